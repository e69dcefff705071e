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
</TS>
