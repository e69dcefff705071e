// The plot as its user meets it: mouse and keys on the window that the library makes.
#include "plot/plot_library.h"

#include <QApplication>
#include <QImage>
#include <QTemporaryDir>
#include <QTest>
#include <QWheelEvent>
#include <gtest/gtest.h>

namespace {

class PlotWindowTest : public testing::Test
{
protected:
    void SetUp() override
    {
        QString reason;
        const PlotLibrary* library = LoadPlotLibrary(reason);
        if (!library)
            GTEST_SKIP() << reason.toStdString(); // the product can be built without it
        plot = library->make(&window, {.picked = [this](const PlotPoint& point) { picked.push_back(point); },
                                       .moved =
                                           [this](const PlotPoint& point, double x, double y) {
                                               picked.push_back(point);
                                               moved = {x, y};
                                           },
                                       .added =
                                           [this](int, double x, double y) {
                                               added = {x, y};
                                           },
                                       .removed = [this](const PlotPoint& point) { removed.push_back(point); }});
        window.resize(800, 400);
        plot->Widget().resize(800, 400);
        window.show();
        plot->Show({QStringLiteral("Chainage [m]"),
                    {{QStringLiteral("Level [m]"),
                      {{.name = QStringLiteral("Bed"),
                        .ink = PlotInk::Ground,
                        .hasPoints = true,
                        .x = {0, 1000},
                        .y = {0, 10}},
                       {.name = QStringLiteral("Water"),
                        .hasPoints = true,
                        .isMovable = true,
                        .x = {0, 500, 1000},
                        .y = {2, 7, 12}}},
                      {},
                      1}}},
                   true);
    }
    QWidget& Window() const { return plot->Widget(); }
    /// Where the marked point stands on the window: the middle of what is painted in the color of marks.
    QPoint Marked() const
    {
        const QImage image = Window().grab().toImage();
        QRect ring;
        for (int y = 0; y < image.height(); ++y) {
            int first = -1, last = -1;
            for (int x = 0; x < image.width(); ++x)
                if (const QColor color = image.pixelColor(x, y);
                    color.red() > 180 && color.green() < 60 && color.blue() < 90) {
                    first = first < 0 ? x : first;
                    last = x;
                }
            if (last - first >= 7)
                ring |= QRect(QPoint(first, y), QPoint(last, y));
        }
        return ring.center();
    }
    void Drag(const QPoint& from, const QPoint& to, Qt::MouseButton button = Qt::LeftButton,
              Qt::KeyboardModifiers held = {})
    {
        QTest::mousePress(&Window(), button, held, from);
        for (int step = 1; step <= 4; ++step) {
            QMouseEvent move(QEvent::MouseMove, from + (to - from) * step / 4, Window().mapToGlobal(to), Qt::NoButton,
                             button, held);
            QApplication::sendEvent(&Window(), &move);
        }
        QTest::mouseRelease(&Window(), button, held, to);
    }

