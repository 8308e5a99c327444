<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja">
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
        <translation>ファイル「%1」を読み取り用に開けませんでした。</translation>
    </message>
    <message>
        <source>The blocks of the file are nested too deeply.</source>
        <translation>ファイルのブロックの入れ子が深すぎます。</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>ファイル「%1」を書き込み用に開けませんでした。</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1</source>
        <translation>秒数「%1」は無効です。</translation>
    </message>
    <message>
        <source>Invalid one or more IP in list &apos;%1&apos;</source>
        <translation>リスト「%1」に無効な IP アドレスがあります。</translation>
    </message>
    <message>
        <source>Invalid domain name &apos;%1&apos;</source>
        <translation>ドメイン名「%1」は無効です。</translation>
    </message>
    <message>
        <source>Invalid MAC &apos;%1&apos;</source>
        <translation>MAC アドレス「%1」は無効です。</translation>
    </message>
    <message>
        <source>Invalid time in seconds &apos;%1&apos;</source>
        <translation>秒数「%1」は無効です。</translation>
    </message>
    <message>
        <source>Error editing subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>サブネットを編集できませんでした。サブネット「%1」は無効です。</translation>
    </message>
    <message>
        <source>Invalid IP &apos;%1&apos;</source>
        <translation>IP アドレス「%1」は無効です。</translation>
    </message>
    <message>
        <source>Error editing range. Can not edit range in &apos;%1&apos;</source>
        <translation>アドレス範囲を編集できませんでした。「%1」のアドレス範囲は編集できません。</translation>
    </message>
    <message>
        <source>Error editing range. Invalid attributes of parent subnet</source>
        <translation>アドレス範囲を編集できませんでした。親サブネットの属性が無効です。</translation>
    </message>
    <message>
        <source>Error editing range. Invalid parent subnet</source>
        <translation>アドレス範囲を編集できませんでした。親サブネットが無効です。</translation>
    </message>
    <message>
        <source>Error editing range. Invalid start IP &apos;%1&apos;</source>
        <translation>アドレス範囲を編集できませんでした。開始 IP アドレス「%1」は無効です。</translation>
    </message>
    <message>
        <source>Error editing range. Invalid end IP &apos;%1&apos;</source>
        <translation>アドレス範囲を編集できませんでした。終了 IP アドレス「%1」は無効です。</translation>
    </message>
    <message>
        <source>Error adding shared-network. Can not add shared-network to &apos;%1&apos;</source>
        <translation>共有ネットワークを追加できませんでした。「%1」に共有ネットワークは追加できません。</translation>
    </message>
    <message>
        <source>Error adding subnet. Invalid subnet &apos;%1&apos;</source>
        <translation>サブネットを追加できませんでした。サブネット「%1」は無効です。</translation>
    </message>
    <message>
        <source>Error adding subnet. Can not add subnet to &apos;%1&apos;</source>
        <translation>サブネットを追加できませんでした。「%1」にサブネットは追加できません。</translation>
    </message>
    <message>
        <source>Error adding range. Can not add range to &apos;%1&apos;</source>
        <translation>アドレス範囲を追加できませんでした。「%1」にアドレス範囲は追加できません。</translation>
    </message>
    <message>
        <source>Error adding range. Invalid attributes of parent subnet</source>
        <translation>アドレス範囲を追加できませんでした。親サブネットの属性が無効です。</translation>
    </message>
    <message>
        <source>Error adding range. Invalid parent subnet</source>
        <translation>アドレス範囲を追加できませんでした。親サブネットが無効です。</translation>
    </message>
    <message>
        <source>Error adding range. Invalid start IP &apos;%1&apos;</source>
        <translation>アドレス範囲を追加できませんでした。開始 IP アドレス「%1」は無効です。</translation>
    </message>
    <message>
        <source>Error adding range. Invalid end IP &apos;%1&apos;</source>
        <translation>アドレス範囲を追加できませんでした。終了 IP アドレス「%1」は無効です。</translation>
    </message>
    <message>
        <source>Error adding host. Can not add host to &apos;%1&apos;</source>
        <translation>ホストを追加できませんでした。「%1」にホストは追加できません。</translation>
    </message>
    <message>
        <source>Error adding host. Host name can not be empty.</source>
        <translation>ホストを追加できませんでした。ホスト名を空にすることはできません。</translation>
    </message>
    <message>
        <source>Error adding fixed address. Can not add to &apos;%1&apos;</source>
        <translation>固定アドレスを追加できませんでした。「%1」に固定アドレスは追加できません。</translation>
    </message>
    <message>
        <source>Error adding fixed address. Invalid IP &apos;%1&apos;</source>
        <translation>固定アドレスを追加できませんでした。IP アドレス「%1」は無効です。</translation>
    </message>
    <message>
        <source>Error adding bind9. Can not add bind9 to &apos;%1&apos;</source>
        <translation>bind9 の設定を追加できませんでした。「%1」に bind9 の設定は追加できません。</translation>
    </message>
    <message>
        <source>Error adding bind9. bind9 can not be empty.</source>
        <translation>bind9 の設定を追加できませんでした。bind9 の設定を空にすることはできません。</translation>
    </message>
    <message>
        <source>Error adding declaration. Can not add declaration to &apos;%1&apos;</source>
        <translation>宣言を追加できませんでした。「%1」に宣言は追加できません。</translation>
    </message>
    <message>
        <source>Error adding parameter. Can not add parameter to &apos;%1&apos;</source>
        <translation>パラメーターを追加できませんでした。「%1」にパラメーターは追加できません。</translation>
    </message>
    <message>
        <source>Error adding static route. Static route parametrs can not be empty.</source>
        <translation>静的ルートを追加できませんでした。静的ルートのパラメーターを空にすることはできません。</translation>
    </message>
    <message>
        <source>Error adding lease time. Can not add to &apos;%1&apos;</source>
        <translation>リース期間を追加できませんでした。「%1」にリース期間は追加できません。</translation>
    </message>
    <message>
        <source>Error adding static route. Can not add static rout to &apos;%1&apos;</source>
        <translation>静的ルートを追加できませんでした。「%1」に静的ルートは追加できません。</translation>
    </message>
    <message>
        <source>Error adding gateways. Can not add to &apos;%1&apos;</source>
        <translation>ゲートウェイを追加できませんでした。「%1」にゲートウェイは追加できません。</translation>
    </message>
    <message>
        <source>Error adding DNS servers. Can not add to &apos;%1&apos;</source>
        <translation>DNS サーバーを追加できませんでした。「%1」に DNS サーバーは追加できません。</translation>
    </message>
    <message>
        <source>Error adding NTP servers address. Can not add to &apos;%1&apos;</source>
        <translation>NTP サーバーのアドレスを追加できませんでした。「%1」に NTP サーバーのアドレスは追加できません。</translation>
    </message>
    <message>
        <source>Error adding domain name. Can not add to &apos;%1&apos;</source>
        <translation>ドメイン名を追加できませんでした。「%1」にドメイン名は追加できません。</translation>
    </message>
    <message>
        <source>Error editing &apos;%1&apos;. The block would be nested too deeply.</source>
        <translation>「%1」を編集できませんでした。ブロックの入れ子が深くなりすぎます。</translation>
    </message>
