
#include "page_fixture.h"
#include "pages/page_table.h"

#include "pages/framework/ctrl_edit.h"

#include <QGroupBox>
#include <QLabel>
#include <QRadioButton>

class InitPageTest : public PageTest
{
protected:
    template <typename Widget = QWidget>
    Widget* Find(const char* name)
    {
        auto* widget = view->page->findChild<Widget*>(name);
        EXPECT_TRUE(widget) << name;
        return widget;
    }
    QString Header(int column) { return grid->model()->headerData(column - 1, Qt::Horizontal).toString(); }
};

TEST_F(InitPageTest, EmptyListShowsTheGlobalValues)
{
    globals.G_waterlevel = 1.5;
    globals.G_discharge = 30;
    Open(MakeInitPage);
    EXPECT_TRUE(view->linesMenu);
    EXPECT_EQ(Texts(1), "||1.500|30.000");
    EXPECT_EQ(Current(), std::pair(1, 1));
    EXPECT_EQ(init.GetCount(), 0u) << "it is no line of the document";
    EXPECT_FALSE(document.IsModified());
    // New lines take them as plain numbers, whatever the unit.
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    view->page->AppendLine();
    EXPECT_EQ(Texts(1), "||1.500|30.000") << "what was shown is a line by now";
    ASSERT_EQ(init.GetCount(), 2u);
    EXPECT_EQ(Texts(2), "||1.500|30.000");
    EXPECT_NEAR(init.GetAt(1).InitialH, 1.5 * 0.3048, 1e-5);
    document.UndoStack().undo();
    EXPECT_EQ(grid->RowCount(), 1);
    EXPECT_EQ(init.GetCount(), 0u);
}

TEST_F(InitPageTest, WhatIsTheGlobalValueStandsBackAndTheOthersAreCounted)
{
    globals.G_waterlevel = 10;
    globals.G_discharge = 3;
    for (const double level : {10.0, 11.0, 10.0})
        Add("A", level, level, 20);
    Open(MakeInitPage);
    const auto standsBack = [this](int row, int column) {
        return grid->model()->index(row - 1, column - 1).data(Qt::ForegroundRole).isValid();
    };
    EXPECT_TRUE(standsBack(1, 3) && standsBack(3, 3));
    EXPECT_FALSE(standsBack(2, 3) || standsBack(1, 4) || standsBack(1, 2));
    EXPECT_TRUE(grid->model()->index(0, 2).data(Qt::ToolTipRole).toString().endsWith("\nThe global value"));
    const auto darkest = [this](int row, int column) { // as it is painted
        const QImage cell =
            grid->viewport()->grab(grid->visualRect(grid->model()->index(row - 1, column - 1))).toImage();
        int lightness = 255;
        for (int y = 2; y < cell.height() - 2; ++y)
            for (int x = 2; x < cell.width() - 2; ++x)
                lightness = std::min(lightness, cell.pixelColor(x, y).lightness());
        return lightness;
    };
    EXPECT_GT(darkest(1, 3), darkest(2, 3) + 30);
    const auto overrides = [this](const char* field) {
        return view->page->OverridesText(*Find<CCtrlEdit>(field)).toStdString();
    };
    EXPECT_EQ(overrides("levelOrDepth_1001"), "Lines with another value: 1 of 3");
    EXPECT_EQ(overrides("discharge_1002"), "Lines with another value: 3 of 3");
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    EXPECT_TRUE(standsBack(1, 3)) << "it is the same level in feet";
    grid->SetCurrentCell(2, 3);
    QTest::keyClick(grid, Qt::Key_G, Qt::ControlModifier | Qt::ShiftModifier);
    EXPECT_EQ(init.GetAt(1).InitialH, 10);
    KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
}

TEST_F(InitPageTest, TheLineOfAnEmptyListFollowsTheGlobalValuesUntilItIsTouched)
{
    globals.G_waterlevel = 3.5;
    Open(MakeInitPage);
    auto* level = Find<CCtrlEdit>("levelOrDepth_1001");
    level->setFocus();
    level->selectAll();
    QTest::keyClicks(level, "5");
    QTest::keyClick(level, Qt::Key_Tab);
    EXPECT_EQ(Texts(1), "||5.000|0.000");
    Enter(1, 1, "main");
    EXPECT_EQ(Stored(), "MAIN 10000000000 5 0");
    document.UndoStack().undo();
    EXPECT_EQ(Stored(), "");
    document.UndoStack().undo();
    EXPECT_EQ(Texts(1), "||3.500|0.000");
    EXPECT_FALSE(document.IsModified());
    Enter(1, 3, "3.5"); // what is there already
    EXPECT_EQ(init.GetCount(), 0u);
}

