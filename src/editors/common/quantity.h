// Numbers of the editors in the user's unit.
#pragma once

#include "ks/units/edit_style.h"

#include <cmath>

/// "12.5 m", to a thousandth of the unit; only the unit for a value that is not set.
inline QString WithSymbol(UnitGroup group, double value)
{
    const double shown = std::round(CKsEditStyle(group).UnitConvertFromBase(value, 1) * 1000) / 1000;
    return QStringLiteral("%1 %2").arg(std::isnan(value) ? QString() : KsShortestNumber(shown),
                                       CKsEditStyle(group).UnitSymbol());
}
