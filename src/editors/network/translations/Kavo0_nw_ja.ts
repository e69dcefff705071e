<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja" sourcelanguage="en_US">
    <context>
        <name>CBranchTable</name>
        <message>
            <source>Branch</source>
            <translation>河川名</translation>
        </message>
        <message>
            <source>From</source>
            <translation>始点</translation>
        </message>
        <message>
            <source>To</source>
            <translation>終点</translation>
        </message>
        <message>
            <source>Vertices</source>
            <translation>頂点数</translation>
        </message>
        <message>
            <source>Flow</source>
            <translation>流下方向</translation>
        </message>
        <message>
            <source>Checked: water flows towards increasing chainages</source>
            <translation>オン: 追加距離が増える方向に流下します</translation>
        </message>
        <message>
            <source>increasing</source>
            <translation>距離増加方向</translation>
        </message>
        <message>
            <source>decreasing</source>
            <translation>距離減少方向</translation>
        </message>
        <message>
            <source>Name of Branch</source>
            <translation>河川名の変更</translation>
        </message>
        <message>
            <source>expected a number, found &quot;%1&quot;.</source>
            <translation>数値を入力してください(入力: 「%1」)。</translation>
        </message>
        <message>
            <source>Chainage of Branch</source>
            <translation>河川の追加距離の変更</translation>
        </message>
        <message>
            <source>Flow Direction</source>
            <translation>流下方向の変更</translation>
        </message>
        <message>
            <source>Delete Branches</source>
            <translation>河川の削除</translation>
        </message>
    </context>
    <context>
        <name>CChannelTable</name>
        <message>
            <source>Chainage</source>
            <translation>追加距離</translation>
        </message>
        <message>
            <source>Radius</source>
            <translation>曲率半径</translation>
        </message>
        <message>
            <source>Width</source>
            <translation>水路幅</translation>
        </message>
        <message>
            <source>expected a number, found &quot;%1&quot;.</source>
            <translation>数値を入力してください(入力: 「%1」)。</translation>
        </message>
        <message>
            <source>there is a line at this chainage already.</source>
            <translation>この追加距離の行はすでにあります。</translation>
        </message>
        <message>
            <source>Channel</source>
            <translation>河道データの変更</translation>
        </message>
        <message>
            <source>Delete Lines</source>
            <translation>行の削除</translation>
        </message>
        <message>
            <source>Insert Line</source>
            <translation>行の挿入</translation>
        </message>
    </context>
    <context>
        <name>CImportDialog</name>
        <message>
            <source>Import Branches from %1</source>
            <translation>%1からの河川の取り込み</translation>
        </message>
        <message>
            <source>&amp;Layer:</source>
            <translation>レイヤー(&amp;L):</translation>
        </message>
        <message>
            <source>Field with the &amp;name:</source>
            <translation>河川名の属性(&amp;N):</translation>
        </message>
        <message>
            <source>Field with the &amp;first chainage [m]:</source>
            <translation>始点の追加距離 [m] の属性(&amp;F):</translation>
        </message>
        <message>
            <source>Field with the la&amp;st chainage [m]:</source>
            <translation>終点の追加距離 [m] の属性(&amp;S):</translation>
        </message>
        <message>
            <source>&amp;Import</source>
            <translation>取り込み(&amp;I)</translation>
        </message>
        <message>
            <source>(none: numbered)</source>
            <translation>(なし: 番号を付ける)</translation>
        </message>
        <message>
            <source>(none: 0)</source>
            <translation>(なし: 0)</translation>
        </message>
        <message>
            <source>(none: length of the line)</source>
            <translation>(なし: 線の長さ)</translation>
        </message>
        <message>
            <source>, the first is named &quot;%1&quot;</source>
            <translation>、最初の名称は「%1」</translation>
        </message>
        <message>
            <source>Lines: %1</source>
            <translation>線の数: %1</translation>
        </message>
        <message>
            <source>Left out, because they are no lines: %1</source>
            <translation>線でないため除外: %1</translation>
        </message>
    </context>
    <context>
        <name>CNetworkDoc</name>
        <message>
            <source>A branch needs a name.</source>
            <translation>河川名を入力してください。</translation>
        </message>
        <message>
            <source>There is a branch &quot;%1&quot; already.</source>
            <translation>河川「%1」はすでにあります。</translation>
        </message>
        <message>
            <source>The chainages of the two ends of a branch have to differ.</source>
            <translation>河川の両端の追加距離は異なる値にしてください。</translation>
        </message>
    </context>
    <context>
        <name>CNetworkMap</name>
        <message>
            <source>Map of the river network</source>
            <translation>河道網の地図</translation>
        </message>
        <message>
            <source>This network has no branches yet.</source>
            <translation>この河道網にはまだ河川がありません。</translation>
        </message>
    </context>
    <context>
        <name>CLinesTable</name>
        <message>
            <source>Line %1, %2: %3</source>
            <translation>%1行目、%2: %3</translation>
        </message>
    </context>
    <context>
        <name>CNetworkView</name>
        <message>
            <source>&amp;Channel of %1</source>
            <translation>%1の河道(&amp;C)</translation>
        </message>
        <message>
            <source>&amp;Channel</source>
            <translation>河道(&amp;C)</translation>
        </message>
        <message>
            <source>&amp;Branches</source>
            <translation>河川(&amp;B)</translation>
        </message>
        <message>
            <source>Branches of the river network</source>
            <translation>河道網の河川</translation>
        </message>
        <message>
            <source>Radius and width along the current branch</source>
            <translation>選択した河川に沿った曲率半径と水路幅</translation>
        </message>
        <message>
            <source>I&amp;mport Branches...</source>
            <translation>河川の取り込み(&amp;M)...</translation>
        </message>
        <message>
            <source>Reads lines of a GIS file as branches</source>
            <translation>GISファイルの線を河川として読み込みます</translation>
        </message>
        <message>
            <source>&amp;Insert Line</source>
            <translation>行の挿入(&amp;I)</translation>
        </message>
        <message>
            <source>Adds a line to the channel of the branch</source>
            <translation>河川の河道の表に行を追加します</translation>
        </message>
        <message>
            <source>&amp;Delete Lines</source>
            <translation>行の削除(&amp;D)</translation>
        </message>
        <message>
            <source>Deletes the selected lines of the table</source>
            <translation>表で選択した行を削除します</translation>
        </message>
        <message>
            <source>Show &amp;All</source>
            <translation>全体を表示(&amp;A)</translation>
        </message>
        <message>
            <source>Shows the whole network on the map</source>
            <translation>河道網全体を地図に表示します</translation>
        </message>
        <message>
            <source>&amp;Zoom In</source>
            <translation>拡大(&amp;Z)</translation>
        </message>
        <message>
            <source>Enlarges the map</source>
            <translation>地図を拡大します</translation>
        </message>
        <message>
            <source>Zoom &amp;Out</source>
            <translation>縮小(&amp;O)</translation>
        </message>
        <message>
            <source>Makes the map smaller</source>
            <translation>地図を縮小します</translation>
        </message>
        <message>
            <source>Import Branches</source>
            <translation>河川の取り込み</translation>
        </message>
        <message>
            <source>GIS files (%1)</source>
            <translation>GISファイル (%1)</translation>
        </message>
        <message>
            <source>All files (*)</source>
            <translation>すべてのファイル (*)</translation>
        </message>
        <message>
            <source>... and %1 more.</source>
            <translation>... ほか%1件。</translation>
        </message>
        <message>
            <source>The branches were imported:</source>
            <translation>河川を取り込みました:</translation>
        </message>
        <message>
            <source>&amp;Show in HD Parameters</source>
            <translation>HDパラメーターで表示(&amp;S)</translation>
        </message>
        <message>
            <source>&amp;Delete Location</source>
            <translation>地点の削除(&amp;D)</translation>
        </message>
        <message>
            <source>&amp;Insert Here as</source>
            <translation>ここに挿入(&amp;I)</translation>
        </message>
    </context>
    <context>
        <name>GisLines</name>
        <message>
            <source>the format is not known.</source>
            <translation>形式が不明です。</translation>
        </message>
        <message>
            <source>%1 could not be read as a GIS file: %2</source>
            <translation>%1をGISファイルとして読み込めませんでした: %2</translation>
        </message>
        <message>
            <source>%1 holds no lines (%2 features of other kinds).</source>
            <translation>%1に線がありません(その他の地物: %2)。</translation>
        </message>
        <message>
            <source>%1: the layer &quot;%2&quot; is in degrees of longitude and latitude. Distances along a branch need map coordinates in meters: project the file first.</source>
            <translation>%1: レイヤー「%2」は経緯度(度)の座標です。河川に沿った距離にはメートル単位の平面座標が必要です。先に投影変換してください。</translation>
        </message>
    </context>
    <context>
        <name>ImportBranches</name>
        <message>
            <source>The library that reads GIS files could not be loaded: %1</source>
            <translation>GISファイルを読み込むライブラリをロードできませんでした: %1</translation>
        </message>
        <message>
            <source>Branch</source>
            <translation>河川</translation>
        </message>
        <message>
            <source>&quot;%1&quot; is taken and becomes &quot;%2&quot;.</source>
            <translation>「%1」はすでにあるため「%2」とします。</translation>
        </message>
        <message>
            <source>&quot;%1&quot;: no two different chainages; it goes from 0 to its length.</source>
            <translation>「%1」: 異なる2つの追加距離がないため、0から線の長さまでとします。</translation>
        </message>
    </context>
    <context>
        <name>LocationKinds</name>
        <message>
            <source>Initial</source>
            <translation>初期条件</translation>
        </message>
        <message>
            <source>Wind</source>
            <translation>風</translation>
        </message>
        <message>
            <source>Bed resistance</source>
            <translation>河床抵抗</translation>
        </message>
        <message>
            <source>Wave</source>
            <translation>波動近似</translation>
        </message>
        <message>
            <source>Water loss</source>
            <translation>損失水量</translation>
        </message>
        <message>
            <source>Flood plain</source>
            <translation>高水敷</translation>
        </message>
        <message>
            <source>Mixing</source>
            <translation>混合</translation>
        </message>
    </context>
    <context>
        <name>MapOverlay</name>
        <message>
            <source>%1 not in this network</source>
            <translation>この河道網にない地点: %1</translation>
        </message>
    </context>
    <context>
        <name>NetworkFile</name>
        <message>
            <source>there is a branch &quot;%1&quot; already.</source>
            <translation>河川「%1」はすでにあります。</translation>
        </message>
        <message>
            <source>expected the branch's name, Name = &quot;...&quot;.</source>
            <translation>河川名 Name = &quot;...&quot; が必要です。</translation>
        </message>
        <message>
            <source>the chainages of the two ends have to differ.</source>
            <translation>両端の追加距離は異なる値でなければなりません。</translation>
        </message>
        <message>
            <source>expected true or false.</source>
            <translation>trueまたはfalseが必要です。</translation>
        </message>
        <message>
            <source>expected %1 numbers after &quot;%2 =&quot;.</source>
            <translation>「%2 =」の後に%1個の数値が必要です。</translation>
        </message>
        <message>
            <source>%1 is no river network: it has no section [%2].</source>
            <translation>%1は河道網ではありません: セクション[%2]がありません。</translation>
        </message>
    </context>
    <context>
        <name>NetworkTexts</name>
        <message>
            <source>Network</source>
            <translation>河道網</translation>
        </message>
        <message>
            <source>KVR River Network</source>
            <translation>KVR 河道網</translation>
        </message>
        <message>
            <source>KVR River Network (*.kvnw)</source>
            <translation>KVR 河道網 (*.kvnw)</translation>
        </message>
        <message>
            <source>River Network</source>
            <translation>河道網</translation>
        </message>
        <message>
            <source>KVR Network Tools</source>
            <translation>KVR 河道網ツール</translation>
        </message>
        <message>
            <source>Shows the whole network on the map
Show All</source>
            <translation>河道網全体を地図に表示します
全体を表示</translation>
        </message>
        <message>
            <source>Enlarges the map
Zoom In</source>
            <translation>地図を拡大します
拡大</translation>
        </message>
        <message>
            <source>Makes the map smaller
Zoom Out</source>
            <translation>地図を縮小します
縮小</translation>
        </message>
        <message>
            <source>Reads lines of a GIS file as branches
Import Branches</source>
            <translation>GISファイルの線を河川として読み込みます
河川の取り込み</translation>
        </message>
    </context>
    <context>
        <name>ParameterFile</name>
        <message>
            <source>%1, line %2: %3</source>
            <translation>%1、%2行目: %3</translation>
        </message>
    </context>
    <context>
        <name>CProjectDoc</name>
        <message>
            <source>%1 could not be saved.
%2</source>
            <translation>%1を保存できませんでした。
%2</translation>
        </message>
    </context>
</TS>
