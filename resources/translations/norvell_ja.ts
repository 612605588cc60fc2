<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja" sourcelanguage="en">
<context>
    <name>AboutDialog</name>
    <message>
        <source>OK</source>
        <translation>OK</translation>
    </message>
    <message>
        <source>About</source>
        <translation>バージョン情報</translation>
    </message>
    <message>
        <source>The program is built with the work of others, under these licences:</source>
        <translation>このプログラムは、以下のライセンスによる他者の成果を利用しています:</translation>
    </message>
    <message>
        <source>Licences</source>
        <translation>ライセンス</translation>
    </message>
    <message>
        <source>Component</source>
        <translation>コンポーネント</translation>
    </message>
    <message>
        <source>Version</source>
        <translation>バージョン</translation>
    </message>
    <message>
        <source>Licence</source>
        <translation>ライセンス</translation>
    </message>
    <message>
        <source>Key fingerprint</source>
        <translation>鍵のフィンガープリント</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>コピー</translation>
    </message>
    <message>
        <source>Key of the service on this computer (SHA-256)</source>
        <translation>このコンピューターのサービスの鍵 (SHA-256)</translation>
    </message>
    <message>
        <source>Key of the server %1 (SHA-256)</source>
        <translation>サーバー %1 の鍵 (SHA-256)</translation>
    </message>
</context>
<context>
    <name>AccountManagementDialog</name>
    <message>
        <source>Change password for local server</source>
        <translation>ローカルサーバーのパスワードを変更</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>メールアドレス</translation>
    </message>
    <message>
        <source>Old password</source>
        <translation>現在のパスワード</translation>
    </message>
    <message>
        <source>New password</source>
        <translation>新しいパスワード</translation>
    </message>
    <message>
        <source>8 to 64 letters, digits and !%-.@^_~, with a lower-case and an upper-case letter, a digit and a symbol</source>
        <translation>8～64 文字の英数字と !%-.@^_~ (小文字、大文字、数字、記号をそれぞれ 1 文字以上)</translation>
    </message>
    <message>
        <source>Confirm Password</source>
        <translation>パスワードの確認</translation>
    </message>
    <message>
        <source>Remember Me</source>
        <translation>ログイン情報を保存</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>適用</translation>
    </message>
    <message>
        <source>Account management</source>
        <translation>アカウント管理</translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation>このフィールドは空にできません。</translation>
    </message>
    <message>
        <source>Passwords do not match.</source>
        <translation>パスワードが一致しません。</translation>
    </message>
    <message>
        <source>Password does not meet the requirements.</source>
        <translation>パスワードが要件を満たしていません。</translation>
    </message>
    <message>
        <source>Change password failed.</source>
        <translation>パスワードを変更できませんでした。</translation>
    </message>
    <message>
        <source>Changing password...</source>
        <translation>パスワードを変更しています...</translation>
    </message>
</context>
<context>
    <name>AccountSetupDialog</name>
    <message>
        <source>First time login account setup</source>
        <translation>初回ログイン用アカウントの設定</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>メールアドレス</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>パスワード</translation>
    </message>
    <message>
        <source>8 to 64 letters, digits and !%-.@^_~, with a lower-case and an upper-case letter, a digit and a symbol</source>
        <translation>8～64 文字の英数字と !%-.@^_~ (小文字、大文字、数字、記号をそれぞれ 1 文字以上)</translation>
    </message>
    <message>
        <source>Confirm Password</source>
        <translation>パスワードの確認</translation>
    </message>
    <message>
        <source>Remember Me</source>
        <translation>ログイン情報を保存</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>次へ</translation>
    </message>
    <message>
        <source>Account setup</source>
        <translation>アカウントの設定</translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation>このフィールドは空にできません。</translation>
    </message>
    <message>
        <source>Passwords do not match.</source>
        <translation>パスワードが一致しません。</translation>
    </message>
    <message>
        <source>Password does not meet the requirements.</source>
        <translation>パスワードが要件を満たしていません。</translation>
    </message>
    <message>
        <source>This email is already taken.</source>
        <translation>このメールアドレスは既に使用されています。</translation>
    </message>
    <message>
        <source>Create account failed.</source>
        <translation>アカウントを作成できませんでした。</translation>
    </message>
    <message>
        <source>Creating account...</source>
        <translation>アカウントを作成しています...</translation>
    </message>
</context>
<context>
    <name>AddDeviceDialog</name>
    <message>
        <source>Search</source>
        <translation>検索</translation>
    </message>
    <message>
        <source>Search model, IP or MAC</source>
        <translation>モデル、IP、MAC を検索</translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>更新</translation>
    </message>
    <message>
        <source>Add Device Manually</source>
        <translation>デバイスを手動で追加</translation>
    </message>
    <message>
        <source>Import CSV</source>
        <translation>CSV をインポート</translation>
    </message>
    <message>
        <source>Select all/Deselect all</source>
        <translation>すべて選択/選択解除</translation>
    </message>
    <message>
        <source>Download template</source>
        <translation>テンプレートをダウンロード</translation>
    </message>
    <message>
        <source>Saves an example of a CSV file that can be imported</source>
        <translation>インポートできる CSV ファイルの例を保存します</translation>
    </message>
    <message>
        <source>Devices that can be added</source>
        <translation>追加できるデバイス</translation>
    </message>
    <message>
        <source>0 of 0 devices selected</source>
        <translation>0 台中 0 台のデバイスを選択</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>追加</translation>
    </message>
    <message>
        <source>Add Device</source>
        <translation>デバイスの追加</translation>
    </message>
    <message>
        <source>Open File</source>
        <translation>ファイルを開く</translation>
    </message>
    <message>
        <source>Devices</source>
        <translation>デバイス</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>名前を付けて保存</translation>
    </message>
    <message>
        <source>The search failed: %1.</source>
        <translation>検索に失敗しました: %1。</translation>
    </message>
    <message>
        <source>No device was found at %1.</source>
        <translation>%1 にデバイスは見つかりませんでした。</translation>
    </message>
    <message>
        <source>No device was found from %1 to %2.</source>
        <translation>%1 から %2 までにデバイスは見つかりませんでした。</translation>
    </message>
    <message>
        <source>Nothing was done with the file: %1.</source>
        <translation>ファイルは処理されませんでした: %1。</translation>
    </message>
    <message>
        <source>The template was written.</source>
        <translation>テンプレートを保存しました。</translation>
    </message>
    <message>
        <source>The template could not be written: %1.</source>
        <translation>テンプレートを保存できませんでした: %1。</translation>
    </message>
    <message>
        <source>The file &quot;%1&quot; could not be read: %2.</source>
        <translation>ファイル「%1」を読み取れませんでした: %2。</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) added to the list.</source>
        <translation>
            <numerusform>%n 台のデバイスを一覧に追加しました。</numerusform>
        </translation>
    </message>
    <message>
        <source>There is no device in the file &quot;%1&quot;.</source>
        <translation>ファイル「%1」にデバイスがありません。</translation>
    </message>
    <message>
        <source>Line %1</source>
        <translation>%1 行目</translation>
    </message>
    <message numerus="yes">
        <source>%n row(s) of the file &quot;%1&quot; could not be read.</source>
        <translation>
            <numerusform>ファイル「%1」の %n 行を読み取れませんでした。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) sent; whether the server lists them could not be checked: %1.</source>
        <translation>
            <numerusform>%n 台のデバイスを送信しましたが、サーバーの一覧にあるか確認できませんでした: %1。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) added.</source>
        <translation>
            <numerusform>%n 台のデバイスを追加しました。</numerusform>
        </translation>
    </message>
    <message>
        <source>%1, %2</source>
        <translation>%1, %2</translation>
    </message>
    <message>
        <source>The server does not list the device after it was sent.</source>
        <translation>送信後もサーバーの一覧にデバイスがありません。</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) could not be added.</source>
        <translation>
            <numerusform>%n 台のデバイスを追加できませんでした。</numerusform>
        </translation>
    </message>
    <message>
        <source>The devices could not be added: %1.</source>
        <translation>デバイスを追加できませんでした: %1。</translation>
    </message>
    <message>
        <source>%1 of %2 devices selected</source>
        <translation>%2 台中 %1 台のデバイスを選択</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>閉じる</translation>
    </message>
    <message>
        <source>Adding...</source>
        <translation>追加しています...</translation>
    </message>
    <message>
        <source>Working on the file...</source>
        <translation>ファイルを処理しています...</translation>
    </message>
    <message>
        <source>Reading what was found...</source>
        <translation>検索結果を読み取っています...</translation>
    </message>
    <message>
        <source>Searching... %1 of %2 seconds</source>
        <translation>検索しています... %1/%2 秒</translation>
    </message>
    <message>
        <source>No device matches</source>
        <translation>一致するデバイスがありません</translation>
    </message>
    <message>
        <source>The search leaves none of the devices.</source>
        <translation>検索条件に一致するデバイスがありません。</translation>
    </message>
    <message>
        <source>Searching for devices...</source>
        <translation>デバイスを検索しています...</translation>
    </message>
    <message>
        <source>The server looks for devices on its network.</source>
        <translation>サーバーがネットワーク上のデバイスを探しています。</translation>
    </message>
    <message>
        <source>The search failed</source>
        <translation>検索に失敗しました</translation>
    </message>
    <message>
        <source>Press Refresh to try again.</source>
        <translation>「更新」を押して再試行してください。</translation>
    </message>
    <message>
        <source>No new device found</source>
        <translation>新しいデバイスは見つかりませんでした</translation>
    </message>
    <message>
        <source>Devices that the server does not reach by itself can be added manually or from a file.</source>
        <translation>サーバーが自動で検出できないデバイスは、手動またはファイルから追加できます。</translation>
    </message>
    <message>
        <source>Waiting for the list of managed devices...</source>
        <translation>管理中のデバイスの一覧を待っています...</translation>
    </message>
    <message>
        <source>What was found there is managed or listed already.</source>
        <translation>見つかったデバイスは既に管理されているか、一覧にあります。</translation>
    </message>
    <message numerus="yes">
        <source>Managed or listed already: %n device(s) of the file.</source>
        <translation>
            <numerusform>ファイルの %n 台のデバイスは既に管理されているか、一覧にあります。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Managed already and left as they are: %n device(s).</source>
        <translation>
            <numerusform>%n 台のデバイスはすでに管理されているため、そのままです。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Managed already: %n device(s) that answered.</source>
        <translation>
            <numerusform>%n 台のデバイスが応答しましたが、既に管理されています。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) without a good MAC address answered, which cannot be added.</source>
        <translation>
            <numerusform>有効な MAC アドレスのないデバイス %n 台が応答しましたが、追加できません。</numerusform>
        </translation>
    </message>
    <message>
        <source>The first %1 are listed.</source>
        <translation>最初の %1 件を表示しています。</translation>
    </message>
</context>
<context>
    <name>AddDeviceManualDialog</name>
    <message>
        <source>By IP</source>
        <translation>IP 指定</translation>
    </message>
    <message>
        <source>IP</source>
        <translation>IP</translation>
    </message>
    <message>
        <source>192.168.0.10</source>
        <translation>192.168.0.10</translation>
    </message>
    <message>
        <source>Port</source>
        <translation>ポート</translation>
    </message>
    <message>
        <source>Any</source>
        <translation>任意</translation>
    </message>
    <message>
        <source>By IP Range</source>
        <translation>IP 範囲指定</translation>
    </message>
    <message>
        <source>From</source>
        <translation>開始</translation>
    </message>
    <message>
        <source>192.168.0.1</source>
        <translation>192.168.0.1</translation>
    </message>
    <message>
        <source>To</source>
        <translation>終了</translation>
    </message>
    <message>
        <source>192.168.0.254</source>
        <translation>192.168.0.254</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>追加</translation>
    </message>
    <message>
        <source>Add Device Manually</source>
        <translation>デバイスを手動で追加</translation>
    </message>
    <message>
        <source>The port must be a number from 1 to 65535.</source>
        <translation>ポートには 1～65535 の数値を入力してください。</translation>
    </message>
    <message>
        <source>The range ends before it begins.</source>
        <translation>範囲の終了が開始より前です。</translation>
    </message>
    <message>
        <source>The range has %1 addresses; %2 are the most that can be searched at once.</source>
        <translation>範囲に %1 個のアドレスがあります。一度に検索できるのは %2 個までです。</translation>
    </message>
    <message>
        <source>1 address</source>
        <translation>1 個のアドレス</translation>
    </message>
    <message>
        <source>%1 addresses</source>
        <translation>%1 個のアドレス</translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation>このフィールドは空にできません。</translation>
    </message>
    <message>
        <source>An address has four numbers from 0 to 255, as in 192.168.0.10.</source>
        <translation>アドレスは 192.168.0.10 のように 0～255 の 4 つの数値で入力してください。</translation>
    </message>
</context>
<context>
    <name>AddServerDialog</name>
    <message>
        <source>Add Server</source>
        <translation>サーバーの追加</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>追加</translation>
    </message>
</context>
<context>
    <name>AlarmAnnouncer</name>
    <message numerus="yes">
        <source>Lost connection to %n device(s)</source>
        <translation>
            <numerusform>%n 台のデバイスとの接続が切れました</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>AlarmModel</name>
    <message>
        <source>Unread</source>
        <translation>未読</translation>
    </message>
</context>
<context>
    <name>AlarmPanel</name>
    <message>
        <source>Copy</source>
        <translation>コピー</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>Delete all</source>
        <translation>すべて削除</translation>
    </message>
    <message>
        <source>Alarms</source>
        <translation>アラーム</translation>
    </message>
    <message>
        <source>Not read since %1</source>
        <translation>%1 から読み取れていません</translation>
    </message>
    <message>
        <source>No alarms.</source>
        <translation>アラームはありません。</translation>
    </message>
    <message>
        <source>Loading alarms...</source>
        <translation>アラームを読み込んでいます...</translation>
    </message>
    <message>
        <source>The alarm list could not be read.</source>
        <translation>アラーム一覧を読み取れませんでした。</translation>
    </message>
</context>
<context>
    <name>AlarmRecord</name>
    <message>
        <source>Server started</source>
        <translation>サーバーが起動しました</translation>
    </message>
    <message>
        <source>Lost connection to %1</source>
        <translation>%1 との接続が切れました</translation>
    </message>
    <message>
        <source>Connection to %1 restored</source>
        <translation>%1 との接続が回復しました</translation>
    </message>
    <message>
        <source>Memory card error on %1</source>
        <translation>%1 でメモリーカードエラーが発生しました</translation>
    </message>
    <message>
        <source>Server stopped</source>
        <translation>サーバーが停止しました</translation>
    </message>
    <message>
        <source>Authorization of %1 lost</source>
        <translation>%1 の認証が失われました</translation>
    </message>
    <message>
        <source>Alarm: %1</source>
        <translation>アラーム: %1</translation>
    </message>
</context>
<context>
    <name>ApiResult</name>
    <message>
        <source>the server did not answer</source>
        <translation>サーバーが応答しませんでした</translation>
    </message>
    <message>
        <source>the server answered with an error</source>
        <translation>サーバーがエラーを返しました</translation>
    </message>
    <message>
        <source>the server refused it</source>
        <translation>サーバーに拒否されました</translation>
    </message>
    <message>
        <source>the server&apos;s answer could not be read</source>
        <translation>サーバーの応答を読み取れませんでした</translation>
    </message>
    <message>
        <source>a secret could not be ciphered</source>
        <translation>機密情報を暗号化できませんでした</translation>
    </message>
    <message>
        <source>the file exists already or cannot be written</source>
        <translation>ファイルが既に存在するか、書き込めません</translation>
    </message>
    <message>
        <source>error %1</source>
        <translation>エラー %1</translation>
    </message>
    <message>
        <source>the server&apos;s key has changed</source>
        <translation>サーバーの鍵が変わっています</translation>
    </message>
    <message>
        <source>nothing was sent, because something in it is missing or not allowed</source>
        <translation>必要な項目がないか許可されていない項目があるため、何も送信されませんでした</translation>
    </message>
    <message>
        <source>the server does not know the session any more</source>
        <translation>サーバーがこのセッションを認識しなくなりました</translation>
    </message>
    <message>
        <source>the server takes no more sessions</source>
        <translation>サーバーはこれ以上セッションを受け付けません</translation>
    </message>
</context>
<context>
    <name>AssignIpDialogII</name>
    <message>
        <source>IP Method</source>
        <translation>IP の割り当て方法</translation>
    </message>
    <message>
        <source>IP Address(es)</source>
        <translation>IP アドレス</translation>
    </message>
    <message>
        <source>192.168.1.10-99, 192.168.2.*</source>
        <translation>192.168.1.10-99, 192.168.2.*</translation>
    </message>
    <message>
        <source>Subnet Mask</source>
        <translation>サブネットマスク</translation>
    </message>
    <message>
        <source>Default Gateway</source>
        <translation>デフォルトゲートウェイ</translation>
    </message>
    <message>
        <source>Preferred DNS</source>
        <translation>優先 DNS</translation>
    </message>
    <message>
        <source>Optional</source>
        <translation>省略可</translation>
    </message>
    <message>
        <source>Alternative DNS</source>
        <translation>代替 DNS</translation>
    </message>
    <message>
        <source>Select all/Deselect all</source>
        <translation>すべて選択/選択解除</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>検索</translation>
    </message>
    <message>
        <source>Search model, IP or MAC</source>
        <translation>モデル、IP、MAC を検索</translation>
    </message>
    <message>
        <source>Devices that get addresses</source>
        <translation>アドレスを割り当てるデバイス</translation>
    </message>
    <message>
        <source>Total Quantity: 0</source>
        <translation>合計: 0</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>適用</translation>
    </message>
    <message>
        <source>Assign IP</source>
        <translation>IP の割り当て</translation>
    </message>
    <message>
        <source>Auto</source>
        <translation>自動</translation>
    </message>
    <message>
        <source>Manual</source>
        <translation>手動</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no IP address; the device keeps the one it had.</source>
        <translation>「%1」は IP アドレスではありません。デバイスは元のアドレスのままです。</translation>
    </message>
    <message>
        <source>Total Quantity: %1</source>
        <translation>合計: %1</translation>
    </message>
    <message>
        <source>The field can’t be empty.</source>
        <translation>このフィールドは空にできません。</translation>
    </message>
    <message>
        <source>Each address has four parts: numbers from 0 to 255, ranges as in 10-19, or * for any.</source>
        <translation>アドレスは 4 つの部分からなります。0～255 の数値、10-19 のような範囲、または任意を表す * を使えます。</translation>
    </message>
    <message>
        <source>This is no subnet mask, as 255.255.255.0 is one.</source>
        <translation>255.255.255.0 のようなサブネットマスクではありません。</translation>
    </message>
    <message>
        <source>The gateway is no IP address.</source>
        <translation>ゲートウェイが IP アドレスではありません。</translation>
    </message>
    <message>
        <source>The DNS server is no IP address.</source>
        <translation>DNS サーバーが IP アドレスではありません。</translation>
    </message>
    <message>
        <source>IP conflicts or not enough available IP addresses. Pleasea use available IP or try a wider IP range.</source>
        <translation>IP アドレスが競合しているか、使用できる IP アドレスが足りません。使用できる IP アドレスか、より広い IP 範囲を指定してください。</translation>
    </message>
    <message>
        <source>The assignment could not be started.</source>
        <translation>割り当てを開始できませんでした。</translation>
    </message>
    <message>
        <source>The addresses in use could not be read. Press Apply to try again.</source>
        <translation>使用中のアドレスを読み取れませんでした。「適用」 を押して再試行してください。</translation>
    </message>
    <message>
        <source>Some of the addresses were taken meanwhile, so others are given now. Look at them and press Apply again.</source>
        <translation>一部のアドレスがその間に使用されたため、別のアドレスを割り当てます。確認してからもう一度 「適用」 を押してください。</translation>
    </message>
