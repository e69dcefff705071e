// The plot: what is painted where, and that it follows.
#include "cross_sections_fixture.h"

#include <QImage>

namespace {

/// The colour at a place of the section, between the grid lines' and points' own.
QColor ColourAt(CSectionPlot* plot, double offset, double level)
{
    return plot->grab().toImage().pixelColor(plot->WindowPoint({offset, level}).toPoint());
}

/// Grid lines shade what they cross.
bool IsLike(const QColor& a, const QColor& b)
{
    return std::abs(a.red() - b.red()) < 26 && std::abs(a.green() - b.green()) < 26 &&
           std::abs(a.blue() - b.blue()) < 26;
}

/// A line goes through a place, or by it at less than a pixel.
bool IsLineAt(CSectionPlot* plot, double offset, double level, const QColor& colour)
{
    const QImage image = plot->grab().toImage();
    const QPoint at = plot->WindowPoint({offset, level}).toPoint();
    for (int up = -1; up <= 1; ++up)
        if (IsLike(image.pixelColor(at.x(), at.y() + up), colour))
            return true;
    return false;
}

bool Has(const QImage& image, const QColor& colour)
{
    for (int y = 0; y < image.height(); ++y)
        for (int x = 0; x < image.width(); ++x)
            if (image.pixelColor(x, y) == colour)
                return true;
    return false;
}

TEST_F(CrossSectionTest, ThePlotShowsGroundWaterAndPaperInBothPalettes)
{
    CCrossSectionView* view = Open();
    Select(view->Sections(), Main2500);
    CSectionPlot* plot = view->Plot();
    EXPECT_GT(plot->width(), 300);
    EXPECT_EQ(plot->Title(), "MAIN  2500.5 m");
    for (const QColor& base : {QColor(Qt::white), QColor(30, 33, 36)}) {
        QPalette palette = plot->palette();
        palette.setColor(QPalette::Base, base);
        palette.setColor(QPalette::Text, base.lightness() < 128 ? Qt::white : Qt::black);
        plot->setPalette(palette);
        const CPlotStyle style(palette);
        EXPECT_TRUE(IsLike(ColourAt(plot, 3.3, 103.3), style.soil));
        EXPECT_TRUE(IsLike(ColourAt(plot, 14.3, 99.3), style.soil));
        EXPECT_TRUE(IsLike(ColourAt(plot, 14.3, 102.3), style.water)) << "the surface is at 105, 20 m wide";
        EXPECT_TRUE(IsLike(ColourAt(plot, 14.3, 109.3), style.paper));
        EXPECT_TRUE(IsLineAt(plot, 14.3, 105, style.surface));
        EXPECT_TRUE(IsLineAt(plot, 13.3, 100, style.ground));
        EXPECT_FALSE(IsLike(style.water, style.paper));
        EXPECT_FALSE(IsLike(style.water, style.soil));
    }
}

TEST_F(CrossSectionTest, ThePlotFollowsEditsSelectionAndUnits)
{
    CCrossSectionView* view = Open();
    Select(view->Sections(), Main2500);
    CSectionPlot* plot = view->Plot();
    const CPlotStyle style(plot->palette());
    EXPECT_TRUE(Edit(view->Sections(), Main2500, SectionWidth, "28"));
    ASSERT_TRUE(plot->Water().has_value());
    EXPECT_NEAR(plot->Water()->level, 109, 1e-6);
    EXPECT_TRUE(IsLike(ColourAt(plot, 14.3, 108.3), style.water));
    EXPECT_TRUE(Edit(view->Sections(), Main2500, SectionWidth, "31"));
    EXPECT_FALSE(plot->Water().has_value()) << "wider than the section";
    EXPECT_FALSE(Has(plot->grab().toImage(), style.water));
    EXPECT_TRUE(Edit(view->Points(), 1, PointLevel, "109"));
    EXPECT_TRUE(IsLike(ColourAt(plot, 9.3, 104.3), style.soil)) << "there was nothing before";
    view->Document()->UndoStack().undo();
    EXPECT_TRUE(IsLike(ColourAt(plot, 9.3, 104.3), style.paper));

    const QImage metric = plot->grab().toImage();
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    EXPECT_EQ(plot->Title(), "MAIN  8203.74 ft");
    EXPECT_NE(plot->grab().toImage(), metric);
    Select(view->Sections(), Side300); // no points: a hint, no ground
    EXPECT_FALSE(Has(plot->grab().toImage(), style.soil));
    EXPECT_EQ(plot->accessibleDescription(), "SIDE  984.252 ft, points: 0");
    Select(view->Sections(), Main1000); // level ground
    EXPECT_TRUE(Has(plot->grab().toImage(), style.soil));
}

TEST_F(CrossSectionTest, PointsAndSectionsArePickedByMouseAndKeys)
{
    CCrossSectionView* view = Open();
    Select(view->Sections(), Main2500);
    CSectionPlot* plot = view->Plot();
    const CPlotStyle style(plot->palette());
    EXPECT_FALSE(Has(plot->grab().toImage(), style.mark));
    QTest::mouseClick(plot, Qt::LeftButton, {}, plot->WindowPoint({20, 100}).toPoint() + QPoint(3, -2));
    EXPECT_EQ(view->Points()->currentIndex().row(), 2);
    EXPECT_TRUE(Has(plot->grab().toImage(), style.mark));
    QTest::mouseClick(plot, Qt::LeftButton, {}, plot->WindowPoint({15, 108}).toPoint()); // nothing near
    EXPECT_EQ(view->Points()->currentIndex().row(), 2);
    plot->setFocus();
    struct Case
    {
        Qt::Key key;
        int section, point;
    };
    const Case cases[] = {{Qt::Key_Left, Main2500, 1},  {Qt::Key_Right, Main2500, 2},   {Qt::Key_Right, Main2500, 3},
                          {Qt::Key_Right, Main2500, 3}, {Qt::Key_PageUp, Main1000, -1}, {Qt::Key_Left, Main1000, 0},
                          {Qt::Key_Up, Main1000, 0},    {Qt::Key_Down, Main2500, -1}};
    for (const Case& each : cases) {
        QTest::keyClick(plot, each.key);
        EXPECT_EQ(view->CurrentSection(), each.section) << each.key;
        EXPECT_EQ(view->Points()->currentIndex().row(), each.point) << each.key;
    }
}

TEST(PlotAxis, HasTicksAtRoundNumbersOfTheUsersUnit)
{
    struct Case
    {
        double from, to;
        int most;
        QStringList labels;
    };
    const Case cases[] = {{0, 100, 5, {"0", "50", "100"}},
                          {0, 90, 5, {"0", "20", "40", "60", "80"}},
                          {-1, 1, 4, {"-1", "0", "1"}},
                          {52.1, 52.5, 4, {"52.2", "52.4"}},
                          {7, 7, 3, {"6", "7", "8"}}};
    for (const Case& each : cases) {
        const CPlotAxis axis = CPlotAxis::Around(UnitGroup::WaterLevel, each.from, each.to, each.most);
        EXPECT_EQ(axis.labels, each.labels)
            << each.labels.join(' ').toStdString() << "; found " << axis.labels.join(' ').toStdString();
        EXPECT_LE(axis.low, each.from);
        EXPECT_GE(axis.high, each.to);
    }
    for (const double extreme : {1e300, 1e17, 1e-300, 0.0}) { // whatever a file says
        const CPlotAxis axis = CPlotAxis::Around(UnitGroup::Width, -extreme, extreme, 8);
        EXPECT_TRUE(std::isfinite(axis.Part(0)));
        EXPECT_LE(axis.ticks.size(), 10u);
        EXPECT_EQ(axis.ticks.size(), std::size_t(axis.labels.size()));
    }
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    const CPlotAxis feet = CPlotAxis::Around(UnitGroup::Width, 0, 30.48, 5);
    EXPECT_EQ(feet.labels, QStringList({"0", "50", "100"}));
    EXPECT_NEAR(feet.ticks[2], 30.48, 1e-9);
    KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
}

} // namespace
