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
        <name>SyntaxError</name>
        <message>
            <source>%1 cannot be read: %2</source>
            <translation>%1 cannot be read: %2</translation>
        </message>
        <message>
            <source>%1, line %2, column %3: expected %4, found %5</source>
            <translation>%1, line %2, column %3: expected %4, found %5</translation>
        </message>
        <message>
            <source>the end of the line</source>
            <translation>the end of the line</translation>
        </message>
        <message>
            <source>the end of the file</source>
            <translation>the end of the file</translation>
        </message>
        <message>
            <source>a parameter file</source>
            <translation>a parameter file</translation>
        </message>
        <message>
            <source>an empty file</source>
            <translation>an empty file</translation>
        </message>
        <message>
            <source>a line of at most 16 MiB</source>
            <translation>a line of at most 16 MiB</translation>
        </message>
        <message>
            <source>a longer one</source>
            <translation>a longer one</translation>
        </message>
        <message>
            <source>at most 128 sections inside one another</source>
            <translation>at most 128 sections inside one another</translation>
        </message>
        <message>
            <source>one more</source>
            <translation>one more</translation>
        </message>
        <message>
            <source>text in UTF-8</source>
            <translation>text in UTF-8</translation>
        </message>
        <message>
            <source>a NUL character</source>
            <translation>a NUL character</translation>
        </message>
        <message>
            <source>the byte 0x%1</source>
            <translation>the byte 0x%1</translation>
        </message>
        <message>
            <source>a section in brackets, a keyword or a comment</source>
            <translation>a section in brackets, a keyword or a comment</translation>
        </message>
        <message>
            <source>a line feed after the carriage return</source>
            <translation>a line feed after the carriage return</translation>
        </message>
        <message>
            <source>a name of letters, digits, '_', '-' and '.'</source>
            <translation>a name of letters, digits, '_', '-' and '.'</translation>
        </message>
        <message>
            <source>] behind the name (names have letters, digits, '_', '-' and '.' only)</source>
            <translation>] behind the name (names have letters, digits, '_', '-' and '.' only)</translation>
        </message>
        <message>
            <source>a target in brackets, such as [Name]</source>
            <translation>a target in brackets, such as [Name]</translation>
        </message>
        <message>
            <source>a target in brackets, such as [Name], before any keyword</source>
            <translation>a target in brackets, such as [Name], before any keyword</translation>
        </message>
        <message>
            <source>= behind the keyword's name</source>
            <translation>= behind the keyword's name</translation>
        </message>
        <message>
            <source>a comma or the end of the line</source>
            <translation>a comma or the end of the line</translation>
        </message>
        <message>
            <source>a parameter (a number, true, false, "text" or &lt;file name&gt;)</source>
            <translation>a parameter (a number, true, false, "text" or &lt;file name&gt;)</translation>
        </message>
        <message>
            <source>true or false</source>
            <translation>true or false</translation>
        </message>
        <message>
            <source>a number such as -12, 0.5 or 1e-05</source>
            <translation>a number such as -12, 0.5 or 1e-05</translation>
        </message>
        <message>
            <source>an integer from -2147483648 to 2147483647</source>
            <translation>an integer from -2147483648 to 2147483647</translation>
        </message>
        <message>
            <source>a number within the range of 64-bit floats</source>
            <translation>a number within the range of 64-bit floats</translation>
        </message>
        <message>
            <source>" closing the string</source>
            <translation>" closing the string</translation>
        </message>
        <message>
            <source>&gt; closing the file name</source>
            <translation>&gt; closing the file name</translation>
        </message>
        <message>
            <source>one of the escapes \" \\ \n \r \t \u{...}</source>
            <translation>one of the escapes \" \\ \n \r \t \u{...}</translation>
        </message>
        <message>
            <source>one of the escapes \&gt; \\ \u{...}</source>
            <translation>one of the escapes \&gt; \\ \u{...}</translation>
        </message>
        <message>
            <source>\u{...} with the hexadecimal number of a character</source>
            <translation>\u{...} with the hexadecimal number of a character</translation>
        </message>
        <message>
            <source>no control character (they are written \u{...})</source>
            <translation>no control character (they are written \u{...})</translation>
        </message>
        <message>
            <source>a blank</source>
            <translation>a blank</translation>
        </message>
        <message>
            <source>a tab</source>
            <translation>a tab</translation>
        </message>
        <message>
            <source>a carriage return</source>
            <translation>a carriage return</translation>
        </message>
        <message>
            <source>the control character U+%1</source>
            <translation>the control character U+%1</translation>
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
</TS>
