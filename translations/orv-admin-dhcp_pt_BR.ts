<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="pt_BR">
<context>
    <name>ConfigCheck</name>
    <message>
        <source>line %1</source>
        <translation>linha %1</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigModel</name>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Não foi possível abrir o arquivo “%1” para leitura</translation>
    </message>
    <message>
        <source>The blocks of the file are nested too deeply.</source>
        <translation>Os blocos do arquivo estão aninhados em níveis demais.</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>Não foi possível abrir o arquivo “%1” para escrita</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1</source>
        <translation>Tempo em segundos inválido: “%1”</translation>
    </message>
    <message>
        <source>Invalid one or more IP in list &apos;%1&apos;</source>
        <translation>A lista “%1” contém pelo menos um endereço IP inválido</translation>
    </message>
    <message>
        <source>Invalid domain name &apos;%1&apos;</source>
        <translation>Nome de domínio inválido: “%1”</translation>
    </message>
    <message>
        <source>Invalid MAC &apos;%1&apos;</source>
        <translation>Endereço MAC inválido: “%1”</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1&apos;</source>
        <translation>Tempo em segundos inválido: “%1”</translation>
    </message>
    <message>
        <source>Error editing subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>Erro ao editar a sub-rede. Sub-rede inválida: “%1”</translation>
    </message>
    <message>
        <source>Invalid IP &apos;%1&apos;</source>
        <translation>Endereço IP inválido: “%1”</translation>
    </message>
    <message>
        <source>Error editing range. Can not edit range in &apos;%1&apos;</source>
        <translation>Erro ao editar a faixa. Não é possível editar uma faixa em “%1”</translation>
    </message>
    <message>
        <source>Error editing range. Invalid attributes of parent subnet</source>
        <translation>Erro ao editar a faixa. Os atributos da sub-rede que a contém são inválidos</translation>
    </message>
    <message>
        <source>Error editing range. Invalid parent subnet</source>
        <translation>Erro ao editar a faixa. A sub-rede que a contém é inválida</translation>
    </message>
    <message>
        <source>Error editing range. Invalid start IP &apos;%1&apos;</source>
        <translation>Erro ao editar a faixa. Endereço IP inicial inválido: “%1”</translation>
    </message>
    <message>
        <source>Error editing range. Invalid end IP &apos;%1&apos;</source>
        <translation>Erro ao editar a faixa. Endereço IP final inválido: “%1”</translation>
    </message>
    <message>
        <source>Error adding shared-network. Can not add shared-network to &apos;%1&apos;</source>
        <translation>Erro ao adicionar a rede compartilhada. Não é possível adicionar uma rede compartilhada a “%1”</translation>
    </message>
    <message>
        <source>Error adding subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>Erro ao adicionar a sub-rede. Sub-rede inválida: “%1”</translation>
    </message>
    <message>
        <source>Error adding subnet. Can not add subnet to &apos;%1&apos;</source>
        <translation>Erro ao adicionar a sub-rede. Não é possível adicionar uma sub-rede a “%1”</translation>
    </message>
    <message>
        <source>Error adding range. Can not add range to &apos;%1&apos;</source>
        <translation>Erro ao adicionar a faixa. Não é possível adicionar uma faixa a “%1”</translation>
    </message>
    <message>
        <source>Error adding range. Invalid attributes of parent subnet</source>
        <translation>Erro ao adicionar a faixa. Os atributos da sub-rede que a contém são inválidos</translation>
    </message>
    <message>
        <source>Error adding range. Invalid parent subnet</source>
        <translation>Erro ao adicionar a faixa. A sub-rede que a contém é inválida</translation>
    </message>
    <message>
        <source>Error adding range. Invalid start IP &apos;%1&apos;</source>
        <translation>Erro ao adicionar a faixa. Endereço IP inicial inválido: “%1”</translation>
    </message>
    <message>
        <source>Error adding range. Invalid end IP &apos;%1&apos;</source>
        <translation>Erro ao adicionar a faixa. Endereço IP final inválido: “%1”</translation>
    </message>
    <message>
        <source>Error adding host. Can not add host to &apos;%1&apos;</source>
        <translation>Erro ao adicionar o host. Não é possível adicionar um host a “%1”</translation>
    </message>
    <message>
        <source>Error adding host. Host name can not be empty.</source>
        <translation>Erro ao adicionar o host. O nome do host não pode ficar vazio.</translation>
    </message>
    <message>
        <source>Error adding fixed address. Can not add to &apos;%1&apos;</source>
        <translation>Erro ao adicionar o endereço fixo. Não é possível adicionar um endereço fixo a “%1”</translation>
    </message>
    <message>
        <source>Error adding fixed address. Invalid IP &apos;%1&apos;</source>
        <translation>Erro ao adicionar o endereço fixo. Endereço IP inválido: “%1”</translation>
    </message>
    <message>
        <source>Error adding bind9. Can not add bind9 to &apos;%1&apos;</source>
        <translation>Erro ao adicionar as configurações do bind9. Não é possível adicionar configurações do bind9 a “%1”</translation>
    </message>
    <message>
        <source>Error adding bind9. bind9 can not be empty.</source>
        <translation>Erro ao adicionar as configurações do bind9. As configurações do bind9 não podem ficar vazias.</translation>
    </message>
    <message>
        <source>Error adding declaration. Can not add declaration to &apos;%1&apos;</source>
        <translation>Erro ao adicionar a declaração. Não é possível adicionar uma declaração a “%1”</translation>
    </message>
    <message>
        <source>Error adding parameter. Can not add parameter to &apos;%1&apos;</source>
        <translation>Erro ao adicionar o parâmetro. Não é possível adicionar um parâmetro a “%1”</translation>
    </message>
    <message>
        <source>Error adding static route. Static route parametrs can not be empty.</source>
        <translation>Erro ao adicionar a rota estática. Os parâmetros da rota estática não podem ficar vazios.</translation>
    </message>
    <message>
        <source>Error adding lease time. Can not add to &apos;%1&apos;</source>
        <translation>Erro ao adicionar o tempo de concessão. Não é possível adicionar um tempo de concessão a “%1”</translation>
    </message>
    <message>
        <source>Error adding static route. Can not add static rout to &apos;%1&apos;</source>
        <translation>Erro ao adicionar a rota estática. Não é possível adicionar uma rota estática a “%1”</translation>
    </message>
    <message>
        <source>Error adding gateways. Can not add to &apos;%1&apos;</source>
        <translation>Erro ao adicionar os gateways. Não é possível adicionar gateways a “%1”</translation>
    </message>
    <message>
        <source>Error adding DNS servers. Can not add to &apos;%1&apos;</source>
        <translation>Erro ao adicionar os servidores DNS. Não é possível adicionar servidores DNS a “%1”</translation>
    </message>
    <message>
        <source>Error adding NTP servers address. Can not add to &apos;%1&apos;</source>
        <translation>Erro ao adicionar os endereços de servidores NTP. Não é possível adicionar servidores NTP a “%1”</translation>
    </message>
    <message>
        <source>Error adding domain name. Can not add to &apos;%1&apos;</source>
        <translation>Erro ao adicionar o nome de domínio. Não é possível adicionar um nome de domínio a “%1”</translation>
    </message>
    <message>
        <source>Error editing &apos;%1&apos;. The block would be nested too deeply.</source>
        <translation>Erro ao editar “%1”. O bloco ficaria aninhado em níveis demais.</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigStatement</name>
    <message>
        <source>All network</source>
        <translation>Toda a rede</translation>
    </message>
    <message>
        <source>Subnet</source>
        <translation>Sub-rede</translation>
    </message>
    <message>
        <source>Shared network</source>
        <translation>Rede compartilhada</translation>
    </message>
    <message>
        <source>Host</source>
        <translation>Host</translation>
    </message>
    <message>
        <source>Range</source>
        <translation>Faixa</translation>
    </message>
    <message>
        <source>Fixed address</source>
        <translation>Endereço fixo</translation>
    </message>
    <message>
        <source>Key information</source>
        <translation>Dados da chave</translation>
    </message>
    <message>
        <source>Zone served by DNS server</source>
        <translation>Zona do servidor DNS</translation>
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
        <translation>Gateways</translation>
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
        <translation>Nome de domínio</translation>
    </message>
    <message>
        <source>Static route MS</source>
        <translation>Rota estática (MS)</translation>
    </message>
    <message>
        <source>Static route</source>
        <translation>Rota estática</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>Endereço MAC</translation>
    </message>
    <message>
        <source>Max lease time</source>
        <translation>Tempo máximo de concessão</translation>
    </message>
    <message>
        <source>Default lease time</source>
        <translation>Tempo de concessão padrão</translation>
    </message>
    <message>
        <source>Key</source>
        <translation>Chave</translation>
    </message>
    <message>
        <source>Key generation algorithm</source>
        <translation>Algoritmo da chave</translation>
    </message>
    <message>
        <source>Generated secret</source>
        <translation>Segredo da chave</translation>
    </message>
    <message>
        <source>Master DNS Server</source>
        <translation>Servidor DNS primário</translation>
    </message>
