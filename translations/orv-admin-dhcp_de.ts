<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de">
<context>
    <name>ConfigCheck</name>
    <message>
        <source>line %1</source>
        <translation>Zeile %1</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigModel</name>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Die Datei „%1“ kann nicht zum Lesen geöffnet werden</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>Die Datei „%1“ kann nicht zum Schreiben geöffnet werden</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1</source>
        <translation>Ungültige Zeit in Sekunden „%1“</translation>
    </message>
    <message>
        <source>Invalid one or more IP in list &apos;%1&apos;</source>
        <translation>Mindestens eine IP-Adresse in der Liste „%1“ ist ungültig</translation>
    </message>
    <message>
        <source>Invalid domain name &apos;%1&apos;</source>
        <translation>Ungültiger Domänenname „%1“</translation>
    </message>
    <message>
        <source>Error editing subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>Fehler beim Bearbeiten des Subnetzes. Ungültiges Subnetz „%1“</translation>
    </message>
    <message>
        <source>Invalid IP &apos;%1&apos;</source>
        <translation>Ungültige IP-Adresse „%1“</translation>
    </message>
    <message>
        <source>Invalid MAC &apos;%1&apos;</source>
        <translation>Ungültige MAC-Adresse „%1“</translation>
    </message>
    <message>
        <source>Error editing range. Can not edit range in &apos;%1&apos;</source>
        <translation>Fehler beim Bearbeiten des Adressbereichs. In „%1“ kann kein Adressbereich bearbeitet werden</translation>
    </message>
    <message>
        <source>Error editing range. Invalid attributes of parent subnet</source>
        <translation>Fehler beim Bearbeiten des Adressbereichs. Die Angaben des übergeordneten Subnetzes sind ungültig</translation>
    </message>
    <message>
        <source>Error editing range. Invalid parent subnet</source>
        <translation>Fehler beim Bearbeiten des Adressbereichs. Das übergeordnete Subnetz ist ungültig</translation>
    </message>
    <message>
        <source>Error editing range. Invalid start IP &apos;%1&apos;</source>
        <translation>Fehler beim Bearbeiten des Adressbereichs. Ungültige erste IP-Adresse „%1“</translation>
    </message>
    <message>
        <source>Error editing range. Invalid end IP &apos;%1&apos;</source>
        <translation>Fehler beim Bearbeiten des Adressbereichs. Ungültige letzte IP-Adresse „%1“</translation>
    </message>
    <message>
        <source>Error adding shared-network. Can not add shared-network to &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen des gemeinsamen Netzwerks. Zu „%1“ kann kein gemeinsames Netzwerk hinzugefügt werden</translation>
    </message>
    <message>
        <source>Error adding subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen des Subnetzes. Ungültiges Subnetz „%1“</translation>
    </message>
    <message>
        <source>Error adding subnet. Can not add subnet to &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen des Subnetzes. Zu „%1“ kann kein Subnetz hinzugefügt werden</translation>
    </message>
    <message>
        <source>Error adding range. Invalid attributes of parent subnet</source>
        <translation>Fehler beim Hinzufügen des Adressbereichs. Die Angaben des übergeordneten Subnetzes sind ungültig</translation>
    </message>
    <message>
        <source>Error adding range. Can not add range to &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen des Adressbereichs. Zu „%1“ kann kein Adressbereich hinzugefügt werden</translation>
    </message>
    <message>
        <source>Error adding range. Invalid parent subnet</source>
        <translation>Fehler beim Hinzufügen des Adressbereichs. Das übergeordnete Subnetz ist ungültig</translation>
    </message>
    <message>
        <source>Error adding range. Invalid start IP &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen des Adressbereichs. Ungültige erste IP-Adresse „%1“</translation>
    </message>
    <message>
        <source>Error adding range. Invalid end IP &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen des Adressbereichs. Ungültige letzte IP-Adresse „%1“</translation>
    </message>
    <message>
        <source>Error adding host. Can not add host to &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen des Hosts. Zu „%1“ kann kein Host hinzugefügt werden</translation>
    </message>
    <message>
        <source>Error adding host. Host name can not be empty.</source>
        <translation>Fehler beim Hinzufügen des Hosts. Der Hostname darf nicht leer sein.</translation>
    </message>
    <message>
        <source>Error adding fixed address. Can not add to &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen der festen Adresse. Zu „%1“ kann keine feste Adresse hinzugefügt werden</translation>
    </message>
    <message>
        <source>Error adding fixed address. Invalid IP &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen der festen Adresse. Ungültige IP-Adresse „%1“</translation>
    </message>
    <message>
        <source>Error adding bind9. Can not add bind9 to &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen der bind9-Einstellungen. Zu „%1“ können keine bind9-Einstellungen hinzugefügt werden</translation>
    </message>
    <message>
        <source>Error adding bind9. bind9 can not be empty.</source>
        <translation>Fehler beim Hinzufügen der bind9-Einstellungen. Die bind9-Einstellungen dürfen nicht leer sein.</translation>
    </message>
    <message>
        <source>Error adding declaration. Can not add declaration to &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen der Deklaration. Zu „%1“ kann keine Deklaration hinzugefügt werden</translation>
    </message>
    <message>
        <source>Error adding parameter. Can not add parameter to &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen des Parameters. Zu „%1“ kann kein Parameter hinzugefügt werden</translation>
    </message>
    <message>
        <source>Error adding lease time. Can not add to &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen der Lease-Dauer. Zu „%1“ kann keine Lease-Dauer hinzugefügt werden</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1&apos;</source>
        <translation>Ungültige Zeit in Sekunden „%1“</translation>
    </message>
    <message>
        <source>Error adding gateways. Can not add to &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen der Gateways. Zu „%1“ können keine Gateways hinzugefügt werden</translation>
    </message>
    <message>
        <source>Error adding DNS servers. Can not add to &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen der DNS-Server. Zu „%1“ können keine DNS-Server hinzugefügt werden</translation>
    </message>
    <message>
        <source>Error adding NTP servers address. Can not add to &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen der NTP-Server-Adressen. Zu „%1“ können keine NTP-Server-Adressen hinzugefügt werden</translation>
    </message>
    <message>
        <source>Error adding domain name. Can not add to &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen des Domänennamens. Zu „%1“ kann kein Domänenname hinzugefügt werden</translation>
    </message>
    <message>
        <source>Error adding static route. Can not add static rout to &apos;%1&apos;</source>
        <translation>Fehler beim Hinzufügen der statischen Route. Zu „%1“ kann keine statische Route hinzugefügt werden</translation>
    </message>
    <message>
        <source>Error adding static route. Static route parametrs can not be empty.</source>
        <translation>Fehler beim Hinzufügen der statischen Route. Die Angaben zur statischen Route dürfen nicht leer sein.</translation>
    </message>
    <message>
        <source>The blocks of the file are nested too deeply.</source>
        <translation>Die Blöcke der Datei sind zu tief verschachtelt.</translation>
    </message>
    <message>
        <source>Error editing &apos;%1&apos;. The block would be nested too deeply.</source>
        <translation>Fehler beim Bearbeiten von „%1“. Der Block wäre zu tief verschachtelt.</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigStatement</name>
    <message>
        <source>All network</source>
        <translation>Gesamtes Netzwerk</translation>
    </message>
    <message>
        <source>Subnet</source>
        <translation>Subnetz</translation>
    </message>
    <message>
        <source>Shared network</source>
        <translation>Gemeinsames Netzwerk</translation>
    </message>
    <message>
        <source>Host</source>
        <translation>Host</translation>
    </message>
    <message>
        <source>Range</source>
        <translation>Adressbereich</translation>
    </message>
    <message>
        <source>Fixed address</source>
        <translation>Feste Adresse</translation>
    </message>
    <message>
        <source>Key information</source>
        <translation>Schlüsselangaben</translation>
    </message>
    <message>
        <source>Zone served by DNS server</source>
        <translation>Zone des DNS-Servers</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Gruppe</translation>
    </message>
    <message>
        <source> mounth </source>
        <translation> Mon. </translation>
    </message>
    <message>
        <source> minutes </source>
        <translation> Min. </translation>
    </message>
    <message>
        <source> seconds </source>
        <translation> Sek. </translation>
    </message>
    <message>
        <source>Gateways</source>
        <translation>Gateways</translation>
    </message>
    <message>
        <source>DNS servers</source>
        <translation>DNS-Server</translation>
    </message>
    <message>
        <source>Domain name</source>
        <translation>Domänenname</translation>
    </message>
    <message>
        <source>NTP servers</source>
        <translation>NTP-Server</translation>
    </message>
    <message>
        <source>Static route MS</source>
        <translation>Statische Route (MS)</translation>
    </message>
    <message>
        <source>Static route</source>
        <translation>Statische Route</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>MAC-Adresse</translation>
    </message>
    <message>
        <source>Max lease time</source>
        <translation>Maximale Lease-Dauer</translation>
    </message>
    <message>
        <source>Default lease time</source>
        <translation>Standard-Lease-Dauer</translation>
    </message>
    <message>
        <source>Key</source>
        <translation>Schlüssel</translation>
    </message>
    <message>
        <source>Key generation algorithm</source>
        <translation>Schlüsselalgorithmus</translation>
    </message>
    <message>
        <source>Generated secret</source>
        <translation>Geheimer Schlüssel</translation>
    </message>
    <message>
        <source>Master DNS Server</source>
        <translation>Primärer DNS-Server</translation>
    </message>
    <message>
        <source> days </source>
        <translation> Tg. </translation>
    </message>
    <message>
        <source> hours </source>
        <translation> Std. </translation>
    </message>
