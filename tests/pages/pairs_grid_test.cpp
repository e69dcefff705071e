// The further grids of the pages: pairs of the file as a whole, and of the current line.
#include "flow_page_fixture.h"
#include "grid/grid_clipboard.h"
#include "pages/page_table.h"

#include <QClipboard>
#include <QTemporaryDir>

class PairsGridTest : public FlowPagesTest
{
protected:
    HDBedResTool& AddTool(const char* name, double chainage, std::vector<CBRTVeloRes> pairs = {})
    {
        HDBedResTool tool;
        tool.RiverName = name;
        tool.Chainage = chainage;
        tool.VeloRes = std::move(pairs);
        return list.Add(tool);
    }
    void OpenToolbox()
    {
        globals.BedResist.Method = 9; // unknown: may use anything
        Open(MakeBedToolboxPage);
        global = Find<CGenGrid>(1318);
        line = Find<CGenGrid>(1320);
    }
    static QString Pairs(const std::vector<CBRTVeloRes>& pairs)
    {
        QStringList texts;
        for (const CBRTVeloRes& pair : pairs)
            texts << QString("%1 %2").arg(pair.Velocity).arg(pair.ResValue);
        return texts.join(", ");
    }
    /// Types cell after cell as a user does who never leaves the keyboard.
    static void TypeCells(CGenGrid* into, std::initializer_list<const char*> texts)
    {
        into->setFocus();
        for (const char* text : texts) {
            QTest::keyClicks(into, QString(text[0]));
            QTest::keyClicks(OpenEditor(*into), text + 1);
            QTest::keyClick(OpenEditor(*into), Qt::Key_Tab);
        }
    }
    void UndoAll()
    {
        while (document.UndoStack().canUndo())
            document.UndoStack().undo();
    }

    CGenParamList<HDBedResTool>& list = document.Parameters().BedResistanceToolboxList;
    CGenGrid *global = nullptr, *line = nullptr;
};