</context>
<context>
    <name>DhcpdLeasesModel</name>
    <message>
        <source>IP address</source>
        <translation>Endereço IP</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>Endereço MAC</translation>
    </message>
    <message>
        <source>Host name</source>
        <translation>Nome do host</translation>
    </message>
    <message>
        <source>Binding state</source>
        <translation>Estado da concessão</translation>
    </message>
    <message>
        <source>Rental start</source>
        <translation>Início da concessão</translation>
    </message>
    <message>
        <source>Rental end</source>
        <translation>Fim da concessão</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Não foi possível abrir o arquivo “%1” para leitura</translation>
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
        <translation>Nome de domínio:</translation>
    </message>
</context>
<context>
    <name>FMain</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>Configurar o servidor DHCP</translation>
    </message>
    <message>
        <source>Topology</source>
        <translation>Topologia</translation>
    </message>
    <message>
        <source>Leases</source>
        <translation>Concessões</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Pesquisar</translation>
    </message>
    <message>
        <source>Previous match</source>
        <translation>Resultado anterior</translation>
    </message>
    <message>
        <source>...</source>
        <translation>...</translation>
    </message>
    <message>
        <source>Next match</source>
        <translation>Próximo resultado</translation>
    </message>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Arquivo</translation>
    </message>
    <message>
        <source>Server</source>
        <translation>Servidor</translation>
    </message>
    <message>
        <source>toolBar</source>
        <translation>Barra de ferramentas</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>Recarregar</translation>
    </message>
    <message>
        <source>F5</source>
        <translation>F5</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Salvar</translation>
    </message>
    <message>
        <source>Ctrl+S</source>
        <translation>Ctrl+S</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>Sair</translation>
    </message>
    <message>
        <source>Restart DHCP-server</source>
        <translation>Reiniciar o servidor DHCP</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>Selecionar interfaces</translation>
    </message>
    <message>
        <source>Start DHCP-server</source>
        <translation>Iniciar o servidor DHCP</translation>
    </message>
    <message>
        <source>Start or stop DHCP-server</source>
        <translation>Iniciar ou parar o servidor DHCP</translation>
    </message>
    <message>
        <source>Ctrl+R</source>
        <translation>Ctrl+R</translation>
    </message>
    <message>
        <source>Add subnet</source>
        <translation>Adicionar sub-rede</translation>
    </message>
    <message>
        <source>Add shared network</source>
        <translation>Adicionar rede compartilhada</translation>
    </message>
    <message>
        <source>Add host</source>
        <translation>Adicionar host</translation>
    </message>
    <message>
        <source>Add range</source>
        <translation>Adicionar faixa</translation>
    </message>
    <message>
        <source>Add arbitrary parameter</source>
        <translation>Adicionar parâmetro como texto</translation>
    </message>
    <message>
        <source>Add arbitrary declaration</source>
        <translation>Adicionar declaração como texto</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Editar</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Remover</translation>
    </message>
    <message>
        <source>Add fixed IP</source>
        <translation>Adicionar endereço IP fixo</translation>
    </message>
    <message>
        <source>Add DNS servers</source>
        <translation>Adicionar servidores DNS</translation>
    </message>
    <message>
        <source>Add domain name</source>
        <translation>Adicionar nome de domínio</translation>
    </message>
    <message>
        <source>Add gateways</source>
        <translation>Adicionar gateways</translation>
    </message>
    <message>
        <source>Add NTP servers</source>
        <translation>Adicionar servidores NTP</translation>
    </message>
    <message>
        <source>Add default lease time</source>
        <translation>Adicionar tempo de concessão padrão</translation>
    </message>
    <message>
        <source>Add max lease time</source>
        <translation>Adicionar tempo máximo de concessão</translation>
    </message>
    <message>
        <source>Reserve an IP address</source>
        <translation>Reservar um endereço IP</translation>
    </message>
    <message>
        <source>Add static route</source>
        <translation>Adicionar rota estática</translation>
    </message>
    <message>
        <source>Add DHCP dynamic zone update</source>
        <translation>Adicionar atualização dinâmica do DNS</translation>
    </message>
    <message>
        <source>%1 more</source>
        <translation>mais %1</translation>
    </message>
    <message>
        <source>%1 and %2</source>
        <translation>%1 e %2</translation>
    </message>
    <message>
        <source>The configuration could not be read, so there is nothing to save.</source>
        <translation>Não foi possível ler a configuração, portanto não há nada a salvar.</translation>
    </message>
    <message>
        <source>The text would be too long, or its blocks nested too deeply, to be read again.</source>
        <translation>O texto seria longo demais, ou seus blocos aninhados em níveis demais, para ser lido novamente.</translation>
    </message>
    <message>
        <source>The configuration has been changed.
