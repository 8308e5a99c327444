<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ru">
<context>
    <name>ConfigCheck</name>
    <message>
        <source>line %1</source>
        <translation>строка %1</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigModel</name>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Не удалось открыть файл «%1» для чтения.</translation>
    </message>
    <message>
        <source>The blocks of the file are nested too deeply.</source>
        <translation>Слишком глубокая вложенность блоков в файле.</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>Не удалось открыть файл «%1» для записи.</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1</source>
        <translation>Указано недопустимое время в секундах: «%1».</translation>
    </message>
    <message>
        <source>Invalid one or more IP in list &apos;%1&apos;</source>
        <translation>В списке «%1» есть недопустимые IP-адреса.</translation>
    </message>
    <message>
        <source>Invalid domain name &apos;%1&apos;</source>
        <translation>Указано недопустимое имя домена «%1».</translation>
    </message>
    <message>
        <source>Invalid MAC &apos;%1&apos;</source>
        <translation>Указан недопустимый MAC-адрес «%1».</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1&apos;</source>
        <translation>Указано недопустимое время в секундах: «%1».</translation>
    </message>
    <message>
        <source>Error editing subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>Не удалось изменить подсеть. Указана недопустимая подсеть «%1».</translation>
    </message>
    <message>
        <source>Invalid IP &apos;%1&apos;</source>
        <translation>Указан недопустимый IP-адрес «%1».</translation>
    </message>
    <message>
        <source>Error editing range. Can not edit range in &apos;%1&apos;</source>
        <translation>Не удалось изменить диапазон адресов. В «%1» нельзя изменить диапазон адресов.</translation>
    </message>
    <message>
        <source>Error editing range. Invalid attributes of parent subnet</source>
        <translation>Не удалось изменить диапазон адресов. У родительской подсети недопустимые атрибуты.</translation>
    </message>
    <message>
        <source>Error editing range. Invalid parent subnet</source>
        <translation>Не удалось изменить диапазон адресов. Родительская подсеть недопустима.</translation>
    </message>
    <message>
        <source>Error editing range. Invalid start IP &apos;%1&apos;</source>
        <translation>Не удалось изменить диапазон адресов. Указан недопустимый начальный IP-адрес «%1».</translation>
    </message>
    <message>
        <source>Error editing range. Invalid end IP &apos;%1&apos;</source>
        <translation>Не удалось изменить диапазон адресов. Указан недопустимый конечный IP-адрес «%1».</translation>
    </message>
    <message>
        <source>Error adding shared-network. Can not add shared-network to &apos;%1&apos;</source>
        <translation>Не удалось добавить общую сеть. В «%1» нельзя добавить общую сеть.</translation>
    </message>
    <message>
        <source>Error adding subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>Не удалось добавить подсеть. Указана недопустимая подсеть «%1».</translation>
    </message>
    <message>
        <source>Error adding subnet. Can not add subnet to &apos;%1&apos;</source>
        <translation>Не удалось добавить подсеть. В «%1» нельзя добавить подсеть.</translation>
    </message>
    <message>
        <source>Error adding range. Can not add range to &apos;%1&apos;</source>
        <translation>Не удалось добавить диапазон адресов. В «%1» нельзя добавить диапазон адресов.</translation>
    </message>
    <message>
        <source>Error adding range. Invalid attributes of parent subnet</source>
        <translation>Не удалось добавить диапазон адресов. У родительской подсети недопустимые атрибуты.</translation>
    </message>
    <message>
        <source>Error adding range. Invalid parent subnet</source>
        <translation>Не удалось добавить диапазон адресов. Родительская подсеть недопустима.</translation>
    </message>
    <message>
        <source>Error adding range. Invalid start IP &apos;%1&apos;</source>
        <translation>Не удалось добавить диапазон адресов. Указан недопустимый начальный IP-адрес «%1».</translation>
    </message>
    <message>
        <source>Error adding range. Invalid end IP &apos;%1&apos;</source>
        <translation>Не удалось добавить диапазон адресов. Указан недопустимый конечный IP-адрес «%1».</translation>
    </message>
    <message>
        <source>Error adding host. Can not add host to &apos;%1&apos;</source>
        <translation>Не удалось добавить узел. В «%1» нельзя добавить узел.</translation>
    </message>
    <message>
        <source>Error adding host. Host name can not be empty.</source>
        <translation>Не удалось добавить узел. Имя узла не может быть пустым.</translation>
    </message>
    <message>
        <source>Error adding fixed address. Can not add to &apos;%1&apos;</source>
        <translation>Не удалось добавить фиксированный адрес. В «%1» нельзя добавить фиксированный адрес.</translation>
    </message>
    <message>
        <source>Error adding fixed address. Invalid IP &apos;%1&apos;</source>
        <translation>Не удалось добавить фиксированный адрес. Указан недопустимый IP-адрес «%1».</translation>
    </message>
    <message>
        <source>Error adding bind9. Can not add bind9 to &apos;%1&apos;</source>
        <translation>Не удалось добавить настройки bind9. В «%1» нельзя добавить настройки bind9.</translation>
    </message>
    <message>
        <source>Error adding bind9. bind9 can not be empty.</source>
        <translation>Не удалось добавить настройки bind9. Настройки bind9 не могут быть пустыми.</translation>
    </message>
    <message>
        <source>Error adding declaration. Can not add declaration to &apos;%1&apos;</source>
        <translation>Не удалось добавить объявление. В «%1» нельзя добавить объявление.</translation>
    </message>
    <message>
        <source>Error adding parameter. Can not add parameter to &apos;%1&apos;</source>
        <translation>Не удалось добавить параметр. В «%1» нельзя добавить параметр.</translation>
    </message>
    <message>
        <source>Error adding static route. Static route parametrs can not be empty.</source>
        <translation>Не удалось добавить статический маршрут. Параметры статического маршрута не могут быть пустыми.</translation>
    </message>
    <message>
        <source>Error adding lease time. Can not add to &apos;%1&apos;</source>
        <translation>Не удалось добавить срок аренды. В «%1» нельзя добавить срок аренды.</translation>
    </message>
    <message>
        <source>Error adding static route. Can not add static rout to &apos;%1&apos;</source>
        <translation>Не удалось добавить статический маршрут. В «%1» нельзя добавить статический маршрут.</translation>
    </message>
    <message>
        <source>Error adding gateways. Can not add to &apos;%1&apos;</source>
        <translation>Не удалось добавить шлюзы. В «%1» нельзя добавить шлюзы.</translation>
    </message>
    <message>
        <source>Error adding DNS servers. Can not add to &apos;%1&apos;</source>
        <translation>Не удалось добавить DNS-серверы. В «%1» нельзя добавить DNS-серверы.</translation>
    </message>
    <message>
        <source>Error adding NTP servers address. Can not add to &apos;%1&apos;</source>
        <translation>Не удалось добавить адреса NTP-серверов. В «%1» нельзя добавить адреса NTP-серверов.</translation>
    </message>
    <message>
        <source>Error adding domain name. Can not add to &apos;%1&apos;</source>
        <translation>Не удалось добавить имя домена. В «%1» нельзя добавить имя домена.</translation>
    </message>
    <message>
        <source>Error editing &apos;%1&apos;. The block would be nested too deeply.</source>
        <translation>Не удалось изменить «%1». Блок оказался бы вложен слишком глубоко.</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigStatement</name>
    <message>
        <source>All network</source>
        <translation>Вся сеть</translation>
    </message>
    <message>
        <source>Subnet</source>
        <translation>Подсеть</translation>
    </message>
    <message>
        <source>Shared network</source>
        <translation>Общая сеть</translation>
    </message>
    <message>
        <source>Host</source>
        <translation>Узел</translation>
    </message>
    <message>
        <source>Range</source>
        <translation>Диапазон адресов</translation>
    </message>
    <message>
        <source>Fixed address</source>
        <translation>Фиксированный адрес</translation>
    </message>
    <message>
        <source>Key information</source>
        <translation>Сведения о ключе</translation>
    </message>
    <message>
        <source>Zone served by DNS server</source>
        <translation>Зона, обслуживаемая DNS-сервером</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>Группа</translation>
    </message>
    <message>
        <source> mounth </source>
        <translation> мес. </translation>
    </message>
    <message>
        <source> days </source>
        <translation> дн. </translation>
    </message>
    <message>
        <source> hours </source>
        <translation> ч </translation>
    </message>
    <message>
        <source> minutes </source>
        <translation> мин </translation>
    </message>
    <message>
        <source> seconds </source>
        <translation> с </translation>
    </message>
    <message>
        <source>Gateways</source>
        <translation>Шлюзы</translation>
    </message>
    <message>
        <source>DNS servers</source>
        <translation>DNS-серверы</translation>
    </message>
    <message>
        <source>NTP servers</source>
        <translation>NTP-серверы</translation>
    </message>
    <message>
        <source>Domain name</source>
        <translation>Имя домена</translation>
    </message>
    <message>
        <source>Static route MS</source>
        <translation>Статический маршрут (MS)</translation>
    </message>
    <message>
        <source>Static route</source>
        <translation>Статический маршрут</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>MAC-адрес</translation>
    </message>
    <message>
        <source>Max lease time</source>
        <translation>Максимальный срок аренды</translation>
    </message>
    <message>
        <source>Default lease time</source>
        <translation>Срок аренды по умолчанию</translation>
    </message>
    <message>
        <source>Key</source>
        <translation>Ключ</translation>
    </message>
    <message>
        <source>Key generation algorithm</source>
        <translation>Алгоритм ключа</translation>
    </message>
    <message>
        <source>Generated secret</source>
        <translation>Секрет ключа</translation>
    </message>
    <message>
        <source>Master DNS Server</source>
        <translation>Первичный DNS-сервер</translation>
    </message>
