<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja" sourcelanguage="en_US">
<context>
    <name>Plots</name>
    <message>
        <source>Plots cannot be shown: the library %1 that draws them could not be loaded. %2</source>
        <translation>図を表示できません。描画ライブラリ %1 を読み込めませんでした。%2</translation>
    </message>
</context>
<context>
    <name>ProfileTexts</name>
    <message>
        <source>Left bank</source>
        <translation>左岸</translation>
    </message>
    <message>
        <source>Right bank</source>
        <translation>右岸</translation>
    </message>
    <message>
        <source>Bed</source>
        <translation>河床</translation>
    </message>
    <message>
        <source>Chainage</source>
        <translation>追加距離</translation>
    </message>
    <message>
        <source>Levels</source>
        <translation>水位・標高</translation>
    </message>
    <message>
        <source>Level</source>
        <translation>水位・標高</translation>
    </message>
    <message>
        <source>Reaches</source>
        <translation>区間</translation>
    </message>
    <message>
        <source>%1, global</source>
        <translation>%1 (全体値)</translation>
    </message>
    <message>
        <source>The point stays where it was: %1</source>
        <translation>点は元の位置のままです: %1</translation>
    </message>
    <message>
        <source>Dragging of a point</source>
        <translation>点の移動</translation>
    </message>
    <message>
        <source>Dragging along the branch</source>
        <translation>河川に沿った移動</translation>
    </message>
    <message>
        <source>No line was added: %1</source>
        <translation>行は追加されませんでした: %1</translation>
    </message>
    <message>
        <source>the table takes no further lines</source>
        <translation>この表にはこれ以上行を追加できません</translation>
    </message>
    <message>
        <source>there is no cross section on both sides that would tell the depth</source>
        <translation>水深を求めるための横断面が両側にありません</translation>
    </message>
    <message>
        <source>%1 is expected</source>
        <translation>%1 の値を入力してください</translation>
    </message>
    <message>
        <source>Insertion of a line</source>
        <translation>行の挿入</translation>
    </message>
    <message>
        <source>Line inserted</source>
        <translation>行を挿入しました</translation>
    </message>
    <message>
        <source>Branch of the long profile</source>
        <translation>縦断図の河川</translation>
    </message>
    <message>
        <source>The branch that is shown; it follows the current line</source>
        <translation>表示する河川。現在行に合わせて切り替わります</translation>
    </message>
    <message>
        <source>Tracks</source>
        <translation>表示項目</translation>
    </message>
    <message>
        <source>Chooses what is shown beside the page in front</source>
        <translation>表示中のページのほかに表示する項目を選びます</translation>
    </message>
    <message>
        <source>Show All</source>
        <translation>全体表示</translation>
    </message>
    <message>
        <source>Shows the whole branch (Home)</source>
        <translation>河川の全体を表示します (Home)</translation>
    </message>
    <message>
        <source>Zoom In</source>
        <translation>拡大</translation>
    </message>
    <message>
        <source>Shows less of the branch in more detail (+)</source>
        <translation>範囲を狭めて詳しく表示します (+)</translation>
    </message>
    <message>
        <source>Zoom Out</source>
        <translation>縮小</translation>
    </message>
    <message>
        <source>Shows more of the branch (-)</source>
        <translation>範囲を広げて表示します (-)</translation>
    </message>
    <message>
        <source>Copy</source>
        <translation>コピー</translation>
    </message>
    <message>
        <source>Copies the picture, and the values as a table</source>
        <translation>図と、値の表をコピーします</translation>
    </message>
    <message>
        <source>Export...</source>
        <translation>エクスポート...</translation>
    </message>
    <message>
        <source>Saves the picture as PNG, SVG or PDF</source>
        <translation>図を PNG、SVG、PDF で保存します</translation>
    </message>
    <message>
        <source>Print...</source>
        <translation>印刷...</translation>
    </message>
    <message>
        <source>Prints the picture</source>
        <translation>図を印刷します</translation>
    </message>
    <message>
        <source>Long profile</source>
        <translation>縦断図</translation>
    </message>
    <message>
        <source>Export the Long Profile</source>
        <translation>縦断図のエクスポート</translation>
    </message>
    <message>
        <source>Pictures (*.png *.svg *.pdf)</source>
        <translation>図 (*.png *.svg *.pdf)</translation>
    </message>
    <message>
        <source>A picture is saved as one of %1, and &quot;%2&quot; is named otherwise.</source>
        <translation>図は %1 のいずれかで保存します。「%2」の拡張子はそのいずれでもありません。</translation>
    </message>
    <message>
        <source>The picture could not be saved.
%1</source>
        <translation>図を保存できませんでした。
%1</translation>
    </message>
    <message>
        <source>Long Profile</source>
        <translation>縦断図</translation>
    </message>
    <message>
        <source>There is no branch yet: neither a line nor the network names one.</source>
        <translation>まだ河川がありません。河川名のある行も、河道網の河川もありません。</translation>
    </message>
</context>
</TS>