</context>
<context>
    <name>AssignIpModel</name>
    <message>
        <source>Model</source>
        <translation>モデル</translation>
    </message>
    <message>
        <source>MAC</source>
        <translation>MAC</translation>
    </message>
    <message>
        <source>Current IP</source>
        <translation>現在の IP</translation>
    </message>
    <message>
        <source>New IP</source>
        <translation>新しい IP</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>備考</translation>
    </message>
    <message>
        <source>Automatic</source>
        <translation>自動</translation>
    </message>
</context>
<context>
    <name>AuthorizeDeviceDialog</name>
    <message>
        <source>Authorize Device</source>
        <translation>デバイスの認証</translation>
    </message>
    <message>
        <source>Username</source>
        <translation>ユーザー名</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>パスワード</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>適用</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will fail: their account is blocked for a while.</source>
        <translation>
            <numerusform>%n 台のデバイスは失敗します: アカウントが一時的にロックされています。</numerusform>
        </translation>
    </message>
    <message>
        <source>Account blocked</source>
        <translation>アカウントロック中</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) refused the last password; another wrong one may block the account.</source>
        <translation>
            <numerusform>%n 台のデバイスが前回のパスワードを拒否しました。もう一度間違えるとアカウントがロックされる場合があります。</numerusform>
        </translation>
    </message>
    <message>
        <source>Invalid password</source>
        <translation>パスワードが無効</translation>
    </message>
</context>
<context>
    <name>CPostWork</name>
    <message>
        <source>Reason: %1.</source>
        <translation>理由: %1。</translation>
    </message>
    <message>
        <source>There will be no debug information in “%1”: the server does not know its task any more.</source>
        <translation>「%1」にデバッグ情報は保存されません: サーバーがそのタスクを管理しなくなっています。</translation>
    </message>
    <message>
        <source>The debug information could not be saved in “%1”, which will be tried again. %2</source>
        <translation>「%1」にデバッグ情報を保存できませんでした。再試行します。%2</translation>
    </message>
    <message>
        <source>There will be no debug information in “%1”: no device delivered any.</source>
        <translation>「%1」にデバッグ情報は保存されません。どのデバイスからも届きませんでした。</translation>
    </message>
</context>
<context>
    <name>CaFileField</name>
    <message>
        <source>This certificate has expired.</source>
        <translation>この証明書は期限切れです。</translation>
    </message>
    <message>
        <source>This certificate is not yet valid.</source>
        <translation>この証明書はまだ有効ではありません。</translation>
    </message>
    <message>
        <source>This certificate expires soon.</source>
        <translation>この証明書はまもなく期限が切れます。</translation>
    </message>
    <message>
        <source>This is no certificate of an authority.</source>
        <translation>認証局の証明書ではありません。</translation>
    </message>
    <message>
        <source>Choose a file</source>
        <translation>ファイルを選択</translation>
    </message>
    <message>
        <source>Choose a CA certificate</source>
        <translation>CA 証明書を選択</translation>
    </message>
    <message>
        <source>There is no certificate in the file.</source>
        <translation>ファイルに証明書がありません。</translation>
    </message>
    <message>
        <source>%1, valid from %2 to %3</source>
        <translation>%1、有効期間 %2～%3</translation>
    </message>
    <message>
        <source>%1 %2</source>
        <translation>%1 %2</translation>
    </message>
</context>
<context>
    <name>CertificateBox</name>
    <message>
        <source>Select all/Deselect all</source>
        <translation>すべて選択/選択解除</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>検索</translation>
    </message>
    <message>
        <source>Search model, IP or MAC</source>
        <translation>モデル、IP、MAC を検索</translation>
    </message>
    <message>
        <source>Choose files…</source>
        <translation>ファイルを選択…</translation>
    </message>
    <message>
        <source>Devices and their certificates</source>
        <translation>デバイスとその証明書</translation>
    </message>
    <message>
        <source>Pick certificate…</source>
        <translation>証明書を選択…</translation>
    </message>
    <message>
        <source>Pick private key…</source>
        <translation>秘密鍵を選択…</translation>
    </message>
    <message>
        <source>Remove files</source>
        <translation>ファイルを取り除く</translation>
    </message>
    <message>
        <source>Choose files</source>
        <translation>ファイルを選択</translation>
    </message>
    <message>
        <source>Pick private key</source>
        <translation>秘密鍵を選択</translation>
    </message>
    <message>
        <source>Pick certificate</source>
        <translation>証明書を選択</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>There is no private key in the file.</source>
        <translation>ファイルに秘密鍵がありません。</translation>
    </message>
    <message>
        <source>There is no certificate in the file.</source>
        <translation>ファイルに証明書がありません。</translation>
    </message>
    <message numerus="yes">
        <source>%n file(s) left to read…</source>
        <translation>
            <numerusform>残り %n 個のファイルを読み取っています…</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n file(s) not used: %1</source>
        <translation>
            <numerusform>%n 個のファイルは使用されません: %1</numerusform>
        </translation>
    </message>
    <message>
        <source>, </source>
        <translation>, </translation>
    </message>
    <message>
        <source>Files find their devices by the MAC addresses in their names. Drop them here, or select rows to pick by hand.</source>
        <translation>ファイルは名前に含まれる MAC アドレスでデバイスに対応付けられます。ここにドロップするか、行を選択して個別に指定してください。</translation>
    </message>
</context>
<context>
    <name>CertificateCheck</name>
    <message>
        <source>No MAC address of its own</source>
        <translation>固有の MAC アドレスなし</translation>
    </message>
    <message>
        <source>File of no use</source>
        <translation>使用できないファイル</translation>
    </message>
    <message>
        <source>No certificate</source>
        <translation>証明書なし</translation>
    </message>
    <message>
        <source>No private key</source>
        <translation>秘密鍵なし</translation>
    </message>
    <message>
        <source>Encrypted key not supported</source>
        <translation>暗号化された鍵は未対応</translation>
    </message>
    <message>
        <source>Key not opened by the password</source>
        <translation>パスワードで鍵を開けません</translation>
    </message>
    <message>
        <source>Key of another certificate</source>
        <translation>別の証明書の鍵</translation>
    </message>
    <message>
        <source>Expired</source>
        <translation>期限切れ</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) would get an expired certificate.</source>
        <translation>
            <numerusform>%n 台のデバイスに期限切れの証明書が設定されます。</numerusform>
        </translation>
    </message>
    <message>
        <source>Not yet valid</source>
        <translation>有効期間前</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) would get a certificate that is not yet valid.</source>
        <translation>
            <numerusform>%n 台のデバイスに有効期間前の証明書が設定されます。</numerusform>
        </translation>
    </message>
    <message>
        <source>File with a private key</source>
        <translation>秘密鍵を含むファイル</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) would get a file that holds a private key too.</source>
        <translation>
            <numerusform>%n 台のデバイスに秘密鍵も含むファイルが送られます。</numerusform>
        </translation>
    </message>
    <message>
        <source>No key or request on the device</source>
        <translation>デバイスに鍵も要求もありません</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will fail: no private key or certificate request there to install a certificate for.</source>
        <translation>
            <numerusform>%n 台のデバイスは失敗します: 証明書をインストールする対象の秘密鍵も証明書要求もありません。</numerusform>
        </translation>
    </message>
    <message>
        <source>Expires soon</source>
        <translation>まもなく期限切れ</translation>
    </message>
</context>
<context>
    <name>CertificateFiles</name>
    <message>
        <source>The file does not exist.</source>
        <translation>ファイルが存在しません。</translation>
    </message>
    <message>
        <source>It is a folder, not a file.</source>
        <translation>ファイルではなくフォルダーです。</translation>
    </message>
    <message>
        <source>It is not a plain file.</source>
        <translation>通常のファイルではありません。</translation>
    </message>
    <message>
        <source>The file is empty.</source>
        <translation>ファイルが空です。</translation>
    </message>
    <message>
        <source>The file is larger than 1 MiB, which no certificate is.</source>
        <translation>ファイルが 1 MiB を超えています。証明書ではありません。</translation>
    </message>
    <message>
        <source>The file cannot be read: %1.</source>
        <translation>ファイルを読み取れません: %1。</translation>
    </message>
    <message>
        <source>The file cannot be read.</source>
        <translation>ファイルを読み取れません。</translation>
    </message>
</context>
<context>
    <name>CertificateListModel</name>
    <message>
        <source>HTTPS</source>
        <translation>HTTPS</translation>
    </message>
    <message>
        <source>IEEE 802.1X</source>
        <translation>IEEE 802.1X</translation>
    </message>
    <message>
        <source>State</source>
        <translation>状態</translation>
    </message>
    <message>
        <source>Expires</source>
        <translation>有効期限</translation>
    </message>
    <message>
        <source>Use</source>
        <translation>用途</translation>
    </message>
    <message>
        <source>Subject</source>
        <translation>サブジェクト</translation>
    </message>
</context>
<context>
    <name>CertificateModel</name>
    <message>
        <source>%1, %2</source>
        <translation>%1, %2</translation>
    </message>
    <message>
        <source>%1 (%2)</source>
        <translation>%1 (%2)</translation>
    </message>
    <message>
        <source>, </source>
        <translation>, </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will be left out: %1.</source>
        <translation>
            <numerusform>%n 台のデバイスを除外します: %1。</numerusform>
        </translation>
    </message>
    <message>
        <source>self-signed</source>
        <translation>自己署名</translation>
    </message>
    <message>
        <source>issued by %1</source>
        <translation>発行者 %1</translation>
    </message>
    <message>
        <source>%1, %2, valid from %3 to %4</source>
        <translation>%1、%2、有効期間 %3～%4</translation>
    </message>
    <message>
        <source>Model</source>
        <translation>モデル</translation>
    </message>
    <message>
        <source>IP</source>
        <translation>IP</translation>
    </message>
    <message>
        <source>MAC</source>
        <translation>MAC</translation>
    </message>
    <message>
        <source>Certificate</source>
        <translation>証明書</translation>
    </message>
    <message>
        <source>Private Key</source>
        <translation>秘密鍵</translation>
    </message>
    <message>
        <source>Valid until</source>
        <translation>有効期限</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>備考</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>Key matches</source>
        <translation>鍵の一致</translation>
    </message>
    <message>
        <source>Ready</source>
        <translation>使用可能</translation>
    </message>
</context>
<context>
    <name>CertificateParser</name>
    <message>
        <source>The private key in the file is damaged or of an unknown kind.</source>
        <translation>ファイルの秘密鍵が壊れているか、不明な種類です。</translation>
    </message>
    <message>
        <source>The file holds a request for a certificate, not a certificate.</source>
        <translation>ファイルの内容は証明書ではなく証明書要求です。</translation>
    </message>
    <message>
        <source>The file holds a public key only.</source>
        <translation>ファイルには公開鍵しかありません。</translation>
    </message>
    <message>
        <source>The file holds neither a certificate nor a private key.</source>
        <translation>ファイルに証明書も秘密鍵もありません。</translation>
    </message>
    <message>
        <source>A certificate in the file is damaged.</source>
        <translation>ファイルの証明書が壊れています。</translation>
    </message>
    <message>
        <source>The file is damaged or cut off.</source>
        <translation>ファイルが壊れているか、途中で切れています。</translation>
    </message>
    <message>
        <source>The file holds neither a certificate nor a private key in PEM or DER form.</source>
        <translation>ファイルに PEM または DER 形式の証明書も秘密鍵もありません。</translation>
    </message>
    <message>
        <source>The private key in the file is larger than any in use, or made to take too long to open.</source>
        <translation>ファイル内の秘密鍵は、通常使われるものより大きいか、開くのに時間がかかりすぎるように作られています。</translation>
    </message>
</context>
<context>
    <name>CertificatePaths</name>
    <message>
        <source>Certificates and keys</source>
        <translation>証明書と鍵</translation>
    </message>
    <message>
        <source>All files</source>
        <translation>すべてのファイル</translation>
    </message>
</context>
<context>
    <name>CertificateUploadDialog</name>
    <message>
        <source>Certificates in use</source>
        <translation>使用中の証明書</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>適用</translation>
    </message>
    <message>
        <source>%1 of %2 devices will be served</source>
        <translation>%2 台中 %1 台のデバイスが対象</translation>
    </message>
    <message>
        <source>The upload could not be started.</source>
        <translation>アップロードを開始できませんでした。</translation>
    </message>
</context>
<context>
    <name>CertificateValidities</name>
    <message>
        <source>Unknown</source>
        <translation>不明</translation>
    </message>
    <message>
        <source>Not yet valid</source>
        <translation>有効期間前</translation>
    </message>
    <message>
        <source>Expires soon</source>
        <translation>まもなく期限切れ</translation>
    </message>
    <message>
        <source>Expired</source>
        <translation>期限切れ</translation>
    </message>
    <message>
        <source>Valid</source>
        <translation>有効</translation>
    </message>
</context>
<context>
    <name>CertificatesDialog</name>
    <message>
        <source>Certificates in use</source>
        <translation>使用中の証明書</translation>
    </message>
    <message>
        <source>Reading the certificates…</source>
        <translation>証明書を読み取っています…</translation>
    </message>
    <message>
        <source>The certificates could not be read.</source>
        <translation>証明書を読み取れませんでした。</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>検索</translation>
    </message>
    <message>
        <source>Search device or subject</source>
        <translation>デバイスまたはサブジェクトを検索</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>閉じる</translation>
    </message>
    <message>
        <source>No device works with a certificate.</source>
        <translation>証明書を使用しているデバイスはありません。</translation>
    </message>
    <message>
        <source>No certificate matches the search.</source>
        <translation>検索に一致する証明書がありません。</translation>
    </message>
    <message>
        <source>%1 expired, %2 within %3 days</source>
        <translation>期限切れ %1、%3 日以内 %2</translation>
    </message>
    <message>
        <source>%1 of %2 certificates</source>
        <translation>%2 件中 %1 件の証明書</translation>
    </message>
</context>
<context>
    <name>ConfirmDialog</name>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Remote Connection</source>
        <translation>リモート接続</translation>
    </message>
    <message>
        <source>Are you sure you want to connect to another server? The present session ends.</source>
        <translation>別のサーバーに接続しますか? 現在のセッションは終了します。</translation>
    </message>
    <message>
        <source>Connect</source>
        <translation>接続</translation>
    </message>
    <message>
        <source>Unfinished Task</source>
        <translation>未完了のタスク</translation>
    </message>
    <message>
        <source>A task was requested and has not begun yet. It may fail when the session ends now. Are you sure you want to go on?</source>
        <translation>要求したタスクがまだ開始されていません。今セッションを終了すると失敗する場合があります。続行しますか?</translation>
    </message>
    <message>
        <source>End session</source>
        <translation>セッションを終了</translation>
    </message>
    <message>
        <source>Site Changes</source>
        <translation>サイトの変更</translation>
    </message>
    <message>
        <source>There are unsaved/unapplied changes of sites, which are lost when the session ends now. Are you sure you want to go on?</source>
        <translation>保存または適用されていないサイトの変更があり、今セッションを終了すると失われます。続行しますか?</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>設定</translation>
    </message>
    <message>
        <source>There are settings that were changed and not applied. The changes are lost when the session ends now. Are you sure you want to go on?</source>
        <translation>変更後に適用されていない設定があります。今セッションを終了すると変更は失われます。続行しますか?</translation>
    </message>
    <message>
        <source>Unsaved Changes</source>
        <translation>未保存の変更</translation>
    </message>
    <message>
        <source>There are unsaved/unapplied changes on this page, which are lost when you leave it. Do you want to stay?</source>
        <translation>このページには保存または適用されていない変更があり、ページを離れると失われます。このページに留まりますか?</translation>
    </message>
    <message>
        <source>Stay</source>
        <translation>留まる</translation>
    </message>
    <message>
        <source>Cancel Task</source>
        <translation>タスクの中止</translation>
    </message>
    <message numerus="yes">
        <source>Are you sure you want to cancel %n task(s)? Devices that are done already stay as they are.</source>
        <translation>
            <numerusform>%n 件のタスクを中止しますか? 既に完了したデバイスはそのままです。</numerusform>
        </translation>
    </message>
    <message>
        <source>Cancel task</source>
        <translation>タスクを中止</translation>
    </message>
    <message>
        <source>Remove Finished Tasks</source>
        <translation>完了したタスクの削除</translation>
    </message>
    <message numerus="yes">
        <source>Are you sure you want to remove %n finished task(s) from the list, with their results? This action cannot be undone.</source>
        <translation>
            <numerusform>%n 件の完了したタスクを結果とともに一覧から削除しますか? この操作は元に戻せません。</numerusform>
        </translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>Delete Alarms</source>
        <translation>アラームの削除</translation>
    </message>
    <message numerus="yes">
        <source>Are you sure you want to delete %n alarm(s)? This action cannot be undone.</source>
        <translation>
            <numerusform>%n 件のアラームを削除しますか? この操作は元に戻せません。</numerusform>
        </translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>Delete Device(s) from Device Overview</source>
        <translation>デバイス一覧からデバイスを削除</translation>
    </message>
    <message>
        <source>Are you sure you want to delete the selected device(s) from the system permanently? This action cannot be undone.</source>
        <translation>選択したデバイスをシステムから完全に削除しますか? この操作は元に戻せません。</translation>
    </message>
    <message>
        <source>Delete Device(s) from Site</source>
        <translation>サイトからデバイスを削除</translation>
    </message>
    <message>
        <source>Are you sure you want to delete the copy of selected device(s) from this site? This action will not affect the list of Device Overview.</source>
        <translation>選択したデバイスのコピーをこのサイトから削除しますか? デバイス一覧には影響しません。</translation>
    </message>
    <message>
        <source>Restart Device</source>
        <translation>デバイスの再起動</translation>
    </message>
    <message>
        <source>Are you sure you want to restart device? This operation may take some time.</source>
        <translation>デバイスを再起動しますか? この操作には時間がかかる場合があります。</translation>
    </message>
    <message>
        <source>Restart</source>
        <translation>再起動</translation>
    </message>
    <message>
        <source>Delete Site</source>
        <translation>サイトの削除</translation>
    </message>
    <message>
        <source>Are you sure you want to delete the site? This action will also delete the sub-site(s) and the copy of selected device(s) of each site and sub-site.</source>
        <translation>サイトを削除しますか? サブサイトと、各サイトおよびサブサイトの選択したデバイスのコピーも削除されます。</translation>
    </message>
    <message>
        <source>Norvell Service Management</source>
        <translation>Norvell サービス管理</translation>
    </message>
    <message>
        <source>Are you sure you want to disconnect from this service?</source>
        <translation>このサービスから切断しますか?</translation>
    </message>
    <message>
        <source>Disconnecting will stop the synchronization of all devices managed by this Device Manager. You will need to set up the connection again to restore synchronization.</source>
        <translation>切断すると、この Device Manager が管理するすべてのデバイスの同期が停止します。同期を再開するには、接続を再度設定する必要があります。</translation>
    </message>
    <message>
        <source>Disconnect</source>
        <translation>切断</translation>
    </message>
    <message>
        <source>Keep running</source>
        <translation>続行する</translation>
    </message>
    <message>
        <source>Discard changes</source>
        <translation>変更を破棄</translation>
    </message>
