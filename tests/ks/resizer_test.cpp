#include "ks/fc/wnd_resizer.h"

#include <QGridLayout>
#include <QGroupBox>
#include <QPushButton>
#include <QTest>
#include <QVBoxLayout>
#include <gtest/gtest.h>

TEST(Resizer, AControlAnchoredOnAllSidesTakesTheExtraSpaceHoweverDeepItStands)
{
    QWidget page;
    auto* outer = new QVBoxLayout(&page);
    auto* fields = new QWidget;
    auto* box = new QGroupBox;
    outer->addWidget(fields);
    outer->addWidget(box);
    auto* inside = new QVBoxLayout(box);
    auto* row = new QHBoxLayout;
    QWidget *grid = new QWidget, *button = new QPushButton("x");
    row->addWidget(grid);
    row->addWidget(button);
    inside->addLayout(row);
    inside->addWidget(new QWidget);

    const CWndResizer resizer(&page);
    EXPECT_TRUE(resizer.SetAnchor(box, CWndResizer::All));
    EXPECT_TRUE(resizer.SetAnchor(grid, CWndResizer::All));
    EXPECT_TRUE(resizer.SetAnchor(button, CWndResizer::Right | CWndResizer::Bottom));
    page.resize(300, 200);
    page.show();
    const QSize before = grid->size(), buttonBefore = button->size();
    page.resize(500, 450);
    QTest::qWait(1);
    EXPECT_EQ(grid->width() - before.width(), 200);
    EXPECT_EQ(grid->height() - before.height(), 250);
    EXPECT_EQ(button->size(), buttonBefore);
    EXPECT_EQ(button->geometry().bottom(), grid->geometry().bottom());
}

TEST(Resizer, CellsOfAGridLayoutStretchOnlyWhereAnchored)
{
    QWidget page;
    auto* layout = new QGridLayout(&page);
    auto *wide = new QWidget, *high = new QWidget;
    layout->addWidget(wide, 0, 1);
    layout->addWidget(high, 1, 0);
    const CWndResizer resizer(&page);
    EXPECT_TRUE(resizer.SetAnchor(wide, CWndResizer::Left | CWndResizer::Right | CWndResizer::Top));
    EXPECT_TRUE(resizer.SetAnchor(high, CWndResizer::Left | CWndResizer::Top | CWndResizer::Bottom));
    EXPECT_EQ(layout->columnStretch(1), 1);
    EXPECT_EQ(layout->rowStretch(0), 0);
    EXPECT_EQ(layout->rowStretch(1), 1);
    EXPECT_EQ(layout->columnStretch(0), 0);
}
