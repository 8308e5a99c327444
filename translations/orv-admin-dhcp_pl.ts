<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="pl">
<context>
    <name>ConfigCheck</name>
    <message>
        <source>line %1</source>
        <translation>wiersz %1</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigModel</name>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Nie można otworzyć pliku „%1” do odczytu.</translation>
    </message>
    <message>
        <source>The blocks of the file are nested too deeply.</source>
        <translation>Bloki w pliku są zagnieżdżone zbyt głęboko.</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>Nie można otworzyć pliku „%1” do zapisu.</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1</source>
        <translation>Czas w sekundach „%1” jest nieprawidłowy.</translation>
    </message>
    <message>
        <source>Invalid one or more IP in list &apos;%1&apos;</source>
        <translation>Co najmniej jeden adres IP na liście „%1” jest nieprawidłowy.</translation>
    </message>
    <message>
        <source>Invalid domain name &apos;%1&apos;</source>
        <translation>Nazwa domeny „%1” jest nieprawidłowa.</translation>
    </message>
    <message>
        <source>Invalid MAC &apos;%1&apos;</source>
        <translation>Adres MAC „%1” jest nieprawidłowy.</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1&apos;</source>
        <translation>Czas w sekundach „%1” jest nieprawidłowy.</translation>
    </message>
    <message>
        <source>Error editing subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>Nie udało się zmienić podsieci. Podsieć „%1” jest nieprawidłowa.</translation>
    </message>
    <message>
        <source>Invalid IP &apos;%1&apos;</source>
        <translation>Adres IP „%1” jest nieprawidłowy.</translation>
    </message>
    <message>
        <source>Error editing range. Can not edit range in &apos;%1&apos;</source>
        <translation>Nie udało się zmienić zakresu adresów. W „%1” nie można zmieniać zakresu adresów.</translation>
    </message>
    <message>
        <source>Error editing range. Invalid attributes of parent subnet</source>
        <translation>Nie udało się zmienić zakresu adresów. Atrybuty podsieci nadrzędnej są nieprawidłowe.</translation>
    </message>
    <message>
        <source>Error editing range. Invalid parent subnet</source>
        <translation>Nie udało się zmienić zakresu adresów. Podsieć nadrzędna jest nieprawidłowa.</translation>
    </message>
    <message>
        <source>Error editing range. Invalid start IP &apos;%1&apos;</source>
        <translation>Nie udało się zmienić zakresu adresów. Początkowy adres IP „%1” jest nieprawidłowy.</translation>
    </message>
    <message>
        <source>Error editing range. Invalid end IP &apos;%1&apos;</source>
        <translation>Nie udało się zmienić zakresu adresów. Końcowy adres IP „%1” jest nieprawidłowy.</translation>
    </message>
    <message>
        <source>Error adding shared-network. Can not add shared-network to &apos;%1&apos;</source>
        <translation>Nie udało się dodać sieci współdzielonej. Do „%1” nie można dodać sieci współdzielonej.</translation>
    </message>
    <message>
        <source>Error adding subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>Nie udało się dodać podsieci. Podsieć „%1” jest nieprawidłowa.</translation>
    </message>
    <message>
        <source>Error adding subnet. Can not add subnet to &apos;%1&apos;</source>
        <translation>Nie udało się dodać podsieci. Do „%1” nie można dodać podsieci.</translation>
    </message>
    <message>
        <source>Error adding range. Can not add range to &apos;%1&apos;</source>
        <translation>Nie udało się dodać zakresu adresów. Do „%1” nie można dodać zakresu adresów.</translation>
    </message>
    <message>
        <source>Error adding range. Invalid attributes of parent subnet</source>
        <translation>Nie udało się dodać zakresu adresów. Atrybuty podsieci nadrzędnej są nieprawidłowe.</translation>
    </message>
    <message>
        <source>Error adding range. Invalid parent subnet</source>
        <translation>Nie udało się dodać zakresu adresów. Podsieć nadrzędna jest nieprawidłowa.</translation>
    </message>
    <message>
        <source>Error adding range. Invalid start IP &apos;%1&apos;</source>
        <translation>Nie udało się dodać zakresu adresów. Początkowy adres IP „%1” jest nieprawidłowy.</translation>
    </message>
    <message>
        <source>Error adding range. Invalid end IP &apos;%1&apos;</source>
        <translation>Nie udało się dodać zakresu adresów. Końcowy adres IP „%1” jest nieprawidłowy.</translation>
    </message>
    <message>
        <source>Error adding host. Can not add host to &apos;%1&apos;</source>
        <translation>Nie udało się dodać hosta. Do „%1” nie można dodać hosta.</translation>
    </message>
    <message>
        <source>Error adding host. Host name can not be empty.</source>
        <translation>Nie udało się dodać hosta. Nazwa hosta nie może być pusta.</translation>
    </message>
    <message>
        <source>Error adding fixed address. Can not add to &apos;%1&apos;</source>
        <translation>Nie udało się dodać stałego adresu. Do „%1” nie można dodać stałego adresu.</translation>
    </message>
    <message>
        <source>Error adding fixed address. Invalid IP &apos;%1&apos;</source>
        <translation>Nie udało się dodać stałego adresu. Adres IP „%1” jest nieprawidłowy.</translation>
    </message>
    <message>
        <source>Error adding bind9. Can not add bind9 to &apos;%1&apos;</source>
        <translation>Nie udało się dodać ustawień bind9. Do „%1” nie można dodać ustawień bind9.</translation>
    </message>
    <message>
        <source>Error adding bind9. bind9 can not be empty.</source>
        <translation>Nie udało się dodać ustawień bind9. Ustawienia bind9 nie mogą być puste.</translation>
    </message>
    <message>
        <source>Error adding declaration. Can not add declaration to &apos;%1&apos;</source>
        <translation>Nie udało się dodać deklaracji. Do „%1” nie można dodać deklaracji.</translation>
    </message>
    <message>
        <source>Error adding parameter. Can not add parameter to &apos;%1&apos;</source>
        <translation>Nie udało się dodać parametru. Do „%1” nie można dodać parametru.</translation>
    </message>
    <message>
        <source>Error adding static route. Static route parametrs can not be empty.</source>
        <translation>Nie udało się dodać trasy statycznej. Parametry trasy statycznej nie mogą być puste.</translation>
    </message>
    <message>
        <source>Error adding lease time. Can not add to &apos;%1&apos;</source>
        <translation>Nie udało się dodać czasu dzierżawy. Do „%1” nie można dodać czasu dzierżawy.</translation>
    </message>
    <message>
        <source>Error adding static route. Can not add static rout to &apos;%1&apos;</source>
        <translation>Nie udało się dodać trasy statycznej. Do „%1” nie można dodać trasy statycznej.</translation>
    </message>
    <message>
        <source>Error adding gateways. Can not add to &apos;%1&apos;</source>
        <translation>Nie udało się dodać bram. Do „%1” nie można dodać bram.</translation>
    </message>
    <message>
        <source>Error adding DNS servers. Can not add to &apos;%1&apos;</source>
        <translation>Nie udało się dodać serwerów DNS. Do „%1” nie można dodać serwerów DNS.</translation>
    </message>
    <message>
        <source>Error adding NTP servers address. Can not add to &apos;%1&apos;</source>
        <translation>Nie udało się dodać adresów serwerów NTP. Do „%1” nie można dodać adresów serwerów NTP.</translation>
    </message>
    <message>
        <source>Error adding domain name. Can not add to &apos;%1&apos;</source>
        <translation>Nie udało się dodać nazwy domeny. Do „%1” nie można dodać nazwy domeny.</translation>
    </message>
    <message>
        <source>Error editing &apos;%1&apos;. The block would be nested too deeply.</source>
        <translation>Nie udało się zmienić „%1”. Blok byłby zagnieżdżony zbyt głęboko.</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigStatement</name>
    <message>
        <source>All network</source>
        <translation>Cała sieć</translation>
    </message>
    <message>
        <source>Subnet</source>
        <translation>Podsieć</translation>
    </message>
    <message>
        <source>Shared network</source>
        <translation>Sieć współdzielona</translation>
    </message>
    <message>
        <source>Host</source>
        <translation>Host</translation>
    </message>
    <message>
        <source>Range</source>
        <translation>Zakres adresów</translation>
    </message>
    <message>
        <source>Fixed address</source>
        <translation>Stały adres</translation>
    </message>
    <message>
        <source>Key information</source>
        <translation>Informacje o kluczu</translation>
    </message>
    <message>
        <source>Zone served by DNS server</source>
        <translation>Strefa obsługiwana przez serwer DNS</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Grupa</translation>
    </message>
    <message>
        <source> mounth </source>
        <translation> mies. </translation>
    </message>
    <message>
        <source> days </source>
        <translation> d </translation>
    </message>
    <message>
        <source> hours </source>
        <translation> godz. </translation>
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
        <translation>Bramy</translation>
    </message>
    <message>
        <source>DNS servers</source>
        <translation>Serwery DNS</translation>
    </message>
    <message>
        <source>NTP servers</source>
        <translation>Serwery NTP</translation>
    </message>
    <message>
        <source>Domain name</source>
        <translation>Nazwa domeny</translation>
    </message>
    <message>
        <source>Static route MS</source>
        <translation>Trasa statyczna (MS)</translation>
    </message>
    <message>
        <source>Static route</source>
        <translation>Trasa statyczna</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>Adres MAC</translation>
    </message>
    <message>
        <source>Max lease time</source>
        <translation>Maksymalny czas dzierżawy</translation>
    </message>
    <message>
        <source>Default lease time</source>
        <translation>Domyślny czas dzierżawy</translation>
    </message>
    <message>
        <source>Key</source>
        <translation>Klucz</translation>
    </message>
    <message>
        <source>Key generation algorithm</source>
        <translation>Algorytm klucza</translation>
    </message>
    <message>
        <source>Generated secret</source>
        <translation>Sekret klucza</translation>
    </message>
    <message>
        <source>Master DNS Server</source>
        <translation>Podstawowy serwer DNS</translation>
    </message>