</context>
<context>
    <name>DhcpdLeasesModel</name>
    <message>
        <source>IP address</source>
        <translation>IP-Adresse</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>MAC-Adresse</translation>
    </message>
    <message>
        <source>Host name</source>
        <translation>Hostname</translation>
    </message>
    <message>
        <source>Binding state</source>
        <translation>Bindungsstatus</translation>
    </message>
    <message>
        <source>Rental start</source>
        <translation>Lease-Beginn</translation>
    </message>
    <message>
        <source>Rental end</source>
        <translation>Lease-Ende</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Die Datei „%1“ kann nicht zum Lesen geöffnet werden</translation>
    </message>
</context>
<context>
    <name>DomainInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Dialog</translation>
    </message>
    <message>
        <source>Domain name:</source>
        <translation>Domänenname:</translation>
    </message>
</context>
<context>
    <name>FMain</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>DHCP-Server konfigurieren</translation>
    </message>
    <message>
        <source>Topology</source>
        <translation>Topologie</translation>
    </message>
    <message>
        <source>Leases</source>
        <translation>Leases</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Suchen</translation>
    </message>
    <message>
        <source>Previous match</source>
        <translation>Vorheriger Treffer</translation>
    </message>
    <message>
        <source>...</source>
        <translation>...</translation>
    </message>
    <message>
        <source>Next match</source>
        <translation>Nächster Treffer</translation>
    </message>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Datei</translation>
    </message>
    <message>
        <source>Server</source>
        <translation>Server</translation>
    </message>
    <message>
        <source>toolBar</source>
        <translation>Werkzeugleiste</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>Neu laden</translation>
    </message>
    <message>
        <source>F5</source>
        <translation>F5</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Speichern</translation>
    </message>
    <message>
        <source>Ctrl+S</source>
        <translation>Ctrl+S</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>Beenden</translation>
    </message>
    <message>
        <source>Restart DHCP-server</source>
        <translation>DHCP-Server neu starten</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>Schnittstellen auswählen</translation>
    </message>
    <message>
        <source>Start DHCP-server</source>
        <translation>DHCP-Server starten</translation>
    </message>
    <message>
        <source>Start or stop DHCP-server</source>
        <translation>DHCP-Server starten oder anhalten</translation>
    </message>
    <message>
        <source>Ctrl+R</source>
        <translation>Ctrl+R</translation>
    </message>
    <message>
        <source>Add subnet</source>
        <translation>Subnetz hinzufügen</translation>
    </message>
    <message>
        <source>Add shared network</source>
        <translation>Gemeinsames Netzwerk hinzufügen</translation>
    </message>
    <message>
        <source>Add host</source>
        <translation>Host hinzufügen</translation>
    </message>
    <message>
        <source>Add range</source>
        <translation>Adressbereich hinzufügen</translation>
    </message>
    <message>
        <source>Add arbitrary parameter</source>
        <translation>Parameter als Text hinzufügen</translation>
    </message>
    <message>
        <source>Add arbitrary declaration</source>
        <translation>Deklaration als Text hinzufügen</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Bearbeiten</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Entfernen</translation>
    </message>
    <message>
        <source>Add fixed IP</source>
        <translation>Feste IP-Adresse hinzufügen</translation>
    </message>
    <message>
        <source>Add DNS servers</source>
        <translation>DNS-Server hinzufügen</translation>
    </message>
    <message>
        <source>Add domain name</source>
        <translation>Domänennamen hinzufügen</translation>
    </message>
    <message>
        <source>Add gateways</source>
        <translation>Gateways hinzufügen</translation>
    </message>
    <message>
        <source>Add NTP servers</source>
        <translation>NTP-Server hinzufügen</translation>
    </message>
    <message>
        <source>Add default lease time</source>
        <translation>Standard-Lease-Dauer hinzufügen</translation>
    </message>
    <message>
        <source>Add max lease time</source>
        <translation>Maximale Lease-Dauer hinzufügen</translation>
    </message>
    <message>
        <source>Reserve an IP address</source>
        <translation>IP-Adresse reservieren</translation>
    </message>
    <message>
        <source>Add static route</source>
        <translation>Statische Route hinzufügen</translation>
    </message>
    <message>
        <source>Add DHCP dynamic zone update</source>
        <translation>Dynamische DNS-Aktualisierung hinzufügen</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Wert</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Aktionen</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Information</translation>
    </message>
    <message>
        <source>Stop DHCP-server</source>
        <translation>DHCP-Server anhalten</translation>
    </message>
    <message>
        <source>Do you want to reload configuration from file?</source>
        <translation>Möchten Sie die Konfiguration neu aus der Datei laden?</translation>
    </message>
    <message>
        <source>The configuration has been changed.
