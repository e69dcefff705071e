// Sorted and filtered lines: what is seen, what is left alone, and that the document knows nothing of it.
#include "page_fixture.h"

#include "grid/grid_clipboard.h"
#include "grid/grid_header.h"
#include "grid/grid_search.h"
#include "grid/lines_view.h"
#include "grid/vector_rows.h"
#include "pages/page_table.h"

#include <QClipboard>
#include <QDialogButtonBox>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QScrollBar>
#include <QSignalSpy>
#include <QTimer>
#include <algorithm>
#include <cmath>
#include <random>

class LinesViewTest : public PageTest
{
protected:
    enum Column
    {
        Name = 1,
        Chainage,
        H,
        Q
    };
    LinesViewTest()
    {
        Add("RHINE", 300, 3, NotGiven);
        Add("ELBE", 100.4, 1, -1);
        Add("RHINE", 100, 2, 5);
        Add("Rhine Delta", 200, 1, 5);
        Add("", NotGiven, 7, 0.5);
        Open(MakeInitPage);
    }
    /// The numbers of the lines as they are shown, at the rows' headers.
    QString Lines() const
    {
        QStringList lines;
        for (int row = 0; row < grid->RowCount(); ++row)
            lines << grid->Model()->headerData(row, Qt::Vertical, Qt::DisplayRole).toString();
        return lines.join(' ');
    }
    void Sort(int column, bool descending = false)
    {
        grid->SetCurrentCell(1, column);
        LinesView::Run(descending ? Command::SortDescending : Command::SortAscending, *grid);
    }
    void Filter(int column, const QString& text)
    {
        QStringList texts = grid->Model()->Filters();
        texts.resize(std::max<qsizetype>(texts.size(), column));
        texts[column - 1] = text;
        grid->ChangeView([&](CGridModel& model) { model.Filter(texts); });
    }
    void Undo() { document.UndoStack().undo(); }
};

TEST_F(LinesViewTest, SortedByOneAndSeveralColumns)
{
    const QString before = Stored();
    Sort(Name);
    EXPECT_EQ(Lines(), "2 1 3 4 5") << "capitals or not, the empty one last";
    Sort(Name, true);
    EXPECT_EQ(Lines(), "4 1 3 2 5") << "the same names as in the file, the empty one last again";
    LinesView::Run(Command::SortByPlace, *grid);
    EXPECT_EQ(Lines(), "2 3 1 4 5");
    LinesView::Run(Command::FileOrder, *grid);
    EXPECT_EQ(Lines(), "1 2 3 4 5");
    Sort(Chainage, true);
    Sort(H);
    EXPECT_EQ(Lines(), "4 2 3 1 5") << "by H, and where that is the same by what was chosen before";
    LinesView::Run(Command::FileOrder, *grid);
    Sort(Q);
    EXPECT_EQ(Lines(), "2 5 3 4 1") << "numbers, not texts; one that is not given last";
    QTest::mouseDClick(grid->Header().viewport(), Qt::LeftButton, {},
                       {grid->Header().sectionViewportPosition(H - 1) + 30, 8});
    EXPECT_EQ(Lines(), "2 4 3 1 5") << "a double click on a header";
    EXPECT_EQ(Stored(), before);
    EXPECT_FALSE(document.IsModified());
}

TEST_F(LinesViewTest, EditedLinesStayWhereTheyAre)
{
    Sort(H);
    ASSERT_EQ(Lines(), "2 4 3 1 5");
    QSignalSpy headers(grid->model(), &QAbstractItemModel::headerDataChanged);
    Enter(1, H, "9");
    EXPECT_EQ(init.GetAt(1).InitialH, 9) << "line 2 of the file";
    EXPECT_EQ(headers.count(), 0) << "to paint them costs as much as the lines do";
    EXPECT_EQ(Lines(), "2 4 3 1 5");
    grid->SetCurrentCell(1, Q);
    QTest::keyClick(grid, Qt::Key_F5);
    EXPECT_EQ(Lines(), "4 3 1 5 2");
    EXPECT_EQ(Current(), std::pair(5, int(Q))) << "the current cell goes with its line";
    EXPECT_TRUE(grid->LineText().startsWith("Line 2 of 5")) << grid->LineText().toStdString();
    Undo();
    EXPECT_EQ(init.GetAt(1).InitialH, 1);
    EXPECT_EQ(Lines(), "4 3 1 5 2") << "undo knows nothing of it";
    EXPECT_EQ(Current(), std::pair(5, int(H))) << "but shows what it did";
}

