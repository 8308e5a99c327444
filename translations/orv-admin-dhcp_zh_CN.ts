<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="zh_CN">
<context>
    <name>ConfigCheck</name>
    <message>
        <source>line %1</source>
        <translation>行 %1</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigModel</name>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>无法打开文件“%1”进行读取。</translation>
    </message>
    <message>
        <source>The blocks of the file are nested too deeply.</source>
        <translation>文件中的块嵌套过深。</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>无法打开文件“%1”进行写入。</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1</source>
        <translation>秒数“%1”无效。</translation>
    </message>
    <message>
        <source>Invalid one or more IP in list &apos;%1&apos;</source>
        <translation>列表“%1”中有无效的 IP 地址。</translation>
    </message>
    <message>
        <source>Invalid domain name &apos;%1&apos;</source>
        <translation>域名“%1”无效。</translation>
    </message>
    <message>
        <source>Invalid MAC &apos;%1&apos;</source>
        <translation>MAC 地址“%1”无效。</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1&apos;</source>
        <translation>秒数“%1”无效。</translation>
    </message>
    <message>
        <source>Error editing subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>编辑子网失败。子网“%1”无效。</translation>
    </message>
    <message>
        <source>Invalid IP &apos;%1&apos;</source>
        <translation>IP 地址“%1”无效。</translation>
    </message>
    <message>
        <source>Error editing range. Can not edit range in &apos;%1&apos;</source>
        <translation>编辑地址范围失败。无法编辑“%1”中的地址范围。</translation>
    </message>
    <message>
        <source>Error editing range. Invalid attributes of parent subnet</source>
        <translation>编辑地址范围失败。上级子网的属性无效。</translation>
    </message>
    <message>
        <source>Error editing range. Invalid parent subnet</source>
        <translation>编辑地址范围失败。上级子网无效。</translation>
    </message>
    <message>
        <source>Error editing range. Invalid start IP &apos;%1&apos;</source>
        <translation>编辑地址范围失败。起始 IP 地址“%1”无效。</translation>
    </message>
    <message>
        <source>Error editing range. Invalid end IP &apos;%1&apos;</source>
        <translation>编辑地址范围失败。结束 IP 地址“%1”无效。</translation>
    </message>
    <message>
        <source>Error adding shared-network. Can not add shared-network to &apos;%1&apos;</source>
        <translation>添加共享网络失败。无法向“%1”添加共享网络。</translation>
    </message>
    <message>
        <source>Error adding subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>添加子网失败。子网“%1”无效。</translation>
    </message>
    <message>
        <source>Error adding subnet. Can not add subnet to &apos;%1&apos;</source>
        <translation>添加子网失败。无法向“%1”添加子网。</translation>
    </message>
    <message>
        <source>Error adding range. Can not add range to &apos;%1&apos;</source>
        <translation>添加地址范围失败。无法向“%1”添加地址范围。</translation>
    </message>
    <message>
        <source>Error adding range. Invalid attributes of parent subnet</source>
        <translation>添加地址范围失败。上级子网的属性无效。</translation>
    </message>
    <message>
        <source>Error adding range. Invalid parent subnet</source>
        <translation>添加地址范围失败。上级子网无效。</translation>
    </message>
    <message>
        <source>Error adding range. Invalid start IP &apos;%1&apos;</source>
        <translation>添加地址范围失败。起始 IP 地址“%1”无效。</translation>
    </message>
    <message>
        <source>Error adding range. Invalid end IP &apos;%1&apos;</source>
        <translation>添加地址范围失败。结束 IP 地址“%1”无效。</translation>
    </message>
    <message>
        <source>Error adding host. Can not add host to &apos;%1&apos;</source>
        <translation>添加主机失败。无法向“%1”添加主机。</translation>
    </message>
    <message>
        <source>Error adding host. Host name can not be empty.</source>
        <translation>添加主机失败。主机名不能为空。</translation>
    </message>
    <message>
        <source>Error adding fixed address. Can not add to &apos;%1&apos;</source>
        <translation>添加固定地址失败。无法向“%1”添加固定地址。</translation>
    </message>
    <message>
        <source>Error adding fixed address. Invalid IP &apos;%1&apos;</source>
        <translation>添加固定地址失败。IP 地址“%1”无效。</translation>
    </message>
    <message>
        <source>Error adding bind9. Can not add bind9 to &apos;%1&apos;</source>
        <translation>添加 bind9 设置失败。无法向“%1”添加 bind9 设置。</translation>
    </message>
    <message>
        <source>Error adding bind9. bind9 can not be empty.</source>
        <translation>添加 bind9 设置失败。bind9 设置不能为空。</translation>
    </message>
    <message>
        <source>Error adding declaration. Can not add declaration to &apos;%1&apos;</source>
        <translation>添加声明失败。无法向“%1”添加声明。</translation>
    </message>
    <message>
        <source>Error adding parameter. Can not add parameter to &apos;%1&apos;</source>
        <translation>添加参数失败。无法向“%1”添加参数。</translation>
    </message>
    <message>
        <source>Error adding static route. Static route parametrs can not be empty.</source>
        <translation>添加静态路由失败。静态路由的参数不能为空。</translation>
    </message>
    <message>
        <source>Error adding lease time. Can not add to &apos;%1&apos;</source>
        <translation>添加租期失败。无法向“%1”添加租期。</translation>
    </message>
    <message>
        <source>Error adding static route. Can not add static rout to &apos;%1&apos;</source>
        <translation>添加静态路由失败。无法向“%1”添加静态路由。</translation>
    </message>
    <message>
        <source>Error adding gateways. Can not add to &apos;%1&apos;</source>
        <translation>添加网关失败。无法向“%1”添加网关。</translation>
    </message>
    <message>
        <source>Error adding DNS servers. Can not add to &apos;%1&apos;</source>
        <translation>添加 DNS 服务器失败。无法向“%1”添加 DNS 服务器。</translation>
    </message>
    <message>
        <source>Error adding NTP servers address. Can not add to &apos;%1&apos;</source>
        <translation>添加 NTP 服务器地址失败。无法向“%1”添加 NTP 服务器地址。</translation>
    </message>
    <message>
        <source>Error adding domain name. Can not add to &apos;%1&apos;</source>
        <translation>添加域名失败。无法向“%1”添加域名。</translation>
    </message>
    <message>
        <source>Error editing &apos;%1&apos;. The block would be nested too deeply.</source>
        <translation>编辑“%1”失败。该块的嵌套会过深。</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigStatement</name>
    <message>
        <source>All network</source>
        <translation>整个网络</translation>
    </message>
    <message>
        <source>Subnet</source>
        <translation>子网</translation>
    </message>
    <message>
        <source>Shared network</source>
        <translation>共享网络</translation>
    </message>
    <message>
        <source>Host</source>
        <translation>主机</translation>
    </message>
    <message>
        <source>Range</source>
        <translation>地址范围</translation>
    </message>
    <message>
        <source>Fixed address</source>
        <translation>固定地址</translation>
    </message>
    <message>
        <source>Key information</source>
        <translation>密钥信息</translation>
    </message>
    <message>
        <source>Zone served by DNS server</source>
        <translation>DNS 服务器管理的区域</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>组</translation>
    </message>
    <message>
        <source> mounth </source>
        <translation> 个月 </translation>
    </message>
    <message>
        <source> days </source>
        <translation> 天 </translation>
    </message>
    <message>
        <source> hours </source>
        <translation> 小时 </translation>
    </message>
    <message>
        <source> minutes </source>
        <translation> 分钟 </translation>
    </message>
    <message>
        <source> seconds </source>
        <translation> 秒 </translation>
    </message>
    <message>
        <source>Gateways</source>
        <translation>网关</translation>
    </message>
    <message>
        <source>DNS servers</source>
        <translation>DNS 服务器</translation>
    </message>
    <message>
        <source>NTP servers</source>
        <translation>NTP 服务器</translation>
    </message>
    <message>
        <source>Domain name</source>
        <translation>域名</translation>
    </message>
    <message>
        <source>Static route MS</source>
        <translation>静态路由 (MS)</translation>
    </message>
    <message>
        <source>Static route</source>
        <translation>静态路由</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>MAC 地址</translation>
    </message>
    <message>
        <source>Max lease time</source>
        <translation>最长租期</translation>
    </message>
    <message>
        <source>Default lease time</source>
        <translation>默认租期</translation>
    </message>
    <message>
        <source>Key</source>
        <translation>密钥</translation>
    </message>
    <message>
        <source>Key generation algorithm</source>
        <translation>密钥算法</translation>
    </message>
    <message>
        <source>Generated secret</source>
        <translation>密钥值</translation>
    </message>
    <message>
        <source>Master DNS Server</source>
        <translation>主 DNS 服务器</translation>
    </message>
