// What undo, redo and saving show: the page and the field, the status bar, and what a file is after every page was
// seen.
#include "exchange_fixture.h"

#include "data/hd_file.h"
#include "grid/cell_commands.h"
#include "rules/file_check.h"

#include <QClipboard>
#include <QDialog>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QStatusBar>
#include <QTimer>

namespace {

class UndoViewTest : public ExchangeTest
{
protected:
    UndoViewTest() { frame.statusBar(); } // is made when it is first asked for
    CKavo0_hdView& Opened(const CString& path)
    {
        view = Open(path);
        EXPECT_TRUE(view);
        QTest::qWait(20); // the other pages are made
        return *view;
    }
    int Tab(const char* text) const
    {
        for (int tab = 0; tab < view->Sheet()->PageCount(); ++tab)
            if (view->Sheet()->tabText(tab) == text)
                return tab;
        ADD_FAILURE() << "no tab " << text;
        return 0;
    }
    void Show(const char* tab) const
    {
        EXPECT_TRUE(view->Sheet()->SetActivePage(Tab(tab)));
        QCoreApplication::processEvents();
    }
    QString Front() const { return view->Sheet()->tabText(view->Sheet()->currentIndex()); }
    template <typename Control = QWidget>
    Control& Find(const char* name) const
    {
        auto* control = view->ActivePage()->findChild<Control*>(name);
        EXPECT_TRUE(control) << name;
        return *control;
    }
    QString Status() const
    {
        QTest::qWait(1); // said when the event is over
        return frame.statusBar()->currentMessage();
    }
    static void Press(int key, Qt::KeyboardModifiers modifiers = {})
    {
        QWidget* focus = QApplication::focusWidget();
        ASSERT_TRUE(focus);
        QTest::keyClick(focus, Qt::Key(key), modifiers);
        QCoreApplication::processEvents();
    }
    /// With the focus outside the page these are keys of the main frame's menu.
    void UndoRedo(bool undo) const
    {
        if (view->ActivePage()->isAncestorOf(QApplication::focusWidget()))
            Press(undo ? Qt::Key_Z : Qt::Key_Y, Qt::ControlModifier);
        else
            view->ActivePage()->UndoRedo(undo);
    }
    void PressUndo() const { UndoRedo(true); }
    void PressRedo() const { UndoRedo(false); }
    static void TypeInto(QLineEdit& field, const char* text)
    {
        field.setFocus();
        field.selectAll();
        QTest::keyClicks(&field, text);
        Press(Qt::Key_Tab);
    }
    static void TypeInto(CGenGrid& grid, int row, int column, const char* text)
    {
        grid.setFocus();
        grid.SetCurrentCell(row, column);
        for (const char* key = text; *key; ++key)
            QTest::keyClick(QApplication::focusWidget(), *key);
        Press(Qt::Key_Return, Qt::ShiftModifier);
    }