</context>
<context>
    <name>DhcpdLeasesModel</name>
    <message>
        <source>IP address</source>
        <translation>Adres IP</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>Adres MAC</translation>
    </message>
    <message>
        <source>Host name</source>
        <translation>Nazwa hosta</translation>
    </message>
    <message>
        <source>Binding state</source>
        <translation>Stan powiązania</translation>
    </message>
    <message>
        <source>Rental start</source>
        <translation>Początek dzierżawy</translation>
    </message>
    <message>
        <source>Rental end</source>
        <translation>Koniec dzierżawy</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Nie można otworzyć pliku „%1” do odczytu.</translation>
    </message>
</context>
<context>
    <name>DomainInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Okno dialogowe</translation>
    </message>
    <message>
        <source>Domain name:</source>
        <translation>Nazwa domeny:</translation>
    </message>
</context>
<context>
    <name>FMain</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>Konfiguracja serwera DHCP</translation>
    </message>
    <message>
        <source>Topology</source>
        <translation>Topologia</translation>
    </message>
    <message>
        <source>Leases</source>
        <translation>Dzierżawy</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Szukaj</translation>
    </message>
    <message>
        <source>Previous match</source>
        <translation>Poprzedni wynik</translation>
    </message>
    <message>
        <source>...</source>
        <translation>...</translation>
    </message>
    <message>
        <source>Next match</source>
        <translation>Następny wynik</translation>
    </message>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Plik</translation>
    </message>
    <message>
        <source>Server</source>
        <translation>Serwer</translation>
    </message>
    <message>
        <source>toolBar</source>
        <translation>Pasek narzędzi</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>Wczytaj ponownie</translation>
    </message>
    <message>
        <source>F5</source>
        <translation>F5</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Zapisz</translation>
    </message>
    <message>
        <source>Ctrl+S</source>
        <translation>Ctrl+S</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>Zakończ</translation>
    </message>
    <message>
        <source>Restart DHCP-server</source>
        <translation>Uruchom ponownie serwer DHCP</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>Wybierz interfejsy</translation>
    </message>
    <message>
        <source>Start DHCP-server</source>
        <translation>Uruchom serwer DHCP</translation>
    </message>
    <message>
        <source>Start or stop DHCP-server</source>
        <translation>Uruchom lub zatrzymaj serwer DHCP</translation>
    </message>
    <message>
        <source>Ctrl+R</source>
        <translation>Ctrl+R</translation>
    </message>
    <message>
        <source>Add subnet</source>
        <translation>Dodaj podsieć</translation>
    </message>
    <message>
        <source>Add shared network</source>
        <translation>Dodaj sieć współdzieloną</translation>
    </message>
    <message>
        <source>Add host</source>
        <translation>Dodaj host</translation>
    </message>
    <message>
        <source>Add range</source>
        <translation>Dodaj zakres adresów</translation>
    </message>
    <message>
        <source>Add arbitrary parameter</source>
        <translation>Dodaj parametr jako tekst</translation>
    </message>
    <message>
        <source>Add arbitrary declaration</source>
        <translation>Dodaj deklarację jako tekst</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Edytuj</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Usuń</translation>
    </message>
    <message>
        <source>Add fixed IP</source>
        <translation>Dodaj stały adres IP</translation>
    </message>
    <message>
        <source>Add DNS servers</source>
        <translation>Dodaj serwery DNS</translation>
    </message>
    <message>
        <source>Add domain name</source>
        <translation>Dodaj nazwę domeny</translation>
    </message>
    <message>
        <source>Add gateways</source>
        <translation>Dodaj bramy</translation>
    </message>
    <message>
        <source>Add NTP servers</source>
        <translation>Dodaj serwery NTP</translation>
    </message>
    <message>
        <source>Add default lease time</source>
        <translation>Dodaj domyślny czas dzierżawy</translation>
    </message>
    <message>
        <source>Add max lease time</source>
        <translation>Dodaj maksymalny czas dzierżawy</translation>
    </message>
    <message>
        <source>Reserve an IP address</source>
        <translation>Zarezerwuj adres IP</translation>
    </message>
    <message>
        <source>Add static route</source>
        <translation>Dodaj trasę statyczną</translation>
    </message>
    <message>
        <source>Add DHCP dynamic zone update</source>
        <translation>Dodaj dynamiczną aktualizację strefy DNS</translation>
    </message>
    <message>
        <source>%1 more</source>
        <translation>jeszcze %1</translation>
    </message>
    <message>
        <source>%1 and %2</source>
        <translation>%1 i %2</translation>
    </message>
    <message>
        <source>The configuration could not be read, so there is nothing to save.</source>
        <translation>Nie udało się odczytać konfiguracji, więc nie ma czego zapisać.</translation>
    </message>
    <message>
        <source>The text would be too long, or its blocks nested too deeply, to be read again.</source>
        <translation>Tekst byłby zbyt długi albo jego bloki byłyby zagnieżdżone zbyt głęboko, aby można było go ponownie odczytać.</translation>
    </message>
    <message>
        <source>The configuration has been changed.