</context>
<context>
    <name>DhcpdLeasesModel</name>
    <message>
        <source>IP address</source>
        <translation>IP 地址</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>MAC 地址</translation>
    </message>
    <message>
        <source>Host name</source>
        <translation>主机名</translation>
    </message>
    <message>
        <source>Binding state</source>
        <translation>绑定状态</translation>
    </message>
    <message>
        <source>Rental start</source>
        <translation>租约开始</translation>
    </message>
    <message>
        <source>Rental end</source>
        <translation>租约结束</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>无法打开文件“%1”进行读取。</translation>
    </message>
</context>
<context>
    <name>DomainInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>对话框</translation>
    </message>
    <message>
        <source>Domain name:</source>
        <translation>域名：</translation>
    </message>
</context>
<context>
    <name>FMain</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>DHCP 服务器配置</translation>
    </message>
    <message>
        <source>Topology</source>
        <translation>拓扑</translation>
    </message>
    <message>
        <source>Leases</source>
        <translation>租约</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>搜索</translation>
    </message>
    <message>
        <source>Previous match</source>
        <translation>上一个匹配项</translation>
    </message>
    <message>
        <source>...</source>
        <translation>...</translation>
    </message>
    <message>
        <source>Next match</source>
        <translation>下一个匹配项</translation>
    </message>
    <message>
        <source>&amp;File</source>
        <translation>文件(&amp;F)</translation>
    </message>
    <message>
        <source>Server</source>
        <translation>服务器</translation>
    </message>
    <message>
        <source>toolBar</source>
        <translation>工具栏</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>重新加载</translation>
    </message>
    <message>
        <source>F5</source>
        <translation>F5</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>保存</translation>
    </message>
    <message>
        <source>Ctrl+S</source>
        <translation>Ctrl+S</translation>
    </message>
    <message>
        <source>Exit</source>
        <translation>退出</translation>
    </message>
    <message>
        <source>Restart DHCP-server</source>
        <translation>重新启动 DHCP 服务器</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>选择接口</translation>
    </message>
    <message>
        <source>Start DHCP-server</source>
        <translation>启动 DHCP 服务器</translation>
    </message>
    <message>
        <source>Start or stop DHCP-server</source>
        <translation>启动或停止 DHCP 服务器</translation>
    </message>
    <message>
        <source>Ctrl+R</source>
        <translation>Ctrl+R</translation>
    </message>
    <message>
        <source>Add subnet</source>
        <translation>添加子网</translation>
    </message>
    <message>
        <source>Add shared network</source>
        <translation>添加共享网络</translation>
    </message>
    <message>
        <source>Add host</source>
        <translation>添加主机</translation>
    </message>
    <message>
        <source>Add range</source>
        <translation>添加地址范围</translation>
    </message>
    <message>
        <source>Add arbitrary parameter</source>
        <translation>以文本方式添加参数</translation>
    </message>
    <message>
        <source>Add arbitrary declaration</source>
        <translation>以文本方式添加声明</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>编辑</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>删除</translation>
    </message>
    <message>
        <source>Add fixed IP</source>
        <translation>添加固定 IP 地址</translation>
    </message>
    <message>
        <source>Add DNS servers</source>
        <translation>添加 DNS 服务器</translation>
    </message>
    <message>
        <source>Add domain name</source>
        <translation>添加域名</translation>
    </message>
    <message>
        <source>Add gateways</source>
        <translation>添加网关</translation>
    </message>
    <message>
        <source>Add NTP servers</source>
        <translation>添加 NTP 服务器</translation>
    </message>
    <message>
        <source>Add default lease time</source>
        <translation>添加默认租期</translation>
    </message>
    <message>
        <source>Add max lease time</source>
        <translation>添加最长租期</translation>
    </message>
    <message>
        <source>Reserve an IP address</source>
        <translation>保留 IP 地址</translation>
    </message>
    <message>
        <source>Add static route</source>
        <translation>添加静态路由</translation>
    </message>
    <message>
        <source>Add DHCP dynamic zone update</source>
        <translation>添加 DNS 区域动态更新</translation>
    </message>
    <message>
        <source>%1 more</source>
        <translation>另外 %1 项</translation>
    </message>
    <message>
        <source>%1 and %2</source>
        <translation>%1, %2</translation>
    </message>
    <message>
        <source>The configuration could not be read, so there is nothing to save.</source>
        <translation>由于无法读取配置，没有可保存的内容。</translation>
    </message>
    <message>
        <source>The text would be too long, or its blocks nested too deeply, to be read again.</source>
        <translation>文本过长或其中的块嵌套过深，将无法再次读取。</translation>
    </message>
    <message>
        <source>The configuration has been changed.
