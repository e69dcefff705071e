// Random edits, undone and redone, against copies of what the list was.
#include "page_fixture.h"
#include "grid/grid_clipboard.h"
#include "pages/page_table.h"

#include <QClipboard>
#include <QTemporaryDir>
#include <random>

class UndoTest : public PageTest
{
};

TEST_F(UndoTest, RandomSequences)
{
    std::mt19937 random(20240607);
    const auto pick = [&](int n) { return int(random() % unsigned(n)); };
    for (int round = 0; round < 10; ++round) {
        init.RemoveAll();
        document.UndoStack().clear();
        for (int i = 0; i < 5; ++i)
            Add("R", i, i * 0.1, i * 0.3);
        Open(MakeInitPage);
        QStringList states{Stored()}; // state i: after i steps
        for (int step = 0; step < 60; ++step) {
            SCOPED_TRACE(step);
            const int row = 1 + pick(grid->RowCount());
            grid->SetCurrentCell(row, 1 + pick(4));
            grid->selectionModel()->select(grid->currentIndex(), QItemSelectionModel::ClearAndSelect);
            const int before = document.UndoStack().index();
            switch (pick(7)) {
            case 0:
                grid->Model()->setData(grid->currentIndex(), QString::number(step), Qt::EditRole);
                view->page->StoreToDocument();
                break;
            case 1:
                view->page->AppendLine();
                break;
            case 2:
                SelectRows(row, std::min(row + pick(3), grid->RowCount()));
                if (pick(2))
                    view->page->AppendLine(); // above the selection
                else
                    view->page->DeleteLines();
                break;
            case 3:
                grid->SetCurrentCell(row, 3);
                QGuiApplication::clipboard()->setText("1\t2\n3\t4\n5\t6");
                EXPECT_TRUE(PasteCells(*grid));
                break;
            case 4:
                view->page->InsertLocation("q", QString::number(step));
                break;
            default:
                document.UndoStack().setIndex(std::max(0, before - pick(4)));
                ASSERT_EQ(Stored(), states[document.UndoStack().index()]);
                if (pick(2)) {
                    document.UndoStack().redo();
                    ASSERT_EQ(Stored(), states[document.UndoStack().index()]);
                }
                continue;
            }
            if (document.UndoStack().index() == before)
                continue; // nothing changed
            ASSERT_EQ(document.UndoStack().index(), before + 1);
            states.resize(before + 1);
            states << Stored();
        }
        while (document.UndoStack().canUndo())
            document.UndoStack().undo();
        ASSERT_EQ(Stored(), states.front());
        ASSERT_EQ(grid->RowCount(), 5);
        while (document.UndoStack().canRedo())
            document.UndoStack().redo();
        ASSERT_EQ(Stored(), states.back());
        ASSERT_EQ(grid->RowCount(), int(init.GetCount()));
    }
    EXPECT_EQ(boxes, QStringList());
}

TEST_F(UndoTest, TheLineOfAnEmptyListIsNoChange)
{
    Open(MakeInitPage);
    EXPECT_EQ(grid->RowCount(), 1);
    EXPECT_EQ(init.GetCount(), 0u);
    EXPECT_FALSE(document.IsModified());
    EXPECT_EQ(document.UndoStack().count(), 0);
    Enter(1, 1, "a"); // touched, and taken back: as if it had never been
    document.UndoStack().undo();
    EXPECT_EQ(init.GetCount(), 0u);
    EXPECT_FALSE(document.IsModified());
    // The pages of the sheet come and go between the steps.
    Open(MakeInitPage);
    document.UndoStack().redo();
    EXPECT_EQ(Stored(), "A 10000000000 0 0");
    EXPECT_EQ(grid->RowCount(), 1);
}

TEST_F(UndoTest, ASaveThatDroppedLinesIsRedoneAsItWas)
{
    QTemporaryDir folder;
    Open(MakeInitPage);
    Add("A", 1);
    Add("", 2, 7);
    Add("B", 3);
    Add("C", NotGiven);
    view->page->LoadFromDocument(&document);
    ASSERT_TRUE(document.OnSaveDocument(folder.filePath("new.HDKV")));
    EXPECT_EQ(Stored(), "A 1 0 0, B 3 0 0");
    const QString dropped = "A 1 0 0,  2 7 0, B 3 0 0, C 10000000000 0 0";
    document.UndoStack().undo();
    EXPECT_EQ(Stored(), dropped);
    EXPECT_EQ(view->revealed.back(), 2);
    // What the lines hold by then does not count: the step is what it was.
    init.GetAt(1).RiverName = "NAMED";
    init.GetAt(2).RiverName.clear();
    document.UndoStack().redo();
    EXPECT_EQ(Stored(), "A 1 0 0,  3 0 0");
}

TEST_F(UndoTest, TheSavedStateIsUnmodifiedFromBothSides)
{
    QTemporaryDir folder;
    Open(MakeInitPage);
    Enter(1, 1, "a");
    ASSERT_TRUE(document.OnSaveDocument(folder.filePath("new.HDKV"))); // the line has no chainage: dropped
    EXPECT_FALSE(document.IsModified());
    document.UndoStack().undo();
    EXPECT_TRUE(document.IsModified()) << "the line is back";
    document.UndoStack().redo();
    EXPECT_FALSE(document.IsModified());
    Enter(1, 1, "b");
    EXPECT_TRUE(document.IsModified());
    document.UndoStack().undo();
    EXPECT_FALSE(document.IsModified());
}
