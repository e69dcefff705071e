<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja" sourcelanguage="en_US">
<context>
    <name>CBedPage</name>
    <message>
        <source>Bed Resistance</source>
        <translation>河床抵抗</translation>
    </message>
    <message>
        <source>Formula</source>
        <translation>抵抗則</translation>
    </message>
    <message>
        <source>Global Values</source>
        <translation>全体値</translation>
    </message>
    <message>
        <source>Local Values</source>
        <translation>地点別の値</translation>
    </message>
</context>
<context>
    <name>CBedToolboxPage</name>
    <message>
        <source>Bed Resistance Toolbox</source>
        <translation>河床抵抗ツール</translation>
    </message>
    <message>
        <source>Global Values</source>
        <translation>全体値</translation>
    </message>
    <message>
        <source>Apply in:</source>
        <translation>適用範囲:</translation>
    </message>
    <message>
        <source>Local Values</source>
        <translation>地点別の値</translation>
    </message>
    <message>
        <source>Velocity table</source>
        <translation>流速の表</translation>
    </message>
    <message>
        <source>Velocity table of the current line</source>
        <translation>現在行の流速の表</translation>
    </message>
</context>
<context>
    <name>CDefaultPage</name>
    <message>
        <source>Computation Scheme</source>
        <translation>計算スキーム</translation>
    </message>
    <message>
        <source>Switches</source>
        <translation>スイッチ</translation>
    </message>
    <message>
        <source>Node &amp;Compatibility</source>
        <translation>節点の適合条件(&amp;C)</translation>
    </message>
    <message>
        <source>Water Level</source>
        <translation>水位</translation>
    </message>
    <message>
        <source>(Energy - Not Avail.)</source>
        <translation>(エネルギー - 利用不可)</translation>
    </message>
</context>
<context>
    <name>CEditorsLoadOptionDlg</name>
    <message>
        <source>Load Branch and Chainage</source>
        <translation>河川名と追加距離の読み込み</translation>
    </message>
    <message>
        <source>&amp;Branch and Chainage,</source>
        <translation>河川名、追加距離(&amp;B)</translation>
    </message>
    <message>
        <source>from Cross Section Editor</source>
        <translation>横断面エディターから</translation>
    </message>
    <message>
        <source>Branch, Chainage and &amp;Radius,</source>
        <translation>河川名、追加距離、曲率半径(&amp;R)</translation>
    </message>
    <message>
        <source>from Cross Section Editor and Network Editor</source>
        <translation>横断面エディターと河道網エディターから</translation>
    </message>
    <message>
        <source>Branch, Chainage, Radius and Channel &amp;Width,</source>
        <translation>河川名、追加距離、曲率半径、水路幅(&amp;W)</translation>
    </message>
</context>
<context>
    <name>CEncroachPage</name>
    <message>
        <source>Iteration</source>
        <translation>反復計算</translation>
    </message>
    <message>
        <source>Encroachment set-ups</source>
        <translation>河積阻害(エンクローチメント)の設定</translation>
    </message>
    <message>
        <source>Set-&amp;up:</source>
        <translation>設定(&amp;U):</translation>
    </message>
    <message>
        <source>&amp;Previous</source>
        <translation>前へ(&amp;P)</translation>
    </message>
    <message>
        <source>Ne&amp;xt</source>
        <translation>次へ(&amp;X)</translation>
    </message>
    <message>
        <source>&amp;Add</source>
        <translation>追加(&amp;A)</translation>
    </message>
    <message>
        <source>Lines of the set-up</source>
        <translation>設定の行</translation>
    </message>
    <message>
        <source>&amp;Duplicate</source>
        <translation>複製(&amp;D)</translation>
    </message>
    <message>
        <source>Dele&amp;te</source>
        <translation>削除(&amp;T)</translation>
    </message>
</context>
<context>
    <name>CFloodPage</name>
    <message>
        <source>Flood Plain Resistance</source>
        <translation>高水敷の抵抗</translation>
    </message>
    <message>
        <source>Global Value</source>
        <translation>全体値</translation>
    </message>
    <message>
        <source>Local Values</source>
        <translation>地点別の値</translation>
    </message>
</context>
<context>
    <name>CGenPropertyPage</name>
    <message>
        <source>Lines with another value: %1 of %2</source>
        <translation>別の値の行: %2 行中 %1 行</translation>
    </message>
</context>
<context>
    <name>CHeatBalancePage</name>
    <message>
        <source>Heat Balance Calculation</source>
        <translation>熱収支計算</translation>
    </message>
    <message>
        <source>Location</source>
        <translation>位置</translation>
    </message>
    <message>
        <source>Solar absorption</source>
        <translation>日射の吸収</translation>
    </message>
    <message>
        <source>Radiation under cloudy skies</source>
        <translation>曇天時の放射</translation>
    </message>
    <message>
        <source>Vaporization</source>
        <translation>蒸発</translation>
    </message>
</context>
<context>
    <name>CInitPage</name>
    <message>
        <source>Initial conditions</source>
        <translation>初期条件</translation>
    </message>
    <message>
        <source>Global Values</source>
        <translation>全体値</translation>
    </message>
    <message>
        <source>Local Values</source>
        <translation>地点別の値</translation>
    </message>
</context>
<context>
    <name>CKlrInitPage</name>
    <message>
        <source>Initial conditions</source>
        <translation>初期条件</translation>
    </message>
    <message>
        <source>Global values</source>
        <translation>全体値</translation>
    </message>
    <message>
        <source>Local values</source>
        <translation>地点別の値</translation>
    </message>
</context>
<context>
    <name>CKlrParamPage</name>
    <message>
        <source>Model Constants</source>
        <translation>モデル定数</translation>
    </message>
    <message>
        <source>Richardsens Bulk Flux No.</source>
        <translation>バルクフラックス・リチャードソン数</translation>
    </message>
    <message>
        <source>Global values</source>
        <translation>全体値</translation>
    </message>
    <message>
        <source>Local values</source>
        <translation>地点別の値</translation>
    </message>
</context>
<context>
    <name>CLeakagePage</name>
    <message>
        <source>Global Leakage Coefficient</source>
        <translation>漏水係数の全体値</translation>
    </message>
    <message>
        <source>Local Leakage Coefficients</source>
        <translation>地点別の漏水係数</translation>
    </message>
</context>
<context>
    <name>CLossPage</name>
    <message>
        <source>Water Loss</source>
        <translation>損失水量</translation>
    </message>
</context>
<context>
    <name>CMapsPage</name>
    <message>
        <source>Output</source>
        <translation>出力</translation>
    </message>
    <message>
        <source>Map output files</source>
        <translation>マップ出力ファイル</translation>
    </message>
    <message>
        <source>Input topography</source>
        <translation>入力地形</translation>
    </message>
    <message>
        <source>DEM input files</source>
        <translation>DEM入力ファイル</translation>
    </message>
</context>
<context>
    <name>CMixingCoefPage</name>
    <message>
        <source>Mixing Coefficients</source>
        <translation>混合係数</translation>
    </message>
    <message>
        <source>Global Values</source>
        <translation>全体値</translation>
    </message>
    <message>
        <source>Local Values</source>
        <translation>地点別の値</translation>
    </message>
    <message>
        <source>Table over the width-depth ratio</source>
        <translation>川幅水深比の表</translation>
    </message>
    <message>
        <source>Table of the current line</source>
        <translation>現在行の表</translation>
    </message>
</context>
<context>
    <name>COutputPage</name>
    <message>
        <source>H or Q points</source>
        <translation>H点またはQ点</translation>
    </message>
    <message>
        <source>H and Q points</source>
        <translation>H点およびQ点</translation>
    </message>
    <message>
        <source>Total</source>
        <translation>合計</translation>
    </message>
    <message>
        <source>Structures</source>
        <translation>構造物</translation>
    </message>
</context>
<context>
    <name>CQuasiPage</name>
    <message>
        <source>Computational parameters</source>
        <translation>計算パラメータ</translation>
    </message>
    <message>
        <source>Steady State Options</source>
        <translation>定常計算のオプション</translation>
    </message>
    <message>
        <source>Contraction expansion coefficients</source>
        <translation>急縮・急拡損失係数</translation>
    </message>
    <message>
        <source>Load branch an&amp;d chainages</source>
        <translation>河川名と追加距離の読み込み(&amp;D)</translation>
    </message>
</context>
<context>
    <name>CReachLengthPage</name>
    <message>
        <source>Over bank reach lengths</source>
        <translation>高水敷の区間長</translation>
    </message>
    <message>
        <source>Load &amp;branch and chainages</source>
        <translation>河川名と追加距離の読み込み(&amp;B)</translation>
    </message>
</context>
<context>
    <name>CStratificationPage</name>
    <message>
        <source>Turbulence model</source>
        <translation>乱流モデル</translation>
    </message>
    <message>
        <source>Corrections (reductions)</source>
        <translation>補正(低減)</translation>
    </message>
    <message>
        <source>Baroclinic Pressure</source>
        <translation>傾圧項</translation>
    </message>
    <message>
        <source>Convection / Advection</source>
        <translation>移流</translation>
    </message>
    <message>
        <source>Dispersion</source>
        <translation>分散</translation>
    </message>
</context>
<context>
    <name>CTextOutputPage</name>
    <message>
        <source>Output files</source>
        <translation>出力ファイル</translation>
    </message>
    <message>
        <source>Text file settings</source>
        <translation>テキストファイルの設定</translation>
    </message>
    <message>
        <source>Time period in output</source>
        <translation>出力期間</translation>
    </message>
    <message>
        <source>Items in output</source>
        <translation>出力項目</translation>
    </message>
    <message>
        <source>Grid points in output</source>
        <translation>出力格子点</translation>
    </message>
    <message>
        <source>Selected grid points in output</source>
        <translation>出力する格子点の選択</translation>
    </message>
</context>
<context>
    <name>CWLCurvePage</name>
    <message>
        <source>System Definition</source>
        <translation>システムで決定</translation>
    </message>
    <message>
        <source>Values</source>
        <translation>値</translation>
    </message>
    <message>
        <source>Water level increment due to curve</source>
        <translation>湾曲による水位上昇</translation>
    </message>
    <message>
        <source>Load &amp;Branch &amp;&amp; Chainage</source>
        <translation>河川名と追加距離を読み込む(&amp;B)</translation>
    </message>
</context>
<context>
    <name>CWLMarkPage</name>
    <message>
        <source>Mark titles</source>
        <translation>マークの名称</translation>
    </message>
    <message>
        <source>Local Values</source>
        <translation>地点別の値</translation>
    </message>
</context>
<context>
    <name>CWLSandBarsPage</name>
    <message>
        <source>Method</source>
        <translation>方法</translation>
    </message>
    <message>
        <source>Values</source>
        <translation>値</translation>
    </message>
    <message>
        <source>Water level increment due to sand bars</source>
        <translation>砂州による水位上昇</translation>
    </message>
    <message>
        <source>Load &amp;Branch &amp;&amp; Chainage</source>
        <translation>河川名と追加距離を読み込む(&amp;B)</translation>
    </message>
</context>
<context>
    <name>CWavePage</name>
    <message>
        <source>Wave Approximation</source>
        <translation>波動近似</translation>
    </message>
    <message>
        <source>Global Value</source>
        <translation>全体値</translation>
    </message>
    <message>
        <source>Local Values</source>
        <translation>地点別の値</translation>
    </message>
</context>
<context>
    <name>CWindPage</name>
    <message>
        <source>Wind Factor</source>
        <translation>風の係数</translation>
    </message>
    <message>
        <source>Global Factor</source>
        <translation>全体の係数</translation>
    </message>
    <message>
        <source>Local Factors</source>
        <translation>地点別の係数</translation>
    </message>