Do you want to overwrite the configuration?</source>
        <translation>Die Konfiguration wurde von außen geändert.
Möchten Sie die Konfiguration überschreiben?</translation>
    </message>
    <message>
        <source>Current configuration in file will be rewrited.
Do you want to save changes?</source>
        <translation>Die aktuelle Konfiguration in der Datei wird überschrieben.
Möchten Sie die Änderungen speichern?</translation>
    </message>
    <message>
        <source>The DHCP server refuses this configuration:
%1</source>
        <translation>Der DHCP-Server lehnt diese Konfiguration ab:
%1</translation>
    </message>
    <message>
        <source>Confirmation</source>
        <translation>Bestätigung</translation>
    </message>
    <message>
        <source>There are unsaved changes, save?</source>
        <translation>Es gibt ungespeicherte Änderungen. Möchten Sie sie speichern?</translation>
    </message>
    <message>
        <source>The IP address is reserved.
Go to topology?</source>
        <translation>Die IP-Adresse ist reserviert.
Zur Topologie wechseln?</translation>
    </message>
    <message>
        <source>Warning!</source>
        <translation>Warnung!</translation>
    </message>
    <message>
        <source>This editing mode for advanced users.
After applying this changes configuration may be incorrect.
Do you want to resume?</source>
        <translation>Dieser Bearbeitungsmodus ist für erfahrene Benutzer gedacht.
