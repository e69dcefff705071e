// When two names mean one branch of the river network.
#pragma once

#include <string>
#include <string_view>

/// A name (UTF-8) as a cell for branch names stores what was typed or pasted: in capitals, without blanks around it and
/// without characters that nobody sees (HasNoWidth). Names of which this is the same are one branch, so it is the key
/// for looking one up. What is no UTF-8 stays as it is.
std::string BranchKey(std::string_view name);

/// Marks of the writing direction; soft hyphen, blank of no width, word joiner, mark of the byte order.
constexpr bool HasNoWidth(char32_t code)
{
    return code == 0x200E || code == 0x200F || (code >= 0x202A && code <= 0x202E) ||
           (code >= 0x2066 && code <= 0x2069) || code == 0x00AD || code == 0x200B || code == 0x2060 || code == 0xFEFF;
}
