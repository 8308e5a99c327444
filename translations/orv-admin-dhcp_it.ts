<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="it">
<context>
    <name>ConfigCheck</name>
    <message>
        <source>line %1</source>
        <translation>riga %1</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigModel</name>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Impossibile aprire il file «%1» in lettura</translation>
    </message>
    <message>
        <source>The blocks of the file are nested too deeply.</source>
        <translation>I blocchi del file sono annidati troppo in profondità.</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>Impossibile aprire il file «%1» in scrittura</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1</source>
        <translation>Durata in secondi non valida: «%1»</translation>
    </message>
    <message>
        <source>Invalid one or more IP in list &apos;%1&apos;</source>
        <translation>L’elenco «%1» contiene almeno un indirizzo IP non valido</translation>
    </message>
    <message>
        <source>Invalid domain name &apos;%1&apos;</source>
        <translation>Nome di dominio non valido: «%1»</translation>
    </message>
    <message>
        <source>Invalid MAC &apos;%1&apos;</source>
        <translation>Indirizzo MAC non valido: «%1»</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1&apos;</source>
        <translation>Durata in secondi non valida: «%1»</translation>
    </message>
    <message>
        <source>Error editing subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>Errore nella modifica della sottorete. Sottorete non valida: «%1»</translation>
    </message>
    <message>
        <source>Invalid IP &apos;%1&apos;</source>
        <translation>Indirizzo IP non valido: «%1»</translation>
    </message>
    <message>
        <source>Error editing range. Can not edit range in &apos;%1&apos;</source>
        <translation>Errore nella modifica dell’intervallo. Impossibile modificare un intervallo in «%1»</translation>
    </message>
    <message>
        <source>Error editing range. Invalid attributes of parent subnet</source>
        <translation>Errore nella modifica dell’intervallo. Gli attributi della sottorete che lo contiene non sono validi</translation>
    </message>
    <message>
        <source>Error editing range. Invalid parent subnet</source>
        <translation>Errore nella modifica dell’intervallo. La sottorete che lo contiene non è valida</translation>
    </message>
    <message>
        <source>Error editing range. Invalid start IP &apos;%1&apos;</source>
        <translation>Errore nella modifica dell’intervallo. Primo indirizzo IP non valido: «%1»</translation>
    </message>
    <message>
        <source>Error editing range. Invalid end IP &apos;%1&apos;</source>
        <translation>Errore nella modifica dell’intervallo. Ultimo indirizzo IP non valido: «%1»</translation>
    </message>
    <message>
        <source>Error adding shared-network. Can not add shared-network to &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta della rete condivisa. Impossibile aggiungere una rete condivisa a «%1»</translation>
    </message>
    <message>
        <source>Error adding subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta della sottorete. Sottorete non valida: «%1»</translation>
    </message>
    <message>
        <source>Error adding subnet. Can not add subnet to &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta della sottorete. Impossibile aggiungere una sottorete a «%1»</translation>
    </message>
    <message>
        <source>Error adding range. Can not add range to &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta dell’intervallo. Impossibile aggiungere un intervallo a «%1»</translation>
    </message>
    <message>
        <source>Error adding range. Invalid attributes of parent subnet</source>
        <translation>Errore nell’aggiunta dell’intervallo. Gli attributi della sottorete che lo contiene non sono validi</translation>
    </message>
    <message>
        <source>Error adding range. Invalid parent subnet</source>
        <translation>Errore nell’aggiunta dell’intervallo. La sottorete che lo contiene non è valida</translation>
    </message>
    <message>
        <source>Error adding range. Invalid start IP &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta dell’intervallo. Primo indirizzo IP non valido: «%1»</translation>
    </message>
    <message>
        <source>Error adding range. Invalid end IP &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta dell’intervallo. Ultimo indirizzo IP non valido: «%1»</translation>
    </message>
    <message>
        <source>Error adding host. Can not add host to &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta dell’host. Impossibile aggiungere un host a «%1»</translation>
    </message>
    <message>
        <source>Error adding host. Host name can not be empty.</source>
        <translation>Errore nell’aggiunta dell’host. Il nome host non può essere vuoto.</translation>
    </message>
    <message>
        <source>Error adding fixed address. Can not add to &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta dell’indirizzo fisso. Impossibile aggiungere un indirizzo fisso a «%1»</translation>
    </message>
    <message>
        <source>Error adding fixed address. Invalid IP &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta dell’indirizzo fisso. Indirizzo IP non valido: «%1»</translation>
    </message>
    <message>
        <source>Error adding bind9. Can not add bind9 to &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta delle impostazioni di bind9. Impossibile aggiungere impostazioni di bind9 a «%1»</translation>
    </message>
    <message>
        <source>Error adding bind9. bind9 can not be empty.</source>
        <translation>Errore nell’aggiunta delle impostazioni di bind9. Le impostazioni di bind9 non possono essere vuote.</translation>
    </message>
    <message>
        <source>Error adding declaration. Can not add declaration to &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta della dichiarazione. Impossibile aggiungere una dichiarazione a «%1»</translation>
    </message>
    <message>
        <source>Error adding parameter. Can not add parameter to &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta del parametro. Impossibile aggiungere un parametro a «%1»</translation>
    </message>
    <message>
        <source>Error adding static route. Static route parametrs can not be empty.</source>
        <translation>Errore nell’aggiunta della rotta statica. I parametri della rotta statica non possono essere vuoti.</translation>
    </message>
    <message>
        <source>Error adding lease time. Can not add to &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta della durata del lease. Impossibile aggiungere una durata del lease a «%1»</translation>
    </message>
    <message>
        <source>Error adding static route. Can not add static rout to &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta della rotta statica. Impossibile aggiungere una rotta statica a «%1»</translation>
    </message>
    <message>
        <source>Error adding gateways. Can not add to &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta dei gateway. Impossibile aggiungere gateway a «%1»</translation>
    </message>
    <message>
        <source>Error adding DNS servers. Can not add to &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta dei server DNS. Impossibile aggiungere server DNS a «%1»</translation>
    </message>
    <message>
        <source>Error adding NTP servers address. Can not add to &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta degli indirizzi dei server NTP. Impossibile aggiungere server NTP a «%1»</translation>
    </message>
    <message>
        <source>Error adding domain name. Can not add to &apos;%1&apos;</source>
        <translation>Errore nell’aggiunta del nome di dominio. Impossibile aggiungere un nome di dominio a «%1»</translation>
    </message>
    <message>
        <source>Error editing &apos;%1&apos;. The block would be nested too deeply.</source>
        <translation>Errore nella modifica di «%1». Il blocco sarebbe annidato troppo in profondità.</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigStatement</name>
    <message>
        <source>All network</source>
        <translation>Intera rete</translation>
    </message>
    <message>
        <source>Subnet</source>
        <translation>Sottorete</translation>
    </message>
    <message>
        <source>Shared network</source>
        <translation>Rete condivisa</translation>
    </message>
    <message>
        <source>Host</source>
        <translation>Host</translation>
    </message>
    <message>
        <source>Range</source>
        <translation>Intervallo</translation>
    </message>
    <message>
        <source>Fixed address</source>
        <translation>Indirizzo fisso</translation>
    </message>
    <message>
        <source>Key information</source>
        <translation>Dati della chiave</translation>
    </message>
    <message>
        <source>Zone served by DNS server</source>
        <translation>Zona del server DNS</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Gruppo</translation>
    </message>
    <message>
        <source> mounth </source>
        <translation> mes. </translation>
    </message>
    <message>
        <source> days </source>
        <translation> g </translation>
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
        <translation>Gateway</translation>
    </message>
    <message>
        <source>DNS servers</source>
        <translation>Server DNS</translation>
    </message>
    <message>
        <source>NTP servers</source>
        <translation>Server NTP</translation>
    </message>
    <message>
        <source>Domain name</source>
        <translation>Nome di dominio</translation>
    </message>
    <message>
        <source>Static route MS</source>
        <translation>Rotta statica (MS)</translation>
    </message>
    <message>
        <source>Static route</source>
        <translation>Rotta statica</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>Indirizzo MAC</translation>
    </message>
    <message>
        <source>Max lease time</source>
        <translation>Durata massima del lease</translation>
    </message>
    <message>
        <source>Default lease time</source>
        <translation>Durata predefinita del lease</translation>
    </message>
    <message>
        <source>Key</source>
        <translation>Chiave</translation>
    </message>
    <message>
        <source>Key generation algorithm</source>
        <translation>Algoritmo della chiave</translation>
    </message>
    <message>
        <source>Generated secret</source>
        <translation>Segreto della chiave</translation>
    </message>
    <message>
        <source>Master DNS Server</source>
        <translation>Server DNS primario</translation>
    </message>
