#include "page_fixture.h"
#include "pages/page_table.h"

#include "grid/name_offers.h"

class GridEditTest : public PageTest
{
protected:
    GridEditTest()
    {
        Add("A", 1, 10, 20);
        Add("B", 2, 11, 21);
        Open(MakeInitPage);
        grid->setFocus();
    }
    void Click(int row, int column)
    {
        QTest::mouseClick(grid->viewport(), Qt::LeftButton, {},
                          grid->visualRect(grid->model()->index(row - 1, column - 1)).center());
    }
};

TEST_F(GridEditTest, AMoveStoresTheLine)
{
    Type(1, 1, "neckar");
    EXPECT_EQ(init.GetAt(0).RiverName, "A");
    QTest::keyClick(Editor(), Qt::Key_Tab);
    EXPECT_EQ(init.GetAt(0).RiverName, "NECKAR");
    EXPECT_EQ(view->edited, 1);
    EXPECT_TRUE(document.IsModified());
    Enter(1, 3, "4.25");
    EXPECT_EQ(view->edited, 2);
    grid->SetCurrentCell(2, 2); // a move without an edit says nothing
    EXPECT_EQ(view->edited, 2);
    EXPECT_EQ(Stored(), "NECKAR 1 4.25 20, B 2 11 21");
}

TEST_F(GridEditTest, TheCurrentCellGoesWithItsLine)
{
    Add("C", 3, 12, 22);
    view->page->LoadFromDocument(&document);
    grid->SetCurrentCell(2, 3);
    init.RemoveAt(0); // a save that drops lines does so, and other editors
    view->page->LoadFromDocument(&document);
    EXPECT_EQ(grid->TextAt(grid->CurrentRow(), 1), "B");
    EXPECT_EQ(grid->CurrentColumn(), 3);
    init.RemoveAt(0);
    view->page->LoadFromDocument(&document);
    for (const auto key : {Qt::Key_7, Qt::Key_Tab, Qt::Key_8, Qt::Key_Return, Qt::Key_9, Qt::Key_Backtab})
        QTest::keyClick(grid, key);
    EXPECT_EQ(Stored(), "C 3 12 22") << "typed on where no line is";
    Click(1, 3);
    EXPECT_EQ(grid->CurrentRow(), 1);
}

TEST_F(GridEditTest, AWheelOverACellTakesNoEntry)
{
    view->branches = {"NECKAR", "MAIN"};
    grid->SetBranchNameColumn(1);
    Type(1, 1, "brook");
    QWheelEvent turn(QPointF(5, 5), Editor()->mapToGlobal(QPointF(5, 5)), {}, {0, -120}, Qt::NoButton, {},
                     Qt::NoScrollPhase, false);
    QApplication::sendEvent(Editor(), &turn);
    QTest::keyClick(Editor(), Qt::Key_Tab);
    EXPECT_EQ(init.GetAt(0).RiverName, "BROOK");
}

TEST_F(GridEditTest, TheSameNumberSpeltAnewIsNoStep)
{
    Enter(1, 3, "10.0");
    EXPECT_EQ(document.UndoStack().count(), 0);
    EXPECT_FALSE(document.IsModified());
}

TEST_F(GridEditTest, EditingStartsWithTheWholeNumber)
{
    init.GetAt(0).InitialH = 1.23456789;
    view->page->LoadFromDocument(&document);
    EXPECT_EQ(grid->TextAt(1, 3), "1.235");
    grid->SetCurrentCell(1, 3);
    QTest::keyClick(grid, Qt::Key_F2);
    EXPECT_EQ(static_cast<QLineEdit*>(Editor())->text(), "1.23456789");
    QTest::keyClick(Editor(), Qt::Key_End);
    QTest::keyClicks(Editor(), "1");
    QTest::keyClick(Editor(), Qt::Key_Escape);
    EXPECT_EQ(init.GetAt(0).InitialH, 1.23456789);
    EXPECT_FALSE(document.IsModified());
}

