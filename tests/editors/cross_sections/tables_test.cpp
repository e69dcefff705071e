// The tables beside the plot: models, editing with units and undo, lines by keys, and what is refused.
#include "cross_sections_fixture.h"
#include "ks/language/language.h"

#include <QAbstractItemModelTester>
#include <QClipboard>
#include <QMenu>
#include <QSignalSpy>
#include <QTimer>

namespace {

using S = CSectionTable;
using P = CPointTable;

TEST_F(CrossSectionTest, TablesShowTheSectionsInTheUsersUnits)
{
    CCrossSectionView* view = Open();
    const auto fatal = QAbstractItemModelTester::FailureReportingMode::Fatal;
    const QAbstractItemModelTester sections(view->Sections()->model(), fatal), points(view->Points()->model(), fatal);
    const auto header = [](const QTableView* table, int column) {
        return table->model()->headerData(column, Qt::Horizontal).toString();
    };
    EXPECT_EQ(Text(view->Sections(), Main2500, S::Branch), "MAIN");
    EXPECT_EQ(Text(view->Sections(), Main2500, S::Chainage), "2500.5");
    EXPECT_EQ(Text(view->Sections(), Main1000, S::Radius), "");
    EXPECT_EQ(header(view->Sections(), S::Width), "Width [m]");
    EXPECT_EQ(header(view->Sections(), S::TopoId), "Topo ID");
    Select(view->Sections(), Main2500);
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    EXPECT_EQ(header(view->Points(), P::Level), "Bed level [ft]");
    EXPECT_EQ(Text(view->Points(), 3, P::Offset), "98.425");
    EXPECT_EQ(Text(view->Sections(), Main2500, S::Chainage), "8203.74");
    for (int row = 0; row < SmallRows; ++row) // what was there is no change, whatever the unit
        for (int column = 0; column < S::ColumnCount; ++column)
            EXPECT_FALSE(Edit(view->Sections(), row, column, Text(view->Sections(), row, column, Qt::EditRole)));
    EXPECT_TRUE(Edit(view->Points(), 0, P::Level, "100"));
    EXPECT_DOUBLE_EQ(view->Document()->Sections().sections[Main2500].points[0].level, 30.48);
    EXPECT_EQ(view->Document()->UndoStack().count(), 1);
    for (const int row : {int(Side300), int(Main1000), int(Main2500)})
        Select(view->Sections(), row);
    view->Document()->RemoveSections({0, 1, 2, 3}, "x");
    EXPECT_EQ(view->Points()->model()->rowCount(), 0);
    EXPECT_EQ(view->Plot()->Title(), "");
    UndoAll(view);
    EXPECT_EQ(view->Sections()->model()->rowCount(), SmallRows);
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
    const Case cases[] = {{false, S::Branch, "  UPPER ", "UPPER"},
                          {false, S::Chainage, "1.5e3", "1500"},
                          {false, S::TopoId, "", ""},
                          {false, S::Radius, "-250", "-250"},
                          {false, S::Width, "", ""},
                          {true, P::Offset, "4.5", "4.5"},
                          {true, P::Level, "-1.25", "-1.25"}};
    const int row = Main2500, point = 0;
    Select(view->Sections(), row);
    for (const Case& each : cases) {
        QTableView* table = each.points ? view->Points() : view->Sections();
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
    const Case cases[] = {
        {false, 1, S::Branch, " ", "Line 2, Branch: a cross section needs the name of its branch."},
        {false, 1, S::Chainage, "1,5", "Line 2, Chainage [m]: expected a number, found \"1,5\"."},
        {false, 1, S::Chainage, "", "Line 2, Chainage [m]: expected a number, found \"\"."},
        {false, 1, S::Chainage, "1000",
         "Line 2, Chainage [m]: there is a cross section of branch \"MAIN\" at chainage 1000 m"},
        {false, 1, S::TopoId, "2021", "Line 2, Topo ID: there is a cross section"},
        {false, 1, S::Width, "-1", "Line 2, Width [m]: expected a width that is not negative."},
        {false, 1, S::Radius, "inf", "Line 2, Radius [m]: expected a number"},
        {true, 1, P::Offset, "21", "Line 2, Offset [m]: expected offsets that do not decrease from point to point."},
        {true, 1, P::Level, "", "Line 2, Bed level [m]: expected a number, found \"\"."},
    };
    for (const Case& each : cases) {
        EXPECT_FALSE(Edit(each.points ? view->Points() : view->Sections(), each.row, each.column, each.typed));
        QCoreApplication::processEvents();
        ASSERT_EQ(boxes.size(), 1) << each.message;
        EXPECT_TRUE(boxes.takeFirst().startsWith(each.message)) << each.message;
    }
    EXPECT_EQ(view->Document()->UndoStack().count(), 0);
}

TEST_F(CrossSectionTest, SectionsAreInsertedAndDeletedWithKeys)
{
    CCrossSectionView* view = Open();
    QTableView* table = view->Sections();
    const auto chainages = [&] {
        QStringList all;
        for (int row = 0; row < table->model()->rowCount(); ++row)
            all << Text(table, row, S::Branch) + Text(table, row, S::Chainage);
        return all.join(' ');
    };
    const QString before = chainages();
    QTest::keyClick(table, Qt::Key_Insert); // between the first two
    EXPECT_EQ(chainages(), "MAIN1000 MAIN1750.25 MAIN2500.5 MAIN2500.5 SIDE300");
    EXPECT_EQ(view->CurrentSection(), 1);
    EXPECT_EQ(Text(table, 1, S::TopoId), "2019");
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
    EXPECT_FALSE(view->IsCommandEnabled(CrossSectionCommand::DeleteLine));
    UndoAll(view);
    EXPECT_EQ(chainages(), before);
    EXPECT_FALSE(view->Document()->IsModified());
    while (view->Document()->UndoStack().canRedo())
        view->Document()->UndoStack().redo();
    EXPECT_EQ(chainages(), "");

    projectBranch = "AELDER"; // the first section of all is on a branch of the project
    QTest::keyClick(table, Qt::Key_Insert);
    EXPECT_EQ(chainages(), "AELDER0");
}

TEST_F(CrossSectionTest, PointsAreInsertedAndDeletedWithKeys)
{
    CCrossSectionView* view = Open();
    Select(view->Sections(), Main2500);
    QTableView* table = view->Points();
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
    EXPECT_TRUE(view->OnCommand(CrossSectionCommand::InsertLine));
    QTest::keyClick(table, Qt::Key_Insert);
    EXPECT_EQ(Text(table, 1, P::Offset), "1");
    EXPECT_EQ(view->Sections()->model()->rowCount(), SmallRows) << "the lines are those of the table with the focus";
}

TEST_F(CrossSectionTest, LinesGoToASpreadsheetAndPointsComeBack)
{
    CCrossSectionView* view = Open();
    QClipboard* clipboard = QGuiApplication::clipboard();
    Select(view->Sections(), Main2500);
    EXPECT_TRUE(view->OnCommand(KsCommand::Copy));
    EXPECT_EQ(clipboard->text(), "MAIN\t2500.5\t400\t20\t2019\n");
    EXPECT_FALSE(view->IsCommandEnabled(KsCommand::Paste)) << "sections are not pasted";
    QTableView* table = view->Points();
    table->setFocus();
    table->selectAll();
    QTest::keyClick(table, Qt::Key_C, Qt::ControlModifier);
    EXPECT_EQ(clipboard->text(), "0\t110\n10\t100\n20\t100\n30\t110\n");

    struct Case
    {
        const char *text, *message; // no message: the points are added
        int rows;
    };
    const Case cases[] = {
        {"", nullptr, 4},
        {"0;110\r\n\r\n 1.5 ; 109 \r\n", nullptr, 6},
        {"0\t110\nend\t1\n", "Line 2 of the pasted text: expected an offset and a bed level, found", 4},
        {"0\t110\t3", "Line 1 of the pasted text: expected", 4},
        {"20\t110", "The pasted text does not fit here: expected offsets that do not decrease", 4}};
    for (const Case& each : cases) {
        Select(table, 0);
        clipboard->setText(each.text);
        QTest::keyClick(table, Qt::Key_V, Qt::ControlModifier);
        QCoreApplication::processEvents();
        EXPECT_EQ(table->model()->rowCount(), each.rows) << each.text;
        ASSERT_EQ(boxes.size(), each.message ? 1 : 0) << each.text;
        if (each.message) {
            EXPECT_TRUE(boxes.takeFirst().startsWith(each.message)) << each.message;
        }
        UndoAll(view);
    }
    table->edit(table->model()->index(0, P::Level));
    EXPECT_FALSE(view->IsCommandEnabled(KsCommand::Copy)) << "the editor's own text";
    EXPECT_FALSE(view->IsCommandEnabled(KsCommand::Paste));
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
    QSignalSpy changed(frame.get(), &CKsMDIFrameWnd::CommandStateChanged);
    Select(view->Sections(), Main1000);
    EXPECT_GE(changed.count(), 1) << "tool bars hear of what can be done now";
    std::set<int> known;
    for (const CKsMenuCommand& command : view->LinesMenu())
        known.insert(command.id);
    EXPECT_EQ(known.size(), 5u) << "four commands and a separator";
}

TEST_F(CrossSectionTest, TheContextMenuIsAboutTheTableItWasAskedFor)
{
    CCrossSectionView* view = Open();
    QStringList offered;
    QTimer::singleShot(0, view, [&] {
        auto* menu = qobject_cast<QMenu*>(QApplication::activePopupWidget());
        ASSERT_NE(menu, nullptr);
        for (const QAction* action : menu->actions())
            offered << (action->isEnabled() ? action->text().remove('&') : QString("-"));
        menu->actions().at(0)->trigger();
        menu->close();
    });
    emit view->Points()->customContextMenuRequested({5, 5}); // the focus is in the other table
    EXPECT_EQ(offered, QStringList({"Insert Line", "-", "", "-", "Next Cross Section"}));
    EXPECT_EQ(view->Points()->model()->rowCount(), 3);
    EXPECT_EQ(view->Sections()->model()->rowCount(), SmallRows);
}

TEST_F(CrossSectionTest, TextsFollowTheLanguage)
{
    KsLanguage::Instance().SetTranslationFolder(QString(KVR_BUILD_DIR) + "/bin/translations");
    CrossSectionModule::LoadResources();
    CCrossSectionView* view = Open();
    const auto header = [&] { return view->Points()->model()->headerData(P::Level, Qt::Horizontal).toString(); };
    const QString english = view->Sections()->accessibleName();
    KsLanguage::Instance().SetCurrent("ja");
    QCoreApplication::processEvents();
    EXPECT_EQ(header(), QString::fromUtf8("河床高 [m]"));
    EXPECT_NE(view->Sections()->accessibleName(), english);
    EXPECT_NE(view->Plot()->accessibleName(), "Plot of the cross section");
    KsLanguage::Instance().SetCurrent("en_US");
    QCoreApplication::processEvents();
    EXPECT_EQ(header(), "Bed level [m]");
    EXPECT_EQ(view->Plot()->accessibleName(), "Plot of the cross section");
    CrossSectionModule::FreeResources();
}

} // namespace
