// The unit that bed resistances are given in: it follows the resistance formula, and no value is converted.
#pragma once

#include <QString>
#include <cstdint>

/// `formula` as "resist_num": 0 Manning's M, 1 Manning's n, 2 Chezy; empty for another number.
/// Units as in V. T. Chow, Open-Channel Hydraulics (1959), sections 5-4 and 5-6, in SI; M = 1/n is Strickler's form.
inline QString ResistanceUnit(std::int32_t formula)
{
    switch (formula) {
    case 0:
        return QStringLiteral("m^(1/3)/s");
    case 1:
        return QStringLiteral("s/m^(1/3)");
    case 2:
        return QStringLiteral("m^(1/2)/s");
    default:
        return {};
    }
}