</context>
<context>
    <name>CrashDialog</name>
    <message>
        <source>Unexpected End</source>
        <translation>予期しない終了</translation>
    </message>
    <message>
        <source>The program ended unexpectedly the last time. This report was saved; it may help your support to find out why. Passwords are left out of it.</source>
        <translation>前回、プログラムが予期せず終了しました。このレポートが保存されています。サポートでの原因調査に役立つことがあります。パスワードは含まれていません。</translation>
    </message>
    <message>
        <source>Report</source>
        <translation>レポート</translation>
    </message>
    <message>
        <source>Show folder</source>
        <translation>フォルダーを表示</translation>
    </message>
    <message>
        <source>Dismiss</source>
        <translation>閉じる</translation>
    </message>
</context>
<context>
    <name>CredentialRules</name>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation>このフィールドは空にできません。</translation>
    </message>
    <message>
        <source>Only alphanumeric characters are allowed.</source>
        <translation>使用できるのは英数字のみです。</translation>
    </message>
    <message>
        <source>Only alphanumeric characters and the following special characters !%-.@^_~ are allowed.</source>
        <translation>使用できるのは英数字と次の記号のみです: !%-.@^_~</translation>
    </message>
</context>
<context>
    <name>CsvDevices</name>
    <message>
        <source>The row is not UTF-8 text.</source>
        <translation>行が UTF-8 テキストではありません。</translation>
    </message>
    <message>
        <source>A quotation mark is not closed.</source>
        <translation>引用符が閉じられていません。</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no port from 1 to 65535.</source>
        <translation>「%1」は 1～65535 のポートではありません。</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no IPv4 address.</source>
        <translation>「%1」は IPv4 アドレスではありません。</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no MAC address.</source>
        <translation>「%1」は MAC アドレスではありません。</translation>
    </message>
    <message>
        <source>The MAC address &quot;%1&quot; stands in line %2 already.</source>
        <translation>MAC アドレス「%1」は既に %2 行目にあります。</translation>
    </message>
    <message>
        <source>it is larger than %1 MiB</source>
        <translation>%1 MiB を超えています</translation>
    </message>
    <message>
        <source>it is no text file</source>
        <translation>テキストファイルではありません</translation>
    </message>
    <message>
        <source>The first line is read as the header.</source>
        <translation>1 行目はヘッダーとして読み取られます。</translation>
    </message>
    <message>
        <source>it is no file</source>
        <translation>ファイルではありません</translation>
    </message>
    <message numerus="yes">
        <source>The row has %n column(s) in place of %1.</source>
        <translation>
            <numerusform>行の列数が %1 ではなく %n です。</numerusform>
        </translation>
    </message>
    <message>
        <source>The row is longer than %1 characters.</source>
        <translation>行が %1 文字を超えています。</translation>
    </message>
    <message>
        <source>it has more than %1 rows</source>
        <translation>行数が %1 を超えています</translation>
    </message>
</context>
<context>
    <name>DBusToasts</name>
    <message>
        <source>Open</source>
        <translation>開く</translation>
    </message>
</context>
<context>
    <name>DeviceActions</name>
    <message>
        <source>%1: %2</source>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>%1 of %2 devices are authorized.</source>
        <translation>%2 台中 %1 台のデバイスが認証済みです。</translation>
    </message>
    <message>
        <source>%1 of %2 devices are authorized so far. %3.</source>
        <translation>これまでに %2 台中 %1 台のデバイスが認証済みです。%3。</translation>
    </message>
    <message>
        <source>Authorize Device</source>
        <translation>デバイスの認証</translation>
    </message>
    <message>
        <source>%1 failed: %2.</source>
        <translation>「%1」に失敗しました: %2。</translation>
    </message>
    <message numerus="yes">
        <source>The credentials are on their way to %n device(s).</source>
        <translation>
            <numerusform>%n 台のデバイスに認証情報を送信しています。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) deleted.</source>
        <translation>
            <numerusform>%n 台のデバイスを削除しました。</numerusform>
        </translation>
    </message>
    <message>
        <source>Deleting devices</source>
        <translation>デバイスの削除</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) removed from the site.</source>
        <translation>
            <numerusform>%n 台のデバイスをサイトから削除しました。</numerusform>
        </translation>
    </message>
    <message>
        <source>Removing devices from the site</source>
        <translation>サイトからのデバイスの削除</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) moved.</source>
        <translation>
            <numerusform>%n 台のデバイスを移動しました。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) added to the site.</source>
        <translation>
            <numerusform>%n 台のデバイスをサイトに追加しました。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) in the site already.</source>
        <translation>
            <numerusform>%n 台のデバイスは既にサイトにあります。</numerusform>
        </translation>
    </message>
    <message>
        <source>The devices are not managed any more.</source>
        <translation>デバイスは管理されなくなっています。</translation>
    </message>
    <message>
        <source>Putting devices into the site</source>
        <translation>サイトへのデバイスの登録</translation>
    </message>
    <message>
        <source>%1 failed: %2. Nothing was changed.</source>
        <translation>「%1」に失敗しました: %2。何も変更されていません。</translation>
    </message>
    <message>
        <source>%1 may have failed: %2. Look at the list before you try again.</source>
        <translation>「%1」に失敗した可能性があります: %2。再試行する前に一覧を確認してください。</translation>
    </message>
    <message>
        <source>Exporting...</source>
        <translation>エクスポートしています...</translation>
    </message>
    <message>
        <source>Exported successfully!</source>
        <translation>エクスポートしました!</translation>
    </message>
    <message>
        <source>The device list could not be exported: %1</source>
        <translation>デバイス一覧をエクスポートできませんでした: %1</translation>
    </message>
    <message>
        <source>The device list could not be exported.</source>
        <translation>デバイス一覧をエクスポートできませんでした。</translation>
    </message>
    <message>
        <source>%1 could not be started: %2.</source>
        <translation>「%1」を開始できませんでした: %2。</translation>
    </message>
    <message>
        <source>%1 may have begun: %2. Look at its task before you try again.</source>
        <translation>「%1」は開始された可能性があります: %2。再試行する前にタスクを確認してください。</translation>
    </message>
    <message numerus="yes">
        <source>Left out: %n device(s) that the server does not manage any more.</source>
        <translation>
            <numerusform>%n 台のデバイスを除外しました: サーバーで管理されなくなっています。</numerusform>
        </translation>
    </message>
    <message>
        <source>The server has ended the session.</source>
        <translation>サーバーがセッションを終了しました。</translation>
    </message>
</context>
<context>
    <name>DeviceFooter</name>
    <message>
        <source>Show only these</source>
        <translation>これらのみ表示</translation>
    </message>
    <message numerus="yes">
        <source>%1 of %Ln device(s) selected</source>
        <translation>
            <numerusform>%Ln 台中 %1 台のデバイスを選択</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1 of %2 shown selected, %Ln device(s) in all</source>
        <translation>
            <numerusform>表示中の %2 台中 %1 台を選択、全 %Ln 台</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 authorized</source>
        <translation>認証済み %1</translation>
    </message>
    <message>
        <source>%1 unreachable</source>
        <translation>接続不可 %1</translation>
    </message>
    <message>
        <source>%1 need attention</source>
        <translation>要確認 %1</translation>
    </message>
    <message numerus="yes">
        <source>%n s</source>
        <translation>
            <numerusform>%n 秒</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%n min</source>
        <translation>
            <numerusform>%n 分</numerusform>
        </translation>
    </message>
    <message>
        <source>Not updated for %1</source>
        <translation>%1 間更新されていません</translation>
    </message>
    <message>
        <source>Updated just now</source>
        <translation>更新したばかり</translation>
    </message>
    <message>
        <source>Updated %1 ago</source>
        <translation>%1 前に更新</translation>
    </message>
</context>
<context>
    <name>DeviceMenus</name>
    <message>
        <source>Copy cell</source>
        <translation>セルをコピー</translation>
    </message>
    <message>
        <source>Copy rows</source>
        <translation>行をコピー</translation>
    </message>
</context>
<context>
    <name>DeviceRecords</name>
    <message>
        <source>Enabled</source>
        <translation>有効</translation>
    </message>
    <message>
        <source>Disabled</source>
        <translation>無効</translation>
    </message>
    <message>
        <source>Ready</source>
        <translation>使用可能</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>エラー</translation>
    </message>
    <message>
        <source>Detached</source>
        <translation>未挿入</translation>
    </message>
    <message>
        <source>Empty</source>
        <translation>空</translation>
    </message>
    <message>
        <source>Mute</source>
        <translation>ミュート</translation>
    </message>
    <message>
        <source>Unmute</source>
        <translation>ミュート解除</translation>
    </message>
    <message>
        <source>Status</source>
        <translation>状態</translation>
    </message>
    <message>
        <source>Model</source>
        <translation>モデル</translation>
    </message>
    <message>
        <source>Host Name</source>
        <translation>ホスト名</translation>
    </message>
    <message>
        <source>IP</source>
        <translation>IP</translation>
    </message>
    <message>
        <source>MAC</source>
        <translation>MAC</translation>
    </message>
    <message>
        <source>Firmware</source>
        <translation>ファームウェア</translation>
    </message>
    <message>
        <source>HTTP Port</source>
        <translation>HTTP ポート</translation>
    </message>
    <message>
        <source>HTTPS Port</source>
        <translation>HTTPS ポート</translation>
    </message>
    <message>
        <source>HTTPS</source>
        <translation>HTTPS</translation>
    </message>
    <message>
        <source>IEEE 802.1X</source>
        <translation>IEEE 802.1X</translation>
    </message>
    <message>
        <source>SD Card Status</source>
        <translation>SD カードの状態</translation>
    </message>
    <message>
        <source>SD Card Usage(%)</source>
        <translation>SD カード使用率(%)</translation>
    </message>
    <message>
        <source>Date/Time</source>
        <translation>日時</translation>
    </message>
    <message>
        <source>Power Frequency(Hz)</source>
        <translation>電源周波数(Hz)</translation>
    </message>
    <message>
        <source>Audio</source>
        <translation>音声</translation>
    </message>
</context>
<context>
    <name>DeviceStatus</name>
    <message>
        <source>Unauthorized</source>
        <translation>未認証</translation>
    </message>
    <message>
        <source>Access Denied</source>
        <translation>アクセス拒否</translation>
    </message>
    <message>
        <source>Authorized</source>
        <translation>認証済み</translation>
    </message>
    <message>
        <source>Unreachable</source>
        <translation>接続不可</translation>
    </message>
    <message>
        <source>Maintaining...</source>
        <translation>メンテナンス中...</translation>
    </message>
    <message>
        <source>Set Password</source>
        <translation>パスワードの設定</translation>
    </message>
    <message>
        <source>Invalid Password</source>
        <translation>パスワードが無効</translation>
    </message>
    <message>
        <source>Account Blocked</source>
        <translation>アカウントロック中</translation>
    </message>
</context>
<context>
    <name>DeviceTab</name>
    <message>
        <source>Drag devices from the &quot;Device Overview&quot;</source>
        <translation>「デバイス一覧」からデバイスをドラッグしてください</translation>
    </message>
    <message>
        <source>Add Device</source>
        <translation>デバイスの追加</translation>
    </message>
    <message>
        <source>No Device</source>
        <translation>デバイスがありません</translation>
    </message>
    <message>
        <source>Clear filter</source>
        <translation>フィルターを解除</translation>
    </message>
    <message>
        <source>No device matches</source>
        <translation>一致するデバイスがありません</translation>
    </message>
    <message>
        <source>Search and status chips leave no device of this tab.</source>
        <translation>検索と状態フィルターに一致するデバイスはこのタブにありません。</translation>
    </message>
    <message>
        <source>Loading devices...</source>
        <translation>デバイスを読み込んでいます...</translation>
    </message>
    <message>
        <source>The device list could not be read</source>
        <translation>デバイス一覧を読み取れませんでした</translation>
    </message>
    <message>
        <source>It is read again as soon as the server answers.</source>
        <translation>サーバーが応答すると再度読み取ります。</translation>
    </message>
</context>
<context>
    <name>DeviceTabs</name>
    <message>
        <source>Camera</source>
        <translation>カメラ</translation>
    </message>
    <message>
        <source>NVR</source>
        <translation>NVR</translation>
    </message>
    <message>
        <source>Others</source>
        <translation>その他</translation>
    </message>
</context>
<context>
    <name>DeviceTabsCorner</name>
    <message>
        <source>Search devices</source>
        <translation>デバイスを検索</translation>
    </message>
    <message>
        <source>Model, host name, firmware or site; an IP address, network (10.4.0.0/16) or range (10.4.0.10-20); a MAC address</source>
        <translation>モデル、ホスト名、ファームウェア、サイト、IP アドレス、ネットワーク (10.4.0.0/16)、範囲 (10.4.0.10-20)、MAC アドレス</translation>
    </message>
    <message>
        <source>Remote connection</source>
        <translation>リモート接続</translation>
    </message>
    <message>
        <source>Columns</source>
        <translation>列</translation>
    </message>
</context>
<context>
    <name>DeviceWindow</name>
    <message>
        <source>The devices are not managed any more.</source>
        <translation>デバイスは管理されなくなっています。</translation>
    </message>
    <message>
        <source>The device is not managed any more.</source>
        <translation>デバイスは管理されなくなっています。</translation>
    </message>
    <message>
        <source>The device cannot be shown.</source>
        <translation>デバイスを表示できません。</translation>
    </message>
</context>
<context>
    <name>DiscoveredModel</name>
    <message>
        <source>Discovered</source>
        <translation>ネットワークで検出</translation>
    </message>
    <message>
        <source>Found by IP</source>
        <translation>IP で検出</translation>
    </message>
    <message>
        <source>From file</source>
        <translation>ファイルから</translation>
    </message>
</context>
<context>
    <name>EditServerDialog</name>
    <message>
        <source>Edit Server</source>
        <translation>サーバーの編集</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>適用</translation>
    </message>
</context>
<context>
    <name>ExportDebugInfoDialog</name>
    <message>
        <source>Export Debug Info</source>
        <translation>デバッグ情報をエクスポート</translation>
    </message>
    <message>
        <source>Folder on this computer</source>
        <translation>このコンピューターのフォルダー</translation>
    </message>
    <message>
        <source>Choose Folder</source>
        <translation>フォルダーを選択</translation>
    </message>
    <message>
        <source>The devices collect the information first. The report is saved when they are done, also if the program is started again meanwhile.</source>
        <translation>最初にデバイスが情報を収集します。完了するとレポートが保存されます。その間にプログラムを再起動しても構いません。</translation>
    </message>
    <message>
        <source>Export</source>
        <translation>エクスポート</translation>
    </message>
    <message>
        <source>The export could not be started.</source>
        <translation>エクスポートを開始できませんでした。</translation>
    </message>
</context>
<context>
    <name>FailedSubmission</name>
    <message numerus="yes">
        <source>%1 on %n device(s) did not begin. %2</source>
        <translation>
            <numerusform>%n 台のデバイスで「%1」を開始できませんでした。%2</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1 on %n device(s) may have begun. %2</source>
        <translation>
            <numerusform>%n 台のデバイスで「%1」が開始された可能性があります。%2</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 Look at the devices before you try again.</source>
        <translation>%1 再試行する前にデバイスを確認してください。</translation>
    </message>
    <message>
        <source>%1 Its task in the list tells whether it has.</source>
        <translation>%1 開始されたかどうかは一覧のタスクで確認できます。</translation>
    </message>
    <message>
        <source>%1 did not begin. %2</source>
        <translation>「%1」は開始されませんでした。%2</translation>
    </message>
    <message>
        <source>%1 may have begun. %2</source>
        <translation>「%1」が開始された可能性があります。%2</translation>
    </message>