Do you want to overwrite the configuration?</source>
        <translation>Konfiguracja w pliku została zmieniona poza tym programem.
Czy ją zastąpić?</translation>
    </message>
    <message>
        <source>Current configuration in file will be rewrited.
Do you want to save changes?</source>
        <translation>Bieżąca konfiguracja w pliku zostanie zastąpiona.
Czy zapisać zmiany?</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Informacja</translation>
    </message>
    <message>
        <source>The DHCP server refuses this configuration:
%1</source>
        <translation>Serwer DHCP odrzuca tę konfigurację:
%1</translation>
    </message>
    <message>
        <source>Answer of the DHCP server</source>
        <translation>Odpowiedź serwera DHCP</translation>
    </message>
    <message>
        <source>The comment of the file will not be kept.</source>
        <translation>Komentarz z pliku nie zostanie zachowany.</translation>
    </message>
    <message>
        <source>The %1 comments of the file will not be kept.</source>
        <translation>Komentarze z pliku (%1) nie zostaną zachowane.</translation>
    </message>
    <message>
        <source>The quoted text in line %1 will be changed.</source>
        <translation>Tekst w cudzysłowie w wierszu %1 zostanie zmieniony.</translation>
    </message>
    <message>
        <source>The quoted texts in lines %1 will be changed.</source>
        <translation>Teksty w cudzysłowach w wierszach %1 zostaną zmienione.</translation>
    </message>
    <message>
        <source>The statement in line %1 will be changed.</source>
        <translation>Instrukcja w wierszu %1 zostanie zmieniona.</translation>
    </message>
    <message>
        <source>The statements in lines %1 will be changed.</source>
        <translation>Instrukcje w wierszach %1 zostaną zmienione.</translation>
    </message>
    <message>
        <source>The carriage return in line %1 will become part of a word.</source>
        <translation>Znak powrotu karetki w wierszu %1 stanie się częścią słowa.</translation>
    </message>
    <message>
        <source>The carriage returns in lines %1 will become parts of words.</source>
        <translation>Znaki powrotu karetki w wierszach %1 staną się częściami słów.</translation>
    </message>
    <message>
        <source>Declaration:</source>
        <translation>Deklaracja:</translation>
    </message>
    <message>
        <source>Edit arbitrary declaration</source>
        <translation>Edytuj deklarację jako tekst</translation>
    </message>
    <message>
        <source>Edit shared network</source>
        <translation>Edytuj sieć współdzieloną</translation>
    </message>
    <message>
        <source>Edit subnet</source>
        <translation>Edytuj podsieć</translation>
    </message>
    <message>
        <source>Edit range</source>
        <translation>Edytuj zakres adresów</translation>
    </message>
    <message>
        <source>Edit host</source>
        <translation>Edytuj host</translation>
    </message>
    <message>
        <source>The IP address is reserved.
