<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja" sourcelanguage="en_US">
<context>
    <name>CGotoDlg</name>
    <message>
        <source>Go to grid line</source>
        <translation>指定行へ移動</translation>
    </message>
    <message>
        <source>&amp;Line number:</source>
        <translation>行番号(&amp;L):</translation>
    </message>
</context>
<context>
    <name>CSearchDlg</name>
    <message>
        <source>Search</source>
        <translation>検索</translation>
    </message>
    <message>
        <source>River Name</source>
        <translation>河川名</translation>
    </message>
    <message>
        <source>River &amp;name:</source>
        <translation>河川名(&amp;N):</translation>
    </message>
    <message>
        <source>&amp;Partial match</source>
        <translation>前方一致(&amp;P)</translation>
    </message>
    <message>
        <source>&amp;Full match</source>
        <translation>完全一致(&amp;F)</translation>
    </message>
    <message>
        <source>Chainage</source>
        <translation>追加距離</translation>
    </message>
    <message>
        <source>&amp;Chainage:</source>
        <translation>追加距離(&amp;C):</translation>
    </message>
    <message>
        <source>&lt;</source>
        <translation>&lt;</translation>
    </message>
    <message>
        <source>Less than</source>
        <translation>より小さい</translation>
    </message>
    <message>
        <source>=</source>
        <translation>=</translation>
    </message>
    <message>
        <source>Equal to</source>
        <translation>等しい</translation>
    </message>
    <message>
        <source>&gt;</source>
        <translation>&gt;</translation>
    </message>
    <message>
        <source>Greater than</source>
        <translation>より大きい</translation>
    </message>
    <message>
        <source>Not &amp;Use</source>
        <translation>使わない(&amp;U)</translation>
    </message>
</context>
<context>
    <name>GridTexts</name>
    <message>
        <source>Floating point number required</source>
        <translation>数値を入力してください</translation>
    </message>
    <message>
        <source>The cell is locked.</source>
        <translation>セルはロックされています。</translation>
    </message>
    <message>
        <source>Please enter 0 or 1.</source>
        <translation>0または1を入力してください。</translation>
    </message>
    <message>
        <source>One of these is required: %1</source>
        <translation>次のいずれかを入力してください: %1</translation>
    </message>
    <message>
        <source>Please enter an integer.</source>
        <translation>整数を入力してください。</translation>
    </message>
    <message>
        <source>Floating-point value is out of range</source>
        <translation>数値が範囲外です</translation>
    </message>
    <message>
        <source>Full value: %1</source>
        <translation>全桁の値: %1</translation>
    </message>
    <message>
        <source>Invalid DateTime</source>
        <translation>無効な日時</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no date and time. Expected one such as %2.</source>
        <translation>「%1」は日時ではありません。%2 のように入力してください。</translation>
    </message>
    <message>
        <source>&quot;%1&quot; holds a part of a second. Times are kept to the whole second. Expected one such as %2.</source>
        <translation>「%1」には 1 秒未満の端数があります。時刻は秒単位で保存されます。%2 のように入力してください。</translation>
    </message>
    <message>
        <source>Line %1 of %2</source>
        <translation>%1 行目 / 全 %2 行</translation>
    </message>
    <message>
        <source>Line %1 of %2, %3: %4</source>
        <translation>%1 行目 / 全 %2 行、%3: %4</translation>
    </message>
    <message>
        <source>No lines. Insert adds one.</source>
        <translation>行がありません。Insertキーで追加します。</translation>
    </message>
    <message>
        <source>Line number must be greater than 0</source>
        <translation>行番号は1以上にしてください</translation>
    </message>
    <message>
        <source>Nothing was pasted. Line %1, column &quot;%2&quot; cannot take &quot;%3&quot;:
%4</source>
        <translation>貼り付けませんでした。%1 行目の「%2」列には「%3」を入れられません:
%4</translation>
    </message>
    <message>
        <source>Nothing was pasted. From line %1 on the table has only %2 lines.</source>
        <translation>貼り付けませんでした。%1 行目から先、表には %2 行しかありません。</translation>
    </message>
    <message>
        <source>Nothing was pasted. The copied cells are %1 columns wide; from column &quot;%2&quot; on the table has only %3.</source>
        <translation>貼り付けませんでした。コピーしたセルは %1 列ありますが、表には「%2」列から %3 列しかありません。</translation>
    </message>
    <message>
        <source>Paste</source>
        <translation>貼り付け</translation>
    </message>
    <message>
        <source>1 cell pasted</source>
        <translation>1 個のセルに貼り付けました</translation>
    </message>
    <message>
        <source>%1 cells pasted</source>
        <translation>%1 個のセルに貼り付けました</translation>
    </message>
    <message>
        <source>%1, line %2</source>
        <translation>%1、%2 行目</translation>
    </message>
    <message>
        <source>Next cell; behind the last one a new line</source>
        <translation>次のセル(最後のセルでは行を追加)</translation>
    </message>
    <message>
        <source>Previous cell</source>
        <translation>前のセル</translation>
    </message>
    <message>
        <source>Insert line</source>
        <translation>行の挿入</translation>
    </message>
    <message>
        <source>Copy, then insert line</source>
        <translation>コピーして行を挿入</translation>
    </message>
    <message>
        <source>Paste, then insert line</source>
        <translation>貼り付けて行を挿入</translation>
    </message>
    <message>
        <source>Delete selected lines</source>
        <translation>選択した行の削除</translation>
    </message>
    <message>
        <source>Select the line</source>
        <translation>行を選択</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>コピー</translation>
    </message>
    <message>
        <source>Search again</source>
        <translation>次を検索</translation>
    </message>
    <message>
        <source>Search</source>
        <translation>検索</translation>
    </message>
    <message>
        <source>Undo</source>
        <translation>元に戻す</translation>
    </message>
    <message>
        <source>Redo</source>
        <translation>やり直し</translation>
    </message>
    <message>
        <source>Change of cells</source>
        <translation>セルの変更</translation>
    </message>
    <message>
        <source>Insertion of lines</source>
        <translation>行の挿入</translation>
    </message>
    <message>
        <source>Line inserted</source>
        <translation>行を挿入しました</translation>
    </message>
    <message>
        <source>Line deleted</source>
        <translation>行を削除しました</translation>
    </message>
    <message>
        <source>%1 lines deleted</source>
        <translation>%1 行を削除しました</translation>
    </message>
    <message>
        <source>&amp;Go to Line...</source>
        <translation>指定行へ移動(&amp;G)...</translation>
    </message>
    <message>
        <source>&amp;Search...</source>
        <translation>検索(&amp;S)...</translation>
    </message>
    <message>
        <source>Search &amp;Again</source>
        <translation>次を検索(&amp;A)</translation>
    </message>
    <message>
        <source>The last occurence of searched item already found</source>
        <translation>これ以降に該当する項目はありません</translation>
    </message>
    <message>
        <source>Searched item not found</source>
        <translation>検索した項目が見つかりません</translation>
    </message>
    <message>
        <source>Deletion of lines</source>
        <translation>行の削除</translation>
    </message>
    <message>
        <source>At most %1 characters fit in here; the end of what was typed or pasted is missing.</source>
        <translation>ここに入るのは %1 文字までです。入力または貼り付けられた内容の末尾が欠けています。</translation>
    </message>
    <message>
        <source>%1: &quot;%2&quot; was typed.</source>
        <translation>%1: 「%2」と入力されました。</translation>
    </message>
    <message>
        <source>Allowed: %1</source>
        <translation>許容範囲: %1</translation>
    </message>
    <message>
        <source>%1 to %2</source>
        <translation>%1 ～ %2</translation>
    </message>
    <message>
        <source>at least %1</source>
        <translation>%1 以上</translation>
    </message>
    <message>
        <source>at most %1</source>
        <translation>%1 以下</translation>
    </message>
</context>
</TS>