</context>
<context>
    <name>DhcpdConfigStatement</name>
    <message>
        <source>All network</source>
        <translation>ネットワーク全体</translation>
    </message>
    <message>
        <source>Subnet</source>
        <translation>サブネット</translation>
    </message>
    <message>
        <source>Shared network</source>
        <translation>共有ネットワーク</translation>
    </message>
    <message>
        <source>Host</source>
        <translation>ホスト</translation>
    </message>
    <message>
        <source>Range</source>
        <translation>アドレス範囲</translation>
    </message>
    <message>
        <source>Fixed address</source>
        <translation>固定アドレス</translation>
    </message>
    <message>
        <source>Key information</source>
        <translation>鍵の情報</translation>
    </message>
    <message>
        <source>Zone served by DNS server</source>
        <translation>DNS サーバーが管理するゾーン</translation>
    </message>
    <message>
        <source>Group</source>
        <translation>グループ</translation>
    </message>
    <message>
        <source> mounth </source>
        <translation> か月 </translation>
    </message>
    <message>
        <source> days </source>
        <translation> 日 </translation>
    </message>
    <message>
        <source> hours </source>
        <translation> 時間 </translation>
    </message>
    <message>
        <source> minutes </source>
        <translation> 分 </translation>
    </message>
    <message>
        <source> seconds </source>
        <translation> 秒 </translation>
    </message>
    <message>
        <source>Gateways</source>
        <translation>ゲートウェイ</translation>
    </message>
    <message>
        <source>DNS servers</source>
        <translation>DNS サーバー</translation>
    </message>
    <message>
        <source>NTP servers</source>
        <translation>NTP サーバー</translation>
    </message>
    <message>
        <source>Domain name</source>
        <translation>ドメイン名</translation>
    </message>
    <message>
        <source>Static route MS</source>
        <translation>静的ルート (MS)</translation>
    </message>
    <message>
        <source>Static route</source>
        <translation>静的ルート</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>MAC アドレス</translation>
    </message>
    <message>
        <source>Max lease time</source>
        <translation>最大リース期間</translation>
    </message>
    <message>
        <source>Default lease time</source>
        <translation>デフォルトのリース期間</translation>
    </message>
    <message>
        <source>Key</source>
        <translation>鍵</translation>
    </message>
    <message>
        <source>Key generation algorithm</source>
        <translation>鍵のアルゴリズム</translation>
    </message>
    <message>
        <source>Generated secret</source>
        <translation>鍵のシークレット</translation>
    </message>
    <message>
        <source>Master DNS Server</source>
        <translation>プライマリ DNS サーバー</translation>
    </message>
