// The tables beside the plot: models, editing with units and undo, lines by keys, and what is refused.
#include "canceled_paste.h"
#include "cross_sections_fixture.h"
#include "grid/grid_commands.h"
#include "grid/lines_view.h"
#include "ks/language/language.h"

#include <QAbstractItemModelTester>
#include <QCheckBox>
#include <QClipboard>
#include <QContextMenuEvent>
#include <QDialog>
#include <QDialogButtonBox>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QPushButton>
#include <QSignalSpy>
#include <QTimer>

namespace {

TEST_F(CrossSectionTest, TablesShowTheSectionsInTheUsersUnits)
{
    CCrossSectionView* view = Open();
    const auto fatal = QAbstractItemModelTester::FailureReportingMode::Fatal;
    const QAbstractItemModelTester sections(view->Sections()->model(), fatal), points(view->Points()->model(), fatal);
    const auto header = [](const CGenGrid* table, int column) {
        return table->model()->headerData(column, Qt::Horizontal).toString();
    };
    EXPECT_EQ(Text(view->Sections(), Main2500, SectionBranch), "MAIN");
    EXPECT_EQ(Text(view->Sections(), Main2500, SectionChainage), "2500.5");
    EXPECT_EQ(Text(view->Sections(), Main1000, SectionRadius), "");
    EXPECT_EQ(header(view->Sections(), SectionWidth), "Width [m]");
    EXPECT_EQ(header(view->Sections(), SectionTopoId), "Topo ID");
    Select(view->Sections(), Main2500);
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    EXPECT_EQ(header(view->Points(), PointLevel), "Bed level [ft]");
    EXPECT_EQ(Text(view->Points(), 3, PointOffset), "98.425");
    EXPECT_EQ(Text(view->Sections(), Main2500, SectionChainage), "8203.74");
    for (int row = 0; row < SmallRows; ++row) // what was there is no change, whatever the unit
        for (int column = 0; column < 5; ++column)
            EXPECT_TRUE(Edit(view->Sections(), row, column, Text(view->Sections(), row, column, Qt::EditRole)));
    Select(view->Sections(), Main2500);
    EXPECT_TRUE(Edit(view->Points(), 0, PointLevel, "100"));
    EXPECT_DOUBLE_EQ(view->Document()->Sections().sections[Main2500].points[0].level, 30.48);
    EXPECT_EQ(view->Document()->UndoStack().count(), 1);
    for (const int row : {int(Side300), int(Main1000), int(Main2500)})
        Select(view->Sections(), row);
    Remove(*view->Document(), view->Sections()->Model()->Rows(), 0, SmallRows);
    EXPECT_EQ(view->Points()->model()->rowCount(), 0);
    EXPECT_EQ(view->Plot()->Title(), "");
    UndoAll(view);
    EXPECT_EQ(view->Sections()->model()->rowCount(), SmallRows);
}

TEST_F(CrossSectionTest, SectionsAndPointsAreDuplicatedAndMoved)
{
    CCrossSectionView* view = Open();
    const auto& stored = view->Document()->Sections().sections;
    view->Sections()->SetCurrentCell(Main2500 + 1, 1);
    CGridCommands::Run(GridAction::Duplicate, *view->Sections());
    ASSERT_EQ(stored.size(), SmallRows + 1u);
    const CCrossSection& copy = stored[Main2500 + 1];
    EXPECT_EQ(copy.points.size(), 4u) << "with its points";
    EXPECT_EQ(copy.width, 20);
    EXPECT_NE(copy.chainage, 2500.5) << "no two stand at one place";
    EXPECT_EQ(view->CurrentSection(), Main2500 + 1);
    UndoAll(view);
    view->Sections()->SetCurrentCell(Side300 + 1, 1);
    CGridCommands::Run(GridAction::MoveUp, *view->Sections());
    EXPECT_EQ(stored[Side300 - 1].branch, "SIDE");
    EXPECT_EQ(view->CurrentSection(), Side300 - 1);
    EXPECT_EQ(view->Points()->RowCount(), 0) << "those of the line that moved";
    UndoAll(view);
    EXPECT_EQ(stored[Side300].branch, "SIDE");
    view->Sections()->ChangeView([](CGridModel& model) { model.Filter({"MAIN"}); });
    view->Sections()->SetCurrentCell(3, 1);
    CGridCommands::Run(GridAction::MoveUp, *view->Sections());
    EXPECT_EQ(view->Sections()->RowCount(), 3) << "the filter hides what it hid";
    EXPECT_EQ(stored[Main2500].topoId, "2021");
    UndoAll(view);
    Select(view->Sections(), Main2500);
    view->Points()->SetCurrentCell(1, 1);
    CGridCommands::Run(GridAction::MoveDown, *view->Points());
    EXPECT_EQ(stored[Main2500].points[0].offset, 0) << "offsets do not decrease";
    EXPECT_EQ(boxes.size(), 1);
}

/// Sections move in memory with every line above them, and their points with them.
TEST_F(CrossSectionTest, WhatDiffersFromTheLastSaveGoesWithItsSection)
{
    CCrossSectionView* view = Open();
    const auto marks = [](const CGenGrid& grid) {
        std::string text;
        for (int row = 0; row < grid.Model()->StoredRows(); ++row)
            text += ".*+"[int(grid.Model()->Saved().MarkOf(row))];
        return text;
    };
    Select(view->Sections(), Main2500);
    EXPECT_TRUE(Edit(view->Points(), 1, PointLevel, "99"));
    EXPECT_EQ(marks(*view->Points()), ".*..");
    const std::string none(std::size_t(SmallRows), '.');
    EXPECT_EQ(marks(*view->Sections()), none);
    CGridCommands::Run(GridAction::MoveUp, *view->Sections());
    EXPECT_EQ(view->CurrentSection(), Main2500 - 1);
    EXPECT_EQ(marks(*view->Points()), ".*..");
    Select(view->Sections(), Main2500);
    EXPECT_EQ(marks(*view->Points()).find('*'), std::string::npos) << "those of another section";
    Select(view->Sections(), Main2500 - 1);
    CGridCommands::Run(GridAction::Duplicate, *view->Sections());
    EXPECT_EQ(marks(*view->Points()), "++++") << "of the copy";
    std::string copied = none;
    copied.insert(std::size_t(Main2500), "+");
    EXPECT_EQ(marks(*view->Sections()), copied);
    Select(view->Sections(), Main2500 - 1);
    view->Points()->SetCurrentCell(2, PointLevel + 1);
    CGridCommands::Run(GridAction::RevertToSaved, *view->Points());
    EXPECT_EQ(view->Document()->Sections().sections[Main2500 - 1].points[1].level, 100);
    EXPECT_EQ(marks(*view->Points()), "....");
    UndoAll(view);
    EXPECT_FALSE(view->Points()->Model()->Saved().MayDiffer());
}

/// The rows of a vector have no names of their own.
TEST_F(CrossSectionTest, SortedAndFilteredSections)
{
    CCrossSectionView* view = Open();
    CGenGrid* sections = view->Sections();
    const auto& stored = view->Document()->Sections().sections;
    EXPECT_FALSE(LinesView::CanRun(Command::SortAscending, view->Points())) << "where a point stands is what it says";
    sections->ChangeView([](CGridModel& model) { model.SortBy({{SectionWidth}}); });
    sections->SetCurrentCell(2, SectionTopoId + 1);
    EXPECT_EQ(sections->CurrentLine(), Main2500 + 1) << "after the one of 7 m";
    EXPECT_EQ(view->CurrentSection(), Main2500);
    EXPECT_EQ(view->Points()->RowCount(), 4);
    sections->ChangeView([](CGridModel& model) { model.Filter(QStringList{"", "", "", "7..20"}); });
    ASSERT_EQ(sections->RowCount(), 2);
    sections->SelectLines(1, 2);
    sections->DeleteSelectedLines();
    ASSERT_EQ(stored.size(), 2u) << "others stand between those that are shown";
    EXPECT_EQ(stored[0].chainage, 1000);
    EXPECT_EQ(stored[1].topoId, "2021");
    EXPECT_EQ(view->Document()->UndoStack().count(), 1);
    UndoAll(view);
    ASSERT_EQ(stored.size(), 4u);
    EXPECT_EQ(stored[Main2500].topoId, "2019");
    EXPECT_EQ(stored[Side300].width, 7);

    // Where rows have changed places, the filter goes with what they hold.
    const auto widths = [&] {
        QList<double> shown;
        for (int row = 0; row < sections->RowCount(); ++row)
            shown << std::get<double>(sections->Model()->Value(row, SectionWidth));
        std::ranges::sort(shown);
        return shown;
    };
    const QList<double> passing = widths();
    EXPECT_EQ(passing.size(), 2);
    LinesView::Run(Command::KeepOrder, *sections);
    EXPECT_EQ(widths(), passing);
    UndoAll(view);
    EXPECT_EQ(widths(), passing);
    view->Document()->UndoStack().redo();
    EXPECT_EQ(widths(), passing);
}

TEST_F(CrossSectionTest, EveryCellCanBeEditedAndUndone)
{
    CCrossSectionView* view = Open();
    struct Case
    {
        bool points;
        int column;
        const char *typed, *shown;
    };
    const Case cases[] = {{false, SectionBranch, "  UPPER ", "UPPER"},
                          {false, SectionChainage, "1.5e3", "1500"},
                          {false, SectionTopoId, "", ""},
                          {false, SectionRadius, "-250", "-250"},
                          {false, SectionWidth, "", ""},
                          {true, PointOffset, "4.5", "4.5"},
                          {true, PointLevel, "-1.25", "-1.25"}};
    const int row = Main2500, point = 0;
    Select(view->Sections(), row);
    for (const Case& each : cases) {
        CGenGrid* table = each.points ? view->Points() : view->Sections();
        const int line = each.points ? point : row;
        const QString before = Text(table, line, each.column);
        ASSERT_NE(before, each.shown) << "the case must change something";
        EXPECT_TRUE(Edit(table, line, each.column, each.typed));
        EXPECT_EQ(Text(table, line, each.column), each.shown);
        Select(view->Sections(), Side300);
        view->Document()->UndoStack().undo();
        EXPECT_EQ(view->CurrentSection(), row) << "undo shows what it does";
        EXPECT_EQ(Text(table, line, each.column), before);
        EXPECT_FALSE(view->Document()->IsModified());
    }
    EXPECT_TRUE(boxes.isEmpty());
}

TEST_F(CrossSectionTest, WhatCannotStandIsRefusedWithAReason)
{
    CCrossSectionView* view = Open();
    Select(view->Sections(), Main2500);
    struct Case
    {
        bool points;
        int row, column;
        const char *typed, *message;
    };
    const char *const none = "Floating point number required", *const taken = "there is a cross section of branch";
    const Case cases[] = {
        {false, 1, SectionBranch, " ", "a cross section needs the name of its branch."},
        {false, 1, SectionChainage, "1,5", none},
        {false, 1, SectionChainage, "", none},
        {false, 1, SectionChainage, "1000", taken},
        {false, 1, SectionTopoId, "2021", taken},
        {false, 1, SectionWidth, "-1", "Floating-point value is out of range"},
        {false, 1, SectionRadius, "inf", none},
        {true, 1, PointOffset, "21", "expected offsets that do not decrease from point to point."},
        {true, 1, PointLevel, "", none},
    };
    for (const Case& each : cases) {
        EXPECT_FALSE(Edit(each.points ? view->Points() : view->Sections(), each.row, each.column, each.typed));
        ASSERT_EQ(boxes.size(), 1) << each.message;
        EXPECT_TRUE(boxes.takeFirst().startsWith(each.message)) << each.message;
    }
    EXPECT_EQ(view->Document()->UndoStack().count(), 0);
}

TEST_F(CrossSectionTest, SectionsAreInsertedAndDeletedWithKeys)
{
    CCrossSectionView* view = Open();
    CGenGrid* table = view->Sections();
    const auto chainages = [&] {
        QStringList all;
        for (int row = 0; row < table->model()->rowCount(); ++row)
            all << Text(table, row, SectionBranch) + Text(table, row, SectionChainage);
        return all.join(' ');
    };
    const QString before = chainages();
    QTest::keyClick(table, Qt::Key_Insert); // between the first two
    EXPECT_EQ(chainages(), "MAIN1000 MAIN1750.25 MAIN2500.5 MAIN2500.5 SIDE300");
    EXPECT_EQ(view->CurrentSection(), 1);
    EXPECT_EQ(Text(table, 1, SectionTopoId), "2019");
    EXPECT_EQ(view->Points()->model()->rowCount(), 0);
    QTest::keyClick(table, Qt::Key_End, Qt::ControlModifier);
    QTest::keyClick(table, Qt::Key_Insert); // behind the only one of its branch
    QTest::keyClick(table, Qt::Key_Insert); // as far again
    EXPECT_EQ(chainages(), "MAIN1000 MAIN1750.25 MAIN2500.5 MAIN2500.5 SIDE300 SIDE400 SIDE500");
    view->Document()->UndoStack().undo();
    EXPECT_EQ(view->CurrentSection(), 5) << "the line above the one that is gone";
    view->Document()->UndoStack().redo();
    EXPECT_EQ(view->CurrentSection(), 6);
    QTest::keyClick(table, Qt::Key_Up, Qt::ShiftModifier);
    QTest::keyClick(table, Qt::Key_Delete);
    EXPECT_EQ(chainages(), "MAIN1000 MAIN1750.25 MAIN2500.5 MAIN2500.5 SIDE300");
    EXPECT_EQ(view->CurrentSection(), 4);
    table->selectAll();
    QTest::keyClick(table, Qt::Key_Delete);
    EXPECT_EQ(chainages(), "");
    EXPECT_FALSE(view->IsCommandEnabled(Command::DeleteLine));
    UndoAll(view);
    EXPECT_EQ(chainages(), before);
    EXPECT_FALSE(view->Document()->IsModified());
    while (view->Document()->UndoStack().canRedo())
        view->Document()->UndoStack().redo();
    EXPECT_EQ(chainages(), "");

    projectBranch = "AELDER"; // the first section of all is on a branch of the project
    QTest::keyClick(table, Qt::Key_Insert);
    EXPECT_EQ(chainages(), "AELDER0");
    for (int i = 0; i < 3; ++i)
        QTest::keyClick(table, Qt::Key_Insert);
    QGuiApplication::clipboard()->setText("350\n450\n100\n225");
    table->SetCurrentCell(1, SectionChainage + 1);
    QTest::keyClick(table, Qt::Key_V, Qt::ControlModifier);
    Select(table, 3);
    QTest::keyClick(table, Qt::Key_Insert);
    EXPECT_EQ(chainages(), "AELDER350 AELDER450 AELDER100 AELDER225 AELDER550")
        << "as far again, but 350 and 450 are taken";
}

TEST_F(CrossSectionTest, PointsAreInsertedAndDeletedWithKeys)
{
    CCrossSectionView* view = Open();
    Select(view->Sections(), Main2500);
    CGenGrid* table = view->Points();
    table->setFocus();
    Select(table, 0);
    const auto points = [&] {
        QStringList all;
        for (const CSectionPoint& point : view->Document()->Sections().sections[Main2500].points)
            all << QString("%1/%2").arg(point.offset).arg(point.level);
        return all.join(' ');
    };
    const QString before = points();
    QTest::keyClick(table, Qt::Key_Insert); // half way
    EXPECT_EQ(points(), "0/110 5/105 10/100 20/100 30/110");
    EXPECT_EQ(table->currentIndex().row(), 1);
    Select(table, 4);
    QTest::keyClick(table, Qt::Key_Insert); // as far again
    EXPECT_EQ(points(), "0/110 5/105 10/100 20/100 30/110 40/110");
    Select(table, 1);
    QTest::keyClick(table, Qt::Key_Down, Qt::ShiftModifier);
    QTest::keyClick(table, Qt::Key_Delete);
    EXPECT_EQ(points(), "0/110 20/100 30/110 40/110");
    UndoAll(view);
    EXPECT_EQ(points(), before);

    view->Sections()->setFocus();
    Select(view->Sections(), Side300); // without points
    table->setFocus();
    EXPECT_TRUE(view->OnCommand(Command::InsertLine));
    QTest::keyClick(table, Qt::Key_Insert);
    EXPECT_EQ(Text(table, 1, PointOffset), "1");
    EXPECT_EQ(view->Sections()->model()->rowCount(), SmallRows) << "the lines are those of the table with the focus";
}

TEST_F(CrossSectionTest, LinesGoToASpreadsheetAndPointsComeBack)
{
    CCrossSectionView* view = Open();
    QClipboard* clipboard = QGuiApplication::clipboard();
    view->Sections()->SelectLines(Main2500 + 1, Main2500 + 1);
    QTest::keyClick(view->Sections(), Qt::Key_C, Qt::ControlModifier);
    EXPECT_EQ(clipboard->text(), "MAIN\t2500.5\t400\t20\t2019");
    Select(view->Sections(), Main2500);
    CGenGrid* table = view->Points();
    table->setFocus();
    table->selectAll();
    QTest::keyClick(table, Qt::Key_C, Qt::ControlModifier);
    EXPECT_EQ(clipboard->text(), "0\t110\n10\t100\n20\t100\n30\t110");

    struct Case
    {
        const char *text, *shown; // what does not fit; null for points that are there at once
        int rows;
    };
    const Case cases[] = {{"", nullptr, 4},
                          {"1\t110\r\n2\t109\r\n3\t100\r\n4\t100\r\n5\t110\r\n", nullptr, 5},
                          {"0\t110\nend\t1\n", "2|Offset [m]|end|Floating point number required", 4},
                          {"0\t110\t3", "", 4}, // a column too many
                          {"0\t1\n9\t1\n8\t1", "3|Offset [m]|8|expected offsets", 4},
                          {"11\t110", "1|Offset [m]|11|expected offsets", 4}};
    for (const Case& each : cases) {
        Select(table, 0);
        clipboard->setText(each.text);
        QStringList listed;
        CancelPaste(*view, listed);
        QTest::keyClick(table, Qt::Key_V, Qt::ControlModifier);
        QCoreApplication::processEvents();
        EXPECT_EQ(table->model()->rowCount(), each.rows) << each.text;
        ASSERT_EQ(listed.size(), each.shown ? 1 : 0) << each.text;
        EXPECT_EQ(listed.join(" ").toStdString().substr(0, each.shown ? std::strlen(each.shown) : 0),
                  each.shown ? each.shown : "");
        EXPECT_EQ(boxes, QStringList());
        UndoAll(view);
    }
}

TEST_F(CrossSectionTest, WhereNoLineFitsNothingIsPasted)
{
    CCrossSectionView* view = Open();
    Select(view->Sections(), Main2500);
    CGenGrid* points = view->Points();
    points->SetCurrentCell(1, 1);
    points->setFocus();
    QGuiApplication::clipboard()->setText("20\t1\n30\t2"); // the offsets would fall
    bool isAsked = false, canPaste = true;
    QTimer::singleShot(0, view, [&] {
        auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
        if (!dialog)
            return;
        isAsked = true;
        dialog->findChild<QCheckBox*>("leaveOut")->click();
        canPaste = dialog->findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok)->isEnabled();
        dialog->reject();
    });
    QTest::keyClick(points, Qt::Key_V, Qt::ControlModifier);
    EXPECT_TRUE(isAsked);
    EXPECT_FALSE(canPaste);
}