Go to topology?</source>
        <translation>Adres IP został zarezerwowany.
Czy przejść do topologii?</translation>
    </message>
    <message>
        <source>Add fixed address</source>
        <translation>Dodaj stały adres</translation>
    </message>
    <message>
        <source>Edit fixed address</source>
        <translation>Edytuj stały adres</translation>
    </message>
    <message>
        <source>Edit static route</source>
        <translation>Edytuj trasę statyczną</translation>
    </message>
    <message>
        <source>Add configuration to automatically configure binding with bind9 DNS server?</source>
        <translation>Czy dodać ustawienia, które automatycznie powiążą serwer DHCP z serwerem DNS bind9?</translation>
    </message>
    <message>
        <source>Choose the bind9 configuration with the update key</source>
        <translation>Wybierz konfigurację bind9 z kluczem aktualizacji</translation>
    </message>
    <message>
        <source>These zones were left out:</source>
        <translation>Pominięto następujące strefy:</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>the name server is not its primary one</source>
        <translation>ten serwer nazw nie jest jej serwerem podstawowym</translation>
    </message>
    <message>
        <source>no key may update it</source>
        <translation>żaden klucz nie ma prawa jej aktualizować</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its name</source>
        <translation>serwer DHCP nie akceptuje jej nazwy</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; is not known</source>
        <translation>jej klucz „%1” jest nieznany</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its key &apos;%1&apos;</source>
        <translation>serwer DHCP nie akceptuje jej klucza „%1”</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; stands behind this place in the configuration</source>
        <translation>jej klucz „%1” jest w konfiguracji zdefiniowany dopiero za tym miejscem</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Wartość</translation>
    </message>
    <message>
        <source>Do you want to reload configuration from file?</source>
        <translation>Czy wczytać ponownie konfigurację z pliku?</translation>
    </message>
    <message>
        <source>Confirmation</source>
        <translation>Potwierdzenie</translation>
    </message>
    <message>
        <source>There are unsaved changes, save?</source>
        <translation>Istnieją niezapisane zmiany. Czy je zapisać?</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Błąd</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Działania</translation>
    </message>
    <message>
        <source>Clear the search</source>
        <translation>Wyczyść wyszukiwanie</translation>
    </message>
    <message>
        <source>Edit gateways</source>
        <translation>Edytuj bramy</translation>
    </message>
    <message>
        <source>Gateways:</source>
        <translation>Bramy:</translation>
    </message>
    <message>
        <source>Edit DNS servers</source>
        <translation>Edytuj serwery DNS</translation>
    </message>
    <message>
        <source>DNS servers:</source>
        <translation>Serwery DNS:</translation>
    </message>
    <message>
        <source>Edit NTP servers</source>
        <translation>Edytuj serwery NTP</translation>
    </message>
    <message>
        <source>NTP servers:</source>
        <translation>Serwery NTP:</translation>
    </message>
    <message>
        <source>Edit domain name</source>
        <translation>Edytuj nazwę domeny</translation>
    </message>
    <message>
        <source>Edit default lease time</source>
        <translation>Edytuj domyślny czas dzierżawy</translation>
    </message>
    <message>
        <source>Edit max lease time</source>
        <translation>Edytuj maksymalny czas dzierżawy</translation>
    </message>
    <message>
        <source>Edit MAC address</source>
        <translation>Edytuj adres MAC</translation>
    </message>
    <message>
        <source>Edit time</source>
        <translation>Edytuj czas</translation>
    </message>
    <message>
        <source>Parameter:</source>
        <translation>Parametr:</translation>
    </message>
    <message>
        <source>Edit arbitrary parameter</source>
        <translation>Edytuj parametr jako tekst</translation>
    </message>
    <message>
        <source>Stop DHCP-server</source>
        <translation>Zatrzymaj serwer DHCP</translation>
    </message>
    <message>
        <source>Warning!</source>
        <translation>Ostrzeżenie!</translation>
    </message>
    <message>
        <source>This editing mode for advanced users.