Nach den Änderungen kann die Konfiguration fehlerhaft sein.
Möchten Sie fortfahren?</translation>
    </message>
    <message>
        <source>Declaration:</source>
        <translation>Deklaration:</translation>
    </message>
    <message>
        <source>Edit arbitrary declaration</source>
        <translation>Deklaration als Text bearbeiten</translation>
    </message>
    <message>
        <source>Parameter:</source>
        <translation>Parameter:</translation>
    </message>
    <message>
        <source>Edit arbitrary parameter</source>
        <translation>Parameter als Text bearbeiten</translation>
    </message>
    <message>
        <source>Edit shared network</source>
        <translation>Gemeinsames Netzwerk bearbeiten</translation>
    </message>
    <message>
        <source>Edit subnet</source>
        <translation>Subnetz bearbeiten</translation>
    </message>
    <message>
        <source>Edit range</source>
        <translation>Adressbereich bearbeiten</translation>
    </message>
    <message>
        <source>Edit host</source>
        <translation>Host bearbeiten</translation>
    </message>
    <message>
        <source>Add fixed address</source>
        <translation>Feste Adresse hinzufügen</translation>
    </message>
    <message>
        <source>Edit fixed address</source>
        <translation>Feste Adresse bearbeiten</translation>
    </message>
    <message>
        <source>Gateways:</source>
        <translation>Gateways:</translation>
    </message>
    <message>
        <source>Edit gateways</source>
        <translation>Gateways bearbeiten</translation>
    </message>
    <message>
        <source>DNS servers:</source>
        <translation>DNS-Server:</translation>
    </message>
    <message>
        <source>Edit DNS servers</source>
        <translation>DNS-Server bearbeiten</translation>
    </message>
    <message>
        <source>NTP servers:</source>
        <translation>NTP-Server:</translation>
    </message>
    <message>
        <source>Edit NTP servers</source>
        <translation>NTP-Server bearbeiten</translation>
    </message>
    <message>
        <source>Edit domain name</source>
        <translation>Domänennamen bearbeiten</translation>
    </message>
    <message>
        <source>Edit max lease time</source>
        <translation>Maximale Lease-Dauer bearbeiten</translation>
    </message>
    <message>
        <source>Edit default lease time</source>
        <translation>Standard-Lease-Dauer bearbeiten</translation>
    </message>
    <message>
        <source>Edit time</source>
        <translation>Dauer bearbeiten</translation>
    </message>
    <message>
        <source>Edit MAC address</source>
        <translation>MAC-Adresse bearbeiten</translation>
    </message>
    <message>
        <source>Edit static route</source>
        <translation>Statische Route bearbeiten</translation>
    </message>
    <message>
        <source>Add configuration to automatically configure binding with bind9 DNS server?</source>
        <translation>Konfiguration für die automatische Anbindung an den DNS-Server bind9 hinzufügen?</translation>
    </message>
    <message>
        <source>Choose the bind9 configuration with the update key</source>
        <translation>bind9-Konfiguration mit dem Aktualisierungsschlüssel auswählen</translation>
    </message>
    <message>
        <source>Add option</source>
        <translation>Option hinzufügen</translation>
    </message>
    <message>
        <source>Add parameter</source>
        <translation>Parameter hinzufügen</translation>
    </message>
    <message>
        <source>Clear the search</source>
        <translation>Suche löschen</translation>
    </message>
    <message>
        <source>Answer of the DHCP server</source>
        <translation>Antwort des DHCP-Servers</translation>
    </message>
    <message>
        <source>%1 more</source>
        <translation>%1 weitere</translation>
    </message>
    <message>
        <source>%1 and %2</source>
        <translation>%1 und %2</translation>
    </message>
    <message>
        <source>The comment of the file will not be kept.</source>
        <translation>Der Kommentar der Datei bleibt nicht erhalten.</translation>
    </message>
    <message>
        <source>The %1 comments of the file will not be kept.</source>
        <translation>Die %1 Kommentare der Datei bleiben nicht erhalten.</translation>
    </message>
    <message>
        <source>The quoted text in line %1 will be changed.</source>
        <translation>Der Text in Anführungszeichen in Zeile %1 wird verändert.</translation>
    </message>
    <message>
        <source>The quoted texts in lines %1 will be changed.</source>
        <translation>In diesen Zeilen werden Texte in Anführungszeichen verändert: %1.</translation>
    </message>
    <message>
        <source>The statement in line %1 will be changed.</source>
        <translation>Die Anweisung in Zeile %1 wird verändert.</translation>
    </message>
    <message>
        <source>The statements in lines %1 will be changed.</source>
        <translation>In diesen Zeilen werden Anweisungen verändert: %1.</translation>
    </message>
    <message>
        <source>The carriage return in line %1 will become part of a word.</source>
        <translation>Das Wagenrücklaufzeichen in Zeile %1 wird Teil eines Wortes.</translation>
    </message>
    <message>
        <source>The carriage returns in lines %1 will become parts of words.</source>
        <translation>In diesen Zeilen werden Wagenrücklaufzeichen Teile von Wörtern: %1.</translation>
    </message>
    <message>
        <source>The configuration could not be read, so there is nothing to save.</source>
        <translation>Die Konfiguration konnte nicht gelesen werden, daher gibt es nichts zu speichern.</translation>
    </message>
    <message>
        <source>The text would be too long, or its blocks nested too deeply, to be read again.</source>
        <translation>Der Text wäre zu lang oder seine Blöcke zu tief verschachtelt, um wieder gelesen zu werden.</translation>
    </message>
    <message>
        <source>These zones were left out:</source>
        <translation>Diese Zonen wurden ausgelassen:</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>the name server is not its primary one</source>
        <translation>der Nameserver ist nicht ihr primärer Server</translation>
    </message>
    <message>
        <source>no key may update it</source>
        <translation>kein Schlüssel darf sie aktualisieren</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its name</source>
        <translation>der DHCP-Server nimmt ihren Namen nicht an</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; is not known</source>
        <translation>ihr Schlüssel „%1“ ist nicht bekannt</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its key &apos;%1&apos;</source>
        <translation>der DHCP-Server nimmt ihren Schlüssel „%1“ nicht an</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; stands behind this place in the configuration</source>
        <translation>ihr Schlüssel „%1“ steht in der Konfiguration erst nach dieser Stelle</translation>
    </message>
    <message>
        <source>Leases found: %1</source>
        <translation>Gefundene Leases: %1</translation>
    </message>
    <message>
        <source>No leases found</source>
        <translation>Keine Leases gefunden</translation>
    </message>
