<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="de_DE">
<context>
    <name>ConfigCheck</name>
    <message>
        <location filename="../app/configcheck.cpp" line="73"/>
        <source>line %1</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>DhcpdConfigModel</name>
    <message>
        <location filename="../config/dhcpdconfigmodel.cpp" line="107"/>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigmodel.cpp" line="120"/>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigmodel_checks.cpp" line="15"/>
        <source>Invalid time in seconds &apos;%1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigmodel_checks.cpp" line="37"/>
        <source>Invalid one or more IP in list &apos;%1&apos;</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigmodel_checks.cpp" line="39"/>
        <source>Invalid domain name &apos;%1&apos;</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigmodel_checks.cpp" line="47"/>
        <source>Error editing subnet. Invalid subnet &apos;%1&apos;</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigmodel_checks.cpp" line="56"/>
        <source>Invalid IP &apos;%1&apos;</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigmodel_checks.cpp" line="63"/>
        <source>Invalid MAC &apos;%1&apos;</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigmodel_checks.cpp" line="74"/>
        <source>Error editing range. Can not edit range in &apos;%1&apos;</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigmodel_checks.cpp" line="76"/>
        <source>Error editing range. Invalid attributes of parent subnet</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigmodel_checks.cpp" line="79"/>
        <source>Error editing range. Invalid parent subnet</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigmodel_checks.cpp" line="84"/>
        <source>Error editing range. Invalid start IP &apos;%1&apos;</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigmodel_checks.cpp" line="87"/>
        <source>Error editing range. Invalid end IP &apos;%1&apos;</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>DhcpdConfigStatement</name>
    <message>
        <location filename="../config/configreader.cpp" line="69"/>
        <source>All network</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigdeclaration.cpp" line="78"/>
        <source>Subnet</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigdeclaration.cpp" line="79"/>
        <source>Shared network</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigdeclaration.cpp" line="80"/>
        <source>Host</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigdeclaration.cpp" line="81"/>
        <source>Range</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigdeclaration.cpp" line="82"/>
        <source>Fixed address</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigdeclaration.cpp" line="83"/>
        <source>Key information</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigdeclaration.cpp" line="84"/>
        <source>Zone served by DNS server</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigdeclaration.cpp" line="85"/>
        <source>Group</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigparam.cpp" line="13"/>
        <source> mounth </source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigparam.cpp" line="16"/>
        <source> minutes </source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigparam.cpp" line="17"/>
        <source> seconds </source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigparam.cpp" line="54"/>
        <source>Gateways</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigparam.cpp" line="55"/>
        <source>DNS servers</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigparam.cpp" line="56"/>
        <source>Domain name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigparam.cpp" line="57"/>
        <source>NTP servers</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigparam.cpp" line="58"/>
        <source>Static route MS</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigparam.cpp" line="59"/>
        <source>Static route</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigparam.cpp" line="62"/>
        <source>MAC address</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigparam.cpp" line="63"/>
        <source>Max lease time</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigparam.cpp" line="64"/>
        <source>Default lease time</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigparam.cpp" line="65"/>
        <source>Key</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigparam.cpp" line="66"/>
        <source>Key generation algorithm</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigparam.cpp" line="67"/>
        <source>Generated secret</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../config/dhcpdconfigparam.cpp" line="68"/>
        <source>Master DNS Server</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>DhcpdLeasesModel</name>
    <message>
        <location filename="../leases/dhcpdleasesmodel.cpp" line="19"/>
        <source>IP address</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../leases/dhcpdleasesmodel.cpp" line="19"/>
        <source>MAC address</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../leases/dhcpdleasesmodel.cpp" line="20"/>
        <source>Host name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../leases/dhcpdleasesmodel.cpp" line="20"/>
        <source>Binding state</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../leases/dhcpdleasesmodel.cpp" line="21"/>
        <source>Rental start</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../leases/dhcpdleasesmodel.cpp" line="21"/>
        <source>Rental end</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../leases/dhcpdleasesmodel.cpp" line="86"/>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>DomainInputDialog</name>
    <message>
        <location filename="../dialogs/domaininputdialog.ui" line="7"/>
        <source>Dialog</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/domaininputdialog.ui" line="17"/>
        <source>Domain name:</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>FMain</name>
    <message>
        <location filename="../app/fmain.ui" line="15"/>
        <source>Configure DHCP server</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="45"/>
        <location filename="../app/fmain.ui" line="51"/>
        <location filename="../app/fmain.cpp" line="115"/>
        <source>Topology</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="65"/>
        <location filename="../app/fmain.ui" line="117"/>
        <source>Leases</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="77"/>
        <location filename="../app/fmain.ui" line="80"/>
        <source>Search</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="87"/>
        <location filename="../app/fmain.ui" line="90"/>
        <source>Previous match</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="93"/>
        <location filename="../app/fmain.ui" line="106"/>
        <source>...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="100"/>
        <location filename="../app/fmain.ui" line="103"/>
        <source>Next match</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="139"/>
        <source>&amp;File</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="148"/>
        <source>Server</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="161"/>
        <source>toolBar</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="181"/>
        <source>Reload</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="184"/>
        <source>F5</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="192"/>
        <source>Save</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="195"/>
        <source>Ctrl+S</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="200"/>
        <source>Exit</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="205"/>
        <source>Restart DHCP-server</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="210"/>
        <source>Select interfaces</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="215"/>
        <location filename="../app/fmain.cpp" line="217"/>
        <source>Start DHCP-server</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="218"/>
        <source>Start or stop DHCP-server</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="221"/>
        <source>Ctrl+R</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="226"/>
        <location filename="../app/fmain.ui" line="229"/>
        <location filename="../app/fmain_topology.cpp" line="322"/>
        <source>Add subnet</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="234"/>
        <location filename="../app/fmain.ui" line="237"/>
        <location filename="../app/fmain_topology.cpp" line="305"/>
        <source>Add shared network</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="242"/>
        <location filename="../app/fmain.ui" line="245"/>
        <location filename="../app/fmain_topology.cpp" line="378"/>
        <source>Add host</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="250"/>
        <location filename="../app/fmain.ui" line="253"/>
        <location filename="../app/fmain_topology.cpp" line="342"/>
        <source>Add range</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="258"/>
        <location filename="../app/fmain.ui" line="261"/>
        <location filename="../app/fmain_topology.cpp" line="294"/>
        <source>Add arbitrary parameter</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="266"/>
        <location filename="../app/fmain.ui" line="269"/>
        <location filename="../app/fmain_topology.cpp" line="284"/>
        <source>Add arbitrary declaration</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="274"/>
        <location filename="../app/fmain.ui" line="277"/>
        <source>Edit</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="282"/>
        <location filename="../app/fmain.ui" line="285"/>
        <source>Remove</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="290"/>
        <location filename="../app/fmain.ui" line="293"/>
        <source>Add fixed IP</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="298"/>
        <location filename="../app/fmain.ui" line="301"/>
        <location filename="../app/fmain_topology.cpp" line="472"/>
        <source>Add DNS servers</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="306"/>
        <location filename="../app/fmain.ui" line="309"/>
        <location filename="../app/fmain_topology.cpp" line="493"/>
        <source>Add domain name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="314"/>
        <location filename="../app/fmain.ui" line="317"/>
        <location filename="../app/fmain_topology.cpp" line="463"/>
        <source>Add gateways</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="322"/>
        <location filename="../app/fmain.ui" line="325"/>
        <location filename="../app/fmain_topology.cpp" line="482"/>
        <source>Add NTP servers</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="330"/>
        <location filename="../app/fmain.ui" line="333"/>
        <location filename="../app/fmain_topology.cpp" line="532"/>
        <source>Add default lease time</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="338"/>
        <location filename="../app/fmain.ui" line="341"/>
        <location filename="../app/fmain_topology.cpp" line="523"/>
        <source>Add max lease time</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="346"/>
        <location filename="../app/fmain_leases.cpp" line="92"/>
        <source>Reserve an IP address</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="351"/>
        <location filename="../app/fmain_topology.cpp" line="553"/>
        <source>Add static route</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.ui" line="356"/>
        <location filename="../app/fmain.ui" line="359"/>
        <source>Add DHCP dynamic zone update</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.cpp" line="115"/>
        <source>Value</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.cpp" line="154"/>
        <location filename="../app/topologymenus.cpp" line="31"/>
        <source>Actions</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.cpp" line="186"/>
        <source>Error</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.cpp" line="190"/>
        <location filename="../app/fmain_files.cpp" line="25"/>
        <location filename="../app/fmain_files.cpp" line="86"/>
        <location filename="../app/fmain_files.cpp" line="119"/>
        <location filename="../app/fmain_leases.cpp" line="103"/>
        <location filename="../app/fmain_topology.cpp" line="585"/>
        <source>Information</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain.cpp" line="214"/>
        <source>Stop DHCP-server</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_files.cpp" line="25"/>
        <source>Do you want to reload configuration from file?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_files.cpp" line="84"/>
        <source>The configuration has been changed.
