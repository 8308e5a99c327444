<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="es">
<context>
    <name>ConfigCheck</name>
    <message>
        <source>line %1</source>
        <translation>línea %1</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigModel</name>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>No se puede abrir el archivo «%1» para lectura</translation>
    </message>
    <message>
        <source>The blocks of the file are nested too deeply.</source>
        <translation>Los bloques del archivo están anidados a demasiada profundidad.</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>No se puede abrir el archivo «%1» para escritura</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1</source>
        <translation>Tiempo en segundos no válido: «%1»</translation>
    </message>
    <message>
        <source>Invalid one or more IP in list &apos;%1&apos;</source>
        <translation>La lista «%1» contiene al menos una dirección IP no válida</translation>
    </message>
    <message>
        <source>Invalid domain name &apos;%1&apos;</source>
        <translation>Nombre de dominio no válido: «%1»</translation>
    </message>
    <message>
        <source>Invalid MAC &apos;%1&apos;</source>
        <translation>Dirección MAC no válida: «%1»</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1&apos;</source>
        <translation>Tiempo en segundos no válido: «%1»</translation>
    </message>
    <message>
        <source>Error editing subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>Error al editar la subred. Subred no válida: «%1»</translation>
    </message>
    <message>
        <source>Invalid IP &apos;%1&apos;</source>
        <translation>Dirección IP no válida: «%1»</translation>
    </message>
    <message>
        <source>Error editing range. Can not edit range in &apos;%1&apos;</source>
        <translation>Error al editar el rango. No se puede editar un rango en «%1»</translation>
    </message>
    <message>
        <source>Error editing range. Invalid attributes of parent subnet</source>
        <translation>Error al editar el rango. Los atributos de la subred que lo contiene no son válidos</translation>
    </message>
    <message>
        <source>Error editing range. Invalid parent subnet</source>
        <translation>Error al editar el rango. La subred que lo contiene no es válida</translation>
    </message>
    <message>
        <source>Error editing range. Invalid start IP &apos;%1&apos;</source>
        <translation>Error al editar el rango. Primera dirección IP no válida: «%1»</translation>
    </message>
    <message>
        <source>Error editing range. Invalid end IP &apos;%1&apos;</source>
        <translation>Error al editar el rango. Última dirección IP no válida: «%1»</translation>
    </message>
    <message>
        <source>Error adding shared-network. Can not add shared-network to &apos;%1&apos;</source>
        <translation>Error al añadir la red compartida. No se puede añadir una red compartida a «%1»</translation>
    </message>
    <message>
        <source>Error adding subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>Error al añadir la subred. Subred no válida: «%1»</translation>
    </message>
    <message>
        <source>Error adding subnet. Can not add subnet to &apos;%1&apos;</source>
        <translation>Error al añadir la subred. No se puede añadir una subred a «%1»</translation>
    </message>
    <message>
        <source>Error adding range. Can not add range to &apos;%1&apos;</source>
        <translation>Error al añadir el rango. No se puede añadir un rango a «%1»</translation>
    </message>
    <message>
        <source>Error adding range. Invalid attributes of parent subnet</source>
        <translation>Error al añadir el rango. Los atributos de la subred que lo contiene no son válidos</translation>
    </message>
    <message>
        <source>Error adding range. Invalid parent subnet</source>
        <translation>Error al añadir el rango. La subred que lo contiene no es válida</translation>
    </message>
    <message>
        <source>Error adding range. Invalid start IP &apos;%1&apos;</source>
        <translation>Error al añadir el rango. Primera dirección IP no válida: «%1»</translation>
    </message>
    <message>
        <source>Error adding range. Invalid end IP &apos;%1&apos;</source>
        <translation>Error al añadir el rango. Última dirección IP no válida: «%1»</translation>
    </message>
    <message>
        <source>Error adding host. Can not add host to &apos;%1&apos;</source>
        <translation>Error al añadir el equipo. No se puede añadir un equipo a «%1»</translation>
    </message>
    <message>
        <source>Error adding host. Host name can not be empty.</source>
        <translation>Error al añadir el equipo. El nombre del equipo no puede estar vacío.</translation>
    </message>
    <message>
        <source>Error adding fixed address. Can not add to &apos;%1&apos;</source>
        <translation>Error al añadir la dirección fija. No se puede añadir una dirección fija a «%1»</translation>
    </message>
    <message>
        <source>Error adding fixed address. Invalid IP &apos;%1&apos;</source>
        <translation>Error al añadir la dirección fija. Dirección IP no válida: «%1»</translation>
    </message>
    <message>
        <source>Error adding bind9. Can not add bind9 to &apos;%1&apos;</source>
        <translation>Error al añadir los ajustes de bind9. No se pueden añadir ajustes de bind9 a «%1»</translation>
    </message>
    <message>
        <source>Error adding bind9. bind9 can not be empty.</source>
        <translation>Error al añadir los ajustes de bind9. Los ajustes de bind9 no pueden estar vacíos.</translation>
    </message>
    <message>
        <source>Error adding declaration. Can not add declaration to &apos;%1&apos;</source>
        <translation>Error al añadir la declaración. No se puede añadir una declaración a «%1»</translation>
    </message>
    <message>
        <source>Error adding parameter. Can not add parameter to &apos;%1&apos;</source>
        <translation>Error al añadir el parámetro. No se puede añadir un parámetro a «%1»</translation>
    </message>
    <message>
        <source>Error adding static route. Static route parametrs can not be empty.</source>
        <translation>Error al añadir la ruta estática. Los parámetros de la ruta estática no pueden estar vacíos.</translation>
    </message>
    <message>
        <source>Error adding lease time. Can not add to &apos;%1&apos;</source>
        <translation>Error al añadir la duración de la concesión. No se puede añadir una duración a «%1»</translation>
    </message>
    <message>
        <source>Error adding static route. Can not add static rout to &apos;%1&apos;</source>
        <translation>Error al añadir la ruta estática. No se puede añadir una ruta estática a «%1»</translation>
    </message>
    <message>
        <source>Error adding gateways. Can not add to &apos;%1&apos;</source>
        <translation>Error al añadir las puertas de enlace. No se pueden añadir puertas de enlace a «%1»</translation>
    </message>
    <message>
        <source>Error adding DNS servers. Can not add to &apos;%1&apos;</source>
        <translation>Error al añadir los servidores DNS. No se pueden añadir servidores DNS a «%1»</translation>
    </message>
    <message>
        <source>Error adding NTP servers address. Can not add to &apos;%1&apos;</source>
        <translation>Error al añadir las direcciones de servidores NTP. No se pueden añadir servidores NTP a «%1»</translation>
    </message>
    <message>
        <source>Error adding domain name. Can not add to &apos;%1&apos;</source>
        <translation>Error al añadir el nombre de dominio. No se puede añadir un nombre de dominio a «%1»</translation>
    </message>
    <message>
        <source>Error editing &apos;%1&apos;. The block would be nested too deeply.</source>
        <translation>Error al editar «%1». El bloque estaría anidado a demasiada profundidad.</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigStatement</name>
    <message>
        <source>All network</source>
        <translation>Toda la red</translation>
    </message>
    <message>
        <source>Subnet</source>
        <translation>Subred</translation>
    </message>
    <message>
        <source>Shared network</source>
        <translation>Red compartida</translation>
    </message>
    <message>
        <source>Host</source>
        <translation>Equipo</translation>
    </message>
    <message>
        <source>Range</source>
        <translation>Rango</translation>
    </message>
    <message>
        <source>Fixed address</source>
        <translation>Dirección fija</translation>
    </message>
    <message>
        <source>Key information</source>
        <translation>Datos de la clave</translation>
    </message>
    <message>
        <source>Zone served by DNS server</source>
        <translation>Zona del servidor DNS</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Grupo</translation>
    </message>
    <message>
        <source> mounth </source>
        <translation> mes. </translation>
    </message>
    <message>
        <source> days </source>
        <translation> d </translation>
    </message>
    <message>
        <source> hours </source>
        <translation> h </translation>
    </message>
    <message>
        <source> minutes </source>
        <translation> min </translation>
    </message>
    <message>
        <source> seconds </source>
        <translation> s </translation>
    </message>
    <message>
        <source>Gateways</source>
        <translation>Puertas de enlace</translation>
    </message>
    <message>
        <source>DNS servers</source>
        <translation>Servidores DNS</translation>
    </message>
    <message>
        <source>NTP servers</source>
        <translation>Servidores NTP</translation>
    </message>
    <message>
        <source>Domain name</source>
        <translation>Nombre de dominio</translation>
    </message>
    <message>
        <source>Static route MS</source>
        <translation>Ruta estática (MS)</translation>
    </message>
    <message>
        <source>Static route</source>
        <translation>Ruta estática</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>Dirección MAC</translation>
    </message>
    <message>
        <source>Max lease time</source>
        <translation>Duración máxima de la concesión</translation>
    </message>
    <message>
        <source>Default lease time</source>
        <translation>Duración predeterminada de la concesión</translation>
    </message>
    <message>
        <source>Key</source>
        <translation>Clave</translation>
    </message>
    <message>
        <source>Key generation algorithm</source>
        <translation>Algoritmo de la clave</translation>
    </message>
    <message>
        <source>Generated secret</source>
        <translation>Secreto de la clave</translation>
    </message>
    <message>
        <source>Master DNS Server</source>
        <translation>Servidor DNS primario</translation>
    </message>