</context>
<context>
    <name>DhcpdLeasesModel</name>
    <message>
        <source>IP address</source>
        <translation>IP-адрес</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>MAC-адрес</translation>
    </message>
    <message>
        <source>Host name</source>
        <translation>Имя узла</translation>
    </message>
    <message>
        <source>Binding state</source>
        <translation>Состояние привязки</translation>
    </message>
    <message>
        <source>Rental start</source>
        <translation>Начало аренды</translation>
    </message>
    <message>
        <source>Rental end</source>
        <translation>Окончание аренды</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Не удалось открыть файл «%1» для чтения.</translation>
    </message>
</context>
<context>
    <name>DomainInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Диалог</translation>
    </message>
    <message>
        <source>Domain name:</source>
        <translation>Имя домена:</translation>
    </message>
</context>
<context>
    <name>FMain</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>Настройка DHCP-сервера</translation>
    </message>
    <message>
        <source>Topology</source>
        <translation>Топология</translation>
    </message>
    <message>
        <source>Leases</source>
        <translation>Арендованные адреса</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Поиск</translation>
    </message>
    <message>
        <source>Previous match</source>
        <translation>Предыдущее совпадение</translation>
    </message>
    <message>
        <source>...</source>
        <translation>...</translation>
    </message>
    <message>
        <source>Next match</source>
        <translation>Следующее совпадение</translation>
    </message>
    <message>
        <source>&amp;File</source>
        <translation>&amp;Файл</translation>
    </message>
    <message>
        <source>Server</source>
        <translation>Сервер</translation>
    </message>
    <message>
        <source>toolBar</source>
        <translation>Панель инструментов</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>Загрузить заново</translation>
    </message>
    <message>
        <source>F5</source>
        <translation>F5</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>Сохранить</translation>
    </message>
    <message>
        <source>Ctrl+S</source>
        <translation>Ctrl+S</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>Выход</translation>
    </message>
    <message>
        <source>Restart DHCP-server</source>
        <translation>Перезапустить DHCP-сервер</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>Выбрать интерфейсы</translation>
    </message>
    <message>
        <source>Start DHCP-server</source>
        <translation>Запустить DHCP-сервер</translation>
    </message>
    <message>
        <source>Start or stop DHCP-server</source>
        <translation>Запустить или остановить DHCP-сервер</translation>
    </message>
    <message>
        <source>Ctrl+R</source>
        <translation>Ctrl+R</translation>
    </message>
    <message>
        <source>Add subnet</source>
        <translation>Добавить подсеть</translation>
    </message>
    <message>
        <source>Add shared network</source>
        <translation>Добавить общую сеть</translation>
    </message>
    <message>
        <source>Add host</source>
        <translation>Добавить узел</translation>
    </message>
    <message>
        <source>Add range</source>
        <translation>Добавить диапазон адресов</translation>
    </message>
    <message>
        <source>Add arbitrary parameter</source>
        <translation>Добавить параметр в виде текста</translation>
    </message>
    <message>
        <source>Add arbitrary declaration</source>
        <translation>Добавить объявление в виде текста</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>Изменить</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Удалить</translation>
    </message>
    <message>
        <source>Add fixed IP</source>
        <translation>Добавить фиксированный IP-адрес</translation>
    </message>
    <message>
        <source>Add DNS servers</source>
        <translation>Добавить DNS-серверы</translation>
    </message>
    <message>
        <source>Add domain name</source>
        <translation>Добавить имя домена</translation>
    </message>
    <message>
        <source>Add gateways</source>
        <translation>Добавить шлюзы</translation>
    </message>
    <message>
        <source>Add NTP servers</source>
        <translation>Добавить NTP-серверы</translation>
    </message>
    <message>
        <source>Add default lease time</source>
        <translation>Добавить срок аренды по умолчанию</translation>
    </message>
    <message>
        <source>Add max lease time</source>
        <translation>Добавить максимальный срок аренды</translation>
    </message>
    <message>
        <source>Reserve an IP address</source>
        <translation>Зарезервировать IP-адрес</translation>
    </message>
    <message>
        <source>Add static route</source>
        <translation>Добавить статический маршрут</translation>
    </message>
    <message>
        <source>Add DHCP dynamic zone update</source>
        <translation>Добавить динамическое обновление зоны DNS</translation>
    </message>
    <message>
        <source>%1 more</source>
        <translation>ещё %1</translation>
    </message>
    <message>
        <source>%1 and %2</source>
        <translation>%1 и %2</translation>
    </message>
    <message>
        <source>The configuration could not be read, so there is nothing to save.</source>
        <translation>Конфигурацию не удалось прочитать, поэтому сохранять нечего.</translation>
    </message>
    <message>
        <source>The text would be too long, or its blocks nested too deeply, to be read again.</source>
        <translation>Текст оказался бы слишком длинным или его блоки — вложенными слишком глубоко, чтобы его можно было прочитать снова.</translation>
    </message>
    <message>
        <source>The configuration has been changed.