</context>
<context>
    <name>DhcpdLeasesModel</name>
    <message>
        <source>IP address</source>
        <translation>IP アドレス</translation>
    </message>
    <message>
        <source>MAC address</source>
        <translation>MAC アドレス</translation>
    </message>
    <message>
        <source>Host name</source>
        <translation>ホスト名</translation>
    </message>
    <message>
        <source>Binding state</source>
        <translation>バインディング状態</translation>
    </message>
    <message>
        <source>Rental start</source>
        <translation>リース開始</translation>
    </message>
    <message>
        <source>Rental end</source>
        <translation>リース終了</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>ファイル「%1」を読み取り用に開けませんでした。</translation>
    </message>
</context>
<context>
    <name>DomainInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>ダイアログ</translation>
    </message>
    <message>
        <source>Domain name:</source>
        <translation>ドメイン名:</translation>
    </message>
</context>
<context>
    <name>FMain</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>DHCP サーバーの設定</translation>
    </message>
    <message>
        <source>Topology</source>
        <translation>トポロジー</translation>
    </message>
    <message>
        <source>Leases</source>
        <translation>リース</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>検索</translation>
    </message>
    <message>
        <source>Previous match</source>
        <translation>前の検索結果</translation>
    </message>
    <message>
        <source>...</source>
        <translation>...</translation>
    </message>
    <message>
        <source>Next match</source>
        <translation>次の検索結果</translation>
    </message>
    <message>
        <source>&amp;File</source>
        <translation>ファイル(&amp;F)</translation>
    </message>
    <message>
        <source>Server</source>
        <translation>サーバー</translation>
    </message>
    <message>
        <source>toolBar</source>
        <translation>ツールバー</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>再読み込み</translation>
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
        <translation>終了</translation>
    </message>
    <message>
        <source>Restart DHCP-server</source>
        <translation>DHCP サーバーを再起動</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>インターフェースを選択</translation>
    </message>
    <message>
        <source>Start DHCP-server</source>
        <translation>DHCP サーバーを起動</translation>
    </message>
    <message>
        <source>Start or stop DHCP-server</source>
        <translation>DHCP サーバーを起動または停止</translation>
    </message>
    <message>
        <source>Ctrl+R</source>
        <translation>Ctrl+R</translation>
    </message>
    <message>
        <source>Add subnet</source>
        <translation>サブネットを追加</translation>
    </message>
    <message>
        <source>Add shared network</source>
        <translation>共有ネットワークを追加</translation>
    </message>
    <message>
        <source>Add host</source>
        <translation>ホストを追加</translation>
    </message>
    <message>
        <source>Add range</source>
        <translation>アドレス範囲を追加</translation>
    </message>
    <message>
        <source>Add arbitrary parameter</source>
        <translation>パラメーターをテキストで追加</translation>
    </message>
    <message>
        <source>Add arbitrary declaration</source>
        <translation>宣言をテキストで追加</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>編集</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>Add fixed IP</source>
        <translation>固定 IP アドレスを追加</translation>
    </message>
    <message>
        <source>Add DNS servers</source>
        <translation>DNS サーバーを追加</translation>
    </message>
    <message>
        <source>Add domain name</source>
        <translation>ドメイン名を追加</translation>
    </message>
    <message>
        <source>Add gateways</source>
        <translation>ゲートウェイを追加</translation>
    </message>
    <message>
        <source>Add NTP servers</source>
        <translation>NTP サーバーを追加</translation>
    </message>
    <message>
        <source>Add default lease time</source>
        <translation>デフォルトのリース期間を追加</translation>
    </message>
    <message>
        <source>Add max lease time</source>
        <translation>最大リース期間を追加</translation>
    </message>
    <message>
        <source>Reserve an IP address</source>
        <translation>IP アドレスを予約</translation>
    </message>
    <message>
        <source>Add static route</source>
        <translation>静的ルートを追加</translation>
    </message>
    <message>
        <source>Add DHCP dynamic zone update</source>
        <translation>DNS ゾーンの動的更新を追加</translation>
    </message>
    <message>
        <source>%1 more</source>
        <translation>ほか %1 件</translation>
    </message>
    <message>
        <source>%1 and %2</source>
        <translation>%1, %2</translation>
    </message>
    <message>
        <source>The configuration could not be read, so there is nothing to save.</source>
        <translation>設定を読み込めなかったため、保存する内容がありません。</translation>
    </message>
    <message>
        <source>The text would be too long, or its blocks nested too deeply, to be read again.</source>
        <translation>テキストが長すぎるか、ブロックの入れ子が深すぎて、再び読み込めなくなります。</translation>
    </message>
    <message>
        <source>The configuration has been changed.
