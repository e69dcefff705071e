// The mark of a number that has not been given.
#pragma once

/// Stands for a chainage (or another number of a table) that has not been given; compared exactly.
inline constexpr double NotGiven = 1.0e10;