</context>
<context>
    <name>FailedTaskBanner</name>
    <message>
        <source>Start again</source>
        <translation>もう一度開始</translation>
    </message>
    <message>
        <source>Dismiss</source>
        <translation>閉じる</translation>
    </message>
    <message>
        <source>1 of %1</source>
        <translation>1/%1</translation>
    </message>
</context>
<context>
    <name>FileCheck</name>
    <message>
        <source>There is no such file.</source>
        <translation>ファイルが存在しません。</translation>
    </message>
    <message>
        <source>This is a folder.</source>
        <translation>フォルダーです。</translation>
    </message>
    <message>
        <source>This is no plain file.</source>
        <translation>通常のファイルではありません。</translation>
    </message>
    <message>
        <source>The file is empty.</source>
        <translation>ファイルが空です。</translation>
    </message>
    <message>
        <source>The file cannot be read.</source>
        <translation>ファイルを読み取れません。</translation>
    </message>
    <message>
        <source>There is no such folder.</source>
        <translation>フォルダーが存在しません。</translation>
    </message>
    <message>
        <source>This is no folder.</source>
        <translation>フォルダーではありません。</translation>
    </message>
    <message>
        <source>Nothing can be written to this folder.</source>
        <translation>このフォルダーには書き込めません。</translation>
    </message>
    <message>
        <source>The name of the file is damaged; give it another one.</source>
        <translation>ファイル名が壊れています。別の名前を付けてください。</translation>
    </message>
    <message>
        <source>The name of the file is blank; give it another one.</source>
        <translation>ファイル名が空白です。別の名前を付けてください。</translation>
    </message>
    <message>
        <source>The file has %1; the server takes %2 at most.</source>
        <translation>ファイルは %1 です。サーバーが受け付けるのは %2 までです。</translation>
    </message>
</context>
<context>
    <name>FileField</name>
    <message>
        <source>Drop a file here or browse for it</source>
        <translation>ここにファイルをドロップするか、参照してください</translation>
    </message>
    <message>
        <source>Drop a folder here or browse for it</source>
        <translation>ここにフォルダーをドロップするか、参照してください</translation>
    </message>
    <message>
        <source>Only one file can be taken.</source>
        <translation>指定できるファイルは 1 つだけです。</translation>
    </message>
    <message>
        <source>Only one folder can be taken.</source>
        <translation>指定できるフォルダーは 1 つだけです。</translation>
    </message>
    <message>
        <source>Looking at it...</source>
        <translation>確認しています...</translation>
    </message>
    <message>
        <source>Size: %1</source>
        <translation>サイズ: %1</translation>
    </message>
    <message>
        <source>Free: %1</source>
        <translation>空き: %1</translation>
    </message>
    <message>
        <source>All Files(*)</source>
        <translation>すべてのファイル(*)</translation>
    </message>
    <message>
        <source>It could not be looked at; choose it again.</source>
        <translation>確認できませんでした。もう一度選択してください。</translation>
    </message>
</context>
<context>
    <name>FramelessDialog</name>
    <message>
        <source>Close</source>
        <translation>閉じる</translation>
    </message>
</context>
<context>
    <name>FramelessWindow</name>
    <message>
        <source>Session Timeout</source>
        <translation>セッションがタイムアウトしました</translation>
    </message>
    <message>
        <source>The user guide cannot be opened. It is installed with the program.</source>
        <translation>ユーザーガイドを開けません。ユーザーガイドはプログラムと一緒にインストールされます。</translation>
    </message>
    <message>
        <source>The key of the service on this computer is remembered from now on: %1</source>
        <translation>このコンピューターのサービスの鍵を記憶しました: %1</translation>
    </message>
    <message>
        <source>The key of the server %1 is remembered from now on: %2</source>
        <translation>サーバー %1 の鍵を記憶しました: %2</translation>
    </message>
    <message>
        <source>The new key is not trusted. Nothing is sent to the server.</source>
        <translation>新しい鍵は信頼されていません。サーバーには何も送信されません。</translation>
    </message>
    <message>
        <source>You are logged in, but what you entered could not be saved for the next login. Look at whether the disk is full.</source>
        <translation>ログインしましたが、入力内容を次回のログイン用に保存できませんでした。ディスクの空き容量を確認してください。</translation>
    </message>
</context>
<context>
    <name>InvalidDeviceDialog</name>
    <message>
        <source>Devices that could not be added</source>
        <translation>追加できなかったデバイス</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>閉じる</translation>
    </message>
    <message>
        <source>Invalid Devices</source>
        <translation>無効なデバイス</translation>
    </message>
    <message>
        <source>Device</source>
        <translation>デバイス</translation>
    </message>
    <message>
        <source>Reason</source>
        <translation>理由</translation>
    </message>
</context>
<context>
    <name>IpAssignment</name>
    <message numerus="yes">
        <source>Addresses given twice: %n device(s).</source>
        <translation>
            <numerusform>アドレスの重複: %n 台。</numerusform>
        </translation>
    </message>
    <message>
        <source>Address given twice</source>
        <translation>アドレスが重複</translation>
    </message>
    <message numerus="yes">
        <source>Addresses of other devices: %n.</source>
        <translation>
            <numerusform>他のデバイスのアドレス: %n 件。</numerusform>
        </translation>
    </message>
    <message>
        <source>Address in use</source>
        <translation>使用中のアドレス</translation>
    </message>
    <message numerus="yes">
        <source>Network, broadcast, gateway or reserved addresses: %n.</source>
        <translation>
            <numerusform>ネットワーク、ブロードキャスト、ゲートウェイ、予約済みのアドレス: %n 件。</numerusform>
        </translation>
    </message>
    <message>
        <source>No device address</source>
        <translation>デバイスに使えないアドレス</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) would not reach the gateway: it is in another subnet.</source>
        <translation>
            <numerusform>%n 台のデバイスはゲートウェイに到達できません: 別のサブネットにあります。</numerusform>
        </translation>
    </message>
    <message>
        <source>Gateway in another subnet</source>
        <translation>ゲートウェイが別のサブネット</translation>
    </message>
</context>
<context>
    <name>JobOutcome</name>
    <message>
        <source>the client is busy, try again</source>
        <translation>クライアントがビジー状態です。もう一度お試しください</translation>
    </message>
    <message>
        <source>something went wrong in the client, its log says what</source>
        <translation>クライアントで問題が発生しました。詳細はログを確認してください</translation>
    </message>
    <message>
        <source>the session has ended</source>
        <translation>セッションが終了しました</translation>
    </message>
</context>
<context>
    <name>ListActions</name>
    <message>
        <source>The task could not be cancelled: %1.</source>
        <translation>タスクを中止できませんでした: %1。</translation>
    </message>
    <message>
        <source>The tasks could not be removed: %1.</source>
        <translation>タスクを削除できませんでした: %1。</translation>
    </message>
    <message>
        <source>The alarms could not be deleted: %1.</source>
        <translation>アラームを削除できませんでした: %1。</translation>
    </message>
</context>
<context>
    <name>LocalNotices</name>
    <message>
        <source>The file %1 was damaged. What could be read of it was kept, and the damaged file is now called %2. Saved servers and settings may be missing.</source>
        <translation>ファイル %1 が破損していました。読み取れた内容は引き継がれ、破損したファイルの名前は %2 になりました。保存されたサーバーや設定が失われている可能性があります。</translation>
    </message>
    <message>
        <source>The file %1 is damaged and could not be repaired. Saved servers and settings may be missing, and changes of them are not kept.</source>
        <translation>ファイル %1 は破損しており、修復できませんでした。保存されたサーバーや設定が失われている可能性があり、変更は保存されません。</translation>
    </message>
    <message>
        <source>The file %1 cannot be read. Saved servers and settings may be missing.</source>
        <translation>ファイル %1 を読み取れません。保存されたサーバーや設定が表示されない可能性があります。</translation>
    </message>
    <message>
        <source>The file %1 cannot be written; the disk may be full. What is saved there is used, but changes are not kept.</source>
        <translation>ファイル %1 に書き込めません。ディスクの空き容量がない可能性があります。保存済みの内容は使用されますが、変更は保存されません。</translation>
    </message>
    <message>
        <source>There is no key file of your own. Passwords are ciphered with a key that every copy of this program has. The user guide says what that means, and how a key file is made.</source>
        <translation>独自のキーファイルがありません。パスワードは、このプログラムのすべてのコピーが持つキーで暗号化されます。その意味とキーファイルの作成方法はユーザーガイドに記載されています。</translation>
    </message>
</context>
<context>
    <name>LogChart</name>
    <message>
        <source>Log entries over time</source>
        <translation>ログ件数の推移</translation>
    </message>
    <message>
        <source>%1 to %2</source>
        <translation>%1～%2</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>no entries</source>
        <translation>ログなし</translation>
    </message>
</context>
<context>
    <name>LogPager</name>
    <message>
        <source>Results per page</source>
        <translation>1 ページの件数</translation>
    </message>
    <message>
        <source>First page</source>
        <translation>最初のページ</translation>
    </message>
    <message>
        <source>Previous page</source>
        <translation>前のページ</translation>
    </message>
    <message>
        <source>Next page</source>
        <translation>次のページ</translation>
    </message>
    <message>
        <source>Last page</source>
        <translation>最後のページ</translation>
    </message>
    <message>
        <source>0 of 0</source>
        <translation>0/0</translation>
    </message>
    <message>
        <source>%1 from %2</source>
        <translation>%1/%2</translation>
    </message>
</context>
<context>
    <name>LogSidebar</name>
    <message>
        <source>Time Frame</source>
        <translation>期間</translation>
    </message>
    <message>
        <source>Start Time</source>
        <translation>開始日時</translation>
    </message>
    <message>
        <source>End Time</source>
        <translation>終了日時</translation>
    </message>
    <message>
        <source>Source</source>
        <translation>ソース</translation>
    </message>
    <message>
        <source>All Sources</source>
        <translation>すべてのソース</translation>
    </message>
    <message>
        <source>Type</source>
        <translation>種類</translation>
    </message>
    <message>
        <source>All Types</source>
        <translation>すべての種類</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>検索</translation>
    </message>
    <message>
        <source>Last hour</source>
        <translation>過去 1 時間</translation>
    </message>
    <message>
        <source>Today</source>
        <translation>今日</translation>
    </message>
    <message>
        <source>7 days</source>
        <translation>7 日間</translation>
    </message>
    <message>
        <source>%1, date</source>
        <translation>%1、日付</translation>
    </message>
    <message>
        <source>%1, time of day</source>
        <translation>%1、時刻</translation>
    </message>
</context>
<context>
    <name>LogTable</name>
    <message>
        <source>Copy</source>
        <translation>コピー</translation>
    </message>
    <message>
        <source>Sort by %1</source>
        <translation>%1で並べ替え</translation>
    </message>
</context>
<context>
    <name>LogWindow</name>
    <message>
        <source>Date/Time</source>
        <translation>日時</translation>
    </message>
    <message>
        <source>Source</source>
        <translation>ソース</translation>
    </message>
    <message>
        <source>Type</source>
        <translation>種類</translation>
    </message>
    <message>
        <source>User</source>
        <translation>ユーザー</translation>
    </message>
    <message>
        <source>Description</source>
        <translation>説明</translation>
    </message>
    <message>
        <source>Device</source>
        <translation>デバイス</translation>
    </message>
    <message>
        <source>System</source>
        <translation>システム</translation>
    </message>
    <message>
        <source>Alarm</source>
        <translation>アラーム</translation>
    </message>
    <message>
        <source>Event</source>
        <translation>イベント</translation>
    </message>
    <message>
        <source>Audit</source>
        <translation>監査</translation>
    </message>
    <message>
        <source>Other</source>
        <translation>その他</translation>
    </message>
    <message>
        <source>Log</source>
        <translation>ログ</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>名前を付けて保存</translation>
    </message>
    <message>
        <source>CSV files (*.csv)</source>
        <translation>CSV ファイル (*.csv)</translation>
    </message>
    <message>
        <source>Show the whole time frame</source>
        <translation>期間全体を表示</translation>
    </message>
    <message>
        <source>Search in the result</source>
        <translation>結果内を検索</translation>
    </message>
    <message>
        <source>Export</source>
        <translation>エクスポート</translation>
    </message>
    <message>
        <source>Log entries</source>
        <translation>ログ</translation>
    </message>
    <message>
        <source>Description of the selected entry</source>
        <translation>選択したログの説明</translation>
    </message>
    <message>
        <source>Select an entry to read its whole description.</source>
        <translation>ログを選択すると説明の全文が表示されます。</translation>
    </message>
    <message>
        <source>Clear filters</source>
        <translation>フィルターを解除</translation>
    </message>
    <message>
        <source>Retry</source>
        <translation>再試行</translation>
    </message>
    <message>
        <source>Loading the log...</source>
        <translation>ログを読み込んでいます...</translation>
    </message>
    <message>
        <source>No log entry</source>
        <translation>ログがありません</translation>
    </message>
    <message>
        <source>The log has nothing of this time frame.</source>
        <translation>この期間のログはありません。</translation>
    </message>
    <message>
        <source>No log entry matches</source>
        <translation>一致するログがありません</translation>
    </message>
    <message>
        <source>The log could not be read</source>
        <translation>ログを読み取れませんでした</translation>
    </message>
    <message>
        <source>The time frame ends before it starts.</source>
        <translation>期間の終了が開始より前です。</translation>
    </message>
    <message>
        <source>Searching...</source>
        <translation>検索しています...</translation>
    </message>
    <message>
        <source>%1 Log Found</source>
        <translation>%1 件のログが見つかりました</translation>
    </message>
    <message>
        <source>%1 Logs Found</source>
        <translation>%1 件のログが見つかりました</translation>
    </message>
    <message>
        <source>Exporting...</source>
        <translation>エクスポートしています...</translation>
    </message>
    <message>
        <source>Exported successfully!</source>
        <translation>エクスポートしました!</translation>
    </message>
    <message>
        <source>Failed to export.</source>
        <translation>エクスポートに失敗しました。</translation>
    </message>
</context>
<context>
    <name>LoginDialog</name>
    <message>
        <source>This Computer</source>
        <translation>このコンピューター</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>メールアドレス</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>パスワード</translation>
    </message>
    <message>
        <source>Remote Server</source>
        <translation>リモートサーバー</translation>
    </message>
    <message>
        <source>Server</source>
        <translation>サーバー</translation>
    </message>
    <message>
        <source>Manage...</source>
        <translation>管理...</translation>
    </message>
    <message>
        <source>Remote Connection</source>
        <translation>リモート接続</translation>
    </message>
    <message>
        <source>Manage saved servers</source>
        <translation>保存済みサーバーの管理</translation>
    </message>
    <message>
        <source>Log in</source>
        <translation>ログイン</translation>
    </message>
    <message>
        <source>Login</source>
        <translation>ログイン</translation>
    </message>
    <message>
        <source>IP:Port/Domain Name</source>
        <translation>IP:ポート/ドメイン名</translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation>このフィールドは空にできません。</translation>
    </message>
    <message>
        <source>Enter the server as an address or a name, with a port from 1 to 65535 behind a colon where it is not %1.</source>
        <translation>サーバーのアドレスまたは名前を入力してください。ポートが %1 以外の場合は、コロンの後に 1～65535 のポートを付けてください。</translation>
    </message>
    <message>
        <source>The login could not be carried out. Try again.</source>
        <translation>ログインを実行できませんでした。もう一度お試しください。</translation>
    </message>
    <message>
        <source>The server did not open a session. Try again.</source>
        <translation>サーバーがセッションを開始しませんでした。もう一度お試しください。</translation>
    </message>
    <message>
        <source>Server full.</source>
        <translation>サーバーが満員です。</translation>
    </message>
    <message>
        <source>Incorrect email or password. Try again.</source>
        <translation>メールアドレスまたはパスワードが正しくありません。もう一度お試しください。</translation>
    </message>
    <message>
        <source>Logging in...</source>
        <translation>ログインしています...</translation>
    </message>
    <message>
        <source>The key file %1 cannot be used. Correct or remove it, then try again.</source>
        <translation>キーファイル %1 を使用できません。修正または削除してから、もう一度お試しください。</translation>
    </message>
    <message>
        <source>The server shows another key than before. Nothing was sent to it.</source>
        <translation>サーバーの鍵が以前と異なります。サーバーには何も送信されていません。</translation>
    </message>
</context>
<context>
    <name>MainConsoleMenu</name>
    <message>
        <source>All</source>
        <translation>すべて</translation>
    </message>
    <message>
        <source>Reset columns</source>
        <translation>列をリセット</translation>
    </message>
</context>
<context>
    <name>MainWindow</name>
    <message>
        <source>Device</source>
        <translation>デバイス</translation>
    </message>
    <message>
        <source>Logs</source>
        <translation>ログ</translation>
    </message>
    <message>
        <source>Settings</source>
        <translation>設定</translation>
    </message>
    <message>
        <source>Alarms</source>
        <translation>アラーム</translation>
    </message>
    <message>
        <source>Tasks</source>
        <translation>タスク</translation>
    </message>
    <message>
        <source>Debug information saved as “%1”.</source>
        <translation>デバッグ情報を「%1」として保存しました。</translation>
    </message>
</context>
<context>
    <name>ModelGroupModel</name>
    <message>
        <source>Model</source>
        <translation>モデル</translation>
    </message>
    <message>
        <source>Devices</source>
        <translation>デバイス</translation>
    </message>
    <message>
        <source>Present version</source>
        <translation>現在のバージョン</translation>
    </message>
    <message>
        <source>Image</source>
        <translation>イメージ</translation>
    </message>
    <message>
        <source>%1 of %2</source>
        <translation>%2 台中 %1 台</translation>
    </message>
    <message>
        <source>fits</source>
        <translation>適合</translation>
    </message>
    <message>
        <source>another model group</source>
        <translation>別のモデルグループ</translation>
    </message>
    <message>
        <source>cannot be told, the device will judge</source>
        <translation>判定できません (デバイスが判断します)</translation>
    </message>
</context>
<context>
    <name>NoticeBar</name>
    <message>
        <source>Site changes detected. Update changes to the server promptly by clicking</source>
        <translation>サイトが変更されています。早めにサーバーに反映してください。</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>適用</translation>
    </message>