Do you want to overwrite the configuration?</source>
        <translation>ファイルの設定がこのプログラムの外で変更されました。
設定を上書きしますか?</translation>
    </message>
    <message>
        <source>Current configuration in file will be rewrited.
Do you want to save changes?</source>
        <translation>ファイルの現在の設定は上書きされます。
変更を保存しますか?</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>情報</translation>
    </message>
    <message>
        <source>The DHCP server refuses this configuration:
%1</source>
        <translation>DHCP サーバーはこの設定を受け付けません:
%1</translation>
    </message>
    <message>
        <source>Answer of the DHCP server</source>
        <translation>DHCP サーバーの応答</translation>
    </message>
    <message>
        <source>The comment of the file will not be kept.</source>
        <translation>ファイル内のコメントは失われます。</translation>
    </message>
    <message>
        <source>The %1 comments of the file will not be kept.</source>
        <translation>ファイル内の %1 個のコメントは失われます。</translation>
    </message>
    <message>
        <source>The quoted text in line %1 will be changed.</source>
        <translation>%1 行目の引用符で囲まれたテキストが変更されます。</translation>
    </message>
    <message>
        <source>The quoted texts in lines %1 will be changed.</source>
        <translation>次の行の引用符で囲まれたテキストが変更されます: %1</translation>
    </message>
    <message>
        <source>The statement in line %1 will be changed.</source>
        <translation>%1 行目の文が変更されます。</translation>
    </message>
    <message>
        <source>The statements in lines %1 will be changed.</source>
        <translation>次の行の文が変更されます: %1</translation>
    </message>
    <message>
        <source>The carriage return in line %1 will become part of a word.</source>
        <translation>%1 行目の復帰 (CR) 文字は単語の一部になります。</translation>
    </message>
    <message>
        <source>The carriage returns in lines %1 will become parts of words.</source>
        <translation>次の行の復帰 (CR) 文字は単語の一部になります: %1</translation>
    </message>
    <message>
        <source>Declaration:</source>
        <translation>宣言:</translation>
    </message>
    <message>
        <source>Edit arbitrary declaration</source>
        <translation>宣言をテキストで編集</translation>
    </message>
    <message>
        <source>Edit shared network</source>
        <translation>共有ネットワークを編集</translation>
    </message>
    <message>
        <source>Edit subnet</source>
        <translation>サブネットを編集</translation>
    </message>
    <message>
        <source>Edit range</source>
        <translation>アドレス範囲を編集</translation>
    </message>
    <message>
        <source>Edit host</source>
        <translation>ホストを編集</translation>
    </message>
    <message>
        <source>The IP address is reserved.
