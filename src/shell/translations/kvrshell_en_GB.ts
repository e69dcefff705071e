<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_GB" sourcelanguage="en_US">
    <context>
        <name>CFrameAction</name>
        <message>
            <source>&amp;New</source>
            <translation>&amp;New</translation>
        </message>
        <message>
            <source>Starts a new document</source>
            <translation>Starts a new document</translation>
        </message>
        <message>
            <source>&amp;Open...</source>
            <translation>&amp;Open...</translation>
        </message>
        <message>
            <source>Opens a document or a project</source>
            <translation>Opens a document or a project</translation>
        </message>
        <message>
            <source>Open &amp;Project...</source>
            <translation>Open &amp;Project...</translation>
        </message>
        <message>
            <source>Opens a project with all its files</source>
            <translation>Opens a project with all its files</translation>
        </message>
        <message>
            <source>Open &amp;Recent</source>
            <translation>Open &amp;Recent</translation>
        </message>
        <message>
            <source>Opens one of the files used last</source>
            <translation>Opens one of the files used last</translation>
        </message>
        <message>
            <source>&amp;Save</source>
            <translation>&amp;Save</translation>
        </message>
        <message>
            <source>Saves the active document</source>
            <translation>Saves the active document</translation>
        </message>
        <message>
            <source>Save &amp;As...</source>
            <translation>Save &amp;As...</translation>
        </message>
        <message>
            <source>Saves the active document under a new name</source>
            <translation>Saves the active document under a new name</translation>
        </message>
        <message>
            <source>&amp;Close</source>
            <translation>&amp;Close</translation>
        </message>
        <message>
            <source>Closes the active window</source>
            <translation>Closes the active window</translation>
        </message>
        <message>
            <source>Close Projec&amp;t</source>
            <translation>Close Projec&amp;t</translation>
        </message>
        <message>
            <source>Closes the project with all its files</source>
            <translation>Closes the project with all its files</translation>
        </message>
        <message>
            <source>E&amp;xit</source>
            <translation>E&amp;xit</translation>
        </message>
        <message>
            <source>Closes all documents and ends the program</source>
            <translation>Closes all documents and ends the program</translation>
        </message>
        <message>
            <source>&amp;Undo</source>
            <translation>&amp;Undo</translation>
        </message>
        <message>
            <source>Takes the last change back</source>
            <translation>Takes the last change back</translation>
        </message>
        <message>
            <source>&amp;Redo</source>
            <translation>&amp;Redo</translation>
        </message>
        <message>
            <source>Makes the change again that was taken back</source>
            <translation>Makes the change again that was taken back</translation>
        </message>
        <message>
            <source>Cu&amp;t</source>
            <translation>Cu&amp;t</translation>
        </message>
        <message>
            <source>Moves the selection to the clipboard</source>
            <translation>Moves the selection to the clipboard</translation>
        </message>
        <message>
            <source>&amp;Copy</source>
            <translation>&amp;Copy</translation>
        </message>
        <message>
            <source>Copies the selection to the clipboard</source>
            <translation>Copies the selection to the clipboard</translation>
        </message>
        <message>
            <source>&amp;Paste</source>
            <translation>&amp;Paste</translation>
        </message>
        <message>
            <source>Puts in what is on the clipboard</source>
            <translation>Puts in what is on the clipboard</translation>
        </message>
        <message>
            <source>&amp;Units</source>
            <translation>&amp;Units</translation>
        </message>
        <message>
            <source>Units in which values are shown; files are not affected</source>
            <translation>Units in which values are shown; files are not affected</translation>
        </message>
        <message>
            <source>&amp;Language</source>
            <translation>&amp;Language</translation>
        </message>
        <message>
            <source>Language of the program</source>
            <translation>Language of the program</translation>
        </message>
        <message>
            <source>&amp;Tool Bars</source>
            <translation>&amp;Tool Bars</translation>
        </message>
        <message>
            <source>Shows or hides tool bars</source>
            <translation>Shows or hides tool bars</translation>
        </message>
        <message>
            <source>&amp;Cascade</source>
            <translation>&amp;Cascade</translation>
        </message>
        <message>
            <source>Arranges the windows one behind the other</source>
            <translation>Arranges the windows one behind the other</translation>
        </message>
        <message>
            <source>&amp;Tile</source>
            <translation>&amp;Tile</translation>
        </message>
        <message>
            <source>Arranges the windows side by side</source>
            <translation>Arranges the windows side by side</translation>
        </message>
        <message>
            <source>Ne&amp;xt</source>
            <translation>Ne&amp;xt</translation>
        </message>
        <message>
            <source>Goes to the next window</source>
            <translation>Goes to the next window</translation>
        </message>
        <message>
            <source>Pre&amp;vious</source>
            <translation>Pre&amp;vious</translation>
        </message>
        <message>
            <source>Goes to the previous window</source>
            <translation>Goes to the previous window</translation>
        </message>
        <message>
            <source>Ta&amp;bs</source>
            <translation>Ta&amp;bs</translation>
        </message>
        <message>
            <source>Shows the windows as tabs</source>
            <translation>Shows the windows as tabs</translation>
        </message>
        <message>
            <source>Close &amp;All</source>
            <translation>Close &amp;All</translation>
        </message>
        <message>
            <source>Closes all windows</source>
            <translation>Closes all windows</translation>
        </message>
        <message>
            <source>&amp;Contents</source>
            <translation>&amp;Contents</translation>
        </message>
        <message>
            <source>Shows the help of the editor</source>
            <translation>Shows the help of the editor</translation>
        </message>
        <message>
            <source>&amp;Plug-ins...</source>
            <translation>&amp;Plug-ins...</translation>
        </message>
        <message>
            <source>Lists the editors that were loaded</source>
            <translation>Lists the editors that were loaded</translation>
        </message>
        <message>
            <source>&amp;About</source>
            <translation>&amp;About</translation>
        </message>
        <message>
            <source>Name and version of the program</source>
            <translation>Name and version of the program</translation>
        </message>
        <message>
            <source>&amp;Project</source>
            <translation>&amp;Project</translation>
        </message>
        <message>
            <source>Shows or hides the files of the project</source>
            <translation>Shows or hides the files of the project</translation>
        </message>
        <message>
            <source>&amp;Side by Side</source>
            <translation>&amp;Side by Side</translation>
        </message>
        <message>
            <source>Puts the other windows beside the active one</source>
            <translation>Puts the other windows beside the active one</translation>
        </message>
        <message>
            <source>All &amp;Digits</source>
            <translation>All &amp;Digits</translation>
        </message>
        <message>
            <source>Shows every digit of the numbers in tables and fields</source>
            <translation>Shows every digit of the numbers in tables and fields</translation>
        </message>
    </context>
    <context>
        <name>CMainFrame</name>
        <message>
            <source>Not loaded: %1 (see Help, Plug-ins)</source>
            <translation>Not loaded: %1 (see Help, Plug-ins)</translation>
        </message>
        <message>
            <source>Project: %1</source>
            <translation>Project: %1</translation>
        </message>
        <message>
            <source>Projects</source>
            <translation>Projects</translation>
        </message>
        <message>
            <source>%1: open in the project %2</source>
            <translation>%1: open in the project %2</translation>
        </message>
        <message>
            <source>These files of the project %1 are open in another project and stay there:
