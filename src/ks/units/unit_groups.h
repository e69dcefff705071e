// What the unit groups convert between: one row a group.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"
#include "ks/units/edit_style.h"
#include "base/unit_group.h"

#include <span>

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
    KsUnit base, metric, usCustomary;

    const KsUnit& Display(KsUnitSystem system) const { return system == KsUnitSystem::Metric ? metric : usCustomary; }
};

KS_API std::span<const KsUnitGroupRow> KsUnitGroups();
/// Null for UnitGroup::None and numbers that no row has.
KS_API const KsUnitGroupRow* KsFindUnitGroup(UnitGroup group);
/// From a group's base unit to its display unit. Computed once; the identity when the unit system cannot be read.
KS_API KsConversion KsUnitConversion(UnitGroup group, KsUnitSystem system);
