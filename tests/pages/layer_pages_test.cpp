// The pages of the two-layer model and of reach lengths.
#include "flow_page_fixture.h"
#include "pages/page_table.h"

#include "module/sheet.h"

#include <QAbstractButton>
#include <QCheckBox>
#include <QTemporaryDir>
#include <QTranslator>

namespace {

/// A language whose words stand in brackets.
class Brackets : public QTranslator
{
public:
    bool isEmpty() const override { return false; }
    QString translate(const char*, const char* text, const char*, int) const override
    {
        return QString("[%1]").arg(text);
    }
};

} // namespace

using LayerPagesTest = FlowPagesTest;

TEST_F(LayerPagesTest, ControlsChangeTheirKeywords)
{
    Open(MakeKlrParamPage);
    globals.Klr.action = 1;
    view->page->LoadFromDocument(&document);
    EachChangesItsKeyword({{1006, "0.004", "fricfac = 0.004"},
                           {1153, "250", "maxvol = 250"},
                           {1154, "0.0125", "maxvelo = 0.0125"},
                           {1155, "0.25", "minthick = 0.25"},
                           {1156, "0.002", "densdiff = 0.002"},
                           {1182, "up", "action = 0"},
                           {1157, "0.0625", "R1 = 0.0625"},
                           {1158, "0.075", "R2 = 0.075"},
                           {1159, "0.175", "Rs = 0.175"}});
    EXPECT_EQ(view->page->findChild<QLabel*>("label_1158")->text().remove('&'), "R1 downward entrainment");
    Open(MakeKlrInitPage);
    EachChangesItsKeyword({{1183, "12.5", "h1 = 12.5"},
                           {1184, "-3.25", "h0 = -3.25"},
                           {1185, "12345.678", "Q1 = 12345.678"},
                           {1161, "1e-05", "Q0 = 1e-05"}});
    EXPECT_EQ(Find<QLineEdit>(1185)->text(), "12345.678");
    EXPECT_EQ(globals.G_friction_factor, 0.0024) << "of the same section, but of another page";
    Open(MakeReachLengthPage);
    globals.FrictionSlope = 3;
    EachChangesItsKeyword({{1187, " ", "EnergyEquation = true, 3"}});
}

TEST_F(LayerPagesTest, UnitsAndActions)
{
    const std::pair<int, const char*> actions[] = {
        {0, "Nothing"}, {1, "Moving interface up"}, {2, "Moving interface down"}, {7, "7"}, {-1, "-1"}};
    for (const auto& [action, text] : actions) {
        globals.Klr.action = action;
        Open(MakeKlrParamPage);
        EXPECT_EQ(Find<QComboBox>(1182)->currentText(), text);
    }
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    const struct
    {
        int control;
        const char *text, *unit;
    } shown[] = {{1153, "3531.4667", "ft³"}, {1154, "0.0295276", "ft/s"}, {1155, "0.0328084", "ft"}};
    for (const auto& s : shown) {
        EXPECT_EQ(Find<QLineEdit>(s.control)->text(), s.text);
        EXPECT_EQ(view->page->findChild<QLabel*>(QString("unit_%1").arg(s.control))->text(), s.unit);
    }
    EXPECT_EQ(Find<QLineEdit>(1157)->text(), "0.05");
    TypeInto(1155, "1");
    EXPECT_EQ(globals.Klr.minthick, 0.3048);
}

TEST_F(LayerPagesTest, AnEmptyTableShowsOneLineThatIsSavedOnceItIsEdited)
{
    QTemporaryDir folder;
    const auto visit = [&](auto list, const char* defaults, auto value) {
        SCOPED_TRACE(defaults);
        const auto saved = [&](CKavo0_hdDoc & copy) -> auto&
        {
            EXPECT_TRUE(document.OnSaveDocument(folder.filePath("new.HDKV")));
            EXPECT_TRUE(copy.OnOpenDocument(folder.filePath("new.HDKV")));
            return copy.Parameters().*list;
        };
        ASSERT_EQ(grid->RowCount(), 1);
        EXPECT_EQ(Texts(1), defaults);
        EXPECT_FALSE(document.IsModified());
        CKavo0_hdDoc untouched, edited;
        EXPECT_EQ(saved(untouched).GetCount(), 0u);
        Enter(1, 1, "main");
        Enter(1, 2, "1500.6");
        Enter(1, 4, "0.0375");
        auto& records = saved(edited);
        ASSERT_EQ(records.GetCount(), 1u);
        EXPECT_EQ(records.GetAt(0).RiverName, "MAIN");
        EXPECT_EQ(records.GetAt(0).Chainage, 1500.6);
        EXPECT_EQ(records.GetAt(0).*value, 0.0375);
    };
    using P = HD_Parameters;
    Open(MakeKlrParamPage);
    visit(&P::KlrParamList, "||0.050|0.050", &HDKlrParam::R2);
    Open(MakeKlrInitPage);
    visit(&P::KlrInitList, "||0.000|0.000|0.000|0.000", &HDKlrInit::h0);
    globals.EnergyEquation = true;
    Open(MakeReachLengthPage);
    visit(&P::QSSReachLengthsList, "||0.000|0.000", &HDReachLength::ReachLength2);
}

