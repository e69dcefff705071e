// Places, and the water surface in a section.
#include "editors/cross_sections/section.h"

#include <gmock/gmock.h>
#include <gtest/gtest.h>

namespace {

CCrossSection At(const char* branch, double chainage)
{
    CCrossSection section;
    section.branch = branch;
    section.chainage = chainage;
    return section;
}

TEST(CrossSections, ArePlacedByBranchAsFirstMetThenByChainage)
{
    CCrossSections all;
    all.sections = {At("b", 20), At("a", 5), At("b", 10), At("a", -5), At("b", 10)};
    EXPECT_THAT(all.ByPlace(), testing::ElementsAre(2, 4, 0, 3, 1));
    EXPECT_EQ(all.Branches(), QStringList({"b", "a"}));
    EXPECT_EQ(all.Nearest("b", 14), 2);
    EXPECT_EQ(all.Nearest("b", 1e9), 0);
    EXPECT_EQ(all.Nearest("B", 14), 2) << "in any case";
    EXPECT_EQ(all.Nearest("c", 14), -1);
    EXPECT_TRUE(all.IsTaken(At("a", 5.0002), 0));
    EXPECT_FALSE(all.IsTaken(At("a", 5), 1)) << "by itself";
    EXPECT_FALSE(all.IsTaken(At("a", 5.001)));

    all.sections = {At("Inn", 7), At("A", 1), At("INN", 3)}; // one branch, spelt twice
    EXPECT_EQ(all.Branches(), QStringList({"Inn", "A"}));
    EXPECT_THAT(all.ByPlace(), testing::ElementsAre(2, 0, 1));
    EXPECT_TRUE(all.IsTaken(At("inn", 3)));
}

TEST(CrossSections, WaterIsAsWideAsTheWidthSays)
{
    const std::vector<CSectionPoint> trapezoid{{0, 10}, {10, 0}, {20, 0}, {30, 10}};
    const std::vector<CSectionPoint> walls{{0, 5}, {0, 0}, {8, 0}, {8, 5}};
    const std::vector<CSectionPoint> island{{0, 10}, {10, 0}, {20, 4}, {30, 1}, {40, 10}}; // two channels
    struct Case
    {
        const char* what;
        std::vector<CSectionPoint> points;
        double width;
        std::optional<CWaterSurface> water;
    };
    const Case cases[] = {
        {"slopes", trapezoid, 20, CWaterSurface{5, 5, 25}},
        {"to the brim", trapezoid, 30, CWaterSurface{10, 0, 30}},
        {"wider than the section", trapezoid, 31, {}},
        {"not known", trapezoid, KsUnset, {}},
        {"none", trapezoid, 0, {}},
        {"the bottom", trapezoid, 10, CWaterSurface{0, 10, 20}},
        {"vertical walls", walls, 8, CWaterSurface{0, 0, 8}},
        {"the deep channel alone", island, 10.5, CWaterSurface{3, 7, 17.5}},
        {"over the island", island, 32, CWaterSurface{14.0 / 3, 16.0 / 3, 0}},
        {"between the two", island, 20, CWaterSurface{4, 6, 20}},
        {"too few points", {{0, 1}, {10, 0}}, 5, {}},
        {"a level line", {{0, 1}, {5, 1}, {10, 1}}, 5, {}},
        {"falling all the way", {{0, 9}, {5, 4}, {10, 1}}, 5, {}},
    };
    for (const Case& each : cases) {
        CCrossSection section;
        section.points = each.points;
        section.width = each.width;
        const auto water = WaterSurface(section);
        ASSERT_EQ(water.has_value(), each.water.has_value()) << each.what;
        if (!water)
            continue;
        if (each.water->right > 0) {
            EXPECT_NEAR(water->level, each.water->level, 1e-5) << each.what;
            EXPECT_NEAR(water->left, each.water->left, 1e-5) << each.what;
            EXPECT_NEAR(water->right, each.water->right, 1e-5) << each.what;
        } else {
            EXPECT_NEAR(water->right - water->left, each.width, 1e-5) << each.what;
            EXPECT_GT(water->level, 4) << each.what;
        }
    }
}

} // namespace
