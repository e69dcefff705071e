// Which values a river may have: wider than any measured, so that what lies outside is a slip of the hand.
#pragma once

#include "data/global_var.h"

#include <span>
#include <string_view>

struct Plausible
{
    std::string_view section; // of a list, or of global values
    std::string_view field;   // of its records, of a keyword, or of the elements of a group in these
    double minimum, maximum;  // base units
    const char* reason;       // English; its translations are in the context "HDRules"
    /// Whether the value counts, with these global values; null: always.
    bool (*applies)(const HD_Global_Var& global) = nullptr;
    /// Values that stand for something else, such as "none"; null: none does.
    bool (*isMark)(double value) = nullptr;
};
std::span<const Plausible> PlausibleValues();