</context>
<context>
    <name>DhcpdLeasesModel</name>
    <message>
        <source>IP address</source>
        <translation>Dirección IP</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>Dirección MAC</translation>
    </message>
    <message>
        <source>Host name</source>
        <translation>Nombre del equipo</translation>
    </message>
    <message>
        <source>Binding state</source>
        <translation>Estado de la concesión</translation>
    </message>
    <message>
        <source>Rental start</source>
        <translation>Inicio de la concesión</translation>
    </message>
    <message>
        <source>Rental end</source>
        <translation>Fin de la concesión</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>No se puede abrir el archivo «%1» para lectura</translation>
    </message>
</context>
<context>
    <name>DomainInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Diálogo</translation>
    </message>
    <message>
        <source>Domain name:</source>
        <translation>Nombre de dominio:</translation>
    </message>
</context>
<context>
    <name>FMain</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>Configurar el servidor DHCP</translation>
    </message>
    <message>
        <source>Topology</source>
        <translation>Topología</translation>
    </message>
    <message>
        <source>Leases</source>
        <translation>Concesiones</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Buscar</translation>
    </message>
    <message>
        <source>Previous match</source>
        <translation>Coincidencia anterior</translation>
    </message>
    <message>
        <source>...</source>
        <translation>...</translation>
    </message>
    <message>
        <source>Next match</source>
        <translation>Coincidencia siguiente</translation>
    </message>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Archivo</translation>
    </message>
    <message>
        <source>Server</source>
        <translation>Servidor</translation>
    </message>
    <message>
        <source>toolBar</source>
        <translation>Barra de herramientas</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>Recargar</translation>
    </message>
    <message>
        <source>F5</source>
        <translation>F5</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Guardar</translation>
    </message>
    <message>
        <source>Ctrl+S</source>
        <translation>Ctrl+S</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>Salir</translation>
    </message>
    <message>
        <source>Restart DHCP-server</source>
        <translation>Reiniciar el servidor DHCP</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>Seleccionar interfaces</translation>
    </message>
    <message>
        <source>Start DHCP-server</source>
        <translation>Iniciar el servidor DHCP</translation>
    </message>
    <message>
        <source>Start or stop DHCP-server</source>
        <translation>Iniciar o detener el servidor DHCP</translation>
    </message>
    <message>
        <source>Ctrl+R</source>
        <translation>Ctrl+R</translation>
    </message>
    <message>
        <source>Add subnet</source>
        <translation>Añadir subred</translation>
    </message>
    <message>
        <source>Add shared network</source>
        <translation>Añadir red compartida</translation>
    </message>
    <message>
        <source>Add host</source>
        <translation>Añadir equipo</translation>
    </message>
    <message>
        <source>Add range</source>
        <translation>Añadir rango</translation>
    </message>
    <message>
        <source>Add arbitrary parameter</source>
        <translation>Añadir parámetro como texto</translation>
    </message>
    <message>
        <source>Add arbitrary declaration</source>
        <translation>Añadir declaración como texto</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Editar</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Eliminar</translation>
    </message>
    <message>
        <source>Add fixed IP</source>
        <translation>Añadir dirección IP fija</translation>
    </message>
    <message>
        <source>Add DNS servers</source>
        <translation>Añadir servidores DNS</translation>
    </message>
    <message>
        <source>Add domain name</source>
        <translation>Añadir nombre de dominio</translation>
    </message>
    <message>
        <source>Add gateways</source>
        <translation>Añadir puertas de enlace</translation>
    </message>
    <message>
        <source>Add NTP servers</source>
        <translation>Añadir servidores NTP</translation>
    </message>
    <message>
        <source>Add default lease time</source>
        <translation>Añadir duración predeterminada de la concesión</translation>
    </message>
    <message>
        <source>Add max lease time</source>
        <translation>Añadir duración máxima de la concesión</translation>
    </message>
    <message>
        <source>Reserve an IP address</source>
        <translation>Reservar una dirección IP</translation>
    </message>
    <message>
        <source>Add static route</source>
        <translation>Añadir ruta estática</translation>
    </message>
    <message>
        <source>Add DHCP dynamic zone update</source>
        <translation>Añadir actualización dinámica de DNS</translation>
    </message>
    <message>
        <source>%1 more</source>
        <translation>%1 más</translation>
    </message>
    <message>
        <source>%1 and %2</source>
        <translation>%1 y %2</translation>
    </message>
    <message>
        <source>The configuration could not be read, so there is nothing to save.</source>
        <translation>No se pudo leer la configuración, así que no hay nada que guardar.</translation>
    </message>
    <message>
        <source>The text would be too long, or its blocks nested too deeply, to be read again.</source>
        <translation>El texto sería demasiado largo, o sus bloques estarían anidados a demasiada profundidad, para volver a leerlo.</translation>
    </message>
    <message>
        <source>The configuration has been changed.