After applying this changes configuration may be incorrect.
Do you want to resume?</source>
        <translation>Ten tryb edycji jest przeznaczony dla zaawansowanych użytkowników.
Po wprowadzeniu zmian konfiguracja może być nieprawidłowa.
Czy kontynuować?</translation>
    </message>
    <message>
        <source>Add option</source>
        <translation>Dodaj opcję</translation>
    </message>
    <message>
        <source>Add parameter</source>
        <translation>Dodaj parametr</translation>
    </message>
    <message>
        <source>Leases found: %1</source>
        <translation>Znalezione dzierżawy: %1</translation>
    </message>
    <message>
        <source>No leases found</source>
        <translation>Nie znaleziono dzierżaw</translation>
    </message>
</context>
<context>
    <name>HandbookViewer</name>
    <message>
        <source>Not found</source>
        <translation>Nie znaleziono</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Spis treści</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Szukaj</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Wstecz</translation>
    </message>
</context>
<context>
    <name>HostInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Okno dialogowe</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Nazwa:</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>Adres MAC:</translation>
    </message>
    <message>
        <source>Fixed IP:</source>
        <translation>Stały adres IP:</translation>
    </message>
</context>
<context>
    <name>IpInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Okno dialogowe</translation>
    </message>
    <message>
        <source>IP:</source>
        <translation>Adres IP:</translation>
    </message>
