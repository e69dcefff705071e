// Every way a text can be wrong, and the sentence the modeller reads.
#include "tql/tql_support.h"

#include <gtest/gtest.h>

namespace {

struct Case
{
    std::string text;
    const char* report; // behind "river.hdkv, "
    TqlError code = TqlError::Syntax;
};

const Case Cases[] = {
    // wrong nesting
    {"[T]\n  [InitList]\n  [/WindList]\n[/T]\n", "line 3, column 3: expected [/InitList], found [/WindList]"},
    {"[T]\n[A]\n[/T]\n", "line 3, column 1: expected [/A], found [/T]"},
    {"[/T]\n", "line 1, column 1: expected a target in brackets, such as [Name], found [/T]"},
    {"[T]\n[/T]\n[/T]\n", "line 3, column 1: expected a target in brackets, such as [Name], found [/T]"},
    {"K = 1\n", "line 1, column 1: expected a target in brackets, such as [Name], before any keyword, found K"},
    // truncated
    {"[T]\n[A]\nK = 1", "line 3, column 6: expected [/A], found the end of the file"},
    {"[T]\n", "line 1, column 4: expected [/T], found the end of the file"},
    {"[T]\n[/", "line 2, column 3: expected a name of letters, digits, '_', '-' and '.', found the end of the line"},
    {"", "line 1, column 1: expected a parameter file, found an empty file"},
    {" \r\n\n\t", "line 3, column 2: expected a parameter file, found an empty file"},
    {"\xEF\xBB\xBF", "line 1, column 1: expected a parameter file, found an empty file"},
    {"// KVR par", "line 1, column 11: expected a target in brackets, such as [Name], found the end of the file"},
    {"\xEF\xBB\xBF// KVR parameter file 1",
     "line 1, column 24: expected a target in brackets, such as [Name], found the end of the file"},
    // lines that are none
    {"[T]\n?\n", "line 2, column 1: expected a section in brackets, a keyword or a comment, found ?"},
    {"[T]\n/ c\n", "line 2, column 1: expected a section in brackets, a keyword or a comment, found /"},
    {"[T]\nK 1\n", "line 2, column 3: expected = behind the keyword's name, found 1"},
    {"[T]\nK\n", "line 2, column 2: expected = behind the keyword's name, found the end of the line"},
    {"[T]\na b = 1\n", "line 2, column 3: expected = behind the keyword's name, found b"},
    {"[T] K = 1\n", "line 1, column 5: expected the end of the line, found K"},
    {"[ T]\n", "line 1, column 2: expected a name of letters, digits, '_', '-' and '.', found a blank"},
    {"[T!]\n",
     "line 1, column 3: expected ] behind the name (names have letters, digits, '_', '-' and '.' only), found !]"},
    {"[T", "line 1, column 3: expected ] behind the name (names have letters, digits, '_', '-' and '.' only), found "
           "the end of the line"},
    {"// c\r// d\n", "line 1, column 5: expected a line feed after the carriage return, found a carriage return"},
    // parameters
    {"[T]\nK = 1,\r\n", "line 2, column 7: expected a parameter (a number, true, false, \"text\" or <file name>), "
                        "found the end of the line"},
    {"[T]\nK = ,1\n",
     "line 2, column 5: expected a parameter (a number, true, false, \"text\" or <file name>), found ,1"},
    {"[T]\nK = 1 2\n", "line 2, column 7: expected a comma or the end of the line, found 2"},
    {"[T]\nK = \"a\"b\n", "line 2, column 8: expected a comma or the end of the line, found b"},
    {"[T]\nK = 1/2\n", "line 2, column 6: expected a comma or the end of the line, found /2"},
    {"[T]\nK = True\n",
     "line 2, column 5: expected a parameter (a number, true, false, \"text\" or <file name>), found True"},
    {"[T]\nK = truer\n", "line 2, column 5: expected true or false, found truer"},
    {"[T]\nK = +1\n",
     "line 2, column 5: expected a parameter (a number, true, false, \"text\" or <file name>), found +1"},
    {"[T]\nK = 1, 12abc\n", "line 2, column 8: expected a number such as -12, 0.5 or 1e-05, found 12abc"},
    {"[T]\nK = 0x10\n", "line 2, column 5: expected a number such as -12, 0.5 or 1e-05, found 0x10"},
    {"[T]\nK = -\n", "line 2, column 5: expected a number such as -12, 0.5 or 1e-05, found -"},
    {"[T]\nK = .\n", "line 2, column 5: expected a number such as -12, 0.5 or 1e-05, found ."},
    {"[T]\nK = .e5\n", "line 2, column 5: expected a number such as -12, 0.5 or 1e-05, found .e5"},
    {"[T]\nK = 1e\n", "line 2, column 5: expected a number such as -12, 0.5 or 1e-05, found 1e"},
    {"[T]\nK = 1e+,2\n", "line 2, column 5: expected a number such as -12, 0.5 or 1e-05, found 1e+"},
    {"[T]\nK = 1.2.3\n", "line 2, column 5: expected a number such as -12, 0.5 or 1e-05, found 1.2.3"},
    {"[T]\nK = - 1\n", "line 2, column 5: expected a number such as -12, 0.5 or 1e-05, found -"},
    {"[T]\nK = 1,5e\n", "line 2, column 7: expected a number such as -12, 0.5 or 1e-05, found 5e"},
    {"[T]\nK = infinity\n", "line 2, column 5: expected a number such as -12, 0.5 or 1e-05, found infinity"},
    {"[T]\nK = NaN\n",
     "line 2, column 5: expected a parameter (a number, true, false, \"text\" or <file name>), found NaN"},
    {"[T]\nK = 2147483648\n", "line 2, column 5: expected an integer from -2147483648 to 2147483647, found 2147483648"},
    {"[T]\nK = -2147483649\n",
     "line 2, column 5: expected an integer from -2147483648 to 2147483647, found -2147483649"},
    {"[T]\nK = 99999999999999999999999\n",
     "line 2, column 5: expected an integer from -2147483648 to 2147483647, found 99999999999999999999999"},
    {"[T]\nK = 1e999\n", "line 2, column 5: expected a number within the range of 64-bit floats, found 1e999"},
    {"[T]\nK = 1e-999\n", "line 2, column 5: expected a number within the range of 64-bit floats, found 1e-999"},
    // strings and file names
    {"[T]\nK = \"abc\n", "line 2, column 9: expected \" closing the string, found the end of the line"},
    {"[T]\nK = <abc\r\n", "line 2, column 9: expected > closing the file name, found the end of the line"},
    {"[T]\nK = \"a\\", "line 2, column 7: expected one of the escapes \\\" \\\\ \\n \\r \\t \\u{...}, found \\"},
    {"[T]\nK = \"\\x\"\n", "line 2, column 6: expected one of the escapes \\\" \\\\ \\n \\r \\t \\u{...}, found \\x\""},
    {"[T]\nK = <a\\n>\n", "line 2, column 7: expected one of the escapes \\> \\\\ \\u{...}, found \\n>"},
    {"[T]\nK = \"\\u{110000}\"\n",
     "line 2, column 6: expected \\u{...} with the hexadecimal number of a character, found \\u{110000}\""},
    {"[T]\nK = \"\\u{D800}\"\n",
     "line 2, column 6: expected \\u{...} with the hexadecimal number of a character, found \\u{D800}\""},
    {"[T]\nK = \"\\u{}\"\n",
     "line 2, column 6: expected \\u{...} with the hexadecimal number of a character, found \\u{}\""},
    {"[T]\nK = \"\\u{41\"\n",
     "line 2, column 6: expected \\u{...} with the hexadecimal number of a character, found \\u{41\""},
    {"[T]\nK = \"\\u0041\"\n",
     "line 2, column 6: expected \\u{...} with the hexadecimal number of a character, found \\u0041\""},
    {"[T]\nK = \"\xE5\xB7\x9D\a\"\n",
     "line 2, column 7: expected no control character (they are written \\u{...}), found the control character U+0007"},
    // encoding
    {std::string("[T]\nK\0= 1\n", 10), "line 2, column 2: expected text in UTF-8, found a NUL character",
     TqlError::Encoding},
    {"[T]\n// \xE5\xB7\x9D \xFF\n", "line 2, column 6: expected text in UTF-8, found the byte 0xFF",
     TqlError::Encoding},
    {"[T]\nK = \"M\xFCller\"\n", "line 2, column 7: expected text in UTF-8, found the byte 0xFC", TqlError::Encoding},
    {"// \xED\xA0\x80\n", "line 1, column 4: expected text in UTF-8, found the byte 0xED", TqlError::Encoding},
    {"// \xC0\xAF\n", "line 1, column 4: expected text in UTF-8, found the byte 0xC0", TqlError::Encoding},
    {"// \xE0\x9F\xBF\n", "line 1, column 4: expected text in UTF-8, found the byte 0xE0", TqlError::Encoding},
    {"// \xF0\x8F\xBF\xBF\n", "line 1, column 4: expected text in UTF-8, found the byte 0xF0", TqlError::Encoding},
    {"// \xF4\x90\x80\x80\n", "line 1, column 4: expected text in UTF-8, found the byte 0xF4", TqlError::Encoding},
    {"// \xE5\xB7", "line 1, column 4: expected text in UTF-8, found the byte 0xE5", TqlError::Encoding},
    {std::string("\xFF\xFE[\0T\0", 6), "line 1, column 1: expected text in UTF-8, found UTF-16", TqlError::Encoding},
    {std::string("\x7F"
                 "ELF\2\1\1\0\0\0",
                 10),
     "line 1, column 8: expected text in UTF-8, found a NUL character", TqlError::Encoding},
};

TEST(SyntaxErrors, AreReportedInOneSentenceAndLeaveNothing)
{
    for (const Case& c : Cases) {
        const Structure structure = LoadText(c.text);
        TqlSyntaxError error;
        EXPECT_TRUE(tqlGetSyntaxErr(structure, &error)) << c.text;
        EXPECT_EQ(error.message, std::string("river.hdkv, ") + c.report);
        EXPECT_EQ(error.code, c.code) << error.message;
        const std::string place = "line " + std::to_string(error.line) + ", column " + std::to_string(error.column);
        EXPECT_EQ(error.message.find("river.hdkv, " + place), 0u) << error.message;
        EXPECT_EQ(tqlPeekErrorGlb(), int(c.code));
        EXPECT_EQ(tqlGetNoSections(structure), 0);
        EXPECT_EQ(tqlTargetByNameNum(structure, "T", 1), nullptr);
    }
}

} // namespace