%2
To have one of them in %1, close its window and open it from the list of %1.</source>
            <translation>These files of the project %1 are open in another project and stay there:
%2
To have one of them in %1, close its window and open it from the list of %1.</translation>
        </message>
        <message>
            <source>%1 could not be opened: no editor reads files of this kind.
The editors read %2.</source>
            <translation>%1 could not be opened: no editor reads files of this kind.
The editors read %2.</translation>
        </message>
        <message>
            <source>New</source>
            <translation>New</translation>
        </message>
        <message>
            <source>Kind of document:</source>
            <translation>Kind of document:</translation>
        </message>
        <message>
            <source>All files</source>
            <translation>All files</translation>
        </message>
        <message>
            <source>Open</source>
            <translation>Open</translation>
        </message>
        <message>
            <source>Open Project</source>
            <translation>Open Project</translation>
        </message>
        <message>
            <source>&amp;Undo %1</source>
            <translation>&amp;Undo %1</translation>
        </message>
        <message>
            <source>&amp;Redo %1</source>
            <translation>&amp;Redo %1</translation>
        </message>
        <message>
            <source>&amp;File</source>
            <translation>&amp;File</translation>
        </message>
        <message>
            <source>&amp;Edit</source>
            <translation>&amp;Edit</translation>
        </message>
        <message>
            <source>&amp;Lines</source>
            <translation>&amp;Lines</translation>
        </message>
        <message>
            <source>&amp;View</source>
            <translation>&amp;View</translation>
        </message>
        <message>
            <source>&amp;Window</source>
            <translation>&amp;Window</translation>
        </message>
        <message>
            <source>&amp;Help</source>
            <translation>&amp;Help</translation>
        </message>
        <message>
            <source>&amp;Metric</source>
            <translation>&amp;Metric</translation>
        </message>
        <message>
            <source>&amp;US Customary</source>
            <translation>&amp;US Customary</translation>
        </message>
        <message>
            <source>Standard</source>
            <translation>Standard</translation>
        </message>
        <message>
            <source>No editor was found. See Help, Plug-ins.</source>
            <translation>No editor was found. See Help, Plug-ins.</translation>
        </message>
        <message>
            <source>Open a file with File, Open, or drop it here.</source>
            <translation>Open a file with File, Open, or drop it here.</translation>
        </message>
        <message>
            <source>&amp;Clear List</source>
            <translation>&amp;Clear List</translation>
        </message>
        <message>
            <source>About %1</source>
            <translation>About %1</translation>
        </message>
        <message>
            <source>%1, version %2