TEST_F(CrossSectionTest, LinesAreSearchedByBranchAndChainage)
{
    CCrossSectionView* view = Open();
    QTimer::singleShot(0, view, [] {
        auto* dialog = QApplication::activeModalWidget();
        dialog->findChild<QLineEdit*>("riverName_1058")->setText("side");
        QTest::keyClick(dialog, Qt::Key_Return);
    });
    view->Points()->setFocus(); // wherever the keys are pressed, sections are looked for
    QTest::keyClick(view->Points(), Qt::Key_F7);
    EXPECT_EQ(view->CurrentSection(), Side300);
    EXPECT_EQ(view->window()->focusWidget(), view->Sections());
    QTest::keyClick(view->Sections(), Qt::Key_F3);
    EXPECT_EQ(boxes, QStringList{"The last occurence of searched item already found"});
}

TEST_F(CrossSectionTest, CommandsStepThroughTheSections)
{
    CCrossSectionView* view = Open();
    EXPECT_FALSE(view->IsCommandEnabled(CrossSectionCommand::Previous));
    EXPECT_FALSE(view->OnCommand(CrossSectionCommand::Previous));
    for (int row = 1; row < SmallRows; ++row) {
        EXPECT_TRUE(view->OnCommand(CrossSectionCommand::Next));
        EXPECT_EQ(view->CurrentSection(), row);
    }
    EXPECT_FALSE(view->OnCommand(CrossSectionCommand::Next));
    EXPECT_TRUE(view->OnCommand(CrossSectionCommand::Previous));
    EXPECT_FALSE(view->OnCommand(4711));
    // Another section leaves the table that the user works in the one of the commands.
    view->Points()->setFocus();
    EXPECT_TRUE(view->OnCommand(CrossSectionCommand::Previous));
    EXPECT_TRUE(view->OnCommand(CrossSectionCommand::Next));
    EXPECT_TRUE(view->OnCommand(Command::InsertLine));
    EXPECT_EQ(view->Sections()->model()->rowCount(), SmallRows);
    view->Document()->UndoStack().undo();
    view->Sections()->setFocus();
    QSignalSpy changed(frame.get(), &CKsMDIFrameWnd::CommandStateChanged);
    Select(view->Sections(), Main1000);
    EXPECT_GE(changed.count(), 1) << "tool bars hear of what can be done now";
    std::set<int> known;
    for (const CKsMenuCommand& command : view->LinesMenu())
        EXPECT_TRUE(command.id == 0 || known.insert(command.id).second) << command.id;
}