TEST_F(LinesViewTest, TheOrderShownBecomesTheFilesOrder)
{
    const QString before = Stored();
    Sort(H, true);
    Filter(Name, "rhine");
    ASSERT_EQ(Lines(), "1 3 4");
    LinesView::Run(Command::KeepOrder, *grid);
    EXPECT_EQ(Stored(),
              " 10000000000 7 0.5, RHINE 300 3 10000000000, RHINE 100 2 5, ELBE 100.4 1 -1, Rhine Delta 200 1 5");
    EXPECT_EQ(Lines(), "2 3 5") << "the lines that are hidden stay so";
    EXPECT_FALSE(LinesView::CanRun(Command::FileOrder, grid));
    EXPECT_EQ(document.UndoStack().count(), 1);
    Undo();
    EXPECT_EQ(Stored(), before);
    EXPECT_EQ(Lines(), "1 3 4");
    document.UndoStack().redo();
    Undo();
    EXPECT_EQ(Stored(), before);
}

TEST_F(LinesViewTest, TheOrderIsKeptWithNoLineInSight)
{
    Sort(Chainage, true);
    Filter(H, ">1000");
    ASSERT_EQ(grid->RowCount(), 0);
    LinesView::Run(Command::KeepOrder, *grid);
    Filter(H, "");
    EXPECT_EQ(init.GetAt(0).Chainage, 300);
    Undo();
    EXPECT_EQ(init.GetAt(1).Chainage, 100.4);
}

TEST_F(LinesViewTest, UndoBringsIntoSightOnlyWhatItChanges)
{
    Filter(Name, "rhine");
    ASSERT_EQ(Lines(), "1 3 4");
    grid->SetCurrentCell(3, Name);
    grid->InsertLine();
    Undo();
    EXPECT_EQ(Lines(), "1 3 4") << "where the line was another one has come, which nobody touched";
    init.GetAt(1).InitialH = 99;
    grid->SetCurrentCell(2, Name);
    grid->SelectLines(2, 2);
    grid->DeleteSelectedLines();
    Undo();
    EXPECT_EQ(Lines(), "1 3 4");
}

TEST_F(LinesViewTest, AFilterIsInTheUnitShown)
{
    Filter(H, ">2.5");
    ASSERT_EQ(Lines(), "1 5");
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    QTest::qWait(1);
    EXPECT_EQ(Lines(), "1 2 3 4 5") << "the lowest is 3.3 feet";
}

TEST_F(LinesViewTest, Conditions)
{
    struct
    {
        int column;
        const char *text, *lines;
    } const cases[] = {
        {Name, "rhi", "1 3 4"},
        {Name, "=rhine", "1 3"},
        {Name, "!=Rhine", "2 4 5"},
        {Name, "\"\"", "5"},
        {Name, "!=\"\"", "1 2 3 4"},
        {Name, "DELTA", "4"},
        {Name, "=", "1 2 3 4 5"},
        {Name, "x", ""},
        {Chainage, ">100", "1 2 4"},
        {Chainage, ">=100", "1 2 3 4"},
        {Chainage, "<= 100.4", "2 3"},
        {Chainage, "<100", ""},
        {Chainage, "100..200", "2 3 4"},
        {Chainage, "..100", "3"},
        {Chainage, "200..", "1 4"},
        {Chainage, "100", "2 3"},
        {Chainage, "100.4", "2"},
        {Chainage, "=100", "3"},
        {Chainage, "\"\"", "5"},
        {Chainage, "!=100", "1 2 4 5"},
        {Chainage, ">", "1 2 3 4 5"},
        {Q, "-1", "2"},
        {Q, "1e1", "3 4"}, // 5 to 15 show so without a digit behind
        {Q, "<0", "2"},
        {Q, ">abc", "1 2 3 4 5"},
    };
    for (const auto& [column, text, lines] : cases) {
        Filter(column, text);
        EXPECT_EQ(Lines(), lines) << column << ' ' << text;
        Filter(column, {});
    }
    EXPECT_EQ(Lines(), "1 2 3 4 5");
    Filter(Name, "rhine");
    Filter(H, ">1");
    EXPECT_EQ(Lines(), "1 3") << "both";
    Filter(Name, {});
    Filter(H, {});
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    Filter(Chainage, "=656.1679790026247"); // feet
    EXPECT_EQ(Lines(), "4") << "in the unit shown, whatever its conversion leaves in the last place";
}