Do you want to overwrite the configuration?</source>
        <translation>A configuração foi alterada fora do programa.
Deseja sobrescrevê-la?</translation>
    </message>
    <message>
        <source>Current configuration in file will be rewrited.
Do you want to save changes?</source>
        <translation>A configuração atual do arquivo será sobrescrita.
Deseja salvar as alterações?</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Informação</translation>
    </message>
    <message>
        <source>The DHCP server refuses this configuration:
%1</source>
        <translation>O servidor DHCP recusa esta configuração:
%1</translation>
    </message>
    <message>
        <source>Answer of the DHCP server</source>
        <translation>Resposta do servidor DHCP</translation>
    </message>
    <message>
        <source>The comment of the file will not be kept.</source>
        <translation>O comentário do arquivo não será mantido.</translation>
    </message>
    <message>
        <source>The %1 comments of the file will not be kept.</source>
        <translation>Os %1 comentários do arquivo não serão mantidos.</translation>
    </message>
    <message>
        <source>The quoted text in line %1 will be changed.</source>
        <translation>O texto entre aspas na linha %1 será alterado.</translation>
    </message>
    <message>
        <source>The quoted texts in lines %1 will be changed.</source>
        <translation>Os textos entre aspas nas linhas %1 serão alterados.</translation>
    </message>
    <message>
        <source>The statement in line %1 will be changed.</source>
        <translation>A instrução na linha %1 será alterada.</translation>
    </message>
    <message>
        <source>The statements in lines %1 will be changed.</source>
        <translation>As instruções nas linhas %1 serão alteradas.</translation>
    </message>
    <message>
        <source>The carriage return in line %1 will become part of a word.</source>
        <translation>O retorno de carro na linha %1 passará a fazer parte de uma palavra.</translation>
    </message>
    <message>
        <source>The carriage returns in lines %1 will become parts of words.</source>
        <translation>Os retornos de carro nas linhas %1 passarão a fazer parte de palavras.</translation>
    </message>
    <message>
        <source>Declaration:</source>
        <translation>Declaração:</translation>
    </message>
    <message>
        <source>Edit arbitrary declaration</source>
        <translation>Editar declaração como texto</translation>
    </message>
    <message>
        <source>Edit shared network</source>
        <translation>Editar rede compartilhada</translation>
    </message>
    <message>
        <source>Edit subnet</source>
        <translation>Editar sub-rede</translation>
    </message>
    <message>
        <source>Edit range</source>
        <translation>Editar faixa</translation>
    </message>
    <message>
        <source>Edit host</source>
        <translation>Editar host</translation>
    </message>
    <message>
        <source>The IP address is reserved.
