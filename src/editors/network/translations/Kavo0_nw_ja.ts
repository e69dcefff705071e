<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja" sourcelanguage="en_US">
<context>
    <name>CImportDialog</name>
    <message>
        <source>Import Branches from %1</source>
        <translation>%1 から河川をインポート</translation>
    </message>
    <message>
        <source>&amp;Layers:</source>
        <translation>レイヤー(&amp;L):</translation>
    </message>
    <message>
        <source>Layer</source>
        <translation>レイヤー</translation>
    </message>
    <message>
        <source>Geometry</source>
        <translation>図形</translation>
    </message>
    <message>
        <source>Lines</source>
        <translation>線の数</translation>
    </message>
    <message>
        <source>Coordinate system</source>
        <translation>座標系</translation>
    </message>
    <message>
        <source>Remark</source>
        <translation>備考</translation>
    </message>
    <message>
        <source>Layers of the file</source>
        <translation>ファイルのレイヤー</translation>
    </message>
    <message>
        <source>none named</source>
        <translation>指定なし</translation>
    </message>
    <message>
        <source>cannot be taken: no lines among %1 features</source>
        <translation>取り込めません: %1 個の地物に線がありません</translation>
    </message>
    <message>
        <source>incomplete or damaged</source>
        <translation>不完全または破損</translation>
    </message>
    <message>
        <source>Field with the &amp;name:</source>
        <translation>河川名のフィールド(&amp;N):</translation>
    </message>
    <message>
        <source>Field with the &amp;first chainage [m]:</source>
        <translation>始点の追加距離のフィールド [m](&amp;F):</translation>
    </message>
    <message>
        <source>Field with the la&amp;st chainage [m]:</source>
        <translation>終点の追加距離のフィールド [m](&amp;S):</translation>
    </message>
    <message>
        <source>Lines whose &amp;parts do not meet:</source>
        <translation>部分がつながらない線(&amp;P):</translation>
    </message>
    <message>
        <source>become branches NAME-1, NAME-2, each from 0 to its length</source>
        <translation>河川 名前-1、名前-2 にする(それぞれ 0 から長さまで)</translation>
    </message>
    <message>
        <source>become branches that share the chainages of the line</source>
        <translation>線の追加距離を分け合う河川にする</translation>
    </message>
    <message>
        <source>are left out</source>
        <translation>取り込まない</translation>
    </message>
    <message>
        <source>&amp;Coordinates in the network:</source>
        <translation>河道網での座標(&amp;C):</translation>
    </message>
    <message>
        <source>EPSG code of the coordinate system</source>
        <translation>座標系の EPSG コード</translation>
    </message>
    <message>
        <source>Take lines &amp;without a name, too</source>
        <translation>名前のない線も取り込む(&amp;W)</translation>
    </message>
    <message>
        <source>&amp;Take what could be read of the damaged file</source>
        <translation>破損したファイルから読み取れた分を取り込む(&amp;T)</translation>
    </message>
    <message>
        <source>The branches of the network are in this coordinate s&amp;ystem, too</source>
        <translation>河道網の既存の河川もこの座標系である(&amp;Y)</translation>
    </message>
    <message>
        <source>What the import &amp;gives:</source>
        <translation>インポートの結果(&amp;G):</translation>
    </message>
    <message>
        <source>&amp;Import</source>
        <translation>インポート(&amp;I)</translation>
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
        <source>(none: by the length of the line)</source>
        <translation>(なし: 線の長さによる)</translation>
    </message>
    <message>
        <source>another one, by its EPSG code:</source>
        <translation>その他(EPSG コードで指定):</translation>
    </message>
    <message>
        <source>taken as the network&apos;s: %1</source>
        <translation>河道網の座標系とみなす: %1</translation>
    </message>
    <message>
        <source>as in the file, taken as meters</source>
        <translation>ファイルのまま(メートルとみなす)</translation>
    </message>
    <message>
        <source>the network&apos;s: %1</source>
        <translation>河道網の座標系: %1</translation>
    </message>
    <message>
        <source>as in the file: %1</source>
        <translation>ファイルのまま: %1</translation>
    </message>
    <message>
        <source>projected to %1</source>
        <translation>%1 に投影</translation>
    </message>
    <message>
        <source>&quot;%1&quot; is no EPSG code of a coordinate system. Expected a number, for example 25832.</source>
        <translation>「%1」は座標系の EPSG コードではありません。番号を入力してください(例: 25832)。</translation>
    </message>
    <message>
        <source>Choose a layer.</source>
        <translation>レイヤーを選択してください。</translation>
    </message>
    <message>
        <source>No line of this layer becomes a branch.</source>
        <translation>このレイヤーには河川になる線がありません。</translation>
    </message>
    <message>
        <source>The network names the coordinate system &quot;%1&quot;, which is not known here.</source>
        <translation>河道網に記された座標系「%1」は不明です。</translation>
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
    <name>CNetworkView</name>
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
    <message>
        <source>%1 holds no lines. Its layers, with their geometry and the number of features:</source>
        <translation>%1 には線がありません。レイヤーとその図形、地物の数:</translation>
    </message>
    <message>
        <source>Cha&amp;nnel of %1</source>
        <translation>%1の河道(&amp;C)</translation>
    </message>
    <message>
        <source>Cha&amp;nnel</source>
        <translation>河道(&amp;C)</translation>
    </message>
    <message>
        <source>Sho&amp;w All</source>
        <translation>全体を表示(&amp;W)</translation>
    </message>
