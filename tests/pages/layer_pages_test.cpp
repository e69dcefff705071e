// The page of reach lengths, which shares a switch with that of the quasi-steady solver.
#include "flow_page_fixture.h"
#include "pages/page_table.h"

#include "module/sheet.h"

#include <QAbstractButton>
#include <QCheckBox>

using ReachLengthTest = FlowPagesTest;

TEST_F(ReachLengthTest, ReachLengthsShowWithTheEnergyEquation)
{
    auto& list = document.Parameters().QSSReachLengthsList;
    auto& record = list.Add();
    record.RiverName = "A";
    record.Chainage = 10;
    Open(MakeReachLengthPage);
    auto* uses = Find<QCheckBox>(1187);
    auto* load = Find<QAbstractButton>(1104);
    const auto shown = [&](bool expected) {
        EXPECT_EQ(uses->isChecked(), expected);
        EXPECT_EQ(globals.EnergyEquation, expected);
        EXPECT_EQ(grid->isVisible(), expected);
        EXPECT_EQ(load->isVisible(), expected);
        EXPECT_EQ(view->linesMenu, expected);
        EXPECT_EQ(list.GetCount(), 1u);
        EXPECT_LT(uses->y(), 60) << "the box stays at the top";
    };
    shown(false);
    EXPECT_FALSE(document.IsModified());
    uses->click();
    shown(true);
    EXPECT_TRUE(document.IsModified());
    EXPECT_EQ(Texts(1), "A|10|0.000|0.000");
    load->click();
    EXPECT_EQ(boxes.size(), 1) << "the document belongs to no project";
    uses->click();
    shown(false);
    view->page->UndoRedo(true);
    shown(true);
    EXPECT_EQ(Texts(1), "A|10|0.000|0.000");
}

TEST_F(ReachLengthTest, TheEnergyEquationIsTheQuasiSteadyPagesToo)
{
    CDlgPropertySheet sheet(nullptr);
    sheet.AddPage(Str::QuasiCaption, [this] { return MakeQuasiPage(&document); });
    sheet.AddPage(Str::ReachLengthCaption, [this] { return MakeReachLengthPage(&document); });
    sheet.show();
    sheet.activateWindow();
    ASSERT_TRUE(QTest::qWaitForWindowActive(&sheet));
    for (const int tab : {0, 1, 1, 0, 0, 1}) {
        ASSERT_TRUE(sheet.SetActivePage(tab));
        auto* page = sheet.ActivePage();
        page->OnSetActive();
        auto* uses = page->findChild<QCheckBox*>("energyEquation_1187");
        EXPECT_EQ(uses->isChecked(), globals.EnergyEquation);
        EXPECT_EQ(page->GetGrid()->isVisibleTo(page), globals.EnergyEquation);
        const bool before = globals.EnergyEquation;
        uses->click();
        EXPECT_EQ(globals.EnergyEquation, !before);
    }
}
