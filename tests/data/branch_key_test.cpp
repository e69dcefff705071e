#include "files/branch_key.h"

#include <gtest/gtest.h>

TEST(BranchKey, IsTheSameForNamesThatMeanOneBranch)
{
    const struct
    {
        const char *name, *key;
    } cases[] = {{"Main", "MAIN"},
                 {"", ""},
                 {"  \t ", ""},
                 {" Main 2\n", "MAIN 2"},
                 {"stra\xC3\x9F"
                  "e",
                  "STRASSE"},
                 {"\xC3\xA9tang", "\xC3\x89TANG"},
                 {"\xE5\xB7\x9D", "\xE5\xB7\x9D"},                               // a river in Japanese
                 {"\xEF\xBD\x81", "\xEF\xBC\xA1"},                               // a wide letter
                 {"\xE3\x80\x80r\xC2\xA0\xC3\xA9\xC2\xA0", "R\xC2\xA0\xC3\x89"}, // blanks of other kinds
                 {"r\xE2\x80\x8B\xC3\xA9\xE2\x80\x8E \xEF\xBB\xBF", "R\xC3\x89"},
                 {"a\xFF", "a\xFF"}};
    for (const auto& c : cases)
        EXPECT_EQ(BranchKey(c.name), c.key) << c.name;
}