Do you want to overwrite the configuration?</source>
        <translation>Конфигурация в файле была изменена извне.
Перезаписать её?</translation>
    </message>
    <message>
        <source>Current configuration in file will be rewrited.
Do you want to save changes?</source>
        <translation>Текущая конфигурация в файле будет перезаписана.
Сохранить изменения?</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Информация</translation>
    </message>
    <message>
        <source>The DHCP server refuses this configuration:
%1</source>
        <translation>DHCP-сервер отклоняет эту конфигурацию:
%1</translation>
    </message>
    <message>
        <source>Answer of the DHCP server</source>
        <translation>Ответ DHCP-сервера</translation>
    </message>
    <message>
        <source>The comment of the file will not be kept.</source>
        <translation>Комментарий из файла не сохранится.</translation>
    </message>
    <message>
        <source>The %1 comments of the file will not be kept.</source>
        <translation>Комментарии из файла (%1) не сохранятся.</translation>
    </message>
    <message>
        <source>The quoted text in line %1 will be changed.</source>
        <translation>Текст в кавычках в строке %1 будет изменён.</translation>
    </message>
    <message>
        <source>The quoted texts in lines %1 will be changed.</source>
        <translation>Тексты в кавычках в строках %1 будут изменены.</translation>
    </message>
    <message>
        <source>The statement in line %1 will be changed.</source>
        <translation>Инструкция в строке %1 будет изменена.</translation>
    </message>
    <message>
        <source>The statements in lines %1 will be changed.</source>
        <translation>Инструкции в строках %1 будут изменены.</translation>
    </message>
    <message>
        <source>The carriage return in line %1 will become part of a word.</source>
        <translation>Символ возврата каретки в строке %1 станет частью слова.</translation>
    </message>
    <message>
        <source>The carriage returns in lines %1 will become parts of words.</source>
        <translation>Символы возврата каретки в строках %1 станут частями слов.</translation>
    </message>
    <message>
        <source>Declaration:</source>
        <translation>Объявление:</translation>
    </message>
    <message>
        <source>Edit arbitrary declaration</source>
        <translation>Изменить объявление в виде текста</translation>
    </message>
    <message>
        <source>Edit shared network</source>
        <translation>Изменить общую сеть</translation>
    </message>
    <message>
        <source>Edit subnet</source>
        <translation>Изменить подсеть</translation>
    </message>
    <message>
        <source>Edit range</source>
        <translation>Изменить диапазон адресов</translation>
    </message>
    <message>
        <source>Edit host</source>
        <translation>Изменить узел</translation>
    </message>
    <message>
        <source>The IP address is reserved.
