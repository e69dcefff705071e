<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="ja" sourcelanguage="en_US">
<context>
    <name>CApplication</name>
    <message>
        <source>There is not enough memory for what was asked for last: it was not done, or not wholly. Save your work, and close other documents or programs.</source>
        <translation>メモリが足りないため、最後の操作は行われなかったか、途中までしか行われませんでした。作業を保存し、ほかの文書やプログラムを閉じてください。</translation>
    </message>
</context>
<context>
    <name>CFileCommands</name>
    <message>
        <source>Projects</source>
        <translation>プロジェクト</translation>
    </message>
    <message>
        <source>%1 could not be opened: no editor reads files of this kind.
The editors read %2.</source>
        <translation>%1 を開けません。この種類のファイルを扱うエディタがありません。
扱える拡張子: %2</translation>
    </message>
    <message>
        <source>New</source>
        <translation>新規作成</translation>
    </message>
    <message>
        <source>Kind of document:</source>
        <translation>文書の種類:</translation>
    </message>
    <message>
        <source>All files</source>
        <translation>すべてのファイル</translation>
    </message>
    <message>
        <source>Open</source>
        <translation>開く</translation>
    </message>
    <message>
        <source>Open Project</source>
        <translation>プロジェクトを開く</translation>
    </message>
    <message>
        <source>Files besides that could not be opened: %1</source>
        <translation>このほかに開けなかったファイルの数: %1</translation>
    </message>