TEST_F(GridEditTest, ANumberThatIsNoneKeepsTheCell)
{
    const auto stays = [&](const char* what) {
        QTest::qWait(1); // where nobody was asked, the message waits for the focus to arrive
        EXPECT_EQ(boxes, QStringList{"Floating point number required"}) << what;
        boxes.clear();
        ASSERT_TRUE(Editor()) << what;
        EXPECT_EQ(static_cast<QLineEdit*>(Editor())->text(), "1.x") << what;
        EXPECT_EQ(Current(), std::pair(1, 3)) << what;
        QTest::qWait(1); // the next event
    };
    Type(1, 3, "1.x");
    for (const auto key : {Qt::Key_Tab, Qt::Key_Return, Qt::Key_F7, Qt::Key_Insert}) {
        QTest::keyClick(Editor(), key);
        stays("key");
    }
    Click(2, 1);
    stays("another cell");
    QTest::mouseClick(grid->verticalHeader()->viewport(), Qt::LeftButton, {}, {5, 30});
    stays("a row header");
    view->other->setFocus(Qt::MouseFocusReason);
    stays("another field");
    EXPECT_TRUE(Editor()->hasFocus());
    document.UpdateAllViews(nullptr, CKsDoc::StoreHint);
    stays("storing");
    document.UpdateAllViews(nullptr, CKsDoc::ReloadHint);
    EXPECT_TRUE(Editor()) << "a reload keeps the text";
    EXPECT_FALSE(view->page->OnKillActive());
    stays("leaving the page");
    QTest::keyClick(Editor(), Qt::Key_Escape);
    EXPECT_FALSE(Editor());
    EXPECT_EQ(Stored(), "A 1 10 20, B 2 11 21");
    Enter(1, 3, "1e999");
    EXPECT_EQ(boxes, QStringList{"Floating point number required"}) << "no double holds it";
}

TEST_F(GridEditTest, LeavingTheGridTakesTheText)
{
    Type(1, 3, "3");
    view->other->setFocus(Qt::MouseFocusReason);
    EXPECT_FALSE(Editor());
    EXPECT_EQ(init.GetAt(0).InitialH, 3);
    Type(1, 4, "4");
    document.UpdateAllViews(nullptr, CKsDoc::StoreHint); // a save
    EXPECT_EQ(init.GetAt(0).InitialQ, 4);
}

TEST_F(GridEditTest, BlankCells)
{
    globals.G_waterlevel = 7;
    Enter(1, 3, "");
    EXPECT_EQ(init.GetAt(0).InitialH, 0) << "stored by a move: zero";
    Enter(1, 2, "");
    EXPECT_EQ(init.GetAt(0).Chainage, NotGiven);
    EXPECT_EQ(grid->TextAt(1, 2), "");
    Type(2, 3, "");
    EXPECT_TRUE(view->page->OnKillActive());
    EXPECT_EQ(init.GetAt(1).InitialH, 7) << "left with the page: the global value";
    init.GetAt(1).InitialH = 1;
    Type(2, 3, "");
    view->other->setFocus(Qt::MouseFocusReason); // where a click goes before the page is asked
    EXPECT_EQ(init.GetAt(1).InitialH, 7) << "likewise with the table";
    EXPECT_EQ(Stored(), "A 10000000000 0 20, B 2 7 21");
}