TEST_F(LayerPagesTest, TablesShowTheirFields)
{
    auto& all = document.Parameters();
    const auto at = [](auto& record) -> auto&
    {
        record.RiverName = "A";
        record.Chainage = 1500.6;
        return record;
    };
    at(all.KlrParamList.Add()).R2 = 0.0425;
    auto& initial = at(all.KlrInitList.Add());
    initial.h1 = 12.5;
    initial.h0 = 3;
    initial.Q1 = 1234.5678;
    initial.Q0 = -1;
    auto& reach = at(all.QSSReachLengthsList.Add());
    reach.ReachLength1 = 105;
    reach.ReachLength2 = 98.5;
    const QStringList location{"River Name", "Chainage"};
    Open(MakeKlrParamPage);
    EXPECT_EQ(Headers(), location + QStringList({"R1", "R2"}));
    EXPECT_EQ(Texts(1), "A|1501|0.050|0.043");
    EXPECT_TRUE(view->linesMenu);
    EXPECT_TRUE(view->page->OnKillActive());
    EXPECT_EQ(all.KlrParamList.GetAt(0).R2, 0.0425) << "whatever is shown of it";
    Open(MakeKlrInitPage);
    EXPECT_EQ(Headers(), location + QStringList({"h1", "h0", "Q1", "Q0"}));
    EXPECT_EQ(Texts(1), "A|1501|12.500|3.000|1234.568|-1.000");
    Enter(1, 5, "7");
    EXPECT_EQ(initial.Q1, 7);
    globals.EnergyEquation = true;
    Open(MakeReachLengthPage);
    EXPECT_EQ(Headers(), location + QStringList({"Left bank", "Right bank"}));
    EXPECT_EQ(Texts(1), "A|1501|105.000|98.500");
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    Enter(1, 3, "1000");
    EXPECT_EQ(reach.ReachLength1, 304.8);
    EXPECT_EQ(reach.ReachLength2, 98.5);
}

TEST_F(LayerPagesTest, ReachLengthsShowWithTheEnergyEquation)
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

TEST_F(LayerPagesTest, TheEnergyEquationIsTheQuasiSteadyPagesToo)
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

TEST_F(LayerPagesTest, TextsFollowTheLanguage)
{
    globals.EnergyEquation = true;
    Brackets language;
    const auto follows = [&](auto text, const char* expected) {
        EXPECT_EQ(text(), expected);
        QCoreApplication::installTranslator(&language);
        QCoreApplication::sendPostedEvents();
        const QString translated = text();
        QCoreApplication::removeTranslator(&language);
        QCoreApplication::sendPostedEvents();
        EXPECT_NE(translated, expected);
        EXPECT_EQ(translated.count('['), QString(expected).count(", ") + 1) << translated.toStdString();
        EXPECT_EQ(text(), expected);
    };
    Open(MakeOutputPage);
    follows([&] { return Find(1037)->accessibleName(); }, "Velocity, H and Q points");
    Open(MakeKlrParamPage);
    follows([&] { return Find<QComboBox>(1182)->itemText(0); }, "Nothing"); // the first of a text of several
    Open(MakeKlrInitPage);
    follows([&] { return Headers().back(); }, "Q0");
    Open(MakeReachLengthPage);
    follows([&] { return Headers().back(); }, "Right bank");
    follows([&] { return Find<QAbstractButton>(1104)->text(); }, "Load &branch and chainages");
}
