#include "editors/cross_sections/section.h"

#include "ks/fc/branch_name.h"

#include <QSet>
#include <algorithm>
#include <cmath>
#include <map>
#include <numeric>

double PlaceOf(double chainage)
{
    constexpr double shown = 1000; // parts of a metre
    return std::round(chainage * shown);
}

std::tuple<QString, QString, double> CCrossSection::Key() const
{
    return {KsBranchKey(Branch()), TopoId(), PlaceOf(chainage)};
}

bool CCrossSections::IsTaken(const CCrossSection& section, int except) const
{
    for (std::size_t i = 0; i < sections.size(); ++i) {
        if (int(i) != except && sections[i].Key() == section.Key())
            return true;
    }
    return false;
}

int CCrossSections::Nearest(const QString& branch, double chainage) const
{
    int nearest = -1;
    double least = HUGE_VAL;
    for (std::size_t i = 0; i < sections.size(); ++i) {
        const double distance = std::abs(sections[i].chainage - chainage);
        if (distance < least && KsSameBranch(sections[i].Branch(), branch)) {
            least = distance;
            nearest = int(i);
        }
    }
    return nearest;
}

QStringList CCrossSections::Branches() const
{
    QStringList branches;
    QSet<QString> known;
    for (const CCrossSection& section : sections) {
        if (const QString key = KsBranchKey(section.Branch()); !known.contains(key)) {
            known << key;
            branches << section.Branch();
        }
    }
    return branches;
}

std::vector<int> CCrossSections::ByPlace() const
{
    std::map<QString, std::size_t> branches; // by key: the place in Branches()
    std::vector<std::pair<std::size_t, double>> places;
    for (const CCrossSection& section : sections) {
        const std::size_t next = branches.size();
        places.emplace_back(branches.emplace(KsBranchKey(section.Branch()), next).first->second, section.chainage);
    }
    std::vector<int> order(sections.size());
    std::iota(order.begin(), order.end(), 0);
    std::stable_sort(order.begin(), order.end(),
                     [&](int a, int b) { return places[std::size_t(a)] < places[std::size_t(b)]; });
    return order;
}

void CCrossSections::SortByPlace()
{
    std::vector<CCrossSection> sorted;
    sorted.reserve(sections.size());
    for (const int index : ByPlace())
        sorted.push_back(std::move(sections[std::size_t(index)]));
    sections = std::move(sorted);
}

// ---- water surface -----------------------------------------------------------------------------

namespace {

using Points = std::vector<CSectionPoint>;

/// Where the ground first reaches the level, going from the deepest point in steps of `step`; the end when nowhere.
double Shore(const Points& points, std::size_t deepest, int step, double level)
{
    std::size_t at = deepest;
    const std::size_t end = step > 0 ? points.size() - 1 : 0;
    while (at != end) {
        const CSectionPoint &inner = points[at], &outer = points[at + std::size_t(step)];
        if (outer.level >= level) {
            const double rise = outer.level - inner.level;
            const double part = rise > 0 ? (level - inner.level) / rise : 0;
            return std::lerp(inner.offset, outer.offset, std::clamp(part, 0.0, 1.0));
        }
        at += std::size_t(step);
    }
    return points[end].offset;
}

} // namespace

std::optional<CWaterSurface> WaterSurface(const CCrossSection& section)
{
    const Points& points = section.points;
    if (points.size() < 3 || !(section.width > 0))
        return {};
    const auto lowest =
        std::min_element(points.begin(), points.end(), [](const auto& a, const auto& b) { return a.level < b.level; });
    const auto deepest = std::size_t(lowest - points.begin());
    const auto surface = [&](double level) {
        return CWaterSurface{level, Shore(points, deepest, -1, level), Shore(points, deepest, 1, level)};
    };
    const auto width = [](const CWaterSurface& each) { return each.right - each.left; };

    // Above its banks the water would leave the section.
    const auto top = [](auto first, auto last) {
        return std::max_element(first, last, [](const auto& a, const auto& b) { return a.level < b.level; })->level;
    };
    double low = lowest->level, high = std::min(top(points.begin(), lowest + 1), top(lowest, points.end()));
    if (high <= low || width(surface(high)) < section.width)
        return {};
    constexpr int halvings = 60; // to the last digit of any level
    for (int i = 0; i < halvings; ++i) {
        const double middle = std::midpoint(low, high);
        (width(surface(middle)) < section.width ? low : high) = middle;
    }
    // Just below the level at which a bank is overtopped, or exactly there where the sides are slopes.
    constexpr double tolerance = 1e-6;
    const CWaterSurface reached = surface(high);
    return width(reached) - section.width > tolerance ? surface(low) : reached;
}