</context>
<context>
    <name>GisGeometry</name>
    <message>
        <source>Point</source>
        <translation>点</translation>
    </message>
    <message>
        <source>Multi Point</source>
        <translation>複数の点</translation>
    </message>
    <message>
        <source>Line String</source>
        <translation>線</translation>
    </message>
    <message>
        <source>Multi Line String</source>
        <translation>複数部分の線</translation>
    </message>
    <message>
        <source>Polygon</source>
        <translation>ポリゴン</translation>
    </message>
    <message>
        <source>Multi Polygon</source>
        <translation>複数部分のポリゴン</translation>
    </message>
    <message>
        <source>Unknown (any)</source>
        <translation>任意</translation>
    </message>
    <message>
        <source>None</source>
        <translation>なし</translation>
    </message>
    <message>
        <source>Compound Curve</source>
        <translation>複合曲線</translation>
    </message>
    <message>
        <source>Multi Curve</source>
        <translation>複数部分の曲線</translation>
    </message>
    <message>
        <source>Geometry Collection</source>
        <translation>図形の集まり</translation>
    </message>
</context>
<context>
    <name>GisLines</name>
    <message>
        <source>%1 could not be read as a GIS file: %2</source>
        <translation>%1をGISファイルとして読み込めませんでした: %2</translation>
    </message>
    <message>
        <source>the format is not known.</source>
        <translation>形式が不明です。</translation>
    </message>
    <message>
        <source>%1 has no layers.</source>
        <translation>%1 にはレイヤーがありません。</translation>
    </message>
</context>
<context>
    <name>GisSystems</name>
    <message>
        <source>%1 is in degrees: distances along a branch need a map in meters.</source>
        <translation>%1 の単位は度です。河川に沿った距離にはメートル単位の地図が必要です。</translation>
    </message>
    <message>
        <source>%1 cannot be projected to %2. %3</source>
        <translation>%1 から %2 へ投影できません。%3</translation>
    </message>
</context>
<context>
    <name>ImportBranches</name>
    <message>
        <source>feature %1</source>
        <translation>地物 %1</translation>
    </message>
    <message>
        <source>&quot;%1&quot; (feature %2)</source>
        <translation>「%1」(地物 %2)</translation>
    </message>
    <message>
        <source>could not be read: %1</source>
        <translation>読み取れません: %1</translation>
    </message>
    <message>
        <source>has no geometry.</source>
        <translation>図形がありません。</translation>
    </message>
    <message>
        <source>is no line (%1).</source>
        <translation>線ではありません(%1)。</translation>
    </message>
    <message>
        <source>has no name.</source>
        <translation>名前がありません。</translation>
    </message>
    <message>
        <source>vertices without coordinates, left out: %1.</source>
        <translation>座標のない頂点を除きました: %1。</translation>
    </message>
    <message>
        <source>lies outside the area of the coordinate system.</source>
        <translation>座標系の範囲外にあります。</translation>
    </message>
    <message>
        <source>the line has no length.</source>
        <translation>線に長さがありません。</translation>
    </message>
    <message>
        <source>the line is empty.</source>
        <translation>線が空です。</translation>
    </message>
    <message>
        <source>parts outside the area of the coordinate system, left out: %1 of %2.</source>
        <translation>座標系の範囲外の部分を除きました: %2 個のうち %1 個。</translation>
    </message>
    <message>
        <source>parts without a length, left out: %1 of %2.</source>
        <translation>長さのない部分を除きました: %2 個のうち %1 個。</translation>
    </message>
    <message>
        <source>its %1 parts meet and become one branch.</source>
        <translation>%1 個の部分がつながるので 1 本の河川にします。</translation>
    </message>
    <message>
        <source>Parts that ran the other way, turned: %1.</source>
        <translation>逆向きだった部分を反転しました: %1。</translation>
    </message>
    <message>
        <source>Branch</source>
        <translation>河川</translation>
    </message>
    <message>
        <source>has no name and becomes &quot;%1&quot;.</source>
        <translation>名前がないので「%1」とします。</translation>
    </message>
    <message>
        <source>this name is taken; the branch becomes &quot;%1&quot;.</source>
        <translation>この名前は使われているので「%1」とします。</translation>
    </message>
    <message>
        <source>no two different chainages; it goes from 0 to its length, %1.</source>
        <translation>異なる 2 つの追加距離がないので、0 から長さ %1 までとします。</translation>
    </message>
    <message>
        <source>its chainages go from %1 to %2, but the line is %3 long.</source>
        <translation>追加距離は %1 から %2 ですが、線の長さは %3 です。</translation>
    </message>
    <message>
        <source>its parts do not meet: %1 pieces.</source>
        <translation>部分がつながりません: %1 個。</translation>
    </message>
    <message>
        <source>The chainages of the line are shared out among them.</source>
        <translation>線の追加距離を長さに応じて分けます。</translation>
    </message>
    <message>
        <source>Each goes from 0 to its length.</source>
        <translation>それぞれ 0 から長さまでとします。</translation>
    </message>
    <message>
        <source>its parts do not meet and become %1. %2</source>
        <translation>部分がつながらないので %1 とします。%2</translation>
    </message>
    <message>
        <source>The library that reads GIS files could not be loaded: %1</source>
        <translation>GISファイルを読み込むライブラリをロードできませんでした: %1</translation>
    </message>
    <message>
        <source>&quot;%1&quot; (%2)</source>
        <translation>「%1」(%2)</translation>
    </message>
