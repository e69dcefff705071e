#include "page_fixture.h"
#include "pages/page_table.h"

#include "grid/grid_clipboard.h"

#include <QClipboard>

class ClipboardTest : public PageTest
{
protected:
    ClipboardTest()
    {
        Add("A", 1.25, 0.1, 20);
        Add("B", NotGiven, 11, 21);
        Open(MakeInitPage);
        grid->setFocus();
    }
    void Select(int top, int left, int bottom, int right)
    {
        grid->SetCurrentCell(top, left);
        grid->selectionModel()->select(
            QItemSelection(grid->model()->index(top - 1, left - 1), grid->model()->index(bottom - 1, right - 1)),
            QItemSelectionModel::ClearAndSelect);
    }
    void Paste(int row, int column, const QString& text)
    {
        grid->SetCurrentCell(row, column);
        QGuiApplication::clipboard()->setText(text);
        QTest::keyClick(grid, Qt::Key_V, Qt::ControlModifier);
    }
    QString Copied()
    {
        QTest::keyClick(grid, Qt::Key_C, Qt::ControlModifier);
        return QGuiApplication::clipboard()->text();
    }
};

TEST_F(ClipboardTest, CopiesWholeNumbersInDisplayUnits)
{
    Select(1, 1, 2, 3);
    EXPECT_EQ(Copied(), "A\t1.25\t0.1\nB\t\t11");
    grid->SetCurrentCell(2, 3);
    for (const auto key : {Qt::Key_Left, Qt::Key_Left, Qt::Key_Up})
        QTest::keyClick(grid, key, Qt::ShiftModifier); // a selection that grows from its last cell
    EXPECT_EQ(Copied(), "A\t1.25\t0.1\nB\t\t11");
    Select(2, 4, 2, 4);
    EXPECT_EQ(Copied(), "21");
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    EXPECT_NEAR(Copied().toDouble(), 21 * 35.3147, 0.01);
}

TEST_F(ClipboardTest, HeadersGoWithWhatIsCopiedAndAreNoLineWhenPasted)
{
    const auto copied = [this] {
        QTest::keyClick(grid, Qt::Key_C, Qt::ControlModifier | Qt::ShiftModifier);
        return QGuiApplication::clipboard()->text();
    };
    Select(1, 2, 2, 3);
    EXPECT_EQ(copied(), "Chainage [m]\tInitial h [m]\n1.25\t0.1\n\t11");
    grid->SetCurrentCell(1, 2);
    QTest::keyClick(grid, Qt::Key_V, Qt::ControlModifier);
    EXPECT_EQ(Stored(), "A 1.25 0.1 20, B 10000000000 11 21");
    EXPECT_EQ(document.UndoStack().count(), 0) << "what was copied is pasted where it was";
    Paste(2, 2, "chainage\tInitial h\n7\t8\n9\t10\n");
    EXPECT_EQ(Stored(), "A 1.25 0.1 20, B 7 8 21,  9 10 0");
    const auto block = grid->SelectedBlock();
    ASSERT_TRUE(block);
    EXPECT_EQ(std::pair(block->top(), block->bottom()), std::pair(1, 2)) << "what was pasted is selected";
    EXPECT_EQ(Current(), std::pair(2, 2));
}

TEST_F(ClipboardTest, PastesRectangles)
{
    Paste(2, 2, "7\t8\n"); // a part of one line
    EXPECT_EQ(Stored(), "A 1.25 0.1 20, B 7 8 21");
    Paste(2, 1, "rhine\t1\t2\t3\r\nmain\t\t5\t6\r\nneckar\t9\t\t\r\n"); // past the end
    EXPECT_EQ(Stored(), "A 1.25 0.1 20, RHINE 1 2 3, MAIN 10000000000 5 6, NECKAR 9 0 0");
    EXPECT_EQ(document.UndoStack().undoText(), "Paste");
    document.UndoStack().undo();
    EXPECT_EQ(Stored(), "A 1.25 0.1 20, B 7 8 21") << "one step";
    document.UndoStack().redo();
    EXPECT_EQ(init.GetCount(), 4u);
    Select(1, 3, 3, 4);
    QGuiApplication::clipboard()->setText("5");
    QTest::keyClick(grid, Qt::Key_V, Qt::ControlModifier); // one cell fills the selection
    EXPECT_EQ(Stored(), "A 1.25 5 5, RHINE 1 5 5, MAIN 10000000000 5 5, NECKAR 9 0 0");
    QGuiApplication::clipboard()->setText("7\t8");
    QTest::keyClick(grid, Qt::Key_V, Qt::ControlModifier); // a line of two does not
    EXPECT_EQ(Stored(), "A 1.25 7 8, RHINE 1 5 5, MAIN 10000000000 5 5, NECKAR 9 0 0");
    Paste(1, 3, "7\n5\n6\n");
    view->revealed.clear();
    QTest::keyClick(grid, Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(view->revealed, QList<int>{3}) << "where something changed";
    // Blank lines are none where lines name their branches, and short lines leave the rest.
    QStringList said;
    QObject::connect(&document, &CKsDoc::Said, [&said](const CString& text) { said << text; });
    Paste(1, 1, "x\t1\t2\n\ny\t3\n\n\n");
    EXPECT_EQ(Stored(), "X 1 2 8, Y 3 5 5, MAIN 10000000000 5 5, NECKAR 9 0 0");
    Paste(3, 2, "\"4\n\"\t6\n\n");
    EXPECT_EQ(Stored(), "X 1 2 8, Y 3 5 5, MAIN 4 6 5, NECKAR 9 0 0") << "a line end behind a number is none of it";
    EXPECT_EQ(said, QStringList({"5 cells pasted; left out: 1 blank line; shorter lines leave their other cells as "
                                 "they were",
                                 "2 cells pasted"}));
    // Elsewhere they are lines, of which no cell is pasted.
    Paste(1, 3, "1\t2\n\n3\t4");
    EXPECT_EQ(Stored(), "X 1 1 2, Y 3 5 5, MAIN 4 3 4, NECKAR 9 0 0");
    EXPECT_EQ(boxes, QStringList());
}

TEST_F(ClipboardTest, PastingWhatWasCopiedChangesNothing)
{
    for (auto system : {KsUnitSystem::Metric, KsUnitSystem::UsCustomary}) {
        KsUnits::Instance().SetSystem(system);
        Select(1, 1, 2, 4);
        const QString before = Stored();
        Copied();
        QTest::keyClick(grid, Qt::Key_V, Qt::ControlModifier);
        EXPECT_EQ(Stored(), before);
        EXPECT_EQ(document.UndoStack().count(), 0);
    }
}
