// The list of problems of a document: with the pages and the view of the program, and a network that the test answers
// for.
#include "module/exchange_fixture.h"

#include "grid/gen_grid.h"
#include "ks/fc/exchange.h"
#include "problems/problem_check.h"
#include "problems/problem_texts.h"
#include "problems/problems_model.h"
#include "problems/problems_panel.h"

#include <QClipboard>
#include <QElapsedTimer>
#include <QGuiApplication>
#include <QLineEdit>
#include <QPushButton>
#include <QSignalSpy>
#include <QTabBar>
#include <QTableView>
#include <QToolButton>

namespace {

constexpr const char* File = R"([KAVO0_HD]
  [Global_Variables]
    [Defalt_Values]
      delta = 3
    [/Defalt_Values]
    [BedResistTools]
      BRTools = 0, true, true, true, 2, 3, 30, 2, 20, 0, 0, 0, 0
    [/BedResistTools]
    [MapOutput]
      GenerateOutput = true
      [MapOutputFiles]
        data = 0, 0, 0, 100, 1, 1, 0, <m.kvt2>, 7, 1, 0, 1, true, 2020, 1, 1, 0, 0, 0, 2020, 1, 1, 0, 0, 0
      [/MapOutputFiles]
    [/MapOutput]
  [/Global_Variables]
  [InitList]
    DATA = "MAIN", 100, 2, 10
    DATA = "MAIN", 100, 2, 10
    DATA = "", 200, 1, 1
  [/InitList]
  [WaveList]
    DATA = "MAIN", 300, 250, 2
  [/WaveList]
  [BedResistanceToolboxList]
    DATA = "MAIN", 100, 1, 1, 10, 20, 2, 1, 30, 1, 20
  [/BedResistanceToolboxList]
  [WLSandBarsList]
    DATA = "OTHER", 100, 0.1, 10, 10, 0.1
  [/WLSandBarsList]
[/KAVO0_HD]
)";

class ProblemsTest : public ExchangeTest
{
protected:
    ProblemsTest()
    {
        projectHandle = 7;
        answerShell = [this](unsigned message, WPARAM request, CKSComm_Package& package, LRESULT otherwise) -> LRESULT {
            if (message != KsMessage::SwitchBoard() || request != KsRequest::Branches || !package.objects)
                return otherwise;
            ++asked;
            for (const char* name : branches) {
                auto item = std::make_unique<CKvrCBEBranch>();
                item->name = QString::fromLatin1(name);
                item->start = 1000;
                package.objects->push_back(std::move(item));
            }
            return !branches.empty();
        };
        Write(Path("a.hdkv"), File);
        view = Open(Path("a.hdkv"));
        EXPECT_TRUE(view);
        ExpectCheck();
        model.Add(*view->Problems());
    }

    /// Waits until a check has come to its end.
    void ExpectCheck()
    {
        QElapsedTimer time;
        for (time.start(); !view->Problems() && time.elapsed() < 5000;)
            QCoreApplication::processEvents(QEventLoop::AllEvents, 20);
        ASSERT_TRUE(view->Problems());
        QSignalSpy spy(view->Problems(), &CProblemCheck::Changed);
        EXPECT_TRUE(spy.wait(5000));
    }

    /// "code page line field" of each row that is listed.
    std::string Rows(const QAbstractItemModel& rows) const
    {
        QStringList texts;
        for (int row = 0; row < rows.rowCount(); ++row) {
            const auto text = [&](int column) { return rows.index(row, column).data().toString(); };
            texts << QStringLiteral("%1 %2 %3 %4")
                         .arg(text(CProblemsModel::Code), text(CProblemsModel::Page), text(CProblemsModel::Line),
                              text(CProblemsModel::FieldName));
        }
        return texts.join("; ").toStdString();
    }
    const Problem& Find(const char* code) const
    {
        for (const Problem& problem : view->Problems()->Found())
            if (!std::strcmp(RuleOf(problem.rule).code, code))
                return problem;
        ADD_FAILURE() << code;
        std::abort();
    }
    QString Focus() const { return view->Sheet()->tabText(view->Sheet()->currentIndex()); }

    std::vector<const char*> branches{"Main"};
    int asked = 0;
    CProblemsModel model{nullptr};
    CKavo0_hdView* view = nullptr;
};

} // namespace

TEST_F(ProblemsTest, SayWhereTheyAreAsTheUserCallsIt)
{
    EXPECT_EQ(Rows(model), "HD302 Default Values  Delta; HD303 Maps 1 Type; HD307 Bed Resist. Toolbox 2 Velocity; "
                           "HD104 Initial 2 Chainage; HD101 Initial 3 River Name; HD201 Wave Approx 1 DnStr. Chainage; "
                           "HD307 Bed Resist. Toolbox 1 Velocity; HD105 W. L. Incr. - Sand Bars 2 River Name")
        << "the sand bars' first line is that of the global values";
    EXPECT_EQ(model.index(7, 0).data().toString(), "The network has no branch OTHER");
    EXPECT_EQ(model.Count(Severity::Error), 3u);
}