</context>
<context>
    <name>HandbookViewer</name>
    <message>
        <source>Not found</source>
        <translation>Nicht gefunden</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Inhalt</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Suchen</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Zurück</translation>
    </message>
</context>
<context>
    <name>HostInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Dialog</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Name:</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>MAC-Adresse:</translation>
    </message>
    <message>
        <source>Fixed IP:</source>
        <translation>Feste IP-Adresse:</translation>
    </message>
</context>
<context>
    <name>IpInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Dialog</translation>
    </message>
    <message>
        <source>IP:</source>
        <translation>IP-Adresse:</translation>
    </message>
</context>
<context>
    <name>MacInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Dialog</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>MAC-Adresse:</translation>
    </message>
</context>
<context>
    <name>MultipleIpInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Dialog</translation>
    </message>
    <message>
        <source>IP addresses</source>
        <translation>IP-Adressen</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Hinzufügen</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Entfernen</translation>
    </message>
    <message>
        <source>Add IP</source>
        <translation>IP-Adresse hinzufügen</translation>
    </message>
</context>
<context>
    <name>OrvHelpMenu</name>
    <message>
        <source>&amp;Help</source>
        <translation>&amp;Hilfe</translation>
    </message>
    <message>
        <source>Manual</source>
        <translation>Handbuchseite</translation>
    </message>
    <message>
        <source>About %1</source>
        <translation>Über %1</translation>
    </message>
    <message>
        <source>About Qt</source>
        <translation>Über Qt</translation>
    </message>
    <message>
        <source>Free software under the GNU General Public License, version 3 or later. There is no warranty, to the extent permitted by law.</source>
        <translation>Freie Software unter der GNU General Public License, Version 3 oder neuer. Es besteht keinerlei Gewährleistung, soweit gesetzlich zulässig.</translation>
    </message>
    <message>
        <source>Configure DHCP server</source>
        <translation>DHCP-Server konfigurieren</translation>
    </message>
    <message>
        <source>Handbook</source>
        <translation>Handbuch</translation>
    </message>