Do you want to overwrite the configuration?</source>
        <translation>La configuración se ha modificado desde fuera del programa.
¿Desea sobrescribirla?</translation>
    </message>
    <message>
        <source>Current configuration in file will be rewrited.
Do you want to save changes?</source>
        <translation>La configuración actual del archivo se sobrescribirá.
¿Desea guardar los cambios?</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Información</translation>
    </message>
    <message>
        <source>The DHCP server refuses this configuration:
%1</source>
        <translation>El servidor DHCP rechaza esta configuración:
%1</translation>
    </message>
    <message>
        <source>Answer of the DHCP server</source>
        <translation>Respuesta del servidor DHCP</translation>
    </message>
    <message>
        <source>The comment of the file will not be kept.</source>
        <translation>El comentario del archivo no se conservará.</translation>
    </message>
    <message>
        <source>The %1 comments of the file will not be kept.</source>
        <translation>Los %1 comentarios del archivo no se conservarán.</translation>
    </message>
    <message>
        <source>The quoted text in line %1 will be changed.</source>
        <translation>El texto entre comillas de la línea %1 se modificará.</translation>
    </message>
    <message>
        <source>The quoted texts in lines %1 will be changed.</source>
        <translation>Los textos entre comillas de las líneas %1 se modificarán.</translation>
    </message>
    <message>
        <source>The statement in line %1 will be changed.</source>
        <translation>La instrucción de la línea %1 se modificará.</translation>
    </message>
    <message>
        <source>The statements in lines %1 will be changed.</source>
        <translation>Las instrucciones de las líneas %1 se modificarán.</translation>
    </message>
    <message>
        <source>The carriage return in line %1 will become part of a word.</source>
        <translation>El retorno de carro de la línea %1 pasará a ser parte de una palabra.</translation>
    </message>
    <message>
        <source>The carriage returns in lines %1 will become parts of words.</source>
        <translation>Los retornos de carro de las líneas %1 pasarán a ser parte de palabras.</translation>
    </message>
    <message>
        <source>Declaration:</source>
        <translation>Declaración:</translation>
    </message>
    <message>
        <source>Edit arbitrary declaration</source>
        <translation>Editar declaración como texto</translation>
    </message>
    <message>
        <source>Edit shared network</source>
        <translation>Editar red compartida</translation>
    </message>
    <message>
        <source>Edit subnet</source>
        <translation>Editar subred</translation>
    </message>
    <message>
        <source>Edit range</source>
        <translation>Editar rango</translation>
    </message>
    <message>
        <source>Edit host</source>
        <translation>Editar equipo</translation>
    </message>
    <message>
        <source>The IP address is reserved.