</context>
<context>
    <name>CFrameAction</name>
    <message>
        <source>&amp;New</source>
        <translation>新規作成(&amp;N)</translation>
    </message>
    <message>
        <source>Starts a new document</source>
        <translation>新しい文書を作成します</translation>
    </message>
    <message>
        <source>&amp;Open...</source>
        <translation>開く(&amp;O)...</translation>
    </message>
    <message>
        <source>Opens a document or a project</source>
        <translation>文書またはプロジェクトを開きます</translation>
    </message>
    <message>
        <source>Open &amp;Project...</source>
        <translation>プロジェクトを開く(&amp;P)...</translation>
    </message>
    <message>
        <source>Opens a project with all its files</source>
        <translation>プロジェクトとそのすべてのファイルを開きます</translation>
    </message>
    <message>
        <source>Open &amp;Recent</source>
        <translation>最近使ったファイル(&amp;R)</translation>
    </message>
    <message>
        <source>Opens one of the files used last</source>
        <translation>最近使ったファイルを開きます</translation>
    </message>
    <message>
        <source>Open in the Runnin&amp;g Program</source>
        <translation>実行中のプログラムで開く(&amp;G)</translation>
    </message>
    <message>
        <source>A further start of the program hands its files to the one that runs</source>
        <translation>もう一度起動すると、ファイルを実行中のプログラムに渡します</translation>
    </message>
    <message>
        <source>&amp;Save</source>
        <translation>上書き保存(&amp;S)</translation>
    </message>
    <message>
        <source>Saves the active document</source>
        <translation>作業中の文書を保存します</translation>
    </message>
    <message>
        <source>Save &amp;As...</source>
        <translation>名前を付けて保存(&amp;A)...</translation>
    </message>
    <message>
        <source>Saves the active document under a new name</source>
        <translation>作業中の文書に名前を付けて保存します</translation>
    </message>
    <message>
        <source>&amp;Close</source>
        <translation>閉じる(&amp;C)</translation>
    </message>
    <message>
        <source>Closes the active window</source>
        <translation>作業中のウィンドウを閉じます</translation>
    </message>
    <message>
        <source>Close Projec&amp;t</source>
        <translation>プロジェクトを閉じる(&amp;T)</translation>
    </message>
    <message>
        <source>Closes the project with all its files</source>
        <translation>プロジェクトとそのすべてのファイルを閉じます</translation>
    </message>
    <message>
        <source>E&amp;xit</source>
        <translation>終了(&amp;X)</translation>
    </message>
    <message>
        <source>Closes all documents and ends the program</source>
        <translation>すべての文書を閉じてプログラムを終了します</translation>
    </message>
    <message>
        <source>&amp;Undo</source>
        <translation>元に戻す(&amp;U)</translation>
    </message>
    <message>
        <source>Takes the last change back</source>
        <translation>直前の変更を取り消します</translation>
    </message>
    <message>
        <source>&amp;Redo</source>
        <translation>やり直す(&amp;R)</translation>
    </message>
    <message>
        <source>Makes the change again that was taken back</source>
        <translation>取り消した変更をもう一度行います</translation>
    </message>
    <message>
        <source>Cu&amp;t</source>
        <translation>切り取り(&amp;T)</translation>
    </message>
    <message>
        <source>&amp;Go to Field...</source>
        <translation>項目へ移動(&amp;G)...</translation>
    </message>
    <message>
        <source>Leads to a field or a page by its name or its keyword</source>
        <translation>名前またはキーワードで項目やページへ移動します</translation>
    </message>
    <message>
        <source>Moves the selection to the clipboard</source>
        <translation>選択範囲を切り取ってクリップボードに入れます</translation>
    </message>
    <message>
        <source>&amp;Copy</source>
        <translation>コピー(&amp;C)</translation>
    </message>
    <message>
        <source>Copies the selection to the clipboard</source>
        <translation>選択範囲をクリップボードにコピーします</translation>
    </message>
    <message>
        <source>&amp;Paste</source>
        <translation>貼り付け(&amp;P)</translation>
    </message>
    <message>
        <source>Puts in what is on the clipboard</source>
        <translation>クリップボードの内容を貼り付けます</translation>
    </message>
    <message>
        <source>&amp;Units</source>
        <translation>単位系(&amp;U)</translation>
    </message>
    <message>
        <source>Units in which values are shown; files are not affected</source>
        <translation>値を表示する単位系を選びます (ファイルの内容は変わりません)</translation>
    </message>
    <message>
        <source>&amp;Language</source>
        <translation>言語(&amp;L)</translation>
    </message>
    <message>
        <source>Language of the program</source>
        <translation>プログラムの表示言語を選びます</translation>
    </message>
    <message>
        <source>&amp;Tool Bars</source>
        <translation>ツールバー(&amp;T)</translation>
    </message>
    <message>
        <source>Shows or hides tool bars</source>
        <translation>ツールバーの表示と非表示を切り替えます</translation>
    </message>
    <message>
        <source>&amp;Cascade</source>
        <translation>重ねて表示(&amp;C)</translation>
    </message>
    <message>
        <source>Arranges the windows one behind the other</source>
        <translation>ウィンドウを重ねて並べます</translation>
    </message>
    <message>
        <source>&amp;Tile</source>
        <translation>並べて表示(&amp;T)</translation>
    </message>
    <message>
        <source>Arranges the windows side by side</source>
        <translation>ウィンドウを重ならないように並べます</translation>
    </message>
    <message>
        <source>Ne&amp;xt</source>
        <translation>次のウィンドウ(&amp;X)</translation>
    </message>
    <message>
        <source>Goes to the next window</source>
        <translation>次のウィンドウに移ります</translation>
    </message>
    <message>
        <source>Pre&amp;vious</source>
        <translation>前のウィンドウ(&amp;V)</translation>
    </message>
    <message>
        <source>Goes to the previous window</source>
        <translation>前のウィンドウに移ります</translation>
    </message>
    <message>
        <source>Ta&amp;bs</source>
        <translation>タブ表示(&amp;B)</translation>
    </message>
    <message>
        <source>Shows the windows as tabs</source>
        <translation>ウィンドウをタブで表示します</translation>
    </message>
    <message>
        <source>Close &amp;All</source>
        <translation>すべて閉じる(&amp;A)</translation>
    </message>
    <message>
        <source>Closes all windows</source>
        <translation>すべてのウィンドウを閉じます</translation>
    </message>
    <message>
        <source>&amp;Contents</source>
        <translation>目次(&amp;C)</translation>
    </message>
    <message>
        <source>Shows the help of the editor</source>
        <translation>エディタのヘルプを表示します</translation>
    </message>
    <message>
        <source>&amp;Plug-ins...</source>
        <translation>プラグイン(&amp;P)...</translation>
    </message>
    <message>
        <source>Lists the editors that were loaded</source>
        <translation>読み込まれたエディタの一覧を表示します</translation>
    </message>
    <message>
        <source>&amp;About</source>
        <translation>バージョン情報(&amp;A)</translation>
    </message>
    <message>
        <source>Name and version of the program</source>
        <translation>プログラムの名称とバージョンを表示します</translation>
    </message>
    <message>
        <source>&amp;Project</source>
        <translation>プロジェクト(&amp;P)</translation>
    </message>
    <message>
        <source>Shows or hides the files of the project</source>
        <translation>プロジェクトのファイル一覧の表示と非表示を切り替えます</translation>
    </message>
    <message>
        <source>&amp;Side by Side</source>
        <translation>横に並べて表示(&amp;S)</translation>
    </message>
    <message>
        <source>Puts the other windows beside the active one</source>
        <translation>作業中のウィンドウの横にほかのウィンドウを並べます</translation>
    </message>
    <message>
        <source>All &amp;Digits</source>
        <translation>全桁表示(&amp;D)</translation>
    </message>
    <message>
        <source>Shows every digit of the numbers in tables and fields</source>
        <translation>表と入力欄の数値を全桁で表示します</translation>
    </message>
    <message>
        <source>Long Pro&amp;file</source>
        <translation>縦断図(&amp;F)</translation>
    </message>
    <message>
        <source>Shows or hides levels and values along the branch</source>
        <translation>河川に沿った水位や値の図の表示と非表示を切り替えます</translation>
    </message>
    <message>
        <source>P&amp;roblems</source>
        <translation>問題(&amp;R)</translation>
    </message>
    <message>
        <source>Shows or hides the list of what is wrong in the open documents</source>
        <translation>開いている文書の問題の一覧を表示または非表示にします</translation>
    </message>
    <message>
        <source>&amp;Next Problem</source>
        <translation>次の問題(&amp;N)</translation>
    </message>
    <message>
        <source>Leads to the next problem of the list</source>
        <translation>一覧の次の問題に移動します</translation>
    </message>
    <message>
        <source>&amp;Appearance</source>
        <translation>外観(&amp;A)</translation>
    </message>
    <message>
        <source>Light or dark windows</source>
        <translation>明るい画面または暗い画面</translation>
    </message>
    <message>
        <source>Pre&amp;vious Problem</source>
        <translation>前の問題(&amp;V)</translation>
    </message>
    <message>
        <source>Leads to the previous problem of the list</source>
        <translation>一覧の前の問題に移動します</translation>
    </message>