TEST_F(LinesViewTest, FieldsBelowTheHeaders)
{
    grid->setFocus();
    grid->SetCurrentCell(3, H);
    QTest::keyClick(grid, Qt::Key_F, Qt::ControlModifier | Qt::ShiftModifier);
    auto* field = grid->findChild<QLineEdit*>("filter3");
    ASSERT_TRUE(field && field->hasFocus());
    EXPECT_FALSE(field->accessibleName().isEmpty());
    QTest::keyClicks(field, ">2");
    EXPECT_EQ(Lines(), "1 5");
    EXPECT_TRUE(grid->LineText().endsWith("2 of 5 shown")) << grid->LineText().toStdString();
    EXPECT_EQ(grid->CurrentRow(), 0) << "no other line takes the place of the hidden one";
    QTest::keyClick(field, Qt::Key_Backspace);
    EXPECT_EQ(Lines(), "1 2 3 4 5") << "not complete";
    EXPECT_EQ(grid->CurrentRow(), 3) << "it is back";
    QTest::keyClicks(field, "x");
    EXPECT_TRUE(field->toolTip().contains(">x")) << "says what is wrong";
    QTest::keyClick(field, Qt::Key_Escape);
    EXPECT_EQ(field->text(), "");
    EXPECT_TRUE(field->isVisible());
    QTest::keyClicks(field, "1");
    QTest::keyClick(field, Qt::Key_Return);
    EXPECT_TRUE(grid->hasFocus());
    EXPECT_EQ(Current(), std::pair(1, int(H)));
    LinesView::Run(Command::ShowAllLines, *grid);
    EXPECT_EQ(Lines(), "1 2 3 4 5");
    EXPECT_FALSE(field->isVisible());
}

TEST_F(LinesViewTest, TheStatusTellsOfWhatThereIs)
{
    grid->selectionModel()->select({grid->model()->index(0, H - 1), grid->model()->index(2, H - 1)},
                                   QItemSelectionModel::ClearAndSelect);
    const auto sum = [this] { return grid->SelectionText().section("sum ", 1).section(',', 0, 0); };
    EXPECT_TRUE(QTest::qWaitFor([&] { return sum() == "6"; })) << grid->SelectionText().toStdString();
    grid->selectionModel()->select({grid->model()->index(0, H - 1), grid->model()->index(2, Q - 1)},
                                   QItemSelectionModel::ClearAndSelect);
    EXPECT_TRUE(QTest::qWaitFor([&] { return grid->SelectionText() == "6 cells selected"; }))
        << "levels and discharges";
    grid->selectionModel()->select({grid->model()->index(0, H - 1), grid->model()->index(2, H - 1)},
                                   QItemSelectionModel::ClearAndSelect);
    init.GetAt(0).InitialH = 13;
    grid->Reload();
    EXPECT_TRUE(QTest::qWaitFor([&] { return sum() == "16"; })) << "of the numbers of now";
    Filter(Name, "rhine");
    SelectRows(1, 3);
    view->page->DeleteLines();
    EXPECT_EQ(grid->LineText(), "0 of 2 shown");
    Filter(Name, "!=x");
    SelectRows(1, 2);
    view->page->DeleteLines();
    EXPECT_TRUE(grid->LineText().startsWith("Line 1 of 1")) << grid->LineText().toStdString();
}

TEST_F(LinesViewTest, AClickWithCtrlSelectsNothingElsewhere)
{
    QStringList said;
    QObject::connect(&document, &CKsDoc::Said, &document, [&said](const QString& text) { said << text; });
    const auto click = [this](int row, Qt::KeyboardModifiers held) {
        QTest::mouseClick(grid->verticalHeader()->viewport(), Qt::LeftButton, held,
                          {5, grid->rowViewportPosition(row - 1) + 5});
    };
    click(1, {});
    click(4, Qt::ControlModifier);
    EXPECT_EQ(said.size(), 1);
    view->page->DeleteLines();
    EXPECT_EQ(init.GetCount(), 4u) << "nothing but the line that is shown selected";
    click(1, {});
    click(3, Qt::ShiftModifier);
    view->page->DeleteLines();
    EXPECT_EQ(init.GetCount(), 1u);
}

TEST_F(LinesViewTest, TheBarBesideTheCountIsThereToBeMoved)
{
    grid->resize(900, 300);
    Filter(Name, "=RHINE");
    QTest::qWait(10);
    EXPECT_TRUE(grid->findChild<QLabel*>("shownLines")->isVisible());
    EXPECT_FALSE(grid->horizontalScrollBar()->isVisible());
    EXPECT_EQ(grid->findChild<QLineEdit*>("filter1")->cursorPosition(), 0) << "the beginning is in sight";
    grid->setColumnWidth(0, 2000);
    QTest::qWait(10);
    EXPECT_TRUE(grid->horizontalScrollBar()->isVisible());
    Filter(Name, "");
    QTest::qWait(10);
    EXPECT_TRUE(grid->horizontalScrollBar()->isVisible());
}

