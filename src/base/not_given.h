// The mark of a number that has not been given, in files, tables and packages alike.
#pragma once

/// Compared exactly, and in whatever unit.
inline constexpr double NotGiven = 1.0e10;