</context>
<context>
    <name>CFrameMenus</name>
    <message>
        <source>&amp;File</source>
        <translation>ファイル(&amp;F)</translation>
    </message>
    <message>
        <source>&amp;Edit</source>
        <translation>編集(&amp;E)</translation>
    </message>
    <message>
        <source>&amp;Lines</source>
        <translation>行(&amp;L)</translation>
    </message>
    <message>
        <source>&amp;View</source>
        <translation>表示(&amp;V)</translation>
    </message>
    <message>
        <source>&amp;Window</source>
        <translation>ウィンドウ(&amp;W)</translation>
    </message>
    <message>
        <source>&amp;Help</source>
        <translation>ヘルプ(&amp;H)</translation>
    </message>
    <message>
        <source>&amp;Metric</source>
        <translation>メートル法(&amp;M)</translation>
    </message>
    <message>
        <source>&amp;US Customary</source>
        <translation>米国慣用単位(&amp;U)</translation>
    </message>
    <message>
        <source>Standard</source>
        <translation>標準</translation>
    </message>
    <message>
        <source>&amp;Undo %1</source>
        <translation>元に戻す(&amp;U) %1</translation>
    </message>
    <message>
        <source>&amp;Redo %1</source>
        <translation>やり直す(&amp;R) %1</translation>
    </message>
    <message>
        <source>&amp;Clear List</source>
        <translation>一覧を消去(&amp;C)</translation>
    </message>
    <message>
        <source>As the &amp;Desktop</source>
        <translation>デスクトップに合わせる(&amp;D)</translation>
    </message>
    <message>
        <source>&amp;Light</source>
        <translation>明るい(&amp;L)</translation>
    </message>
    <message>
        <source>Dar&amp;k</source>
        <translation>暗い(&amp;K)</translation>
    </message>