Do you want to overwrite the configuration?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_files.cpp" line="85"/>
        <location filename="../app/fmain_files.cpp" line="119"/>
        <source>Current configuration in file will be rewrited.
Do you want to save changes?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_files.cpp" line="91"/>
        <source>The DHCP server refuses this configuration:
%1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_files.cpp" line="104"/>
        <source>Confirmation</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_files.cpp" line="104"/>
        <source>There are unsaved changes, save?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_leases.cpp" line="103"/>
        <source>The IP address is reserved.
Go to topology?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="244"/>
        <source>Warning!</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="245"/>
        <source>This editing mode for advanced users.
After applying this changes configuration may be incorrect.
Do you want to resume?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="284"/>
        <location filename="../app/fmain_topology.cpp" line="289"/>
        <source>Declaration:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="289"/>
        <source>Edit arbitrary declaration</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="294"/>
        <location filename="../app/fmain_topology.cpp" line="299"/>
        <location filename="../app/fmain_topology.cpp" line="567"/>
        <source>Parameter:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="299"/>
        <source>Edit arbitrary parameter</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="314"/>
        <source>Edit shared network</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="331"/>
        <source>Edit subnet</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="357"/>
        <source>Edit range</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="395"/>
        <source>Edit host</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="428"/>
        <source>Add fixed address</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="437"/>
        <source>Edit fixed address</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="463"/>
        <location filename="../app/fmain_topology.cpp" line="467"/>
        <source>Gateways:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="467"/>
        <source>Edit gateways</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="472"/>
        <location filename="../app/fmain_topology.cpp" line="477"/>
        <source>DNS servers:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="477"/>
        <source>Edit DNS servers</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="482"/>
        <location filename="../app/fmain_topology.cpp" line="487"/>
        <source>NTP servers:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="487"/>
        <source>Edit NTP servers</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="502"/>
        <source>Edit domain name</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="527"/>
        <source>Edit max lease time</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="537"/>
        <source>Edit default lease time</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="540"/>
        <source>Edit time</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="545"/>
        <source>Edit MAC address</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="567"/>
        <location filename="../app/fmain_topology.cpp" line="571"/>
        <source>Edit static route</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="585"/>
        <source>Add configuration to automatically configure binding with bind9 DNS server?</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/fmain_topology.cpp" line="589"/>
        <source>Choose the bind9 configuration with the update key</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/topologymenus.cpp" line="35"/>
        <source>Add option</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/topologymenus.cpp" line="38"/>
        <source>Add parameter</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>HostInputDialog</name>
    <message>
        <location filename="../dialogs/hostinputdialog.ui" line="7"/>
        <source>Dialog</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/hostinputdialog.ui" line="17"/>
        <source>Name:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/hostinputdialog.ui" line="30"/>
        <source>MAC address:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/hostinputdialog.ui" line="43"/>
        <source>Fixed IP:</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>IpInputDialog</name>
    <message>
        <location filename="../dialogs/ipinputdialog.ui" line="7"/>
        <source>Dialog</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/ipinputdialog.ui" line="17"/>
        <source>IP:</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>MacInputDialog</name>
    <message>
        <location filename="../dialogs/macinputdialog.ui" line="7"/>
        <source>Dialog</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/macinputdialog.ui" line="17"/>
        <source>MAC address:</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>MultipleIpInputDialog</name>
    <message>
        <location filename="../dialogs/multipleipinputdialog.ui" line="7"/>
        <source>Dialog</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/multipleipinputdialog.ui" line="17"/>
        <source>IP addresses</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/multipleipinputdialog.ui" line="32"/>
        <source>Add</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/multipleipinputdialog.ui" line="45"/>
        <source>Remove</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/multipleipinputdialog.cpp" line="54"/>
        <source>Add IP</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>OrvHelpMenu</name>
    <message>
        <location filename="../platform/orvhelpmenu.cpp" line="15"/>
        <source>&amp;Help</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../platform/orvhelpmenu.cpp" line="17"/>
        <location filename="../platform/orvhelpmenu.cpp" line="28"/>
        <source>Manual</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../platform/orvhelpmenu.cpp" line="19"/>
        <location filename="../platform/orvhelpmenu.cpp" line="49"/>
        <source>About %1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../platform/orvhelpmenu.cpp" line="20"/>
        <source>About Qt</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../platform/orvhelpmenu.cpp" line="46"/>
        <source>Free software under the GNU General Public License, version 3 or later. There is no warranty, to the extent permitted by law.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>QAbstractTableModel</name>
    <message>
        <location filename="../dialogs/routemodel.cpp" line="16"/>
        <source>Net mask</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/routemodel.cpp" line="18"/>
        <source>IP net</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/routemodel.cpp" line="20"/>
        <source>Gateway</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>QDialog</name>
    <message>
        <location filename="../server/interfacesdialog.cpp" line="17"/>
        <source>Available interfaces</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../server/interfacesdialog.cpp" line="20"/>
        <source>Select interfaces</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../server/interfacesdialog.cpp" line="46"/>
        <source>Available interfaces are not found!</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>QObject</name>
    <message>
        <location filename="../app/main.cpp" line="45"/>
        <source>Error</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../app/main.cpp" line="45"/>
        <source>Must be superuser</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../server/dhcpservermanager.cpp" line="21"/>
        <source>Updating DHCP-server status...</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../server/dhcpservermanager.cpp" line="23"/>
        <source>DHCP-server is running</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../server/dhcpservermanager.cpp" line="25"/>
        <source>DHCP-server is stopped</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../server/dhcpservermanager.cpp" line="34"/>
        <source>DHCP-server already running</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../server/dhcpservermanager.cpp" line="39"/>
        <source>DHCP-server already stopped</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../server/dhcpservermanager.cpp" line="57"/>
        <source>Checking DHCP-server status failed