Go to topology?</source>
        <translation>IP-адрес зарезервирован.
Перейти к топологии?</translation>
    </message>
    <message>
        <source>Add fixed address</source>
        <translation>Добавить фиксированный адрес</translation>
    </message>
    <message>
        <source>Edit fixed address</source>
        <translation>Изменить фиксированный адрес</translation>
    </message>
    <message>
        <source>Edit static route</source>
        <translation>Изменить статический маршрут</translation>
    </message>
    <message>
        <source>Add configuration to automatically configure binding with bind9 DNS server?</source>
        <translation>Добавить настройки для автоматической связи с DNS-сервером bind9?</translation>
    </message>
    <message>
        <source>Choose the bind9 configuration with the update key</source>
        <translation>Выбрать конфигурацию bind9 с ключом обновления</translation>
    </message>
    <message>
        <source>These zones were left out:</source>
        <translation>Пропущены следующие зоны:</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>the name server is not its primary one</source>
        <translation>этот сервер имён не является для неё первичным</translation>
    </message>
    <message>
        <source>no key may update it</source>
        <translation>ни один ключ не даёт права её обновлять</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its name</source>
        <translation>DHCP-сервер не принимает её имя</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; is not known</source>
        <translation>её ключ «%1» неизвестен</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its key &apos;%1&apos;</source>
        <translation>DHCP-сервер не принимает её ключ «%1»</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; stands behind this place in the configuration</source>
        <translation>её ключ «%1» определён в конфигурации после этого места</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>Значение</translation>
    </message>
    <message>
        <source>Do you want to reload configuration from file?</source>
        <translation>Загрузить конфигурацию из файла заново?</translation>
    </message>
    <message>
        <source>Confirmation</source>
        <translation>Подтверждение</translation>
    </message>
    <message>
        <source>There are unsaved changes, save?</source>
        <translation>Имеются несохранённые изменения. Сохранить их?</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>Ошибка</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>Действия</translation>
    </message>
    <message>
        <source>Clear the search</source>
        <translation>Очистить поиск</translation>
    </message>
    <message>
        <source>Edit gateways</source>
        <translation>Изменить шлюзы</translation>
    </message>
    <message>
        <source>Gateways:</source>
        <translation>Шлюзы:</translation>
    </message>
    <message>
        <source>Edit DNS servers</source>
        <translation>Изменить DNS-серверы</translation>
    </message>
    <message>
        <source>DNS servers:</source>
        <translation>DNS-серверы:</translation>
    </message>
    <message>
        <source>Edit NTP servers</source>
        <translation>Изменить NTP-серверы</translation>
    </message>
    <message>
        <source>NTP servers:</source>
        <translation>NTP-серверы:</translation>
    </message>
    <message>
        <source>Edit domain name</source>
        <translation>Изменить имя домена</translation>
    </message>
    <message>
        <source>Edit default lease time</source>
        <translation>Изменить срок аренды по умолчанию</translation>
    </message>
    <message>
        <source>Edit max lease time</source>
        <translation>Изменить максимальный срок аренды</translation>
    </message>
    <message>
        <source>Edit MAC address</source>
        <translation>Изменить MAC-адрес</translation>
    </message>
    <message>
        <source>Edit time</source>
        <translation>Изменить срок</translation>
    </message>
    <message>
        <source>Parameter:</source>
        <translation>Параметр:</translation>
    </message>
    <message>
        <source>Edit arbitrary parameter</source>
        <translation>Изменить параметр в виде текста</translation>
    </message>
    <message>
        <source>Stop DHCP-server</source>
        <translation>Остановить DHCP-сервер</translation>
    </message>
    <message>
        <source>Warning!</source>
        <translation>Внимание!</translation>
    </message>
    <message>
        <source>This editing mode for advanced users.
