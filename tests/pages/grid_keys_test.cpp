#include "page_fixture.h"
#include "pages/page_table.h"

#include "grid/grid_keys.h"

#include <QClipboard>
#include <QHeaderView>
#include <QKeyEvent>
#include <QSignalSpy>

class GridKeyTest : public PageTest
{
protected:
    GridKeyTest()
    {
        Add("A", 1, 10, 20);
        Add("B", 2, 11, 21);
        Open(MakeInitPage);
        grid->setFocus();
    }
    void Press(Qt::Key key, Qt::KeyboardModifiers held = {}) { QTest::keyClick(grid, key, held); }
    std::pair<int, int> From(int row, int column, Qt::Key key, Qt::KeyboardModifiers held = {})
    {
        grid->SetCurrentCell(row, column);
        Press(key, held);
        return Current();
    }
};

TEST_F(GridKeyTest, MovesThroughTheCells)
{
    const int last = grid->ColumnCount();
    for (const auto key : {Qt::Key_Tab, Qt::Key_Return, Qt::Key_Enter}) {
        EXPECT_EQ(From(1, 1, key), std::pair(1, 2));
        EXPECT_EQ(From(1, last, key), std::pair(2, 1));
        EXPECT_EQ(From(2, 2, key, Qt::ShiftModifier), std::pair(2, 1));
        EXPECT_EQ(From(2, 1, key, Qt::ShiftModifier), std::pair(1, last));
    }
    EXPECT_EQ(From(2, 1, Qt::Key_Backtab, Qt::ShiftModifier), std::pair(1, last));
    EXPECT_EQ(init.GetCount(), 2u);
    EXPECT_EQ(From(1, 1, Qt::Key_Tab, Qt::ShiftModifier), std::pair(1, 1)) << "does not wrap";
    EXPECT_FALSE(grid->hasFocus()) << "and leaves the grid";
    grid->setFocus();
    view->locations.clear();
    grid->SetCurrentCell(1, 3);
    grid->SetCurrentCell(2, 3);
    EXPECT_EQ(view->locations, QList<int>{2}) << "told once a line";
}

TEST_F(GridKeyTest, BehindTheLastCellALineIsAppended)
{
    globals.G_waterlevel = 7;
    EXPECT_EQ(From(2, grid->ColumnCount(), Qt::Key_Tab), std::pair(3, 1));
    EXPECT_EQ(Texts(3), "||7.000|0.000");
    EXPECT_EQ(From(3, grid->ColumnCount(), Qt::Key_Return), std::pair(4, 1));
    EXPECT_EQ(init.GetCount(), 4u);
}

TEST_F(GridKeyTest, FromALineThatIsGoneTheKeysGoOnWhereItStood)
{
    Add("C", 3);
    Add("D", 4);
    view->page->LoadFromDocument(&document);
    const auto after = [this](Qt::Key key, Qt::KeyboardModifiers held = {}) {
        grid->SetCurrentCell(3, 2);
        auto line = init.RemoveAt(2); // as a save does
        view->page->LoadFromDocument(&document);
        EXPECT_EQ(Current(), std::pair(0, 0));
        Press(key, held);
        const auto current = Current();
        init.InsertAt(2, std::move(line));
        view->page->LoadFromDocument(&document);
        return current;
    };
    EXPECT_EQ(after(Qt::Key_End, Qt::ControlModifier), std::pair(3, grid->ColumnCount()));
    EXPECT_EQ(after(Qt::Key_Home, Qt::ControlModifier), std::pair(1, 1));
    EXPECT_EQ(after(Qt::Key_Down), std::pair(3, 1));
}

TEST_F(GridKeyTest, InsertCopiesOrPastesFirst)
{
    auto* clipboard = QGuiApplication::clipboard();
    clipboard->clear();
    grid->SetCurrentCell(1, 1);
    Press(Qt::Key_Insert);
    EXPECT_EQ(init.GetCount(), 3u);
    EXPECT_TRUE(clipboard->text().isEmpty());
    grid->SetCurrentCell(2, 1);
    Press(Qt::Key_Insert, Qt::ControlModifier);
    EXPECT_EQ(clipboard->text(), "B");
    EXPECT_EQ(init.GetCount(), 4u);
    document.SetModifiedFlag(false);
    grid->SetCurrentCell(3, 1);
    Press(Qt::Key_Insert, Qt::ShiftModifier);
    EXPECT_EQ(init.GetAt(2).RiverName, "B");
    EXPECT_EQ(init.GetCount(), 5u);
    EXPECT_TRUE(document.IsModified());
    grid->SetCurrentCell(1, 1);
    Press(Qt::Key_Insert, Qt::ControlModifier | Qt::ShiftModifier);
    EXPECT_EQ(clipboard->text(), "A") << "with both, Ctrl decides";
    SelectRows(2, 3);
    Press(Qt::Key_Insert);
    EXPECT_EQ(Current(), std::pair(2, 1)) << "above the selection";
    EXPECT_EQ(init.GetAt(1).RiverName, "");
    EXPECT_EQ(init.GetAt(2).RiverName, "B");
}