</context>
<context>
    <name>HDRules</name>
    <message>
        <source>Manning&apos;s n is 0.008 for glass and 0.8 for dense grass</source>
        <translation>マニングの n はガラスで 0.008、密な草で 0.8 です</translation>
    </message>
    <message>
        <source>Manning&apos;s M, 1/n, is 125 for glass and 1 for dense grass</source>
        <translation>マニングの M (1/n) はガラスで 125、密な草で 1 です</translation>
    </message>
    <message>
        <source>Chezy&apos;s C is between 1 and 220 m^½/s for all beds and depths</source>
        <translation>シェジーの C はどの河床と水深でも 1 から 220 m^½/s です</translation>
    </message>
    <message>
        <source>the largest flood known had 10 million m³/s</source>
        <translation>知られている最大の洪水は毎秒1000万立方メートルです</translation>
    </message>
    <message>
        <source>no water stands lower than the Dead Sea or higher than the highest lakes</source>
        <translation>死海より低い水面や最も高い湖より高い水面はありません</translation>
    </message>
    <message>
        <source>a depth is not negative, and the deepest lake has 1,642 m</source>
        <translation>水深は負にならず、最も深い湖は 1,642 m です</translation>
    </message>
    <message>
        <source>beyond it there is no place on the Earth</source>
        <translation>それを超える場所は地球上にありません</translation>
    </message>
    <message>
        <source>the factor is 1 in open terrain and less where something shelters the river</source>
        <translation>係数は開けた地形で 1、河川が遮られる所ではそれより小さくなります</translation>
    </message>
    <message>
        <source>a loss is a part of the velocity head</source>
        <translation>損失は速度水頭の一部です</translation>
    </message>
    <message>
        <source>it cannot be negative</source>
        <translation>負にはなりません</translation>
    </message>
    <message>
        <source>beyond it all the water would be gone within a second</source>
        <translation>それを超えると1秒で水がなくなります</translation>
    </message>
    <message>
        <source>no river flows as fast</source>
        <translation>それほど速く流れる河川はありません</translation>
    </message>
    <message>
        <source>a river bed is not as steep</source>
        <translation>河床はそれほど急ではありません</translation>
    </message>
    <message>
        <source>there has to be one at least</source>
        <translation>少なくとも1つ必要です</translation>
    </message>
    <message>
        <source>it weights two points in time or place</source>
        <translation>2つの時点または地点の重みです</translation>
    </message>
    <message>
        <source>remove the line</source>
        <translation>行を削除</translation>
    </message>
    <message>
        <source>exchange start and end</source>
        <translation>始点と終点を交換</translation>
    </message>
    <message>
        <source>no HD parameters</source>
        <translation>HDパラメータなし</translation>
    </message>
    <message>
        <source>The file has no target [KAVO0_HD], so it holds no HD parameters. Perhaps it is a file of another kind.</source>
        <translation>ファイルにターゲット [KAVO0_HD] がないため、HDパラメータを含みません。別の種類のファイルかもしれません。</translation>
    </message>
    <message>
        <source>missing section</source>
        <translation>セクションの不足</translation>
    </message>
    <message>
        <source>A section that every file has is missing. Its values are the defaults of a new file.</source>
        <translation>どのファイルにもあるセクションがありません。その値には新規ファイルの既定値が使われます。</translation>
    </message>
    <message>
        <source>missing keyword</source>
        <translation>キーワードの不足</translation>
    </message>
    <message>
        <source>A keyword that its section needs is missing. Its values are the defaults of a new file.</source>
        <translation>セクションに必要なキーワードがありません。その値には新規ファイルの既定値が使われます。</translation>
    </message>
    <message>
        <source>missing parameter</source>
        <translation>パラメータの不足</translation>
    </message>
    <message>
        <source>A keyword has fewer parameters than it needs. The defaults stand in for the rest.</source>
        <translation>キーワードのパラメータが足りません。残りには既定値が使われます。</translation>
    </message>
    <message>
        <source>value of the wrong type</source>
        <translation>値の型の誤り</translation>
    </message>
    <message>
        <source>What stands in the file is not of the type that the parameter has, such as a text where a number belongs. It is not used, and a save writes what is used instead.</source>
        <translation>数値の位置に文字列があるなど、ファイルの内容がパラメータの型と異なります。その内容は使われず、保存すると代わりの値が書かれます。</translation>
    </message>
    <message>
        <source>value written otherwise</source>
        <translation>別の型で書かれた値</translation>
    </message>
    <message>
        <source>The value is written in another type than it should be, but what it means is beyond doubt, such as 1 for true. It is used, and a save writes it as it should be.</source>
        <translation>値は本来と異なる型で書かれていますが、true の代わりの 1 のように意味は明らかです。値は使われ、保存すると本来の型で書かれます。</translation>
    </message>
    <message>
        <source>count that does not fit</source>
        <translation>合わない個数</translation>
    </message>
    <message>
        <source>The parameter counts those behind it, and there are not as many. What follows in the keyword cannot be told apart and is not used.</source>
        <translation>後に続くパラメータの個数が、示された個数と合いません。キーワードの以降の内容は区別できず、使われません。</translation>
    </message>
    <message>
        <source>incomplete date</source>
        <translation>不完全な日付</translation>
    </message>
    <message>
        <source>A date and time needs six integers: year, month, day, hour, minute and second.</source>
        <translation>日時には年、月、日、時、分、秒の6つの整数が必要です。</translation>
    </message>
    <message>
        <source>no such date</source>
        <translation>存在しない日付</translation>
    </message>
    <message>
        <source>The six integers are no date and time of the calendar, such as the 30th of February.</source>
        <translation>2月30日のように、6つの整数が暦にない日時を表しています。</translation>
    </message>
    <message>
        <source>more flags than titles</source>
        <translation>題名より多いフラグ</translation>
    </message>
    <message>
        <source>There are more flags than marks that they could belong to. A save leaves them out.</source>
        <translation>フラグの数が対応するマークの数より多くなっています。保存すると余分なフラグは除かれます。</translation>
    </message>
    <message>
        <source>surplus parameters</source>
        <translation>余分なパラメータ</translation>
    </message>
    <message>
        <source>The keyword has more parameters than it knows. A save leaves them out.</source>
        <translation>キーワードのパラメータが決められた数より多くなっています。保存すると余分なものは除かれます。</translation>
    </message>
    <message>
        <source>unknown section or keyword</source>
        <translation>未知のセクションまたはキーワード</translation>
    </message>
    <message>
        <source>Nothing here uses it. It is kept, and a save writes it behind the rest.</source>
        <translation>ここでは使われません。内容は保持され、保存すると最後に書かれます。</translation>
    </message>
    <message>
        <source>unknown parameters</source>
        <translation>未知のパラメータ</translation>
    </message>
    <message>
        <source>The keyword has more parameters than are known. They are kept.</source>
        <translation>キーワードに未知のパラメータがあります。それらは保持されます。</translation>
    </message>
    <message>
        <source>repeated section or keyword</source>
        <translation>重複したセクションまたはキーワード</translation>
    </message>
    <message>
        <source>It stands in the file more than once, and only the first counts. The others are kept, but never shown.</source>
        <translation>ファイルに複数回現れ、最初のものだけが有効です。他は保持されますが、表示されません。</translation>
    </message>
    <message>
        <source>keyword without its companion</source>
        <translation>対になるキーワードがないキーワード</translation>
    </message>
    <message>
        <source>The keyword only means something together with another one, which is missing. It is kept as it stands.</source>
        <translation>このキーワードは別のキーワードとともに意味を持ちますが、それがありません。そのまま保持されます。</translation>
    </message>
    <message>
        <source>broken rule of the file</source>
        <translation>ファイルの規則違反</translation>
    </message>
    <message>
        <source>The value is of the right type, but not one that the file may hold. Another one is used instead.</source>
        <translation>値の型は正しいものの、ファイルに許されない値です。代わりの値が使われます。</translation>
    </message>
    <message>
        <source>line without branch</source>
        <translation>河川名のない行</translation>
    </message>
    <message>
        <source>the branch name is empty</source>
        <translation>河川名が空です</translation>
    </message>
    <message>
        <source>The line belongs to no place of the river, so the simulation cannot use it. A save of the document offers to remove such lines.</source>
        <translation>行が河川のどの場所にも属さないため、計算に使えません。文書を保存するとき、このような行を削除するか尋ねられます。</translation>
    </message>
    <message>
        <source>line without chainage</source>
        <translation>追加距離のない行</translation>
    </message>
    <message>
        <source>the chainage is not given</source>
        <translation>追加距離が入力されていません</translation>
    </message>
    <message>
        <source>The line names a branch but no place on it, so the simulation cannot use it. A save of the document offers to remove such lines.</source>
        <translation>河川名はあっても位置がないため、計算に使えません。文書を保存するとき、このような行を削除するか尋ねられます。</translation>
    </message>
    <message>
        <source>two lines for one location</source>
        <translation>同じ地点の2行</translation>
    </message>
    <message>
        <source>line %1 is for the same location and has other values</source>
        <translation>行 %1 が同じ地点で別の値を持っています</translation>
    </message>
    <message>
        <source>Two lines of the list give the same branch and chainage different values. Only one of them can hold, and which one is for the simulation to choose.</source>
        <translation>同じ河川と追加距離に2つの行が異なる値を与えています。有効なのは一方だけで、どちらになるかは計算側が決めます。</translation>
    </message>
    <message>
        <source>repeated line</source>
        <translation>重複した行</translation>
    </message>
    <message>
        <source>line %1 is the same</source>
        <translation>行 %1 と同じです</translation>
    </message>
    <message>
        <source>The line says once more what an earlier one of the list says, value for value. It can be removed without changing anything.</source>
        <translation>前にある行とすべての値が同じです。削除しても何も変わりません。</translation>
    </message>
    <message>
        <source>branch not in the network</source>
        <translation>河道網にない河川</translation>
    </message>
    <message>
        <source>the network has no branch %1</source>
        <translation>河道網に河川 %1 がありません</translation>
    </message>
    <message>
        <source>The river network has no branch of this name, so the line holds nowhere. Perhaps the name is misspelled, or the branch was renamed.</source>
        <translation>河道網にこの名前の河川がないため、行はどこにも適用されません。名前の誤りか、河川の名前が変更されたのかもしれません。</translation>
    </message>
    <message>
        <source>chainage beyond the branch</source>
        <translation>河川の範囲外の追加距離</translation>
    </message>
    <message>
        <source>%1 does not lie on branch %2, which runs from %3 to %4</source>
        <translation>%1 は河川 %2 の範囲 (%3 から %4) にありません</translation>
    </message>
    <message>
        <source>The chainage lies before the first or behind the last one of its branch in the river network, by more than a millimeter.</source>
        <translation>追加距離が河道網の河川の始点より前、または終点より後にあり、その差は1ミリメートルを超えます。</translation>
    </message>
    <message>
        <source>reach that ends before it starts</source>
        <translation>始点より前で終わる区間</translation>
    </message>
    <message>
        <source>the reach ends at %1, before it starts at %2</source>
        <translation>区間は始点 %2 より前の %1 で終わります</translation>
    </message>
    <message>
        <source>The end of the reach lies upstream of its start: below it, or, on a branch whose flow is against its chainages, above it.</source>
        <translation>区間の終点が始点より上流にあります。流れが追加距離と逆向きの河川では、終点の追加距離が始点より大きい場合がこれに当たります。</translation>
    </message>
    <message>
        <source>reach without length</source>
        <translation>長さのない区間</translation>
    </message>
    <message>
        <source>the reach ends where it starts</source>
        <translation>区間の始点と終点が同じです</translation>
    </message>
    <message>
        <source>Start and end of the reach are the same, so it holds nowhere.</source>
        <translation>区間の始点と終点が同じため、どこにも適用されません。</translation>
    </message>
    <message>
        <source>reach without end</source>
        <translation>終点のない区間</translation>
    </message>
    <message>
        <source>the end of the reach is not given</source>
        <translation>区間の終点が入力されていません</translation>
    </message>
    <message>
        <source>The line says where its reach starts, but not where it ends.</source>
        <translation>行には区間の始点があり、終点がありません。</translation>
    </message>
    <message>
        <source>reaches that overlap</source>
        <translation>重なる区間</translation>
    </message>
    <message>
        <source>the reach overlaps that of line %1</source>
        <translation>区間が行 %1 の区間と重なります</translation>
    </message>
    <message>
        <source>A piece of the branch belongs to two reaches of the list. Which of them holds there is for the simulation to choose. Reaches may touch.</source>
        <translation>河川の一部が一覧の2つの区間に属しています。どちらが有効かは計算側が決めます。区間どうしが接するのはかまいません。</translation>
    </message>
    <message>
        <source>value below its range</source>
        <translation>範囲より小さい値</translation>
    </message>
    <message>
        <source>%1 is less than %2, the least that is allowed</source>
        <translation>%1 は許される最小値 %2 より小さい値です</translation>
    </message>
    <message>
        <source>The value is smaller than the editor lets anybody type. The file was written by something else.</source>
        <translation>エディタで入力できる値より小さくなっています。ファイルは別のプログラムで書かれたものです。</translation>
    </message>
    <message>
        <source>value above its range</source>
        <translation>範囲より大きい値</translation>
    </message>
    <message>
        <source>%1 is more than %2, the most that is allowed</source>
        <translation>%1 は許される最大値 %2 より大きい値です</translation>
    </message>
    <message>
        <source>The value is larger than the editor lets anybody type. The file was written by something else.</source>
        <translation>エディタで入力できる値より大きくなっています。ファイルは別のプログラムで書かれたものです。</translation>
    </message>
    <message>
        <source>number of no entry</source>
        <translation>該当する項目のない番号</translation>
    </message>
    <message>
        <source>%1 is the number of no entry; they go from %2 to %3</source>
        <translation>%1 に当たる項目がありません。番号は %2 から %3 までです</translation>
    </message>
    <message>
        <source>The value is the number of an entry of a list, and the list has none of this number.</source>
        <translation>値は選択肢の番号ですが、その番号の選択肢がありません。</translation>
    </message>
    <message>
        <source>value that no river has</source>
        <translation>河川ではありえない値</translation>
    </message>
    <message>
        <source>%1 is less than %2: %3</source>
        <translation>%1 は %2 より小さい値です: %3</translation>
    </message>
    <message>
        <source>The value is allowed, but smaller than any river&apos;s, so perhaps it was typed in another unit or for another formula.</source>
        <translation>許される値ですが、どの河川の値よりも小さいため、別の単位または別の公式の値が入力されたのかもしれません。</translation>
    </message>
    <message>
        <source>%1 is more than %2: %3</source>
        <translation>%1 は %2 より大きい値です: %3</translation>
    </message>
    <message>
        <source>The value is allowed, but larger than any river&apos;s, so perhaps it was typed in another unit or for another formula.</source>
        <translation>許される値ですが、どの河川の値よりも大きいため、別の単位または別の公式の値が入力されたのかもしれません。</translation>
    </message>
    <message>
        <source>least above greatest resistance</source>
        <translation>最大抵抗より大きい最小抵抗</translation>
    </message>
    <message>
        <source>the least resistance, %1, is above the greatest, %2</source>
        <translation>最小抵抗 %1 が最大抵抗 %2 より大きくなっています</translation>
    </message>
    <message>
        <source>Results are raised to the least and lowered to the greatest resistance, which cannot both be done when the least is above the greatest.</source>
        <translation>結果は最小抵抗まで引き上げられ、最大抵抗まで引き下げられます。最小が最大より大きいと両方を満たせません。</translation>
    </message>
    <message>
        <source>velocities that do not rise</source>
        <translation>増加しない流速</translation>
    </message>
    <message>
        <source>velocity %1 stands behind %2</source>
        <translation>流速 %2 の後に %1 があります</translation>
    </message>
    <message>
        <source>A table of resistance over velocity is looked up by velocity, so the velocities have to rise from line to line.</source>
        <translation>流速に対する抵抗の表は流速で引かれるため、流速は行ごとに増加しなければなりません。</translation>
    </message>
    <message>
        <source>interface above the water level</source>
        <translation>水位より高い界面</translation>
    </message>
    <message>
        <source>the interface of the layers, %1, lies above the water level, %2</source>
        <translation>層の界面 %1 が水位 %2 より高くなっています</translation>
    </message>
    <message>
        <source>The bottom layer reaches up to the interface and the top layer from there to the water level, so the interface cannot lie above it.</source>
        <translation>下層は界面まで、上層は界面から水位までです。界面が水位より高くなることはありません。</translation>
    </message>
    <message>
        <source>marks out of order</source>
        <translation>順序の異なるマーク</translation>
    </message>
    <message>
        <source>mark %1 (%2) and mark %3 (%4) stand the other way round than at other locations</source>
        <translation>マーク %1 (%2) とマーク %3 (%4) の上下が他の地点と逆です</translation>
    </message>
    <message>
        <source>At nine of ten locations or more one of the two marks lies above the other, and here it does not. Perhaps their levels were exchanged.</source>
        <translation>地点の9割以上で一方のマークが他方より高いのに、ここではそうではありません。高さが入れ替わっているのかもしれません。</translation>
    </message>
    <message>
        <source>period that ends before it starts</source>
        <translation>開始前に終わる期間</translation>
    </message>
    <message>
        <source>the period ends at %1, not after it starts at %2</source>
        <translation>期間の終了 %1 が開始 %2 より後ではありません</translation>
    </message>
    <message>
        <source>The end of the period does not lie behind its start, so nothing would be written.</source>
        <translation>期間の終わりが始まりより後にないため、何も書かれません。</translation>
    </message>
    <message>
        <source>output over an input file</source>
        <translation>入力ファイルへの出力</translation>
    </message>
    <message>
        <source>the simulation writes %1, which it also reads</source>
        <translation>計算は %1 に書き込み、同じファイルを読み込みます</translation>
    </message>
    <message>
        <source>The file is written by the simulation and read by it, too: as ground elevations, as help grid, or as this parameter file itself. What it held would be lost.</source>
        <translation>計算が書き込むファイルが、地盤高、補助格子、またはこのパラメータファイルとして読み込まれます。元の内容は失われます。</translation>
    </message>
    <message>
        <source>two outputs into one file</source>
        <translation>1つのファイルへの2つの出力</translation>
    </message>
    <message>
        <source>line %1 writes the same file</source>
        <translation>行 %1 が同じファイルに書き込みます</translation>
    </message>
    <message>
        <source>Two outputs are written to one file, so one of them would be lost.</source>
        <translation>2つの出力が同じファイルに書かれるため、一方が失われます。</translation>
    </message>
    <message>
        <source>output without file</source>
        <translation>ファイルのない出力</translation>
    </message>
    <message>
        <source>the output has no file name</source>
        <translation>出力のファイル名がありません</translation>
    </message>
    <message>
        <source>An output is asked for, but not where it is to be written.</source>
        <translation>出力が指定されていますが、書き込み先がありません。</translation>
    </message>
