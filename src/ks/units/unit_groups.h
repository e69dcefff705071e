// What the unit groups convert between: one row a group.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"
#include "ks/units/edit_style.h"

#include <optional>

/// A unit: how UDUNITS spells it, and how the user reads it.
struct KsUnit
{
    const char* spelling; // null: values are shown as stored
    const char* symbol;   // UTF-8; empty for a quantity without unit
};

struct KsUnitGroupRow
{
    UnitGroup group;
    const char* quantity;
    KsUnit base, usCustomary; // metric values are shown as they are stored
    const char* alsoTyped = ""; // what users also type, to be offered to them: UTF-8, ", " between

    const KsUnit& Display(KsUnitSystem system) const { return system == KsUnitSystem::Metric ? base : usCustomary; }
};

/// Null for UnitGroup::None and numbers that no row has.
KS_API const KsUnitGroupRow* KsFindUnitGroup(UnitGroup group);
/// Between a group's base unit and its display unit: base = display * factor. No quantity has an offset. Computed once;
/// 1 when the unit definitions cannot be read.
KS_API double KsUnitFactor(UnitGroup group, KsUnitSystem system);
/// How many base units of the group are one of a unit that a user typed ("cfs", "l/s", "FT"), in any case that has a
/// meaning; nothing for what is no unit, and for a unit of something else.
KS_API std::optional<long double> KsTypedUnitFactor(UnitGroup group, const CString& unit);
/// Whether the text is a unit of anything.
KS_API bool KsIsUnit(const CString& unit);