Go to topology?</source>
        <translation>La dirección IP está reservada.
¿Ir a la topología?</translation>
    </message>
    <message>
        <source>Add fixed address</source>
        <translation>Añadir dirección fija</translation>
    </message>
    <message>
        <source>Edit fixed address</source>
        <translation>Editar dirección fija</translation>
    </message>
    <message>
        <source>Edit static route</source>
        <translation>Editar ruta estática</translation>
    </message>
    <message>
        <source>Add configuration to automatically configure binding with bind9 DNS server?</source>
        <translation>¿Añadir la configuración que enlaza automáticamente con el servidor DNS bind9?</translation>
    </message>
    <message>
        <source>Choose the bind9 configuration with the update key</source>
        <translation>Elegir la configuración de bind9 que contiene la clave de actualización</translation>
    </message>
    <message>
        <source>These zones were left out:</source>
        <translation>Se han omitido estas zonas:</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>the name server is not its primary one</source>
        <translation>el servidor de nombres no es su servidor primario</translation>
    </message>
    <message>
        <source>no key may update it</source>
        <translation>ninguna clave puede actualizarla</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its name</source>
        <translation>el servidor DHCP no acepta su nombre</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; is not known</source>
        <translation>no se conoce su clave «%1»</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its key &apos;%1&apos;</source>
        <translation>el servidor DHCP no acepta su clave «%1»</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; stands behind this place in the configuration</source>
        <translation>su clave «%1» está después de este lugar en la configuración</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Valor</translation>
    </message>
    <message>
        <source>Do you want to reload configuration from file?</source>
        <translation>¿Desea recargar la configuración desde el archivo?</translation>
    </message>
    <message>
        <source>Confirmation</source>
        <translation>Confirmación</translation>
    </message>
    <message>
        <source>There are unsaved changes, save?</source>
        <translation>Hay cambios sin guardar. ¿Guardarlos?</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Acciones</translation>
    </message>
    <message>
        <source>Clear the search</source>
        <translation>Borrar la búsqueda</translation>
    </message>
    <message>
        <source>Edit gateways</source>
        <translation>Editar puertas de enlace</translation>
    </message>
    <message>
        <source>Gateways:</source>
        <translation>Puertas de enlace:</translation>
    </message>
    <message>
        <source>Edit DNS servers</source>
        <translation>Editar servidores DNS</translation>
    </message>
    <message>
        <source>DNS servers:</source>
        <translation>Servidores DNS:</translation>
    </message>
    <message>
        <source>Edit NTP servers</source>
        <translation>Editar servidores NTP</translation>
    </message>
    <message>
        <source>NTP servers:</source>
        <translation>Servidores NTP:</translation>
    </message>
    <message>
        <source>Edit domain name</source>
        <translation>Editar nombre de dominio</translation>
    </message>
    <message>
        <source>Edit default lease time</source>
        <translation>Editar duración predeterminada de la concesión</translation>
    </message>
    <message>
        <source>Edit max lease time</source>
        <translation>Editar duración máxima de la concesión</translation>
    </message>
    <message>
        <source>Edit MAC address</source>
        <translation>Editar dirección MAC</translation>
    </message>
    <message>
        <source>Edit time</source>
        <translation>Editar tiempo</translation>
    </message>
    <message>
        <source>Parameter:</source>
        <translation>Parámetro:</translation>
    </message>
    <message>
        <source>Edit arbitrary parameter</source>
        <translation>Editar parámetro como texto</translation>
    </message>
    <message>
        <source>Stop DHCP-server</source>
        <translation>Detener el servidor DHCP</translation>
    </message>
    <message>
        <source>Warning!</source>
        <translation>¡Advertencia!</translation>
    </message>
    <message>
        <source>This editing mode for advanced users.
