<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja" sourcelanguage="en_US">
<context>
    <name>CKsDifferenceDialog</name>
    <message>
        <source>lines: %1</source>
        <translation>行数: %1</translation>
    </message>
    <message>
        <source>The first %1 places are listed.</source>
        <translation>最初の %1 か所を表示しています。</translation>
    </message>
    <message>
        <source>Section
Keyword
Number
Parameter</source>
        <translation>セクション
キーワード
番号
パラメータ</translation>
    </message>
    <message>
        <source>&amp;Close</source>
        <translation>閉じる(&amp;C)</translation>
    </message>
    <message>
        <source>Nothing differs.</source>
        <translation>相違はありません。</translation>
    </message>
    <message>
        <source>values changed: %1</source>
        <translation>変更された値: %1</translation>
    </message>
    <message>
        <source>lines added: %1</source>
        <translation>追加された行: %1</translation>
    </message>
    <message>
        <source>lines removed: %1</source>
        <translation>削除された行: %1</translation>
    </message>
    <message>
        <source>Sections: %1; %2.</source>
        <translation>セクション: %1; %2。</translation>
    </message>
</context>
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
        <source>%1 is in use by %2. Choose another name.</source>
        <translation>%1 は %2 が使用中です。別の名前を指定してください。</translation>
    </message>
    <message>
        <source>%1 exists already. Replace it?</source>
        <translation>%1 は既に存在します。置き換えますか?</translation>
    </message>
    <message>
        <source>The changes are not saved. Save them under another name?</source>
        <translation>変更は保存されていません。別の名前で保存しますか?</translation>
    </message>
    <message>
        <source>Undone: %1</source>
        <translation>元に戻しました: %1</translation>
    </message>
    <message>
        <source>Redone: %1</source>
        <translation>やり直しました: %1</translation>
    </message>
    <message>
        <source>%1 was removed or renamed by another program. What is shown is nowhere else, and is lost unless it is saved.
Save it again?</source>
        <translation>%1 はほかのプログラムによって削除または名前変更されました。表示されている内容はほかのどこにもなく、保存しないと失われます。
もう一度保存しますか?</translation>
    </message>
</context>
<context>
    <name>CKsDocumentFile</name>
    <message>
        <source>What %1 held just before is kept in %2: whether another program had written to it could not be seen (%3).</source>
        <translation>%1 の直前の内容は %2 に残されています。ほかのプログラムが書き込んだかどうかは確認できませんでした (%3)。</translation>
    </message>
    <message>
        <source>Could not read &quot;%1&quot;: %2.</source>
        <translation>「%1」を読み込めませんでした: %2。</translation>
    </message>
    <message>
        <source>Could not write &quot;%1&quot;: %2.</source>
        <translation>「%1」に書き込めませんでした: %2。</translation>
    </message>
    <message>
        <source>The new content is complete in &quot;%1&quot;.</source>
        <translation>新しい内容は「%1」にすべて残っています。</translation>
    </message>
    <message>
        <source>owner</source>
        <translation>所有者</translation>
    </message>
    <message>
        <source>group</source>
        <translation>グループ</translation>
    </message>
    <message>
        <source>mode</source>
        <translation>アクセス許可</translation>
    </message>
    <message>
        <source>access list</source>
        <translation>アクセス制御リスト</translation>
    </message>
    <message>
        <source>extended attributes</source>
        <translation>拡張属性</translation>
    </message>
    <message>
        <source>, </source>
        <translation>、</translation>
    </message>
    <message>
        <source>Another program has changed %1 since it was read or saved here.
Saving writes what is shown instead. As it is now the file stays in a copy beside it, %2.
Save?</source>
        <translation>%1 は、ここで開いた後または保存した後に別のプログラムによって変更されています。
保存すると、表示されている内容に置き換わります。今のファイルは同じフォルダの %2 に残ります。
保存しますか?</translation>
    </message>
    <message>
        <source>Not everything about %1 can be kept: %2.
Save?</source>
        <translation>%1 の次の情報は引き継げません: %2。
保存しますか?</translation>
    </message>
    <message>
        <source>%1 is one of %2 names of the same file (hard links).
Shall the file have the new content under all its names?
No: only %1 gets it, and becomes a file of its own.</source>
        <translation>%1 は、同じファイルの %2 個の名前 (ハードリンク) の 1 つです。
