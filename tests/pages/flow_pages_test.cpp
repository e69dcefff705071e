// The pages of wind, numerical scheme, heat balance, stratification, leakage, flood plains and water loss.
#include "flow_page_fixture.h"
#include "pages/page_table.h"

#include "ks/units/edit_fields.h"
#include "module/sheet.h"

#include <QCheckBox>
#include <QGroupBox>

TEST_F(FlowPagesTest, ControlsChangeTheirKeywords)
{
    Open(MakeWindPage);
    EachChangesItsKeyword({{1159, " ", "wind_shear_stress = true"},
                           {1004, "0.875", "G_wind_factor = 0.875"},
                           {1006, "0.003", "G_friction_factor = 0.003"}});
    Open(MakeDefaultPage);
    EachChangesItsKeyword({{1012, "0.75", "delta = 0.75"},
                           {1013, "0.0125", "delhs = 0.0125"},
                           {1014, "0.25", "delh = 0.25"},
                           {1015, "1.5", "alpha = 1.5"},
                           {1016, "0.5", "theta = 0.5"},
                           {1017, "0.25", "eps = 0.25"},
                           {1018, "0.125", "dh_node = 0.125"},
                           {1019, "0.5", "zeta_min = 0.5"},
                           {1020, "0.5", "struc_fac = 0.5"},
                           {1021, "-11", "inter1_max = -11"},
                           {1024, "3", "no_iter = 3"},
                           {1026, "2147483647", "max_iter = 2147483647"},
                           {1027, "0.75", "froude_max = 0.75"},
                           {1028, "2", "froude_exp = 2"}});
    Open(MakeHeatBalancePage);
    EachChangesItsKeyword({{1148, " ", "Calc = true"},
                           {1149, "-33.5", "Latitude = -33.5"},
                           {1150, "12.25", "Longitude = 12.25"},
                           {1151, "15", "TimeZone = 15"},
                           {1152, "0.5", "DisTime = 0.5"},
                           {1153, "2.5", "LightAtt = 2.5"},
                           {1154, "0.25", "betaBeer = 0.25"},
                           {1155, "0.375", "RadA = 0.375"},
                           {1156, "0.625", "RadB = 0.625"},
                           {1157, "1.25", "VapA = 1.25"},
                           {1158, "1.5", "VapB = 1.5"}});
    Open(MakeStratificationPage);
    EachChangesItsKeyword({{1175, "12", "npv = 12"},
                           {1176, "0.25", "visc = 0.25"},
                           {1177, "up", "vmf = 2"},
                           {1179, " ", "Rich = false"},
                           {1148, " ", "dens = false"},
                           {1180, "0.5", "bpr1 = 0.5"},
                           {1181, "0.25", "bpr2 = 0.25"},
                           {1184, "0.625", "uu = 0.625"},
                           {1185, "0.75", "uw = 0.75"},
                           {1186, "0.875", "uwc = 0.875"},
                           {1182, "1.25", "dfx = 1.25"},
                           {1183, "1.5", "dfz = 1.5"}});
    Open(MakeLeakagePage);
    EachChangesItsKeyword({{1228, " ", "IncludeLeakage = true"}, {1238, "4e-07", "LeakageCoefficient = 4e-07"}});
    Open(MakeFloodPage);
    EachChangesItsKeyword({{1040, "25", "G_flood_plan_res = 25"}});
}

TEST_F(FlowPagesTest, ControlsShowTheDefaults)
{
    globals.struc_fac = 0.26;
    Open(MakeDefaultPage);
    const std::pair<int, const char*> shown[] = {{1012, "0.5"}, {1013, "0.01"}, {1016, "1"},  {1017, "0.0001"},
                                                 {1020, "0.3"}, {1021, "10"},   {1027, "-1"}, {1024, "1"}};
    for (const auto& [number, text] : shown)
        EXPECT_EQ(Find<QLineEdit>(number)->text(), text) << number;
    EXPECT_TRUE(view->page->OnKillActive());
    EXPECT_EQ(globals.struc_fac, 0.26) << "whatever is shown of it";
    // In US customary units lengths show in feet; a Delta is a ratio.
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    EXPECT_EQ(Find<QLineEdit>(1014)->text(), "0.328");
    EXPECT_EQ(Find<QLineEdit>(1012)->text(), "0.5");
    EXPECT_EQ(view->page->findChild<QLabel*>("unit_1014")->text(), "ft");
    TypeInto(1014, "1");
    EXPECT_EQ(globals.delh, 0.3048);
    EXPECT_EQ(globals.delhs, 0.01);
}