TEST_F(ProblemsTest, LeadToTheirPlaces)
{
    const struct
    {
        const char *code, *page;
        int row, column;
    } cases[] = {{"HD104", "Initial", 2, 2},
                 {"HD101", "Initial", 3, 1},
                 {"HD201", "Wave Approx", 1, 3},
                 {"HD105", "W. L. Incr. - Sand Bars", 2, 1}};
    for (const auto& c : cases) {
        view->ShowProblem(Find(c.code).place);
        EXPECT_EQ(Focus(), c.page);
        const CGenGrid& grid = *view->ActivePage()->GetGrid();
        EXPECT_EQ(grid.CurrentRow(), c.row) << c.code;
        EXPECT_EQ(grid.currentIndex().column() + 1, c.column) << c.code;
    }
    view->ShowProblem(Find("HD302").place);
    EXPECT_EQ(Focus(), "Default Values");
}

TEST_F(ProblemsTest, AreMendedAsOneStepToUndo)
{
    const int steps = view->GetDocument()->UndoStack().count();
    view->Mend(Find("HD104"));
    EXPECT_EQ(Parameters(*view).InitList.GetCount(), 2u);
    ExpectCheck();
    view->Mend(Find("HD201"));
    const HD_Wavetype& reach = Parameters(*view).WaveList.GetAt(0);
    EXPECT_EQ(reach.Chainage, 250);
    EXPECT_EQ(reach.DownstreamChainage, 300);
    EXPECT_EQ(view->GetDocument()->UndoStack().count(), steps + 2);
    ExpectCheck();
    EXPECT_EQ(model.rowCount(), 6);
    view->GetDocument()->UndoStack().undo();
    EXPECT_EQ(reach.Chainage, 300);
    view->GetDocument()->UndoStack().undo();
    ExpectCheck();
    EXPECT_EQ(model.rowCount(), 8);
}

// The list is as old as the last check: a second click on the button would mean another line.
TEST_F(ProblemsTest, AreMendedOnlyAsLongAsTheyAreWhatThereIs)
{
    const Problem problem = Find("HD104");
    view->Mend(problem);
    view->Mend(problem);
    EXPECT_EQ(Parameters(*view).InitList.GetCount(), 2u);
}

TEST_F(ProblemsTest, FollowTheNetwork)
{
    EXPECT_EQ(asked, 1);
    branches = {"MAIN", "OTHER"};
    view->GetDocument()->UndoStack().push(new QUndoCommand);
    ExpectCheck();
    EXPECT_EQ(asked, 1) << "a change of the document is none of the network";
    CKSComm_Package news;
    CObList none;
    news.objects = &none;
    KsSendMessage(view, KsMessage::BetweenEditors(), KsRequest::DataChanged, reinterpret_cast<LPARAM>(&news));
    ExpectCheck();
    EXPECT_EQ(model.rowCount(), 7);
    branches.clear();
    KsSendMessage(view, KsMessage::BetweenEditors(), KsRequest::DataChanged, reinterpret_cast<LPARAM>(&news));
    ExpectCheck();
    EXPECT_EQ(model.rowCount(), 7) << "without a network nothing is said about branches";
}

TEST_F(ProblemsTest, AreMarkedAtLinesAndTabs)
{
    const auto& sheet = *view->Sheet();
    const CGridModel& initial = *view->Sheet()->PageAt(0)->GetGrid()->Model();
    EXPECT_FALSE(initial.NoteOf(0));
    ASSERT_TRUE(initial.NoteOf(1) && initial.NoteOf(2));
    for (int tab = 0; tab < sheet.count(); ++tab)
        if (sheet.tabText(tab).endsWith("Sand Bars")) {
            const CGridModel& bars = *view->Sheet()->PageAt(tab)->GetGrid()->Model();
            EXPECT_TRUE(!bars.NoteOf(0) && bars.NoteOf(1)) << "behind the line of the global values";
        }
    EXPECT_EQ(initial.headerData(1, Qt::Vertical, Qt::ToolTipRole).toString(), "Line 1 is the same");
    EXPECT_EQ(sheet.tabToolTip(0), "1 warning, 1 note");
    EXPECT_FALSE(sheet.tabIcon(0).isNull());
    EXPECT_TRUE(sheet.tabIcon(1).isNull());
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    const CGridModel& reaches = *view->Sheet()->PageAt(4)->GetGrid()->Model();
    EXPECT_TRUE(reaches.headerData(0, Qt::Vertical, Qt::ToolTipRole).toString().contains("ft"))
        << "in the units of now";
    KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
    ExpectCheck(); // the pages have shown the document again
    view->Mend(Find("HD104"));
    ExpectCheck();
    EXPECT_EQ(sheet.tabToolTip(0), "1 warning");
    EXPECT_FALSE(initial.NoteOf(2));
}

