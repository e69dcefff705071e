#include "page_fixture.h"
#include "pages/page_table.h"

#include "grid/gen_grid.h"
#include "grid/grid_input.h"
#include "grid/grid_keys.h"

#include <QClipboard>

// Lines come next to the current one, are copied and change places, in the order of the file; each is one step.
class LineCommandsTest : public PageTest
{
protected:
    LineCommandsTest()
    {
        Add("A", 1, 10, 20);
        Add("B", 2, 11, 21);
        Add("A", 3, 12, 22);
        Add("B", 4, 13, 23);
        Open(MakeInitPage);
        grid->setFocus();
    }
    void Press(Qt::Key key, Qt::KeyboardModifiers held = {}) { QTest::keyClick(grid, key, held); }
    std::string Stored() const
    {
        std::string text;
        for (std::size_t i = 0; i < init.GetCount(); ++i)
            text += init.GetAt(i).RiverName + QString::number(init.GetAt(i).Chainage).toStdString() + ' ';
        return text;
    }
    void Select(int top, int left, int bottom, int right)
    {
        grid->SetCurrentCell(top, left);
        grid->selectionModel()->select(
            QItemSelection(grid->model()->index(top - 1, left - 1), grid->model()->index(bottom - 1, right - 1)),
            QItemSelectionModel::ClearAndSelect);
    }
    void Filter(const QString& text)
    {
        grid->ChangeView([&](CGridModel& model) { model.Filter({text}); });
    }
    std::string Selected() const
    {
        const auto block = grid->SelectedBlock();
        return block ? std::to_string(block->top() + 1) + '-' + std::to_string(block->bottom() + 1) : "";
    }
    void UndoTo(const std::string& text)
    {
        document.UndoStack().undo();
        EXPECT_EQ(Stored(), text);
        document.UndoStack().redo();
    }
    static constexpr Qt::KeyboardModifiers AltShift = Qt::AltModifier | Qt::ShiftModifier;
    static constexpr Qt::KeyboardModifiers CtrlShift = Qt::ControlModifier | Qt::ShiftModifier;
    const std::string before = "A1 B2 A3 B4 ";
};

TEST_F(LineCommandsTest, ALineIsInsertedAboveOrBelow)
{
    globals.G_waterlevel = 7;
    grid->SetCurrentCell(2, 3);
    Press(Qt::Key_Insert, Qt::AltModifier);
    EXPECT_EQ(Current(), std::pair(2, 1));
    EXPECT_EQ(Texts(2), "||7.000|0.000");
    EXPECT_EQ(init.GetCount(), 5u);
    UndoTo(before);
    document.UndoStack().undo();
    grid->SetCurrentCell(4, 1);
    Press(Qt::Key_Insert, AltShift);
    EXPECT_EQ(Current(), std::pair(5, 1)) << "behind the last one";
    document.UndoStack().undo();
    Filter("a");
    grid->SetCurrentCell(1, 1);
    Press(Qt::Key_Insert, AltShift);
    EXPECT_EQ(Current(), std::pair(2, 1));
    EXPECT_EQ(init.GetAt(1).RiverName, "") << "the line that is hidden stays behind it";
    document.UndoStack().undo();
    grid->ChangeView([](CGridModel& model) { model.SortBy({{1, true}}); }); // A3, A1
    grid->SetCurrentCell(1, 1);
    Press(Qt::Key_Insert, AltShift);
    EXPECT_EQ(Current(), std::pair(2, 1)) << "where the user looks";
}

TEST_F(LineCommandsTest, LinesAreDuplicatedWithAllTheyHold)
{
    grid->SelectLines(2, 3);
    Press(Qt::Key_L, CtrlShift);
    EXPECT_EQ(Stored(), "A1 B2 A3 B2 A3 B4 ");
    EXPECT_EQ(init.GetAt(4).InitialH, 12);
    EXPECT_EQ(Selected(), "4-5");
    UndoTo(before);
    document.UndoStack().undo();
    Filter("a");
    grid->SelectLines(1, 2);
    Press(Qt::Key_L, CtrlShift);
    EXPECT_EQ(Stored(), "A1 B2 A3 A1 A3 B4 ") << "only what is shown";
    UndoTo(before);
}

TEST_F(LineCommandsTest, LinesChangePlacesWithTheirNeighbourThatIsShown)
{
    grid->SelectLines(2, 3);
    Press(Qt::Key_Up, CtrlShift);
    EXPECT_EQ(Stored(), "B2 A3 A1 B4 ");
    EXPECT_EQ(Selected(), "1-2");
    Press(Qt::Key_Up, CtrlShift);
    EXPECT_EQ(Stored(), "B2 A3 A1 B4 ") << "there is none above";
    Press(Qt::Key_Down, CtrlShift);
    EXPECT_EQ(Stored(), before);
    Press(Qt::Key_Down, CtrlShift);
    EXPECT_EQ(Stored(), "A1 B4 B2 A3 ");
    EXPECT_EQ(Selected(), "3-4");
    UndoTo(before);
    while (document.UndoStack().canUndo())
        document.UndoStack().undo();
    EXPECT_EQ(Stored(), before);
    Filter("a");
    grid->SetCurrentCell(2, 3);
    Press(Qt::Key_Up, CtrlShift);
    EXPECT_EQ(Stored(), "B2 A3 A1 B4 ");
    EXPECT_EQ(Current(), std::pair(1, 3)) << "the cell goes with its line";
    document.UndoStack().undo();
    Filter("");
    grid->ChangeView([](CGridModel& model) { model.SortBy({{1, true}}); });
    Press(Qt::Key_Down, CtrlShift);
    EXPECT_EQ(Stored(), before) << "a place in the file is nothing that shows then";
}

TEST_F(LineCommandsTest, CutTakesWholeLinesOrWhatCellsHold)
{
    globals.G_waterlevel = 7;
    globals.G_discharge = 3;
    grid->SelectLines(1, 2);
    Press(Qt::Key_X, Qt::ControlModifier);
    EXPECT_EQ(Stored(), "A3 B4 ");
    EXPECT_TRUE(QGuiApplication::clipboard()->text().startsWith("A\t1\t10")) << "and can be pasted again";
    UndoTo(before);
    document.UndoStack().undo();
    Select(2, 3, 3, 4);
    Press(Qt::Key_X, Qt::ControlModifier);
    EXPECT_EQ(Stored(), before);
    EXPECT_EQ(Texts(2), "B|2|7.000|3.000") << "as cells that were emptied: the global value, where there is one";
    document.UndoStack().undo();
    EXPECT_EQ(Texts(2), "B|2|11.000|21.000");
    Select(1, 1, 4, 3);
    Press(Qt::Key_G, CtrlShift);
    EXPECT_EQ(Texts(1) + Texts(4), "A|1|7.000|20.000B|4|7.000|23.000") << "places have no global value";
}
