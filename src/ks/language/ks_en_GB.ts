<?xml version="1.0" encoding="utf-8"?>
<!DOCTYPE TS>
<TS version="2.1" language="en_GB" sourcelanguage="en_US">
    <context>
        <name>CKsDoc</name>
        <message>
            <source>The file does not exist.</source>
            <translation>The file does not exist.</translation>
        </message>
        <message>
            <source>This is not a file.</source>
            <translation>This is not a file.</translation>
        </message>
        <message>
            <source>%1 could not be opened.
%2</source>
            <translation>%1 could not be opened.
%2</translation>
        </message>
        <message>
            <source>Save the changes to %1?</source>
            <translation>Save the changes to %1?</translation>
        </message>
        <message>
            <source>Save As</source>
            <translation>Save As</translation>
        </message>
        <message>
            <source>%1 is open in another window. Choose another name.</source>
            <translation>%1 is open in another window. Choose another name.</translation>
        </message>
        <message>
            <source>%1 exists already. Replace it?</source>
            <translation>%1 exists already. Replace it?</translation>
        </message>
    </context>
    <context>
        <name>CKsEditLong</name>
        <message>
            <source>Enter an integer from %1 to %2.</source>
            <translation>Enter an integer from %1 to %2.</translation>
        </message>
        <message>
            <source>Enter an integer.</source>
            <translation>Enter an integer.</translation>
        </message>
        <message>
            <source>Enter a number.</source>
            <translation>Enter a number.</translation>
        </message>
    </context>
    <context>
        <name>CKsEditStyle</name>
        <message>
            <source>Unit: %1</source>
            <translation>Unit: %1</translation>
        </message>
    </context>
    <context>
        <name>SystemReason</name>
        <message>
            <source>no space is left on the device</source>
            <translation>no space is left on the device</translation>
        </message>
        <message>
            <source>the file system is read-only</source>
            <translation>the file system is read-only</translation>
        </message>
        <message>
            <source>permission denied</source>
            <translation>permission denied</translation>
        </message>
        <message>
            <source>the operation is not permitted</source>
            <translation>the operation is not permitted</translation>
        </message>
        <message>
            <source>there is no such file or folder</source>
            <translation>there is no such file or folder</translation>
        </message>
        <message>
            <source>a part of the path is no folder</source>
            <translation>a part of the path is no folder</translation>
        </message>
        <message>
            <source>it is a folder</source>
            <translation>it is a folder</translation>
        </message>
        <message>
            <source>it is not an ordinary file</source>
            <translation>it is not an ordinary file</translation>
        </message>
        <message>
            <source>the device reports an input or output error</source>
            <translation>the device reports an input or output error</translation>
        </message>
        <message>
            <source>the file would be too large</source>
            <translation>the file would be too large</translation>
        </message>
        <message>
            <source>the name is too long</source>
            <translation>the name is too long</translation>
        </message>
        <message>
            <source>the link leads in a circle</source>
            <translation>the link leads in a circle</translation>
        </message>
        <message>
            <source>too many files are open</source>
            <translation>too many files are open</translation>
        </message>
        <message>
            <source>another program is using it</source>
            <translation>another program is using it</translation>
        </message>
        <message>
            <source>your disk quota is used up</source>
            <translation>your disk quota is used up</translation>
        </message>
        <message>
            <source>%1.</source>
            <translation>%1.</translation>
        </message>
    </context>
    <context>
        <name>ParameterFile</name>
        <message>
            <source>%1, line %2: %3</source>
            <translation>%1, line %2: %3</translation>
        </message>
        <message>
            <source>%1 is no file of this kind: it has no section [%2].</source>
            <translation>%1 is no file of this kind: it has no section [%2].</translation>
        </message>
        <message>
            <source>expected a section [%1].</source>
            <translation>expected a section [%1].</translation>
        </message>
        <message>
            <source>expected only one %1 in [%2].</source>
            <translation>expected only one %1 in [%2].</translation>
        </message>
        <message>
            <source>expected a text, %1 = &quot;...&quot;.</source>
            <translation>expected a text, %1 = &quot;...&quot;.</translation>
        </message>
        <message>
            <source>expected a file name after &quot;%1 =&quot;.</source>
            <translation>expected a file name after &quot;%1 =&quot;.</translation>
        </message>
        <message>
            <source>expected true or false after &quot;%1 =&quot;.</source>
            <translation>expected true or false after &quot;%1 =&quot;.</translation>
        </message>
        <message>
            <source>expected a number after &quot;%1 =&quot;.</source>
            <translation>expected a number after &quot;%1 =&quot;.</translation>
        </message>
        <message>
            <source>expected %1 numbers after &quot;%2 =&quot;.</source>
            <translation>expected %1 numbers after &quot;%2 =&quot;.</translation>
        </message>
        <message>
            <source>The new content is complete in &quot;%1&quot;.</source>
            <translation>The new content is complete in &quot;%1&quot;.</translation>
        </message>
    </context>
</TS>
