// Switching the resistance formula: what it asks, what it converts, and that it is one step.
#include "flow_page_fixture.h"
#include "pages/page_table.h"

#include <QComboBox>

namespace {

class ResistanceFormulaTest : public FlowPagesTest
{
protected:
    ResistanceFormulaTest()
    {
        globals.G_resistance = 40;
        globals.BedResist = {1, false, false, false, {{1, 25}, {2, 0}}, 20, 0.25, 10, 50};
        HD_Resistfact bed;
        bed.RiverName = "A";
        bed.Chainage = 1;
        bed.Resistance = 32;
        document.Parameters().BedList.Add(bed);
        HDBedResTool tool;
        tool.RiverName = "A";
        tool.Chainage = 1;
        tool.MaxRes = 50; // no minimum
        tool.VeloRes = {{1, 16}};
        document.Parameters().BedResistanceToolboxList.Add(tool);
        Open(MakeBedPage);
    }
    /// Chooses a formula as the keyboard does, answering the question that comes.
    void Choose(Qt::Key key, QMessageBox::StandardButton pressed)
    {
        boxes.clear();
        answer = pressed;
        auto* formula = Find<QComboBox>(1300);
        formula->setFocus();
        QTest::keyClick(formula, key);
    }
    const HDBedResistTools& tools = globals.BedResist;
};

} // namespace

TEST_F(ResistanceFormulaTest, LeavesTheValuesUnlessAskedTo)
{
    const QStringList before = Lines();
    Choose(Qt::Key_Down, QMessageBox::No);
    ASSERT_EQ(boxes.size(), 1);
    EXPECT_TRUE(boxes[0].contains("M = 1/n") && boxes[0].contains("40 to 0.025")) << boxes[0].toStdString();
    EXPECT_EQ(Changed(before), QStringList("resist_num = 1"));
    document.UndoStack().undo();
    EXPECT_EQ(Lines(), before);

    Choose(Qt::Key_Down, QMessageBox::Cancel);
    EXPECT_EQ(Lines(), before);
    EXPECT_EQ(Find<QComboBox>(1300)->currentIndex(), 0) << "the list shows what is stored";
    EXPECT_FALSE(document.UndoStack().canUndo());
}

TEST_F(ResistanceFormulaTest, ConvertsEveryResistanceInOneStep)
{
    globals.G_flood_plan_res = 12;
    const QStringList before = Lines();
    Choose(Qt::Key_Down, QMessageBox::Yes);
    EXPECT_TRUE(boxes.value(0).contains("changes 16 values")) << boxes.value(0).toStdString();
    EXPECT_EQ(document.UndoStack().count(), 1);
    EXPECT_EQ(globals.resist_num, 1);
    EXPECT_EQ(globals.G_resistance, 1 / 40.0);
    EXPECT_EQ(globals.ZoneResistance2, 1 / 25.0);
    EXPECT_EQ(document.Parameters().BedList.GetAt(0).Resistance, 1 / 32.0);
    EXPECT_EQ(grid->TextAt(1, 3), "0.03125");
    EXPECT_EQ(tools.MinRes, 1 / 50.0) << "the largest M is the smallest n";
    EXPECT_EQ(tools.MaxRes, 1 / 10.0);
    EXPECT_EQ(tools.CoefA, 1 / 20.0);
    EXPECT_EQ(tools.CoefB, -0.25);
    EXPECT_EQ(tools.VeloRes[0].ResValue, 1 / 25.0);
    EXPECT_EQ(tools.VeloRes[1].ResValue, 0) << "not given";
    const HDBedResTool& tool = document.Parameters().BedResistanceToolboxList.GetAt(0);
    EXPECT_EQ(tool.MinRes, 1 / 50.0);
    EXPECT_EQ(tool.MaxRes, 0) << "there was no smallest M";
    EXPECT_EQ(tool.VeloRes[0].ResValue, 1 / 16.0);
    EXPECT_EQ(globals.G_flood_plan_res, 12);
    const QStringList after = Lines();
    document.UndoStack().undo();
    EXPECT_EQ(Lines(), before);
    document.UndoStack().redo();
    EXPECT_EQ(Lines(), after);
}

TEST_F(ResistanceFormulaTest, ChezyIsNotConverted)
{
    globals.resist_num = 1;
    view->page->LoadFromDocument(&document);
    const QStringList before = Lines();
    Choose(Qt::Key_Down, QMessageBox::Ok);
    EXPECT_TRUE(boxes.value(0).contains("hydraulic radius")) << boxes.value(0).toStdString();
    EXPECT_EQ(Changed(before), QStringList("resist_num = 2"));
}

TEST_F(ResistanceFormulaTest, TheToolboxLocksWhatItsMethodDoesNotUse)
{
    Open(MakeBedToolboxPage);
    const auto open = [this] {
        QString text;
        for (int control : {1311, 1314, 1316})
            text += Find(control)->isEnabled() ? '*' : '-';
        for (int column : {2, 5})
            text += grid->model()->index(0, column).flags() & Qt::ItemIsEditable ? '*' : '-';
        text += Find<CGenGrid>(1318)->model()->index(0, 1).flags() & Qt::ItemIsEditable ? '*' : '-';
        return text;
    };
    EXPECT_EQ(open(), "*****-");
    auto* method = Find<QComboBox>(1310);
    method->setFocus();
    QTest::keyClick(method, Qt::Key_Down);
    EXPECT_EQ(open(), "*----*");
    QTest::keyClick(method, Qt::Key_Home);
    EXPECT_EQ(open(), "------");
    globals.BedResist.Method = 7; // nobody knows what it uses
    view->page->LoadFromDocument(&document);
    EXPECT_EQ(open(), "******");
    const QString tip = grid->model()->headerData(2, Qt::Horizontal, Qt::ToolTipRole).toString();
    EXPECT_TRUE(tip.contains("a·(V·R)^b")) << tip.toStdString();
    EXPECT_TRUE(view->page->findChild<QLabel*>("formulaLabel")->text().contains("a·(V·R)^b"));
}
