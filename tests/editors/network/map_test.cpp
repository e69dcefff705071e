// The map under mouse and keys, and that what it paints while it moves is what it paints anew.
#include "network_fixture.h"

#include "editors/network/map_overlay.h"

namespace {

QImage Picture(CNetworkMap* map)
{
    return map->grab().toImage();
}

/// How many pixels of a region differ visibly.
int Differences(const QImage& a, const QImage& b)
{
    int count = 0;
    for (int y = 0; y < a.height(); ++y) {
        for (int x = 0; x < a.width(); ++x) {
            const QColor one = a.pixelColor(x, y), other = b.pixelColor(x, y);
            count += std::abs(one.red() - other.red()) + std::abs(one.green() - other.green()) +
                         std::abs(one.blue() - other.blue()) >
                     24;
        }
    }
    return count;
}

TEST_F(NetworkTest, AClickPicksTheNearestPlaceOfABranch)
{
    CNetworkView* view = Open();
    CNetworkMap* map = view->Map();
    int heard = 0;
    QObject::connect(&map->Marks(), &CMapSelection::PickedChanged, [&] { ++heard; });
    const QPoint at = PointOf(map, "MAIN", 6000).toPoint();
    QTest::mouseClick(map, Qt::LeftButton, {}, at + QPoint(-7, 0)); // west of a stretch to the north
    ASSERT_TRUE(map->Marks().Picked());
    EXPECT_EQ(map->Marks().Picked()->branch, "MAIN");
    EXPECT_NEAR(map->Marks().Picked()->chainage, 6000, 10); // within a pixel
    EXPECT_EQ(heard, 1);
    EXPECT_EQ(view->Branches()->currentIndex().row(), 0);
    Click(map, map->WindowPoint({"SIDE", 100}));
    EXPECT_EQ(map->Marks().Picked()->branch, "SIDE");
    EXPECT_EQ(view->Branches()->currentIndex().row(), 1);            // the table follows
    QTest::mouseClick(map, Qt::LeftButton, {}, at + QPoint(-40, 0)); // too far from everything
    EXPECT_FALSE(map->Marks().Picked());
    Click(map, map->WindowPoint({"SIDE", 100}));
    QTest::mousePress(map, Qt::LeftButton, {}, at); // a drag picks nothing
    QTest::mouseMove(map, at + QPoint(30, 0));
    QTest::mouseMove(map, at + QPoint(50, 10));
    QTest::mouseRelease(map, Qt::LeftButton, {}, at + QPoint(50, 10));
    EXPECT_EQ(map->Marks().Picked()->branch, "SIDE");
    EXPECT_NEAR(PointOf(map, "MAIN", 6000).x(), at.x() + 50, 1);
    QTest::keyClick(map, Qt::Key_Escape);
    EXPECT_FALSE(map->Marks().Picked());
}

TEST_F(NetworkTest, KeysAndWheelMoveTheMap)
{
    CNetworkView* view = Open();
    CNetworkMap* map = view->Map();
    const auto at = [&] { return PointOf(map, "MAIN", 4000); };
    const auto length = [&] { return PointOf(map, "MAIN", 1000).x() - at().x(); };
    const QPointF start = at();
    const double fitted = length();
    struct Case
    {
        Qt::Key key;
        QPointF moves;
    };
    for (const Case& each : {Case{Qt::Key_Left, {60, 0}},
                             {Qt::Key_Right, {-60, 0}},
                             {Qt::Key_Up, {0, 60}},
                             {Qt::Key_Down, {0, -60}},
                             {Qt::Key_PageUp, {0, 400}},
                             {Qt::Key_PageDown, {0, -400}}}) {
        const QPointF before = at();
        QTest::keyClick(map, each.key);
        EXPECT_EQ(at() - before, each.moves) << each.key;
    }
    QTest::keyClick(map, Qt::Key_Plus);
    EXPECT_NEAR(length() / fitted, 1.4, 1e-6);
    QTest::keyClick(map, Qt::Key_Minus);
    QTest::keyClick(map, Qt::Key_Minus);
    EXPECT_NEAR(length() * 1.4 / fitted, 1, 1e-6);
    for (int i = 0; i < 40; ++i)
        QTest::keyClick(map, Qt::Key_Minus);
    EXPECT_NEAR(length() * 2 / fitted, 1, 1e-6); // no smaller than half of all
    QTest::keyClick(map, Qt::Key_Home);
    EXPECT_LT((at() - start).manhattanLength(), 1.5);
    QTest::keyClick(map, Qt::Key_Plus, Qt::ControlModifier); // not the map's
    EXPECT_NEAR(length(), fitted, 1e-6);

    QWheelEvent wheel(at(), map->mapToGlobal(at()), {}, QPoint(0, 240), Qt::NoButton, Qt::NoModifier, Qt::NoScrollPhase,
                      false);
    const QPointF under = at();
    QApplication::sendEvent(map, &wheel);
    EXPECT_NEAR(length() / fitted, 1.96, 1e-6);
    EXPECT_LT((at() - under).manhattanLength(), 1.5); // the place under the pointer stays
    frame->resize(1000, 700);                         // only a fitted map follows the window
    EXPECT_NEAR(length() / fitted, 1.96, 1e-6);
}

TEST_F(NetworkTest, TheLegendCoversNoBranchWhenAllIsShown)
{
    CNetworkDoc document;
    CNetworkBranch branch;
    branch.name = "CREEK";
    branch.line = {{0, 0}, {1000, 0}, {1000, 600}, {950, 600}}; // ends in the upper right corner
    branch.end = branch.Length();
    document.AppendBranches({branch}, {}, {});
    CNetworkMap map(document);
    for (const QSize size : {QSize(1200, 500), QSize(420, 700), QSize(800, 600), QSize(260, 200)}) {
        SCOPED_TRACE(size.width());
        map.resize(size);
        map.grab(); // resizes what is not shown
        map.FitAll();
        const QRectF legend = LegendBox(map.fontMetrics(), map.rect(), {});
        const bool small = size.width() < 300; // the legend would leave no room
        for (double chainage = 0; chainage <= branch.end; chainage += 50) {
            const QPointF at = map.WindowPoint({"CREEK", chainage}).value();
            EXPECT_TRUE(QRectF(map.rect()).contains(at)) << chainage;
            EXPECT_FALSE(legend.contains(at) && !small) << chainage;
        }
    }
}

TEST_F(NetworkTest, OnlyLocationsCountAndPlacesAreSaidWithTheirUnit)
{
    CNetworkView* view = Open();
    ASSERT_TRUE(QTest::qWaitFor([&] { return view->Map()->Marks().Placed().size() == 2; }));
    EXPECT_EQ(view->Map()->Marks().Locations().size(), 4u)
        << "two of them are not in this network; blank lines are nowhere";
    EXPECT_EQ(PlaceText({"MAIN", 1234.56}), "MAIN 1234.6 m");
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    EXPECT_EQ(PlaceText({"MAIN", 304.8}), "MAIN 1000.0 ft");
}

TEST_F(NetworkTest, WithoutAMousePlacesAndLocationsAreReached)
{
    CNetworkView* view = Open();
    CNetworkMap* map = view->Map();
    ASSERT_TRUE(QTest::qWaitFor([&] { return map->Marks().Placed().size() == 2; }));
    QTest::keyClick(map, Qt::Key_Space);
    ASSERT_TRUE(map->Marks().Picked());
    EXPECT_EQ(map->Marks().Picked()->branch, "MAIN");
    const auto step = [&](Qt::Key key) {
        QTest::keyClick(map, key);
        return map->Marks().Selected() ? map->Marks().Selected()->chainage : -1;
    };
    EXPECT_EQ(step(Qt::Key_N), 2000);
    EXPECT_EQ(step(Qt::Key_N), 5000);
    EXPECT_EQ(step(Qt::Key_N), 2000); // around
    EXPECT_EQ(step(Qt::Key_P), 5000);
    QTest::keyClick(map, Qt::Key_Space);
    EXPECT_EQ(map->Marks().Selected(), nullptr);
    EXPECT_EQ(step(Qt::Key_P), 5000) << "from the end";
    QTest::keyClick(map, Qt::Key_Space);
    map->Marks().SetLocations({});
    QTest::keyClick(map, Qt::Key_N);
    EXPECT_EQ(map->Marks().Selected(), nullptr);
}

TEST_F(NetworkTest, AMovedMapLooksLikeOneThatIsPaintedAnew)
{
    hdLocations.clear();
    for (int i = 0; i < 70; ++i)
        hdLocations.push_back({"MAIN", 1000.0 + 100 * i, i % HDDataTypeCount, {}});
    CNetworkView* view = Open();
    CNetworkMap* map = view->Map();
    ASSERT_TRUE(QTest::qWaitFor([&] { return map->Marks().Placed().size() == 70; }));
    map->Zoom(2.3);
    for (const QPoint& way : {QPoint(60, 0), QPoint(-130, 45), QPoint(0, -200), QPoint(7, 3), QPoint(5000, 0)}) {
        map->Pan(way);
        const QImage moved = Picture(map);
        QEvent anew(QEvent::FontChange); // everything is computed again
        QApplication::sendEvent(map, &anew);
        EXPECT_EQ(Differences(moved, Picture(map)), 0) << way.x() << ' ' << way.y();
    }
    QTest::keyClick(map, Qt::Key_Home);
    const QImage light = Picture(map);
    QPalette dark;
    dark.setColor(QPalette::Base, QColor(20, 24, 28));
    dark.setColor(QPalette::Text, Qt::white);
    map->setPalette(dark);
    EXPECT_GT(Differences(light, Picture(map)), map->width() * map->height() / 2);
}

TEST_F(NetworkTest, EveryKindHasAColourAndAShapeOfItsOwn)
{
    const QImage reference = LocationKindSymbol(0, 33, Qt::black).toImage();
    for (int a = 0; a < HDDataTypeCount; ++a) {
        EXPECT_FALSE(LocationKindName(a).isEmpty());
        for (int b = 0; b < a; ++b) {
            const auto colour = [](int kind) {
                return LocationKindSymbol(kind, 33, Qt::black).toImage().pixel(16, 16);
            };
            EXPECT_NE(colour(a), colour(b));
            const QImage one = LocationKindSymbol(a, 33, Qt::black).toImage().convertToFormat(QImage::Format_Alpha8);
            const QImage other = LocationKindSymbol(b, 33, Qt::black).toImage().convertToFormat(QImage::Format_Alpha8);
            int outside = 0; // pixels that only one of them covers
            for (int y = 0; y < one.height(); ++y) {
                for (int x = 0; x < one.width(); ++x)
                    outside += std::abs(qAlpha(one.pixel(x, y)) - qAlpha(other.pixel(x, y))) > 128;
            }
            EXPECT_GT(outside, 40) << a << ' ' << b;
        }
    }
}

TEST_F(NetworkTest, AnEmptyNetworkAndOneWithoutExtentCanBeShown)
{
    for (const char* branches :
         {"", "[Branch]\nName = \"A\"\nChainage = 0, 1\n[/Branch]\n",
          "[Branch]\nName = \"A\"\nChainage = 0, 1\n[Line]\nVertex = 5, 5\n[/Line]\n[/Branch]\n"}) {
        CNetworkView* view = Open(QByteArray("[KVR_NETWORK]\nx = 1\n") + branches + "[/KVR_NETWORK]\n");
        ASSERT_NE(view, nullptr);
        for (const Qt::Key key : {Qt::Key_Plus, Qt::Key_Home, Qt::Key_Space, Qt::Key_N, Qt::Key_Minus, Qt::Key_Left})
            QTest::keyClick(view->Map(), key);
        QTest::mouseClick(view->Map(), Qt::LeftButton, {}, view->Map()->rect().center());
        EXPECT_FALSE(Picture(view->Map()).isNull());
        EXPECT_FALSE(view->Map()->Marks().Picked());
    }
}

} // namespace