</context>
<context>
    <name>DhcpdLeasesModel</name>
    <message>
        <source>IP address</source>
        <translation>Indirizzo IP</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>Indirizzo MAC</translation>
    </message>
    <message>
        <source>Host name</source>
        <translation>Nome host</translation>
    </message>
    <message>
        <source>Binding state</source>
        <translation>Stato del lease</translation>
    </message>
    <message>
        <source>Rental start</source>
        <translation>Inizio del lease</translation>
    </message>
    <message>
        <source>Rental end</source>
        <translation>Fine del lease</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Impossibile aprire il file «%1» in lettura</translation>
    </message>
</context>
<context>
    <name>DomainInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Finestra di dialogo</translation>
    </message>
    <message>
        <source>Domain name:</source>
        <translation>Nome di dominio:</translation>
    </message>
</context>
<context>
    <name>FMain</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>Configura il server DHCP</translation>
    </message>
    <message>
        <source>Topology</source>
        <translation>Topologia</translation>
    </message>
    <message>
        <source>Leases</source>
        <translation>Lease</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Cerca</translation>
    </message>
    <message>
        <source>Previous match</source>
        <translation>Risultato precedente</translation>
    </message>
    <message>
        <source>...</source>
        <translation>...</translation>
    </message>
    <message>
        <source>Next match</source>
        <translation>Risultato successivo</translation>
    </message>
    <message>
        <source>&amp;File</source>
        <translation>&amp;File</translation>
    </message>
    <message>
        <source>Server</source>
        <translation>Server</translation>
    </message>
    <message>
        <source>toolBar</source>
        <translation>Barra degli strumenti</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>Ricarica</translation>
    </message>
    <message>
        <source>F5</source>
        <translation>F5</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Salva</translation>
    </message>
    <message>
        <source>Ctrl+S</source>
        <translation>Ctrl+S</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>Esci</translation>
    </message>
    <message>
        <source>Restart DHCP-server</source>
        <translation>Riavvia il server DHCP</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>Scegli le interfacce</translation>
    </message>
    <message>
        <source>Start DHCP-server</source>
        <translation>Avvia il server DHCP</translation>
    </message>
    <message>
        <source>Start or stop DHCP-server</source>
        <translation>Avvia o arresta il server DHCP</translation>
    </message>
    <message>
        <source>Ctrl+R</source>
        <translation>Ctrl+R</translation>
    </message>
    <message>
        <source>Add subnet</source>
        <translation>Aggiungi sottorete</translation>
    </message>
    <message>
        <source>Add shared network</source>
        <translation>Aggiungi rete condivisa</translation>
    </message>
    <message>
        <source>Add host</source>
        <translation>Aggiungi host</translation>
    </message>
    <message>
        <source>Add range</source>
        <translation>Aggiungi intervallo</translation>
    </message>
    <message>
        <source>Add arbitrary parameter</source>
        <translation>Aggiungi parametro come testo</translation>
    </message>
    <message>
        <source>Add arbitrary declaration</source>
        <translation>Aggiungi dichiarazione come testo</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Modifica</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Rimuovi</translation>
    </message>
    <message>
        <source>Add fixed IP</source>
        <translation>Aggiungi indirizzo IP fisso</translation>
    </message>
    <message>
        <source>Add DNS servers</source>
        <translation>Aggiungi server DNS</translation>
    </message>
    <message>
        <source>Add domain name</source>
        <translation>Aggiungi nome di dominio</translation>
    </message>
    <message>
        <source>Add gateways</source>
        <translation>Aggiungi gateway</translation>
    </message>
    <message>
        <source>Add NTP servers</source>
        <translation>Aggiungi server NTP</translation>
    </message>
    <message>
        <source>Add default lease time</source>
        <translation>Aggiungi durata predefinita del lease</translation>
    </message>
    <message>
        <source>Add max lease time</source>
        <translation>Aggiungi durata massima del lease</translation>
    </message>
    <message>
        <source>Reserve an IP address</source>
        <translation>Prenota un indirizzo IP</translation>
    </message>
    <message>
        <source>Add static route</source>
        <translation>Aggiungi rotta statica</translation>
    </message>
    <message>
        <source>Add DHCP dynamic zone update</source>
        <translation>Aggiungi aggiornamento dinamico del DNS</translation>
    </message>
    <message>
        <source>%1 more</source>
        <translation>ancora %1</translation>
    </message>
    <message>
        <source>%1 and %2</source>
        <translation>%1 e %2</translation>
    </message>
    <message>
        <source>The configuration could not be read, so there is nothing to save.</source>
        <translation>Non è stato possibile leggere la configurazione, quindi non c’è nulla da salvare.</translation>
    </message>
    <message>
        <source>The text would be too long, or its blocks nested too deeply, to be read again.</source>
        <translation>Il testo sarebbe troppo lungo, o i suoi blocchi troppo annidati, per essere riletto.</translation>
    </message>
    <message>
        <source>The configuration has been changed.
