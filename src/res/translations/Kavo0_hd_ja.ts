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
        <source>Local values</source>
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
        <source>Stored as %1.</source>
        <translation>%1 として保存されます。</translation>
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
</context>
</TS>