// Five times as many keys as there are slices: none of them waits long.
TEST_F(ProblemsTest, HoldNoKeyUp)
{
    auto& list = Parameters(*view).InitList;
    for (int i = 0; i < 300'000; ++i) {
        HD_Initial& record = list.Add();
        record.RiverName = "MAIN";
        record.Chainage = i / 1000.0;
    }
    view->Problems()->Restart();
    QSignalSpy spy(view->Problems(), &CProblemCheck::Changed);
    qint64 longest = 0;
    int turns = 0;
    QElapsedTimer all;
    all.start();
    for (QElapsedTimer turn; spy.isEmpty() && all.elapsed() < 20'000; ++turns) {
        turn.start();
        QCoreApplication::processEvents();
        if (spy.isEmpty()) // what follows is shown
            longest = std::max(longest, turn.elapsed());
    }
    EXPECT_EQ(spy.count(), 1);
    EXPECT_GT(turns, 10);
    EXPECT_LT(longest, 100) << "of a few milliseconds each, on a busy machine";
}

TEST_F(ProblemsTest, ListNarrowsDownCopiesAndMends)
{
    CProblemsPanel panel(model, nullptr);
    panel.resize(900, 300);
    panel.show();
    auto& table = *panel.findChild<QTableView*>();
    auto& rows = *table.model();
    EXPECT_EQ(panel.Summary(), "3 errors, 4 warnings, 1 note");
    EXPECT_TRUE(Rows(rows).starts_with("HD302")) << "errors first";
    EXPECT_TRUE(Rows(rows).ends_with("HD104 Initial 2 Chainage"));
    const auto switches = panel.findChildren<QToolButton*>(Qt::FindDirectChildrenOnly);
    switches[0]->click();
    EXPECT_EQ(rows.rowCount(), 5);
    panel.findChild<QLineEdit*>()->setText("initial chain");
    EXPECT_EQ(Rows(rows), "HD104 Initial 2 Chainage");
    table.selectRow(0);
    QKeyEvent copy(QEvent::KeyPress, Qt::Key_C, Qt::ControlModifier);
    QCoreApplication::sendEvent(&table, &copy);
    EXPECT_EQ(QGuiApplication::clipboard()->text(), "Problem\tPage\tLine\tField\tDocument\tCode\n"
                                                    "Line 1 is the same\tInitial\t2\tChainage\ta.hdkv\tHD104\n");
    auto* mend = panel.findChild<QPushButton*>();
    EXPECT_EQ(mend->text(), "Remove the line");
    mend->click();
    EXPECT_EQ(Parameters(*view).InitList.GetCount(), 2u);
    ExpectCheck();
    EXPECT_EQ(rows.rowCount(), 0);
    EXPECT_FALSE(mend->isVisibleTo(&panel));

    panel.findChild<QLineEdit*>()->clear();
    switches[0]->click();
    panel.Step(false);
    EXPECT_EQ(table.currentIndex().row(), rows.rowCount() - 1) << "none was chosen";
    panel.Step(true);
    EXPECT_EQ(table.currentIndex().row(), 0);
    EXPECT_EQ(Focus(), "Default Values");
    panel.Step(true);
    panel.Step(false);
    panel.Step(false);
    EXPECT_EQ(table.currentIndex().row(), rows.rowCount() - 1) << "around the end";
}

// Until a save has written what is shown.
TEST_F(ProblemsTest, ListWhatTheFileSaysOtherwise)
{
    QByteArray text = File;
    Write(Path("b.hdkv"), text.replace("delta = 3", "delta = \"x\""));
    view = Open(Path("b.hdkv"));
    ExpectCheck();
    CProblemsModel rows(nullptr);
    rows.Add(*view->Problems());
    EXPECT_TRUE(Rows(rows).starts_with("HD005 Defalt_Values 4 of the file delta; HD303 Maps")) << Rows(rows);
    EXPECT_EQ(rows.index(0, 0).data().toString(), "Expected: a number; in the file: \"x\"; used instead: 0.5");
    EXPECT_EQ(rows.Count(Severity::Error), 3u);
    answer = QMessageBox::Yes; // without the line that has no branch
    ASSERT_TRUE(view->GetDocument()->DoSave(Path("b.hdkv")));
    ExpectCheck();
    EXPECT_TRUE(Rows(rows).starts_with("HD303 Maps")) << Rows(rows);
}

TEST_F(ProblemsTest, GoWithTheirDocument)
{
    CProblemsPanel panel(model, nullptr);
    delete CKsMDIChildWnd::Of(std::exchange(view, nullptr));
    EXPECT_EQ(model.rowCount(), 0);
    EXPECT_EQ(panel.Summary(), "");
}

TEST(ProblemTexts, StandInTheUsersUnits)
{
    Problem problem{RuleId::BeyondBranch,
                    {},
                    {Amount{304.8, UnitGroup::Chainage}, std::string("%3"), Amount{0, UnitGroup::Chainage},
                     Amount{30.48, UnitGroup::Chainage}}};
    EXPECT_EQ(ProblemTexts::TextOf(problem),
              u"304.8\u00A0m does not lie on branch %3, which runs from 0\u00A0m to 30.48\u00A0m");
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    EXPECT_EQ(ProblemTexts::TextOf(problem),
              u"1000\u00A0ft does not lie on branch %3, which runs from 0\u00A0ft to 100\u00A0ft");
    KsUnits::Instance().SetSystem(KsUnitSystem::Metric);
}