Go to topology?</source>
        <translation>O endereço IP está reservado.
Ir para a topologia?</translation>
    </message>
    <message>
        <source>Add fixed address</source>
        <translation>Adicionar endereço fixo</translation>
    </message>
    <message>
        <source>Edit fixed address</source>
        <translation>Editar endereço fixo</translation>
    </message>
    <message>
        <source>Edit static route</source>
        <translation>Editar rota estática</translation>
    </message>
    <message>
        <source>Add configuration to automatically configure binding with bind9 DNS server?</source>
        <translation>Adicionar a configuração para a integração automática com o servidor DNS bind9?</translation>
    </message>
    <message>
        <source>Choose the bind9 configuration with the update key</source>
        <translation>Escolha a configuração do bind9 com a chave de atualização</translation>
    </message>
    <message>
        <source>These zones were left out:</source>
        <translation>Estas zonas foram omitidas:</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>the name server is not its primary one</source>
        <translation>o servidor de nomes não é o servidor primário dela</translation>
    </message>
    <message>
        <source>no key may update it</source>
        <translation>nenhuma chave pode atualizá-la</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its name</source>
        <translation>o servidor DHCP não aceita o nome dela</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; is not known</source>
        <translation>a chave dela, “%1”, não é conhecida</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its key &apos;%1&apos;</source>
        <translation>o servidor DHCP não aceita a chave dela, “%1”</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; stands behind this place in the configuration</source>
        <translation>a chave dela, “%1”, está depois deste ponto na configuração</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Valor</translation>
    </message>
    <message>
        <source>Do you want to reload configuration from file?</source>
        <translation>Deseja recarregar a configuração do arquivo?</translation>
    </message>
    <message>
        <source>Confirmation</source>
        <translation>Confirmação</translation>
    </message>
    <message>
        <source>There are unsaved changes, save?</source>
        <translation>Há alterações não salvas. Salvar?</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Erro</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Ações</translation>
    </message>
    <message>
        <source>Clear the search</source>
        <translation>Limpar a pesquisa</translation>
    </message>
    <message>
        <source>Edit gateways</source>
        <translation>Editar gateways</translation>
    </message>
    <message>
        <source>Gateways:</source>
        <translation>Gateways:</translation>
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
        <translation>Editar nome de domínio</translation>
    </message>
    <message>
        <source>Edit default lease time</source>
        <translation>Editar tempo de concessão padrão</translation>
    </message>
    <message>
        <source>Edit max lease time</source>
        <translation>Editar tempo máximo de concessão</translation>
    </message>
    <message>
        <source>Edit MAC address</source>
        <translation>Editar endereço MAC</translation>
    </message>
    <message>
        <source>Edit time</source>
        <translation>Editar tempo</translation>
    </message>
    <message>
        <source>Parameter:</source>
        <translation>Parâmetro:</translation>
    </message>
    <message>
        <source>Edit arbitrary parameter</source>
        <translation>Editar parâmetro como texto</translation>
    </message>
    <message>
        <source>Stop DHCP-server</source>
        <translation>Parar o servidor DHCP</translation>
    </message>
    <message>
        <source>Warning!</source>
        <translation>Aviso!</translation>
    </message>
    <message>
        <source>This editing mode for advanced users.
