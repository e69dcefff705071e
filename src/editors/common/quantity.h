// Numbers of the editors in the user's unit.
#pragma once

#include "grid/column_spec.h"

#include <cmath>

/// "12.5 m", to a thousandth of the unit; only the unit for a value that is not set.
inline QString WithSymbol(UnitGroup group, double value)
{
    const CKsEditStyle style(group);
    return NumberText(std::isnan(value) ? QString() : style.RoundedText(value), style.UnitSymbol());
}
