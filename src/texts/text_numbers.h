// The numbers of the module's texts, free of any library, so that a declaration of data can say how its value is called.
// The texts stand in string_table.inc, res/strings.h gives them in the user's language.
#pragma once

enum class Str : int
{
    None = 0,
#define KVR_STRING(number, name, text) name = number,
#include "texts/string_table.inc"
#undef KVR_STRING
};