</context>
<context>
    <name>ImportReport</name>
    <message>
        <source>The layer names no coordinate system: its numbers are taken as meters on a map.</source>
        <translation>レイヤーに座標系の指定がありません。座標値は地図上のメートルとみなします。</translation>
    </message>
    <message>
        <source>Coordinate system: %1, as in the file.</source>
        <translation>座標系: %1(ファイルのまま)。</translation>
    </message>
    <message>
        <source>Coordinate system: %1, projected from %2.</source>
        <translation>座標系: %1(%2 から投影)。</translation>
    </message>
    <message>
        <source>Lengths on this map are %1 times those on the ground</source>
        <translation>この地図上の長さは地上の %1 倍です</translation>
    </message>
    <message>
        <source> (from %1 to %2 by line)</source>
        <translation>(線により %1 から %2)</translation>
    </message>
    <message>
        <source>.</source>
        <translation>。</translation>
    </message>
    <message>
        <source>So are chainages that follow from them. Another coordinate system avoids this.</source>
        <translation>長さから求めた追加距離も同様です。別の座標系を選ぶと避けられます。</translation>
    </message>
    <message>
        <source>The file counts %1 features, but only %2 could be read.</source>
        <translation>ファイルには %1 個の地物があるはずですが、%2 個しか読み取れませんでした。</translation>
    </message>
    <message>
        <source>The file is incomplete or damaged.</source>
        <translation>ファイルが不完全か破損しています。</translation>
    </message>
    <message>
        <source>Features with errors: %1 of %2.</source>
        <translation>エラーのある地物: %2 個のうち %1 個。</translation>
    </message>
    <message>
        <source>These lines lie %1 away from the branches of the network: they may be in different coordinate systems.</source>
        <translation>これらの線は河道網の河川から %1 離れています。座標系が異なる可能性があります。</translation>
    </message>
    <message>
        <source>%1, layer &quot;%2&quot;</source>
        <translation>%1、レイヤー「%2」</translation>
    </message>
    <message>
        <source>Branches: %1, in all %2</source>
        <translation>河川: %1、合計 %2</translation>
    </message>
    <message>
        <source>Left out</source>
        <translation>取り込まないもの</translation>
    </message>
    <message>
        <source>Changed</source>
        <translation>変更したもの</translation>
    </message>
    <message>
        <source>Branches</source>
        <translation>河川</translation>
    </message>
    <message>
        <source>%1: %2 long, chainages from %3 to %4</source>
        <translation>%1: 長さ %2、追加距離 %3 から %4</translation>
    </message>
    <message>
        <source>Report of the import</source>
        <translation>インポートの報告</translation>
    </message>
    <message>
        <source>Imported Branches</source>
        <translation>インポートした河川</translation>
    </message>
    <message>
        <source>C&amp;opy</source>
        <translation>コピー(&amp;O)</translation>
    </message>
    <message>
        <source>&amp;Close</source>
        <translation>閉じる(&amp;C)</translation>
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
    <name>NetworkRules</name>
    <message>
        <source>a branch needs a name.</source>
        <translation>河川には名前が必要です。</translation>
    </message>
    <message>
        <source>there is a branch &quot;%1&quot; already.</source>
        <translation>河川「%1」はすでにあります。</translation>
    </message>
    <message>
        <source>the chainages of the two ends of a branch have to differ.</source>
        <translation>河川の両端の追加距離は異なる値でなければなりません。</translation>
    </message>
</context>
<context>
    <name>NetworkTables</name>
    <message>
        <source>There is a line at this chainage already.</source>
        <translation>この追加距離の行はすでにあります。</translation>
    </message>
    <message>
        <source>decreasing
increasing</source>
        <translation>距離減少方向
距離増加方向</translation>
    </message>
    <message>
        <source>Whether water flows towards increasing or decreasing chainages</source>
        <translation>追加距離が増える方向と減る方向のどちらに流下するか</translation>
    </message>
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
        <source>Cut. Vertices and channel are not on the clipboard; Undo brings them back.</source>
        <translation>切り取りました。頂点と河道はクリップボードに入りません。「元に戻す」で戻せます。</translation>
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
</TS>
