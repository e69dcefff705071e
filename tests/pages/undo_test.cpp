// Undo of what empty lists show and of saves. Random edits against a model: tests/model.
#include "page_fixture.h"
#include "pages/page_table.h"

#include <QTemporaryDir>

class UndoTest : public PageTest
{
};

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