すべての名前で新しい内容にしますか?
「いいえ」の場合は %1 だけが新しい内容になり、独立したファイルになります。</translation>
    </message>
    <message>
        <source>%1 is saved, but the disk has not confirmed it: %2. Should the power fail soon, the file may be found as it was before.</source>
        <translation>%1 を保存しましたが、ディスクの確認が得られませんでした: %2。直後に電源が切れると、ファイルが保存前の状態に戻ることがあります。</translation>
    </message>
    <message>
        <source>What another program had written to %1 is kept in %2.</source>
        <translation>別のプログラムが %1 に書き込んだ内容は %2 に残っています。</translation>
    </message>
    <message>
        <source>Not kept of %1 as it was before: %2.</source>
        <translation>%1 から引き継げなかった情報: %2。</translation>
    </message>
    <message>
        <source>%1 is no file of this kind: it has no section [%2].</source>
        <translation>%1はこの種類のファイルではありません: セクション[%2]がありません。</translation>
    </message>
    <message>
        <source>%1 could not be read when it was opened; what is shown is not its content.
Saving replaces it. As it is now it stays in a copy beside it, %2.
Save?</source>
        <translation>%1 は開いたときに読み込めませんでした。表示されているのはその内容ではありません。
保存すると置き換えられます。今のファイルは同じフォルダの %2 に残ります。
保存しますか?</translation>
    </message>
    <message>
        <source>%1 holds values that were not taken as they stand (places: %2).
Saving writes what is shown instead. As it is now the file stays in a copy beside it, %3.
Save?</source>
        <translation>%1 には、そのまま取り込めなかった値があります (%2 か所)。
保存すると、表示されている値で書き込まれます。今のファイルは同じフォルダの %3 に残ります。
保存しますか?</translation>
    </message>
    <message>
        <source>The changes are saved in %1, which could not be renamed to %2: %3.</source>
        <translation>変更は %1 に保存しましたが、名前を %2 に変更できませんでした: %3。</translation>
    </message>
    <message>
        <source>%1 is now %2</source>
        <translation>%1 は %2 になりました</translation>
    </message>
    <message>
        <source>A save of %1 was cut off. What another program may have written to it just before is kept in %2.</source>
        <translation>%1 の保存が途中で打ち切られました。その直前にほかのプログラムが書き込んだ可能性のある内容は %2 に残されています。</translation>
    </message>
    <message>
        <source>A save of %1 was cut off while the file was written over: it may be half old and half new. The whole new content is in %2.</source>
        <translation>%1 の保存がファイルの上書き中に中断されました。ファイルは新旧の内容が混ざっているかもしれません。新しい内容の全体は %2 にあります。</translation>
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
        <source>The result of &quot;%1&quot; is no number.</source>
        <translation>「%1」の結果は数値になりません。</translation>
    </message>
    <message>
        <source>The result of &quot;%1&quot; is no integer.</source>
        <translation>「%1」の結果は整数になりません。</translation>
    </message>
    <message>
        <source>This number has no unit; &quot;%1&quot; cannot stand here.</source>
        <translation>この数値には単位がありません。「%1」は入力できません。</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no unit of this quantity. Possible are %2.</source>
        <translation>「%1」はこの量の単位ではありません。使える単位: %2。</translation>
    </message>
    <message>
        <source>Unit: %1</source>
        <translation>単位: %1</translation>
    </message>
</context>
<context>
    <name>CKsFileBar</name>
    <message>
        <source>its file system has no locks</source>
        <translation>ファイル システムにロックの機能がありません</translation>
    </message>
    <message>
        <source>another file has the name of the lock</source>
        <translation>ロックと同じ名前の別のファイルがあります</translation>
    </message>
    <message>
        <source>%1 could not be read. What is shown here are default values, not its content.
%2</source>
        <translation>%1 を読み込めませんでした。表示されているのは既定値で、ファイルの内容ではありません。