After applying this changes configuration may be incorrect.
Do you want to resume?</source>
        <translation>Этот режим редактирования предназначен для опытных пользователей.
После внесения изменений конфигурация может оказаться неверной.
Продолжить?</translation>
    </message>
    <message>
        <source>Add option</source>
        <translation>Добавить опцию</translation>
    </message>
    <message>
        <source>Add parameter</source>
        <translation>Добавить параметр</translation>
    </message>
    <message>
        <source>Leases found: %1</source>
        <translation>Найдено аренд: %1</translation>
    </message>
    <message>
        <source>No leases found</source>
        <translation>Аренды не найдены</translation>
    </message>
</context>
<context>
    <name>HandbookViewer</name>
    <message>
        <source>Not found</source>
        <translation>Не найдено</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>Содержание</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>Поиск</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>Назад</translation>
    </message>
</context>
<context>
    <name>HostInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Диалог</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Имя:</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>MAC-адрес:</translation>
    </message>
    <message>
        <source>Fixed IP:</source>
        <translation>Фиксированный IP-адрес:</translation>
    </message>
</context>
<context>
    <name>IpInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Диалог</translation>
    </message>
    <message>
        <source>IP:</source>
        <translation>IP-адрес:</translation>
    </message>
</context>
<context>
    <name>MacInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Диалог</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>MAC-адрес:</translation>
    </message>