</context>
<context>
    <name>QAbstractTableModel</name>
    <message>
        <source>Net mask</source>
        <translation>Netzmaske</translation>
    </message>
    <message>
        <source>IP net</source>
        <translation>IP-Netz</translation>
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
        <translation>Verfügbare Schnittstellen</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>Schnittstellen auswählen</translation>
    </message>
    <message>
        <source>Available interfaces are not found!</source>
        <translation>Keine verfügbaren Schnittstellen gefunden!</translation>
    </message>
</context>
<context>
    <name>QObject</name>
    <message>
        <source>Error</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <source>Must be superuser</source>
        <translation>Dieses Programm muss als Superuser ausgeführt werden</translation>
    </message>
    <message>
        <source>Updating DHCP-server status...</source>
        <translation>Status des DHCP-Servers wird abgefragt …</translation>
    </message>
    <message>
        <source>DHCP-server is running</source>
        <translation>DHCP-Server läuft</translation>
    </message>
    <message>
        <source>DHCP-server is stopped</source>
        <translation>DHCP-Server ist angehalten</translation>
    </message>
    <message>
        <source>DHCP-server already running</source>
        <translation>Der DHCP-Server läuft bereits</translation>
    </message>
    <message>
        <source>DHCP-server already stopped</source>
        <translation>Der DHCP-Server ist bereits angehalten</translation>
    </message>
    <message>
        <source>Checking DHCP-server status failed