Do you want to overwrite the configuration?</source>
        <translation>La configurazione è stata modificata dall’esterno.
Sovrascrivere la configurazione?</translation>
    </message>
    <message>
        <source>Current configuration in file will be rewrited.
Do you want to save changes?</source>
        <translation>La configurazione attuale nel file verrà sovrascritta.
Salvare le modifiche?</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Informazione</translation>
    </message>
    <message>
        <source>The DHCP server refuses this configuration:
%1</source>
        <translation>Il server DHCP rifiuta questa configurazione:
%1</translation>
    </message>
    <message>
        <source>Answer of the DHCP server</source>
        <translation>Risposta del server DHCP</translation>
    </message>
    <message>
        <source>The comment of the file will not be kept.</source>
        <translation>Il commento del file non verrà conservato.</translation>
    </message>
    <message>
        <source>The %1 comments of the file will not be kept.</source>
        <translation>I %1 commenti del file non verranno conservati.</translation>
    </message>
    <message>
        <source>The quoted text in line %1 will be changed.</source>
        <translation>Il testo tra virgolette alla riga %1 verrà modificato.</translation>
    </message>
    <message>
        <source>The quoted texts in lines %1 will be changed.</source>
        <translation>I testi tra virgolette alle righe %1 verranno modificati.</translation>
    </message>
    <message>
        <source>The statement in line %1 will be changed.</source>
        <translation>L’istruzione alla riga %1 verrà modificata.</translation>
    </message>
    <message>
        <source>The statements in lines %1 will be changed.</source>
        <translation>Le istruzioni alle righe %1 verranno modificate.</translation>
    </message>
    <message>
        <source>The carriage return in line %1 will become part of a word.</source>
        <translation>Il ritorno carrello alla riga %1 diventerà parte di una parola.</translation>
    </message>
    <message>
        <source>The carriage returns in lines %1 will become parts of words.</source>
        <translation>I ritorni carrello alle righe %1 diventeranno parte di parole.</translation>
    </message>
    <message>
        <source>Declaration:</source>
        <translation>Dichiarazione:</translation>
    </message>
    <message>
        <source>Edit arbitrary declaration</source>
        <translation>Modifica dichiarazione come testo</translation>
    </message>
    <message>
        <source>Edit shared network</source>
        <translation>Modifica rete condivisa</translation>
    </message>
    <message>
        <source>Edit subnet</source>
        <translation>Modifica sottorete</translation>
    </message>
    <message>
        <source>Edit range</source>
        <translation>Modifica intervallo</translation>
    </message>
    <message>
        <source>Edit host</source>
        <translation>Modifica host</translation>
    </message>
    <message>
        <source>The IP address is reserved.