</context>
<context>
    <name>HelpTexts</name>
    <message>
        <source>on</source>
        <translation>オン</translation>
    </message>
    <message>
        <source>off</source>
        <translation>オフ</translation>
    </message>
    <message>
        <source>now</source>
        <translation>現在の日時</translation>
    </message>
    <message>
        <source>Field</source>
        <translation>項目</translation>
    </message>
    <message>
        <source>Meaning</source>
        <translation>意味</translation>
    </message>
    <message>
        <source>Unit</source>
        <translation>単位</translation>
    </message>
    <message>
        <source>Range</source>
        <translation>範囲</translation>
    </message>
    <message>
        <source>Default</source>
        <translation>既定値</translation>
    </message>
    <message>
        <source>In the file</source>
        <translation>ファイルでの名前</translation>
    </message>
    <message>
        <source>Values of the whole file</source>
        <translation>ファイル全体の値</translation>
    </message>
    <message>
        <source>Keys of fields and tables</source>
        <translation>入力欄と表のキー</translation>
    </message>
    <message>
        <source>Problems and their codes</source>
        <translation>問題とコード</translation>
    </message>
    <message>
        <source>Columns of the values at locations</source>
        <translation>地点別の値の列</translation>
    </message>
    <message>
        <source>Columns of a further table</source>
        <translation>その他の表の列</translation>
    </message>
</context>
<context>
    <name>Kavo0_hd</name>
    <message>
        <source>R1</source>
        <translation>R1</translation>
    </message>
    <message>
        <source>R2</source>
        <translation>R2</translation>
    </message>
    <message>
        <source>Kvr_Help.chm
HDPar
KVR HD Parameters
KVR HD Parameters (*.hdkv)
.hdkv
HDPar.Document
HDPar Document</source>
        <translation>Kvr_Help.chm
HDPar
KVR HDパラメータ
KVR HDパラメータ (*.hdkv)
.hdkv
HDPar.Document
HDPar Document</translation>
    </message>
    <message>
        <source>h0</source>
        <translation>h0</translation>
    </message>
    <message>
        <source>h1</source>
        <translation>h1</translation>
    </message>
    <message>
        <source>Q0</source>
        <translation>Q0</translation>
    </message>
    <message>
        <source>Q1</source>
        <translation>Q1</translation>
    </message>
    <message>
        <source>Left bank</source>
        <translation>左岸</translation>
    </message>
    <message>
        <source>Right bank</source>
        <translation>右岸</translation>
    </message>
    <message>
        <source>River Name</source>
        <translation>河川名</translation>
    </message>
    <message>
        <source>Chainage</source>
        <translation>追加距離</translation>
    </message>
    <message>
        <source>Flood Pl. Res</source>
        <translation>高水敷抵抗</translation>
    </message>
    <message>
        <source>Lines in the editor data-tables with none or only partially
filled information will be deleted when saving the editor file.
Proceed Yes/No ?</source>
        <translation>データ表のうち、空の行や記入が不完全な行は、
ファイルの保存時に削除されます。
続行しますか?</translation>
    </message>
    <message>
        <source>Data deleted in Wave page, but to switch there, you must first repair error on active page</source>
        <translation>「波動近似」ページのデータを削除しました。ページを切り替えるには、先に表示中のページの誤りを直してください。</translation>
    </message>
    <message>
        <source>Data deleted in Init page, but to switch there, you must first repair error on active page</source>
        <translation>「初期条件」ページのデータを削除しました。ページを切り替えるには、先に表示中のページの誤りを直してください。</translation>
    </message>
    <message>
        <source>Data deleted in Bed Resist. page, but to switch there, you must first repair error on active page</source>
        <translation>「河床抵抗」ページのデータを削除しました。ページを切り替えるには、先に表示中のページの誤りを直してください。</translation>
    </message>
    <message>
        <source>Data deleted in Wind page, but to switch there, you must first repair error on active page</source>
        <translation>「風」ページのデータを削除しました。ページを切り替えるには、先に表示中のページの誤りを直してください。</translation>
    </message>
    <message>
        <source>Data deleted in Water Loss page, but to switch there, you must first repair error on active page</source>
        <translation>「損失水量」ページのデータを削除しました。ページを切り替えるには、先に表示中のページの誤りを直してください。</translation>
    </message>
    <message>
        <source>Data deleted in Flood Plain Resist. page, but to switch there, you must first repair error on active page</source>
        <translation>「高水敷抵抗」ページのデータを削除しました。ページを切り替えるには、先に表示中のページの誤りを直してください。</translation>
    </message>
    <message>
        <source>Data inserted in Init page, but to switch there, you must first repair error on active page</source>
        <translation>「初期条件」ページにデータを挿入しました。ページを切り替えるには、先に表示中のページの誤りを直してください。</translation>
    </message>
    <message>
        <source>Data inserted in Bed Resist. page, but to switch there, you must first repair error on active page</source>
        <translation>「河床抵抗」ページにデータを挿入しました。ページを切り替えるには、先に表示中のページの誤りを直してください。</translation>
    </message>
    <message>
        <source>Data inserted in Wave page, but to switch there, you must first repair error on active page</source>
        <translation>「波動近似」ページにデータを挿入しました。ページを切り替えるには、先に表示中のページの誤りを直してください。</translation>
    </message>
    <message>
        <source>Data inserted in Wind page, but to switch there, you must first repair error on active page</source>
        <translation>「風」ページにデータを挿入しました。ページを切り替えるには、先に表示中のページの誤りを直してください。</translation>
    </message>
    <message>
        <source>Data inserted in Water Loss page, but to switch there, you must first repair error on active page</source>
        <translation>「損失水量」ページにデータを挿入しました。ページを切り替えるには、先に表示中のページの誤りを直してください。</translation>
    </message>
    <message>
        <source>Data inserted in Flood Plain Resist. page, but to switch there, you must first repair error on active page</source>
        <translation>「高水敷抵抗」ページにデータを挿入しました。ページを切り替えるには、先に表示中のページの誤りを直してください。</translation>
    </message>
    <message>
        <source>Can&apos;t select Wave page because of error on active page</source>
        <translation>表示中のページに誤りがあるため、「波動近似」ページを選択できません。</translation>
    </message>
    <message>
        <source>Can&apos;t select Init page because of error on active page</source>
        <translation>表示中のページに誤りがあるため、「初期条件」ページを選択できません。</translation>
    </message>
    <message>
        <source>Can&apos;t select Bed Resist. page because of error on active page</source>
        <translation>表示中のページに誤りがあるため、「河床抵抗」ページを選択できません。</translation>
    </message>
    <message>
        <source>Can&apos;t select Wind page because of error on active page</source>
        <translation>表示中のページに誤りがあるため、「風」ページを選択できません。</translation>
    </message>
    <message>
        <source>Can&apos;t select Water Loss page because of error on active page</source>
        <translation>表示中のページに誤りがあるため、「損失水量」ページを選択できません。</translation>
    </message>
    <message>
        <source>Can&apos;t select Flood Plain Resist. page because of error on active page</source>
        <translation>表示中のページに誤りがあるため、「高水敷抵抗」ページを選択できません。</translation>
    </message>
    <message>
        <source>HD Parameters</source>
        <translation>HDパラメータ</translation>
    </message>
    <message>
        <source> KVR HD Tools</source>
        <translation> KVR HDツール</translation>
    </message>
    <message>
        <source>Unsupported file format</source>
        <translation>対応していないファイル形式です</translation>
    </message>
    <message>
        <source>Kavo0 HD</source>
        <translation>Kavo0 HD</translation>
    </message>
    <message>
        <source>UpStr. Chainage</source>
        <translation>上流端追加距離</translation>
    </message>
    <message>
        <source>DnStr. Chainage</source>
        <translation>下流端追加距離</translation>
    </message>
    <message>
        <source>Approx.</source>
        <translation>近似</translation>
    </message>
    <message>
        <source>High Order Fully Dynamic
Fully Dynamic
Diffusive Wave
Kinematic Wave</source>
        <translation>高次ダイナミックウェーブ
ダイナミックウェーブ
拡散波近似
キネマティックウェーブ近似</translation>
    </message>
    <message>
        <source>Data deleted in Mixing Coef. page, but to switch there, you must first repair error on active page</source>
        <translation>「混合係数」ページのデータを削除しました。ページを切り替えるには、先に表示中のページの誤りを直してください。</translation>
    </message>
    <message>
        <source>Data inserted in Mixing Coef. page, but to switch there, you must first repair error on active page</source>
        <translation>「混合係数」ページにデータを挿入しました。ページを切り替えるには、先に表示中のページの誤りを直してください。</translation>
    </message>
    <message>
        <source>Can&apos;t select Mixing Coef. page because of error on active page</source>
        <translation>表示中のページに誤りがあるため、「混合係数」ページを選択できません。</translation>
    </message>
    <message>
        <source>Leakage Coef</source>
        <translation>漏水係数</translation>
    </message>
    <message>
        <source>%1 already stands beside %2 and holds something else.
Replace it Yes/No ?</source>
        <translation>%2 と同じ場所に、内容の異なる %1 が既にあります。
置き換えますか?</translation>
    </message>
    <message>
        <source>Removal of incomplete lines</source>
        <translation>不完全な行の削除</translation>
    </message>
    <message>
        <source>Go to Field or Page</source>
        <translation>項目またはページへ移動</translation>
    </message>
    <message>
        <source>A word of its name, or its keyword in the file</source>
        <translation>名前の一部、またはファイル内のキーワード</translation>
    </message>
    <message>
        <source>Fields and pages found</source>
        <translation>見つかった項目とページ</translation>
    </message>
    <message>
        <source>Name
Page
Keyword</source>
        <translation>名前
ページ
キーワード</translation>
    </message>
    <message>
        <source>&amp;Insert Line</source>
        <translation>行の挿入(&amp;I)</translation>
    </message>
    <message>
        <source>&amp;Delete Line</source>
        <translation>行の削除(&amp;D)</translation>
    </message>
    <message>
        <source>Insert &amp;Location from Network</source>
        <translation>河道網の位置を挿入(&amp;L)</translation>
    </message>
    <message>
        <source>No network editor of the project has a picked location.
Pick a place on the network&apos;s map first.</source>
        <translation>プロジェクトの河道網エディターで位置が選択されていません。
先に河道網の平面図で位置を選択してください。</translation>
    </message>
    <message>
        <source>Initial h</source>
        <translation>初期水位 h</translation>
    </message>
    <message>
        <source>Initial y</source>
        <translation>初期水深 y</translation>
    </message>
    <message>
        <source>Initial Q</source>
        <translation>初期流量 Q</translation>
    </message>
    <message>
        <source>Initial</source>
        <translation>初期条件</translation>
    </message>
    <message>
        <source>Invalid floating point number!</source>
        <translation>数値の書き方が正しくありません。</translation>
    </message>
    <message>
        <source>Change of a value</source>
        <translation>値の変更</translation>
    </message>
    <message>
        <source>Loading of locations</source>
        <translation>位置の読み込み</translation>
    </message>
    <message>
        <source>Wind</source>
        <translation>風</translation>
    </message>
    <message>
        <source>Topographical factor</source>
        <translation>地形係数</translation>
    </message>
    <message>
        <source>Default Values</source>
        <translation>既定値</translation>
    </message>
    <message>
        <source>Heat Balance</source>
        <translation>熱収支</translation>
    </message>
    <message>
        <source>Stratification</source>
        <translation>成層</translation>
    </message>
    <message>
        <source>Groundwater Leakage</source>
        <translation>地下水への漏水</translation>
    </message>
    <message>
        <source>Flood Plain Resist.</source>
        <translation>高水敷抵抗</translation>
    </message>
    <message>
        <source>Water Loss</source>
        <translation>損失水量</translation>
    </message>
    <message>
        <source>Water Loss 1
Water Loss 2
Water Loss 3
Water Loss 4</source>
        <translation>損失水量 1
損失水量 2
損失水量 3
損失水量 4</translation>
    </message>
    <message>
        <source>Wave Approx</source>
        <translation>波動近似</translation>
    </message>
    <message>
        <source>Quasi Steady</source>
        <translation>準定常</translation>
    </message>
    <message>
        <source>Bed Resist.</source>
        <translation>河床抵抗</translation>
    </message>
    <message>
        <source>Bed Resist. Toolbox</source>
        <translation>河床抵抗ツール</translation>
    </message>
    <message>
        <source>Mixing Coef.</source>
        <translation>混合係数</translation>
    </message>
    <message>
        <source>Encroachment</source>
        <translation>河積阻害</translation>
    </message>
    <message>
        <source>Contraction</source>
        <translation>急縮</translation>
    </message>
    <message>
        <source>Expansion</source>
        <translation>急拡</translation>
    </message>
    <message>
        <source>Resistance</source>
        <translation>抵抗値</translation>
    </message>
    <message>
        <source>Zone 1</source>
        <translation>区分1</translation>
    </message>
    <message>
        <source>Zone 2</source>
        <translation>区分2</translation>
    </message>
    <message>
        <source>Zone 3</source>
        <translation>区分3</translation>
    </message>
    <message>
        <source>Coef. a</source>
        <translation>係数a</translation>
    </message>
    <message>
        <source>Coef. b</source>
        <translation>係数b</translation>
    </message>
    <message>
        <source>Minimum</source>
        <translation>最小</translation>
    </message>
    <message>
        <source>Maximum</source>
        <translation>最大</translation>
    </message>
    <message>
        <source>Velocity</source>
        <translation>流速</translation>
    </message>
    <message>
        <source>Width/depth</source>
        <translation>川幅水深比</translation>
    </message>
    <message>
        <source>Coefficient f</source>
        <translation>係数f</translation>
    </message>
    <message>
        <source>f1
