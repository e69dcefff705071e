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
</TS>