Go to topology?</source>
        <translation>L’indirizzo IP è stato prenotato.
Passare alla topologia?</translation>
    </message>
    <message>
        <source>Add fixed address</source>
        <translation>Aggiungi indirizzo fisso</translation>
    </message>
    <message>
        <source>Edit fixed address</source>
        <translation>Modifica indirizzo fisso</translation>
    </message>
    <message>
        <source>Edit static route</source>
        <translation>Modifica rotta statica</translation>
    </message>
    <message>
        <source>Add configuration to automatically configure binding with bind9 DNS server?</source>
        <translation>Aggiungere la configurazione per il collegamento automatico con il server DNS bind9?</translation>
    </message>
    <message>
        <source>Choose the bind9 configuration with the update key</source>
        <translation>Scegli la configurazione di bind9 con la chiave di aggiornamento</translation>
    </message>
    <message>
        <source>These zones were left out:</source>
        <translation>Queste zone sono state tralasciate:</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>the name server is not its primary one</source>
        <translation>il server dei nomi non è il suo server primario</translation>
    </message>
    <message>
        <source>no key may update it</source>
        <translation>nessuna chiave può aggiornarla</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its name</source>
        <translation>il server DHCP non accetta il suo nome</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; is not known</source>
        <translation>la sua chiave «%1» è sconosciuta</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its key &apos;%1&apos;</source>
        <translation>il server DHCP non accetta la sua chiave «%1»</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; stands behind this place in the configuration</source>
        <translation>la sua chiave «%1» si trova dopo questo punto nella configurazione</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Valore</translation>
    </message>
    <message>
        <source>Do you want to reload configuration from file?</source>
        <translation>Ricaricare la configurazione dal file?</translation>
    </message>
    <message>
        <source>Confirmation</source>
        <translation>Conferma</translation>
    </message>
    <message>
        <source>There are unsaved changes, save?</source>
        <translation>Ci sono modifiche non salvate. Salvarle?</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Errore</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Azioni</translation>
    </message>
    <message>
        <source>Clear the search</source>
        <translation>Cancella la ricerca</translation>
    </message>
    <message>
        <source>Edit gateways</source>
        <translation>Modifica gateway</translation>
    </message>
    <message>
        <source>Gateways:</source>
        <translation>Gateway:</translation>
    </message>
    <message>
        <source>Edit DNS servers</source>
        <translation>Modifica server DNS</translation>
    </message>
    <message>
        <source>DNS servers:</source>
        <translation>Server DNS:</translation>
    </message>
    <message>
        <source>Edit NTP servers</source>
        <translation>Modifica server NTP</translation>
    </message>
    <message>
        <source>NTP servers:</source>
        <translation>Server NTP:</translation>
    </message>
    <message>
        <source>Edit domain name</source>
        <translation>Modifica nome di dominio</translation>
    </message>
    <message>
        <source>Edit default lease time</source>
        <translation>Modifica durata predefinita del lease</translation>
    </message>
    <message>
        <source>Edit max lease time</source>
        <translation>Modifica durata massima del lease</translation>
    </message>
    <message>
        <source>Edit MAC address</source>
        <translation>Modifica indirizzo MAC</translation>
    </message>
    <message>
        <source>Edit time</source>
        <translation>Modifica durata</translation>
    </message>
    <message>
        <source>Parameter:</source>
        <translation>Parametro:</translation>
    </message>
    <message>
        <source>Edit arbitrary parameter</source>
        <translation>Modifica parametro come testo</translation>
    </message>
    <message>
        <source>Stop DHCP-server</source>
        <translation>Arresta il server DHCP</translation>
    </message>
    <message>
        <source>Warning!</source>
        <translation>Attenzione!</translation>
    </message>
    <message>
        <source>This editing mode for advanced users.
