// An axis of the plot: its range in base units, and ticks at round numbers of the user's unit.
#pragma once

#include "ks/units/edit_style.h"

#include <QStringList>
#include <vector>

struct CPlotAxis
{
    UnitGroup group = UnitGroup::None;
    double low = 0, high = 1;  // metres
    std::vector<double> ticks; // metres, increasing
    QStringList labels;        // one a tick, in the user's unit

    /// Around the values from `from` to `to`, with about `most` ticks (at least two).
    static CPlotAxis Around(UnitGroup group, double from, double to, int most);
    /// Where a value stands: 0 at the low end, 1 at the high end.
    double Part(double value) const { return (value - low) / (high - low); }
};
