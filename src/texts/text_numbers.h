// The numbers of the module's texts, free of any library, so that a declaration of data can say how its value is
// called. The texts stand in string_table.inc, res/strings.h gives them in the user's language.
#pragma once

#include <string>

enum class Str : int
{
    None = 0,
#define KVR_STRING(number, name, text) name = number,
#include "texts/string_table.inc"
#undef KVR_STRING
};

/// The title of a control as a message or a document calls it, without mnemonic and colon: "Zone 1" for "Zone &1:",
/// "区分1" for "区分1(&1):".
inline std::string PlainText(std::string title)
{
    if (const std::size_t key = title.find('&'); key != std::string::npos) {
        const bool isInBrackets = key > 0 && title[key - 1] == '(';
        title.erase(isInBrackets ? key - 1 : key, isInBrackets ? 4 : 1);
    }
    if (title.ends_with(':'))
        title.pop_back();
    return title;
}