TEST_F(InitPageTest, LevelOrDepth)
{
    globals.G_waterlevel = 2;
    Add("A", 1, 2, 3);
    Open(MakeInitPage);
    const auto shows = [&](bool depth) {
        EXPECT_EQ(Find<QLabel>("label_1001")->text(), depth ? "Water De&pth" : "Wate&r Level");
        EXPECT_EQ(Header(3), depth ? "Initial y" : "Initial h");
        EXPECT_EQ(Find<QRadioButton>("depth_1202")->isChecked(), depth);
        EXPECT_EQ(globals.iLevelDepth, int(depth));
    };
    shows(false);
    Find<QRadioButton>("depth_1202")->click();
    shows(true);
    EXPECT_TRUE(document.IsModified());
    EXPECT_EQ(globals.G_waterlevel, 2);
    EXPECT_EQ(Stored(), "A 1 2 3") << "nothing is converted";
    document.UndoStack().undo();
    shows(false);
    EXPECT_EQ(QString("%1 %2 %3 %4").arg(Header(1), Header(2), Header(3), Header(4)),
              "River Name Chainage Initial h Initial Q");
}

TEST_F(InitPageTest, UnitsAreLive)
{
    globals.G_waterlevel = 3.048;
    Add("A", 304.8, 3.048, 28.316846592);
    Open(MakeInitPage);
    const QString before = Stored();
    auto* level = Find<CCtrlEdit>("levelOrDepth_1001");
    const auto tip = [&](int column) {
        return grid->model()->headerData(column - 1, Qt::Horizontal, Qt::ToolTipRole).toString();
    };
    EXPECT_EQ(Texts(1), "A|305|3.048|28.317");
    EXPECT_EQ(tip(3), "Water level, or water depth, from which the computation starts at this\nlocation.\n"
                      "Unit: m\nNew lines: 3.048 m, the global value\nIn the file: InitialH");
    EXPECT_EQ(Find<QLabel>("unit_1001")->text(), "m");
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    EXPECT_EQ(level->text(), "10");
    EXPECT_TRUE(level->toolTip().endsWith("\nUnit: ft\nDefault: 0 ft\nIn the file: G_waterlevel"))
        << level->toolTip().toStdString();
    EXPECT_EQ(Find<QLabel>("unit_1001")->text(), "ft");
    EXPECT_TRUE(tip(3).contains("\nUnit: ft\n")) << tip(3).toStdString();
    EXPECT_EQ(Texts(1), "A|1000|10.000|1000.000");
    KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
    EXPECT_EQ(Texts(1), "A|305|3.048|28.317");
    EXPECT_EQ(Stored(), before);
    EXPECT_EQ(globals.G_waterlevel, 3.048);
    EXPECT_FALSE(document.IsModified());
}

TEST_F(InitPageTest, GlobalFieldsAreStoredWhenLeft)
{
    Open(MakeInitPage);
    auto* discharge = Find<CCtrlEdit>("discharge_1002");
    discharge->setFocus();
    discharge->selectAll();
    QTest::keyClicks(discharge, "12.5");
    EXPECT_EQ(globals.G_discharge, 0);
    document.UpdateAllViews(nullptr, CKsDoc::StoreHint); // a save with the field still open
    EXPECT_EQ(globals.G_discharge, 12.5);
    EXPECT_TRUE(document.IsModified());
    QTest::keyClick(discharge, Qt::Key_Z, Qt::ControlModifier);
    EXPECT_EQ(globals.G_discharge, 0) << "with nothing typed, undo is the document's";
    EXPECT_EQ(discharge->text(), "0");
    discharge->selectAll();
    QTest::keyClicks(discharge, "x");
    EXPECT_FALSE(view->page->OnKillActive()) << "nothing typed is lost";
    EXPECT_EQ(boxes, QStringList{"Invalid floating point number!"});
    EXPECT_TRUE(discharge->hasFocus());
    EXPECT_EQ(discharge->text(), "x");
}

TEST_F(InitPageTest, LocationsOfOtherEditors)
{
    Add("A", 1, 2, 3);
    auto& page = Open(MakeInitPage);
    page.InsertLocation("side", "12.5");
    EXPECT_EQ(Texts(2), "SIDE|12|0.000|0.000");
    EXPECT_EQ(init.GetAt(1).Chainage, 12.5);
    document.UndoStack().undo();
    EXPECT_EQ(init.GetCount(), 1u) << "one step";
    page.InsertLocation("side", "far");
    EXPECT_EQ(init.GetCount(), 1u);
    EXPECT_EQ(boxes.size(), 1);
    grid->Model()->setData(grid->Model()->index(0, 2), "9", Qt::EditRole);
    const auto record = page.GetRecordAt(1);
    ASSERT_TRUE(record);
    const auto& initial = dynamic_cast<const HD_Initial&>(*record);
    EXPECT_EQ(initial.RiverName, "A");
    EXPECT_EQ(initial.InitialH, 9) << "as the row shows it";
    EXPECT_EQ(initial.InitialQ, 3);
    EXPECT_EQ(page.GetRecordAt(0), nullptr);
    EXPECT_EQ(page.GetRecordAt(2), nullptr);
}

TEST_F(InitPageTest, ReachableByKeyboardAndByName)
{
    Open(MakeInitPage);
    const char* order[] = {"level_1201", "levelOrDepth_1001", "discharge_1002", "grid_1003"};
    Find(order[0])->setFocus();
    for (const char* name : order) {
        EXPECT_EQ(QApplication::focusWidget()->objectName(), name);
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
    }
    for (const char* label : {"label_1001", "label_1002"})
        EXPECT_TRUE(Find<QLabel>(label)->buddy()) << label;
    EXPECT_EQ(grid->accessibleName(), "Local Values");
}