Shell of the river model editors.</source>
            <translation>%1, version %2

Shell of the river model editors.</translation>
        </message>
        <message>
            <source>The project could not be opened.
%1</source>
            <translation>The project could not be opened.
%1</translation>
        </message>
        <message>
            <source>These files of the project %1 could not be opened:
%2</source>
            <translation>These files of the project %1 could not be opened:
%2</translation>
        </message>
        <message>
            <source>%1: the file does not exist</source>
            <translation>%1: the file does not exist</translation>
        </message>
        <message>
            <source>%1: no editor reads files of this kind</source>
            <translation>%1: no editor reads files of this kind</translation>
        </message>
    </context>
    <context>
        <name>CPluginsDialog</name>
        <message>
            <source>Plug-ins</source>
            <translation>Plug-ins</translation>
        </message>
        <message>
            <source>Editor</source>
            <translation>Editor</translation>
        </message>
        <message>
            <source>File</source>
            <translation>File</translation>
        </message>
        <message>
            <source>State</source>
            <translation>State</translation>
        </message>
        <message>
            <source>In use</source>
            <translation>In use</translation>
        </message>
    </context>
    <context>
        <name>CProjectTree</name>
        <message>
            <source>%1 (missing)</source>
            <translation>%1 (missing)</translation>
        </message>
        <message>
            <source>%1 (no editor)</source>
            <translation>%1 (no editor)</translation>
        </message>
        <message>
            <source>&amp;Open</source>
            <translation>&amp;Open</translation>
        </message>
        <message>
            <source>&amp;Close Project</source>
            <translation>&amp;Close Project</translation>
        </message>
        <message>
            <source>Project</source>
            <translation>Project</translation>
        </message>
        <message>
            <source>Files of the project</source>
            <translation>Files of the project</translation>
        </message>
        <message>
            <source>%1 (in %2)</source>
            <translation>%1 (in %2)</translation>
        </message>
        <message>
            <source>%1: open in the project %2</source>
            <translation>%1: open in the project %2</translation>
        </message>
    </context>
    <context>
        <name>PluginLoader</name>
        <message>
            <source>Its document template %1 is missing or names no file extension.</source>
            <translation>Its document template %1 is missing or names no file extension.</translation>
        </message>
        <message>
            <source>It could not be loaded: %1</source>
            <translation>It could not be loaded: %1</translation>
        </message>
        <message>
            <source>It is no editor: it does not export %1.</source>
            <translation>It is no editor: it does not export %1.</translation>
        </message>
    </context>
    <context>
        <name>ShellMain</name>
        <message>
            <source>Shell of the river model editors</source>
            <translation>Shell of the river model editors</translation>
        </message>
        <message>
            <source>Folder of the editors.</source>
            <translation>Folder of the editors.</translation>
        </message>
        <message>
            <source>folder</source>
            <translation>folder</translation>
        </message>
        <message>
            <source>Files and projects to open.</source>
            <translation>Files and projects to open.</translation>
        </message>
    </context>
</TS>