After applying this changes configuration may be incorrect.
Do you want to resume?</source>
        <translation>Este modo de edición es para usuarios avanzados.
Tras aplicar estos cambios, la configuración podría ser incorrecta.
¿Desea continuar?</translation>
    </message>
    <message>
        <source>Add option</source>
        <translation>Añadir opción</translation>
    </message>
    <message>
        <source>Add parameter</source>
        <translation>Añadir parámetro</translation>
    </message>
    <message>
        <source>Leases found: %1</source>
        <translation>Concesiones encontradas: %1</translation>
    </message>
    <message>
        <source>No leases found</source>
        <translation>No se encontraron concesiones</translation>
    </message>
</context>
<context>
    <name>HandbookViewer</name>
    <message>
        <source>Not found</source>
        <translation>No encontrado</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Contenido</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Buscar</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Atrás</translation>
    </message>
</context>
<context>
    <name>HostInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Diálogo</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Nombre:</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>Dirección MAC:</translation>
    </message>
    <message>
        <source>Fixed IP:</source>
        <translation>Dirección IP fija:</translation>
    </message>
</context>
<context>
    <name>IpInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Diálogo</translation>
    </message>
    <message>
        <source>IP:</source>
        <translation>Dirección IP:</translation>
    </message>
</context>
<context>
    <name>MacInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Diálogo</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>Dirección MAC:</translation>
    </message>