</context>
<context>
    <name>CMainFrame</name>
    <message>
        <source>Not opened, as what is being typed here is no value: %1</source>
        <translation>入力中の内容が値として正しくないため、開きませんでした: %1</translation>
    </message>
    <message>
        <source>The changes to %1 cannot be kept for the case of a crash: %2.</source>
        <translation>%1 の変更を異常終了に備えて保持できません: %2。</translation>
    </message>
    <message>
        <source>Save often. It is tried again and again; when it works, this notice goes.</source>
        <translation>こまめに保存してください。繰り返し試し、保持できるとこの表示は消えます。</translation>
    </message>
    <message>
        <source>Recovery after a crash does not work</source>
        <translation>異常終了後の復元が使えません</translation>
    </message>
    <message>
        <source>Not loaded: %1 (see Help, Plug-ins)</source>
        <translation>読み込めませんでした: %1 (「ヘルプ」の「プラグイン」を参照)</translation>
    </message>
    <message>
        <source>Project: %1</source>
        <translation>プロジェクト: %1</translation>
    </message>
    <message>
        <source>No editor was found. See Help, Plug-ins.</source>
        <translation>エディタが見つかりません。「ヘルプ」の「プラグイン」を参照してください。</translation>
    </message>
    <message>
        <source>Open a file with File, Open, or drop it here.</source>
        <translation>「ファイル」の「開く」でファイルを開くか、ここにドロップしてください。</translation>
    </message>
</context>
<context>
    <name>CProjectController</name>
    <message>
        <source>%1 was removed or renamed by another program. Its files stay open.</source>
        <translation>%1 はほかのプログラムによって削除されたか、名前が変更されました。プロジェクトのファイルは開いたままです。</translation>
    </message>
    <message>
        <source>%1 was changed by another program and cannot be read: %2</source>
        <translation>%1 はほかのプログラムによって変更され、読み込めません: %2</translation>
    </message>
    <message>
        <source>%1 was changed by another program. The list of its files has been read again.</source>
        <translation>%1 はほかのプログラムによって変更されました。ファイルの一覧を読み込み直しました。</translation>
    </message>
    <message>
        <source>%1 can be read again. The list of its files is that of the file.</source>
        <translation>%1 を再び読み込めるようになりました。ファイルの一覧はこのファイルのとおりです。</translation>
    </message>
    <message>
        <source>The project could not be opened.
%1</source>
        <translation>プロジェクトを開けませんでした。
%1</translation>
    </message>
    <message>
        <source>These files of the project %1 could not be opened:
%2</source>
        <translation>プロジェクト %1 の次のファイルを開けませんでした:
%2</translation>
    </message>
    <message>
        <source>%1: open in the project %2</source>
        <translation>%1: プロジェクト %2 で開いています</translation>
    </message>
    <message>
        <source>These files of the project %1 are open in another project and stay there:
%2
To have one of them in %1, close its window and open it from the list of %1.</source>
        <translation>プロジェクト %1 の次のファイルは、ほかのプロジェクトで開いているため、そちらに属したままになります。
%2
%1 で使うには、そのウィンドウを閉じてから、%1 の一覧で開いてください。</translation>
    </message>
    <message>
        <source>%1: the file does not exist</source>
        <translation>%1: ファイルがありません</translation>
    </message>
    <message>
        <source>%1: no editor reads files of this kind</source>
        <translation>%1: この種類のファイルを扱うエディタがありません</translation>
    </message>
</context>
<context>
    <name>CProjectTree</name>
    <message>
        <source>%1 (missing)</source>
        <translation>%1 (ファイルなし)</translation>
    </message>
    <message>
        <source>%1 (no editor)</source>
        <translation>%1 (エディタなし)</translation>
    </message>
    <message>
        <source>&amp;Open</source>
        <translation>開く(&amp;O)</translation>
    </message>
    <message>
        <source>&amp;Close Project</source>
        <translation>プロジェクトを閉じる(&amp;C)</translation>
    </message>
    <message>
        <source>Project</source>
        <translation>プロジェクト</translation>
    </message>
    <message>
        <source>Files of the project</source>
        <translation>プロジェクトのファイル</translation>
    </message>
    <message>
        <source>%1 (in %2)</source>
        <translation>%1 (%2 内)</translation>
    </message>
    <message>
        <source>%1: open in the project %2</source>
        <translation>%1: プロジェクト %2 で開いています</translation>
    </message>
    <message>
        <source>This file is outside the project&apos;s folder.</source>
        <translation>このファイルはプロジェクトのフォルダーの外にあります。</translation>
    </message>