%2</translation>
    </message>
    <message>
        <source>Values of %1 that were not taken as they stand: %2. A save keeps the file as it is in a copy.</source>
        <translation>%1 の値のうち、そのまま取り込めなかったもの: %2 か所。保存すると、今のファイルのコピーが残ります。</translation>
    </message>
    <message>
        <source>The file as it was before this save is kept in %1.</source>
        <translation>保存前のファイルは %1 に残っています。</translation>
    </message>
    <message>
        <source>Show List...</source>
        <translation>一覧を表示...</translation>
    </message>
    <message>
        <source>Edit Default Values</source>
        <translation>既定値を編集</translation>
    </message>
    <message>
        <source>Close this bar</source>
        <translation>このバーを閉じる</translation>
    </message>
    <message>
        <source>%1 is in use by %2. Here it can be looked at and copied, not changed.</source>
        <translation>%1 は %2 が使用中です。ここでは表示とコピーだけができ、変更はできません。</translation>
    </message>
    <message>
        <source>%1 can be edited now: it is no longer in use by %2. What has been written to it meanwhile is read first.</source>
        <translation>%1 を編集できるようになりました。%2 は使用を終えています。その間にファイルに書き込まれた内容を先に読み込みます。</translation>
    </message>
    <message>
        <source>Edit</source>
        <translation>編集</translation>
    </message>
    <message>
        <source>Edit a Copy...</source>
        <translation>コピーを編集...</translation>
    </message>
    <message>
        <source>Other programs cannot be told that %1 is in use here: %2. Nobody else should change it now.</source>
        <translation>%1 をここで使用中であることを他のプログラムに知らせることができません: %2。今は他の人が変更しないようにしてください。</translation>
    </message>
    <message>
        <source>%1 is in use by %2, too: the lock that kept others out was removed. Here it can be saved when he has let go of it, or under another name.</source>
        <translation>%1 は %2 によっても使用中です: ほかの人を締め出していたロックが削除されました。ここでは、相手が手放したあと、または別の名前で保存できます。</translation>
    </message>
</context>
<context>
    <name>CKsFileUse</name>
    <message>
        <source>another program</source>
        <translation>他のプログラム</translation>
    </message>
    <message>
        <source>%1 on %2 (%3, process %4) since %5</source>
        <translation>%2 の %1 (%3、プロセス %4、%5 から)</translation>
    </message>
    <message>
        <source>%1 on %2 (%3, process %4)</source>
        <translation>%2 の %1 (%3、プロセス %4)</translation>
    </message>
</context>
<context>
    <name>CKsFindingsDialog</name>
    <message>
        <source>%1: Values Not Taken as They Stand</source>
        <translation>%1: そのまま取り込めなかった値</translation>
    </message>
    <message>
        <source>These places of %1 are not written as they should be. Each row says what stands there, what was expected, and what is used instead. Nothing is changed in the file unless you save; a save keeps the file as it is in a copy.</source>
        <translation>%1 のこれらの箇所は、正しく書かれていません。各行に、ファイルの内容、期待される内容、代わりに使われる値を示します。保存しない限りファイルは変わりません。保存すると、今のファイルのコピーが残ります。</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>コピー(&amp;C)</translation>
    </message>
    <message>
        <source>C&amp;lose</source>
        <translation>閉じる(&amp;L)</translation>
    </message>
</context>
<context>
    <name>CKsFindingsModel</name>
    <message>
        <source>a number</source>
        <translation>数値</translation>
    </message>
    <message>
        <source>an integer</source>
        <translation>整数</translation>
    </message>
    <message>
        <source>true or false</source>
        <translation>true または false</translation>
    </message>
    <message>
        <source>a text in quotes</source>
        <translation>引用符で囲んだ文字列</translation>
    </message>
    <message>
        <source>a file name in &lt; &gt;</source>
        <translation>&lt; &gt; で囲んだファイル名</translation>
    </message>
    <message>
        <source>six integers</source>
        <translation>6 個の整数</translation>
    </message>
    <message>
        <source>a count that fits the %1 parameters behind it</source>
        <translation>後に続く %1 個のパラメータに合う個数</translation>
    </message>
    <message>
        <source>a flag for each of %1 titles</source>
        <translation>%1 個のタイトルごとに 1 個のフラグ</translation>
    </message>
    <message>
        <source>a target [%1]</source>
        <translation>ターゲット [%1]</translation>
    </message>
    <message>
        <source>more parameters, or a smaller count</source>
        <translation>より多くのパラメータ、またはより小さい個数</translation>
    </message>
    <message>
        <source>only one of this name; the first counts</source>
        <translation>この名前は 1 つだけ (最初のものが有効)</translation>
    </message>
    <message>
        <source>nothing: the line is left out</source>
        <translation>なし (この行は読み込まれません)</translation>
    </message>
    <message>
        <source>the first; this one is kept, but not shown</source>
        <translation>最初のもの (これは保持されますが表示されません)</translation>
    </message>
    <message>
        <source>not known</source>
        <translation>不明</translation>
    </message>
    <message>
        <source>a keyword %1</source>
        <translation>キーワード %1</translation>
    </message>
    <message>
        <source>a section [%1]</source>
        <translation>セクション [%1]</translation>
    </message>
    <message>
        <source>no more parameters</source>
        <translation>これ以上のパラメータがないこと</translation>
    </message>
    <message>
        <source>Line