</context>
<context>
    <name>MultipleIpInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Диалог</translation>
    </message>
    <message>
        <source>IP addresses</source>
        <translation>IP-адреса</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Добавить</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Удалить</translation>
    </message>
    <message>
        <source>Add IP</source>
        <translation>Добавить IP-адрес</translation>
    </message>
</context>
<context>
    <name>OrvHelpMenu</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>Настройка DHCP-сервера</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>&amp;Справка</translation>
    </message>
    <message>
        <source>Manual</source>
        <translation>Страница руководства</translation>
    </message>
    <message>
        <source>About %1</source>
        <translation>О программе %1</translation>
    </message>
    <message>
        <source>About Qt</source>
        <translation>О Qt</translation>
    </message>
    <message>
        <source>Free software under the GNU General Public License, version 3 or later. There is no warranty, to the extent permitted by law.</source>
        <translation>Свободное программное обеспечение на условиях Стандартной общественной лицензии GNU (GNU GPL) версии 3 или более поздней. В пределах, допустимых законом, никакие гарантии не предоставляются.</translation>
    </message>
    <message>
        <source>Handbook</source>
        <translation>Руководство</translation>
    </message>
</context>
<context>
    <name>QAbstractTableModel</name>
    <message>
        <source>Net mask</source>
        <translation>Маска сети</translation>
    </message>
    <message>
        <source>IP net</source>
        <translation>IP-сеть</translation>
    </message>
    <message>
        <source>Gateway</source>
        <translation>Шлюз</translation>
    </message>
</context>
<context>
    <name>QDialog</name>
    <message>
        <source>Available interfaces</source>
        <translation>Доступные интерфейсы</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>Выбрать интерфейсы</translation>
    </message>
    <message>
        <source>Available interfaces are not found!</source>
        <translation>Доступные интерфейсы не найдены.</translation>
    </message>
</context>
<context>
    <name>QObject</name>
    <message>
        <source>Error</source>
        <translation>Ошибка</translation>
    </message>
    <message>
        <source>Must be superuser</source>
        <translation>Программу необходимо запускать от имени суперпользователя.</translation>
    </message>
    <message>
        <source>Updating DHCP-server status...</source>
        <translation>Проверка состояния DHCP-сервера…</translation>
    </message>
    <message>
        <source>DHCP-server is running</source>
        <translation>DHCP-сервер работает</translation>
    </message>
    <message>
        <source>DHCP-server is stopped</source>
        <translation>DHCP-сервер остановлен</translation>
    </message>
    <message>
        <source>DHCP-server already running</source>
        <translation>DHCP-сервер уже работает.</translation>
    </message>
    <message>
        <source>DHCP-server already stopped</source>
        <translation>DHCP-сервер уже остановлен.</translation>
    </message>
    <message>
        <source>Checking DHCP-server status failed