Do you want to overwrite the configuration?</source>
        <translation>文件中的配置已在本程序之外被更改。
要覆盖该配置吗？</translation>
    </message>
    <message>
        <source>Current configuration in file will be rewrited.
Do you want to save changes?</source>
        <translation>文件中的当前配置将被覆盖。
要保存更改吗？</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>信息</translation>
    </message>
    <message>
        <source>The DHCP server refuses this configuration:
%1</source>
        <translation>DHCP 服务器拒绝此配置：
%1</translation>
    </message>
    <message>
        <source>Answer of the DHCP server</source>
        <translation>DHCP 服务器的响应</translation>
    </message>
    <message>
        <source>The comment of the file will not be kept.</source>
        <translation>文件中的注释不会保留。</translation>
    </message>
    <message>
        <source>The %1 comments of the file will not be kept.</source>
        <translation>文件中的 %1 条注释不会保留。</translation>
    </message>
    <message>
        <source>The quoted text in line %1 will be changed.</source>
        <translation>第 %1 行中带引号的文本将被更改。</translation>
    </message>
    <message>
        <source>The quoted texts in lines %1 will be changed.</source>
        <translation>以下各行中带引号的文本将被更改：%1。</translation>
    </message>
    <message>
        <source>The statement in line %1 will be changed.</source>
        <translation>第 %1 行中的语句将被更改。</translation>
    </message>
    <message>
        <source>The statements in lines %1 will be changed.</source>
        <translation>以下各行中的语句将被更改：%1。</translation>
    </message>
    <message>
        <source>The carriage return in line %1 will become part of a word.</source>
        <translation>第 %1 行中的回车符将成为单词的一部分。</translation>
    </message>
    <message>
        <source>The carriage returns in lines %1 will become parts of words.</source>
        <translation>以下各行中的回车符将成为单词的一部分：%1。</translation>
    </message>
    <message>
        <source>Declaration:</source>
        <translation>声明：</translation>
    </message>
    <message>
        <source>Edit arbitrary declaration</source>
        <translation>以文本方式编辑声明</translation>
    </message>
    <message>
        <source>Edit shared network</source>
        <translation>编辑共享网络</translation>
    </message>
    <message>
        <source>Edit subnet</source>
        <translation>编辑子网</translation>
    </message>
    <message>
        <source>Edit range</source>
        <translation>编辑地址范围</translation>
    </message>
    <message>
        <source>Edit host</source>
        <translation>编辑主机</translation>
    </message>
    <message>
        <source>The IP address is reserved.