Column
Section
Keyword
Parameter
In the file
Expected
Used instead</source>
        <translation>行
列
セクション
キーワード
パラメータ
ファイルの内容
期待される内容
代わりに使う値</translation>
    </message>
    <message>
        <source>Expected: %1</source>
        <translation>期待される値: %1</translation>
    </message>
    <message>
        <source>%1; in the file: %2</source>
        <translation>%1、ファイルの内容: %2</translation>
    </message>
    <message>
        <source>%1; used instead: %2</source>
        <translation>%1、代わりに使われる値: %2</translation>
    </message>
</context>
<context>
    <name>CKsFormula</name>
    <message>
        <source>&quot;%1&quot; is no name or function known here.</source>
        <translation>「%1」はここで使える名前または関数ではありません。</translation>
    </message>
    <message>
        <source>The brackets of &quot;%1&quot; do not match.</source>
        <translation>「%1」の括弧が対応していません。</translation>
    </message>
    <message>
        <source>&quot;%1&quot; has too many or too few values in its brackets.</source>
        <translation>「%1」の括弧内の値の数が正しくありません。</translation>
    </message>
    <message>
        <source>The formula ends where a number is expected.</source>
        <translation>数値が必要な位置で式が終わっています。</translation>
    </message>
    <message>
        <source>The formula cannot be read at character %1.</source>
        <translation>式の %1 文字目を解釈できません。</translation>
    </message>
    <message>
        <source>A formula sets nothing: two numbers are compared with &quot;==&quot;.</source>
        <translation>式で値の代入はできません。比較には「==」を使ってください。</translation>
    </message>
    <message>
        <source>The formula is longer than %1 characters.</source>
        <translation>式が %1 文字を超えています。</translation>
    </message>
    <message>
        <source>The formula has a comma outside of brackets; the decimal separator is the point.</source>
        <translation>式の括弧の外にコンマがあります。小数点にはピリオドを使ってください。</translation>
    </message>
</context>
<context>
    <name>CKsHelpWindow</name>
    <message>
        <source>Help</source>
        <translation>ヘルプ</translation>
    </message>
    <message>
        <source>Words to look for</source>
        <translation>検索する語</translation>
    </message>
    <message>
        <source>Chapters</source>
        <translation>章</translation>
    </message>
    <message>
        <source>Text of the chapter</source>
        <translation>章の本文</translation>
    </message>