TEST_F(PairsGridTest, KeyboardAlone)
{
    OpenToolbox();
    EXPECT_TRUE(global->isEnabled());
    EXPECT_EQ(global->RowCount(), 0) << "no pair is shown that the file does not have";
    global->setFocus();
    QTest::keyClick(global, Qt::Key_Insert);
    EXPECT_EQ(Pairs(globals.BedResist.VeloRes), "0 0");
    TypeCells(global, {"0.5", "26", "1", "29"}); // Tab behind the last cell appends
    EXPECT_EQ(Pairs(globals.BedResist.VeloRes), "0.5 26, 1 29, 0 0");
    EXPECT_EQ(list.GetCount(), 0u) << "the location grid got no line";
    global->SelectLines(3, 3);
    QTest::keyClick(global, Qt::Key_Delete);
    EXPECT_EQ(Pairs(globals.BedResist.VeloRes), "0.5 26, 1 29");
    global->selectAll();
    QTest::keyClick(global, Qt::Key_Delete);
    EXPECT_EQ(global->RowCount(), 0) << "the table may be empty";
    QTest::keyClick(global, Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(Pairs(globals.BedResist.VeloRes), "0.5 26, 1 29");
    QGuiApplication::clipboard()->setText("2\t3\n4\t5");
    global->SetCurrentCell(2, 1);
    EXPECT_TRUE(PasteCells(*global));
    EXPECT_EQ(Pairs(globals.BedResist.VeloRes), "0.5 26, 2 3, 4 5");
    UndoAll();
    EXPECT_EQ(Pairs(globals.BedResist.VeloRes), "");
    EXPECT_TRUE(PasteCells(*global)) << "also into an empty table";
    EXPECT_EQ(Pairs(globals.BedResist.VeloRes), "2 3, 4 5");
    EXPECT_FALSE(line->isEnabled()) << "there is no line yet";
    Enter(1, 1, "main");
    EXPECT_TRUE(line->isEnabled());
    QTest::qWait(1); // the table gets room for its columns
    QTest::mouseDClick(line->viewport(), Qt::LeftButton, {}, QPoint(20, 20));
    EXPECT_EQ(Pairs(list.GetAt(0).VeloRes), "0 0") << "a double click makes the first line";
}

TEST_F(PairsGridTest, FollowsTheCurrentLine)
{
    AddTool("A", 1, {{0.5, 20}, {1, 25}});
    AddTool("B", 2, {{2, 30}});
    AddTool("C", 3);
    OpenToolbox();
    const auto rows = [&] { return line->RowCount(); };
    EXPECT_EQ(rows(), 2);
    grid->SetCurrentCell(2, 3);
    EXPECT_EQ(rows(), 1);
    EXPECT_EQ(line->TextAt(1, 2), "30");
    line->SetCurrentCell(1, 2);
    TypeCells(line, {"31", "3"}); // the second line's first cell
    grid->setFocus();
    grid->SetCurrentCell(3, 3);
    EXPECT_EQ(rows(), 0);
    EXPECT_EQ(Pairs(list.GetAt(1).VeloRes), "2 31, 3 0");

    // Undo and redo work across both grids and show the line they are about.
    Enter(3, 3, "7");
    EXPECT_EQ(list.GetAt(2).CoefA, 7);
    const int steps = document.UndoStack().count();
    view->revealed.clear();
    UndoAll();
    EXPECT_EQ(view->revealed, QList<int>({3, 2, 2, 2}));
    EXPECT_EQ(steps, 4);
    EXPECT_EQ(Pairs(list.GetAt(1).VeloRes), "2 30");
    while (document.UndoStack().canRedo())
        document.UndoStack().redo();
    EXPECT_EQ(Pairs(list.GetAt(1).VeloRes), "2 31, 3 0");

    // A line takes its pairs with it.
    SelectRows(1, 2);
    view->page->DeleteLines();
    ASSERT_EQ(list.GetCount(), 1u);
    document.UndoStack().undo();
    EXPECT_EQ(Pairs(list.GetAt(0).VeloRes), "0.5 20, 1 25");
    EXPECT_EQ(Pairs(list.GetAt(1).VeloRes), "2 31, 3 0");
    UndoAll();
    EXPECT_EQ(Pairs(list.GetAt(1).VeloRes), "2 30");
    EXPECT_EQ(boxes, QStringList());
}

TEST_F(PairsGridTest, AWrongNumberKeepsTheLine)
{
    AddTool("A", 1, {{0.5, 20}});
    AddTool("B", 2, {{2, 30}});
    OpenToolbox();
    line->setFocus();
    line->SetCurrentCell(1, 2);
    QTest::keyClick(line, '1');
    QTest::keyClicks(OpenEditor(*line), ".");
    QTest::mouseClick(grid->viewport(), Qt::LeftButton, {}, grid->visualRect(grid->model()->index(1, 0)).center());
    EXPECT_EQ(boxes, QStringList("Floating point number required"));
    EXPECT_EQ(grid->CurrentRow(), 1);
    ASSERT_TRUE(OpenEditor(*line));
    QTest::qWait(0);
    QTest::keyClicks(OpenEditor(*line), "5");
    grid->GotoLine(2); // as the menu does: what is typed still goes to its own line
    EXPECT_EQ(Pairs(list.GetAt(0).VeloRes), "0.5 1.5");
    EXPECT_EQ(Pairs(list.GetAt(1).VeloRes), "2 30");
}

TEST_F(PairsGridTest, PairsNeedALine)
{
    OpenToolbox();
    EXPECT_FALSE(line->isEnabled()) << "the line that an empty table shows is none yet";
    Enter(1, 3, "0.5");
    ASSERT_TRUE(line->isEnabled());
    line->setFocus();
    QTest::keyClick(line, Qt::Key_Insert);
    TypeCells(line, {"1", "2"});
    QTemporaryDir folder;
    EXPECT_TRUE(document.OnSaveDocument(folder.filePath("a.HDKV")));
    EXPECT_FALSE(line->isEnabled());
    document.UndoStack().undo(); // of the removal of incomplete lines
    EXPECT_EQ(Pairs(list.GetAt(0).VeloRes), "1 2, 0 0") << "the user's line is not lost";
    UndoAll();
    EXPECT_TRUE(list.IsEmpty());
}

TEST_F(PairsGridTest, MixingPairs)
{
    document.Parameters().MixingCoefList.Add().CoefPairs = {{20, 0.11}, {40, 0.16}};
    globals.Mixing.CoefPairs = {{10, 0.5}};
    Open(MakeMixingCoefPage);
    for (const auto& [number, rows] : {std::pair(1334, 1), std::pair(1336, 2)}) {
        auto* pairs = Find<CGenGrid>(number);
        EXPECT_EQ(pairs->RowCount(), rows);
        pairs->SetCurrentCell(1, 2);
        TypeCells(pairs, {"0.25"});
    }
    EXPECT_EQ(globals.Mixing.CoefPairs[0].Second, 0.25);
    EXPECT_EQ(document.Parameters().MixingCoefList.GetAt(0).CoefPairs[0].Second, 0.25);
}