    QWidget window;
    std::unique_ptr<IPlot> plot;
    std::vector<PlotPoint> picked, removed;
    QPointF moved, added;
};

TEST_F(PlotWindowTest, PointsArePickedMovedAddedAndRemoved)
{
    const PlotPoint middle{0, 1, 1};
    plot->Mark(500, {middle});
    const QPoint at = Marked();
    ASSERT_TRUE(Window().rect().contains(at));
    QTest::mouseClick(&Window(), Qt::LeftButton, {}, at + QPoint(2, -2));
    EXPECT_EQ(picked, std::vector{middle}) << "near enough";
    Drag(at, at - QPoint(30, 40));
    EXPECT_EQ(moved.x(), 500) << "up and down only";
    EXPECT_GT(moved.y(), 7);
    EXPECT_EQ(moved.y(), std::round(moved.y() * 100) / 100) << "no digits that no mouse can mean";
    Drag(at, at + QPoint(60, 40), Qt::LeftButton, Qt::ControlModifier);
    EXPECT_GT(moved.x(), 500);
    EXPECT_EQ(moved.y(), 7) << "with Ctrl along the axis only";
    Drag(at, at - QPoint(0, 40), Qt::LeftButton, Qt::ShiftModifier);
    EXPECT_EQ(moved.y(), std::round(moved.y())) << "with Shift in whole steps";

    picked.clear();
    moved = {};
    QTest::mousePress(&Window(), Qt::LeftButton, {}, at);
    QMouseEvent move(QEvent::MouseMove, at - QPoint(0, 50), Window().mapToGlobal(at), Qt::NoButton, Qt::LeftButton, {});
    QApplication::sendEvent(&Window(), &move);
    QTest::keyClick(&Window(), Qt::Key_Escape);
    QTest::mouseRelease(&Window(), Qt::LeftButton, {}, at - QPoint(0, 50));
    EXPECT_TRUE(picked.empty()) << "Escape gives the drag up";

    QTest::mouseDClick(&Window(), Qt::LeftButton, {}, at + QPoint(60, 60));
    EXPECT_GT(added.x(), 500);
    EXPECT_LT(added.y(), 7);
    QTest::keyClick(&Window(), Qt::Key_Delete);
    EXPECT_EQ(removed, std::vector{middle});
    QTest::keyClick(&Window(), Qt::Key_Right);
    EXPECT_EQ(picked, (std::vector{PlotPoint{0, 1, 2}}));
    QTest::keyClick(&Window(), Qt::Key_Right);
    EXPECT_EQ(picked.size(), 1u) << "there is no further one";
}

TEST_F(PlotWindowTest, WhatIsInSightMovesAndZooms)
{
    const auto all = plot->Range();
    EXPECT_LT(all.first, 0);
    EXPECT_GT(all.second, 1000);
    Drag({400, 300}, {300, 300});
    EXPECT_NEAR(plot->Range().second - plot->Range().first, all.second - all.first, 1e-6);
    EXPECT_GT(plot->Range().first, all.first) << "the branch follows the hand";
    QTest::keyClick(&Window(), Qt::Key_Home);
    EXPECT_EQ(plot->Range(), all);

    QWheelEvent wheel({400, 200}, Window().mapToGlobal(QPointF(400, 200)), {}, {0, 120}, Qt::NoButton, {},
                      Qt::NoScrollPhase, false);
    QApplication::sendEvent(&Window(), &wheel);
    EXPECT_LT(plot->Range().second - plot->Range().first, all.second - all.first);
    QTest::keyClick(&Window(), Qt::Key_Home);
    Drag({200, 100}, {600, 300}, Qt::RightButton);
    const auto boxed = plot->Range();
    EXPECT_LT(boxed.second - boxed.first, (all.second - all.first) * 0.6);
    for (int i = 0; i < 300; ++i)
        plot->Zoom(2);
    EXPECT_GT(plot->Range().second, plot->Range().first) << "numbers on the axis still differ";
    for (int i = 0; i < 300; ++i)
        plot->Zoom(0.5);
    EXPECT_LT(plot->Range().second - plot->Range().first, 5 * (all.second - all.first)) << "it is still seen";
    plot->SetRange(0, 100);
    plot->Mark(1000, {{0, 1, 2}});
    EXPECT_GE(plot->Range().second, 1000) << "what is marked comes into sight";
}

TEST_F(PlotWindowTest, PicturesAreWrittenAndWhatCannotBeWrittenLosesNothing)
{
    const QTemporaryDir folder;
    const auto begin = [&](const QString& name) {
        EXPECT_EQ(plot->Write(folder.filePath(name), 640, 360).toStdString(), "");
        QFile file(folder.filePath(name));
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        return file.readAll();
    };
    const QByteArray svg = begin(QStringLiteral("a.svg")), pdf = begin(QStringLiteral("a.pdf")),
                     png = begin(QStringLiteral("a.png"));
    EXPECT_TRUE(svg.contains("<svg") && svg.contains("Level"));
    EXPECT_TRUE(pdf.startsWith("%PDF"));
    const QImage picture = QImage::fromData(png);
    EXPECT_EQ(picture.size(), QSize(640, 360));
    EXPECT_EQ(picture.pixelColor(1, 1), QColor(Qt::white)) << "on paper whatever the window looks like";
    EXPECT_NE(plot->Write(folder.filePath(QStringLiteral("missing/a.png")), 640, 360), QString());
    EXPECT_EQ(plot->Range().second > 1000, true) << "the window shows what it showed";
}

} // namespace