Go to topology?</source>
        <translation>IP 地址已保留。
要转到“拓扑”吗？</translation>
    </message>
    <message>
        <source>Add fixed address</source>
        <translation>添加固定地址</translation>
    </message>
    <message>
        <source>Edit fixed address</source>
        <translation>编辑固定地址</translation>
    </message>
    <message>
        <source>Edit static route</source>
        <translation>编辑静态路由</translation>
    </message>
    <message>
        <source>Add configuration to automatically configure binding with bind9 DNS server?</source>
        <translation>要添加用于与 bind9 DNS 服务器自动关联的配置吗？</translation>
    </message>
    <message>
        <source>Choose the bind9 configuration with the update key</source>
        <translation>选择包含更新密钥的 bind9 配置</translation>
    </message>
    <message>
        <source>These zones were left out:</source>
        <translation>已略过以下区域：</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <translation>%1：%2</translation>
    </message>
    <message>
        <source>the name server is not its primary one</source>
        <translation>该域名服务器不是它的主服务器</translation>
    </message>
    <message>
        <source>no key may update it</source>
        <translation>没有允许更新它的密钥</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its name</source>
        <translation>DHCP 服务器不接受它的名称</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; is not known</source>
        <translation>找不到它的密钥“%1”</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its key &apos;%1&apos;</source>
        <translation>DHCP 服务器不接受它的密钥“%1”</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; stands behind this place in the configuration</source>
        <translation>它的密钥“%1”在配置中定义于此处之后</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>值</translation>
    </message>
    <message>
        <source>Do you want to reload configuration from file?</source>
        <translation>要从文件重新加载配置吗？</translation>
    </message>
    <message>
        <source>Confirmation</source>
        <translation>确认</translation>
    </message>
    <message>
        <source>There are unsaved changes, save?</source>
        <translation>有尚未保存的更改。要保存吗？</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>错误</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>操作</translation>
    </message>
    <message>
        <source>Clear the search</source>
        <translation>清除搜索</translation>
    </message>
    <message>
        <source>Edit gateways</source>
        <translation>编辑网关</translation>
    </message>
    <message>
        <source>Gateways:</source>
        <translation>网关：</translation>
    </message>
    <message>
        <source>Edit DNS servers</source>
        <translation>编辑 DNS 服务器</translation>
    </message>
    <message>
        <source>DNS servers:</source>
        <translation>DNS 服务器：</translation>
    </message>
    <message>
        <source>Edit NTP servers</source>
        <translation>编辑 NTP 服务器</translation>
    </message>
    <message>
        <source>NTP servers:</source>
        <translation>NTP 服务器：</translation>
    </message>
    <message>
        <source>Edit domain name</source>
        <translation>编辑域名</translation>
    </message>
    <message>
        <source>Edit default lease time</source>
        <translation>编辑默认租期</translation>
    </message>
    <message>
        <source>Edit max lease time</source>
        <translation>编辑最长租期</translation>
    </message>
    <message>
        <source>Edit MAC address</source>
        <translation>编辑 MAC 地址</translation>
    </message>
    <message>
        <source>Edit time</source>
        <translation>编辑时长</translation>
    </message>
    <message>
        <source>Parameter:</source>
        <translation>参数：</translation>
    </message>
    <message>
        <source>Edit arbitrary parameter</source>
        <translation>以文本方式编辑参数</translation>
    </message>
    <message>
        <source>Stop DHCP-server</source>
        <translation>停止 DHCP 服务器</translation>
    </message>
    <message>
        <source>Warning!</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>This editing mode for advanced users.