Go to topology?</source>
        <translation>IP アドレスを予約しました。
トポロジーに移動しますか?</translation>
    </message>
    <message>
        <source>Add fixed address</source>
        <translation>固定アドレスを追加</translation>
    </message>
    <message>
        <source>Edit fixed address</source>
        <translation>固定アドレスを編集</translation>
    </message>
    <message>
        <source>Edit static route</source>
        <translation>静的ルートを編集</translation>
    </message>
    <message>
        <source>Add configuration to automatically configure binding with bind9 DNS server?</source>
        <translation>DNS サーバー bind9 と自動的に連携するための設定を追加しますか?</translation>
    </message>
    <message>
        <source>Choose the bind9 configuration with the update key</source>
        <translation>更新用の鍵が書かれた bind9 の設定ファイルを選択</translation>
    </message>
    <message>
        <source>These zones were left out:</source>
        <translation>次のゾーンは除外されました:</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>the name server is not its primary one</source>
        <translation>このネームサーバーはゾーンのプライマリではありません</translation>
    </message>
    <message>
        <source>no key may update it</source>
        <translation>更新を許可された鍵がありません</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its name</source>
        <translation>DHCP サーバーがこのゾーン名を受け付けません</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; is not known</source>
        <translation>鍵「%1」が見つかりません</translation>
    </message>
    <message>
        <source>the DHCP server does not accept its key &apos;%1&apos;</source>
        <translation>DHCP サーバーが鍵「%1」を受け付けません</translation>
    </message>
    <message>
        <source>its key &apos;%1&apos; stands behind this place in the configuration</source>
        <translation>鍵「%1」の定義は設定内でこの位置より後にあります</translation>
    </message>
    <message>
        <source>Value</source>
        <translation>値</translation>
    </message>
    <message>
        <source>Do you want to reload configuration from file?</source>
        <translation>設定をファイルから再読み込みしますか?</translation>
    </message>
    <message>
        <source>Confirmation</source>
        <translation>確認</translation>
    </message>
    <message>
        <source>There are unsaved changes, save?</source>
        <translation>保存されていない変更があります。保存しますか?</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>エラー</translation>
    </message>
    <message>
        <source>Actions</source>
        <translation>操作</translation>
    </message>
    <message>
        <source>Clear the search</source>
        <translation>検索をクリア</translation>
    </message>
    <message>
        <source>Edit gateways</source>
        <translation>ゲートウェイを編集</translation>
    </message>
    <message>
        <source>Gateways:</source>
        <translation>ゲートウェイ:</translation>
    </message>
    <message>
        <source>Edit DNS servers</source>
        <translation>DNS サーバーを編集</translation>
    </message>
    <message>
        <source>DNS servers:</source>
        <translation>DNS サーバー:</translation>
    </message>
    <message>
        <source>Edit NTP servers</source>
        <translation>NTP サーバーを編集</translation>
    </message>
    <message>
        <source>NTP servers:</source>
        <translation>NTP サーバー:</translation>
    </message>
    <message>
        <source>Edit domain name</source>
        <translation>ドメイン名を編集</translation>
    </message>
    <message>
        <source>Edit default lease time</source>
        <translation>デフォルトのリース期間を編集</translation>
    </message>
    <message>
        <source>Edit max lease time</source>
        <translation>最大リース期間を編集</translation>
    </message>
    <message>
        <source>Edit MAC address</source>
        <translation>MAC アドレスを編集</translation>
    </message>
    <message>
        <source>Edit time</source>
        <translation>期間を編集</translation>
    </message>
    <message>
        <source>Parameter:</source>
        <translation>パラメーター:</translation>
    </message>
    <message>
        <source>Edit arbitrary parameter</source>
        <translation>パラメーターをテキストで編集</translation>
    </message>
    <message>
        <source>Stop DHCP-server</source>
        <translation>DHCP サーバーを停止</translation>
    </message>
    <message>
        <source>Warning!</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>This editing mode for advanced users.