After applying this changes configuration may be incorrect.
Do you want to resume?</source>
        <translation>Este modo de edição é para usuários avançados.
Após estas alterações, a configuração pode ficar incorreta.
Deseja continuar?</translation>
    </message>
    <message>
        <source>Add option</source>
        <translation>Adicionar opção</translation>
    </message>
    <message>
        <source>Add parameter</source>
        <translation>Adicionar parâmetro</translation>
    </message>
    <message>
        <source>Leases found: %1</source>
        <translation>Concessões encontradas: %1</translation>
    </message>
    <message>
        <source>No leases found</source>
        <translation>Nenhuma concessão encontrada</translation>
    </message>
</context>
<context>
    <name>HandbookViewer</name>
    <message>
        <source>Not found</source>
        <translation>Não encontrado</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Conteúdo</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Pesquisar</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Voltar</translation>
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
        <translation>Nome:</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>Endereço MAC:</translation>
    </message>
    <message>
        <source>Fixed IP:</source>
        <translation>Endereço IP fixo:</translation>
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
        <translation>Endereço IP:</translation>
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
        <translation>Endereço MAC:</translation>
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
        <translation>Endereços IP</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Adicionar</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Remover</translation>
    </message>
    <message>
        <source>Add IP</source>
        <translation>Adicionar endereço IP</translation>
    </message>
