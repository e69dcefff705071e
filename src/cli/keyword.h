// Global values by the name that a user gives.
#pragma once

#include "base/result.h"
#include "data/global_var.h"

struct NamedValue
{
    std::string name; // "Section/Keyword"
    FieldList fields; // of HD_Global_Var
};

/// Finds a keyword, or the list of an item sub-section, by "Keyword" or "Section/Keyword". The error lists what the
/// name could mean.
Result<NamedValue> FindKeyword(const std::string& name);
