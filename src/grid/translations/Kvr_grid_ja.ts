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
        <source>; shorter lines leave their other cells as they were</source>
        <translation>。短い行の残りのセルは元のままです</translation>
    </message>
    <message>
        <source>a line end</source>
        <translation>改行</translation>
    </message>
    <message>
        <source>a tab</source>
        <translation>タブ</translation>
    </message>
    <message>
        <source>A text takes no characters that cannot be seen. Character %1 of this one is %2.</source>
        <translation>文字列には目に見えない文字を入力できません。この文字列の %1 文字目は%2です。</translation>
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
        <source>Insert Line</source>
        <translation>行の挿入</translation>
    </message>
    <message>
        <source>Copy, Then Insert Line</source>
        <translation>コピーして行を挿入</translation>
    </message>
    <message>
        <source>Paste, Then Insert Line</source>
        <translation>貼り付けて行を挿入</translation>
    </message>
    <message>
        <source>Delete Selected Lines</source>
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
        <source>Line %1 is what is searched, but hidden by the filter. Show it?</source>
        <translation>%1 行目が該当しますが、絞り込みで隠れています。表示しますか?</translation>
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
    <message>
        <source>Interpolate along the chainage</source>
        <translation>追加距離に沿って補間</translation>
    </message>
    <message>
        <source>Fill Dow&amp;n</source>
        <translation>下方向へコピー(&amp;N)</translation>
    </message>
    <message>
        <source>Fill with a Se&amp;ries...</source>
        <translation>連続データで埋める(&amp;R)...</translation>
    </message>
    <message>
        <source>Inter&amp;polate...</source>
        <translation>補間(&amp;P)...</translation>
    </message>
    <message>
        <source>Calc&amp;ulate...</source>
        <translation>計算(&amp;U)...</translation>
    </message>
    <message>
        <source>1 cell changed</source>
        <translation>1 個のセルを変更しました</translation>
    </message>
    <message>
        <source>%1 cells changed</source>
        <translation>%1 個のセルを変更しました</translation>
    </message>
    <message>
        <source>1 stays as it was</source>
        <translation>1 個は元のままです</translation>
    </message>
    <message>
        <source>%1 stay as they were</source>
        <translation>%1 個は元のままです</translation>
    </message>
    <message>
        <source>Line</source>
        <translation>行</translation>
    </message>
    <message>
        <source>Column</source>
        <translation>列</translation>
    </message>
    <message>
        <source>Now</source>
        <translation>現在</translation>
    </message>
    <message>
        <source>Then</source>
        <translation>変更後</translation>
    </message>
    <message>
        <source>First results</source>
        <translation>最初の結果</translation>
    </message>
    <message>
        <source>These stay as they are:</source>
        <translation>次のセルは変わりません:</translation>
    </message>
    <message>
        <source>Reason</source>
        <translation>理由</translation>
    </message>
    <message>
        <source>No cell would change.</source>
        <translation>変わるセルはありません。</translation>
    </message>
    <message>
        <source>1 cell changes:</source>
        <translation>1 個のセルが変わります:</translation>
    </message>
    <message>
        <source>%1 cells change; the first of them:</source>
        <translation>%1 個のセルが変わります。最初のもの:</translation>
    </message>
    <message>
        <source>1 cell stays as it is:</source>
        <translation>1 個のセルは変わりません:</translation>
    </message>
    <message>
        <source>%1 cells stay as they are; the first of them:</source>
        <translation>%1 個のセルは変わりません。最初のもの:</translation>
    </message>
    <message>
        <source>Formula</source>
        <translation>式</translation>
    </message>
    <message>
        <source>&amp;Formula:</source>
        <translation>式(&amp;F):</translation>
    </message>
    <message>
        <source>&quot;value&quot; is the number of the cell itself. Numbers are in the units shown. Other columns of the line: %1; in every language: %2. Functions: min, max, abs, sqrt, rint, ln, log10, exp, sin, ...</source>
        <translation>「value」はセル自身の数値です。数値は表示中の単位です。同じ行のほかの列: %1 (どの言語でも: %2)。関数: min, max, abs, sqrt, rint, ln, log10, exp, sin など</translation>
    </message>
    <message>
        <source>Step</source>
        <translation>増分</translation>
    </message>
    <message>
        <source>&amp;Step from line to line:</source>
        <translation>行ごとの増分(&amp;S):</translation>
    </message>
    <message>
        <source>Between the &amp;first and the last selected line of each branch</source>
        <translation>各河川の選択した最初の行と最後の行の間(&amp;F)</translation>
    </message>
    <message>
        <source>Between the lines of the branch that are &amp;not selected</source>
        <translation>選択していない同じ河川の行の間(&amp;N)</translation>
    </message>
    <message>
        <source>&amp;Also beyond the last known values (extrapolate)</source>
        <translation>既知の値の外側も(外挿)(&amp;A)</translation>
    </message>
    <message>
        <source>The result is no number.</source>
        <translation>結果が数値になりません。</translation>
    </message>
    <message>
        <source>The result is no integer.</source>
        <translation>結果が整数になりません。</translation>
    </message>
    <message>
        <source>Line %1: %2</source>
        <translation>%1 行目: %2</translation>
    </message>
    <message>
        <source>The cell is empty.</source>
        <translation>セルが空です。</translation>
    </message>
    <message>
        <source>The line has no branch or no chainage.</source>
        <translation>行に河川名または追加距離がありません。</translation>
    </message>
    <message>
        <source>There is no known value on both sides of it.</source>
        <translation>両側に既知の値がありません。</translation>
    </message>
    <message>
        <source>A cell that the formula names is empty.</source>
        <translation>式で使うセルが空です。</translation>
    </message>
    <message>
        <source>Sort As&amp;cending</source>
        <translation>昇順に並べ替え(&amp;C)</translation>
    </message>
    <message>
        <source>Sort D&amp;escending</source>
        <translation>降順に並べ替え(&amp;E)</translation>
    </message>
    <message>
        <source>Sort by &amp;Branch and Chainage</source>
        <translation>河川名と追加距離で並べ替え(&amp;B)</translation>
    </message>
    <message>
        <source>Order of the &amp;File</source>
        <translation>ファイルの順序(&amp;F)</translation>
    </message>
    <message>
        <source>Ma&amp;ke This the Order of the File</source>
        <translation>この順序をファイルの順序にする(&amp;K)</translation>
    </message>
    <message>
        <source>Fil&amp;ter</source>
        <translation>絞り込み(&amp;T)</translation>
    </message>
    <message>
        <source>Show Ever&amp;y Line</source>
        <translation>すべての行を表示(&amp;Y)</translation>
    </message>
    <message>
        <source>Sort and Filter Afres&amp;h</source>
        <translation>並べ替えと絞り込みをやり直す(&amp;H)</translation>
    </message>
    <message>
        <source>Sort by the current column, smallest first</source>
        <translation>現在の列で昇順に並べ替え</translation>
    </message>
    <message>
        <source>Sort by the current column, largest first</source>
        <translation>現在の列で降順に並べ替え</translation>
    </message>
    <message>
        <source>Filter the lines</source>
        <translation>行の絞り込み</translation>
    </message>
    <message>
        <source>Sorting of lines</source>
        <translation>行の並べ替え</translation>
    </message>
    <message>
        <source>%1 of %2 shown</source>
        <translation>%2 行中 %1 行を表示</translation>
    </message>
    <message>
        <source>Filter of %1</source>
        <translation>%1 の絞り込み</translation>
    </message>
    <message>
        <source>Filter</source>
        <translation>絞り込み</translation>
    </message>
    <message>
        <source>Text that the cells contain; =text for the whole cell, &quot;&quot; for empty ones. Alt+Down shows what there is.</source>
        <translation>セルに含まれる文字列。=文字列 はセル全体、&quot;&quot; は空のセル。Alt+↓ で候補を表示します。</translation>
    </message>
    <message>
        <source>12.5, &gt;5, &lt;=3, 2..7, =4, !=4, &quot;&quot; for empty cells</source>
        <translation>12.5、&gt;5、&lt;=3、2..7、=4、!=4、空のセルは &quot;&quot;</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no condition for numbers. Possible are 5, =5, !=5, &gt;5, &gt;=5, &lt;5, &lt;=5, 2..7 and &quot;&quot; for empty cells.</source>
        <translation>「%1」は数値の条件ではありません。5、=5、!=5、&gt;5、&gt;=5、&lt;5、&lt;=5、2..7、空のセルには &quot;&quot; を使えます。</translation>
    </message>
    <message>
        <source>All</source>
        <translation>すべて</translation>
    </message>
    <message>
        <source>(empty)</source>
        <translation>(空)</translation>
    </message>
    <message>
        <source>No line passes the filter.</source>
        <translation>絞り込みに該当する行がありません。</translation>
    </message>
    <message>
        <source>Only what stands together can be selected: click where it begins and, with Shift, where it ends.</source>
        <translation>選択できるのは連続した範囲だけです。先頭をクリックし、末尾を Shift を押しながらクリックしてください。</translation>
    </message>
    <message>
        <source>Line %1 does not pass the filter; it is shown until the filter changes.</source>
        <translation>%1 行目は絞り込みに該当しませんが、絞り込みを変更するまで表示します。</translation>
    </message>
    <message>
        <source>%1 cells selected</source>
        <translation>%1 セルを選択</translation>
    </message>
    <message>
        <source>%1: sum %2, mean %3, min %4, max %5</source>
        <translation>%1: 合計 %2、平均 %3、最小 %4、最大 %5</translation>
    </message>
    <message>
        <source>Range: %1</source>
        <translation>範囲: %1</translation>
    </message>
    <message>
        <source>New lines: %1, the global value</source>
        <translation>新しい行: %1 (全体値)</translation>
    </message>
    <message>
        <source>New lines: %1</source>
        <translation>新しい行: %1</translation>
    </message>
    <message>
        <source>In the file: %1</source>
        <translation>ファイル内の名前: %1</translation>
    </message>
    <message>
        <source>Branch</source>
        <translation>河川名</translation>
    </message>
    <message>
        <source>&amp;Branch:</source>
        <translation>河川名(&amp;B):</translation>
    </message>
    <message>
        <source>&amp;From chainage:</source>
        <translation>始点の追加距離(&amp;F):</translation>
    </message>
    <message>
        <source>From chainage</source>
        <translation>始点の追加距離</translation>
    </message>
    <message>
        <source>&amp;To chainage:</source>
        <translation>終点の追加距離(&amp;T):</translation>
    </message>
    <message>
        <source>To chainage</source>
        <translation>終点の追加距離</translation>
    </message>
    <message>
        <source>At &amp;even distances</source>
        <translation>一定の間隔で(&amp;E)</translation>
    </message>
    <message>
        <source>&amp;Distance:</source>
        <translation>間隔(&amp;D):</translation>
    </message>
    <message>
        <source>Distance</source>
        <translation>間隔</translation>
    </message>
    <message>
        <source>At each &amp;cross section between them</source>
        <translation>区間内の各横断面に(&amp;C)</translation>
    </message>
    <message>
        <source>No cross sections are known: none are open in the project.</source>
        <translation>横断面がありません。プロジェクトで開かれていません。</translation>
    </message>
    <message>
        <source>No cross sections of this branch are known.</source>
        <translation>この河川の横断面がありません。</translation>
    </message>
    <message>
        <source>Which branch?</source>
        <translation>河川名を指定してください。</translation>
    </message>
    <message>
        <source>%1 takes a number.</source>
        <translation>%1には数値を入力してください。</translation>
    </message>
    <message>
        <source>The reach ends before it begins.</source>
        <translation>終点が始点より前にあります。</translation>
    </message>
    <message>
        <source>No cross section is between them.</source>
        <translation>区間内に横断面がありません。</translation>
    </message>
    <message>
        <source>%1 takes a number greater than 0.</source>
        <translation>%1には 0 より大きい数値を入力してください。</translation>
    </message>
    <message>
        <source>These would be more than %1 lines.</source>
        <translation>%1 行を超えます。</translation>
    </message>
    <message>
        <source>1 line:</source>
        <translation>1 行:</translation>
    </message>
    <message>
        <source>%1 lines:</source>
        <translation>%1 行:</translation>
    </message>
    <message>
        <source>1 is there already and stays as it is.</source>
        <translation>1 行は既にあり、そのまま残ります。</translation>
    </message>
    <message>
        <source>%1 are there already and stay as they are.</source>
        <translation>%1 行は既にあり、そのまま残ります。</translation>
    </message>
    <message>
        <source>Nothing was inserted. %1</source>
        <translation>挿入されませんでした。%1</translation>
    </message>
    <message>
        <source>%1 lines inserted</source>
        <translation>%1 行を挿入しました</translation>
    </message>
    <message>
        <source>1 was there</source>
        <translation>1 行は既にありました</translation>
    </message>
    <message>
        <source>%1 were there</source>
        <translation>%1 行は既にありました</translation>
    </message>
    <message>
        <source>1 cell cut</source>
        <translation>1 個のセルを切り取りました</translation>
    </message>
    <message>
        <source>%1 cells cut</source>
        <translation>%1 個のセルを切り取りました</translation>
    </message>
    <message>
        <source>1 cell cleared</source>
        <translation>1 個のセルをクリアしました</translation>
    </message>
    <message>
        <source>%1 cells cleared</source>
        <translation>%1 個のセルをクリアしました</translation>
    </message>
    <message>
        <source>Clear the Cell</source>
        <translation>セルのクリア</translation>
    </message>
    <message>
        <source>Clear %1 Cells</source>
        <translation>%1 個のセルのクリア</translation>
    </message>
    <message>
        <source>&amp;Delete the Line</source>
        <translation>行の削除(&amp;D)</translation>
    </message>
    <message>
        <source>&amp;Delete %1 Lines</source>
        <translation>%1 行の削除(&amp;D)</translation>
    </message>
    <message>
        <source>Delete takes away lines that are selected by their numbers. %1 clears cells.</source>
        <translation>Delete は行番号で選択した行を削除します。セルのクリアは %1 です。</translation>
    </message>
    <message>
        <source>Insert Line Above</source>
        <translation>上に行を挿入</translation>
    </message>
    <message>
        <source>Insert Line Below</source>
        <translation>下に行を挿入</translation>
    </message>
    <message>
        <source>Duplicate Lines</source>
        <translation>行の複製</translation>
    </message>
    <message>
        <source>Duplicate the selected lines, or the current one</source>
        <translation>選択した行または現在の行を複製</translation>
    </message>
    <message>
        <source>Move Lines Up</source>
        <translation>行を上へ移動</translation>
    </message>
    <message>
        <source>Move the selected lines, or the current one, up in the file</source>
        <translation>選択した行または現在の行をファイル内で上へ移動</translation>
    </message>
    <message>
        <source>Move Lines Down</source>
        <translation>行を下へ移動</translation>
    </message>
    <message>
        <source>Move the selected lines, or the current one, down in the file</source>
        <translation>選択した行または現在の行をファイル内で下へ移動</translation>
    </message>
    <message>
        <source>Insert Lines Along a Branch...</source>
        <translation>河川に沿って行を挿入...</translation>
    </message>
    <message>
        <source>Cut</source>
        <translation>切り取り</translation>
    </message>
    <message>
        <source>Copy, then delete the lines that are selected by their numbers, or clear the cells</source>
        <translation>コピーして、行番号で選択した行を削除、またはセルをクリア</translation>
    </message>
    <message>
        <source>Clear Cells</source>
        <translation>セルのクリア</translation>
    </message>
    <message>
        <source>Clear the selected cells</source>
        <translation>選択したセルをクリア</translation>
    </message>
    <message>
        <source>Fit the Width</source>
        <translation>列の幅を合わせる</translation>
    </message>
    <message>
        <source>Menu of the cell</source>
        <translation>セルのメニュー</translation>
    </message>
    <message>
        <source>Duplication of lines</source>
        <translation>行の複製</translation>
    </message>
    <message>
        <source>Line duplicated</source>
        <translation>行を複製しました</translation>
    </message>
    <message>
        <source>%1 lines duplicated</source>
        <translation>%1 行を複製しました</translation>
    </message>
    <message>
        <source>Move of a line</source>
        <translation>行の移動</translation>
    </message>
    <message>
        <source>Move of lines</source>
        <translation>行の移動</translation>
    </message>
    <message>
        <source>Line moved</source>
        <translation>行を移動しました</translation>
    </message>
    <message>
        <source>%1 lines moved</source>
        <translation>%1 行を移動しました</translation>
    </message>
    <message>
        <source>Nothing was duplicated. %1</source>
        <translation>複製されませんでした。%1</translation>
    </message>
    <message>
        <source>Lines are moved in the order of the file. These are sorted: Lines &gt; %1 shows them as they stand in the file.</source>
        <translation>行はファイルの順序で移動します。現在は並べ替えられています。「行」&gt;「%1」でファイルの順序に戻せます。</translation>
    </message>
    <message>
        <source>Nothing was moved. %1</source>
        <translation>移動されませんでした。%1</translation>
    </message>
    <message>
        <source>Default: %1</source>
        <translation>既定値: %1</translation>
    </message>
    <message>
        <source>Reset to Global Value</source>
        <translation>全体値に戻す</translation>
    </message>
    <message>
        <source>Give the selected cells the global value of their column</source>
        <translation>選択したセルをその列の全体値にします</translation>
    </message>
    <message>
        <source>Find and Replace...</source>
        <translation>検索と置換...</translation>
    </message>
    <message>
        <source>Find texts, numbers or ranges of numbers, and replace them</source>
        <translation>文字列、数値、数値の範囲を検索して置換します</translation>
    </message>
    <message>
        <source>Fi&amp;nd:</source>
        <translation>検索(&amp;N):</translation>
    </message>
    <message>
        <source>Find</source>
        <translation>検索</translation>
    </message>
    <message>
        <source>Re&amp;place with:</source>
        <translation>置換後(&amp;P):</translation>
    </message>
    <message>
        <source>Replace with</source>
        <translation>置換後</translation>
    </message>
    <message>
        <source>Texts; of numbers 5, &gt;3, &lt;=3 or 2..5; &quot;&quot; for empty cells. Numbers are in the units shown, and may become a formula: =value*1.1</source>
        <translation>文字列。数値は 5、&gt;3、&lt;=3、2..5。空のセルは &quot;&quot;。数値は表示中の単位で、=value*1.1 のような数式に置換できます</translation>
    </message>
    <message>
        <source>&amp;Whole cells only</source>
        <translation>セル全体が一致するものだけ(&amp;W)</translation>
    </message>
    <message>
        <source>&amp;Capitals and small letters differ</source>
        <translation>大文字と小文字を区別する(&amp;C)</translation>
    </message>
    <message>
        <source>In the c&amp;olumn &quot;%1&quot;</source>
        <translation>列「%1」内(&amp;O)</translation>
    </message>
    <message>
        <source>On this pa&amp;ge</source>
        <translation>このページ内(&amp;G)</translation>
    </message>
    <message>
        <source>In this &amp;table</source>
        <translation>この表内(&amp;T)</translation>
    </message>
    <message>
        <source>In the whole &amp;document</source>
        <translation>文書全体(&amp;D)</translation>
    </message>
    <message>
        <source>Cells found</source>
        <translation>見つかったセル</translation>
    </message>
    <message>
        <source>Page</source>
        <translation>ページ</translation>
    </message>
    <message>
        <source>&amp;Find Next</source>
        <translation>次を検索(&amp;F)</translation>
    </message>
    <message>
        <source>&amp;Replace</source>
        <translation>置換(&amp;R)</translation>
    </message>
    <message>
        <source>Replace &amp;All</source>
        <translation>すべて置換(&amp;A)</translation>
    </message>
    <message>
        <source>stays: %1</source>
        <translation>変更なし: %1</translation>
    </message>
    <message>
        <source>Nothing found.</source>
        <translation>見つかりません。</translation>
    </message>
    <message>
        <source>1 cell found</source>
        <translation>1 個のセルが見つかりました</translation>
    </message>
    <message>
        <source>%1 cells found</source>
        <translation>%1 個のセルが見つかりました</translation>
    </message>
    <message>
        <source>1 would change.</source>
        <translation>1 個が変わります。</translation>
    </message>
    <message>
        <source>%1 would change.</source>
        <translation>%1 個が変わります。</translation>
    </message>
    <message>
        <source>Lines that a filter hides are left alone.</source>
        <translation>絞り込みで隠れている行は対象外です。</translation>
    </message>
    <message>
        <source>; the line with the headers was left out</source>
        <translation>（見出しの行は除きました）</translation>
    </message>
    <message>
        <source>Copy with Headers</source>
        <translation>見出し付きでコピー</translation>
    </message>
    <message>
        <source>Copy the selected cells below the headers and units of their columns</source>
        <translation>選択したセルを、列の見出しと単位の行を付けてコピーします</translation>
    </message>
    <message>
        <source>The global value</source>
        <translation>全体値</translation>
    </message>
    <message>
        <source>Sort and Filter</source>
        <translation>並べ替えと絞り込み</translation>
    </message>
    <message>
        <source>Paste with Preview...</source>
        <translation>確認して貼り付け...</translation>
    </message>
    <message>
        <source>Show how the copied texts are understood, and where they would go, before they do</source>
        <translation>コピーした文字列の解釈と貼り付け先を、貼り付ける前に表示します</translation>
    </message>
    <message>
        <source>Tab</source>
        <translation>タブ</translation>
    </message>
    <message>
        <source>Semicolon</source>
        <translation>セミコロン</translation>
    </message>
    <message>
        <source>Comma</source>
        <translation>コンマ</translation>
    </message>
    <message>
        <source>Vertical bar</source>
        <translation>縦棒</translation>
    </message>
    <message>
        <source>Column %1</source>
        <translation>列 %1</translation>
    </message>
    <message>
        <source>Cells are separated &amp;by:</source>
        <translation>セルの区切り(&amp;B):</translation>
    </message>
    <message>
        <source>&amp;Numbers:</source>
        <translation>数値(&amp;N):</translation>
    </message>
    <message>
        <source>With a decimal point: 1,234.5</source>
        <translation>小数点はピリオド: 1,234.5</translation>
    </message>
    <message>
        <source>With a decimal comma: 1.234,5</source>
        <translation>小数点はコンマ: 1.234,5</translation>
    </message>
    <message>
        <source>Lines &amp;go:</source>
        <translation>行の貼り付け先(&amp;G):</translation>
    </message>
    <message>
        <source>Into the table from line %1 on</source>
        <translation>表の %1 行目から</translation>
    </message>
    <message>
        <source>Behind the last line</source>
        <translation>最後の行の後</translation>
    </message>
    <message>
        <source>To the lines of the same branch and chainage, others behind the last line</source>
        <translation>河川名と距離が同じ行、なければ最後の行の後</translation>
    </message>
    <message>
        <source>The first line na&amp;mes the columns</source>
        <translation>1 行目は列名(&amp;M)</translation>
    </message>
    <message>
        <source>Columns</source>
        <translation>列</translation>
    </message>
    <message>
        <source>Copied</source>
        <translation>コピー元</translation>
    </message>
    <message>
        <source>Goes to</source>
        <translation>貼り付け先</translation>
    </message>
    <message>
        <source>Unit</source>
        <translation>単位</translation>
    </message>
    <message>
        <source>First text</source>
        <translation>最初の文字列</translation>
    </message>
    <message>
        <source>As it is understood</source>
        <translation>解釈の結果</translation>
    </message>
    <message>
        <source>What does not fit can be mended here:</source>
        <translation>受け入れられないもの (ここで直せます):</translation>
    </message>
    <message>
        <source>What does not fit</source>
        <translation>受け入れられないもの</translation>
    </message>
    <message>
        <source>(left out)</source>
        <translation>(除外)</translation>
    </message>
    <message>
        <source>Unit of column %1</source>
        <translation>列 %1 の単位</translation>
    </message>
    <message>
        <source>1 line was copied.</source>
        <translation>1 行をコピーしました。</translation>
    </message>
    <message>
        <source>%1 lines were copied.</source>
        <translation>%1 行をコピーしました。</translation>
    </message>
    <message>
        <source>1 line is new.</source>
        <translation>新しい行は 1 行です。</translation>
    </message>
    <message>
        <source>%1 lines are new.</source>
        <translation>新しい行は %1 行です。</translation>
    </message>
    <message>
        <source>Copied: %1</source>
        <translation>コピー元: %1</translation>
    </message>
    <message>
        <source>new</source>
        <translation>新規</translation>
    </message>
    <message>
        <source>Copied line</source>
        <translation>コピー元の行</translation>
    </message>
    <message>
        <source>Text</source>
        <translation>文字列</translation>
    </message>
    <message>
        <source>Two columns go to &quot;%1&quot;.</source>
        <translation>2 つの列の貼り付け先が &quot;%1&quot; です。</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no unit of &quot;%2&quot;. Possible are %3.</source>
        <translation>&quot;%1&quot; は &quot;%2&quot; の単位ではありません。使えるのは %3 です。</translation>
    </message>
    <message>
        <source>No column goes anywhere.</source>
        <translation>貼り付け先のある列がありません。</translation>
    </message>
    <message>
        <source>Which line is which is told by &quot;%1&quot; and &quot;%2&quot;: columns have to go there.</source>
        <translation>行は &quot;%1&quot; と &quot;%2&quot; で対応させます。両方に貼り付ける列が必要です。</translation>
    </message>
    <message>
        <source>The table takes no new lines.</source>
        <translation>この表に新しい行は追加できません。</translation>
    </message>
    <message>
        <source>Lines cannot be added to this table.</source>
        <translation>この表に行は追加できません。</translation>
    </message>
    <message>
        <source>Nothing was replaced. %1</source>
        <translation>置換しませんでした。%1</translation>
    </message>
    <message>
        <source>There is no value above to fill it with.</source>
        <translation>上の行に入れる値がありません。</translation>
    </message>
    <message>
        <source>No line was inserted. %1</source>
        <translation>行を挿入しませんでした。%1</translation>
    </message>
    <message>
        <source>1 cell reverted</source>
        <translation>1 個のセルを戻しました</translation>
    </message>
    <message>
        <source>%1 cells reverted</source>
        <translation>%1 個のセルを戻しました</translation>
    </message>
    <message>
        <source>The line is new since the last save.</source>
        <translation>この行は前回の保存より後に追加されました。</translation>
    </message>
    <message>
        <source>What the line was at the last save is not known.</source>
        <translation>前回の保存時にこの行が何であったかは不明です。</translation>
    </message>
    <message>
        <source>Revert to Saved Values</source>
        <translation>保存時の値に戻す</translation>
    </message>
    <message>
        <source>Give the selected cells the values that they had at the last save</source>
        <translation>選択したセルを前回の保存時の値に戻します</translation>
    </message>
    <message>
        <source>Changed since the last save</source>
        <translation>前回の保存より後に変更</translation>
    </message>
    <message>
        <source>New since the last save</source>
        <translation>前回の保存より後に追加</translation>
    </message>
    <message>
        <source>%1: %2</source>
        <translation>%1: %2</translation>
    </message>
    <message>
        <source>was off at the last save</source>
        <translation>前回の保存時はオフ</translation>
    </message>
    <message>
        <source>was on at the last save</source>
        <translation>前回の保存時はオン</translation>
    </message>
    <message>
        <source>was empty at the last save</source>
        <translation>前回の保存時は空</translation>
    </message>
    <message>
        <source>was %1 at the last save</source>
        <translation>前回の保存時は %1</translation>
    </message>
    <message>
        <source>1 line is hidden by the filter</source>
        <translation>1 行はフィルターで非表示</translation>
    </message>
    <message>
        <source>%1 lines are hidden by the filter</source>
        <translation>%1 行はフィルターで非表示</translation>
    </message>
    <message>
        <source>1 line is hidden by the filter.</source>
        <translation>フィルターで非表示の行が 1 行あります。</translation>
    </message>
    <message>
        <source>%1 lines are hidden by the filter.</source>
        <translation>フィルターで非表示の行が %1 行あります。</translation>
    </message>
    <message>
        <source>Only lines can be reverted; global values can be undone.</source>
        <translation>保存時の値に戻せるのは行だけです。全体値は元に戻す操作で戻せます。</translation>
    </message>
    <message>
        <source>left out: %1</source>
        <translation>除外: %1</translation>
    </message>
    <message>
        <source>1 line</source>
        <translation>1 行</translation>
    </message>
    <message>
        <source>%1 lines</source>
        <translation>%1 行</translation>
    </message>
    <message>
        <source>1 cell</source>
        <translation>1 個のセル</translation>
    </message>
    <message>
        <source>%1 cells</source>
        <translation>%1 個のセル</translation>
    </message>
    <message>
        <source>The line below has their &amp;units</source>
        <translation>次の行は単位(&amp;U)</translation>
    </message>
    <message>
        <source>1 blank line is left out.</source>
        <translation>空白行 1 行は除外されます。</translation>
    </message>
    <message>
        <source>%1 blank lines are left out.</source>
        <translation>空白行 %1 行は除外されます。</translation>
    </message>
    <message>
        <source>&amp;Leave out what does not fit: %1</source>
        <translation>受け入れられないものを除外(&amp;L): %1</translation>
    </message>
    <message>
        <source>1 blank line</source>
        <translation>空白行 1 行</translation>
    </message>
    <message>
        <source>%1 blank lines</source>
        <translation>空白行 %1 行</translation>
    </message>
    <message>
        <source>It may not fit with lines that are left out.</source>
        <translation>除外した行とは合わない可能性があります。</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no unit of &quot;%2&quot;, which has none.</source>
        <translation>「%2」には単位がなく、「%1」は使えません。</translation>
    </message>
    <message>
        <source>The line does not tell its place.</source>
        <translation>行に場所が示されていません。</translation>
    </message>
    <message>
        <source>The copied lines %1 have the same place.</source>
        <translation>コピーした %1 行目は同じ場所です。</translation>
    </message>
    <message>
        <source>A line needs the name of its branch.</source>
        <translation>行には河川名が必要です。</translation>
    </message>
    <message>
        <source>Nothing stands above the first line that could be filled down.</source>
        <translation>最初の行の上には、コピーする値がありません。</translation>
    </message>
    <message>
        <source>Numbers in two lines or more have to be selected first.</source>
        <translation>先に2行以上の数値を選択してください。</translation>
    </message>
    <message>
        <source>There is no number among the selected cells.</source>
        <translation>選択したセルに数値がありません。</translation>
    </message>
    <message>
        <source>No global value stands for this column.</source>
        <translation>この列には全体値がありません。</translation>
    </message>
    <message>
        <source>Nothing here differs from the last save.</source>
        <translation>前回の保存と異なるところはありません。</translation>
    </message>
    <message>
        <source>The lines of this table stand in an order of their own.</source>
        <translation>この表の行の順序は決まっています。</translation>
    </message>
    <message>
        <source>The first line cannot go up.</source>
        <translation>最初の行は上に移動できません。</translation>
    </message>
    <message>
        <source>The last line cannot go down.</source>
        <translation>最後の行は下に移動できません。</translation>
    </message>
    <message>
        <source>The table ends with line %1 and takes no new ones.</source>
        <translation>この表は %1 行目までで、行を追加できません。</translation>
    </message>
    <message>
        <source>Of numbers a condition is 5, &gt;3, &lt;=3, 2..7, =4 or !=4.</source>
        <translation>数値の条件は 5、&gt;3、&lt;=3、2..7、=4、!=4 のように入力します。</translation>
    </message>
</context>
</TS>