%1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../server/dhcpservermanager.cpp" line="93"/>
        <source>Some operation with DHCP-server already executes</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../server/dhcpservermanager.cpp" line="120"/>
        <source>Operation with DHCP-server failed
%1</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../server/dhcpservermanager_interfaces.cpp" line="86"/>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../server/dhcpservermanager_interfaces.cpp" line="126"/>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>RangeInputDialog</name>
    <message>
        <location filename="../dialogs/rangeinputdialog.ui" line="7"/>
        <source>Dialog</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/rangeinputdialog.ui" line="17"/>
        <source>Start IP:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/rangeinputdialog.ui" line="30"/>
        <source>End IP:</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>SharedNetworkInputDialog</name>
    <message>
        <location filename="../dialogs/sharednetworkinputdialog.ui" line="7"/>
        <source>Dialog</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/sharednetworkinputdialog.ui" line="17"/>
        <source>Name:</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>StatementInputDialog</name>
    <message>
        <location filename="../dialogs/statementinputdialog.ui" line="7"/>
        <source>Dialog</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/statementinputdialog.ui" line="24"/>
        <source>Attributes:</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>StaticRouteInputDialog</name>
    <message>
        <location filename="../dialogs/staticrouteinputdialog.ui" line="7"/>
        <source>Dialog</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/staticrouteinputdialog.ui" line="13"/>
        <source>Static routes</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/staticrouteinputdialog.ui" line="36"/>
        <source>Add</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/staticrouteinputdialog.ui" line="49"/>
        <source>Remove</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/staticrouteinputdialog.ui" line="74"/>
        <source>Route for MS systems</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/staticrouteinputdialog.cpp" line="97"/>
        <source>Information</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/staticrouteinputdialog.cpp" line="97"/>
        <source>There is an empty cell.
To add, fill in the cell.</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>SubnetInputDialog</name>
    <message>
        <location filename="../dialogs/subnetinputdialog.ui" line="7"/>
        <source>Dialog</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/subnetinputdialog.ui" line="17"/>
        <source>Address:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/subnetinputdialog.ui" line="30"/>
        <source>Netmask:</source>
        <translation type="unfinished"></translation>
    </message>
</context>
<context>
    <name>TimeInputDialog</name>
    <message>
        <location filename="../dialogs/timeinputdialog.ui" line="7"/>
        <source>Dialog</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/timeinputdialog.ui" line="24"/>
        <source>Mounth:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/timeinputdialog.ui" line="51"/>
        <source>Days:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/timeinputdialog.ui" line="82"/>
        <source> h</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/timeinputdialog.ui" line="92"/>
        <location filename="../dialogs/timeinputdialog.ui" line="112"/>
        <source>:</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/timeinputdialog.ui" line="102"/>
        <source> m</source>
        <translation type="unfinished"></translation>
    </message>
    <message>
        <location filename="../dialogs/timeinputdialog.ui" line="122"/>
        <source> s</source>
        <translation type="unfinished"></translation>
    </message>
</context>
</TS>