f2
f3
f4</source>
        <translation>f1
f2
f3
f4</translation>
    </message>
    <message>
        <source>Method
Banks
Left offset
Right offset
Left position
Right position
Width
Reduction
Total reduction
Left reduction
Right reduction
Target level
Target energy</source>
        <translation>方法
対象岸
左岸余裕幅
右岸余裕幅
左岸位置
右岸位置
幅
低減方法
全低減率
左岸低減率
右岸低減率
目標水位
目標エネルギー高</translation>
    </message>
    <message>
        <source>1 Fixed positions
2 Fixed width
3 Conveyance reduction
4 Target level
5 Target level and energy</source>
        <translation>1 位置を固定
2 幅を固定
3 通水能の低減
4 目標水位
5 目標水位とエネルギー高</translation>
    </message>
    <message>
        <source>1 Both banks
2 Left bank
3 Right bank</source>
        <translation>1 両岸
2 左岸
3 右岸</translation>
    </message>
    <message>
        <source>1 Equal on both banks
2 In proportion to conveyance
3 Bank by bank</source>
        <translation>1 両岸等分
2 通水能に比例
3 岸ごと</translation>
    </message>
    <message>
        <source>Set-up %1</source>
        <translation>設定 %1</translation>
    </message>
    <message>
        <source>This set-up will not be saved as it is: its second line or a later one needs a branch name and a chainage.</source>
        <translation>この設定はこのままでは保存されません。2行目以降のいずれかに河川名と追加距離が必要です。</translation>
    </message>
    <message>
        <source>There is no set-up yet. Add makes one.</source>
        <translation>設定がまだありません。「追加」で作成します。</translation>
    </message>
    <message>
        <source>Addition of a set-up</source>
        <translation>設定の追加</translation>
    </message>
    <message>
        <source>Deletion of a set-up</source>
        <translation>設定の削除</translation>
    </message>
    <message>
        <source>Branches and chainages come from the cross section and network editors of the project.
This document belongs to no project, so there is nothing to load.</source>
        <translation>河川名と追加距離は、プロジェクトの横断面エディターと河道網エディターから読み込みます。
この文書はプロジェクトに属していないため、読み込むものがありません。</translation>
    </message>
    <message>
        <source>No cross section or network editor of the project has answered.
Nothing was loaded.</source>
        <translation>プロジェクトの横断面エディターと河道網エディターから応答がありません。
何も読み込みませんでした。</translation>
    </message>
    <message>
        <source>Add. Output</source>
        <translation>追加出力</translation>
    </message>
    <message>
        <source>KLR Parameters</source>
        <translation>KLRパラメータ</translation>
    </message>
    <message>
        <source>KLR Initial</source>
        <translation>KLR初期条件</translation>
    </message>
    <message>
        <source>Reach Lengths</source>
        <translation>区間長</translation>
    </message>
    <message>
        <source>%1 locations added, %2 were there already; %3 of these have new values.</source>
        <translation>%1地点を追加しました。%2地点は既にあり、うち%3地点の値を更新しました。</translation>
    </message>
    <message>
        <source>Search for river name/topo ID.
Search</source>
        <translation>河川名/地形IDを検索します。
検索</translation>
    </message>
    <message>
        <source>Search for next occurence of river name/ topo ID.
Find Next</source>
        <translation>次の河川名/地形IDを検索します。
次を検索</translation>
    </message>
    <message>
        <source>Default name
User defined name
No decimals</source>
        <translation>既定の名称
ユーザー定義の名称
小数桁数</translation>
    </message>
    <message>
        <source>Format
Auto name
Filename
Browse</source>
        <translation>形式
自動命名
ファイル名
参照</translation>
    </message>
    <message>
        <source>Interpolate</source>
        <translation>補間</translation>
    </message>
    <message>
        <source>Global</source>
        <translation>全体</translation>
    </message>
    <message>
        <source>kvt Timeseries Bridge
Ascii Format 1 Timeseries Bridge
Ascii Format 2 Timeseries Bridge</source>
        <translation>kvt Timeseries Bridge
Ascii Format 1 Timeseries Bridge
Ascii Format 2 Timeseries Bridge</translation>
    </message>
    <message>
        <source>None
Single
Multiple 1
Multiple 2
Multiple ½</source>
        <translation>なし
単一
複数1
複数2
複数½</translation>
    </message>
    <message>
        <source>Filename
Browse
Item no.
Order</source>
        <translation>ファイル名
参照
項目番号
優先順位</translation>
    </message>
    <message>
        <source>X Orig.
Y Orig.
Rotation
Grid Size
J Cells no.
K Cells no.
Filename
Browse
Type
Item
Component no.
Storing frequency
Default period
Start time
End time</source>
        <translation>X原点
Y原点
回転角
格子間隔
J方向格子数
K方向格子数
ファイル名
参照
種類
項目
成分番号
保存間隔
既定期間
開始時刻
終了時刻</translation>
    </message>
    <message>
        <source>Max
Min
Dynamic</source>
        <translation>最大
最小
時系列</translation>
    </message>
    <message>
        <source>Water level
Water depth
Velocity
Velocity * Depth
AD component
DEM
(h,p,q)</source>
        <translation>水位
水深
流速
流速×水深
移流拡散成分
DEM
(h,p,q)</translation>
    </message>
    <message>
        <source>%1 locations added, %2 were there already.</source>
        <translation>%1地点を追加しました。%2地点は既にありました。</translation>
    </message>
    <message>
        <source>%1 already exists.
The simulation will write over it. Use this name?</source>
        <translation>%1 は既に存在します。
計算を実行すると上書きされます。この名前を使いますか?</translation>
    </message>
    <message>
        <source>Choose a File</source>
        <translation>ファイルの選択</translation>
    </message>
    <message>
        <source>Rows without a file name (%1) are left out when the file is saved.</source>
        <translation>ファイル名のない行(%1行)は、保存時に除かれます。</translation>
    </message>
    <message>
        <source>Mark title</source>
        <translation>マークの名称</translation>
    </message>
    <message>
        <source>Average Range</source>
        <translation>平均範囲</translation>
    </message>
    <message>
        <source>Water Width</source>
        <translation>水面幅</translation>
    </message>
    <message>
        <source>Radius</source>
        <translation>半径</translation>
    </message>
    <message>
        <source>Slope of Bed Channel</source>
        <translation>河床勾配</translation>
    </message>
    <message>
        <source>Width of Low Water Channel</source>
        <translation>低水路幅</translation>
    </message>
    <message>
        <source>Area of Low Water Channel</source>
        <translation>低水路流積</translation>
    </message>
    <message>
        <source>dH (Observed)</source>
        <translation>dH(実測値)</translation>
    </message>
    <message>
        <source>User Def. Marks</source>
        <translation>ユーザー定義マーク</translation>
    </message>
    <message>
        <source>W. L. Incr. - Curves</source>
        <translation>水位上昇 - 湾曲</translation>
    </message>
    <message>
        <source>W. L. Incr. - Sand Bars</source>
        <translation>水位上昇 - 砂州</translation>
    </message>
    <message>
        <source>Time Series Output</source>
        <translation>時系列出力</translation>
    </message>
    <message>
        <source>Maps</source>
        <translation>マップ</translation>
    </message>
    <message>
        <source>File name</source>
        <translation>ファイル名</translation>
    </message>
    <message>
        <source>Water level
Discharge
Velocity
Cross section area
Flow width
Radius
Resistance number
Conveyance
Froude number
Volume
Flooded area
Mass error
Lateral inflows
Water level slope
Energy level slope
Energy level
Bed shear stress
Lowest river bed level
Left levee bank level (marker 1)
Right levee bank level (marker 3)
Min. of left and right levee bank level
Left low flow bank level (marker 4)
Right low flow bank level (marker 5)
Min. of left and right low flow bank level
Center X-Y coordinates
Left X-Y coordinates
Right X-Y coordinates
User defined marks</source>
        <translation>水位
流量
流速
流積
水面幅
径深
抵抗係数
通水能
フルード数
貯留量
浸水面積
質量誤差
横流入
水面勾配
エネルギー勾配
エネルギー水頭
河床せん断応力
最深河床高
左岸堤防高(マーカー1)
右岸堤防高(マーカー3)
左右岸堤防高の低い方
左岸低水路岸高(マーカー4)
右岸低水路岸高(マーカー5)
左右岸低水路岸高の低い方
中央XY座標
左岸XY座標
右岸XY座標
ユーザー定義マーク</translation>
    </message>
    <message>
        <source>%1 does not exist.
The simulation will look for it. Use this name?</source>
        <translation>%1 は存在しません。
計算時にこのファイルが読み込まれます。この名前を使いますか?</translation>
    </message>
    <message>
        <source>Resistance = a·(V·R)^b, between minimum and maximum. V is the velocity in m/s, R the hydraulic radius in m.</source>
        <translation>抵抗値 = a·(V·R)^b(最小値と最大値の間)。Vは流速(m/s)、Rは径深(m)です。</translation>
    </message>
    <message>
        <source>The formula changes from %1 to %2. Convert the values too (M = 1/n)?

Yes changes %3 values, for example %4 to %5: the global values, all lines, and the coefficients, bounds and tables of the toolbox.
No leaves every value as it is. Flood plain resistances stay as they are in any case.</source>
        <translation>抵抗則が「%1」から「%2」に変わります。値も換算しますか(M = 1/n)?

「はい」では%3個の値が変わります(例: %4 → %5)。全体値、すべての行、ツールの係数・上下限・表が対象です。
「いいえ」では値はすべてそのままです。高水敷の抵抗はどちらの場合も変わりません。</translation>
    </message>
    <message>
        <source>The formula changes from %1 to %2.

Between the two no value can be converted without a hydraulic radius, so all %3 values stay as they are.</source>
        <translation>抵抗則が「%1」から「%2」に変わります。

両者の間の換算には径深が必要なため、%3個の値はすべてそのままです。</translation>
    </message>
    <message>
        <source>Conversion of resistances</source>
        <translation>抵抗値の換算</translation>
    </message>
    <message>
        <source>In a field</source>
        <translation>入力欄</translation>
    </message>
    <message>
        <source>Takes what is typed</source>
        <translation>入力を確定する</translation>
    </message>
    <message>
        <source>Takes back what is typed</source>
        <translation>入力を取り消す</translation>
    </message>
    <message>
        <source>In a table</source>
        <translation>表</translation>
    </message>
    <message>
        <source>Saved</source>
        <translation>保存しました</translation>
    </message>
    <message>
        <source>Saved; %1 (undo brings back what was dropped)</source>
        <translation>保存しました。%1(「元に戻す」で復元できます)</translation>
    </message>
    <message>
        <source>, </source>
        <translation>、</translation>
    </message>
    <message>
        <source>1 line without location dropped</source>
        <translation>位置のない 1 行を除きました</translation>
    </message>
    <message>
        <source>%1 lines without location dropped</source>
        <translation>位置のない %1 行を除きました</translation>
    </message>
    <message>
        <source>1 mark without title dropped</source>
        <translation>名称のないマーク 1 件を除きました</translation>
    </message>
    <message>
        <source>%1 marks without title dropped</source>
        <translation>名称のないマーク %1 件を除きました</translation>
    </message>
    <message>
        <source>1 row without file name dropped</source>
        <translation>ファイル名のない 1 行を除きました</translation>
    </message>
    <message>
        <source>%1 rows without file name dropped</source>
        <translation>ファイル名のない %1 行を除きました</translation>
    </message>
    <message>
        <source>Marks without a title (%1) and the levels below them are left out when the file is saved.</source>
        <translation>名称のないマーク(%1 件)とその水位は、ファイルの保存時に除かれます。</translation>
    </message>
    <message>
        <source>1 encroachment set-up without a filled second line was not written</source>
        <translation>2行目が入力されていない河積阻害の設定1件は書き込まれませんでした</translation>
    </message>
    <message>
        <source>%1 encroachment set-ups without a filled second line were not written</source>
        <translation>2行目が入力されていない河積阻害の設定%1件は書き込まれませんでした</translation>
    </message>
    <message>
        <source>&amp;Resistance:</source>
        <translation>抵抗値(&amp;R):</translation>
    </message>
    <message>
        <source>Zone &amp;1 (main channel):</source>
        <translation>区分1(低水路)(&amp;1):</translation>
    </message>
    <message>
        <source>Zone &amp;2 (transition):</source>
        <translation>区分2(遷移部)(&amp;2):</translation>
    </message>
    <message>
        <source>Zone &amp;3 (flood plain):</source>
        <translation>区分3(高水敷)(&amp;3):</translation>
    </message>
    <message>
        <source>&amp;Uniform section
&amp;Three zones</source>
        <translation>断面一様(&amp;U)
3区分(&amp;T)</translation>
    </message>
    <message>
        <source>Re&amp;sistance formula:</source>
        <translation>抵抗則(&amp;S):</translation>
    </message>
    <message>
        <source>Manning&apos;s M
Manning&apos;s n
Chezy</source>
        <translation>マニングのM(粗度係数の逆数)
マニングの粗度係数n
シェジー係数</translation>
    </message>
    <message>
        <source>&amp;Method:</source>
        <translation>方法(&amp;M):</translation>
    </message>
    <message>
        <source>Not used
Coefficients a and b
Table over velocity</source>
        <translation>使用しない
