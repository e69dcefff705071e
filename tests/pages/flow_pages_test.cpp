// The pages of wind, numerical scheme, heat balance, stratification, leakage and flood plains.
#include "flow_page_fixture.h"
#include "pages/page_table.h"

#include "ks/units/edit_fields.h"
#include "module/sheet.h"

#include <QCheckBox>
#include <QGroupBox>

TEST_F(FlowPagesTest, TheSheetStaysOnAPageWithAWrongEntry)
{
    CDlgPropertySheet sheet(nullptr);
    sheet.AddPage(Str::DefaultCaption, [this] { return MakeDefaultPage(&document); });
    sheet.AddPage(Str::HeatBalanceCaption, [this] { return MakeHeatBalancePage(&document); });
    sheet.show();
    sheet.activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&sheet));
    sheet.ActivePage()->OnSetActive();
    QTest::qWait(1); // the page is laid out
    const std::pair<const char*, const char*> entries[] = {{"noIter_1024", "x"}, {"delta_1012", "7"}};
    for (const auto& [name, wrong] : entries) {
        SCOPED_TRACE(name);
        boxes.clear();
        auto* field = sheet.findChild<QLineEdit*>(name);
        field->setFocus();
        field->selectAll();
        QTest::keyClicks(field, wrong);
        EXPECT_FALSE(sheet.SetActivePage(1));
        EXPECT_EQ(sheet.currentIndex(), 0);
        EXPECT_EQ(boxes.size(), 1);
        EXPECT_TRUE(field->hasFocus());
        EXPECT_EQ(field->text(), wrong);
        QTest::qWait(0);
        field->selectAll();
        QTest::keyClicks(field, "1");
        EXPECT_TRUE(sheet.SetActivePage(1));
        EXPECT_TRUE(sheet.SetActivePage(0));
    }
    EXPECT_EQ(globals.delta, 1);
    EXPECT_EQ(globals.no_iter, 1);
}

TEST_F(FlowPagesTest, TheOnlyNodeCompatibilityIsWaterLevel)
{
    Open(MakeDefaultPage);
    EXPECT_FALSE(view->linesMenu);
    const QStringList before = Lines();
    auto* list = Find<QComboBox>(1025);
    EXPECT_EQ(list->currentText(), "Water Level");
    list->setFocus();
    QTest::keyClick(list, Qt::Key_Down);
    EXPECT_EQ(list->currentText(), "(Energy - Not Avail.)");
    EXPECT_TRUE(view->page->OnKillActive());
    EXPECT_EQ(Lines(), before);
    EXPECT_FALSE(document.IsModified());
    view->page->OnSetActive();
    EXPECT_EQ(list->currentText(), "Water Level");
}

TEST_F(FlowPagesTest, HeatBalanceIsEnabledAsAWhole)
{
    Open(MakeHeatBalancePage);
    const auto enabled = [&] {
        QStringList names;
        for (QWidget* widget : view->page->findChildren<QWidget*>())
            if (widget->isEnabled())
                names << widget->objectName();
        return names;
    };
    EXPECT_EQ(enabled(), QStringList({"heatBalance", "included_1148"}));
    Find<QCheckBox>(1148)->click();
    EXPECT_EQ(enabled().size(), view->page->findChildren<QWidget*>().size());
    EXPECT_TRUE(document.IsModified());
    TypeInto(1149, "12");
    Find<QCheckBox>(1148)->click();
    EXPECT_EQ(enabled(), QStringList({"heatBalance", "included_1148"}));
    EXPECT_EQ(Find<QLineEdit>(1149)->text(), "12");
    EXPECT_EQ(globals.HeatBalance.Latitude, 12);
}

