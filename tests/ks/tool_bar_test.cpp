#include "ks_fixture.h"

#include <QAction>
#include <QMenu>
#include <QMenuBar>

TEST_F(KsTest, ABarNeedsAFrameAndButtons)
{
    CKsToolBarEx bar;
    const std::vector<CKsToolBarButton> buttons{{7, "", "Status\nTip"}};
    EXPECT_FALSE(bar.Create(nullptr, 0, 1));
    EXPECT_FALSE(bar.LoadToolBar(buttons));
    EXPECT_TRUE(bar.Create(&frame, 2, 1));
    EXPECT_FALSE(bar.LoadToolBar({}));
    EXPECT_TRUE(bar.LoadToolBar(buttons));
    bar.EnableDocking(CBRS_ALIGN_TOP | CBRS_ALIGN_LEFT);
    EXPECT_EQ(bar.allowedAreas(), Qt::TopToolBarArea | Qt::LeftToolBarArea);
    EXPECT_EQ(frame.toolBarArea(&bar), Qt::TopToolBarArea);
    EXPECT_EQ(bar.GetBarStyle(), 2u);
}

TEST_F(KsTest, ButtonsSendTheirCommandToTheActiveViewThatCanDoIt)
{
    CKsToolBarEx bar;
    ASSERT_TRUE(bar.Create(&frame, 0, 1));
    ASSERT_TRUE(bar.LoadToolBar({{7, "", "Looks for it\nSearch"}, {0, "", ""}, {8, "", "\nAgain"}}));
    QAction *search = bar.actions()[0], *again = bar.actions()[2];
    EXPECT_EQ(search->text(), "Search");
    EXPECT_EQ(search->statusTip(), "Looks for it");
    EXPECT_FALSE(search->isEnabled()) << "no view";

    LogView* view = ViewOf(Open({}));
    view->enabledCommand = 7;
    emit frame.CommandStateChanged();
    EXPECT_TRUE(search->isEnabled());
    EXPECT_FALSE(again->isEnabled());
    LogView::log.clear();
    search->trigger();
    EXPECT_EQ(LogView::log, QStringList({"a leaves field", "a command 7"}));
    EXPECT_FALSE(frame.SendCommand(8));
}

TEST_F(KsTest, MenusAreEnabledByPosition)
{
    frame.menuBar()->addMenu("one");
    QMenu* second = frame.menuBar()->addMenu("two");
    frame.EnableMenuItem(1, false);
    EXPECT_FALSE(second->menuAction()->isEnabled());
    frame.EnableMenuItem(1, true);
    EXPECT_TRUE(second->menuAction()->isEnabled());
    frame.EnableMenuItem(5, false); // nothing there, nothing happens
}