</context>
<context>
    <name>CKsOutsideChange</name>
    <message>
        <source>%1 was changed by another program (%2), and the changes made here are not saved. Reload takes the file; undo brings back what is shown. Keep Both saves what is shown under another name. Overwrite saves it here; the file as it is stays in a copy beside it.</source>
        <translation>%1 がほかのプログラムによって変更されました (%2)。ここで行った変更はまだ保存されていません。「再読み込み」はファイルの内容を取り込みます。元に戻すと、今の表示に戻ります。「両方残す」は今の表示を別の名前で保存します。「上書き」は今の表示を保存し、今のファイルのコピーを隣に残します。</translation>
    </message>
    <message>
        <source>%1 was changed by another program (%2). What is shown is the content before.</source>
        <translation>%1 がほかのプログラムによって変更されました (%2)。表示されているのは変更前の内容です。</translation>
    </message>
    <message>
        <source>%1 was changed by another program (%2). What is shown is the content before. Reload takes the file; undo brings back what is shown. Keep Both saves what is shown under another name. Overwrite puts it back; the file as it is stays in a copy beside it.</source>
        <translation>%1 がほかのプログラムによって変更されました (%2)。表示されているのは変更前の内容です。「再読み込み」はファイルの内容を取り込みます。元に戻すと、今の表示に戻ります。「両方残す」は今の表示を別の名前で保存します。「上書き」は今の表示をファイルに書き戻し、今のファイルのコピーを隣に残します。</translation>
    </message>
    <message>
        <source>The file cannot be loaded as it is, and what is shown stays: %1</source>
        <translation>今のファイルは読み込めないため、表示はそのままです: %1</translation>
    </message>
    <message>
        <source>Reload</source>
        <translation>再読み込み</translation>
    </message>
    <message>
        <source>Compare...</source>
        <translation>比較...</translation>
    </message>
    <message>
        <source>Keep Both...</source>
        <translation>両方残す...</translation>
    </message>
    <message>
        <source>Overwrite</source>
        <translation>上書き</translation>
    </message>
    <message>
        <source>Save As...</source>
        <translation>名前を付けて保存...</translation>
    </message>
    <message>
        <source>Save Again</source>
        <translation>もう一度保存</translation>
    </message>
    <message>
        <source>%1 was removed or renamed by another program (%2). What is shown is nowhere else until it is saved again.</source>
        <translation>%1 はほかのプログラムによって削除されたか、名前が変更されました (%2)。表示されている内容は、もう一度保存するまでほかのどこにもありません。</translation>
    </message>
    <message>
        <source>The folder of %1 was removed or renamed by another program (%2). What is shown can be saved under another name only.</source>
        <translation>%1 のフォルダがほかのプログラムによって削除されたか、名前が変更されました (%2)。表示中の内容は別の名前でのみ保存できます。</translation>
    </message>
    <message>
        <source>%1 cannot be read any more: %2. What is shown stays; to be safe save it under another name.</source>
        <translation>%1 を読み込めなくなりました: %2。表示はそのままです。念のため別の名前で保存してください。</translation>
    </message>
    <message>
        <source>What differs is not known: the file cannot be read.</source>
        <translation>相違点は不明です: ファイルを読み取れません。</translation>
    </message>
    <message>
        <source>Changes of %1 by Another Program</source>
        <translation>ほかのプログラムによる %1 の変更</translation>
    </message>
    <message>
        <source>Shown</source>
        <translation>表示中</translation>
    </message>
    <message>
        <source>In the file</source>
        <translation>ファイル</translation>
    </message>
</context>
<context>
    <name>CKsProjectDoc</name>
    <message>
        <source>Reload</source>
        <translation>再読み込み</translation>
    </message>
    <message>
        <source>%1 was left as it is: it is in use by %2.</source>
        <translation>%1 はそのままです。%2 が使用中です。</translation>
    </message>
    <message>
        <source>%1 is in use by %2, and is not changed here.</source>
        <translation>%1 は %2 が使用中のため、ここでは変更しません。</translation>
    </message>
    <message>
        <source>%1 could not be read, and is not changed.</source>
        <translation>%1 は読み込めなかったため、変更しません。</translation>
    </message>
</context>
<context>
    <name>KsMessageBox</name>
    <message>
        <source>... and %1 more lines</source>
        <translation>... ほか %1 行</translation>
    </message>
</context>
<context>
    <name>QShortcut</name>
    <message>
        <source>Backspace</source>
        <translation>Backspace</translation>
    </message>