TEST_F(GridKeyTest, CommandsGoToTheView)
{
    Press(Qt::Key_F7);
    Press(Qt::Key_F3, Qt::ShiftModifier);
    Press(Qt::Key_Delete, Qt::ControlModifier);
    EXPECT_EQ(view->commands, (QList<int>{Command::Search, Command::SearchAgain, Command::DeleteLine}));
    EXPECT_EQ(init.GetCount(), 2u) << "no whole line is selected";
    // While a cell is being edited as well, its text being taken first; Delete is the text's then.
    Type(1, 1, "x");
    QTest::keyClick(Editor(), Qt::Key_Delete);
    EXPECT_TRUE(Editor());
    QTest::keyClick(Editor(), Qt::Key_F7);
    EXPECT_FALSE(Editor());
    EXPECT_EQ(view->commands.size(), 4);
    EXPECT_EQ(init.GetAt(0).RiverName, "X");
}

TEST_F(GridKeyTest, DeletesTheLineWhoseNumberIsClicked)
{
    Add("C", 3);
    view->page->LoadFromDocument(&document);
    const QHeaderView& numbers = *grid->verticalHeader();
    const int top = numbers.sectionViewportPosition(1), height = numbers.sectionSize(1);
    for (const int y : {top, top + height / 2, top + height - 1}) { // a border belongs to its line
        grid->SetCurrentCell(1, 1);
        QTest::mouseClick(numbers.viewport(), Qt::LeftButton, {}, {5, y});
        EXPECT_EQ(Current().first, 2) << y;
        EXPECT_TRUE(grid->HasLinesToDelete()) << y;
    }
    Press(Qt::Key_Delete);
    EXPECT_EQ(init.GetCount(), 2u);
    // The next click may come so soon that it is told as the second of a double click.
    const QPointF at(5, top + height / 2.0);
    for (const auto type : {QEvent::MouseButtonDblClick, QEvent::MouseButtonRelease}) {
        QMouseEvent event(type, at, numbers.viewport()->mapToGlobal(at), Qt::LeftButton, Qt::LeftButton, {});
        QApplication::sendEvent(numbers.viewport(), &event);
    }
    Press(Qt::Key_Delete);
    ASSERT_EQ(init.GetCount(), 1u);
    EXPECT_EQ(init.GetAt(0).RiverName, "A");
}

TEST_F(GridKeyTest, DeletesWholeLinesOfOneRange)
{
    Add("C", 3);
    view->page->LoadFromDocument(&document);
    auto* selection = grid->selectionModel();
    const auto row = [&](int n) { return grid->model()->index(n - 1, 0); };
    grid->SetCurrentCell(1, 1);
    selection->select(row(1), QItemSelectionModel::Rows | QItemSelectionModel::ClearAndSelect);
    selection->select(row(3), QItemSelectionModel::Rows | QItemSelectionModel::Select);
    Press(Qt::Key_Delete);
    EXPECT_EQ(init.GetCount(), 3u) << "two ranges";
    // The row's number, clicked.
    QTest::mouseClick(grid->verticalHeader()->viewport(), Qt::LeftButton, {},
                      {5, grid->verticalHeader()->sectionViewportPosition(1) + 5});
    Press(Qt::Key_Delete);
    EXPECT_EQ(Stored(), "A 1 10 20, C 3 0 0");
    // All cells of a line, one by one, are not the line.
    grid->SetCurrentCell(1, 1);
    for (int column = 2; column <= grid->ColumnCount(); ++column)
        QTest::keyClick(grid, Qt::Key_Right, Qt::ShiftModifier);
    Press(Qt::Key_Delete);
    EXPECT_EQ(init.GetCount(), 2u);
    Press(Qt::Key_Space, Qt::ShiftModifier);
    Press(Qt::Key_Delete);
    EXPECT_EQ(Stored(), "C 3 0 0");
    document.UndoStack().undo();
    globals.G_discharge = 4;
    SelectRows(1, 2);
    Press(Qt::Key_Delete);
    EXPECT_EQ(Stored(), "");
    EXPECT_EQ(Texts(1), "||0.000|4.000") << "a table without lines shows one";
    Press(Qt::Key_Delete);
    EXPECT_EQ(document.UndoStack().count(), 2) << "which cannot be deleted";
    document.UndoStack().undo();
    EXPECT_EQ(Stored(), "A 1 10 20, C 3 0 0");
}

TEST_F(GridKeyTest, PlainLettersType)
{
    for (const char* text : {"C", "V"}) {
        Type(1, 1, text);
        QTest::keyClick(Editor(), Qt::Key_Tab);
        EXPECT_EQ(Texts(1).left(2), QString(text) + '|');
    }
}

TEST_F(GridKeyTest, UndoAndRedo)
{
    Enter(1, 3, "5");
    Type(1, 4, "6"); // still open: undo takes it first
    QTest::keyClick(Editor(), Qt::Key_Tab);
    Press(Qt::Key_Z, Qt::ControlModifier);
    Press(Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(Stored(), "A 1 10 20, B 2 11 21");
    Press(Qt::Key_Y, Qt::ControlModifier);
    Press(Qt::Key_Z, Qt::ControlModifier | Qt::ShiftModifier);
    EXPECT_EQ(Stored(), "A 1 5 6, B 2 11 21");
    EXPECT_EQ(view->revealed, (QList<int>{1, 1, 1, 1}));
}