%1</source>
        <translation>Не удалось проверить состояние DHCP-сервера.
%1</translation>
    </message>
    <message>
        <source>Some operation with DHCP-server already executes</source>
        <translation>Уже выполняется другая операция с DHCP-сервером.</translation>
    </message>
    <message>
        <source>Operation with DHCP-server failed
%1</source>
        <translation>Не удалось выполнить операцию с DHCP-сервером.
%1</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>Не удалось открыть файл «%1» для чтения.</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>Не удалось открыть файл «%1» для записи.</translation>
    </message>
    <message>
        <source>The choice of interfaces is not stored, since file &apos;%1&apos; has no line with &apos;%2&apos;</source>
        <translation>Выбор интерфейсов не сохранён, так как в файле «%1» нет строки с «%2».</translation>
    </message>
</context>
<context>
    <name>QtSingleApplication</name>
    <message>
        <source>Error</source>
        <translation>Ошибка</translation>
    </message>
    <message>
        <source>The program does not start, since it cannot tell whether it is running already: there is no folder &apos;%1&apos; that only the superuser can enter.</source>
        <translation>Программа не запускается, так как не может определить, не запущена ли она уже: нет каталога «%1», доступного только суперпользователю.</translation>
    </message>
</context>
<context>
    <name>RangeInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Диалог</translation>
    </message>
    <message>
        <source>Start IP:</source>
        <translation>Начальный IP-адрес:</translation>
    </message>
    <message>
        <source>End IP:</source>
        <translation>Конечный IP-адрес:</translation>
    </message>
</context>
<context>
    <name>SharedNetworkInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Диалог</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>Имя:</translation>
    </message>
</context>
<context>
    <name>StatementInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Диалог</translation>
    </message>
    <message>
        <source>Attributes:</source>
        <translation>Атрибуты:</translation>
    </message>
</context>
<context>
    <name>StaticRouteInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Диалог</translation>
    </message>
    <message>
        <source>Static routes</source>
        <translation>Статические маршруты</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>Добавить</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>Удалить</translation>
    </message>
    <message>
        <source>Route for MS systems</source>
        <translation>Маршрут для систем MS</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>Информация</translation>
    </message>
    <message>
        <source>There is an empty cell.
To add, fill in the cell.</source>
        <translation>Есть пустая ячейка.
Чтобы добавить маршрут, заполните ячейку.</translation>
    </message>
</context>
<context>
    <name>SubnetInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Диалог</translation>
    </message>
    <message>
        <source>Address:</source>
        <translation>Адрес:</translation>
    </message>
    <message>
        <source>Netmask:</source>
        <translation>Маска сети:</translation>
    </message>
</context>
<context>
    <name>TimeInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>Диалог</translation>
    </message>
    <message>
        <source>Mounth:</source>
        <translation>Месяцы:</translation>
    </message>
    <message>
        <source>Days:</source>
        <translation>Дни:</translation>
    </message>
    <message>
        <source>Hours</source>
        <translation>Часы</translation>
    </message>
    <message>
        <source> h</source>
        <translation> ч</translation>
    </message>
    <message>
        <source>:</source>
        <translation>:</translation>
    </message>
    <message>
        <source>Minutes</source>
        <translation>Минуты</translation>
    </message>
    <message>
        <source> m</source>
        <translation> мин</translation>
    </message>
    <message>
        <source>Seconds</source>
        <translation>Секунды</translation>
    </message>
    <message>
        <source> s</source>
        <translation> с</translation>
    </message>
</context>
<context>
    <name>fileio</name>
    <message>
        <source>The old content cannot be kept while it is overwritten</source>
        <translation>Невозможно сохранить прежнее содержимое на время перезаписи.</translation>
    </message>
    <message>
        <source>%1. The file is damaged, its old content is kept in %2</source>
        <translation>%1. Файл повреждён, его прежнее содержимое находится в «%2».</translation>
    </message>
</context>
</TS>