</context>
<context>
    <name>MultipleIpInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Diálogo</translation>
    </message>
    <message>
        <source>IP addresses</source>
        <translation>Direcciones IP</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Añadir</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Eliminar</translation>
    </message>
    <message>
        <source>Add IP</source>
        <translation>Añadir dirección IP</translation>
    </message>
</context>
<context>
    <name>OrvHelpMenu</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>Configurar el servidor DHCP</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>A&amp;yuda</translation>
    </message>
    <message>
        <source>Manual</source>
        <translation>Página de manual</translation>
    </message>
    <message>
        <source>About %1</source>
        <translation>Acerca de %1</translation>
    </message>
    <message>
        <source>About Qt</source>
        <translation>Acerca de Qt</translation>
    </message>
    <message>
        <source>Free software under the GNU General Public License, version 3 or later. There is no warranty, to the extent permitted by law.</source>
        <translation>Software libre bajo la Licencia Pública General de GNU, versión 3 o posterior. No ofrece ninguna garantía, en la medida en que lo permita la ley.</translation>
    </message>
    <message>
        <source>Handbook</source>
        <translation>Manual</translation>
    </message>
</context>
<context>
    <name>QAbstractTableModel</name>
    <message>
        <source>Net mask</source>
        <translation>Máscara de red</translation>
    </message>
    <message>
        <source>IP net</source>
        <translation>Red IP</translation>
    </message>
    <message>
        <source>Gateway</source>
        <translation>Puerta de enlace</translation>
    </message>
</context>
<context>
    <name>QDialog</name>
    <message>
        <source>Available interfaces</source>
        <translation>Interfaces disponibles</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>Seleccionar interfaces</translation>
    </message>
    <message>
        <source>Available interfaces are not found!</source>
        <translation>¡No se han encontrado interfaces disponibles!</translation>
    </message>
</context>
<context>
    <name>QObject</name>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>Must be superuser</source>
        <translation>Este programa debe ejecutarse como superusuario</translation>
    </message>
    <message>
        <source>Updating DHCP-server status...</source>
        <translation>Consultando el estado del servidor DHCP…</translation>
    </message>
    <message>
        <source>DHCP-server is running</source>
        <translation>El servidor DHCP está en ejecución</translation>
    </message>
    <message>
        <source>DHCP-server is stopped</source>
        <translation>El servidor DHCP está detenido</translation>
    </message>
    <message>
        <source>DHCP-server already running</source>
        <translation>El servidor DHCP ya está en ejecución</translation>
    </message>
    <message>
        <source>DHCP-server already stopped</source>
        <translation>El servidor DHCP ya está detenido</translation>
    </message>
    <message>
        <source>Checking DHCP-server status failed