TEST_F(FlowPagesTest, Stratification)
{
    globals.Stratification.vmf = 1;
    globals.Stratification.vmb = 7;
    Open(MakeStratificationPage);
    EXPECT_EQ(Find<QComboBox>(1177)->currentText(), "mixing-length");
    auto* bed = Find<QComboBox>(1178);
    EXPECT_EQ(bed->currentText(), "7") << "a model that this list does not name";
    auto* densities = Find<QCheckBox>(1148);
    auto* richardson = Find<QCheckBox>(1179);
    densities->click();
    EXPECT_FALSE(richardson->isEnabled());
    EXPECT_TRUE(richardson->isChecked());
    EXPECT_TRUE(globals.Stratification.Rich);
    EXPECT_EQ(globals.Stratification.vmb, 7);
    bed->setFocus();
    QTest::keyClick(bed, Qt::Key_Home);
    EXPECT_EQ(globals.Stratification.vmb, 0);
    EXPECT_EQ(bed->count(), 1);
    densities->click();
    EXPECT_TRUE(richardson->isEnabled());
}

TEST_F(FlowPagesTest, LeakageShowsItsTableWhenIncluded)
{
    auto& list = document.Parameters().LeakageList;
    Open(MakeLeakagePage);
    EXPECT_FALSE(grid->isVisible());
    EXPECT_FALSE(view->linesMenu);
    EXPECT_FALSE(Find(1238)->isEnabled());
    EXPECT_EQ(Texts(1), "||0") << "a blank line to type into";
    EXPECT_TRUE(list.IsEmpty());
    EXPECT_FALSE(document.IsModified());

    Find<QCheckBox>(1228)->click();
    EXPECT_TRUE(grid->isVisible());
    EXPECT_TRUE(view->linesMenu);
    EXPECT_TRUE(Find(1238)->isEnabled());
    Enter(1, 1, "main");
    Enter(1, 3, "4.2e-07");
    EXPECT_EQ(Texts(1), "MAIN||4.2e-07");
    grid->SetCurrentCell(1, grid->ColumnCount());
    QTest::keyClick(grid, Qt::Key_Tab);
    EXPECT_EQ(list.GetCount(), 2u) << "behind the last cell a new line";
    Enter(1, 3, "");
    EXPECT_EQ(list.GetAt(0).LeakageCoefficient, 0);
    EXPECT_EQ(list.GetAt(0).Chainage, NotGiven);
    list.GetAt(1).LeakageCoefficient = 0.5;
    SelectRows(1, 1);
    view->page->DeleteLines();
    ASSERT_EQ(list.GetCount(), 1u);
    EXPECT_EQ(list.GetAt(0).LeakageCoefficient, 0.5);

    Find<QCheckBox>(1228)->click();
    EXPECT_FALSE(grid->isVisible());
    EXPECT_FALSE(view->linesMenu);
    EXPECT_EQ(list.GetCount(), 1u);
    view->page->UndoRedo(true);
    EXPECT_TRUE(grid->isVisible());
}

TEST_F(FlowPagesTest, WhatBlankCellsBecome)
{
    auto& all = document.Parameters();
    globals.G_wind_factor = 0.75;
    Open(MakeWindPage);
    EXPECT_EQ(Texts(1), "||0.750") << "an empty list shows a line with the global factor";
    Type(1, 3, "");
    EXPECT_TRUE(view->page->OnKillActive());
    EXPECT_TRUE(all.WindList.IsEmpty()) << "it holds what it held";
    Enter(1, 2, "5");
    Type(1, 3, "");
    EXPECT_TRUE(view->page->OnKillActive());
    EXPECT_EQ(all.WindList.GetAt(0).WindFactor, 0.75);
    EXPECT_EQ(all.WindList.GetAt(0).RiverName, "");
    Enter(1, 3, "2");
    TypeInto(1004, "1.");
    EXPECT_FALSE(view->page->OnKillActive()) << "the field keeps what was typed, and the focus";
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Escape);
    EXPECT_TRUE(view->page->OnKillActive());
    EXPECT_EQ(globals.G_wind_factor, 0.75);

    Open(MakeFloodPage);
    EXPECT_EQ(Find<QLineEdit>(1040)->text(), "-99");
    EXPECT_EQ(grid->RowCount(), 1);
    Enter(1, 3, "25");
    EXPECT_EQ(all.FloodList.GetAt(0).FloodPlainResistance, 25);
    Enter(1, 3, "");
    EXPECT_TRUE(view->page->OnKillActive());
    EXPECT_EQ(all.FloodList.GetAt(0).FloodPlainResistance, 0);
    EXPECT_EQ(all.FloodList.GetAt(0).Chainage, NotGiven);
}