</context>
<context>
    <name>NoticeCard</name>
    <message>
        <source>User Guide</source>
        <translation>ユーザーガイド</translation>
    </message>
    <message>
        <source>Dismiss</source>
        <translation>閉じる</translation>
    </message>
</context>
<context>
    <name>Notifier</name>
    <message>
        <source>Open</source>
        <translation>開く</translation>
    </message>
    <message>
        <source>Dismiss</source>
        <translation>閉じる</translation>
    </message>
</context>
<context>
    <name>Operation</name>
    <message>
        <source>Add Device</source>
        <translation>デバイスの追加</translation>
    </message>
    <message>
        <source>Authorize Device</source>
        <translation>デバイスの認証</translation>
    </message>
    <message>
        <source>Set Password</source>
        <translation>パスワードの設定</translation>
    </message>
    <message>
        <source>Assign IP Address</source>
        <translation>IPの割り当て</translation>
    </message>
    <message>
        <source>Upload</source>
        <translation>アップロード</translation>
    </message>
    <message>
        <source>Quick Setup</source>
        <translation>クイック設定</translation>
    </message>
    <message>
        <source>Set Configuration</source>
        <translation>構成の設定</translation>
    </message>
    <message>
        <source>Backup Configuration</source>
        <translation>構成のバックアップ</translation>
    </message>
    <message>
        <source>Restart Device</source>
        <translation>デバイスの再起動</translation>
    </message>
    <message>
        <source>Restore Device</source>
        <translation>デバイスの復元</translation>
    </message>
    <message>
        <source>Replace Device</source>
        <translation>デバイスの交換</translation>
    </message>
    <message>
        <source>Export</source>
        <translation>エクスポート</translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>更新</translation>
    </message>
    <message>
        <source>Delete Device</source>
        <translation>デバイスの削除</translation>
    </message>
    <message>
        <source>Export Device List</source>
        <translation>デバイス一覧をエクスポート</translation>
    </message>
    <message>
        <source>Export Debug Info</source>
        <translation>デバッグ情報をエクスポート</translation>
    </message>
    <message>
        <source>Upload Firmware</source>
        <translation>ファームウェアをアップロード</translation>
    </message>
    <message>
        <source>Upload Package</source>
        <translation>パッケージをアップロード</translation>
    </message>
    <message>
        <source>Upload Configuration File</source>
        <translation>構成ファイルをアップロード</translation>
    </message>
    <message>
        <source>Upload Certificate</source>
        <translation>証明書をアップロード</translation>
    </message>
    <message>
        <source>HTTPS</source>
        <translation>HTTPS</translation>
    </message>
    <message>
        <source>IEEE 802.1x</source>
        <translation>IEEE 802.1x</translation>
    </message>
    <message>
        <source>Create Template</source>
        <translation>テンプレートの作成</translation>
    </message>
    <message>
        <source>Import Template</source>
        <translation>テンプレートのインポート</translation>
    </message>
    <message>
        <source>Restore to Restore Point</source>
        <translation>復元ポイントに復元</translation>
    </message>
    <message>
        <source>Restore to Factory Default</source>
        <translation>工場出荷時の設定に復元</translation>
    </message>
    <message>
        <source>More</source>
        <translation>その他</translation>
    </message>
    <message>
        <source>Certificates in use</source>
        <translation>使用中の証明書</translation>
    </message>
    <message>
        <source>Not available in this version yet.</source>
        <translation>このバージョンではまだ利用できません。</translation>
    </message>
    <message>
        <source>Device List</source>
        <translation>デバイス一覧</translation>
    </message>
    <message>
        <source>Save as</source>
        <translation>名前を付けて保存</translation>
    </message>
    <message>
        <source>CSV files (*.csv)</source>
        <translation>CSV ファイル (*.csv)</translation>
    </message>
</context>
<context>
    <name>OperationDialog</name>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
</context>
<context>
    <name>OperationTargets</name>
    <message numerus="yes">
        <source>%n device(s) will fail: not reachable.</source>
        <translation>
            <numerusform>%n 台のデバイスは失敗します: 接続できません。</numerusform>
        </translation>
    </message>
    <message>
        <source>Unreachable</source>
        <translation>接続不可</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will fail: not authorized.</source>
        <translation>
            <numerusform>%n 台のデバイスは失敗します: 認証されていません。</numerusform>
        </translation>
    </message>
    <message>
        <source>Not authorized</source>
        <translation>未認証</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) at work for another task.</source>
        <translation>
            <numerusform>%n 台のデバイスは別のタスクを実行中です。</numerusform>
        </translation>
    </message>
    <message>
        <source>Busy</source>
        <translation>ビジー</translation>
    </message>
</context>
<context>
    <name>OrbTexts</name>
    <message>
        <source>Norvell Partner Desk</source>
        <translation>Norvell Partner Desk</translation>
    </message>
    <message>
        <source>Unable to connect to this service. Check connection information, then retry.</source>
        <translation>このサービスに接続できません。接続情報を確認して再試行してください。</translation>
    </message>
    <message>
        <source>Oops! An unknown error happened. Try again or contact Norvell technical support for further assistance.</source>
        <translation>不明なエラーが発生しました。もう一度お試しいただくか、Norvell テクニカルサポートにお問い合わせください。</translation>
    </message>
    <message>
        <source>Incorrect email or password. Check account information via %1.</source>
        <translation>メールアドレスまたはパスワードが正しくありません。%1 でアカウント情報を確認してください。</translation>
    </message>
    <message>
        <source>Invalid password: Password reset required or password expired. Check account information via %1.</source>
        <translation>パスワードが無効です: パスワードの再設定が必要か、有効期限が切れています。%1 でアカウント情報を確認してください。</translation>
    </message>
    <message>
        <source>User does not exist. %1 via Norvell Partner Desk.</source>
        <translation>ユーザーが存在しません。Norvell Partner Desk で%1。</translation>
    </message>
    <message>
        <source>Become a Partner</source>
        <translation>パートナーに登録してください</translation>
    </message>
</context>
<context>
    <name>PasswordChecklist</name>
    <message>
        <source>The devices have no policy of their own.</source>
        <translation>デバイスに固有のポリシーはありません。</translation>
    </message>
</context>
<context>
    <name>PasswordEdit</name>
    <message>
        <source>Hide password</source>
        <translation>パスワードを隠す</translation>
    </message>
    <message>
        <source>Show password</source>
        <translation>パスワードを表示</translation>
    </message>
</context>
<context>
    <name>PasswordPolicy</name>
    <message>
        <source>At least one alphabetic character</source>
        <translation>英字を 1 文字以上含む</translation>
    </message>
    <message>
        <source>At least one of these special characters: %1</source>
        <translation>次の記号を 1 文字以上含む: %1</translation>
    </message>
    <message>
        <source>At least one numeric character</source>
        <translation>数字を 1 文字以上含む</translation>
    </message>
    <message>
        <source>At least one lowercase character</source>
        <translation>小文字を 1 文字以上含む</translation>
    </message>
    <message>
        <source>At least one uppercase character</source>
        <translation>大文字を 1 文字以上含む</translation>
    </message>
    <message>
        <source>Not the same as the username</source>
        <translation>ユーザー名と異なる</translation>
    </message>
    <message numerus="yes">
        <source>At least %n character(s)</source>
        <translation>
            <numerusform>%n 文字以上</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>PasswordPolicyDialog</name>
    <message>
        <source>Make your password policy with the following rules:</source>
        <translation>次のルールでパスワードポリシーを設定:</translation>
    </message>
    <message>
        <source>Minimum required length:</source>
        <translation>最小文字数:</translation>
    </message>
    <message>
        <source>Minimum required length</source>
        <translation>最小文字数</translation>
    </message>
    <message>
        <source>At least one alphabetic character</source>
        <translation>英字を 1 文字以上含む</translation>
    </message>
    <message>
        <source>At least one numeric character</source>
        <translation>数字を 1 文字以上含む</translation>
    </message>
    <message>
        <source>At least one of these special characters: !%-.@^_~ </source>
        <translation>次の記号を 1 文字以上含む: !%-.@^_~ </translation>
    </message>
    <message>
        <source>At least one uppercase character</source>
        <translation>大文字を 1 文字以上含む</translation>
    </message>
    <message>
        <source>At least one lowercase character</source>
        <translation>小文字を 1 文字以上含む</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>適用</translation>
    </message>
    <message>
        <source>Password Policy</source>
        <translation>パスワードポリシー</translation>
    </message>
    <message>
        <source>Prohibition of a password that is the same as the</source>
        <translation>次と同じパスワードを禁止</translation>
    </message>
    <message>
        <source>username</source>
        <translation>ユーザー名</translation>
    </message>
</context>
<context>
    <name>PathField</name>
    <message>
        <source>Browse...</source>
        <translation>参照...</translation>
    </message>
</context>
<context>
    <name>QueueBanners</name>
    <message numerus="yes">
        <source>Left out: %n device(s) that the server does not manage any more.</source>
        <translation>
            <numerusform>%n 台のデバイスを除外しました: サーバーで管理されなくなっています。</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>QuickSetupDialog</name>
    <message>
        <source>Quick Setup</source>
        <translation>クイック設定</translation>
    </message>
    <message>
        <source>Daylight saving</source>
        <translation>サマータイム</translation>
    </message>
    <message>
        <source>On</source>
        <translation>オン</translation>
    </message>
    <message>
        <source>Off</source>
        <translation>オフ</translation>
    </message>
    <message>
        <source>Mains frequency</source>
        <translation>電源周波数</translation>
    </message>
    <message>
        <source>50 Hz</source>
        <translation>50 Hz</translation>
    </message>
    <message>
        <source>60 Hz</source>
        <translation>60 Hz</translation>
    </message>
    <message>
        <source>Audio</source>
        <translation>音声</translation>
    </message>
    <message>
        <source>Mute</source>
        <translation>ミュート</translation>
    </message>
    <message>
        <source>Unmute</source>
        <translation>ミュート解除</translation>
    </message>
    <message>
        <source>Only the settings that are ticked change.</source>
        <translation>チェックした設定のみ変更されます。</translation>
    </message>
    <message>
        <source>Time zone</source>
        <translation>タイムゾーン</translation>
    </message>
    <message>
        <source>Date and time</source>
        <translation>日付と時刻</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>適用</translation>
    </message>
    <message>
        <source>As written below</source>
        <translation>下記の指定</translation>
    </message>
    <message>
        <source>Time zone as POSIX writes it</source>
        <translation>POSIX 形式のタイムゾーン</translation>
    </message>
    <message>
        <source>This time zone has no daylight saving.</source>
        <translation>このタイムゾーンにはサマータイムがありません。</translation>
    </message>
    <message>
        <source>This is no time zone, as CET-1CEST,M3.5.0,M10.5.0/3 is one.</source>
        <translation>CET-1CEST,M3.5.0,M10.5.0/3 のようなタイムゾーンではありません。</translation>
    </message>
    <message>
        <source>The setup could not be started.</source>
        <translation>設定を開始できませんでした。</translation>
    </message>
</context>
<context>
    <name>ReconnectingDialog</name>
    <message>
        <source>Unable to establish a connection to the server. The client is currently attempting to reconnect to the server.</source>
        <translation>サーバーとの接続を確立できません。クライアントはサーバーへの再接続を試みています。</translation>
    </message>
    <message>
        <source>Trying again every few seconds...</source>
        <translation>数秒ごとに再試行しています...</translation>
    </message>
    <message>
        <source>Disconnect</source>
        <translation>切断</translation>
    </message>
    <message>
        <source>Reconnecting</source>
        <translation>再接続中</translation>
    </message>
</context>
<context>
    <name>RefreshDeviceDialog</name>
    <message>
        <source>Refreshing...</source>
        <translation>更新しています...</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Refresh</source>
        <translation>更新</translation>
    </message>
</context>
<context>
    <name>RemoteConnectionDialog</name>
    <message>
        <source>Search</source>
        <translation>検索</translation>
    </message>
    <message>
        <source>Search name or information</source>
        <translation>名前または情報を検索</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>追加</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>編集</translation>
    </message>
    <message>
        <source>Delete</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>Saved servers</source>
        <translation>保存済みサーバー</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Save</source>
        <translation>保存</translation>
    </message>
    <message>
        <source>Remote Connection</source>
        <translation>リモート接続</translation>
    </message>
    <message>
        <source>Server Name</source>
        <translation>サーバー名</translation>
    </message>
    <message>
        <source>Server Information</source>
        <translation>サーバー情報</translation>
    </message>
    <message>
        <source>The saved servers could not be read.</source>
        <translation>保存済みサーバーを読み取れませんでした。</translation>
    </message>
    <message>
        <source>The list could not be saved; the saved one is as it was.</source>
        <translation>一覧を保存できませんでした。保存済みの一覧は元のままです。</translation>
    </message>
    <message>
        <source>Key of the selected server</source>
        <translation>選択したサーバーの鍵</translation>
    </message>
    <message>
        <source>Key Fingerprint</source>
        <translation>鍵のフィンガープリント</translation>
    </message>
    <message>
        <source>First seen %1, last seen %2</source>
        <translation>初回: %1、最終: %2</translation>
    </message>
    <message>
        <source>The key of this server is remembered with the first login.</source>
        <translation>このサーバーの鍵は最初のログイン時に記憶されます。</translation>
    </message>
</context>
<context>
    <name>RestoreDeviceDialog</name>
    <message>
        <source>Network</source>
        <translation>ネットワーク</translation>
    </message>
    <message>
        <source>Daylight saving time</source>
        <translation>サマータイム</translation>
    </message>
    <message>
        <source>Custom language</source>
        <translation>カスタム言語</translation>
    </message>
    <message>
        <source>NADP</source>
        <translation>NADP</translation>
    </message>
    <message>
        <source>Focus position</source>
        <translation>フォーカス位置</translation>
    </message>
    <message>
        <source>Lens configuration</source>
        <translation>レンズ設定</translation>
    </message>
    <message>
        <source>Restore to Factory Default</source>
        <translation>工場出荷時の設定に復元</translation>
    </message>
    <message>
        <source>Restore all settings to factory default, including:</source>
        <translation>次の項目を含むすべての設定を工場出荷時に戻す:</translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>復元</translation>
    </message>
    <message>
        <source>Devices whose network settings are restored may get another address and be cut off from the server.</source>
        <translation>ネットワーク設定を復元したデバイスは、アドレスが変わりサーバーから切断される場合があります。</translation>
    </message>
    <message numerus="yes">
        <source>The settings of %n device(s) will be lost. Type %n to go on.</source>
        <translation>
            <numerusform>%n 台のデバイスの設定が失われます。続行するには %n と入力してください。</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>Rollout</name>
    <message>
        <source>The session ended before it began.</source>
        <translation>開始前にセッションが終了しました。</translation>
    </message>
</context>
<context>
    <name>RolloutBannerRow</name>
    <message>
        <source>Continue</source>
        <translation>続行</translation>
    </message>
    <message>
        <source>Stop</source>
        <translation>停止</translation>
    </message>
    <message>
        <source>Dismiss</source>
        <translation>閉じる</translation>
    </message>
    <message>
        <source>Begin with the other devices now</source>
        <translation>残りのデバイスを今すぐ開始</translation>
    </message>
    <message>
        <source>Do not begin with the other devices; those at work go on</source>
        <translation>残りのデバイスを開始しない (実行中のデバイスは継続)</translation>
    </message>
</context>
<context>
    <name>RolloutFields</name>
    <message>
        <source>In waves:</source>
        <translation>段階的に:</translation>
    </message>
    <message>
        <source>Size of the first wave</source>
        <translation>第 1 段階の規模</translation>
    </message>
    <message>
        <source>What the first wave is counted in</source>
        <translation>第 1 段階の単位</translation>
    </message>
    <message>
        <source>devices</source>
        <translation>台</translation>
    </message>
    <message>
        <source>%</source>
        <translation>%</translation>
    </message>
    <message>
        <source>Minutes between the waves</source>
        <translation>段階間の待ち時間 (分)</translation>
    </message>
    <message>
        <source>Most failed devices in percent</source>
        <translation>失敗デバイスの上限 (パーセント)</translation>
    </message>
    <message>
        <source> min</source>
        <translation> 分</translation>
    </message>
    <message>
        <source> %</source>
        <translation> %</translation>
    </message>
    <message>
        <source>first</source>
        <translation>最初</translation>
    </message>
    <message>
        <source>wait</source>
        <translation>待機</translation>
    </message>
    <message>
        <source>go on if at most</source>
        <translation>続行条件 最大</translation>
    </message>
    <message>
        <source>failed</source>
        <translation>失敗</translation>
    </message>
</context>
<context>
    <name>RolloutMgr</name>
    <message>
        <source>The image has changed since the rollout began.</source>
        <translation>展開の開始後にイメージが変更されています。</translation>
    </message>
    <message>
        <source>The image could not be checked.</source>
        <translation>イメージを確認できませんでした。</translation>
    </message>
    <message>
        <source>The upload could not be started.</source>
        <translation>アップロードを開始できませんでした。</translation>
    </message>
    <message numerus="yes">
        <source>The session has ended, and with it the rollout(s) of %1. Waves that were sent go on.</source>
        <translation>
            <numerusform>セッションが終了し、%1 の展開も終了しました。送信済みの段階は継続します。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>The server has ended the session. The rollout(s) of %1 go on after the next log-in.</source>
        <translation>
            <numerusform>サーバーがセッションを終了しました。%1 の展開は次回のログイン後に再開します。</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>RolloutTexts</name>
    <message>
        <source>%1 of %2 done</source>
        <translation>%2 台中 %1 台完了</translation>
    </message>
    <message>
        <source>%1, %2 failed</source>
        <translation>%1、%2 台失敗</translation>
    </message>
    <message>
        <source>Second wave</source>
        <translation>第 2 段階</translation>
    </message>
    <message>
        <source>First wave</source>
        <translation>第 1 段階</translation>
    </message>
    <message numerus="yes">
        <source>%1: %n device(s), waiting to be sent.</source>
        <translation>
            <numerusform>%1: %n 台、送信待ち。</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>%1: %n device(s), scheduled for %2.</source>
        <translation>
            <numerusform>%1: %n 台、%2 に予定。</numerusform>
        </translation>
    </message>
    <message>
        <source>%1: %2.</source>
        <translation>%1: %2。</translation>
    </message>
    <message>
        <source>Waiting %1 min.</source>
        <translation>待機中 (残り %1 分)。</translation>
    </message>
    <message>
        <source>Stopped: more than %1 % of the first wave failed.</source>
        <translation>停止: 第 1 段階の失敗が %1 % を超えました。</translation>
    </message>
    <message>
        <source>Stopped: the task of this wave was cancelled.</source>
        <translation>停止: この段階のタスクがキャンセルされました。</translation>
    </message>
    <message>
        <source>Stopped: this wave did not begin. %1</source>
        <translation>停止: この段階は開始されませんでした。%1</translation>
    </message>
    <message>
        <source>Stopped.</source>
        <translation>停止しました。</translation>
    </message>
    <message>
        <source>Finished: %1.</source>
        <translation>完了: %1。</translation>
    </message>
    <message numerus="yes">
        <source>Waiting for the second wave: %n device(s).</source>
        <translation>
            <numerusform>%n 台のデバイスが第 2 段階を待っています。</numerusform>
        </translation>
    </message>
    <message>
        <source>Stopped: the task of this wave is no longer in the list. The wave is not sent again.</source>
        <translation>停止: この段階のタスクは一覧にありません。この段階は再送信されません。</translation>
    </message>
