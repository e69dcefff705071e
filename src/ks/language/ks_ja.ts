<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja" sourcelanguage="en_US">
    <context>
        <name>CKsDoc</name>
        <message>
            <source>The file does not exist.</source>
            <translation>ファイルがありません。</translation>
        </message>
        <message>
            <source>This is not a file.</source>
            <translation>ファイルではありません。</translation>
        </message>
        <message>
            <source>%1 could not be opened.
%2</source>
            <translation>%1 を開けませんでした。
%2</translation>
        </message>
        <message>
            <source>Save the changes to %1?</source>
            <translation>%1 への変更を保存しますか?</translation>
        </message>
        <message>
            <source>Save As</source>
            <translation>名前を付けて保存</translation>
        </message>
        <message>
            <source>%1 is open in another window. Choose another name.</source>
            <translation>%1 は別のウィンドウで開かれています。別の名前を指定してください。</translation>
        </message>
        <message>
            <source>%1 exists already. Replace it?</source>
            <translation>%1 は既に存在します。置き換えますか?</translation>
        </message>
    </context>
    <context>
        <name>CKsEditLong</name>
        <message>
            <source>Enter an integer from %1 to %2.</source>
            <translation>%1 から %2 までの整数を入力してください。</translation>
        </message>
        <message>
            <source>Enter an integer.</source>
            <translation>整数を入力してください。</translation>
        </message>
        <message>
            <source>Enter a number.</source>
            <translation>数値を入力してください。</translation>
        </message>
    </context>
    <context>
        <name>CKsEditStyle</name>
        <message>
            <source>Unit: %1</source>
            <translation>単位: %1</translation>
        </message>
    </context>
    <context>
        <name>SystemReason</name>
        <message>
            <source>no space is left on the device</source>
            <translation>デバイスに空き領域がありません</translation>
        </message>
        <message>
            <source>the file system is read-only</source>
            <translation>ファイルシステムは読み取り専用です</translation>
        </message>
        <message>
            <source>permission denied</source>
            <translation>アクセスが許可されていません</translation>
        </message>
        <message>
            <source>the operation is not permitted</source>
            <translation>この操作は許可されていません</translation>
        </message>
        <message>
            <source>there is no such file or folder</source>
            <translation>ファイルまたはフォルダがありません</translation>
        </message>
        <message>
            <source>a part of the path is no folder</source>
            <translation>パスの途中がフォルダではありません</translation>
        </message>
        <message>
            <source>it is a folder</source>
            <translation>フォルダです</translation>
        </message>
        <message>
            <source>it is not an ordinary file</source>
            <translation>通常のファイルではありません</translation>
        </message>
        <message>
            <source>the device reports an input or output error</source>
            <translation>デバイスの入出力エラーです</translation>
        </message>
        <message>
            <source>the file would be too large</source>
            <translation>ファイルが大きくなりすぎます</translation>
        </message>
        <message>
            <source>the name is too long</source>
            <translation>名前が長すぎます</translation>
        </message>
        <message>
            <source>the link leads in a circle</source>
            <translation>リンクが循環しています</translation>
        </message>
        <message>
            <source>too many files are open</source>
            <translation>開いているファイルが多すぎます</translation>
        </message>
        <message>
            <source>another program is using it</source>
            <translation>別のプログラムが使用しています</translation>
        </message>
        <message>
            <source>your disk quota is used up</source>
            <translation>ディスクの割り当て容量を使い切りました</translation>
        </message>
        <message>
            <source>%1.</source>
            <translation>%1。</translation>
        </message>
    </context>
    <context>
        <name>ParameterFile</name>
        <message>
            <source>%1, line %2: %3</source>
            <translation>%1、%2行目: %3</translation>
        </message>
        <message>
            <source>%1 is no file of this kind: it has no section [%2].</source>
            <translation>%1はこの種類のファイルではありません: セクション[%2]がありません。</translation>
        </message>
        <message>
            <source>expected a section [%1].</source>
            <translation>セクション[%1]が必要です。</translation>
        </message>
        <message>
            <source>expected only one %1 in [%2].</source>
            <translation>[%2]の中の%1は1つだけにしてください。</translation>
        </message>
        <message>
            <source>expected a text, %1 = &quot;...&quot;.</source>
            <translation>文字列(%1 = &quot;...&quot;)が必要です。</translation>
        </message>
        <message>
            <source>expected a file name after &quot;%1 =&quot;.</source>
            <translation>「%1 =」の後にファイル名が必要です。</translation>
        </message>
        <message>
            <source>expected true or false after &quot;%1 =&quot;.</source>
            <translation>「%1 =」の後にtrueまたはfalseが必要です。</translation>
        </message>
        <message>
            <source>expected a number after &quot;%1 =&quot;.</source>
            <translation>「%1 =」の後に数値が必要です。</translation>
        </message>
        <message>
            <source>expected %1 numbers after &quot;%2 =&quot;.</source>
            <translation>「%2 =」の後に%1個の数値が必要です。</translation>
        </message>
        <message>
            <source>The new content is complete in &quot;%1&quot;.</source>
            <translation>新しい内容は「%1」にすべて残っています。</translation>
        </message>
    </context>
</TS>