TEST_F(FlowPagesTest, Ranges)
{
    Open(MakeDefaultPage);
    const struct
    {
        int control;
        const char* typed;
        double& value;
        bool taken;
    } cases[] = {
        {1012, "0.49", globals.delta, false},    {1012, "1.01", globals.delta, false},
        {1012, "1", globals.delta, true},        {1012, "0.5", globals.delta, true},
        {1019, "-0.1", globals.zeta_min, false}, {1019, "0", globals.zeta_min, true},
        {1019, "1e9", globals.zeta_min, true},
    };
    for (const auto& c : cases) {
        SCOPED_TRACE(c.typed);
        boxes.clear();
        const double before = c.value;
        TypeInto(c.control, c.typed);
        EXPECT_EQ(boxes, c.taken ? QStringList() : QStringList("Floating-point value is out of range"));
        EXPECT_EQ(c.value, c.taken ? std::atof(c.typed) : before);
        QTest::qWait(0);
        if (!c.taken)
            QTest::keyClick(Find(c.control), Qt::Key_Escape);
    }
}

TEST_F(FlowPagesTest, AWrongIntegerKeepsThePage)
{
    Open(MakeDefaultPage);
    for (const char* wrong : {"x", "1.5", "2147483648", "-", ""}) {
        SCOPED_TRACE(wrong);
        boxes.clear();
        auto* field = Find<QLineEdit>(1026);
        field->setFocus();
        field->selectAll();
        QTest::keyClicks(field, wrong);
        if (!*wrong)
            QTest::keyClick(field, Qt::Key_Delete);
        EXPECT_FALSE(view->page->OnKillActive());
        EXPECT_EQ(boxes.size(), 1);
        EXPECT_TRUE(field->hasFocus());
        EXPECT_EQ(globals.max_iter, 100);
    }
    TypeInto(1026, "101");
    EXPECT_TRUE(view->page->OnKillActive());
    EXPECT_EQ(globals.max_iter, 101);
}

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

TEST_F(FlowPagesTest, TablesShowTheirFields)
{
    auto& all = document.Parameters();
    const auto at = [](auto& record) -> auto&
    {
        record.RiverName = "A";
        record.Chainage = 1500.6;
        return record;
    };
    at(all.WindList.Add()).WindFactor = 0.12345;
    at(all.FloodList.Add()).FloodPlainResistance = 12.5;
    auto& loss = at(all.WaterList.Add());
    loss.WaterLoss1 = 0.0052;
    loss.WaterLoss4 = 4;
    const QStringList location{"River Name", "Chainage"};
    Open(MakeWindPage);
    EXPECT_EQ(Headers(), location + QStringList{"Topographical factor"});
    EXPECT_EQ(Texts(1), "A|1501|0.123");
    Open(MakeFloodPage);
    EXPECT_EQ(Headers(), location + QStringList{"Flood Pl. Res"});
    EXPECT_EQ(Texts(1), "A|1501|12.500");
    Open(MakeLossPage);
    EXPECT_EQ(Headers(), location + QStringList({"Water Loss 1", "Water Loss 2", "Water Loss 3", "Water Loss 4"}));
    EXPECT_EQ(Texts(1), "A|1501|0.0052|0|0|4");
    Enter(1, 5, "2.5");
    EXPECT_EQ(loss.WaterLoss3, 2.5);
    const auto record = view->page->GetRecordAt(1);
    EXPECT_EQ(dynamic_cast<HD_Waterloss&>(*record).WaterLoss3, 2.5);
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