After applying this changes configuration may be incorrect.
Do you want to resume?</source>
        <translation>此编辑模式面向高级用户。
应用更改后，配置可能会出错。
要继续吗？</translation>
    </message>
    <message>
        <source>Add option</source>
        <translation>添加选项</translation>
    </message>
    <message>
        <source>Add parameter</source>
        <translation>添加参数</translation>
    </message>
    <message>
        <source>Leases found: %1</source>
        <translation>找到的租约：%1</translation>
    </message>
    <message>
        <source>No leases found</source>
        <translation>未找到租约</translation>
    </message>
</context>
<context>
    <name>HandbookViewer</name>
    <message>
        <source>Not found</source>
        <translation>未找到</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>目录</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>搜索</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>后退</translation>
    </message>
</context>
<context>
    <name>HostInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>对话框</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>名称：</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>MAC 地址：</translation>
    </message>
    <message>
        <source>Fixed IP:</source>
        <translation>固定 IP 地址：</translation>
    </message>
</context>
<context>
    <name>IpInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>对话框</translation>
    </message>
    <message>
        <source>IP:</source>
        <translation>IP 地址：</translation>
    </message>
</context>
<context>
    <name>MacInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>对话框</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>MAC 地址：</translation>
    </message>
</context>
<context>
    <name>MultipleIpInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>对话框</translation>
    </message>
    <message>
        <source>IP addresses</source>
        <translation>IP 地址</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>添加</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>删除</translation>
    </message>
    <message>
        <source>Add IP</source>
        <translation>添加 IP 地址</translation>
    </message>