TEST_F(CrossSectionTest, TheContextMenuIsAboutTheTableItWasAskedFor)
{
    CCrossSectionView* view = Open();
    QTimer::singleShot(0, view, [] {
        auto* menu = qobject_cast<QMenu*>(QApplication::activePopupWidget());
        ASSERT_NE(menu, nullptr);
        menu->actions().at(0)->trigger();
        menu->close();
    });
    const QPoint at(5, 5); // the focus is in the other table
    QContextMenuEvent asked(QContextMenuEvent::Mouse, at, view->Points()->mapToGlobal(at));
    QApplication::sendEvent(view->Points()->viewport(), &asked);
    EXPECT_EQ(view->Points()->model()->rowCount(), 3);
    EXPECT_EQ(view->Sections()->model()->rowCount(), SmallRows);
}

TEST_F(CrossSectionTest, TextsFollowTheLanguage)
{
    KsLanguage::Instance().SetTranslationFolder(QString(KVR_BUILD_DIR) + "/bin/translations");
    const CKsEditorResources texts(CrossSectionEditor());
    CCrossSectionView* view = Open();
    const auto header = [&] { return view->Points()->model()->headerData(PointLevel, Qt::Horizontal).toString(); };
    const QString english = view->Sections()->accessibleName();
    const auto title = [&] {
        const auto labels = view->findChildren<QLabel*>();
        return (*std::ranges::find(labels, view->Points(), &QLabel::buddy))->text();
    };
    EXPECT_TRUE(title().startsWith("&Points of ")) << title().toStdString();
    KsLanguage::Instance().SetCurrent("ja");
    QCoreApplication::processEvents();
    EXPECT_FALSE(title().contains("Points")) << title().toStdString();
    EXPECT_EQ(header(), QString::fromUtf8("河床高 [m]"));
    EXPECT_NE(view->Sections()->accessibleName(), english);
    EXPECT_NE(view->Plot()->accessibleName(), "Plot of the cross section");
    KsLanguage::Instance().SetCurrent("en_US");
    QCoreApplication::processEvents();
    EXPECT_EQ(header(), "Bed level [m]");
    EXPECT_EQ(view->Plot()->accessibleName(), "Plot of the cross section");
}

} // namespace