</context>
<context>
    <name>ScheduleField</name>
    <message>
        <source>Now</source>
        <translation>今すぐ</translation>
    </message>
    <message>
        <source>At</source>
        <translation>日時指定</translation>
    </message>
    <message>
        <source>Time of the upload</source>
        <translation>アップロードの日時</translation>
    </message>
    <message>
        <source>There is no such time on that day: the clocks are put forward.</source>
        <translation>夏時間への切り替えのため、その日にこの時刻は存在しません。</translation>
    </message>
    <message>
        <source>This time has passed; choose a later one.</source>
        <translation>この日時は過ぎています。後の日時を選択してください。</translation>
    </message>
</context>
<context>
    <name>SelfSignedFields</name>
    <message>
        <source>Two letters, as in US</source>
        <translation>US のような 2 文字</translation>
    </message>
    <message>
        <source>Optional</source>
        <translation>省略可</translation>
    </message>
    <message>
        <source>Country</source>
        <translation>国</translation>
    </message>
    <message>
        <source>State/Province</source>
        <translation>都道府県</translation>
    </message>
    <message>
        <source>Locality</source>
        <translation>市区町村</translation>
    </message>
    <message>
        <source>Organization</source>
        <translation>組織</translation>
    </message>
    <message>
        <source>Organizational Unit</source>
        <translation>部署</translation>
    </message>
    <message>
        <source>Validity (days)</source>
        <translation>有効期間 (日)</translation>
    </message>
    <message>
        <source>The country is named by its two letters, as in US.</source>
        <translation>国は US のような 2 文字で指定してください。</translation>
    </message>
</context>
<context>
    <name>ServerDialog</name>
    <message>
        <source>Server Name</source>
        <translation>サーバー名</translation>
    </message>
    <message>
        <source>Server Information</source>
        <translation>サーバー情報</translation>
    </message>
    <message>
        <source>IP:Port/Domain Name</source>
        <translation>IP:ポート/ドメイン名</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>メールアドレス</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>パスワード</translation>
    </message>
    <message>
        <source>Remember Me</source>
        <translation>ログイン情報を保存</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Add</source>
        <translation>追加</translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation>このフィールドは空にできません。</translation>
    </message>
    <message>
        <source>Enter an address or a name, with a port from 1 to 65535 behind a colon if need be.</source>
        <translation>アドレスまたは名前を入力してください。必要に応じてコロンの後に 1～65535 のポートを付けてください。</translation>
    </message>
    <message>
        <source>The password is kept only with “Remember Me”.</source>
        <translation>パスワードは「ログイン情報を保存」を選択した場合のみ保存されます。</translation>
    </message>
</context>
<context>
    <name>ServerKeyDialog</name>
    <message>
        <source>Remembered key (SHA-256)</source>
        <translation>記憶している鍵 (SHA-256)</translation>
    </message>
    <message>
        <source>Remembered key</source>
        <translation>記憶している鍵</translation>
    </message>
    <message>
        <source>New key (SHA-256)</source>
        <translation>新しい鍵 (SHA-256)</translation>
    </message>
    <message>
        <source>New key</source>
        <translation>新しい鍵</translation>
    </message>
    <message>
        <source>This is normal after the service was installed anew; otherwise somebody may be listening in between. Ask whoever looks after the server for its key, and trust the new one only if it matches.</source>
        <translation>サービスを新しくインストールした後であれば正常ですが、そうでない場合は通信が傍受されている可能性があります。サーバーの管理者に鍵を確認し、一致する場合にのみ新しい鍵を信頼してください。</translation>
    </message>
    <message>
        <source>Trust the new key</source>
        <translation>新しい鍵を信頼する</translation>
    </message>
    <message>
        <source>Do not trust</source>
        <translation>信頼しない</translation>
    </message>
    <message>
        <source>The service on this computer shows another key than before, so nothing was sent to it.</source>
        <translation>このコンピューターのサービスの鍵が以前と異なるため、何も送信されていません。</translation>
    </message>
    <message>
        <source>Server Key Changed</source>
        <translation>サーバーの鍵の変更</translation>
    </message>
    <message>
        <source>The service on this computer shows another key than before. Nothing is sent to it.</source>
        <translation>このコンピューターのサービスの鍵が以前と異なります。何も送信されません。</translation>
    </message>
    <message>
        <source>The server %1 shows another key than before. Nothing is sent to it.</source>
        <translation>サーバー %1 の鍵が以前と異なります。何も送信されません。</translation>
    </message>
    <message>
        <source>First seen %1, last seen %2</source>
        <translation>初回: %1、最終: %2</translation>
    </message>
    <message>
        <source>First seen %1</source>
        <translation>初回: %1</translation>
    </message>
</context>
<context>
    <name>ServerSettings</name>
    <message>
        <source>%1: the server&apos;s value %2 cannot be shown.</source>
        <translation>%1: サーバーの値 %2 を表示できません。</translation>
    </message>
    <message>
        <source>%1: the server has %2, shown is %3.</source>
        <translation>%1: サーバーの値は %2、表示は %3 です。</translation>
    </message>
    <message>
        <source>Notification banners for alarms</source>
        <translation>アラームの通知バナー</translation>
    </message>
    <message>
        <source>Notification banners for tasks</source>
        <translation>タスクの通知バナー</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>言語</translation>
    </message>
    <message>
        <source>Number of days to keep logs</source>
        <translation>ログの保存日数</translation>
    </message>
    <message>
        <source>Default File Location</source>
        <translation>既定のファイルの場所</translation>
    </message>
    <message>
        <source>Automatic restore points</source>
        <translation>自動復元ポイント</translation>
    </message>
    <message>
        <source>Number of automatic restore points to keep</source>
        <translation>保持する自動復元ポイントの数</translation>
    </message>
    <message>
        <source>Limit of firmware uploads</source>
        <translation>ファームウェアアップロードの制限</translation>
    </message>
    <message>
        <source>Number of simultaneous firmware uploads</source>
        <translation>ファームウェアの同時アップロード数</translation>
    </message>
    <message>
        <source>on</source>
        <translation>オン</translation>
    </message>
    <message>
        <source>off</source>
        <translation>オフ</translation>
    </message>
    <message>
        <source>(empty)</source>
        <translation>(空)</translation>
    </message>
</context>
<context>
    <name>ServiceManagement</name>
    <message>
        <source>connecting to ORB...</source>
        <translation>ORB に接続しています...</translation>
    </message>
    <message>
        <source>Only an administrator can connect the service.</source>
        <translation>サービスに接続できるのは管理者のみです。</translation>
    </message>
</context>
<context>
    <name>ServiceManagementAddServiceDialog</name>
    <message>
        <source>1</source>
        <translation>1</translation>
    </message>
    <message>
        <source>2</source>
        <translation>2</translation>
    </message>
    <message>
        <source>Choose a Norvell service to connect</source>
        <translation>接続する Norvell サービスを選択</translation>
    </message>
    <message>
        <source>Service</source>
        <translation>サービス</translation>
    </message>
    <message>
        <source>Select a Norvell Service</source>
        <translation>Norvell サービスを選択</translation>
    </message>
    <message>
        <source>Email</source>
        <translation>メールアドレス</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>パスワード</translation>
    </message>
    <message>
        <source>Choose a location to synchronize devices</source>
        <translation>デバイスを同期する場所を選択</translation>
    </message>
    <message>
        <source>Organization</source>
        <translation>組織</translation>
    </message>
    <message>
        <source>Select an Organization</source>
        <translation>組織を選択</translation>
    </message>
    <message>
        <source>Site</source>
        <translation>サイト</translation>
    </message>
    <message>
        <source>Select a Site</source>
        <translation>サイトを選択</translation>
    </message>
    <message>
        <source>Back</source>
        <translation>戻る</translation>
    </message>
    <message>
        <source>Next</source>
        <translation>次へ</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>適用</translation>
    </message>
    <message>
        <source>Norvell Service Management</source>
        <translation>Norvell サービス管理</translation>
    </message>
    <message>
        <source>Orb</source>
        <translation>Orb</translation>
    </message>
    <message>
        <source>Accounts, organizations and sites are managed in the %1.</source>
        <translation>アカウント、組織、サイトは %1 で管理します。</translation>
    </message>
    <message>
        <source>Norvell Partner Desk</source>
        <translation>Norvell Partner Desk</translation>
    </message>
    <message>
        <source>The field can&apos;t be empty.</source>
        <translation>このフィールドは空にできません。</translation>
    </message>
    <message>
        <source>Session expired. Click &apos;Back&apos; to go to the previous step and try again.</source>
        <translation>セッションの有効期限が切れました。「戻る」をクリックして前の手順からやり直してください。</translation>
    </message>
    <message>
        <source>No organization or site exist. Create an organization first or site.</source>
        <translation>組織またはサイトがありません。先に組織またはサイトを作成してください。</translation>
    </message>
    <message>
        <source>One or more customers do not have remote access permission.</source>
        <translation>リモートアクセスの権限がない顧客がいます。</translation>
    </message>
    <message>
        <source>Applying...</source>
        <translation>適用しています...</translation>
    </message>
    <message>
        <source>Applied successfully</source>
        <translation>適用しました</translation>
    </message>
    <message>
        <source>Signing in...</source>
        <translation>サインインしています...</translation>
    </message>
</context>
<context>
    <name>ServiceManagementStatusDialog</name>
    <message>
        <source>Service Connected</source>
        <translation>サービスに接続済み</translation>
    </message>
    <message>
        <source>The devices managed by this Device Manager are synced with the Norvell service. Disconnecting will stop synchronization, requiring re-setup to restore it.</source>
        <translation>この Device Manager が管理するデバイスは Norvell サービスと同期されています。切断すると同期が停止し、再開するには再設定が必要です。</translation>
    </message>
    <message>
        <source>Disconnect</source>
        <translation>切断</translation>
    </message>
    <message>
        <source>Remote Access</source>
        <translation>リモートアクセス</translation>
    </message>
    <message>
        <source>Granting technical support personnel remote access to the devices for viewing device status, performing maintenance, and troubleshooting.</source>
        <translation>デバイスの状態確認、メンテナンス、トラブルシューティングのために、テクニカルサポート担当者にデバイスへのリモートアクセスを許可します。</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>閉じる</translation>
    </message>
    <message>
        <source>Norvell Service Management</source>
        <translation>Norvell サービス管理</translation>
    </message>
    <message>
        <source>Reading the status...</source>
        <translation>状態を読み取っています...</translation>
    </message>
    <message>
        <source>The status is not known.</source>
        <translation>状態が不明です。</translation>
    </message>
    <message>
        <source>Connected</source>
        <translation>接続済み</translation>
    </message>
    <message>
        <source>Not connected at the moment</source>
        <translation>現在接続されていません</translation>
    </message>
    <message>
        <source>Only an administrator can change this.</source>
        <translation>変更できるのは管理者のみです。</translation>
    </message>
    <message>
        <source>Set Remote Access...</source>
        <translation>リモートアクセスを設定しています...</translation>
    </message>
    <message>
        <source>Set remote access successfully!</source>
        <translation>リモートアクセスを設定しました!</translation>
    </message>
    <message>
        <source>Failed to set remote access.</source>
        <translation>リモートアクセスを設定できませんでした。</translation>
    </message>
    <message>
        <source>Disconnecting...</source>
        <translation>切断しています...</translation>
    </message>
    <message>
        <source>Disconnected successfully!</source>
        <translation>切断しました!</translation>
    </message>
</context>
<context>
    <name>SetPasswordDialog</name>
    <message>
        <source>Strength: weak</source>
        <translation>強度: 弱</translation>
    </message>
    <message>
        <source>Strength: fair</source>
        <translation>強度: 中</translation>
    </message>
    <message>
        <source>Strength: strong</source>
        <translation>強度: 強</translation>
    </message>
    <message>
        <source>Strength: --</source>
        <translation>強度: --</translation>
    </message>
    <message>
        <source>Set Password</source>
        <translation>パスワードの設定</translation>
    </message>
    <message>
        <source>Username</source>
        <translation>ユーザー名</translation>
    </message>
    <message>
        <source>New Password</source>
        <translation>新しいパスワード</translation>
    </message>
    <message>
        <source>Confirm Password</source>
        <translation>パスワードの確認</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>適用</translation>
    </message>
    <message>
        <source>Generate a password</source>
        <translation>パスワードを生成</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>編集</translation>
    </message>
    <message>
        <source>Password Policy</source>
        <translation>パスワードポリシー</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will refuse this password by their policy.</source>
        <translation>
            <numerusform>%n 台のデバイスはポリシーによりこのパスワードを拒否します。</numerusform>
        </translation>
    </message>
    <message>
        <source>Against its policy</source>
        <translation>ポリシー違反</translation>
    </message>
    <message>
        <source>New Password and Confirm Password don&apos;t match.</source>
        <translation>新しいパスワードと確認用パスワードが一致しません。</translation>
    </message>
    <message>
        <source>Username and password are too long: together they may have %1 characters.</source>
        <translation>ユーザー名とパスワードが長すぎます: 合わせて %1 文字までです。</translation>
    </message>
</context>
<context>
    <name>SettingWindow</name>
    <message>
        <source>Retry</source>
        <translation>再試行</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Apply</source>
        <translation>適用</translation>
    </message>
    <message>
        <source>Changes were taken back.</source>
        <translation>変更を元に戻しました。</translation>
    </message>
    <message>
        <source>Loading settings...</source>
        <translation>設定を読み込んでいます...</translation>
    </message>
    <message>
        <source>The settings could not be read: %1.</source>
        <translation>設定を読み取れませんでした: %1。</translation>
    </message>
    <message>
        <source>The server offers no settings.</source>
        <translation>サーバーに設定項目がありません。</translation>
    </message>
    <message>
        <source>Saving settings...</source>
        <translation>設定を保存しています...</translation>
    </message>
    <message>
        <source>The settings could not be saved: %1.</source>
        <translation>設定を保存できませんでした: %1。</translation>
    </message>
    <message>
        <source>Settings saved.</source>
        <translation>設定を保存しました。</translation>
    </message>
    <message>
        <source>The server&apos;s settings were kept.</source>
        <translation>サーバーの設定を維持しました。</translation>
    </message>
</context>
<context>
    <name>SettingsChangedDialog</name>
    <message>
        <source>Settings Changed Meanwhile</source>
        <translation>設定が変更されています</translation>
    </message>
    <message>
        <source>Somebody else has changed these settings since you opened the page. Nothing is saved yet.</source>
        <translation>このページを開いた後に、他のユーザーがこれらの設定を変更しました。まだ何も保存されていません。</translation>
    </message>
    <message>
        <source>Setting</source>
        <translation>設定</translation>
    </message>
    <message>
        <source>This page</source>
        <translation>このページ</translation>
    </message>
    <message>
        <source>Server now</source>
        <translation>現在のサーバー</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>Save this page&apos;s values</source>
        <translation>このページの値を保存</translation>
    </message>
    <message>
        <source>Keep the server&apos;s values</source>
        <translation>サーバーの値を維持</translation>
    </message>
</context>
<context>
    <name>SettingsForm</name>
    <message>
        <source>Client</source>
        <translation>クライアント</translation>
    </message>
    <message>
        <source>Notification</source>
        <translation>通知</translation>
    </message>
    <message>
        <source>Pop up  notification banners for all the alarms</source>
        <translation>すべてのアラームの通知バナーを表示</translation>
    </message>
    <message>
        <source>Pop up  notification banners for all the tasks</source>
        <translation>すべてのタスクの通知バナーを表示</translation>
    </message>
    <message>
        <source>Language</source>
        <translation>言語</translation>
    </message>
    <message>
        <source>Server</source>
        <translation>サーバー</translation>
    </message>
    <message>
        <source>Log</source>
        <translation>ログ</translation>
    </message>
    <message>
        <source>Number of days to keep logs</source>
        <translation>ログの保存日数</translation>
    </message>
    <message>
        <source>Device Management</source>
        <translation>デバイス管理</translation>
    </message>
    <message>
        <source>Default File Location</source>
        <translation>既定のファイルの場所</translation>
    </message>
    <message>
        <source>Configuration Restore Point</source>
        <translation>構成の復元ポイント</translation>
    </message>
    <message>
        <source>Create configuration restore points automatically every night if configuration changes are detected.</source>
        <translation>構成の変更が検出された場合、毎晩自動的に構成の復元ポイントを作成する。</translation>
    </message>
    <message>
        <source>Number of automatic restore points to keep</source>
        <translation>保持する自動復元ポイントの数</translation>
    </message>
    <message>
        <source>for each camera</source>
        <translation>(カメラごと)</translation>
    </message>
    <message>
        <source>Firmware Upload Limit</source>
        <translation>ファームウェアアップロードの制限</translation>
    </message>
    <message>
        <source>Upload firmware to up to</source>
        <translation>ファームウェアを同時にアップロードする最大数</translation>
    </message>
    <message>
        <source>Upload firmware to up to so many devices simultaneously.</source>
        <translation>ファームウェアを同時にアップロードするデバイスの最大数。</translation>
    </message>
    <message>
        <source>devices simultaneously.</source>
        <translation>台</translation>
    </message>
    <message>
        <source>Browse</source>
        <translation>参照</translation>
    </message>
    <message>
        <source>Select Directory</source>
        <translation>フォルダーの選択</translation>
    </message>
    <message>
        <source>Language of the user interface</source>
        <translation>ユーザーインターフェースの言語</translation>
    </message>
    <message>
        <source>As the system</source>
        <translation>システムと同じ</translation>
    </message>
    <message>
        <source>Another language is used from the next start of the program on.</source>
        <translation>言語の変更は、次回プログラムを起動したときから有効になります。</translation>
    </message>