</context>
<context>
    <name>OrvHelpMenu</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>DHCP 服务器配置</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>帮助(&amp;H)</translation>
    </message>
    <message>
        <source>Manual</source>
        <translation>手册页</translation>
    </message>
    <message>
        <source>About %1</source>
        <translation>关于 %1</translation>
    </message>
    <message>
        <source>About Qt</source>
        <translation>关于 Qt</translation>
    </message>
    <message>
        <source>Free software under the GNU General Public License, version 3 or later. There is no warranty, to the extent permitted by law.</source>
        <translation>本程序是自由软件，依据 GNU 通用公共许可证（GNU GPL）第 3 版或更新版本发布。在法律许可的范围内，不提供任何担保。</translation>
    </message>
    <message>
        <source>Handbook</source>
        <translation>手册</translation>
    </message>
</context>
<context>
    <name>QAbstractTableModel</name>
    <message>
        <source>Net mask</source>
        <translation>子网掩码</translation>
    </message>
    <message>
        <source>IP net</source>
        <translation>IP 网络</translation>
    </message>
    <message>
        <source>Gateway</source>
        <translation>网关</translation>
    </message>
</context>
<context>
    <name>QDialog</name>
    <message>
        <source>Available interfaces</source>
        <translation>可用接口</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>选择接口</translation>
    </message>
    <message>
        <source>Available interfaces are not found!</source>
        <translation>未找到可用接口。</translation>
    </message>
</context>
<context>
    <name>QObject</name>
    <message>
        <source>Error</source>
        <translation>错误</translation>
    </message>
    <message>
        <source>Must be superuser</source>
        <translation>此程序必须以超级用户身份运行。</translation>
    </message>
    <message>
        <source>Updating DHCP-server status...</source>
        <translation>正在检查 DHCP 服务器状态…</translation>
    </message>
    <message>
        <source>DHCP-server is running</source>
        <translation>DHCP 服务器正在运行</translation>
    </message>
    <message>
        <source>DHCP-server is stopped</source>
        <translation>DHCP 服务器已停止</translation>
    </message>
    <message>
        <source>DHCP-server already running</source>
        <translation>DHCP 服务器已在运行。</translation>
    </message>
    <message>
        <source>DHCP-server already stopped</source>
        <translation>DHCP 服务器已处于停止状态。</translation>
    </message>
    <message>
        <source>Checking DHCP-server status failed
