// Numbers of the editors' tables: shown in the user's unit, typed in it, stored in metres.
#pragma once

#include "ks/units/edit_style.h"

#include <QLocale>
#include <cmath>
#include <optional>

/// To a thousandth of the unit; empty for a value that is not set.
inline QString ShowQuantity(UnitGroup group, double value)
{
    const double shown = CKsEditStyle(group).UnitConvertFromBase(value, 1);
    return std::isnan(value) ? QString() : KsShortestNumber(std::round(shown * 1000) / 1000);
}

/// With every digit, for editing.
inline QString EditQuantity(UnitGroup group, double value)
{
    return std::isnan(value) ? QString() : KsShortestNumber(CKsEditStyle(group).UnitConvertFromBase(value, 1));
}

/// What was typed, in metres; nothing when it is no number.
inline std::optional<double> ReadQuantity(UnitGroup group, const QString& text)
{
    QLocale numbers = QLocale::c();
    numbers.setNumberOptions(QLocale::RejectGroupSeparator);
    bool good = false;
    const double value = numbers.toDouble(text.trimmed(), &good);
    return good && std::isfinite(value) ? std::optional(CKsEditStyle(group).UnitConvertFromBase(value, 0))
                                        : std::nullopt;
}

/// "Width [m]"
inline QString WithUnit(const QString& name, UnitGroup group)
{
    return QStringLiteral("%1 [%2]").arg(name, CKsEditStyle(group).UnitSymbol());
}

/// "12.5 m"
inline QString WithSymbol(UnitGroup group, double value)
{
    return QStringLiteral("%1 %2").arg(ShowQuantity(group, value), CKsEditStyle(group).UnitSymbol());
}