/// Rows that are named by their places.
TEST(ShownRows, FollowsLinesThatComeAndGo)
{
    std::vector<double> numbers{5, 4, 3, 2, 1};
    VectorRows<double> rows(numbers);
    CShownRows shown;
    shown.Sort(rows, {4, 3, 2, 1, 0});
    shown.Hide(rows, {false, false, false, true, false});
    const auto lines = [&] {
        QStringList texts;
        for (std::size_t row = 0; row < shown.Count(); ++row)
            texts << QString::number(numbers[shown.SourceRow(row)]);
        return texts.join(' ');
    };
    numbers.insert(numbers.begin() + 1, 9);
    ASSERT_TRUE(shown.Follow(rows, 1));
    EXPECT_EQ(lines(), "1 3 9 4 5");
    numbers.erase(numbers.begin());
    ASSERT_TRUE(shown.Follow(rows, 0));
    EXPECT_EQ(lines(), "1 3 9 4");
    numbers.push_back(8);
    ASSERT_TRUE(shown.Follow(rows, 5));
    EXPECT_EQ(lines(), "1 3 9 4 8");
    numbers.pop_back();
    EXPECT_FALSE(shown.Follow(rows, {})) << "nobody says where";
}

TEST(RowOrder, EqualNumbersStayAsTheyStandAndThoseThatAreNoneComeLast)
{
    std::vector<double> numbers{1};
    VectorRows<double> rows(numbers);
    std::vector<ColumnSpec> columns(1);
    columns[0].access = std::make_shared<CellAccess>(
        CellAccess{[](const void* row) -> CellValue { return *static_cast<const double*>(row); }, {}});
    SourceRows expected;
    for (std::uint32_t row = 1; row < 100; ++row) {
        numbers.push_back(row % 2 ? 0.0 : -0.0);
        expected.push_back(row);
    }
    expected.push_back(0);
    EXPECT_EQ(SortedRows(rows, columns, {{0}}), expected);
    numbers = {std::nan(""), 2, NotGiven, -1};
    EXPECT_EQ(SortedRows(rows, columns, {{0}}), (SourceRows{3, 1, 0, 2}));
    EXPECT_EQ(SortedRows(rows, columns, {{0, true}}), (SourceRows{1, 3, 0, 2}));
}

TEST_F(LinesViewTest, NewLinesStayInSight)
{
    Filter(Name, "rhine");
    ASSERT_EQ(Lines(), "1 3 4");
    SelectRows(2, 2);
    view->page->AppendLine(); // above line 3
    EXPECT_EQ(Lines(), "1 3 4 5");
    EXPECT_EQ(Current(), std::pair(2, 1));
    Enter(2, Name, "oder");
    EXPECT_EQ(init.GetAt(2).RiverName, "ODER");
    view->page->InsertLocation("MAIN", "5");
    EXPECT_EQ(Lines(), "1 3 4 5 7");
    EXPECT_EQ(Current(), std::pair(5, 1));
    Sort(H);
    EXPECT_EQ(init.GetAt(6).RiverName, "MAIN") << "at the end of the file";
    LinesView::Run(Command::ShowAfresh, *grid);
    EXPECT_EQ(init.GetCount(), 7u);
    EXPECT_EQ(Lines(), "5 4 1") << "until the filter is asked again";
}

TEST_F(LinesViewTest, WhatIsHiddenIsShownToWhoGoesThere)
{
    Filter(Name, "elbe");
    ASSERT_EQ(Lines(), "2");
    QStringList said;
    QObject::connect(&document, &CKsDoc::Said, &document, [&said](const QString& text) { said << text; });
    view->page->GotoLine(4);
    EXPECT_EQ(Lines(), "2 4");
    EXPECT_EQ(Current().first, 2);
    EXPECT_TRUE(said.join(' ').contains("Line 4")) << said.join(' ').toStdString();
    Enter(2, H, "8");
    Filter(Name, "elbe");
    ASSERT_EQ(Lines(), "2");
    Undo();
    EXPECT_EQ(init.GetAt(3).InitialH, 1);
    EXPECT_EQ(Lines(), "2 4");
    EXPECT_EQ(Current(), std::pair(2, int(H)));
    int row = 0;
    EXPECT_FALSE(SearchRows(*grid, row, {.name = "RHINE", .nameMatch = NameMatch::Whole}));

    CGridSearch search;
    answer = QMessageBox::Yes;
    QTimer::singleShot(0, grid, [] {
        auto* dialog = QApplication::activeModalWidget();
        ASSERT_TRUE(dialog);
        QTest::keyClicks(dialog->findChild<QLineEdit*>("riverName_1058"), "rhine");
        dialog->findChild<QRadioButton*>("fullMatch_1060")->click();
        dialog->findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok)->click();
    });
    search.Run(Command::Search, *grid);
    ASSERT_EQ(boxes.size(), 1);
    EXPECT_TRUE(boxes[0].contains("Line 1 ") && boxes[0].contains("hidden by the filter")) << boxes[0].toStdString();
    EXPECT_EQ(Lines(), "1 2 4");
    EXPECT_EQ(Current().first, 1);
}