After applying this changes configuration may be incorrect.
Do you want to resume?</source>
        <translation>この編集モードは上級者向けです。
変更を適用すると、設定が正しくなくなることがあります。
続けますか?</translation>
    </message>
    <message>
        <source>Add option</source>
        <translation>オプションを追加</translation>
    </message>
    <message>
        <source>Add parameter</source>
        <translation>パラメーターを追加</translation>
    </message>
    <message>
        <source>Leases found: %1</source>
        <translation>見つかったリース: %1</translation>
    </message>
    <message>
        <source>No leases found</source>
        <translation>リースが見つかりません</translation>
    </message>
</context>
<context>
    <name>HandbookViewer</name>
    <message>
        <source>Not found</source>
        <translation>見つかりません</translation>
    </message>
    <message>
        <source>Contents</source>
        <translation>目次</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>検索</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>戻る</translation>
    </message>
</context>
<context>
    <name>HostInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>ダイアログ</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>名前:</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>MAC アドレス:</translation>
    </message>
    <message>
        <source>Fixed IP:</source>
        <translation>固定 IP アドレス:</translation>
    </message>
</context>
<context>
    <name>IpInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>ダイアログ</translation>
    </message>
    <message>
        <source>IP:</source>
        <translation>IP アドレス:</translation>
    </message>
</context>
<context>
    <name>MacInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>ダイアログ</translation>
    </message>
    <message>
        <source>MAC address:</source>
        <translation>MAC アドレス:</translation>
    </message>
</context>
<context>
    <name>MultipleIpInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>ダイアログ</translation>
    </message>
    <message>
        <source>IP addresses</source>
        <translation>IP アドレス</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>追加</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>Add IP</source>
        <translation>IP アドレスを追加</translation>
    </message>
</context>
<context>
    <name>OrvHelpMenu</name>
    <message>
        <source>Configure DHCP server</source>
        <translation>DHCP サーバーの設定</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>ヘルプ(&amp;H)</translation>
    </message>
    <message>
        <source>Manual</source>
        <translation>マニュアルページ</translation>
    </message>
    <message>
        <source>About %1</source>
        <translation>%1 について</translation>
    </message>
    <message>
        <source>About Qt</source>
        <translation>Qt について</translation>
    </message>
    <message>
        <source>Free software under the GNU General Public License, version 3 or later. There is no warranty, to the extent permitted by law.</source>
        <translation>これは GNU 一般公衆利用許諾書 (GNU GPL) バージョン 3 以降のもとで公開されている自由ソフトウェアです。法律で認められる範囲において、いかなる保証もありません。</translation>
    </message>
    <message>
        <source>Handbook</source>
        <translation>ハンドブック</translation>
    </message>
</context>
<context>
    <name>QAbstractTableModel</name>
    <message>
        <source>Net mask</source>
        <translation>ネットマスク</translation>
    </message>
    <message>
        <source>IP net</source>
        <translation>IP ネットワーク</translation>
    </message>
    <message>
        <source>Gateway</source>
        <translation>ゲートウェイ</translation>
    </message>
</context>
<context>
    <name>QDialog</name>
    <message>
        <source>Available interfaces</source>
        <translation>使用できるインターフェース</translation>
    </message>
    <message>
        <source>Select interfaces</source>
        <translation>インターフェースを選択</translation>
    </message>
    <message>
        <source>Available interfaces are not found!</source>
        <translation>使用できるインターフェースが見つかりません。</translation>
    </message>
</context>
<context>
    <name>QObject</name>
    <message>
        <source>Error</source>
        <translation>エラー</translation>
    </message>
    <message>
        <source>Must be superuser</source>
        <translation>このプログラムはスーパーユーザーとして実行する必要があります。</translation>
    </message>
    <message>
        <source>Updating DHCP-server status...</source>
        <translation>DHCP サーバーの状態を確認しています...</translation>
    </message>
    <message>
        <source>DHCP-server is running</source>
        <translation>DHCP サーバーは稼働中です</translation>
    </message>
    <message>
        <source>DHCP-server is stopped</source>
        <translation>DHCP サーバーは停止しています</translation>
    </message>
    <message>
        <source>DHCP-server already running</source>
        <translation>DHCP サーバーはすでに稼働しています。</translation>
    </message>
    <message>
        <source>DHCP-server already stopped</source>
        <translation>DHCP サーバーはすでに停止しています。</translation>
    </message>
    <message>
        <source>Checking DHCP-server status failed