After applying this changes configuration may be incorrect.
Do you want to resume?</source>
        <translation>Questa modalità di modifica è per utenti esperti.
Dopo queste modifiche la configurazione potrebbe non essere corretta.
Continuare?</translation>
    </message>
    <message>
        <source>Add option</source>
        <translation>Aggiungi opzione</translation>
    </message>
    <message>
        <source>Add parameter</source>
        <translation>Aggiungi parametro</translation>
    </message>
    <message>
        <source>Leases found: %1</source>
        <translation>Lease trovati: %1</translation>
    </message>
    <message>
        <source>No leases found</source>
        <translation>Nessun lease trovato</translation>
    </message>
</context>
<context>
    <name>HandbookViewer</name>
    <message>
        <source>Not found</source>
        <translation>Non trovato</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Indice</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Cerca</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Indietro</translation>
    </message>
</context>
<context>
    <name>HostInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Finestra di dialogo</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Nome:</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>Indirizzo MAC:</translation>
    </message>
    <message>
        <source>Fixed IP:</source>
        <translation>Indirizzo IP fisso:</translation>
    </message>
</context>
<context>
    <name>IpInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Finestra di dialogo</translation>
    </message>
    <message>
        <source>IP:</source>
        <translation>Indirizzo IP:</translation>
    </message>