%1</source>
        <translation>检查 DHCP 服务器状态失败。
%1</translation>
    </message>
    <message>
        <source>Some operation with DHCP-server already executes</source>
        <translation>正在对 DHCP 服务器执行其他操作。</translation>
    </message>
    <message>
        <source>Operation with DHCP-server failed
%1</source>
        <translation>对 DHCP 服务器的操作失败。
%1</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>无法打开文件“%1”进行读取。</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>无法打开文件“%1”进行写入。</translation>
    </message>
    <message>
        <source>The choice of interfaces is not stored, since file &apos;%1&apos; has no line with &apos;%2&apos;</source>
        <translation>由于文件“%1”中没有包含“%2”的行，所选接口未保存。</translation>
    </message>
</context>
<context>
    <name>QtSingleApplication</name>
    <message>
        <source>Error</source>
        <translation>错误</translation>
    </message>
    <message>
        <source>The program does not start, since it cannot tell whether it is running already: there is no folder &apos;%1&apos; that only the superuser can enter.</source>
        <translation>程序无法启动，因为无法判断它是否已在运行：不存在只有超级用户才能进入的文件夹“%1”。</translation>
    </message>
</context>
<context>
    <name>RangeInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>对话框</translation>
    </message>
    <message>
        <source>Start IP:</source>
        <translation>起始 IP 地址：</translation>
    </message>
    <message>
        <source>End IP:</source>
        <translation>结束 IP 地址：</translation>
    </message>
</context>
<context>
    <name>SharedNetworkInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>对话框</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>名称：</translation>
    </message>
</context>
<context>
    <name>StatementInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>对话框</translation>
    </message>
    <message>
        <source>Attributes:</source>
        <translation>属性：</translation>
    </message>
</context>
<context>
    <name>StaticRouteInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>对话框</translation>
    </message>
    <message>
        <source>Static routes</source>
        <translation>静态路由</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>添加</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>删除</translation>
    </message>
    <message>
        <source>Route for MS systems</source>
        <translation>用于 MS 系统的路由</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>信息</translation>
    </message>
    <message>
        <source>There is an empty cell.
To add, fill in the cell.</source>
        <translation>有一个单元格为空。
要添加路由，请填写该单元格。</translation>
    </message>
</context>
<context>
    <name>SubnetInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>对话框</translation>
    </message>
    <message>
        <source>Address:</source>
        <translation>地址：</translation>
    </message>
    <message>
        <source>Netmask:</source>
        <translation>子网掩码：</translation>
    </message>
</context>
<context>
    <name>TimeInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>对话框</translation>
    </message>
    <message>
        <source>Mounth:</source>
        <translation>月数：</translation>
    </message>
    <message>
        <source>Days:</source>
        <translation>天数：</translation>
    </message>
    <message>
        <source>Hours</source>
        <translation>小时</translation>
    </message>
    <message>
        <source> h</source>
        <translation> 小时</translation>
    </message>
    <message>
        <source>:</source>
        <translation>:</translation>
    </message>
    <message>
        <source>Minutes</source>
        <translation>分钟</translation>
    </message>
    <message>
        <source> m</source>
        <translation> 分钟</translation>
    </message>
    <message>
        <source>Seconds</source>
        <translation>秒</translation>
    </message>
    <message>
        <source> s</source>
        <translation> 秒</translation>
    </message>
</context>
<context>
    <name>fileio</name>
    <message>
        <source>The old content cannot be kept while it is overwritten</source>
        <translation>无法在覆盖期间保留原有内容。</translation>
    </message>
    <message>
        <source>%1. The file is damaged, its old content is kept in %2</source>
        <translation>%1。文件已损坏，其原有内容保存在“%2”中。</translation>
    </message>
</context>
</TS>