%1</source>
        <translation>DHCP サーバーの状態を確認できませんでした。
%1</translation>
    </message>
    <message>
        <source>Some operation with DHCP-server already executes</source>
        <translation>DHCP サーバーに対する別の操作がすでに実行中です。</translation>
    </message>
    <message>
        <source>Operation with DHCP-server failed
%1</source>
        <translation>DHCP サーバーに対する操作に失敗しました。
%1</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for read</source>
        <translation>ファイル「%1」を読み取り用に開けませんでした。</translation>
    </message>
    <message>
        <source>Unable to open file &apos;%1&apos; for write</source>
        <translation>ファイル「%1」を書き込み用に開けませんでした。</translation>
    </message>
    <message>
        <source>The choice of interfaces is not stored, since file &apos;%1&apos; has no line with &apos;%2&apos;</source>
        <translation>ファイル「%1」に「%2」の行がないため、インターフェースの選択は保存されませんでした。</translation>
    </message>
</context>
<context>
    <name>QtSingleApplication</name>
    <message>
        <source>Error</source>
        <translation>エラー</translation>
    </message>
    <message>
        <source>The program does not start, since it cannot tell whether it is running already: there is no folder &apos;%1&apos; that only the superuser can enter.</source>
        <translation>すでに実行中かどうかを判断できないため、プログラムを起動できません。スーパーユーザーだけがアクセスできるフォルダー「%1」がありません。</translation>
    </message>
</context>
<context>
    <name>RangeInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>ダイアログ</translation>
    </message>
    <message>
        <source>Start IP:</source>
        <translation>開始 IP アドレス:</translation>
    </message>
    <message>
        <source>End IP:</source>
        <translation>終了 IP アドレス:</translation>
    </message>
</context>
<context>
    <name>SharedNetworkInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>ダイアログ</translation>
    </message>
    <message>
        <source>Name:</source>
        <translation>名前:</translation>
    </message>
</context>
<context>
    <name>StatementInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>ダイアログ</translation>
    </message>
    <message>
        <source>Attributes:</source>
        <translation>属性:</translation>
    </message>
</context>
<context>
    <name>StaticRouteInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>ダイアログ</translation>
    </message>
    <message>
        <source>Static routes</source>
        <translation>静的ルート</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>追加</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>Route for MS systems</source>
        <translation>MS システム用のルート</translation>
    </message>
    <message>
        <source>Information</source>
        <translation>情報</translation>
    </message>
    <message>
        <source>There is an empty cell.
To add, fill in the cell.</source>
        <translation>空のセルがあります。
ルートを追加するには、セルに入力してください。</translation>
    </message>
</context>
<context>
    <name>SubnetInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>ダイアログ</translation>
    </message>
    <message>
        <source>Address:</source>
        <translation>アドレス:</translation>
    </message>
    <message>
        <source>Netmask:</source>
        <translation>ネットマスク:</translation>
    </message>
</context>
<context>
    <name>TimeInputDialog</name>
    <message>
        <source>Dialog</source>
        <translation>ダイアログ</translation>
    </message>
    <message>
        <source>Mounth:</source>
        <translation>月数:</translation>
    </message>
    <message>
        <source>Days:</source>
        <translation>日数:</translation>
    </message>
    <message>
        <source>Hours</source>
        <translation>時間</translation>
    </message>
    <message>
        <source> h</source>
        <translation> 時間</translation>
    </message>
    <message>
        <source>:</source>
        <translation>:</translation>
    </message>
    <message>
        <source>Minutes</source>
        <translation>分</translation>
    </message>
    <message>
        <source> m</source>
        <translation> 分</translation>
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
        <translation>上書きしている間、元の内容を保管しておくことができません。</translation>
    </message>
    <message>
        <source>%1. The file is damaged, its old content is kept in %2</source>
        <translation>%1。ファイルは破損しています。元の内容は「%2」にあります。</translation>
    </message>
</context>
</TS>