</context>
<context>
    <name>SidePanel</name>
    <message>
        <source>Alarms</source>
        <translation>アラーム</translation>
    </message>
    <message>
        <source>Tasks</source>
        <translation>タスク</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>閉じる</translation>
    </message>
</context>
<context>
    <name>SiteCommit</name>
    <message>
        <source>The site changes could not be sent. Press Apply to try again.</source>
        <translation>サイトの変更を送信できませんでした。「適用」を押して再試行してください。</translation>
    </message>
    <message>
        <source>The site changes could not be sent: %1. Press Apply to try again.</source>
        <translation>サイトの変更を送信できませんでした: %1。「適用」を押して再試行してください。</translation>
    </message>
</context>
<context>
    <name>SiteEdits</name>
    <message>
        <source>Site</source>
        <translation>サイト</translation>
    </message>
    <message>
        <source>The site does not exist any more.</source>
        <translation>サイトは存在しなくなっています。</translation>
    </message>
    <message>
        <source>A site needs a name.</source>
        <translation>サイトには名前が必要です。</translation>
    </message>
    <message>
        <source>The name of a site has at most %1 characters.</source>
        <translation>サイト名は %1 文字までです。</translation>
    </message>
    <message>
        <source>A site cannot be moved into itself.</source>
        <translation>サイトを自分自身の中に移動することはできません。</translation>
    </message>
    <message>
        <source>The site is there already.</source>
        <translation>サイトは既にそこにあります。</translation>
    </message>
    <message>
        <source>The target does not exist any more.</source>
        <translation>移動先は存在しなくなっています。</translation>
    </message>
    <message>
        <source>A site cannot be moved into one of its sub-sites.</source>
        <translation>サイトを自分のサブサイトの中に移動することはできません。</translation>
    </message>
    <message>
        <source>Sites nest at most %1 levels deep.</source>
        <translation>サイトの階層は %1 までです。</translation>
    </message>
    <message>
        <source>The site &quot;%1&quot; was deleted by somebody else, and your changes to it with it.</source>
        <translation>サイト「%1」は他のユーザーによって削除され、変更も失われました。</translation>
    </message>
    <message>
        <source>The site &quot;%1&quot; stays where it was, since somebody else has changed the sites there.</source>
        <translation>他のユーザーがその場所のサイトを変更したため、サイト「%1」は元の場所のままです。</translation>
    </message>
    <message>
        <source>The new site &quot;%1&quot; is gone, since somebody else has changed the sites above it.</source>
        <translation>他のユーザーが上位のサイトを変更したため、新しいサイト「%1」は失われました。</translation>
    </message>
</context>
<context>
    <name>SiteTree</name>
    <message>
        <source>Site name</source>
        <translation>サイト名</translation>
    </message>
    <message>
        <source>(no name)</source>
        <translation>(名前なし)</translation>
    </message>
    <message>
        <source>Copy %1 device</source>
        <translation>%1 台のデバイスをコピー</translation>
    </message>
    <message>
        <source>Copy %1 devices</source>
        <translation>%1 台のデバイスをコピー</translation>
    </message>
    <message>
        <source>Move %1 device</source>
        <translation>%1 台のデバイスを移動</translation>
    </message>
    <message>
        <source>Move %1 devices</source>
        <translation>%1 台のデバイスを移動</translation>
    </message>
    <message>
        <source>Sites</source>
        <translation>サイト</translation>
    </message>
    <message>
        <source>Add a site</source>
        <translation>サイトを追加</translation>
    </message>
    <message>
        <source>DEVICE</source>
        <translation>デバイス</translation>
    </message>
    <message>
        <source>SITE MANAGEMENT</source>
        <translation>サイト管理</translation>
    </message>
    <message>
        <source>Device Overview</source>
        <translation>デバイス一覧</translation>
    </message>
    <message>
        <source>Add Site</source>
        <translation>サイトの追加</translation>
    </message>
    <message>
        <source>Edit Site</source>
        <translation>サイトの編集</translation>
    </message>
    <message>
        <source>Delete Site</source>
        <translation>サイトの削除</translation>
    </message>
    <message>
        <source>A site can only be dropped on a site or between sites.</source>
        <translation>サイトはサイトの上またはサイトの間にのみドロップできます。</translation>
    </message>
    <message>
        <source>Devices can only be dropped on a site.</source>
        <translation>デバイスはサイトの上にのみドロップできます。</translation>
    </message>
    <message>
        <source>Apply the site changes first.</source>
        <translation>先にサイトの変更を適用してください。</translation>
    </message>
</context>
<context>
    <name>StartCheck</name>
    <message>
        <source>Norvell Device Manager Service Control is not installed on this computer. Please connect to a remote server.</source>
        <translation>このコンピューターには Norvell Device Manager Service Control がインストールされていません。リモートサーバーに接続してください。</translation>
    </message>
    <message>
        <source>Norvell Device Manager Service Control is not running on this computer. Please check the status of local server or connect to a remote server.</source>
        <translation>このコンピューターで Norvell Device Manager Service Control が実行されていません。ローカルサーバーの状態を確認するか、リモートサーバーに接続してください。</translation>
    </message>
</context>
<context>
    <name>StateRefresh</name>
    <message>
        <source>The device states could not be read. Try again.</source>
        <translation>デバイスの状態を読み取れませんでした。もう一度お試しください。</translation>
    </message>
    <message>
        <source>The device states could not be read: the client is busy, try again.</source>
        <translation>デバイスの状態を読み取れませんでした。クライアントがビジー状態です。もう一度お試しください。</translation>
    </message>
</context>
<context>
    <name>TargetListDialog</name>
    <message>
        <source>Devices</source>
        <translation>デバイス</translation>
    </message>
    <message>
        <source>Search model, IP or MAC</source>
        <translation>モデル、IP、MAC を検索</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>検索</translation>
    </message>
    <message>
        <source>Select all/Deselect all</source>
        <translation>すべて選択/選択解除</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>閉じる</translation>
    </message>
</context>
<context>
    <name>TargetModel</name>
    <message>
        <source>%1, %2</source>
        <translation>%1, %2</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>備考</translation>
    </message>
</context>
<context>
    <name>TargetSummary</name>
    <message>
        <source>Show</source>
        <translation>表示</translation>
    </message>
    <message>
        <source>%1 of %2 devices selected</source>
        <translation>%2 台中 %1 台のデバイスを選択</translation>
    </message>
    <message numerus="yes">
        <source>%Ln device(s) selected</source>
        <translation>
            <numerusform>%Ln 台のデバイスを選択</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>TargetWarningLines</name>
    <message>
        <source>Leave them out</source>
        <translation>除外する</translation>
    </message>
</context>
<context>
    <name>TaskAnnouncer</name>
    <message>
        <source>Task - Upload Firmware created</source>
        <translation>タスク - ファームウェアのアップロードを作成しました</translation>
    </message>
    <message>
        <source>Task - Upload Firmware processing</source>
        <translation>タスク - ファームウェアのアップロードを処理しています</translation>
    </message>
    <message>
        <source>Task - Upload Firmware finished</source>
        <translation>タスク - ファームウェアのアップロードが終了しました</translation>
    </message>
    <message>
        <source>Task - Upload Configuration File processing</source>
        <translation>タスク - 構成ファイルのアップロードを処理しています</translation>
    </message>
    <message>
        <source>Task - Upload Configuration File finished</source>
        <translation>タスク - 構成ファイルのアップロードが終了しました</translation>
    </message>
    <message>
        <source>Task - Upload Package File processing</source>
        <translation>タスク - パッケージファイルのアップロードを処理しています</translation>
    </message>
    <message>
        <source>Task - Upload Package File finished</source>
        <translation>タスク - パッケージファイルのアップロードが終了しました</translation>
    </message>
</context>
<context>
    <name>TaskPanel</name>
    <message>
        <source>Copy</source>
        <translation>コピー</translation>
    </message>
    <message>
        <source>Retry failed</source>
        <translation>失敗分を再試行</translation>
    </message>
    <message>
        <source>Cancel task</source>
        <translation>タスクを中止</translation>
    </message>
    <message>
        <source>Remove</source>
        <translation>削除</translation>
    </message>
    <message>
        <source>All</source>
        <translation>すべて</translation>
    </message>
    <message>
        <source>Active</source>
        <translation>実行中</translation>
    </message>
    <message>
        <source>Failed</source>
        <translation>失敗</translation>
    </message>
    <message>
        <source>Remove finished</source>
        <translation>完了分を削除</translation>
    </message>
    <message>
        <source>Remove all finished tasks from the list</source>
        <translation>完了したタスクをすべて一覧から削除</translation>
    </message>
    <message>
        <source>Search task, user, model, IP, MAC, state</source>
        <translation>タスク、ユーザー、モデル、IP、MAC、状態を検索</translation>
    </message>
    <message>
        <source>Tasks</source>
        <translation>タスク</translation>
    </message>
    <message>
        <source>Loading tasks...</source>
        <translation>タスクを読み込んでいます...</translation>
    </message>
    <message>
        <source>The task list could not be read.</source>
        <translation>タスク一覧を読み取れませんでした。</translation>
    </message>
    <message>
        <source>No tasks.
What is done to devices shows here.</source>
        <translation>タスクはありません。
デバイスに対する操作がここに表示されます。</translation>
    </message>
    <message>
        <source>No task matches the filter.</source>
        <translation>フィルターに一致するタスクがありません。</translation>
    </message>
    <message>
        <source>The tasks could not be read since %1.</source>
        <translation>%1 からタスクを読み取れていません。</translation>
    </message>
    <message>
        <source>This client cannot retry the task: it was started elsewhere or before the last log-in, so its settings are not known here.</source>
        <translation>このクライアントではタスクを再試行できません: 別の場所または前回のログインより前に開始されたため、設定がここでは分かりません。</translation>
    </message>
    <message>
        <source>Retrying asks for the password or key again.</source>
        <translation>再試行時にパスワードまたはキーの再入力が必要です。</translation>
    </message>
    <message>
        <source>Its rollout or its repetition sees to the devices that failed.</source>
        <translation>失敗したデバイスは、ロールアウトまたは再実行で処理されます。</translation>
    </message>
</context>
<context>
    <name>TaskQueue</name>
    <message>
        <source>Reason: %1.</source>
        <translation>理由: %1。</translation>
    </message>
    <message>
        <source>The server has ended the session.</source>
        <translation>サーバーがセッションを終了しました。</translation>
    </message>
</context>
<context>
    <name>TaskState</name>
    <message>
        <source>Requesting</source>
        <translation>要求中</translation>
    </message>
    <message>
        <source>Queuing</source>
        <translation>待機中</translation>
    </message>
    <message>
        <source>Processing</source>
        <translation>処理中</translation>
    </message>
    <message>
        <source>(1/3) File is uploading...</source>
        <translation>(1/3) ファイルをアップロードしています...</translation>
    </message>
    <message>
        <source>(2/3) Device is updating...</source>
        <translation>(2/3) デバイスを更新しています...</translation>
    </message>
    <message>
        <source>(3/3) Device is reconnecting...</source>
        <translation>(3/3) デバイスが再接続しています...</translation>
    </message>
    <message>
        <source>Scheduled</source>
        <translation>予定</translation>
    </message>
    <message>
        <source>Applied successfully</source>
        <translation>適用しました</translation>
    </message>
    <message>
        <source>Uploaded successfully</source>
        <translation>アップロードしました</translation>
    </message>
    <message>
        <source>Failed</source>
        <translation>失敗</translation>
    </message>
    <message>
        <source>Mismatching status</source>
        <translation>状態が一致しません</translation>
    </message>
    <message>
        <source>Unsupported method</source>
        <translation>サポートされていない方法です</translation>
    </message>
    <message>
        <source>Mismatching private key and certificate</source>
        <translation>秘密鍵と証明書が一致しません</translation>
    </message>
    <message>
        <source>Invalid file or public key</source>
        <translation>ファイルまたは公開鍵が無効です</translation>
    </message>
    <message>
        <source>Certificate not installed</source>
        <translation>証明書がインストールされていません</translation>
    </message>
    <message>
        <source>Not installed</source>
        <translation>インストールされていません</translation>
    </message>
    <message>
        <source>Device response timeout</source>
        <translation>デバイスの応答がタイムアウトしました</translation>
    </message>
    <message>
        <source>Device response timeout. Contact Norvell technical support for further assistant.</source>
        <translation>デバイスの応答がタイムアウトしました。Norvell テクニカルサポートにお問い合わせください。</translation>
    </message>
    <message>
        <source>Failed to connect to device</source>
        <translation>デバイスに接続できませんでした</translation>
    </message>
    <message>
        <source>Failed to connect to device. Check device status and connection, then retry.</source>
        <translation>デバイスに接続できませんでした。デバイスの状態と接続を確認して再試行してください。</translation>
    </message>
    <message>
        <source>Failed to set password to device</source>
        <translation>デバイスにパスワードを設定できませんでした</translation>
    </message>
    <message>
        <source>Invalid file for this model group</source>
        <translation>このモデルグループには無効なファイルです</translation>
    </message>
    <message>
        <source>Failed to upload: Incompatible Firmware. Check the firmware release notes for compatibility.</source>
        <translation>アップロードに失敗しました: ファームウェアに互換性がありません。ファームウェアのリリースノートで互換性を確認してください。</translation>
    </message>
    <message>
        <source>Failed to upload: No SD card detected. Check SD card status, then retry.</source>
        <translation>アップロードに失敗しました: SD カードが検出されません。SD カードの状態を確認して再試行してください。</translation>
    </message>
    <message>
        <source> SD card error. Check SD card status, then retry.</source>
        <translation> SD カードエラー。SD カードの状態を確認して再試行してください。</translation>
    </message>
    <message>
        <source> Reached maximum package upload limit. Check package status, then retry.</source>
        <translation> パッケージのアップロード上限に達しました。パッケージの状態を確認して再試行してください。</translation>
    </message>
    <message>
        <source> Insufficient storage. Check storage status, then retry.</source>
        <translation> 空き容量が不足しています。ストレージの状態を確認して再試行してください。</translation>
    </message>
    <message>
        <source> Broken or invalid file. Select valid file, then retry.</source>
        <translation> ファイルが壊れているか無効です。有効なファイルを選択して再試行してください。</translation>
    </message>
    <message>
        <source> Internal process error.Contact Norvell technical support for further assistant.</source>
        <translation> 内部処理エラー。Norvell テクニカルサポートにお問い合わせください。</translation>
    </message>
    <message>
        <source>Failed to upload: </source>
        <translation>アップロードに失敗しました: </translation>
    </message>
</context>
<context>
    <name>TaskTexts</name>
    <message numerus="yes">
        <source>%n device(s): %1</source>
        <translation>
            <numerusform>%n 台のデバイス: %1</numerusform>
        </translation>
    </message>
    <message>
        <source>%1 of %2 failed: %3</source>
        <translation>%2 台中 %1 台が失敗: %3</translation>
    </message>
    <message>
        <source>Started at %1</source>
        <translation>開始: %1</translation>
    </message>
    <message>
        <source>Started by %1 at %2</source>
        <translation>開始: %1、%2</translation>
    </message>
    <message>
        <source>Scheduled for %1</source>
        <translation>%1 に予定</translation>
    </message>
    <message>
        <source>an unknown time</source>
        <translation>時刻不明</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) · %1</source>
        <translation>
            <numerusform>%n 台のデバイス · %1</numerusform>
        </translation>
    </message>
</context>
<context>
    <name>TaskType</name>
    <message>
        <source>Upload Firmware</source>
        <translation>ファームウェアをアップロード</translation>
    </message>
    <message>
        <source>Upload Configuration File</source>
        <translation>構成ファイルをアップロード</translation>
    </message>
    <message>
        <source>Upload Package</source>
        <translation>パッケージをアップロード</translation>
    </message>
    <message>
        <source>Generate HTTPS Certificate</source>
        <translation>HTTPS 証明書の生成</translation>
    </message>
    <message>
        <source>Install HTTPS Certificate</source>
        <translation>HTTPS 証明書のインストール</translation>
    </message>
    <message>
        <source>Upload HTTPS Certificate and Key</source>
        <translation>HTTPS 証明書とキーのアップロード</translation>
    </message>
    <message>
        <source>Upload IEEE 802.1x Certificate (EAP-PEAP)</source>
        <translation>IEEE 802.1x 証明書のアップロード (EAP-PEAP)</translation>
    </message>
    <message>
        <source>Upload IEEE 802.1x Certificate (EAP-TLS)</source>
        <translation>IEEE 802.1x 証明書のアップロード (EAP-TLS)</translation>
    </message>
    <message>
        <source>Assign IP Address (Auto)</source>
        <translation>IP アドレスの割り当て (自動)</translation>
    </message>
    <message>
        <source>Assign IP Address (Manual)</source>
        <translation>IP アドレスの割り当て (手動)</translation>
    </message>
    <message>
        <source>Export Debug Info</source>
        <translation>デバッグ情報をエクスポート</translation>
    </message>
    <message>
        <source>Quick Setup</source>
        <translation>クイック設定</translation>
    </message>
    <message>
        <source>Restart Device</source>
        <translation>デバイスの再起動</translation>
    </message>
    <message>
        <source>Restore Device</source>
        <translation>デバイスの復元</translation>
    </message>
    <message>
        <source>Set Password</source>
        <translation>パスワードの設定</translation>
    </message>
    <message>
        <source>Set Password Policy</source>
        <translation>パスワードポリシーの設定</translation>
    </message>
    <message>
        <source>Create Template</source>
        <translation>テンプレートの作成</translation>
    </message>
    <message>
        <source>Set Configuration</source>
        <translation>構成の設定</translation>
    </message>
    <message>
        <source>Custom Command</source>
        <translation>カスタムコマンド</translation>
    </message>
    <message>
        <source>Task</source>
        <translation>タスク</translation>
    </message>