係数aとb
流速に対する表</translation>
    </message>
    <message>
        <source>Zone &amp;1</source>
        <translation>区分1(&amp;1)</translation>
    </message>
    <message>
        <source>Zone &amp;2</source>
        <translation>区分2(&amp;2)</translation>
    </message>
    <message>
        <source>Zone &amp;3</source>
        <translation>区分3(&amp;3)</translation>
    </message>
    <message>
        <source>Coefficient &amp;a:</source>
        <translation>係数a(&amp;A):</translation>
    </message>
    <message>
        <source>Coefficient &amp;b:</source>
        <translation>係数b(&amp;B):</translation>
    </message>
    <message>
        <source>Mi&amp;nimum resistance:</source>
        <translation>最小抵抗値(&amp;N):</translation>
    </message>
    <message>
        <source>Ma&amp;ximum resistance:</source>
        <translation>最大抵抗値(&amp;X):</translation>
    </message>
    <message>
        <source>Del&amp;ta:</source>
        <translation>Delta(&amp;T):</translation>
    </message>
    <message>
        <source>Delh&amp;s:</source>
        <translation>Delhs(&amp;S):</translation>
    </message>
    <message>
        <source>&amp;Delh:</source>
        <translation>Delh(&amp;D):</translation>
    </message>
    <message>
        <source>&amp;Alpha:</source>
        <translation>Alpha(&amp;A):</translation>
    </message>
    <message>
        <source>Theta:</source>
        <translation>Theta:</translation>
    </message>
    <message>
        <source>E&amp;ps:</source>
        <translation>Eps(&amp;P):</translation>
    </message>
    <message>
        <source>Dh N&amp;ode:</source>
        <translation>Dh Node(&amp;O):</translation>
    </message>
    <message>
        <source>&amp;Zeta Min:</source>
        <translation>Zeta Min(&amp;Z):</translation>
    </message>
    <message>
        <source>St&amp;ruc Fac:</source>
        <translation>Struc Fac(&amp;R):</translation>
    </message>
    <message>
        <source>Fro&amp;udeMax:</source>
        <translation>FroudeMax(&amp;U):</translation>
    </message>
    <message>
        <source>FroudeE&amp;xp:</source>
        <translation>FroudeExp(&amp;X):</translation>
    </message>
    <message>
        <source>&amp;Inter1Max:</source>
        <translation>Inter1Max(&amp;I):</translation>
    </message>
    <message>
        <source>&amp;MaxIterSteady:</source>
        <translation>MaxIterSteady(&amp;M):</translation>
    </message>
    <message>
        <source>&amp;NoIter:</source>
        <translation>NoIter(&amp;N):</translation>
    </message>
    <message>
        <source>&amp;Maximum number of iterations:</source>
        <translation>最大反復回数(&amp;M):</translation>
    </message>
    <message>
        <source>Flood Plain &amp;Resistance:</source>
        <translation>高水敷の抵抗(&amp;R):</translation>
    </message>
    <message>
        <source>&amp;Included</source>
        <translation>計算する(&amp;I)</translation>
    </message>
    <message>
        <source>L&amp;atitude (N pos.)</source>
        <translation>緯度(北緯を正)(&amp;A)</translation>
    </message>
    <message>
        <source>L&amp;ongitude (W pos.)</source>
        <translation>経度(西経を正)(&amp;O)</translation>
    </message>
    <message>
        <source>&amp;Time meridian zone (W pos.)</source>
        <translation>標準時子午線(西経を正)(&amp;T)</translation>
    </message>
    <message>
        <source>&amp;Displacement in time</source>
        <translation>時刻のずれ(&amp;D)</translation>
    </message>
    <message>
        <source>Li&amp;ght attenuation</source>
        <translation>光の減衰(&amp;G)</translation>
    </message>
    <message>
        <source>&amp;Constant in Beer&apos;s law</source>
        <translation>ベールの法則の定数(&amp;C)</translation>
    </message>
    <message>
        <source>&amp;Parameter A</source>
        <translation>パラメータA(&amp;P)</translation>
    </message>
    <message>
        <source>Parameter &amp;B</source>
        <translation>パラメータB(&amp;B)</translation>
    </message>
    <message>
        <source>Pa&amp;rameter A</source>
        <translation>パラメータA(&amp;R)</translation>
    </message>
    <message>
        <source>Para&amp;meter B</source>
        <translation>パラメータB(&amp;M)</translation>
    </message>
    <message>
        <source>Wate&amp;r Level</source>
        <translation>水位(&amp;R)</translation>
    </message>
    <message>
        <source>Water De&amp;pth</source>
        <translation>水深(&amp;P)</translation>
    </message>
    <message>
        <source>Di&amp;scharge:</source>
        <translation>流量(&amp;S):</translation>
    </message>
    <message>
        <source>Wa&amp;ter Level
Water &amp;Depth</source>
        <translation>水位(&amp;T)