</context>
<context>
    <name>SyntaxError</name>
    <message>
        <source>%1 cannot be read: %2</source>
        <translation>%1 を読み込めません: %2</translation>
    </message>
    <message>
        <source>%1, line %2, column %3: expected %4, found %5</source>
        <translation>%1、%2 行 %3 文字目: %4 が必要ですが、%5 があります</translation>
    </message>
    <message>
        <source>the end of the line</source>
        <translation>行末</translation>
    </message>
    <message>
        <source>the end of the file</source>
        <translation>ファイルの終わり</translation>
    </message>
    <message>
        <source>a parameter file</source>
        <translation>パラメータファイル</translation>
    </message>
    <message>
        <source>an empty file</source>
        <translation>空のファイル</translation>
    </message>
    <message>
        <source>a file smaller than 2 GiB</source>
        <translation>2 GiB 未満のファイル</translation>
    </message>
    <message>
        <source>one of %1 bytes</source>
        <translation>%1 バイトのファイル</translation>
    </message>
    <message>
        <source>a line of at most 16 MiB</source>
        <translation>16 MiB 以下の行</translation>
    </message>
    <message>
        <source>a longer one</source>
        <translation>それより長い行</translation>
    </message>
    <message>
        <source>at most 128 sections inside one another</source>
        <translation>128 段以下のセクションの入れ子</translation>
    </message>
    <message>
        <source>one more</source>
        <translation>それより深い入れ子</translation>
    </message>
    <message>
        <source>text in UTF-8</source>
        <translation>UTF-8 のテキスト</translation>
    </message>
    <message>
        <source>a NUL character</source>
        <translation>NUL 文字</translation>
    </message>
    <message>
        <source>the byte 0x%1</source>
        <translation>バイト 0x%1</translation>
    </message>
    <message>
        <source>a section in brackets, a keyword or a comment</source>
        <translation>角括弧で囲んだセクション、キーワード、またはコメント</translation>
    </message>
    <message>
        <source>a line feed after the carriage return</source>
        <translation>復帰文字の直後の改行文字</translation>
    </message>
    <message>
        <source>a name of letters, digits, &apos;_&apos;, &apos;-&apos; and &apos;.&apos;</source>
        <translation>文字、数字、&apos;_&apos;、&apos;-&apos;、&apos;.&apos; からなる名前</translation>
    </message>
    <message>
        <source>] behind the name (names have letters, digits, &apos;_&apos;, &apos;-&apos; and &apos;.&apos; only)</source>
        <translation>名前の直後の ](名前に使えるのは文字、数字、&apos;_&apos;、&apos;-&apos;、&apos;.&apos; だけです)</translation>
    </message>
    <message>
        <source>a target in brackets, such as [Name]</source>
        <translation>[Name] のように角括弧で囲んだターゲット</translation>
    </message>
    <message>
        <source>a target in brackets, such as [Name], before any keyword</source>
        <translation>キーワードより前に、[Name] のように角括弧で囲んだターゲット</translation>
    </message>
    <message>
        <source>= behind the keyword&apos;s name</source>
        <translation>キーワード名の後の =</translation>
    </message>
    <message>
        <source>a comma or the end of the line</source>
        <translation>コンマまたは行末</translation>
    </message>
    <message>
        <source>a parameter (a number, true, false, &quot;text&quot; or &lt;file name&gt;)</source>
        <translation>パラメータ(数値、true、false、&quot;文字列&quot;、&lt;ファイル名&gt; のいずれか)</translation>
    </message>
    <message>
        <source>true or false</source>
        <translation>true または false</translation>
    </message>
    <message>
        <source>a number such as -12, 0.5 or 1e-05</source>
        <translation>-12、0.5、1e-05 のような数値</translation>
    </message>
    <message>
        <source>an integer from -2147483648 to 2147483647</source>
        <translation>-2147483648 から 2147483647 までの整数</translation>
    </message>
    <message>
        <source>a number within the range of 64-bit floats</source>
        <translation>64 ビット浮動小数点数の範囲内の数値</translation>
    </message>
    <message>
        <source>&quot; closing the string</source>
        <translation>文字列を閉じる &quot;</translation>
    </message>
    <message>
        <source>&gt; closing the file name</source>
        <translation>ファイル名を閉じる &gt;</translation>
    </message>
    <message>
        <source>one of the escapes \&quot; \\ \n \r \t \u{...}</source>
        <translation>エスケープ \&quot; \\ \n \r \t \u{...} のいずれか</translation>
    </message>
    <message>
        <source>one of the escapes \&gt; \\ \u{...}</source>
        <translation>エスケープ \&gt; \\ \u{...} のいずれか</translation>
    </message>
    <message>
        <source>\u{...} with the hexadecimal number of a character</source>
        <translation>文字の 16 進番号を入れた \u{...}</translation>
    </message>
    <message>
        <source>no control character (they are written \u{...})</source>
        <translation>制御文字以外の文字(制御文字は \u{...} と書きます)</translation>
    </message>
    <message>
        <source>a blank</source>
        <translation>空白</translation>
    </message>
    <message>
        <source>a tab</source>
        <translation>タブ</translation>
    </message>
    <message>
        <source>a carriage return</source>
        <translation>復帰文字</translation>
    </message>
    <message>
        <source>the control character U+%1</source>
        <translation>制御文字 U+%1</translation>
    </message>
    <message>
        <source>%1</source>
        <translation>%1</translation>
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
        <source>another program has changed it since it was read</source>
        <translation>読み込んだ後に別のプログラムによって変更されています</translation>
    </message>
    <message>
        <source>there is not enough memory</source>
        <translation>メモリが足りません</translation>
    </message>
    <message>
        <source>it lies on another device</source>
        <translation>別のデバイスにあります</translation>
    </message>
    <message>
        <source>the file system does not support it</source>
        <translation>ファイルシステムが対応していません</translation>
    </message>
    <message>
        <source>the system gives the error number %1</source>
        <translation>システムのエラー番号は %1 です</translation>
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
</TS>
