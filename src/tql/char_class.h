// What a byte can be in the text, one table look-up.
#pragma once

#include "tql/bytes.h"

#include <array>
#include <cstdint>
#include <string_view>

namespace tql {

enum CharClass : std::uint8_t
{
    NameChar = 1,    // letters, digits, '_', '-', '.', and every byte of a character beyond ASCII
    Blank = 2,       // space and tab
    Digit = 4,       // 0-9
    WordEnd = 8,     // what may follow a number or a word: blank, comma, comment, line end
    StringStop = 16, // what is not simply itself within a string
    FileStop = 32    // the same for a file name
};

inline constexpr auto CharClasses = [] {
    std::array<std::uint8_t, 256> table{};
    for (int c = 0; c < 256; ++c) {
        const bool digit = c >= '0' && c <= '9';
        const bool letter = (c >= 'A' && c <= 'Z') || (c >= 'a' && c <= 'z');
        const bool blank = c == ' ' || c == '\t';
        const bool control = c < 0x20 || c == 0x7F;
        int flags = 0;
        if (digit || letter || c == '_' || c == '-' || c == '.' || c >= 0x80)
            flags |= NameChar;
        if (blank)
            flags |= Blank;
        if (digit)
            flags |= Digit;
        if (blank || c == ',' || c == '/' || c == '\r' || c == '\n')
            flags |= WordEnd;
        if (control || c == '"' || c == '\\')
            flags |= StringStop;
        if (control || c == '>' || c == '\\')
            flags |= FileStop;
        table[std::size_t(c)] = std::uint8_t(flags);
    }
    return table;
}();

inline bool Is(char c, int classes)
{
    return (CharClasses[static_cast<unsigned char>(c)] & classes) != 0;
}

inline const char* SkipBlanks(const char* p)
{
    for (; Is(*p, Blank); ++p) {
        p = FindByte(p, [](std::uint64_t block) { return block ^ Repeat(' '); });
        if (*p != '\t')
            break;
    }
    return p;
}

inline bool IsName(std::string_view text)
{
    for (const char c : text)
        if (!Is(c, NameChar))
            return false;
    return !text.empty();
}

} // namespace tql