%1</source>
        <translation>Die Abfrage des DHCP-Server-Status ist fehlgeschlagen
%1</translation>
    </message>
    <message>
        <source>Some operation with DHCP-server already executes</source>
        <translation>Am DHCP-Server läuft bereits ein anderer Vorgang</translation>
    </message>
    <message>
        <source>Operation with DHCP-server failed
%1</source>
        <translation>Der Vorgang am DHCP-Server ist fehlgeschlagen
%1</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Die Datei „%1“ kann nicht zum Lesen geöffnet werden</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>Die Datei „%1“ kann nicht zum Schreiben geöffnet werden</translation>
    </message>
    <message>
        <source>The choice of interfaces is not stored, since file &apos;%1&apos; has no line with &apos;%2&apos;</source>
        <translation>Die Auswahl der Schnittstellen ist nicht gespeichert, da die Datei „%1“ keine Zeile mit „%2“ hat</translation>
    </message>
</context>
<context>
    <name>QtSingleApplication</name>
    <message>
        <source>Error</source>
        <translation>Fehler</translation>
    </message>
    <message>
        <source>The program does not start, since it cannot tell whether it is running already: there is no folder &apos;%1&apos; that only the superuser can enter.</source>
        <translation>Das Programm startet nicht, da es nicht feststellen kann, ob es bereits läuft: Es gibt keinen Ordner „%1“, den nur der Superuser betreten kann.</translation>
    </message>
</context>
<context>
    <name>RangeInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Dialog</translation>
    </message>
    <message>
        <source>Start IP:</source>
        <translation>Erste IP-Adresse:</translation>
    </message>
    <message>
        <source>End IP:</source>
        <translation>Letzte IP-Adresse:</translation>
    </message>
</context>
<context>
    <name>SharedNetworkInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Dialog</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Name:</translation>
    </message>
</context>
<context>
    <name>StatementInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Dialog</translation>
    </message>
    <message>
        <source>Attributes:</source>
        <translation>Attribute:</translation>
    </message>
</context>
<context>
    <name>StaticRouteInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Dialog</translation>
    </message>
    <message>
        <source>Static routes</source>
        <translation>Statische Routen</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Hinzufügen</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Entfernen</translation>
    </message>
    <message>
        <source>Route for MS systems</source>
        <translation>Route für MS-Systeme</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Information</translation>
    </message>
    <message>
        <source>There is an empty cell.
To add, fill in the cell.</source>
        <translation>Es gibt eine leere Zelle.
Füllen Sie sie aus, um die Routen zu übernehmen.</translation>
    </message>
</context>
<context>
    <name>SubnetInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Dialog</translation>
    </message>
    <message>
        <source>Address:</source>
        <translation>Adresse:</translation>
    </message>
    <message>
        <source>Netmask:</source>
        <translation>Netzmaske:</translation>
    </message>
</context>
<context>
    <name>TimeInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Dialog</translation>
    </message>
    <message>
        <source>Mounth:</source>
        <translation>Monate:</translation>
    </message>
    <message>
        <source>Days:</source>
        <translation>Tage:</translation>
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
        <source> m</source>
        <translation> min</translation>
    </message>
    <message>
        <source> s</source>
        <translation> s</translation>
    </message>
    <message>
        <source>Hours</source>
        <translation>Stunden</translation>
    </message>
    <message>
        <source>Minutes</source>
        <translation>Minuten</translation>
    </message>
    <message>
        <source>Seconds</source>
        <translation>Sekunden</translation>
    </message>
</context>
<context>
    <name>fileio</name>
    <message>
        <source>The old content cannot be kept while it is overwritten</source>
        <translation>Der alte Inhalt kann während des Überschreibens nicht aufbewahrt werden</translation>
    </message>
    <message>
        <source>%1. The file is damaged, its old content is kept in %2</source>
        <translation>%1. Die Datei ist beschädigt, ihr alter Inhalt liegt in %2</translation>
    </message>
</context>
</TS>