</context>
<context>
    <name>CRecovery</name>
    <message>
        <source>The changes to %1 could not be recovered: what was kept of them cannot be read.</source>
        <translation>%1 の変更を復元できませんでした: 保存されていた内容を読み取れません。</translation>
    </message>
    <message>
        <source>Recovered changes</source>
        <translation>復元した変更</translation>
    </message>
    <message>
        <source>The changes to %1 could not be recovered: what was kept of them is no file of this kind.</source>
        <translation>%1 の変更を復元できませんでした: 保存されていた内容はこの種類のファイルではありません。</translation>
    </message>
    <message>
        <source>%1 (recovered)</source>
        <translation>%1 (復元)</translation>
    </message>
    <message>
        <source>%1 (recovered %2)</source>
        <translation>%1 (復元 %2)</translation>
    </message>
</context>
<context>
    <name>CRecoveryDialog</name>
    <message>
        <source>Recover Changes</source>
        <translation>変更の復元</translation>
    </message>
    <message>
        <source>The program ended before these changes were saved. A document that you open has them, not yet saved; undo leads back to its file.</source>
        <translation>これらの変更が保存される前にプログラムが終了しました。開いた文書には変更が未保存の状態で入っています。元に戻すとファイルの内容に戻ります。</translation>
    </message>
    <message>
        <source>Document</source>
        <translation>文書</translation>
    </message>
    <message>
        <source>Last change kept</source>
        <translation>最後に保持した変更</translation>
    </message>
    <message>
        <source>What differs</source>
        <translation>相違点</translation>
    </message>
    <message>
        <source>&amp;Open</source>
        <translation>開く(&amp;O)</translation>
    </message>
    <message>
        <source>&amp;Compare</source>
        <translation>比較(&amp;C)</translation>
    </message>
    <message>
        <source>&amp;Discard</source>
        <translation>破棄(&amp;D)</translation>
    </message>
    <message>
        <source>&amp;Later</source>
        <translation>後で(&amp;L)</translation>
    </message>
    <message>
        <source>A damaged recovery file</source>
        <translation>破損した復元ファイル</translation>
    </message>
    <message>
        <source>Comparing...</source>
        <translation>比較しています...</translation>
    </message>
    <message>
        <source>What differs is not known: the file cannot be read.</source>
        <translation>相違点は不明です: ファイルを読み取れません。</translation>
    </message>
    <message>
        <source>What differs is not known: it could not be looked at.</source>
        <translation>相違点は不明です: 調べられませんでした。</translation>
    </message>
    <message>
        <source>It cannot be read, and can only be discarded.</source>
        <translation>読み取れません。破棄のみ可能です。</translation>
    </message>
    <message>
        <source>No editor reads files of this kind (%1).</source>
        <translation>この種類のファイル (%1) を扱うエディタがありません。</translation>
    </message>
    <message>
        <source>New document. %1</source>
        <translation>新しい文書。%1</translation>
    </message>
    <message>
        <source>The file has been changed since; the changes open as a new document beside it. %1</source>
        <translation>ファイルはその後変更されています。変更は別の新しい文書として開きます。%1</translation>
    </message>
    <message>
        <source>The file is not there any more; the changes open as a new document. %1</source>
        <translation>ファイルはもう存在しません。変更は新しい文書として開きます。%1</translation>
    </message>
    <message>
        <source>Discard the changes to %1? They cannot be brought back.</source>
        <translation>%1 の変更を破棄しますか? 元に戻すことはできません。</translation>
    </message>
    <message>
        <source>Recovered Changes of %1</source>
        <translation>%1 の復元した変更</translation>
    </message>
    <message>
        <source>Now</source>
        <translation>現在</translation>
    </message>
    <message>
        <source>Recovered</source>
        <translation>復元後</translation>
    </message>
    <message>
        <source>%1 in %2</source>
        <translation>%1 (フォルダ: %2)</translation>
    </message>
    <message>
        <source>Typed but not entered, as it is no value: %1</source>
        <translation>入力されましたが、値ではないため反映されていません: %1</translation>
    </message>
