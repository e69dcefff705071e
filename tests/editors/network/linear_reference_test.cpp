// Points and places: nearest places, interpolated chainages, and the channel between the rows of its table.
#include "editors/network/linear_reference.h"
#include "editors/network/plane_line.h"

#include <gtest/gtest.h>
#include <random>

namespace {

CNetworkBranch Branch(const char* name, double start, double end, std::vector<QPointF> line)
{
    CNetworkBranch branch;
    branch.name = name;
    branch.start = start;
    branch.end = end;
    branch.line = std::move(line);
    return branch;
}

CNetwork SmallNetwork()
{
    CNetwork network;
    network.branches = {Branch("L", 1000, 8000, {{0, 0}, {3000, 0}, {3000, 4000}}),
                        Branch("BACK", 500, 0, {{3000, 0}, {3000, -1000}}),
                        Branch("DOUBLE", 0, 10, {{9000, 0}, {9000, 0}, {9010, 0}, {9010, 0}}),
                        Branch("POINT", 0, 10, {{5000, 5000}}), Branch("EMPTY", 0, 10, {})};
    return network;
}

TEST(LinearReference, NearestPlaces)
{
    struct Case
    {
        QPointF point;
        double tolerance;
        const char* branch; // null: none
        double chainage, distance;
    };
    const Case cases[] = {
        {{1500, 0}, 10, "L", 2500, 0},        // on a segment
        {{1500, 200}, 250, "L", 2500, 200},   // beside it
        {{1500, 200}, 199.9, nullptr, 0, 0},  // too far away
        {{1500, 200}, 200, "L", 2500, 200},   // just within
        {{-300, 400}, 501, "L", 1000, 500},   // before the first vertex
        {{3000, 9000}, 1e9, "L", 8000, 5000}, // behind the last
        {{3003, 2000}, 10, "L", 6000, 3},     // the second segment
        {{2900, 60}, 100, "L", 3900, 60},     // inside a bend the nearer segment counts
        {{3000, -250}, 1, "BACK", 375, 0},    // chainages fall along the line
        {{3010, -1000}, 100, "BACK", 0, 10},  // its end
        {{9005, 1}, 5, "DOUBLE", 5, 1},       // vertices given twice
        {{5000, 5000}, 1, nullptr, 0, 0},     // a single point is no line
    };
    const CNetwork network = SmallNetwork();
    const CLinearReference reference(network);
    for (const Case& each : cases) {
        SCOPED_TRACE(testing::Message() << each.point.x() << ", " << each.point.y());
        const auto place = reference.Nearest(each.point, each.tolerance);
        ASSERT_EQ(place.has_value(), each.branch != nullptr);
        if (!place)
            continue;
        EXPECT_EQ(network.branches[std::size_t(place->branch)].name, each.branch);
        EXPECT_NEAR(place->chainage, each.chainage, 1e-9);
        EXPECT_NEAR(place->distance, each.distance, 1e-9);
        const auto back = reference.PointAt(place->branch, place->chainage);
        ASSERT_TRUE(back);
        EXPECT_NEAR(back->x(), place->point.x(), 1e-9);
        EXPECT_NEAR(back->y(), place->point.y(), 1e-9);
    }
    EXPECT_FALSE(CLinearReference().Nearest({0, 0}));
}

TEST(LinearReference, PointsOfChainages)
{
    const CNetwork network = SmallNetwork();
    const CLinearReference reference(network);
    EXPECT_EQ(reference.PointAt(0, 1000), QPointF(0, 0));
    EXPECT_EQ(reference.PointAt(0, 4000), QPointF(3000, 0));
    EXPECT_EQ(reference.PointAt(0, 8000), QPointF(3000, 4000));
    EXPECT_EQ(reference.PointAt(0, 8000 + 1e-7), QPointF(3000, 4000)); // a rounding of the unit system
    EXPECT_EQ(reference.PointAt(1, 500), QPointF(3000, 0));
    EXPECT_EQ(reference.PointAt(2, 0), QPointF(9000, 0));
    for (const auto& [branch, chainage] :
         {std::pair(0, 999.9), {0, 8000.1}, {0, std::nan("")}, {1, -1.0}, {3, 5.0}, {4, 5.0}, {5, 5.0}, {-1, 5.0}})
        EXPECT_FALSE(reference.PointAt(branch, chainage)) << branch << ' ' << chainage;
}

TEST(LinearReference, TheBoxesHideNoNearerPlace)
{
    std::mt19937 random(5);
    const auto number = [&] { return double(random() % 100000) / 10; };
    CNetwork network;
    for (int i = 0; i < 40; ++i) {
        std::vector<QPointF> line{{number(), number()}};
        for (unsigned vertex = random() % 150 + 1; vertex > 0; --vertex)
            line.push_back(line.back() + QPointF(number() / 50 - 100, number() / 50 - 100));
        network.branches.push_back(Branch("X", 0, 1, line));
    }
    const CLinearReference reference(network);
    for (int i = 0; i < 300; ++i) {
        const QPointF point(number(), number());
        double nearest = HUGE_VAL;
        for (const CNetworkBranch& branch : network.branches) {
            for (std::size_t k = 1; k < branch.line.size(); ++k) {
                const QPointF a = branch.line[k - 1], b = branch.line[k];
                const QPointF off = point - (a + NearestPart(point, a, b) * (b - a));
                nearest = std::min(nearest, std::hypot(off.x(), off.y()));
            }
        }
        const auto place = reference.Nearest(point);
        ASSERT_TRUE(place);
        EXPECT_NEAR(place->distance, nearest, 1e-9);
        EXPECT_FALSE(reference.Nearest(point, nearest * 0.999));
    }
}

TEST(PlaneLine, IsClippedToThePartsThatMeetTheWindow)
{
    // A wave in and out of the window's right half, then for long far from it, and back through the left half.
    std::vector<QPointF> line;
    for (int i = 0; i <= 64; ++i)
        line.emplace_back(i < 32 ? 50 : 150, i % 2 ? 20 : 80);
    for (int i = 0; i < 64; ++i)
        line.emplace_back(1000 + i, i % 2 ? 20 : 80);
    for (int i = 0; i < 20; ++i)
        line.emplace_back(10, i % 2 ? 20 : 80);
    const QRectF window(0, 0, 100, 100);
    CMapProjection projection;
    projection.origin = {0, 100};
    const CPlaneLine plane(line, projection);
    std::vector<std::pair<QPointF, QPointF>> expected, shown;
    for (std::size_t i = 1; i < plane.Points().size(); ++i) {
        const QPointF &a = plane.Points()[i - 1], &b = plane.Points()[i];
        if (std::min(a.x(), b.x()) <= window.right())
            expected.emplace_back(a, b);
    }
    for (const QPolygonF& part : plane.Clip(window)) {
        for (qsizetype i = 1; i < part.size(); ++i)
            shown.emplace_back(part[i - 1], part[i]);
    }
    EXPECT_EQ(shown, expected);
}

TEST(ChannelValues, AreInterpolatedBetweenRowsThatHaveThemAndNeverBeyond)
{
    const double no = KsUnset;
    const std::vector<CChannelRow> channel{
        {100, 400, no}, {200, no, 50}, {300, 800, 70}, {300, 900, 71}, {400, no, 90}};
    struct Case
    {
        double chainage, radius, width;
    };
    for (const Case& each : {Case{100, 400, no},
                             {150, 500, no},
                             {200, 600, 50},
                             {250, 700, 60},
                             {300, 800, 70},
                             {350, no, 80.5},
                             {400, no, 90},
                             {99, no, no},
                             {401, no, no}}) {
        const double radius = ChannelValue(channel, &CChannelRow::radius, each.chainage);
        const double width = ChannelValue(channel, &CChannelRow::width, each.chainage);
        EXPECT_TRUE(radius == each.radius || (std::isnan(radius) && std::isnan(each.radius))) << each.chainage;
        EXPECT_TRUE(width == each.width || (std::isnan(width) && std::isnan(each.width))) << each.chainage << width;
    }
    EXPECT_TRUE(std::isnan(ChannelValue({}, &CChannelRow::width, 5)));
}

} // namespace
