<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja" sourcelanguage="en_US">
<context>
    <name>CCrossSectionDoc</name>
    <message>
        <source>BRANCH</source>
        <translation>河川</translation>
    </message>
</context>
<context>
    <name>CCrossSectionView</name>
    <message>
        <source>&amp;Points</source>
        <translation>測点(&amp;P)</translation>
    </message>
    <message>
        <source>&amp;Points of %1</source>
        <translation>%1の測点(&amp;P)</translation>
    </message>
    <message>
        <source>&amp;Cross sections</source>
        <translation>横断面(&amp;C)</translation>
    </message>
    <message>
        <source>Cross sections by branch and chainage</source>
        <translation>河川・追加距離ごとの横断面</translation>
    </message>
    <message>
        <source>Points of the current cross section</source>
        <translation>選択した横断面の測点</translation>
    </message>
    <message>
        <source>&amp;Insert Line</source>
        <translation>行の挿入(&amp;I)</translation>
    </message>
    <message>
        <source>Adds a cross section or a point below the current one</source>
        <translation>現在の行の下に横断面または測点を追加します</translation>
    </message>
    <message>
        <source>&amp;Delete Lines</source>
        <translation>行の削除(&amp;D)</translation>
    </message>
    <message>
        <source>Deletes the selected cross sections or points</source>
        <translation>選択した横断面または測点を削除します</translation>
    </message>
    <message>
        <source>Pre&amp;vious Cross Section</source>
        <translation>前の横断面(&amp;V)</translation>
    </message>
    <message>
        <source>Shows the cross section above</source>
        <translation>1つ上の横断面を表示します</translation>
    </message>
    <message>
        <source>Ne&amp;xt Cross Section</source>
        <translation>次の横断面(&amp;X)</translation>
    </message>
    <message>
        <source>Shows the cross section below</source>
        <translation>1つ下の横断面を表示します</translation>
    </message>
</context>
<context>
    <name>CSectionPlot</name>
    <message>
        <source>This cross section has no points yet. The Insert key in the table of points adds one.</source>
        <translation>この横断面にはまだ測点がありません。測点の表でInsertキーを押すと追加できます。</translation>
    </message>
    <message>
        <source>No cross section is selected.</source>
        <translation>横断面が選択されていません。</translation>
    </message>
    <message>
        <source>Topo ID %1</source>
        <translation>測量ID %1</translation>
    </message>
    <message>
        <source>Radius %1</source>
        <translation>曲率半径 %1</translation>
    </message>
    <message>
        <source>Plot of the cross section</source>
        <translation>横断図</translation>
    </message>
    <message>
        <source>%1, points: %2</source>
        <translation>%1、測点数: %2</translation>
    </message>
    <message>
        <source>Offset %1
Bed level %2</source>
        <translation>横断距離 %1
河床高 %2</translation>
    </message>
    <message>
        <source>Width %1 (not within the profile)</source>
        <translation>水面幅 %1(横断形状に収まらない)</translation>
    </message>
    <message>
        <source>Width %1</source>
        <translation>水面幅 %1</translation>
    </message>
</context>
<context>
    <name>CrossSectionTexts</name>
    <message>
        <source>Sections</source>
        <translation>横断面</translation>
    </message>
    <message>
        <source>KVR Cross Sections</source>
        <translation>KVR横断面</translation>
    </message>
    <message>
        <source>Cross Sections</source>
        <translation>横断面</translation>
    </message>
    <message>
        <source>KVR Cross Section Tools</source>
        <translation>KVR横断面ツール</translation>
    </message>
    <message>
        <source>Shows the cross section above
Previous Cross Section</source>
        <translation>1つ上の横断面を表示します
前の横断面</translation>
    </message>
    <message>
        <source>Shows the cross section below
Next Cross Section</source>
        <translation>1つ下の横断面を表示します
次の横断面</translation>
    </message>
    <message>
        <source>Adds a cross section or a point below the current one
Insert Line</source>
        <translation>現在の行の下に横断面または測点を追加します
行の挿入</translation>
    </message>
    <message>
        <source>Deletes the selected cross sections or points
Delete Lines</source>
        <translation>選択した横断面または測点を削除します
行の削除</translation>
    </message>
</context>
<context>
    <name>SectionRules</name>
    <message>
        <source>a cross section needs the name of its branch.</source>
        <translation>横断面には河川名が必要です。</translation>
    </message>
    <message>
        <source>expected a width that is not negative.</source>
        <translation>水面幅には0以上の値を指定してください。</translation>
    </message>
    <message>
        <source>expected offsets that do not decrease from point to point.</source>
        <translation>横断距離は測点の順に減少しないように指定してください。</translation>
    </message>
    <message>
        <source>there is a cross section of branch &quot;%1&quot; at chainage %2 m with the topo ID &quot;%3&quot; already.</source>
        <translation>河川「%1」の追加距離%2 m、測量ID「%3」の横断面はすでにあります。</translation>
    </message>
</context>
<context>
    <name>SectionTables</name>
    <message>
        <source>Branch</source>
        <translation>河川名</translation>
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
        <source>Topo ID</source>
        <translation>測量ID</translation>
    </message>
    <message>
        <source>Offset</source>
        <translation>横断距離</translation>
    </message>
    <message>
        <source>Bed level</source>
        <translation>河床高</translation>
    </message>
    <message>
        <source>Cut. The points are not on the clipboard; Undo brings them back.</source>
        <translation>切り取りました。測点はクリップボードに入りません。「元に戻す」で戻せます。</translation>
    </message>
</context>
</TS>