TEST_F(GridEditTest, BranchNamesToChooseFrom)
{
    view->branches = {"MAIN", "SIDE"};
    grid->SetBranchNameColumn(1);
    grid->SetCurrentCell(1, 1);
    QTest::keyClick(grid, Qt::Key_F2);
    auto* list = qobject_cast<QComboBox*>(Editor());
    ASSERT_TRUE(list);
    EXPECT_EQ(list->count(), 2);
    EXPECT_EQ(list->currentText(), "A");
    list->setCurrentIndex(1);
    QTest::keyClick(Editor(), Qt::Key_Tab);
    Enter(2, 1, "new");
    EXPECT_EQ(Stored(), "SIDE 1 10 20, NEW 2 11 21");
    // What is typed is stored, be it the start of a name that is offered.
    view->branches = {"MOORBECK", "RIVER1", "RIVER10"};
    Enter(1, 1, "moor");
    Enter(2, 1, "river1");
    EXPECT_EQ(Stored(), "MOOR 1 10 20, RIVER1 2 11 21");
    Type(1, 1, "moo");
    QTest::keyClick(Editor(), Qt::Key_Down); // taken on purpose
    QTest::keyClick(Editor(), Qt::Key_Return);
    EXPECT_EQ(init.GetAt(0).RiverName, "MOORBECK");
    Type(2, 1, "river1");
    auto* offers = view->findChildren<CNameOffers*>().last(); // those of closed editors may still be there
    ASSERT_TRUE(offers->isVisible());
    QTest::mouseClick(offers->viewport(), Qt::LeftButton, {}, offers->visualItemRect(offers->item(0)).center());
    ASSERT_TRUE(Editor());
    EXPECT_TRUE(Editor()->hasFocus());
    EXPECT_FALSE(offers->isVisible());
    QTest::keyClick(Editor(), Qt::Key_Return);
    EXPECT_EQ(init.GetAt(1).RiverName, "RIVER10");
    view->branches.clear();
    Enter(1, 1, "x");
    EXPECT_EQ(init.GetAt(0).RiverName, "X") << "no network: plain text";
}

TEST_F(GridEditTest, WhatNobodySeesIsNoPartOfABranchName)
{
    for (const bool chosen : {false, true}) { // from a list, or not
        view->branches = chosen ? QStringList("MAIN") : QStringList();
        grid->SetBranchNameColumn(1);
        Type(1, 1, "");
        QGuiApplication::clipboard()->setText(QStringLiteral(" \u202Ainn 2\u202C \r\n"));
        auto* list = qobject_cast<QComboBox*>(Editor());
        (list ? list->lineEdit() : qobject_cast<QLineEdit*>(Editor()))->paste();
        QTest::keyClick(Editor(), Qt::Key_Return);
        EXPECT_EQ(init.GetAt(0).RiverName, "INN 2");
        Enter(1, 1, "other");
    }
}

TEST_F(GridEditTest, UnitsSwitchedWhileTyping)
{
    Type(1, 3, "10");
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    EXPECT_EQ(KsUnits::Instance().System(), KsUnitSystem::UsCustomary);
    EXPECT_EQ(init.GetAt(0).InitialH, 10) << "meant in the unit it was typed in";
    EXPECT_FALSE(document.IsModified()) << "and that is what was stored";
    Type(1, 3, "10");
    KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
    EXPECT_NEAR(init.GetAt(0).InitialH, 3.048, 1e-5);
}

TEST_F(GridEditTest, AnOpenEditorGoesWithItsWindow)
{
    Type(1, 1, "half typed");
    view.reset();
    EXPECT_EQ(init.GetAt(0).RiverName, "A");
    EXPECT_FALSE(document.IsModified());
}

TEST_F(GridEditTest, KeysBetweenTwoClicksDoNotMoveTheSecondOne)
{
    const QPoint first = grid->visualRect(grid->model()->index(0, 2)).center();
    QTest::mouseClick(grid->viewport(), Qt::LeftButton, {}, first);
    QTest::keyClick(grid, '3');
    QTest::keyClick(Editor(), Qt::Key_Return);
    ASSERT_EQ(Current(), std::pair(1, 4));
    QMouseEvent second(QEvent::MouseButtonDblClick, first, grid->viewport()->mapToGlobal(first), Qt::LeftButton,
                       Qt::LeftButton, {});
    QApplication::sendEvent(grid->viewport(), &second);
    ASSERT_TRUE(Editor());
    EXPECT_EQ(Current(), std::pair(1, 3));
    QTest::keyClick(Editor(), Qt::Key_Tab);
    EXPECT_EQ(Current(), std::pair(1, 4));
}