</context>
<context>
    <name>MacInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Okno dialogowe</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>Adres MAC:</translation>
    </message>
</context>
<context>
    <name>MultipleIpInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Okno dialogowe</translation>
    </message>
    <message>
        <source>IP addresses</source>
        <translation>Adresy IP</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Dodaj</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Usuń</translation>
    </message>
    <message>
        <source>Add IP</source>
        <translation>Dodaj adres IP</translation>
    </message>
</context>
<context>
    <name>OrvHelpMenu</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>Konfiguracja serwera DHCP</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>Pomo&amp;c</translation>
    </message>
    <message>
        <source>Manual</source>
        <translation>Strona podręcznika</translation>
    </message>
    <message>
        <source>About %1</source>
        <translation>O programie %1</translation>
    </message>
    <message>
        <source>About Qt</source>
        <translation>O Qt</translation>
    </message>
    <message>
        <source>Free software under the GNU General Public License, version 3 or later. There is no warranty, to the extent permitted by law.</source>
        <translation>Wolne oprogramowanie udostępniane na warunkach Powszechnej Licencji Publicznej GNU (GNU GPL) w wersji 3 lub nowszej. Program nie jest objęty żadną gwarancją w zakresie dozwolonym przez prawo.</translation>
    </message>
    <message>
        <source>Handbook</source>
        <translation>Podręcznik</translation>
    </message>
</context>
<context>
    <name>QAbstractTableModel</name>
    <message>
        <source>Net mask</source>
        <translation>Maska sieci</translation>
    </message>
    <message>
        <source>IP net</source>
        <translation>Sieć IP</translation>
    </message>
    <message>
        <source>Gateway</source>
        <translation>Brama</translation>
    </message>
</context>
<context>
    <name>QDialog</name>
    <message>
        <source>Available interfaces</source>
        <translation>Dostępne interfejsy</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>Wybierz interfejsy</translation>
    </message>
    <message>
        <source>Available interfaces are not found!</source>
        <translation>Nie znaleziono dostępnych interfejsów.</translation>
    </message>
</context>
<context>
    <name>QObject</name>
    <message>
        <source>Error</source>
        <translation>Błąd</translation>
    </message>
    <message>
        <source>Must be superuser</source>
        <translation>Ten program należy uruchomić z uprawnieniami superużytkownika.</translation>
    </message>
    <message>
        <source>Updating DHCP-server status...</source>
        <translation>Sprawdzanie stanu serwera DHCP…</translation>
    </message>
    <message>
        <source>DHCP-server is running</source>
        <translation>Serwer DHCP działa</translation>
    </message>
    <message>
        <source>DHCP-server is stopped</source>
        <translation>Serwer DHCP jest zatrzymany</translation>
    </message>
    <message>
        <source>DHCP-server already running</source>
        <translation>Serwer DHCP już działa.</translation>
    </message>
    <message>
        <source>DHCP-server already stopped</source>
        <translation>Serwer DHCP jest już zatrzymany.</translation>
    </message>
    <message>
        <source>Checking DHCP-server status failed