</context>
<context>
    <name>MacInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Finestra di dialogo</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>Indirizzo MAC:</translation>
    </message>
</context>
<context>
    <name>MultipleIpInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Finestra di dialogo</translation>
    </message>
    <message>
        <source>IP addresses</source>
        <translation>Indirizzi IP</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Aggiungi</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Rimuovi</translation>
    </message>
    <message>
        <source>Add IP</source>
        <translation>Aggiungi indirizzo IP</translation>
    </message>
</context>
<context>
    <name>OrvHelpMenu</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>Configura il server DHCP</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>&amp;Aiuto</translation>
    </message>
    <message>
        <source>Manual</source>
        <translation>Pagina di manuale</translation>
    </message>
    <message>
        <source>About %1</source>
        <translation>Informazioni su %1</translation>
    </message>
    <message>
        <source>About Qt</source>
        <translation>Informazioni su Qt</translation>
    </message>
    <message>
        <source>Free software under the GNU General Public License, version 3 or later. There is no warranty, to the extent permitted by law.</source>
        <translation>Software libero distribuito secondo la GNU General Public License, versione 3 o successiva. Non è fornita alcuna garanzia, nei limiti consentiti dalla legge.</translation>
    </message>
    <message>
        <source>Handbook</source>
        <translation>Manuale</translation>
    </message>
</context>
<context>
    <name>QAbstractTableModel</name>
    <message>
        <source>Net mask</source>
        <translation>Maschera di rete</translation>
    </message>
    <message>
        <source>IP net</source>
        <translation>Rete IP</translation>
    </message>
    <message>
        <source>Gateway</source>
        <translation>Gateway</translation>
    </message>
</context>
<context>
    <name>QDialog</name>
    <message>
        <source>Available interfaces</source>
        <translation>Interfacce disponibili</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>Scegli le interfacce</translation>
    </message>
    <message>
        <source>Available interfaces are not found!</source>
        <translation>Nessuna interfaccia disponibile trovata!</translation>
    </message>
</context>
<context>
    <name>QObject</name>
    <message>
        <source>Error</source>
        <translation>Errore</translation>
    </message>
    <message>
        <source>Must be superuser</source>
        <translation>Questo programma deve essere eseguito come superutente</translation>
    </message>
    <message>
        <source>Updating DHCP-server status...</source>
        <translation>Verifica dello stato del server DHCP…</translation>
    </message>
    <message>
        <source>DHCP-server is running</source>
        <translation>Il server DHCP è in esecuzione</translation>
    </message>
    <message>
        <source>DHCP-server is stopped</source>
        <translation>Il server DHCP è arrestato</translation>
    </message>
    <message>
        <source>DHCP-server already running</source>
        <translation>Il server DHCP è già in esecuzione</translation>
    </message>
    <message>
        <source>DHCP-server already stopped</source>
        <translation>Il server DHCP è già arrestato</translation>
    </message>
    <message>
        <source>Checking DHCP-server status failed
