#include "editors/cross_sections/plot_axis.h"

#include <algorithm>
#include <cmath>

namespace {

/// 1, 2 or 5 times a power of ten, at least `value`.
double Round125(double value)
{
    const double power = std::pow(10, std::floor(std::log10(value)));
    const double digits = value / power;
    return (digits <= 1 ? 1 : digits <= 2 ? 2 : digits <= 5 ? 5 : 10) * power;
}

} // namespace

CPlotAxis CPlotAxis::Around(UnitGroup group, double from, double to, int most)
{
    const CKsEditStyle unit(group);
    CPlotAxis axis;
    axis.group = group;
    // A level line is shown, too; so are numbers that differ by less than a double can tell.
    const double least = std::max(1.0, 1e-9 * std::max(std::abs(from), std::abs(to)));
    const double room = std::max(0.04 * (to - from), to - from < 1e-3 * least ? least : 0);
    axis.low = from - room;
    axis.high = to + room;
    const double low = unit.UnitConvertFromBase(axis.low, 1), high = unit.UnitConvertFromBase(axis.high, 1);
    const int count = std::max(most, 2);
    const double step = Round125((high - low) / count);
    const int decimals = std::max(0, -int(std::floor(std::log10(step) + 1e-9)));
    const double first = std::ceil(low / step);
    for (int i = 0; i <= count && (first + i) * step <= high; ++i) {
        const double value = (first + i) * step;
        axis.ticks.push_back(unit.UnitConvertFromBase(value, 0));
        axis.labels << QString::number(value == 0 ? 0.0 : value, 'f', std::min(decimals, 9)); // no "-0"
    }
    return axis;
}
