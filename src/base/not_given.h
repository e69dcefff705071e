// The mark of a number that has not been given, as HD parameter files write it; so the values of their records have it
// in memory, in cells and in packages, too.
#pragma once

/// Compared exactly, and in whatever unit. What an item of a package need not carry, and what networks and cross
/// sections do not know, is KsUnset (ks/fc/exchange.h); in a cell it is this mark (FieldAccess, grid/column_spec.h).
inline constexpr double NotGiven = 1.0e10;