%1</source>
        <translation>La verifica dello stato del server DHCP non è riuscita
%1</translation>
    </message>
    <message>
        <source>Some operation with DHCP-server already executes</source>
        <translation>È già in corso un’altra operazione sul server DHCP</translation>
    </message>
    <message>
        <source>Operation with DHCP-server failed
%1</source>
        <translation>L’operazione sul server DHCP non è riuscita
%1</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Impossibile aprire il file «%1» in lettura</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>Impossibile aprire il file «%1» in scrittura</translation>
    </message>
    <message>
        <source>The choice of interfaces is not stored, since file &apos;%1&apos; has no line with &apos;%2&apos;</source>
        <translation>La scelta delle interfacce non è stata salvata, perché il file «%1» non contiene una riga con «%2»</translation>
    </message>
</context>
<context>
    <name>QtSingleApplication</name>
    <message>
        <source>Error</source>
        <translation>Errore</translation>
    </message>
    <message>
        <source>The program does not start, since it cannot tell whether it is running already: there is no folder &apos;%1&apos; that only the superuser can enter.</source>
        <translation>Il programma non si avvia, perché non può stabilire se è già in esecuzione: non esiste una cartella «%1» accessibile solo al superutente.</translation>
    </message>
</context>
<context>
    <name>RangeInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Finestra di dialogo</translation>
    </message>
    <message>
        <source>Start IP:</source>
        <translation>Primo indirizzo IP:</translation>
    </message>
    <message>
        <source>End IP:</source>
        <translation>Ultimo indirizzo IP:</translation>
    </message>
</context>
<context>
    <name>SharedNetworkInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Finestra di dialogo</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Nome:</translation>
    </message>
</context>
<context>
    <name>StatementInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Finestra di dialogo</translation>
    </message>
    <message>
        <source>Attributes:</source>
        <translation>Attributi:</translation>
    </message>
</context>
<context>
    <name>StaticRouteInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Finestra di dialogo</translation>
    </message>
    <message>
        <source>Static routes</source>
        <translation>Rotte statiche</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Aggiungi</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Rimuovi</translation>
    </message>
    <message>
        <source>Route for MS systems</source>
        <translation>Rotta per sistemi MS</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Informazione</translation>
    </message>
    <message>
        <source>There is an empty cell.
To add, fill in the cell.</source>
        <translation>C’è una cella vuota.
Compilarla per accettare le rotte.</translation>
    </message>
</context>
<context>
    <name>SubnetInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Finestra di dialogo</translation>
    </message>
    <message>
        <source>Address:</source>
        <translation>Indirizzo:</translation>
    </message>
    <message>
        <source>Netmask:</source>
        <translation>Maschera di rete:</translation>
    </message>
</context>
<context>
    <name>TimeInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Finestra di dialogo</translation>
    </message>
    <message>
        <source>Mounth:</source>
        <translation>Mesi:</translation>
    </message>
    <message>
        <source>Days:</source>
        <translation>Giorni:</translation>
    </message>
    <message>
        <source>Hours</source>
        <translation>Ore</translation>
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
        <translation>Minuti</translation>
    </message>
    <message>
        <source> m</source>
        <translation> min</translation>
    </message>
    <message>
        <source>Seconds</source>
        <translation>Secondi</translation>
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
        <translation>Il vecchio contenuto non può essere conservato durante la sovrascrittura</translation>
    </message>
    <message>
        <source>%1. The file is damaged, its old content is kept in %2</source>
        <translation>%1. Il file è danneggiato, il suo vecchio contenuto è conservato in %2</translation>
    </message>
</context>
</TS>