</context>
<context>
    <name>HelpCommands</name>
    <message>
        <source>About %1</source>
        <translation>%1 のバージョン情報</translation>
    </message>
    <message>
        <source>Plug-ins</source>
        <translation>プラグイン</translation>
    </message>
    <message>
        <source>Editor</source>
        <translation>エディタ</translation>
    </message>
    <message>
        <source>File</source>
        <translation>ファイル</translation>
    </message>
    <message>
        <source>State</source>
        <translation>状態</translation>
    </message>
    <message>
        <source>In use</source>
        <translation>使用中</translation>
    </message>
    <message>
        <source>%1, version %2</source>
        <translation>%1、バージョン %2</translation>
    </message>
    <message>
        <source>Shell of the river model editors.</source>
        <translation>河川モデルのエディタのシェル。</translation>
    </message>
    <message>
        <source>Free software under the GNU General Public License, version 3 or later (GPL-3.0-or-later).</source>
        <translation>GNU General Public License バージョン3以降 (GPL-3.0-or-later) で提供されるフリーソフトウェアです。</translation>
    </message>
    <message>
        <source>It uses %1.</source>
        <translation>使用しているソフトウェア: %1</translation>
    </message>
    <message>
        <source>Keys of the menus</source>
        <translation>メニューのキー</translation>
    </message>
    <message>
        <source>About the program</source>
        <translation>プログラムについて</translation>
    </message>
</context>
<context>
    <name>LibraryFile</name>
    <message>
        <source>it is no library of this system</source>
        <translation>このシステムのライブラリではありません</translation>
    </message>
    <message>
        <source>the file is cut off, it holds only %1 bytes</source>
        <translation>ファイルが途中で切れており、%1 バイトしかありません</translation>
    </message>
</context>
<context>
    <name>LibraryTrial</name>
    <message>
        <source>it failed with the error &quot;%1&quot;</source>
        <translation>エラー「%1」で失敗しました</translation>
    </message>
    <message>
        <source>it failed with an error that it does not name</source>
        <translation>名前のないエラーで失敗しました</translation>
    </message>
    <message>
        <source>it ended the program that tried it (%1)</source>
        <translation>試したプログラムが終了しました (%1)</translation>
    </message>
    <message>
        <source>it ended the program that tried it</source>
        <translation>試したプログラムが終了しました</translation>
    </message>
    <message>
        <source>its start did not end within %1 seconds</source>
        <translation>起動が %1 秒以内に終わりませんでした</translation>
    </message>
</context>
<context>
    <name>PluginLoader</name>
    <message>
        <source>Its document template %1 is missing or names no file extension.</source>
        <translation>文書テンプレート %1 がないか、拡張子が定められていません。</translation>
    </message>
    <message>
        <source>It could not be loaded: %1</source>
        <translation>読み込めませんでした: %1</translation>
    </message>
    <message>
        <source>%1. It is tried again when its file has changed</source>
        <translation>%1。ファイルが変わると、もう一度試します</translation>
    </message>
    <message>
        <source>It is no editor: it does not export %1.</source>
        <translation>エディタではありません。次の関数が公開されていません: %1</translation>
    </message>
</context>
<context>
    <name>ProjectRespell</name>
    <message>
        <source>The project %1 still names %2 and could not be changed: %3.
The file is found all the same.</source>
        <translation>プロジェクト %1 は %2 を指したままで、変更できませんでした: %3。
ファイルはこのままでも見つかります。</translation>
    </message>
</context>
<context>
    <name>ShellMain</name>
    <message>
        <source>Shell of the river model editors</source>
        <translation>河川モデルエディタのシェル</translation>
    </message>
    <message>
        <source>Folder of the editors.</source>
        <translation>エディタのフォルダ</translation>
    </message>
    <message>
        <source>folder</source>
        <translation>フォルダ</translation>
    </message>
    <message>
        <source>Files and projects to open.</source>
        <translation>開くファイルまたはプロジェクト</translation>
    </message>
    <message>
        <source>Start a program of its own, whether one runs already or not.</source>
        <translation>すでに実行中でも、別のプログラムとして起動します。</translation>
    </message>
</context>
</TS>