%1</source>
        <translation>Nie udało się sprawdzić stanu serwera DHCP.
%1</translation>
    </message>
    <message>
        <source>Some operation with DHCP-server already executes</source>
        <translation>Trwa już inna operacja na serwerze DHCP.</translation>
    </message>
    <message>
        <source>Operation with DHCP-server failed
%1</source>
        <translation>Operacja na serwerze DHCP nie powiodła się.
%1</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Nie można otworzyć pliku „%1” do odczytu.</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>Nie można otworzyć pliku „%1” do zapisu.</translation>
    </message>
    <message>
        <source>The choice of interfaces is not stored, since file &apos;%1&apos; has no line with &apos;%2&apos;</source>
        <translation>Wybór interfejsów nie został zapisany, ponieważ w pliku „%1” nie ma wiersza z „%2”.</translation>
    </message>
</context>
<context>
    <name>QtSingleApplication</name>
    <message>
        <source>Error</source>
        <translation>Błąd</translation>
    </message>
    <message>
        <source>The program does not start, since it cannot tell whether it is running already: there is no folder &apos;%1&apos; that only the superuser can enter.</source>
        <translation>Programu nie można uruchomić, ponieważ nie da się ustalić, czy już działa: nie ma katalogu „%1”, do którego dostęp ma wyłącznie superużytkownik.</translation>
    </message>
</context>
<context>
    <name>RangeInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Okno dialogowe</translation>
    </message>
    <message>
        <source>Start IP:</source>
        <translation>Początkowy adres IP:</translation>
    </message>
    <message>
        <source>End IP:</source>
        <translation>Końcowy adres IP:</translation>
    </message>
</context>
<context>
    <name>SharedNetworkInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Okno dialogowe</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Nazwa:</translation>
    </message>
</context>
<context>
    <name>StatementInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Okno dialogowe</translation>
    </message>
    <message>
        <source>Attributes:</source>
        <translation>Atrybuty:</translation>
    </message>
</context>
<context>
    <name>StaticRouteInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Okno dialogowe</translation>
    </message>
    <message>
        <source>Static routes</source>
        <translation>Trasy statyczne</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Dodaj</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Usuń</translation>
    </message>
    <message>
        <source>Route for MS systems</source>
        <translation>Trasa dla systemów MS</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Informacja</translation>
    </message>
    <message>
        <source>There is an empty cell.
To add, fill in the cell.</source>
        <translation>Jedna z komórek jest pusta.
Wypełnij ją, aby dodać trasę.</translation>
    </message>
</context>
<context>
    <name>SubnetInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Okno dialogowe</translation>
    </message>
    <message>
        <source>Address:</source>
        <translation>Adres:</translation>
    </message>
    <message>
        <source>Netmask:</source>
        <translation>Maska sieci:</translation>
    </message>
</context>
<context>
    <name>TimeInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Okno dialogowe</translation>
    </message>
    <message>
        <source>Mounth:</source>
        <translation>Miesiące:</translation>
    </message>
    <message>
        <source>Days:</source>
        <translation>Dni:</translation>
    </message>
    <message>
        <source>Hours</source>
        <translation>Godziny</translation>
    </message>
    <message>
        <source> h</source>
        <translation> godz.</translation>
    </message>
    <message>
        <source>:</source>
        <translation>:</translation>
    </message>
    <message>
        <source>Minutes</source>
        <translation>Minuty</translation>
    </message>
    <message>
        <source> m</source>
        <translation> min</translation>
    </message>
    <message>
        <source>Seconds</source>
        <translation>Sekundy</translation>
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
        <translation>Nie można zachować poprzedniej zawartości na czas jej zastępowania.</translation>
    </message>
    <message>
        <source>%1. The file is damaged, its old content is kept in %2</source>
        <translation>%1. Plik jest uszkodzony, a jego poprzednia zawartość znajduje się w „%2”.</translation>
    </message>
</context>
</TS>