    CKavo0_hdView* view = nullptr;
};

TEST_F(UndoViewTest, BringsThePageAndTheFieldIntoView)
{
    Opened(WriteFile("river.hdkv"));
    TypeInto(*view->ActivePage()->GetGrid(), 2, 3, "7.5");
    Show("Heat Balance");
    const QWidget* page = view->ActivePage();
    auto* field = [&]() -> QLineEdit* {
        for (auto* edit : page->findChildren<QLineEdit*>())
            if (edit->isVisible() && edit->isEnabled())
                return edit;
        return nullptr;
    }();
    if (!field) { // closed while the switch is off
        page->findChildren<QAbstractButton*>().front()->click();
        field = page->findChildren<QLineEdit*>().front();
    }
    TypeInto(*field, "3.25");
    const int steps = view->GetDocument()->UndoStack().index();
    Show("User Def. Marks");
    TypeInto(Find<CGenGrid>("titles_1075"), 1, 1, "bank");

    PressUndo();
    EXPECT_EQ(Front(), "User Def. Marks");
    EXPECT_EQ(QApplication::focusWidget(), &Find("titles_1075"));
    EXPECT_TRUE(Status().endsWith("Undone: Change of cells")) << Status().toStdString();
    PressUndo();
    EXPECT_EQ(Front(), "Heat Balance");
    EXPECT_EQ(QApplication::focusWidget(), field);
    for (int step = steps; step > 1; --step)
        PressUndo();
    EXPECT_EQ(Front(), "Initial");
    const auto& grid = *view->ActivePage()->GetGrid();
    EXPECT_EQ(QApplication::focusWidget(), &grid);
    EXPECT_EQ(std::pair(grid.CurrentRow(), grid.CurrentColumn()), std::pair(2, 3));
    EXPECT_FALSE(view->GetDocument()->IsModified());
    for (int step = 0; step < steps; ++step)
        PressRedo();
    EXPECT_EQ(Front(), "Heat Balance");
    EXPECT_EQ(QApplication::focusWidget(), field);
    EXPECT_TRUE(Status().startsWith("Redone: ")) << Status().toStdString();
}

TEST_F(UndoViewTest, TheStatusBarSaysWhatWasDone)
{
    Opened(WriteFile("river.hdkv"));
    CGenGrid& grid = *view->ActivePage()->GetGrid();
    grid.setFocus();
    Press(Qt::Key_Insert);
    EXPECT_EQ(Status(), "Line 3 of 3   Line inserted");
    Press(Qt::Key_Home);
    grid.SetCurrentCell(1, 1);
    EXPECT_EQ(Status(), "Line 1 of 3");
    QApplication::clipboard()->setText("1\t2\n3\t4");
    grid.SetCurrentCell(3, 3);
    Press(Qt::Key_V, Qt::ControlModifier);
    EXPECT_EQ(Status(), "Line 3 of 4   4 cells pasted");
    ASSERT_TRUE(view->GetDocument()->DoSave(Path("saved.HDKV")));
    EXPECT_TRUE(Status().endsWith("Saved; 2 lines without location dropped (undo brings back what was dropped)"))
        << Status().toStdString();
    PressUndo();
    EXPECT_EQ(Status(), "Line 3 of 4   Undone: Removal of incomplete lines");
    PressRedo();
    EXPECT_TRUE(view->GetDocument()->DoSave(Path("saved.HDKV")));
    EXPECT_EQ(Status(), "Line 2 of 2   Saved");
    grid.setFocus();
    grid.selectAll();
    Press(Qt::Key_Delete);
    EXPECT_EQ(Status(), "Line 1 of 1   2 lines deleted");
}

TEST_F(UndoViewTest, AFileWhosePagesWereAllSeenHoldsNothingThatNobodyTyped)
{
    Opened({});
    for (int tab = 0; tab < view->Sheet()->PageCount(); ++tab) {
        ASSERT_TRUE(view->Sheet()->SetActivePage(tab));
        QCoreApplication::processEvents();
    }
    ASSERT_TRUE(view->GetDocument()->DoSave(Path("new.HDKV")));
    EXPECT_EQ(view->GetDocument()->UndoStack().count(), 0);
    auto parsed = ParseFile(Path("new.HDKV").toStdString());
    ASSERT_TRUE(parsed);
    EXPECT_EQ(CheckHDFile(parsed->Get(), nullptr, {}).Count(), 0U);
    EXPECT_FALSE(Read(Path("new.HDKV")).contains("DATA"));
    // What the time series page shows of its empty tables is what a new file gets.
    auto saved = LoadHDFile(Path("new.HDKV").toStdString());
    ASSERT_TRUE(saved);
    EXPECT_EQ(saved->Global.TextOutput.OutputItems.size(), 1U);
    EXPECT_EQ(saved->Global.TextOutput.OutputFiles.size(), 1U);
    EXPECT_TRUE(Parameters(*view).Global.TextOutput.OutputItems.empty()) << "not in memory";
    EXPECT_TRUE(saved->Global.MarkTitles.empty());
    EXPECT_TRUE(saved->Global.MapOutput.MapOutputFiles.empty());
}

TEST_F(UndoViewTest, UntitledMarksGoOnlyWhenTheirPageWasSeenAndSaysSo)
{
    HD_Parameters parameters;
    parameters.Global.MarkTitles = {"BANK", ""};
    HDWLMark mark;
    mark.RiverName = "MAIN";
    mark.Chainage = 5;
    mark.MarkLevels = {1, 2};
    parameters.WaterLevelMarkList.Add(mark);
    ASSERT_TRUE(SaveHDFile(parameters, Path("marks.HDKV").toStdString()));
    const QByteArray before = Read(Path("marks.HDKV"));
    Opened(Path("marks.HDKV"));
    ASSERT_TRUE(view->GetDocument()->DoSave(Path("marks.HDKV")));
    EXPECT_EQ(Read(Path("marks.HDKV")), before) << "pages that nobody has seen change nothing";

    Show("User Def. Marks");
    EXPECT_TRUE(Find<QLabel>("status_1076").text().startsWith("Marks without a title (1)"));
    ASSERT_TRUE(view->GetDocument()->DoSave(Path("marks.HDKV")));
    EXPECT_TRUE(Status().contains("Saved; 1 mark without title dropped")) << Status().toStdString();
    EXPECT_EQ(Find<QLabel>("status_1076").text(), "");
    const auto& list = Parameters(*view).WaterLevelMarkList;
    EXPECT_EQ(list.GetAt(0).MarkLevels, std::vector<double>{1});
    view->GetDocument()->UndoStack().undo();
    EXPECT_EQ(list.GetAt(0).MarkLevels, (std::vector<double>{1, 2}));
    EXPECT_EQ(Parameters(*view).Global.MarkTitles, (std::vector<std::string>{"BANK", ""}));
    EXPECT_TRUE(view->GetDocument()->IsModified());
}

TEST_F(UndoViewTest, LevelsStandBelowTheTitleTheyWereGivenBeforeItsName)
{
    Opened({});
    Show("User Def. Marks");
    CGenGrid &marks = *view->ActivePage()->GetGrid(), &titles = Find<CGenGrid>("titles_1075");
    TypeInto(marks, 1, 3, "5.5");
    TypeInto(titles, 1, 1, "bank");
    const auto& list = Parameters(*view).WaterLevelMarkList;
    EXPECT_EQ(list.GetAt(0).MarkLevels, std::vector<double>{5.5});
    PressUndo();
    EXPECT_TRUE(Parameters(*view).Global.MarkTitles.empty());
    EXPECT_EQ(list.GetAt(0).MarkLevels, std::vector<double>{5.5});
    PressUndo();
    EXPECT_TRUE(list.IsEmpty());
    EXPECT_FALSE(view->GetDocument()->IsModified());
    PressRedo();
    PressRedo();
    EXPECT_EQ(list.GetAt(0).MarkLevels, std::vector<double>{5.5});
    EXPECT_EQ(Parameters(*view).Global.MarkTitles, std::vector<std::string>{"BANK"});
}

TEST_F(UndoViewTest, ReplacingInTheWholeDocumentIsOneStepOverAllPages)
{
    Opened(WriteFile("river.hdkv"));
    auto& parameters = view->GetDocument()->Parameters();
    HDLeakage place;
    place.RiverName = "MAIN";
    parameters.LeakageList.Add(place); // of a page that nobody has seen
    CGenGrid& grid = *view->ActivePage()->GetGrid();
    grid.SetCurrentCell(grid.RowCount(), 1);
    QTimer::singleShot(0, &grid, [this] {
        auto* dialog = QApplication::activeModalWidget();
        ASSERT_TRUE(dialog);
        dialog->findChild<QLineEdit*>("find")->setText("MAIN");
        dialog->findChild<QLineEdit*>("with")->setText("TRUNK");
        dialog->findChild<QRadioButton*>("inDocument")->setChecked(true);
        QTest::qWait(100);
        dialog->findChild<QPushButton*>("findNext")->click();
        EXPECT_EQ(Front(), "Wind") << "the next page with one";
        dialog->findChild<QPushButton*>("replaceAll")->click();
        static_cast<QDialog*>(dialog)->reject();
    });
    RunOnCells(grid, GridAction::Replace);
    EXPECT_EQ(parameters.InitList.GetAt(0).RiverName, "TRUNK");
    EXPECT_EQ(parameters.LeakageList.GetAt(0).RiverName, "TRUNK");
    EXPECT_EQ(view->GetDocument()->UndoStack().count(), 1);
    view->GetDocument()->UndoStack().undo();
    EXPECT_EQ(parameters.InitList.GetAt(0).RiverName, "MAIN");
    EXPECT_EQ(parameters.LeakageList.GetAt(0).RiverName, "MAIN");
}

} // namespace