%1</source>
        <translation>No se ha podido consultar el estado del servidor DHCP
%1</translation>
    </message>
    <message>
        <source>Some operation with DHCP-server already executes</source>
        <translation>Ya hay otra operación en curso con el servidor DHCP</translation>
    </message>
    <message>
        <source>Operation with DHCP-server failed
%1</source>
        <translation>La operación con el servidor DHCP ha fallado
%1</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>No se puede abrir el archivo «%1» para lectura</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>No se puede abrir el archivo «%1» para escritura</translation>
    </message>
    <message>
        <source>The choice of interfaces is not stored, since file &apos;%1&apos; has no line with &apos;%2&apos;</source>
        <translation>La selección de interfaces no se ha guardado, porque el archivo «%1» no tiene ninguna línea con «%2»</translation>
    </message>
</context>
<context>
    <name>QtSingleApplication</name>
    <message>
        <source>Error</source>
        <translation>Error</translation>
    </message>
    <message>
        <source>The program does not start, since it cannot tell whether it is running already: there is no folder &apos;%1&apos; that only the superuser can enter.</source>
        <translation>El programa no se inicia, porque no puede determinar si ya está en ejecución: no hay ninguna carpeta «%1» a la que solo pueda entrar el superusuario.</translation>
    </message>
</context>
<context>
    <name>RangeInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Diálogo</translation>
    </message>
    <message>
        <source>Start IP:</source>
        <translation>Primera dirección IP:</translation>
    </message>
    <message>
        <source>End IP:</source>
        <translation>Última dirección IP:</translation>
    </message>
</context>
<context>
    <name>SharedNetworkInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Diálogo</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Nombre:</translation>
    </message>
</context>
<context>
    <name>StatementInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Diálogo</translation>
    </message>
    <message>
        <source>Attributes:</source>
        <translation>Atributos:</translation>
    </message>
</context>
<context>
    <name>StaticRouteInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Diálogo</translation>
    </message>
    <message>
        <source>Static routes</source>
        <translation>Rutas estáticas</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Añadir</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Eliminar</translation>
    </message>
    <message>
        <source>Route for MS systems</source>
        <translation>Ruta para sistemas MS</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Información</translation>
    </message>
    <message>
        <source>There is an empty cell.
To add, fill in the cell.</source>
        <translation>Hay una celda vacía.
Rellénela para aceptar las rutas.</translation>
    </message>
</context>
<context>
    <name>SubnetInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Diálogo</translation>
    </message>
    <message>
        <source>Address:</source>
        <translation>Dirección:</translation>
    </message>
    <message>
        <source>Netmask:</source>
        <translation>Máscara de red:</translation>
    </message>
</context>
<context>
    <name>TimeInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Diálogo</translation>
    </message>
    <message>
        <source>Mounth:</source>
        <translation>Meses:</translation>
    </message>
    <message>
        <source>Days:</source>
        <translation>Días:</translation>
    </message>
    <message>
        <source>Hours</source>
        <translation>Horas</translation>
    </message>
    <message>
        <source> h</source>
        <translation> h</translation>
    </message>
    <message>
        <source>:</source>
        <translation>:</translation>
    </message>
    <message>
        <source>Minutes</source>
        <translation>Minutos</translation>
    </message>
    <message>
        <source> m</source>
        <translation> min</translation>
    </message>
    <message>
        <source>Seconds</source>
        <translation>Segundos</translation>
    </message>
    <message>
        <source> s</source>
        <translation> s</translation>
    </message>
</context>
<context>
    <name>fileio</name>
    <message>
        <source>The old content cannot be kept while it is overwritten</source>
        <translation>El contenido anterior no puede conservarse mientras se sobrescribe</translation>
    </message>
    <message>
        <source>%1. The file is damaged, its old content is kept in %2</source>
        <translation>%1. El archivo está dañado, su contenido anterior se conserva en %2</translation>
    </message>
</context>
</TS>