/// Whatever is done to what is shown, hidden lines keep every bit and their order, and undo gives the file back.
TEST_F(LinesViewTest, HiddenLinesAreNeverTouched)
{
    std::mt19937 random(20261122);
    const auto pick = [&](int n) { return int(random() % unsigned(n)); };
    for (int round = 0; round < 60; ++round) {
        SCOPED_TRACE(round);
        grid->ChangeView([](CGridModel& model) {
            model.SortBy({});
            model.Filter({});
        });
        document.UndoStack().clear();
        init.RemoveAll();
        for (int i = 0; i < 12; ++i)
            Add(pick(2) ? "A" : "B", pick(5) * 10, pick(4), i);
        view->page->LoadFromDocument(&document);
        const QString before = Stored();
        if (pick(2))
            Filter(Name, pick(2) ? "A" : "B");
        else
            Filter(H, ">=2");
        if (pick(2))
            Sort(1 + pick(3), pick(2));
        if (grid->RowCount() == 0)
            continue;
        for (int step = 0; step < 6; ++step) {
            std::vector<std::pair<const HD_Initial*, HD_Initial>> hidden;
            for (std::size_t i = 0; i < init.GetCount(); ++i)
                if (grid->Model()->ShownRow(i) < 0)
                    hidden.emplace_back(&init.GetAt(i), init.GetAt(i));
            const int shown = grid->Model()->StoredRows(), row = 1 + pick(std::max(grid->RowCount(), 1));
            const int last = std::min(row + pick(4), grid->RowCount());
            QStringList expected;
            for (int each = 1; each <= shown; ++each)
                expected << Texts(each);
            switch (pick(4)) {
            case 0:
                SelectRows(row, last);
                view->page->DeleteLines();
                expected.remove(row - 1, last - row + 1);
                break;
            case 1: {
                grid->SetCurrentCell(row, H);
                QGuiApplication::clipboard()->setText("5\t6\n7\t8\n9\t10");
                ASSERT_TRUE(PasteCells(*grid));
                for (int i = 0; i < 3; ++i) {
                    if (row - 1 + i == expected.size()) {
                        expected << Texts(row + i);
                        ASSERT_TRUE(expected.back().startsWith("||")) << "a new line";
                    }
                    QStringList cells = expected[row - 1 + i].split('|');
                    cells[2] = QString("%1.000").arg(5 + 2 * i);
                    cells[3] = QString("%1.000").arg(6 + 2 * i);
                    expected[row - 1 + i] = cells.join('|');
                }
                break;
            }
            case 2:
                SelectRows(row, row);
                view->page->AppendLine();
                expected.insert(row - 1, Texts(row));
                break;
            default:
                Enter(row, H, "77");
                expected[row - 1] = Texts(row);
                ASSERT_TRUE(Texts(row).contains("|77.000|"));
            }
            QStringList now;
            for (int each = 1; each <= grid->Model()->StoredRows(); ++each)
                now << Texts(each);
            ASSERT_EQ(now.join(", "), expected.join(", ")) << "what was done to the lines shown, and nothing else";
            std::size_t next = 0; // among the hidden ones, in the order of the file
            for (std::size_t i = 0; i < init.GetCount() && next < hidden.size(); ++i)
                if (&init.GetAt(i) == hidden[next].first) {
                    EXPECT_EQ(grid->Model()->ShownRow(i), -1);
                    EXPECT_EQ(init.GetAt(i).InitialQ, hidden[next].second.InitialQ);
                    EXPECT_EQ(init.GetAt(i).InitialH, hidden[next].second.InitialH);
                    ++next;
                }
            ASSERT_EQ(next, hidden.size());
            if (grid->Model()->StoredRows() == 0)
                break;
        }
        const QString after = Stored();
        while (document.UndoStack().canUndo())
            Undo();
        ASSERT_EQ(Stored(), before);
        while (document.UndoStack().canRedo())
            document.UndoStack().redo();
        ASSERT_EQ(Stored(), after);
    }
}