</context>
<context>
    <name>TimeSyncFields</name>
    <message numerus="yes">
        <source>Every %n hour(s)</source>
        <translation>
            <numerusform>%n 時間ごと</numerusform>
        </translation>
    </message>
    <message numerus="yes">
        <source>Every %n minute(s)</source>
        <translation>
            <numerusform>%n 分ごと</numerusform>
        </translation>
    </message>
    <message>
        <source>Time synchronization</source>
        <translation>時刻の同期</translation>
    </message>
    <message>
        <source>Set once from this computer</source>
        <translation>このコンピューターの時刻に一度合わせる</translation>
    </message>
    <message>
        <source>NTP servers</source>
        <translation>NTP サーバー</translation>
    </message>
    <message>
        <source>NTP server %1</source>
        <translation>NTP サーバー %1</translation>
    </message>
    <message>
        <source>Update interval</source>
        <translation>更新間隔</translation>
    </message>
    <message>
        <source>“%1” is no name or address of a server.</source>
        <translation>「%1」はサーバーの名前またはアドレスではありません。</translation>
    </message>
    <message>
        <source>The server “%1” is named twice.</source>
        <translation>サーバー「%1」が重複しています。</translation>
    </message>
    <message>
        <source>Name at least one NTP server.</source>
        <translation>NTP サーバーを 1 つ以上指定してください。</translation>
    </message>
</context>
<context>
    <name>TimeZones</name>
    <message>
        <source>Pago Pago</source>
        <translation>パゴパゴ</translation>
    </message>
    <message>
        <source>Honolulu</source>
        <translation>ホノルル</translation>
    </message>
    <message>
        <source>Anchorage</source>
        <translation>アンカレッジ</translation>
    </message>
    <message>
        <source>Los Angeles, Vancouver</source>
        <translation>ロサンゼルス、バンクーバー</translation>
    </message>
    <message>
        <source>Denver, Edmonton</source>
        <translation>デンバー、エドモントン</translation>
    </message>
    <message>
        <source>Phoenix</source>
        <translation>フェニックス</translation>
    </message>
    <message>
        <source>Chicago, Winnipeg</source>
        <translation>シカゴ、ウィニペグ</translation>
    </message>
    <message>
        <source>Mexico City, Guatemala</source>
        <translation>メキシコシティ、グアテマラ</translation>
    </message>
    <message>
        <source>New York, Toronto</source>
        <translation>ニューヨーク、トロント</translation>
    </message>
    <message>
        <source>Bogotá, Lima</source>
        <translation>ボゴタ、リマ</translation>
    </message>
    <message>
        <source>Halifax</source>
        <translation>ハリファックス</translation>
    </message>
    <message>
        <source>Caracas, La Paz</source>
        <translation>カラカス、ラパス</translation>
    </message>
    <message>
        <source>Santiago</source>
        <translation>サンティアゴ</translation>
    </message>
    <message>
        <source>St. John’s</source>
        <translation>セントジョンズ</translation>
    </message>
    <message>
        <source>São Paulo, Buenos Aires</source>
        <translation>サンパウロ、ブエノスアイレス</translation>
    </message>
    <message>
        <source>South Georgia</source>
        <translation>サウスジョージア</translation>
    </message>
    <message>
        <source>Azores</source>
        <translation>アゾレス諸島</translation>
    </message>
    <message>
        <source>Praia</source>
        <translation>プライア</translation>
    </message>
    <message>
        <source>Coordinated Universal Time</source>
        <translation>協定世界時</translation>
    </message>
    <message>
        <source>London, Dublin</source>
        <translation>ロンドン、ダブリン</translation>
    </message>
    <message>
        <source>Lisbon</source>
        <translation>リスボン</translation>
    </message>
    <message>
        <source>Accra, Reykjavik</source>
        <translation>アクラ、レイキャビク</translation>
    </message>
    <message>
        <source>Berlin, Madrid, Paris, Rome</source>
        <translation>ベルリン、マドリード、パリ、ローマ</translation>
    </message>
    <message>
        <source>Algiers, Tunis</source>
        <translation>アルジェ、チュニス</translation>
    </message>
    <message>
        <source>Lagos</source>
        <translation>ラゴス</translation>
    </message>
    <message>
        <source>Athens, Helsinki, Kyiv</source>
        <translation>アテネ、ヘルシンキ、キーウ</translation>
    </message>
    <message>
        <source>Cairo</source>
        <translation>カイロ</translation>
    </message>
    <message>
        <source>Jerusalem</source>
        <translation>エルサレム</translation>
    </message>
    <message>
        <source>Johannesburg</source>
        <translation>ヨハネスブルグ</translation>
    </message>
    <message>
        <source>Istanbul, Riyadh</source>
        <translation>イスタンブール、リヤド</translation>
    </message>
    <message>
        <source>Moscow</source>
        <translation>モスクワ</translation>
    </message>
    <message>
        <source>Nairobi</source>
        <translation>ナイロビ</translation>
    </message>
    <message>
        <source>Tehran</source>
        <translation>テヘラン</translation>
    </message>
    <message>
        <source>Baku, Dubai</source>
        <translation>バクー、ドバイ</translation>
    </message>
    <message>
        <source>Kabul</source>
        <translation>カブール</translation>
    </message>
    <message>
        <source>Karachi</source>
        <translation>カラチ</translation>
    </message>
    <message>
        <source>Tashkent</source>
        <translation>タシケント</translation>
    </message>
    <message>
        <source>Delhi, Mumbai</source>
        <translation>デリー、ムンバイ</translation>
    </message>
    <message>
        <source>Kathmandu</source>
        <translation>カトマンズ</translation>
    </message>
    <message>
        <source>Dhaka</source>
        <translation>ダッカ</translation>
    </message>
    <message>
        <source>Yangon</source>
        <translation>ヤンゴン</translation>
    </message>
    <message>
        <source>Bangkok, Hanoi</source>
        <translation>バンコク、ハノイ</translation>
    </message>
    <message>
        <source>Jakarta</source>
        <translation>ジャカルタ</translation>
    </message>
    <message>
        <source>Beijing, Shanghai, Taipei</source>
        <translation>北京、上海、台北</translation>
    </message>
    <message>
        <source>Hong Kong</source>
        <translation>香港</translation>
    </message>
    <message>
        <source>Manila</source>
        <translation>マニラ</translation>
    </message>
    <message>
        <source>Kuala Lumpur, Singapore</source>
        <translation>クアラルンプール、シンガポール</translation>
    </message>
    <message>
        <source>Perth</source>
        <translation>パース</translation>
    </message>
    <message>
        <source>Tokyo</source>
        <translation>東京</translation>
    </message>
    <message>
        <source>Seoul</source>
        <translation>ソウル</translation>
    </message>
    <message>
        <source>Darwin</source>
        <translation>ダーウィン</translation>
    </message>
    <message>
        <source>Adelaide</source>
        <translation>アデレード</translation>
    </message>
    <message>
        <source>Brisbane</source>
        <translation>ブリスベン</translation>
    </message>
    <message>
        <source>Melbourne, Sydney</source>
        <translation>メルボルン、シドニー</translation>
    </message>
    <message>
        <source>Nouméa</source>
        <translation>ヌメア</translation>
    </message>
    <message>
        <source>Suva</source>
        <translation>スバ</translation>
    </message>
    <message>
        <source>Auckland</source>
        <translation>オークランド</translation>
    </message>
    <message>
        <source>Nukuʻalofa</source>
        <translation>ヌクアロファ</translation>
    </message>
</context>
<context>
    <name>TitleBar</name>
    <message>
        <source>Help</source>
        <translation>ヘルプ</translation>
    </message>
    <message>
        <source>Account</source>
        <translation>アカウント</translation>
    </message>
    <message>
        <source>Minimize</source>
        <translation>最小化</translation>
    </message>
    <message>
        <source>Maximize</source>
        <translation>最大化</translation>
    </message>
    <message>
        <source>Restore</source>
        <translation>元のサイズに戻す</translation>
    </message>
    <message>
        <source>Close</source>
        <translation>閉じる</translation>
    </message>
    <message>
        <source>Account Management</source>
        <translation>アカウント管理</translation>
    </message>
    <message>
        <source>Norvell Service Management</source>
        <translation>Norvell サービス管理</translation>
    </message>
    <message>
        <source>About</source>
        <translation>バージョン情報</translation>
    </message>
    <message>
        <source>Log off</source>
        <translation>ログオフ</translation>
    </message>
    <message>
        <source>The service is connected.</source>
        <translation>サービスは接続されています。</translation>
    </message>
</context>
<context>
    <name>Transfer</name>
    <message>
        <source>It was cancelled.</source>
        <translation>キャンセルされました。</translation>
    </message>
    <message>
        <source>The file “%1” cannot be read.</source>
        <translation>ファイル「%1」を読み取れません。</translation>
    </message>
    <message>
        <source>The file “%1” is empty.</source>
        <translation>ファイル「%1」は空です。</translation>
    </message>
    <message>
        <source>The file “%1” was changed while it was being sent.</source>
        <translation>ファイル「%1」は送信中に変更されました。</translation>
    </message>
    <message>
        <source>The file “%1” disappeared while it was being sent.</source>
        <translation>ファイル「%1」は送信中になくなりました。</translation>
    </message>
    <message>
        <source>The service refused it or the connection was lost.</source>
        <translation>サービスに拒否されたか、接続が切れました。</translation>
    </message>
    <message>
        <source>Nothing got through to the service for too long.</source>
        <translation>長時間サービスに何も届きませんでした。</translation>
    </message>
    <message>
        <source>The service does not take files of this size.</source>
        <translation>サービスはこのサイズのファイルを受け付けません。</translation>
    </message>
    <message>
        <source>The file “%1” exists already or cannot be written.</source>
        <translation>ファイル「%1」は既に存在するか、書き込めません。</translation>
    </message>
</context>
<context>
    <name>TransferBanner</name>
    <message>
        <source>Upload progress</source>
        <translation>アップロードの進行状況</translation>
    </message>
    <message>
        <source>Cancel</source>
        <translation>キャンセル</translation>
    </message>
    <message>
        <source>%1 of %2, %3 per second</source>
        <translation>%1/%2 (毎秒 %3)</translation>
    </message>
    <message>
        <source>%1 sent, waiting for the server.</source>
        <translation>%1 を送信済み、サーバーの応答を待っています。</translation>
    </message>
    <message>
        <source>Cancelling...</source>
        <translation>キャンセルしています...</translation>
    </message>
</context>
<context>
    <name>UploadConfigurationDialog</name>
    <message>
        <source>Upload Configuration File</source>
        <translation>構成ファイルをアップロード</translation>
    </message>
    <message>
        <source>Configuration file</source>
        <translation>構成ファイル</translation>
    </message>
    <message>
        <source>Choose Configuration File</source>
        <translation>構成ファイルを選択</translation>
    </message>
    <message>
        <source>One file of up to 4 GiB.</source>
        <translation>4 GiB までのファイル 1 つ。</translation>
    </message>
    <message>
        <source>Upload</source>
        <translation>アップロード</translation>
    </message>
    <message>
        <source>The upload could not be started.</source>
        <translation>アップロードを開始できませんでした。</translation>
    </message>
</context>
<context>
    <name>UploadFirmwareDialog</name>
    <message>
        <source>Upload Firmware</source>
        <translation>ファームウェアをアップロード</translation>
    </message>
    <message>
        <source>Only devices whose last upload failed</source>
        <translation>前回のアップロードに失敗したデバイスのみ</translation>
    </message>
    <message>
        <source>Upload</source>
        <translation>アップロード</translation>
    </message>
    <message>
        <source>Open Firmware Image</source>
        <translation>ファームウェアイメージを開く</translation>
    </message>
    <message>
        <source>Firmware file</source>
        <translation>ファームウェアファイル</translation>
    </message>
    <message>
        <source>Models of the devices</source>
        <translation>デバイスのモデル</translation>
    </message>
    <message>
        <source>The last upload failed on none of the devices.</source>
        <translation>前回のアップロードに失敗したデバイスはありません。</translation>
    </message>
    <message>
        <source>When</source>
        <translation>日時</translation>
    </message>
    <message>
        <source>Rollout</source>
        <translation>展開</translation>
    </message>
    <message>
        <source>%1 at a time</source>
        <translation>同時に %1 台</translation>
    </message>
    <message>
        <source>The first line of this image is damaged; every device would refuse it.</source>
        <translation>このイメージの 1 行目が壊れています。すべてのデバイスに拒否されます。</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will fail: the image is for another model group.</source>
        <translation>
            <numerusform>%n 台のデバイスは失敗します: イメージが別のモデルグループ用です。</numerusform>
        </translation>
    </message>
    <message>
        <source>Another model group</source>
        <translation>別のモデルグループ</translation>
    </message>
    <message>
        <source>Schedule for %1, then %2</source>
        <translation>%1 台、次に %2 台を予約</translation>
    </message>
    <message>
        <source>Upload to %1, then %2</source>
        <translation>%1 台、次に %2 台にアップロード</translation>
    </message>
    <message>
        <source>Schedule for %1</source>
        <translation>%1 台を予約</translation>
    </message>
    <message>
        <source>Upload to %1</source>
        <translation>%1 台にアップロード</translation>
    </message>
    <message>
        <source>The upload could not be started.</source>
        <translation>アップロードを開始できませんでした。</translation>
    </message>
    <message>
        <source>One file of up to 4 GiB.</source>
        <translation>4 GiB までのファイル 1 つ。</translation>
    </message>
</context>
<context>
    <name>UploadHttpsDialog</name>
    <message>
        <source>Upload Certificate – HTTPS</source>
        <translation>証明書をアップロード – HTTPS</translation>
    </message>
    <message>
        <source>Generate self-signed certificates</source>
        <translation>自己署名証明書を生成</translation>
    </message>
    <message>
        <source>Install certificates</source>
        <translation>証明書をインストール</translation>
    </message>
    <message>
        <source>Upload certificates and private keys</source>
        <translation>証明書と秘密鍵をアップロード</translation>
    </message>
    <message>
        <source>HTTP and HTTPS</source>
        <translation>HTTP と HTTPS</translation>
    </message>
    <message>
        <source>HTTPS only</source>
        <translation>HTTPS のみ</translation>
    </message>
    <message>
        <source>Method</source>
        <translation>方法</translation>
    </message>
    <message>
        <source>Mode</source>
        <translation>モード</translation>
    </message>
    <message>
        <source>HTTPS Port</source>
        <translation>HTTPS ポート</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) with HTTP on this port already.</source>
        <translation>
            <numerusform>%n 台のデバイスは既にこのポートで HTTP を使用しています。</numerusform>
        </translation>
    </message>
    <message>
        <source>HTTP port</source>
        <translation>HTTP ポート</translation>
    </message>
</context>
<context>
    <name>UploadIeeeDialog</name>
    <message>
        <source>Upload Certificate – IEEE 802.1x</source>
        <translation>証明書をアップロード – IEEE 802.1x</translation>
    </message>
    <message>
        <source>For encrypted private keys</source>
        <translation>暗号化された秘密鍵用</translation>
    </message>
    <message>
        <source>Password</source>
        <translation>パスワード</translation>
    </message>
    <message>
        <source>Private Key Password</source>
        <translation>秘密鍵のパスワード</translation>
    </message>
    <message>
        <source>Method</source>
        <translation>方法</translation>
    </message>
    <message>
        <source>Identity</source>
        <translation>ID</translation>
    </message>
    <message>
        <source>CA Certificate</source>
        <translation>CA 証明書</translation>
    </message>
    <message>
        <source>Type the identity that the devices log in with.</source>
        <translation>デバイスがログインに使う ID を入力してください。</translation>
    </message>
    <message>
        <source>Type the password that the devices log in with.</source>
        <translation>デバイスがログインに使うパスワードを入力してください。</translation>
    </message>
    <message>
        <source>Choose the certificate of the authority.</source>
        <translation>認証局の証明書を選択してください。</translation>
    </message>
</context>
<context>
    <name>UploadPackageDialog</name>
    <message>
        <source>Upload Package</source>
        <translation>パッケージをアップロード</translation>
    </message>
    <message>
        <source>Package</source>
        <translation>パッケージ</translation>
    </message>
    <message>
        <source>Choose Package</source>
        <translation>パッケージを選択</translation>
    </message>
    <message>
        <source>One file of up to 4 GiB.</source>
        <translation>4 GiB までのファイル 1 つ。</translation>
    </message>
    <message>
        <source>Store the package on the memory card</source>
        <translation>パッケージをメモリーカードに保存</translation>
    </message>
    <message>
        <source>Upload</source>
        <translation>アップロード</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) will fail: no memory card is ready.</source>
        <translation>
            <numerusform>%n 台のデバイスは失敗します: 使用できるメモリーカードがありません。</numerusform>
        </translation>
    </message>
    <message>
        <source>No memory card ready</source>
        <translation>使用できるメモリーカードなし</translation>
    </message>
    <message numerus="yes">
        <source>%n device(s) may fail: the memory card is almost full.</source>
        <translation>
            <numerusform>%n 台のデバイスは失敗する可能性があります: メモリーカードの空きがほとんどありません。</numerusform>
        </translation>
    </message>
    <message>
        <source>Memory card almost full</source>
        <translation>メモリーカードの空き不足</translation>
    </message>
    <message>
        <source>The upload could not be started.</source>
        <translation>アップロードを開始できませんでした。</translation>
    </message>
</context>
<context>
    <name>WelcomePage</name>
    <message>
        <source>Log in</source>
        <translation>ログイン</translation>
    </message>
    <message>
        <source>Checking the service on this computer...</source>
        <translation>このコンピューターのサービスを確認しています...</translation>
    </message>
</context>
<context>
    <name>main</name>
    <message>
        <source>Norvell Device Manager</source>
        <translation>Norvell Device Manager</translation>
    </message>
</context>
</TS>