水深(&amp;D)</translation>
    </message>
    <message>
        <source>Wate&amp;r level (h1)</source>
        <translation>水位(h1)(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;Interface level (h0)</source>
        <translation>界面の標高(h0)(&amp;I)</translation>
    </message>
    <message>
        <source>Discharge &amp;toplayer (Q1)</source>
        <translation>上層の流量(Q1)(&amp;T)</translation>
    </message>
    <message>
        <source>Discharge &amp;bottom layer (Q0)</source>
        <translation>下層の流量(Q0)(&amp;B)</translation>
    </message>
    <message>
        <source>&amp;Interface Friction Factor</source>
        <translation>界面摩擦係数(&amp;I)</translation>
    </message>
    <message>
        <source>&amp;Maximum volume of entrainment</source>
        <translation>最大連行量(&amp;M)</translation>
    </message>
    <message>
        <source>Ma&amp;ximum entrainment velocity</source>
        <translation>最大連行速度(&amp;X)</translation>
    </message>
    <message>
        <source>Minimum layer &amp;thickness for entrainment cutoff</source>
        <translation>連行を打ち切る最小層厚(&amp;T)</translation>
    </message>
    <message>
        <source>Minimum relative &amp;density difference</source>
        <translation>最小相対密度差(&amp;D)</translation>
    </message>
    <message>
        <source>&amp;Action for disappearing interface</source>
        <translation>界面消失時の処理(&amp;A)</translation>
    </message>
    <message>
        <source>Nothing
Moving interface up
Moving interface down</source>
        <translation>処理なし
界面を上へ移動
界面を下へ移動</translation>
    </message>
    <message>
        <source>R1 &amp;upward entrainment</source>
        <translation>R1 上向きの連行(&amp;U)</translation>
    </message>
    <message>
        <source>R1 d&amp;ownward entrainment</source>
        <translation>R1 下向きの連行(&amp;O)</translation>
    </message>
    <message>
        <source>&amp;Rs upward entrainment at controls</source>
        <translation>Rs 支配断面での上向きの連行(&amp;R)</translation>
    </message>
    <message>
        <source>&amp;Include Leakage</source>
        <translation>漏水を考慮する(&amp;I)</translation>
    </message>
    <message>
        <source>&amp;Coefficient:</source>
        <translation>係数(&amp;C):</translation>
    </message>
    <message>
        <source>&amp;Generate maps</source>
        <translation>マップを作成する(&amp;G)</translation>
    </message>
    <message>
        <source>&amp;Apply DEM input data for ground elevations</source>
        <translation>地盤高にDEM入力データを使用する(&amp;A)</translation>
    </message>
    <message>
        <source>Apply DEM data between river &amp;cross-sections</source>
        <translation>河川横断面の間にもDEMデータを使用する(&amp;C)</translation>
    </message>
    <message>
        <source>&amp;Map additional flooded areas using help grid from KVR GIS</source>
        <translation>KVR GISの補助グリッドで追加の浸水域を表示する(&amp;M)</translation>
    </message>
    <message>
        <source>Hel&amp;p grid</source>
        <translation>補助グリッド(&amp;P)</translation>
    </message>
    <message>
        <source>Mixing coefficient f&amp;1:</source>
        <translation>混合係数f1(&amp;1):</translation>
    </message>
    <message>
        <source>Mixing coefficient f&amp;2:</source>
        <translation>混合係数f2(&amp;2):</translation>
    </message>
    <message>
        <source>Mixing coefficient f&amp;3:</source>
        <translation>混合係数f3(&amp;3):</translation>
    </message>
    <message>
        <source>Mixing coefficient f&amp;4:</source>
        <translation>混合係数f4(&amp;4):</translation>
    </message>
    <message>
        <source>&amp;Relax:</source>
        <translation>Relax(&amp;R):</translation>
    </message>
    <message>
        <source>&amp;Beta_Limit:</source>
        <translation>Beta_Limit(&amp;B):</translation>
    </message>
    <message>
        <source>Fac_&amp;0:</source>
        <translation>Fac_0(&amp;0):</translation>
    </message>
    <message>
        <source>&amp;Qconv_Factor:</source>
        <translation>Qconv_Factor(&amp;Q):</translation>
    </message>
    <message>
        <source>Hc&amp;onv_Factor:</source>
        <translation>Hconv_Factor(&amp;O):</translation>
    </message>
    <message>
        <source>&amp;Min_Hconv_In_Branch:</source>
        <translation>Min_Hconv_In_Branch(&amp;M):</translation>
    </message>
    <message>
        <source>Q_&amp;struc_Factor:</source>
        <translation>Q_struc_Factor(&amp;S):</translation>
    </message>
    <message>
        <source>Hs&amp;top:</source>
        <translation>Hstop(&amp;T):</translation>
    </message>
    <message>
        <source>&amp;Use energy equation</source>
        <translation>エネルギー式を用いる(&amp;U)</translation>
    </message>
    <message>
        <source>Model contraction and ex&amp;pansion losses</source>
        <translation>急縮・急拡損失を考慮する(&amp;P)</translation>
    </message>
    <message>
        <source>&amp;Allow upstream slope</source>
        <translation>上流向きの水面勾配を許す(&amp;A)</translation>
    </message>
    <message>
        <source>Velocit&amp;y distribution coefficient based on conveyance</source>
        <translation>通水能から流速分布係数を求める(&amp;Y)</translation>
    </message>
    <message>
        <source>&amp;No suppression of convective terms</source>
        <translation>移流項を抑制しない(&amp;N)</translation>
    </message>
    <message>
        <source>Fr&amp;iction slope evaluation</source>
        <translation>摩擦勾配の評価(&amp;I)</translation>
    </message>
    <message>
        <source>Default
Average conveyance
Average friction
Geometric mean
Harmonic mean</source>
        <translation>既定
通水能の平均
摩擦勾配の算術平均
幾何平均
調和平均</translation>
    </message>
    <message>
        <source>&amp;Contraction</source>
        <translation>急縮(&amp;C)</translation>
    </message>
    <message>
        <source>E&amp;xpansion</source>
        <translation>急拡(&amp;X)</translation>
    </message>
    <message>
        <source>&amp;No. of layers</source>
        <translation>層の数(&amp;N)</translation>
    </message>
    <message>
        <source>&amp;Densities calculated</source>
        <translation>密度を計算する(&amp;D)</translation>
    </message>
    <message>
        <source>V&amp;iscosity</source>
        <translation>粘性係数(&amp;I)</translation>
    </message>
    <message>
        <source>Turb&amp;ulence model in fluid</source>
        <translation>流体中の乱流モデル(&amp;U)</translation>
    </message>
    <message>
        <source>constant
mixing-length
k model
k-eps model</source>
        <translation>一定
混合距離
kモデル
k-εモデル</translation>
    </message>
    <message>
        <source>Turbulence model at &amp;bed</source>
        <translation>河床の乱流モデル(&amp;B)</translation>
    </message>
    <message>
        <source>drag coefficient</source>
        <translation>抗力係数</translation>
    </message>
    <message>
        <source>&amp;Richardson numbers correction</source>
        <translation>リチャードソン数による補正(&amp;R)</translation>
    </message>
    <message>
        <source>Fa&amp;ctor</source>
        <translation>係数(&amp;C)</translation>
    </message>
    <message>
        <source>L&amp;ocal bed slope</source>
        <translation>局所河床勾配(&amp;O)</translation>
    </message>
    <message>
        <source>Factor hori&amp;zontal momentum</source>
        <translation>水平運動量の係数(&amp;Z)</translation>
    </message>
    <message>
        <source>Factor vertical &amp;momentum</source>
        <translation>鉛直運動量の係数(&amp;M)</translation>
    </message>
    <message>
        <source>Factor &amp;advection</source>
        <translation>移流の係数(&amp;A)</translation>
    </message>
    <message>
        <source>Factor horizontal vi&amp;scosity</source>
        <translation>水平渦動粘性の係数(&amp;S)</translation>
    </message>
    <message>
        <source>Factor vertical viscosit&amp;y</source>
        <translation>鉛直渦動粘性の係数(&amp;Y)</translation>
    </message>
    <message>
        <source>&amp;Generate time series output files</source>
        <translation>時系列出力ファイルを作成する(&amp;G)</translation>
    </message>
    <message>
        <source>&amp;Delimiter in output file</source>
        <translation>区切り文字(&amp;D)</translation>
    </message>
    <message>
        <source>Width of col&amp;umns</source>
        <translation>列幅(&amp;U)</translation>
    </message>
    <message>
        <source>Limited output &amp;period</source>
        <translation>出力期間を限定する(&amp;P)</translation>
    </message>
    <message>
        <source>&amp;Start</source>
        <translation>開始(&amp;S)</translation>
    </message>
    <message>
        <source>E&amp;nd</source>
        <translation>終了(&amp;N)</translation>
    </message>
    <message>
        <source>&amp;All
Only from the l&amp;ist
All ex&amp;cepted those from the list</source>
        <translation>すべて(&amp;A)
一覧のもののみ(&amp;I)
一覧のものを除くすべて(&amp;C)</translation>
    </message>
    <message>
        <source>Wave &amp;Approximation:</source>
        <translation>波動近似(&amp;A):</translation>
    </message>
    <message>
        <source>&amp;Include wind</source>
        <translation>風を考慮する(&amp;I)</translation>
    </message>
    <message>
        <source>To&amp;pographical Factor</source>
        <translation>地形係数(&amp;P)</translation>
    </message>
    <message>
        <source>Fri&amp;ction Factor</source>
        <translation>摩擦係数(&amp;C)</translation>
    </message>
    <message>
        <source>Enabling water level &amp;increment due to curve</source>
        <translation>湾曲による水位上昇を考慮する(&amp;I)</translation>
    </message>
    <message>
        <source>Average &amp;Range</source>
        <translation>平均範囲(&amp;R)</translation>
    </message>
    <message>
        <source>Water &amp;Surface width</source>
        <translation>水面幅(&amp;S)</translation>
    </message>
    <message>
        <source>&amp;Curvature Radius</source>
        <translation>曲率半径(&amp;C)</translation>
    </message>
    <message>
        <source>Veloci&amp;ty</source>
        <translation>流速(&amp;T)</translation>
    </message>
    <message>
        <source>Enabling water level &amp;increment due to sand bars</source>
        <translation>砂州による水位上昇を考慮する(&amp;I)</translation>
    </message>
    <message>
        <source>&amp;Slope / Low Water channel Width / Water Area of Annual Max Discharge
&amp;dH (Observed)</source>
        <translation>河床勾配・低水路幅・年最大流量時の流積(&amp;S)
dH(実測値)(&amp;D)</translation>
    </message>
    <message>
        <source>&amp;Minimum</source>
        <translation>最小値(&amp;M)</translation>
    </message>
    <message>
        <source>Ma&amp;ximum</source>
        <translation>最大値(&amp;X)</translation>
    </message>
    <message>
        <source>Time &amp;of minimum</source>
        <translation>最小値の時刻(&amp;O)</translation>
    </message>
    <message>
        <source>&amp;Time of maximum</source>
        <translation>最大値の時刻(&amp;T)</translation>
    </message>
    <message>
        <source>Velocity
Discharge
Cross Section Area
Flow Width
Radius
Resistance
Conveyance
Froude Number
Volume
Flood Area
Mass Error
Accumulated Mass Error
Lateral Inflows
Water level slope
Energy level slope
Energy level
Bed shear stress
Groundwater head
Time Step</source>
        <translation>流速
流量
流水断面積
水面幅
径深
抵抗値
通水能
フルード数
貯水量
氾濫面積
質量誤差
累積質量誤差
横流入量
水面勾配
エネルギー勾配
エネルギー水位
河床せん断応力
地下水頭
計算時間間隔</translation>
    </message>
    <message>
        <source>No field and no page has a name or keyword like this.</source>
        <translation>この名前またはキーワードの項目やページはありません。</translation>
    </message>
    <message>
        <source>Water level, or water depth, from which the computation starts wherever no line gives another one.</source>
        <translation>行で指定のない地点の、計算開始時の水位または水深。</translation>
    </message>
    <message>
        <source>Whether the initial values are water levels above the datum or water depths above the lowest point of the cross section.</source>
        <translation>初期値を、基準面からの水位とするか、横断面の最深点からの水深とするか。</translation>
    </message>
    <message>
        <source>Discharge from which the computation starts wherever no line gives another one; positive towards increasing chainage.</source>
        <translation>行で指定のない地点の、計算開始時の流量。追加距離が増える向きを正とする。</translation>
    </message>
    <message>
        <source>Multiplies the shear stress of the wind on the water surface: 1 in open terrain, less where banks, trees or buildings shelter the river.</source>
        <translation>水面に働く風のせん断応力に掛ける係数。開けた地形では1、堤防・樹木・建物に遮られる所では1より小さくする。</translation>
    </message>
    <message>
        <source>Resistance of the bed in the chosen formula. A larger Manning&apos;s n slows the flow and raises the water level; a larger M or Chezy coefficient does the opposite.</source>
        <translation>選択した抵抗則による河床の抵抗値。マニングのnが大きいほど流れは遅く、水位は高くなる。マニングのMとシェジー係数ではその逆になる。</translation>
    </message>
    <message>
        <source>Resistance of the flood plain, which holds there instead of that of the river bed. The default -99 stands for none of its own.</source>
        <translation>高水敷の抵抗値。高水敷では河床の抵抗値に代えて用いる。既定値の-99は、固有の値がないことを表す。</translation>
    </message>
    <message>
        <source>How much of the momentum equation is solved. Fully dynamic: all terms. Diffusive: without the acceleration terms, so not for tides or fast waves. Kinematic: bed slope and friction only, so without backwater.</source>
        <translation>運動方程式のどの項まで解くか。ダイナミックウェーブは全項を解く。拡散波近似は加速度項を省くため、潮汐や速い波には使えない。キネマティックウェーブ近似は河床勾配と摩擦だけを考え、背水を表せない。</translation>
    </message>
    <message>
        <source>Whether one resistance holds in the whole cross section, or main channel, transition and flood plain have one each.</source>
        <translation>断面全体に一つの抵抗値を用いるか、低水路・遷移部・高水敷の3区分に別々の値を用いるか。</translation>
    </message>
    <message>
        <source>Resistance of the main channel, where cross sections have three zones.</source>
        <translation>断面を3区分とする場合の、低水路の抵抗値。</translation>
    </message>
    <message>
        <source>Resistance of the transition from the main channel to the flood plain, where cross sections have three zones.</source>
        <translation>断面を3区分とする場合の、低水路から高水敷への遷移部の抵抗値。</translation>
    </message>
    <message>
        <source>Resistance of the flood plain, where cross sections have three zones.</source>
        <translation>断面を3区分とする場合の、高水敷の抵抗値。</translation>
    </message>
    <message>
        <source>Time weight of the water surface slope in the momentum equation: 0.5 takes old and new time level alike, 1 the new one only. Larger values damp oscillations, and flatten fast waves.</source>
        <translation>運動方程式の水面勾配項の時間重み。0.5では新旧の時間レベルを等しく、1では新しい時間レベルだけを用いる。大きいほど振動は抑えられるが、速い波が平滑化される。</translation>
    </message>
    <message>
        <source>Difference of water level across a structure below which its discharge is taken as proportional to that difference. Larger values steady structures that are nearly drowned, and make their discharge less exact.</source>
        <translation>構造物の上下流の水位差がこの値より小さいとき、流量を水位差に比例するものとして扱う。大きいほど、もぐり状態に近い構造物の計算は安定するが、流量の精度は下がる。</translation>
    </message>
    <message>
        <source>Height of the narrow slot below the lowest point of a cross section that keeps some water when the river falls dry. Larger values are more stable and add more water that is not there.</source>
        <translation>河道が干上がっても少量の水を残すため、横断面の最深点の下に設ける細いスリットの高さ。大きいほど安定するが、実在しない水量が増える。</translation>
    </message>
    <message>
        <source>Velocity distribution coefficient: multiplies the convective acceleration in the momentum equation. 1 where the velocity is the same all over the section, more where it varies.</source>
        <translation>流速分布係数。運動方程式の移流加速度項に掛ける。断面内の流速が一様なら1、ばらつきが大きいほど大きくする。</translation>
    </message>
    <message>
        <source>Weight of the new time level in the convective acceleration of the implicit scheme: 0.5 halfway between both levels, 1 fully forward. Larger values are more stable and less accurate in time.</source>
        <translation>陰解法の移流加速度項における、新しい時間レベルの重み。0.5は新旧の中間、1は完全な前進型。大きいほど安定するが、時間方向の精度は下がる。</translation>
    </message>
    <message>
        <source>Slope of the water surface below which the diffusive wave approximation is solved fully forward in time. Larger values calm oscillations where the surface is nearly level.</source>
        <translation>拡散波近似を時間方向に完全な前進型で解くことにする、水面勾配の限界値。大きいほど、水面がほぼ水平な所の振動が抑えられる。</translation>
    </message>
    <message>
        <source>Step of water level with which the equations of a node, where branches meet, are differentiated numerically. The default hardly ever needs a change.</source>
        <translation>河川が合流する節点の方程式を数値微分する際の、水位の刻み幅。通常は既定値のままでよい。</translation>
    </message>
    <message>
        <source>Least head loss coefficient of a structure: inflow and outflow losses that sum up to less are raised to it. Larger values steady wide structures, and cost some head.</source>
        <translation>構造物の損失係数の下限。流入と流出の損失の合計がこれより小さいときは、この値に引き上げる。大きいほど幅の広い構造物の計算は安定するが、損失水頭が増える。</translation>
    </message>
    <message>
        <source>Damps the change of a structure&apos;s discharge from one iteration to the next; 0 does not damp. Larger values calm structures that oscillate, and converge more slowly.</source>
        <translation>構造物の流量が反復ごとに変わる量を抑える係数。0では抑えない。大きいほど構造物での振動は収まるが、収束は遅くなる。</translation>
    </message>
    <message>
        <source>Froude number from which on the convective acceleration is left out, which keeps the computation stable near and above critical flow. A negative value stands for the usual suppression.</source>
        <translation>移流加速度項を完全に省くフルード数。限界流付近や射流での計算を安定させる。負の値では通常の抑制を用いる。</translation>
    </message>
    <message>
        <source>How the suppression of the convective acceleration grows with the Froude number: a larger exponent leaves more of it in subcritical flow. A negative value stands for the usual suppression.</source>
        <translation>フルード数に応じて移流加速度項の抑制が強まる度合いを表す指数。大きいほど、常流では移流加速度項が多く残る。負の値では通常の抑制を用いる。</translation>
    </message>
    <message>
        <source>Iterations of the implicit solution in each time step. 1 does for most rivers; 2 or more are more exact where water levels change fast, and take longer.</source>
        <translation>各時間ステップでの陰解法の反復回数。多くの河川では1で足りる。水位の変化が速い場合は2以上にすると精度が上がるが、計算時間も増える。</translation>
    </message>
    <message>
        <source>Most iterations when the steady water surface from which the computation starts is determined.</source>
        <translation>計算開始時の定常水面形を求める際の、最大反復回数。</translation>
    </message>
    <message>
        <source>Most iterations at a structure to find the discharge that goes with the water levels on both sides.</source>
        <translation>構造物の両側の水位に見合う流量を求める際の、最大反復回数。</translation>
    </message>
    <message>
        <source>Whether the shear stress of the wind on the water surface is part of the momentum equation.</source>
        <translation>水面に働く風のせん断応力を、運動方程式に含めるかどうか。</translation>
    </message>
    <message>
        <source>Formula in which the bed resistances of all pages are given. Manning&apos;s M, which is 1/n, and the Chezy coefficient are larger for smoother beds, Manning&apos;s n for rougher ones.</source>
        <translation>すべてのページの河床抵抗値に用いる抵抗則。マニングのM(nの逆数)とシェジー係数は河床が滑らかなほど大きく、マニングのnは粗いほど大きい。</translation>
    </message>
    <message>
        <source>Share of each computed change that the quasi-steady solver applies, from 0 to 1. Smaller values converge more slowly and more surely.</source>
        <translation>準定常計算で、求めた修正量のうち実際に適用する割合(0から1)。小さいほど収束は遅いが、確実になる。</translation>
    </message>
    <message>
        <source>Smallest number that the quasi-steady solver divides by: smaller ones are raised to it, so that the convergence tests neither overflow nor underflow.</source>
        <translation>準定常計算で除数とする値の下限。これより小さい値はこの値に引き上げ、収束判定でのオーバーフローやアンダーフローを防ぐ。</translation>
    </message>
    <message>
        <source>Multiplies the stop criteria of both discharge and water level. Larger values end the iterations sooner, with a less accurate result.</source>
        <translation>流量と水位の両方の収束判定値に掛ける係数。大きいほど反復は早く終わるが、結果の精度は下がる。</translation>
    </message>
    <message>
        <source>Relative change of discharge from one iteration to the next at which discharges count as converged. Smaller values are more accurate and take longer.</source>
        <translation>反復ごとの流量の相対変化がこの値以下になれば、流量は収束したとみなす。小さいほど精度は上がるが、計算時間も増える。</translation>
    </message>
    <message>
        <source>Relative change of water level from one iteration to the next at which water levels count as converged. Smaller values are more accurate and take longer.</source>
        <translation>反復ごとの水位の相対変化がこの値以下になれば、水位は収束したとみなす。小さいほど精度は上がるが、計算時間も増える。</translation>
    </message>
    <message>
        <source>Least stop criterion for the water levels of a branch: where the relative one asks for less, this change counts as converged.</source>
        <translation>河川内の水位の収束判定値の下限。相対的な判定値がこれより小さくなる場合は、この変化量で収束とみなす。</translation>
    </message>
    <message>
        <source>Relative step of discharge with which the slope of a structure&apos;s relation between discharge and water level is determined.</source>
        <translation>構造物の流量と水位の関係の勾配を求める際の、流量の相対的な刻み幅。</translation>
    </message>
    <message>
        <source>Change of water level between two iterations of the whole network at which the backwater computation stops. Smaller values are more accurate and take longer.</source>
        <translation>河道網全体の反復で、水位の変化がこの値以下になれば背水計算を終える。小さいほど精度は上がるが、計算時間も増える。</translation>
    </message>
    <message>
        <source>Adds a loss of head where the flow contracts or expands from one cross section to the next.</source>
        <translation>隣り合う横断面の間で流れが急縮・急拡する所に、損失水頭を加える。</translation>
    </message>
    <message>
        <source>Allows a steady water surface that falls in the upstream direction. Otherwise the surface is kept from doing so.</source>
        <translation>定常計算の水面が上流に向かって下がることを許す。許さない場合は、そうならないように抑える。</translation>
    </message>
    <message>
        <source>Determines the velocity distribution coefficient of each section from the conveyance of its parts, instead of the same Alpha everywhere.</source>
        <translation>各断面の流速分布係数を、どこでも同じAlphaではなく、断面各部の通水能から求める。</translation>
    </message>
    <message>
        <source>Keeps the convective terms in full near and above critical flow, where they are reduced otherwise: more exact there, and less stable.</source>
        <translation>限界流付近や射流で通常は弱める移流項を、そのまま残す。精度は上がるが、計算は不安定になりやすい。</translation>
    </message>
    <message>
        <source>Computes the steady water surface by the energy equation, with friction over the reach lengths and losses of contraction and expansion, instead of the momentum equation.</source>
        <translation>定常水面形を、運動方程式ではなくエネルギー式(区間長に沿う摩擦と急縮・急拡の損失を含む)で計算する。</translation>
    </message>
    <message>
        <source>How the friction slope between two cross sections follows from the slopes or conveyances at both, in the energy equation.</source>
        <translation>エネルギー式で、二つの横断面の摩擦勾配または通水能から、その間の摩擦勾配をどのように求めるか。</translation>
    </message>
    <message>
        <source>Multiplies the difference of the velocity heads where the velocity increases downstream, for the loss of head. From 0.1 for gradual to 0.6 for abrupt transitions.</source>
        <translation>下流に向かって流速が増す所で、速度水頭の差に掛けて損失水頭とする係数。緩やかな断面変化で0.1、急な変化で0.6程度。</translation>
    </message>
    <message>
        <source>Multiplies the difference of the velocity heads where the velocity decreases downstream, for the loss of head. From 0.3 for gradual to 0.8 for abrupt transitions.</source>
        <translation>下流に向かって流速が減る所で、速度水頭の差に掛けて損失水頭とする係数。緩やかな断面変化で0.3、急な変化で0.8程度。</translation>
    </message>
    <message>
        <source>Strength of the momentum exchange between parts of the cross section that flow at different velocities, such as main channel, flood plain and vegetation. A larger coefficient slows the faster part more and raises the water level.</source>
        <translation>断面内で流速の異なる部分(低水路、高水敷、樹木群など)の間の運動量交換の強さ。大きいほど速い部分の流れが抑えられ、水位が上がる。</translation>
    </message>
    <message>
        <source>Name of a mark, such as a warning level. The locations have a column of levels for each.</source>
        <translation>警戒水位などのマークの名称。地点の表には、名称ごとに水位の列がある。</translation>
    </message>
    <message>
        <source>Whether levels of the mark between its locations are interpolated along the chainage.</source>
        <translation>マークの水位を、地点の間で追加距離に沿って補間するかどうか。</translation>
    </message>
    <message>
        <source>How the resistance follows the flow: not at all, by the formula a·(V·R)^b, or by a table over the velocity.</source>
        <translation>流れに応じて抵抗値をどのように変えるか。変えない、式 a·(V·R)^b による、流速に対する表による、のいずれか。</translation>
    </message>
    <message>
        <source>Whether the resistance of this zone follows the flow as set here; otherwise it stays as the page of the bed resistance gives it.</source>
        <translation>この区分の抵抗値を、ここでの設定により流れに応じて変えるかどうか。変えない場合は、河床抵抗のページの値のままとする。</translation>
    </message>
    <message>
        <source>Factor a in a·(V·R)^b, where V is the velocity in m/s and R the hydraulic radius in m.</source>
        <translation>式 a·(V·R)^b の係数a。Vは流速(m/s)、Rは径深(m)。</translation>
    </message>
    <message>
        <source>Exponent b in a·(V·R)^b: 0 makes the resistance independent of the flow.</source>
        <translation>式 a·(V·R)^b の指数b。0では抵抗値は流れによらない。</translation>
    </message>
    <message>
        <source>Least resistance that comes of a·(V·R)^b: smaller results are raised to it.</source>
        <translation>式 a·(V·R)^b による抵抗値の下限。これより小さい値はこの値に引き上げる。</translation>
    </message>
    <message>
        <source>Largest resistance that comes of a·(V·R)^b: larger results are reduced to it.</source>
        <translation>式 a·(V·R)^b による抵抗値の上限。これより大きい値はこの値に引き下げる。</translation>
    </message>
    <message>
        <source>Whether the rise of the water level at the outer bank of a bend is determined. It is in proportion to width and square of the velocity, and inverse to the radius.</source>
        <translation>湾曲部の外岸での水位上昇を求めるかどうか。水位上昇は水面幅と流速の2乗に比例し、曲率半径に反比例する。</translation>
    </message>
    <message>
        <source>Whether the simulation determines this itself. Its column is locked then.</source>
        <translation>この値を計算の中で求めるかどうか。求める場合、その列は変更できない。</translation>
    </message>
    <message>
        <source>Length of the river over which width, radius and velocity are averaged: none, a single one, or multiples of it.</source>
        <translation>水面幅・曲率半径・流速を平均する河川の範囲。なし、単一、またはその倍数。</translation>
    </message>
    <message>
        <source>Width of the water surface in the bend. The wider, the larger the rise of the water level.</source>
        <translation>湾曲部の水面幅。広いほど水位上昇は大きい。</translation>
    </message>
    <message>
        <source>Radius of curvature of the river&apos;s axis. The smaller, the larger the rise of the water level.</source>
        <translation>河道中心線の曲率半径。小さいほど水位上昇は大きい。</translation>
    </message>
    <message>
        <source>Mean velocity in the bend. The rise of the water level grows with its square.</source>
        <translation>湾曲部の平均流速。水位上昇はその2乗に比例する。</translation>
    </message>
    <message>
        <source>Whether the rise of the water level that sand bars cause is determined.</source>
        <translation>砂州による水位上昇を求めるかどうか。</translation>
    </message>
    <message>
        <source>Whether the rise is determined from slope, width and flow area, or given as it was observed. The columns of the other method are locked.</source>
        <translation>水位上昇を河床勾配・低水路幅・流積から求めるか、実測値で与えるか。もう一方の方法の列は変更できない。</translation>
    </message>
    <message>
        <source>Slope of the river bed, from which the height of the sand bars is determined.</source>
        <translation>砂州の高さを求めるための河床勾配。</translation>
    </message>
    <message>
        <source>Width of the low water channel in which the sand bars lie.</source>
        <translation>砂州のある低水路の幅。</translation>
    </message>
    <message>
        <source>Flow area of the low water channel at the largest discharge of a year.</source>
        <translation>年最大流量時の低水路の流積。</translation>
    </message>
    <message>
        <source>Rise of the water level due to sand bars, as it was observed.</source>
        <translation>砂州による水位上昇の実測値。</translation>
    </message>
    <message>
        <source>Most iterations to find the positions of the encroachment that meet the target.</source>
        <translation>目標を満たす河積阻害の位置を求める際の、最大反復回数。</translation>
    </message>
    <message>
        <source>Whether the exchange of heat with the atmosphere, by radiation and evaporation, is part of the computation of the water temperature.</source>
        <translation>水温の計算に、放射や蒸発による大気との熱交換を含めるかどうか。</translation>
    </message>
    <message>
        <source>Latitude of the river, positive in the north. With date and time it gives the height of the sun.</source>
        <translation>河川の緯度(北緯を正)。日時とあわせて太陽高度を決める。</translation>
    </message>
    <message>
        <source>Longitude of the river, positive in the west. Its distance from the meridian of the time zone shifts the noon of the sun.</source>
        <translation>河川の経度(西経を正)。標準時子午線との差だけ太陽の南中時刻がずれる。</translation>
    </message>
    <message>
        <source>Meridian of the time zone in which the times of the simulation are given, positive in the west.</source>
        <translation>計算の時刻が従う時間帯の標準時子午線(西経を正)。</translation>
    </message>
    <message>
        <source>Difference of the clock from the standard time of the time zone, as in summer time.</source>
        <translation>夏時間など、時計の標準時からのずれ。</translation>
    </message>
    <message>
        <source>How fast the light of the sun fades with the depth. The larger, as in turbid water, the nearer to the surface its heat stays.</source>
        <translation>日射が深さとともに減衰する速さ。濁った水のように大きいほど、熱は水面近くにとどまる。</translation>
    </message>
    <message>
        <source>Share of the radiation of the sun that the surface absorbs at once, from 0 to 1. The rest goes down by Beer&apos;s law.</source>
        <translation>日射のうち水面で直ちに吸収される割合(0から1)。残りはベールの法則に従って水中に達する。</translation>
    </message>
    <message>
        <source>Share a of the sun&apos;s radiation that comes through an overcast sky, in a + b·n/N, where n of N possible hours are sunny.</source>
        <translation>曇天でも地上に達する日射の割合a。式 a + b·n/N(Nは可照時間、nは日照時間)で用いる。</translation>
    </message>
    <message>
        <source>Share b of the sun&apos;s radiation that a clear sky adds, in a + b·n/N, where n of N possible hours are sunny.</source>
        <translation>晴天で加わる日射の割合b。式 a + b·n/N(Nは可照時間、nは日照時間)で用いる。</translation>
    </message>
    <message>
        <source>Part a of the evaporation that does not depend on the wind, in Dalton&apos;s law a + b·W with the wind speed W.</source>
        <translation>蒸発のうち風によらない部分の係数a。ダルトンの法則 a + b·W(Wは風速)で用いる。</translation>
    </message>
    <message>
        <source>Growth b of the evaporation with the wind, in Dalton&apos;s law a + b·W with the wind speed W.</source>
        <translation>風速とともに増す蒸発の係数b。ダルトンの法則 a + b·W(Wは風速)で用いる。</translation>
    </message>
    <message>
        <source>Layers into which the depth of stratified branches is divided. More of them show the profile in more detail and take longer.</source>
        <translation>成層を考える河川の水深方向の層の数。多いほど鉛直分布を細かく表せるが、計算時間も増える。</translation>
    </message>
    <message>
        <source>Whether the density follows temperature and salinity, so that its differences drive the flow and damp turbulence.</source>
        <translation>密度を水温と塩分から求め、密度差による流れと乱れの抑制を考慮するかどうか。</translation>
    </message>
    <message>
        <source>Eddy viscosity in the vertical: the one of the constant turbulence model, the first guess of the others.</source>
        <translation>鉛直方向の渦動粘性係数。乱流モデルが「一定」のときの値であり、他のモデルでは初期値となる。</translation>
    </message>
    <message>
        <source>How the exchange by turbulence within the water is determined, from a constant viscosity to two transport equations. The later in the list, the more detailed and the slower.</source>
        <translation>水中の乱れによる交換をどのように求めるか。一定の粘性係数から二つの輸送方程式まで、後のものほど詳しく、計算時間も増える。</translation>
    </message>
    <message>
        <source>How the friction between water and bed is determined.</source>
        <translation>水と河床の間の摩擦をどのように求めるか。</translation>
    </message>
    <message>
        <source>Whether a stable stratification reduces the exchange between layers, by the Richardson number.</source>
        <translation>安定な成層による層間の交換の低減を、リチャードソン数により考慮するかどうか。</translation>
    </message>
    <message>
        <source>Multiplies the pressure that comes of differences in density: 1 in full, 0 without it.</source>
        <translation>密度差による圧力に掛ける係数。1ではそのまま、0では考慮しない。</translation>
    </message>
    <message>
        <source>Multiplies the part of that pressure that comes of the local slope of the bed: 1 in full, 0 without it.</source>
        <translation>密度差による圧力のうち、局所河床勾配による部分に掛ける係数。1ではそのまま、0では考慮しない。</translation>
    </message>
    <message>
        <source>Multiplies the horizontal transport of momentum: 1 in full, 0 without it.</source>
        <translation>運動量の水平輸送に掛ける係数。1ではそのまま、0では考慮しない。</translation>
    </message>
    <message>
        <source>Multiplies the vertical transport of momentum between the layers: 1 in full, 0 without it.</source>
        <translation>層間の運動量の鉛直輸送に掛ける係数。1ではそのまま、0では考慮しない。</translation>
    </message>
    <message>
        <source>Multiplies the advection of temperature and salinity between the layers: 1 in full, 0 without it.</source>
        <translation>層間の水温と塩分の移流に掛ける係数。1ではそのまま、0では考慮しない。</translation>
    </message>
    <message>
        <source>Multiplies the horizontal eddy viscosity: 1 in full, less for sharper fronts.</source>
        <translation>水平方向の渦動粘性に掛ける係数。1ではそのまま、小さいほど前線が鋭くなる。</translation>
    </message>
    <message>
        <source>Multiplies the vertical eddy viscosity: 1 in full, less for a sharper stratification.</source>
        <translation>鉛直方向の渦動粘性に掛ける係数。1ではそのまま、小さいほど成層が鋭くなる。</translation>
    </message>
    <message>
        <source>Friction between the two layers at their interface. The larger, the more one layer drags the other along.</source>
        <translation>二層の界面での摩擦の係数。大きいほど、一方の層が他方の層を引きずる。</translation>
    </message>
    <message>
        <source>Largest volume that one layer takes from the other at a point in a time step. Smaller values are more stable.</source>
        <translation>一つの地点で1時間ステップの間に、一方の層が他方の層から取り込む水量の上限。小さいほど安定する。</translation>
    </message>
    <message>
        <source>Largest velocity of entrainment, at which water passes through the interface.</source>
        <translation>水が界面を通過する連行速度の上限。</translation>
    </message>
    <message>
        <source>Thickness of a layer below which nothing is entrained from it any more, so that it does not vanish.</source>
        <translation>層がこの厚さより薄くなると、消失しないように、その層からの連行を打ち切る。</translation>
    </message>
    <message>
        <source>Least difference of density between the layers, relative to the density, that the computation takes into account: smaller ones are raised to it.</source>
        <translation>計算で考える層間の相対密度差の下限。これより小さい密度差はこの値に引き上げる。</translation>
    </message>
    <message>
        <source>What is done where a layer is used up and the interface reaches the surface or the bed.</source>
        <translation>一方の層がなくなり、界面が水面または河床に達したときの処理。</translation>
    </message>
    <message>
        <source>Richardson bulk flux number of the entrainment from the lower layer into the upper one. The larger, the more the layers mix.</source>
        <translation>下層から上層への連行のバルクフラックス・リチャードソン数。大きいほど二層は混合する。</translation>
    </message>
    <message>
        <source>Richardson bulk flux number of the entrainment from the upper layer into the lower one. The larger, the more the layers mix.</source>
        <translation>上層から下層への連行のバルクフラックス・リチャードソン数。大きいほど二層は混合する。</translation>
    </message>
    <message>
        <source>Richardson bulk flux number of the upward entrainment at hydraulic controls, such as sills and narrows, where mixing is stronger.</source>
        <translation>混合が強まる潜堤や狭窄部などの支配断面での、上向きの連行のバルクフラックス・リチャードソン数。</translation>
    </message>
    <message>
        <source>Water level, the surface of the upper layer, from which the computation starts.</source>
        <translation>計算開始時の水位(上層の水面)。</translation>
    </message>
    <message>
        <source>Level of the interface between the layers from which the computation starts. It lies between bed and water level.</source>
        <translation>計算開始時の二層の界面の標高。河床と水位の間にある。</translation>
    </message>
    <message>
        <source>Discharge of the upper layer from which the computation starts; positive towards increasing chainage.</source>
        <translation>計算開始時の上層の流量。追加距離が増える向きを正とする。</translation>
    </message>
    <message>
        <source>Discharge of the lower layer from which the computation starts; positive towards increasing chainage.</source>
        <translation>計算開始時の下層の流量。追加距離が増える向きを正とする。</translation>
    </message>
    <message>
        <source>Friction between wind and water. The shear stress on the surface grows with it and with the square of the wind speed.</source>
        <translation>風と水面の間の摩擦係数。水面のせん断応力は、この係数と風速の2乗に比例する。</translation>
    </message>
    <message>
        <source>Whether the simulation also writes the items below, at the grid points below, into the files below.</source>
        <translation>計算の際に、下の項目を、下の格子点について、下のファイルにも書き出すかどうか。</translation>
    </message>
    <message>
        <source>Text between two columns of a text file, such as a semicolon.</source>
        <translation>テキストファイルの列の間に置く文字(セミコロンなど)。</translation>
    </message>
    <message>
        <source>Characters that a column of a text file takes.</source>
        <translation>テキストファイルの1列の文字数。</translation>
    </message>
    <message>
        <source>Of which grid points series are written: of all, of those in the list, or of the others.</source>
        <translation>時系列を書き出す格子点。すべて、一覧にあるもののみ、または一覧にないもの。</translation>
    </message>
    <message>
        <source>Whether series are written of a part of the simulated time only.</source>
        <translation>計算期間の一部だけの時系列を書き出すかどうか。</translation>
    </message>
    <message>
        <source>First time that is written.</source>
        <translation>書き出す最初の時刻。</translation>
    </message>
    <message>
        <source>Last time that is written.</source>
        <translation>書き出す最後の時刻。</translation>
    </message>
    <message>
        <source>Adds the smallest value of each series to the text files.</source>
        <translation>各時系列の最小値をテキストファイルに加える。</translation>
    </message>
    <message>
        <source>Adds the largest value of each series to the text files.</source>
        <translation>各時系列の最大値をテキストファイルに加える。</translation>
    </message>
    <message>
        <source>Adds the time of the smallest value of each series to the text files.</source>
        <translation>各時系列の最小値の時刻をテキストファイルに加える。</translation>
    </message>
    <message>
        <source>Adds the time of the largest value of each series to the text files.</source>
        <translation>各時系列の最大値の時刻をテキストファイルに加える。</translation>
    </message>
    <message>
        <source>Result that is written.</source>
        <translation>書き出す計算結果。</translation>
    </message>
    <message>
        <source>Name of the result in the files, instead of the default one.</source>
        <translation>既定の名称に代えてファイルに書く、計算結果の名称。</translation>
    </message>
    <message>
        <source>Decimals with which the numbers are written.</source>
        <translation>数値を書き出す小数桁数。</translation>
    </message>
    <message>
        <source>Format of the file.</source>
        <translation>ファイルの形式。</translation>
    </message>
    <message>
        <source>Whether the simulation names the file after its result file; the file name beside it then counts for nothing.</source>
        <translation>ファイル名を計算結果のファイルに合わせて自動的に付けるかどうか。付ける場合、隣のファイル名は使われない。</translation>
    </message>
    <message>
        <source>File that the simulation writes.</source>
        <translation>計算時に書き出すファイル。</translation>
    </message>
    <message>
        <source>Whether the simulation also writes maps of its results.</source>
        <translation>計算の際に、結果のマップも書き出すかどうか。</translation>
    </message>
    <message>
        <source>Whether the ground between the cross sections of the river is taken from the elevation data too, instead of interpolating it between them.</source>
        <translation>河川の横断面の間の地盤高も、断面からの補間ではなく標高データから取るかどうか。</translation>
    </message>
    <message>
        <source>Whether ground elevations come from the elevation data below; water depths are water levels above them.</source>
        <translation>地盤高を下の標高データから取るかどうか。水深は水位と地盤高の差となる。</translation>
    </message>
    <message>
        <source>Whether areas beside the cross sections that the help grid assigns to the river are mapped too.</source>
        <translation>補助グリッドで河川に割り当てられた、横断面の外側の区域も表示するかどうか。</translation>
    </message>
    <message>
        <source>File of the help grid, which assigns areas beside the cross sections to places of the river.</source>
        <translation>横断面の外側の区域を河川の地点に割り当てる、補助グリッドのファイル。</translation>
    </message>
    <message>
        <source>x coordinate of the map&apos;s origin, its lower left corner.</source>
        <translation>マップの原点(左下隅)のx座標。</translation>
    </message>
    <message>
        <source>y coordinate of the map&apos;s origin, its lower left corner.</source>
        <translation>マップの原点(左下隅)のy座標。</translation>
    </message>
    <message>
        <source>Angle by which the map&apos;s grid is turned against north.</source>
        <translation>マップの格子が北に対して回転している角度。</translation>
    </message>
    <message>
        <source>Length of the sides of a cell. Smaller cells show more detail and make larger files.</source>
        <translation>格子の一辺の長さ。小さいほど詳しくなるが、ファイルも大きくなる。</translation>
    </message>
    <message>
        <source>Number of cells in the direction of the x axis.</source>
        <translation>x軸方向の格子の数。</translation>
    </message>
    <message>
        <source>Number of cells in the direction of the y axis.</source>
        <translation>y軸方向の格子の数。</translation>
    </message>
    <message>
        <source>File that the simulation writes the map to.</source>
        <translation>計算時にマップを書き出すファイル。</translation>
    </message>
    <message>
        <source>Whether the map shows the largest or the smallest value of the period, or each stored time (dynamic).</source>
        <translation>期間中の最大値、最小値、または保存した各時刻(時系列)のどれを表すか。</translation>
    </message>
    <message>
        <source>Every how many time steps a dynamic map is stored.</source>
        <translation>時系列のマップを何時間ステップごとに保存するか。</translation>
    </message>
    <message>
        <source>Result that the map shows.</source>
        <translation>マップに表す計算結果。</translation>
    </message>
    <message>
        <source>Number of the component, where the map shows one of advection and dispersion.</source>
        <translation>移流拡散成分を表すマップの、成分の番号。</translation>
    </message>
    <message>
        <source>Whether the map is of the whole simulated time; start and end then count for nothing.</source>
        <translation>計算期間の全体を対象とするかどうか。その場合、開始時刻と終了時刻は使われない。</translation>
    </message>
    <message>
        <source>First time that the map takes into account.</source>
        <translation>マップの対象とする最初の時刻。</translation>
    </message>
    <message>
        <source>Last time that the map takes into account.</source>
        <translation>マップの対象とする最後の時刻。</translation>
    </message>
    <message>
        <source>File of ground elevations.</source>
        <translation>地盤高のファイル。</translation>
    </message>
    <message>
        <source>Number of the item in the file that holds the elevations.</source>
        <translation>ファイル内で標高を持つ項目の番号。</translation>
    </message>
    <message>
        <source>Priority where the files overlap.</source>
        <translation>ファイルが重なる所での優先順位。</translation>
    </message>
    <message>
        <source>Whether water passes between river and groundwater through the bed.</source>
        <translation>河床を通した河川と地下水の間の水の出入りを考慮するかどうか。</translation>
    </message>
    <message>
        <source>Leakage through the wetted bed for each unit of its area and of the difference between river level and groundwater head. The larger, the more water passes; 0 for a tight bed.</source>
        <translation>河床の潤面積と、河川水位と地下水頭の差の、それぞれ単位あたりの漏水量。大きいほど多くの水が出入りし、0は水を通さない河床を表す。</translation>
    </message>
    <message>
        <source>Branch of the river network on which the location lies.</source>
        <translation>地点のある河川(河道網の河川名)。</translation>
    </message>
    <message>
        <source>Distance of the location along its branch.</source>
        <translation>河川に沿った地点までの距離。</translation>
    </message>
    <message>
        <source>Water level, or water depth, from which the computation starts at this location.</source>
        <translation>この地点の、計算開始時の水位または水深。</translation>
    </message>
    <message>
        <source>Discharge from which the computation starts at this location; positive towards increasing chainage.</source>
        <translation>この地点の、計算開始時の流量。追加距離が増える向きを正とする。</translation>
    </message>
    <message>
        <source>Chainage at which the reach of this line ends.</source>
        <translation>この行の区間が終わる追加距離。</translation>
    </message>
    <message>
        <source>One of the four coefficients of the water that the river loses at this location; 0 for no loss.</source>
        <translation>この地点で河川から失われる水量の、四つの係数の一つ。0は損失がないことを表す。</translation>
    </message>
    <message>
        <source>Width of a part of the cross section relative to its depth, to which the coefficient belongs.</source>
        <translation>係数が対応する、断面の一部分の幅と水深の比。</translation>
    </message>
    <message>
        <source>Level of this mark at the location; empty where there is none.</source>
        <translation>この地点のマークの水位。ない場合は空欄。</translation>
    </message>
    <message>
        <source>Mean velocity of the flow to which the resistance belongs.</source>
        <translation>抵抗値が対応する平均流速。</translation>
    </message>
    <message>
        <source>Resistance at that velocity, in the chosen formula.</source>
        <translation>その流速での、選択した抵抗則による抵抗値。</translation>
    </message>
    <message>
        <source>What is given for the encroachment: positions, a width, a reduction of conveyance, or a target that the computation meets.</source>
        <translation>河積阻害を何で与えるか。位置、幅、通水能の低減、または計算で満たすべき目標。</translation>
    </message>
    <message>
        <source>Banks from which the flow area is narrowed.</source>
        <translation>流積を狭める岸。</translation>
    </message>
    <message>
        <source>Least distance that stays free between the left bank of the main channel and the encroachment.</source>
        <translation>低水路の左岸と河積阻害の間に必ず残す距離。</translation>
    </message>
    <message>
        <source>Least distance that stays free between the right bank of the main channel and the encroachment.</source>
        <translation>低水路の右岸と河積阻害の間に必ず残す距離。</translation>
    </message>
    <message>
        <source>Place in the cross section up to which the left side is blocked, with fixed positions.</source>
        <translation>位置を固定する方法で、左側を塞ぐ範囲の端の、横断面内の位置。</translation>
    </message>
    <message>
        <source>Place in the cross section from which on the right side is blocked, with fixed positions.</source>
        <translation>位置を固定する方法で、右側を塞ぐ範囲の端の、横断面内の位置。</translation>
    </message>
    <message>
        <source>Width that stays free between both encroachments, with a fixed width.</source>
        <translation>幅を固定する方法で、両側の河積阻害の間に残す幅。</translation>
    </message>
    <message>
        <source>How the reduction of conveyance is shared by the banks.</source>
        <translation>通水能の低減を両岸にどのように分けるか。</translation>
    </message>
    <message>
        <source>Share of the conveyance of the section that the encroachment takes away.</source>
        <translation>河積阻害により失われる、断面の通水能の割合。</translation>
    </message>
    <message>
        <source>Share of the conveyance that is taken away at the left bank.</source>
        <translation>左岸側で失われる通水能の割合。</translation>
    </message>
    <message>
        <source>Share of the conveyance that is taken away at the right bank.</source>
        <translation>右岸側で失われる通水能の割合。</translation>
    </message>
    <message>
        <source>Water level to which the encroachment is fitted, with the methods that have a target.</source>
        <translation>目標を定める方法で、河積阻害を合わせる水位。</translation>
    </message>
    <message>
        <source>Energy level to which the encroachment is fitted, with the method that has one as its target.</source>
        <translation>目標を定める方法で、河積阻害を合わせるエネルギー高。</translation>
    </message>
    <message>
        <source>Length of the flow&apos;s way over the left flood plain, to the next cross section.</source>
        <translation>次の横断面までの、左岸側高水敷上の流れの長さ。</translation>
    </message>
    <message>
        <source>Length of the flow&apos;s way over the right flood plain, to the next cross section.</source>
        <translation>次の横断面までの、右岸側高水敷上の流れの長さ。</translation>
    </message>
    <message>
        <source>Writes the mean velocity of the flow.
Writes the discharge also where the computation determines water levels.
Writes the area of the cross section that water fills.
Writes the width of the water surface.
Writes the hydraulic radius, or the resistance radius where sections use it.
Writes the resistance with which the computation went on, as it changes with the flow.
Writes the conveyance: the discharge divided by the root of the friction slope.
Writes the Froude number: below 1 in subcritical flow, above in supercritical flow.
Writes the volume of the water, around each point or in all of the network.
Writes the area of the water surface, around each point or in all of the network.
Writes the volume of water that a time step creates or loses by numerical errors.
Writes the sum of all mass errors since the start.
Writes the inflow from the sides.
Writes the slope of the water surface.
Writes the slope of the energy level, that is of friction and other losses.
Writes the energy level: water level and velocity head together.
Writes the shear stress of the flow on the bed.
Writes the groundwater head beside the river, where leakage is included.
Writes the length of the time steps, where the computation chooses it.</source>
        <translation>平均流速を出力する。
水位を計算する点でも流量を出力する。
流水断面積を出力する。
水面幅を出力する。
径深(断面によっては抵抗半径)を出力する。
計算に用いた、流れに応じて変わる抵抗値を出力する。
通水能(流量を摩擦勾配の平方根で割った値)を出力する。
フルード数を出力する。1より小さければ常流、大きければ射流。
各点の受け持つ範囲、または河道網全体の貯水量を出力する。
各点の受け持つ範囲、または河道網全体の氾濫面積を出力する。
数値誤差により1時間ステップで増減する水量を出力する。
計算開始からの質量誤差の合計を出力する。
横からの流入量を出力する。
水面の勾配を出力する。
エネルギー水位の勾配、すなわち摩擦などの損失の勾配を出力する。
エネルギー水位(水位と速度水頭の和)を出力する。
流れが河床に及ぼすせん断応力を出力する。
漏水を考慮する場合に、河川沿いの地下水頭を出力する。
計算が自動的に決める場合の、計算時間間隔を出力する。</translation>
    </message>
</context>
<context>
    <name>ProblemTexts</name>
    <message>
        <source>Exchange of start and end</source>
        <translation>始点と終点の交換</translation>
    </message>
    <message>
        <source>Error</source>
        <translation>エラー</translation>
    </message>
    <message>
        <source>Warning</source>
        <translation>警告</translation>
    </message>
    <message>
        <source>Note</source>
        <translation>注記</translation>
    </message>
    <message>
        <source>1 error</source>
        <translation>エラー 1件</translation>
    </message>
    <message>
        <source>%1 errors</source>
        <translation>エラー %1件</translation>
    </message>
    <message>
        <source>1 warning</source>
        <translation>警告 1件</translation>
    </message>
    <message>
        <source>%1 warnings</source>
        <translation>警告 %1件</translation>
    </message>
    <message>
        <source>1 note</source>
        <translation>注記 1件</translation>
    </message>
    <message>
        <source>%1 notes</source>
        <translation>注記 %1件</translation>
    </message>
    <message>
        <source>Problems</source>
        <translation>問題</translation>
    </message>
    <message>
        <source>Problem</source>
        <translation>問題</translation>
    </message>
    <message>
        <source>Page</source>
        <translation>ページ</translation>
    </message>
    <message>
        <source>Line</source>
        <translation>行</translation>
    </message>
    <message>
        <source>Field</source>
        <translation>項目</translation>
    </message>
    <message>
        <source>Document</source>
        <translation>文書</translation>
    </message>
    <message>
        <source>Code</source>
        <translation>コード</translation>
    </message>
    <message>
        <source>Show only what has these words</source>
        <translation>これらの語を含むものだけを表示</translation>
    </message>
    <message>
        <source>Nothing was found in the open documents.</source>
        <translation>開いている文書に問題はありません。</translation>
    </message>
    <message>
        <source>A click leads to the place.</source>
        <translation>クリックするとその場所に移動します。</translation>
    </message>
    <message>
        <source>&amp;Go There</source>
        <translation>移動(&amp;G)</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>コピー(&amp;C)</translation>
    </message>
    <message>
        <source>%1: %2. %3</source>
        <translation>%1: %2。%3</translation>
    </message>
    <message>
        <source>Start and end exchanged: %1 cells</source>
        <translation>始点と終点を交換: %1個のセル</translation>
    </message>
    <message>
        <source>%1 of the file</source>
        <translation>ファイルの %1</translation>
    </message>
</context>
</TS>
