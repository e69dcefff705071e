// What is drawn of a curve looks, on every column of pixels, as all of its points do.
#include "plot/reduced_curve.h"

#include <algorithm>
#include <cmath>
#include <gtest/gtest.h>
#include <limits>
#include <map>
#include <random>

namespace {

constexpr double None = std::numeric_limits<double>::quiet_NaN();

struct Seen
{
    double least = std::numeric_limits<double>::infinity(), most = -least;
    bool operator==(const Seen&) const = default;
};

/// What a column shows of points that stand in it.
std::map<int, Seen> Columns(const std::vector<double>& x, const std::vector<double>& y,
                            const std::vector<std::size_t>& points, double from, double to, int pixels)
{
    std::map<int, Seen> columns;
    for (const std::size_t point : points) {
        if (x[point] < from || x[point] >= to || std::isnan(y[point]))
            continue;
        Seen& seen = columns[int((x[point] - from) / (to - from) * pixels)];
        seen.least = std::min(seen.least, y[point]);
        seen.most = std::max(seen.most, y[point]);
    }
    return columns;
}

TEST(ReducedCurve, EveryColumnShowsItsExtremesInTheOrderOfThePoints)
{
    std::mt19937 random(3);
    for (const std::size_t count : {0u, 1u, 63u, 64u, 65u, 4000u, 50'000u}) {
        std::vector<double> x, y;
        std::vector<std::size_t> all;
        for (std::size_t i = 0; i < count; ++i) {
            x.push_back((i > 0 ? x.back() : 0) + double(random() % 5)); // some stand at one place
            y.push_back(random() % 50 == 0 ? None : double(random() % 100'000));
            all.push_back(i);
        }
        const CReducedCurve curve(x, y);
        const double end = count > 0 ? x.back() + 1 : 1;
        for (int round = 0; round < 20; ++round) {
            const double from = round == 0 ? -10 : random() % 1000 / 1000.0 * end;
            const double to = from + (round == 0 ? end + 20 : (1 + random() % 500) / 500.0 * end);
            const int pixels = 1 + int(random() % 300);
            const auto shown = curve.Visible(from, to, pixels);
            EXPECT_TRUE(std::ranges::is_sorted(shown, std::less_equal<>()) || shown.size() < 2) << count;
            EXPECT_EQ(std::ranges::adjacent_find(shown), shown.end());
            EXPECT_LE(shown.size(), 4 * std::size_t(pixels) + 2);
            // Columns are counted anew here: those at whose edge a point stands may differ by rounding.
            const auto want = Columns(x, y, all, from, to, pixels), have = Columns(x, y, shown, from, to, pixels);
            std::size_t different = 0;
            for (const auto& [column, seen] : want)
                different += !have.contains(column) || have.at(column) != seen;
            EXPECT_LE(different, want.size() / 50) << count << " from " << from << " to " << to << " on " << pixels;
        }
    }
}

TEST(ReducedCurve, LinesEnterAndLeaveTheWindowAndGapsStay)
{
    std::vector<double> x, y;
    for (int i = 0; i < 10'000; ++i) {
        x.push_back(i);
        y.push_back(i >= 4000 && i < 6000 ? None : i);
    }
    const CReducedCurve curve(x, y);
    EXPECT_EQ(curve.Visible(10.5, 12.5, 100), (std::vector<std::size_t>{10, 11, 12, 13}));
    EXPECT_EQ(curve.Visible(10.25, 10.75, 100), (std::vector<std::size_t>{10, 11})) << "no point is in sight";
    const auto all = curve.Visible(1000, 9000, 50);
    EXPECT_EQ(all.front(), 999u);
    EXPECT_EQ(all.back(), 9001u);
    EXPECT_TRUE(std::ranges::any_of(all, [&](std::size_t point) { return std::isnan(y[point]); }))
        << "a line would run across the gap";
    EXPECT_TRUE(curve.Visible(5, 5, 10).empty());
    EXPECT_TRUE(CReducedCurve().Visible(0, 1, 10).empty());
}

} // namespace