</context>
<context>
    <name>OrvHelpMenu</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>Configurar o servidor DHCP</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>A&amp;juda</translation>
    </message>
    <message>
        <source>Manual</source>
        <translation>Página de manual</translation>
    </message>
    <message>
        <source>About %1</source>
        <translation>Sobre %1</translation>
    </message>
    <message>
        <source>About Qt</source>
        <translation>Sobre o Qt</translation>
    </message>
    <message>
        <source>Free software under the GNU General Public License, version 3 or later. There is no warranty, to the extent permitted by law.</source>
        <translation>Software livre sob a Licença Pública Geral GNU, versão 3 ou posterior. Não há garantia alguma, na medida permitida pela lei.</translation>
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
        <translation>Máscara de rede</translation>
    </message>
    <message>
        <source>IP net</source>
        <translation>Rede IP</translation>
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
        <translation>Interfaces disponíveis</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>Selecionar interfaces</translation>
    </message>
    <message>
        <source>Available interfaces are not found!</source>
        <translation>Nenhuma interface disponível foi encontrada!</translation>
    </message>
</context>
<context>
    <name>QObject</name>
    <message>
        <source>Error</source>
        <translation>Erro</translation>
    </message>
    <message>
        <source>Must be superuser</source>
        <translation>Este programa deve ser executado como superusuário</translation>
    </message>
    <message>
        <source>Updating DHCP-server status...</source>
        <translation>Consultando o estado do servidor DHCP…</translation>
    </message>
    <message>
        <source>DHCP-server is running</source>
        <translation>O servidor DHCP está em execução</translation>
    </message>
    <message>
        <source>DHCP-server is stopped</source>
        <translation>O servidor DHCP está parado</translation>
    </message>
    <message>
        <source>DHCP-server already running</source>
        <translation>O servidor DHCP já está em execução</translation>
    </message>
    <message>
        <source>DHCP-server already stopped</source>
        <translation>O servidor DHCP já está parado</translation>
    </message>
    <message>
        <source>Checking DHCP-server status failed
%1</source>
        <translation>Falha na consulta do estado do servidor DHCP
%1</translation>
    </message>
    <message>
        <source>Some operation with DHCP-server already executes</source>
        <translation>Já há outra operação em andamento com o servidor DHCP</translation>
    </message>
    <message>
        <source>Operation with DHCP-server failed
%1</source>
        <translation>Falha na operação com o servidor DHCP
%1</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Não foi possível abrir o arquivo “%1” para leitura</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>Não foi possível abrir o arquivo “%1” para escrita</translation>
    </message>
    <message>
        <source>The choice of interfaces is not stored, since file &apos;%1&apos; has no line with &apos;%2&apos;</source>
        <translation>A seleção de interfaces não foi salva, pois o arquivo “%1” não tem nenhuma linha com “%2”</translation>
    </message>
</context>
<context>
    <name>QtSingleApplication</name>
    <message>
        <source>Error</source>
        <translation>Erro</translation>
    </message>
    <message>
        <source>The program does not start, since it cannot tell whether it is running already: there is no folder &apos;%1&apos; that only the superuser can enter.</source>
        <translation>O programa não inicia, pois não consegue determinar se já está em execução: não há nenhuma pasta “%1” em que só o superusuário possa entrar.</translation>
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
        <translation>Endereço IP inicial:</translation>
    </message>
    <message>
        <source>End IP:</source>
        <translation>Endereço IP final:</translation>
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
        <translation>Nome:</translation>
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
        <translation>Rotas estáticas</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Adicionar</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Remover</translation>
    </message>
    <message>
        <source>Route for MS systems</source>
        <translation>Rota para sistemas MS</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Informação</translation>
    </message>
    <message>
        <source>There is an empty cell.
To add, fill in the cell.</source>
        <translation>Há uma célula vazia.
Preencha-a para aceitar as rotas.</translation>
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
        <translation>Endereço:</translation>
    </message>
    <message>
        <source>Netmask:</source>
        <translation>Máscara de rede:</translation>
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
        <translation>Dias:</translation>
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
        <translation>O conteúdo antigo não pode ser mantido durante a sobrescrita</translation>
    </message>
    <message>
        <source>%1. The file is damaged, its old content is kept in %2</source>
        <translation>%1. O arquivo está danificado, seu conteúdo antigo está em %2</translation>
    </message>
</context>
</TS>
