// What differs from the last save: against what a user would find who remembers every line.
#include "flow_page_fixture.h"
#include "pages/page_table.h"
#include "test_folder.h"

#include "document/list_rows.h"
#include "grid/cell_operations.h"
#include "grid/grid_commands.h"
#include "grid/row_commands.h"
#include "grid/saved_mark.h"

#include <QPainter>
#include <map>
#include <random>

namespace {

/// Does to a table what a user may do, in any order, and compares its marks after every step with the lines as they
/// were saved, which it knows by a number each.
class RandomEdits
{
public:
    RandomEdits(CKavo0_hdDoc& document, CGridModel& model, unsigned seed)
        : m_document(document), m_model(model), m_random(seed)
    {
        m_states.push_back(NumberedLines({}));
        Remember();
    }
    void Step()
    {
        QUndoStack& stack = m_document.UndoStack();
        const int before = stack.index();
        const State was = m_states[std::size_t(before)];
        const QString done = DoSomething();
        SCOPED_TRACE(done.toStdString());
        const int now = stack.index();
        if (now > before && !m_isRedo) { // what could be redone is gone
            ASSERT_EQ(now, before + 1);
            m_states.resize(std::size_t(now));
            m_states.push_back(NumberedLines(was));
        }
        if (m_isSave)
            Remember();
        Compare();
    }

    int marked = 0, isNew = 0; // seen so far

private:
    /// For each row of the source what names its line in memory, where it may be another one's when it is gone for
    /// good, and the number that stays its own.
    struct State
    {
        std::vector<const void*> names;
        std::vector<int> numbers;
    };
    int Pick(int count) { return int(m_random() % unsigned(count)); }
    IRowSource& Source() const { return *m_model.Rows(); }

    State NumberedLines(const State& before)
    {
        State state;
        std::map<const void*, int> known;
        for (std::size_t row = 0; row < before.names.size(); ++row)
            known[before.names[row]] = before.numbers[row];
        for (std::size_t row = 0; row < Source().Count(); ++row) {
            const void* const name = Source().At(row);
            const auto number = known.find(name);
            state.names.push_back(name);
            state.numbers.push_back(number == known.end() ? m_nextNumber++ : number->second);
        }
        return state;
    }
    std::vector<CellValue> Values(std::size_t row) const
    {
        std::vector<CellValue> values;
        for (const ColumnSpec& column : m_model.Columns())
            values.push_back(column.access->get(Source().At(row)));
        return values;
    }
    void Remember()
    {
        m_saved.clear();
        const State& state = m_states[std::size_t(m_document.UndoStack().index())];
        for (std::size_t row = 0; row < Source().Count(); ++row)
            m_saved[state.numbers[row]] = Values(row);
    }
    void Compare()
    {
        const State& state = m_states[std::size_t(m_document.UndoStack().index())];
        ASSERT_EQ(state.numbers.size(), Source().Count());
        for (int row = 0; row < m_model.StoredRows(); ++row) {
            const std::size_t at = m_model.SourceRow(row);
            const auto saved = m_saved.find(state.numbers[at]);
            const std::vector<CellValue> values = Values(at);
            SavedMark expected = saved == m_saved.end() ? SavedMark::New : SavedMark::None;
            for (int column = 0; expected != SavedMark::New && column < m_model.columnCount(); ++column) {
                const CellValue& before = saved->second[std::size_t(column)];
                const bool differs = !SameCell(before, values[std::size_t(column)]);
                if (differs)
                    expected = SavedMark::Changed;
                const auto told = m_model.Saved().Before(row, column);
                ASSERT_EQ(told.has_value(), differs) << "row " << row << ", column " << column;
                ASSERT_TRUE(!differs || SameCell(*told, before)) << "row " << row << ", column " << column;
            }
            ASSERT_EQ(int(m_model.Saved().MarkOf(row)), int(expected)) << "row " << row;
            marked += expected == SavedMark::Changed;
            isNew += expected == SavedMark::New;
        }
        EXPECT_TRUE(m_document.IsModified() || !m_model.Saved().MayDiffer());
    }

    CellBlock SomeBlock()
    {
        const int top = Pick(m_model.StoredRows()), left = Pick(m_model.columnCount());
        return {top, left, top + Pick(m_model.StoredRows() - top), left + Pick(m_model.columnCount() - left)};
    }
    /// Two columns of numbers for three rows from this one on, of which the last may be new.
    PastedCells SomeCells(int row)
    {
        PastedCells cells{.rows = {}, .columns = {{1, {}, {}}, {2, {}, {true, false, false}}}};
        std::size_t next = m_model.Rows()->Count();
        for (int i = 0; i < 3; ++i) {
            cells.rows.push_back(row + i < m_model.StoredRows() ? m_model.SourceRow(row + i) : next++);
            for (PastedCells::Column& column : cells.columns)
                column.values.Add(double(Pick(200)));
        }
        return cells;
    }
    void Make(CCellResults results) { m_model.ChangeCells("cells", results.FirstRow(), results.TakeChanges()); }
    void Save()
    {
        m_isSave = true;
        EXPECT_TRUE(m_document.OnSaveDocument(QString::fromStdString(m_folder.Path("a.HDKV"))));
        m_model.Sync();
    }
    QString DoSomething()
    {
        m_isSave = m_isRedo = false;
        const int lines = m_model.StoredRows();
        if (lines < 8) {
            m_model.Filter({});
            m_model.InsertRow(0);
            return "insertion into few";
        }
        const int row = Pick(lines);
        switch (Pick(18)) {
        case 0:
            m_model.InsertRow(row);
            return "insertion";
        case 1:
            m_model.DuplicateRows(row, 1 + Pick(std::min(5, lines - row)));
            return "duplication";
        case 2:
        case 3:
            m_model.RemoveRows(row, 1 + Pick(std::min(4, lines - row)));
            return "deletion";
        case 4:
        case 5:
            if (!m_model.Shown().IsSorted() && row > 0)
                m_model.MoveRows(row, 1, true);
            return "move";
        case 6:
            m_model.SortBy({{Pick(m_model.columnCount()), Pick(2) == 0}});
            return "sorting";
        case 7:
            m_model.KeepOrder(row);
            return "order of the file";
        case 8:
            m_model.Filter({QString(), Pick(2) ? QString() : QString("<%1").arg(100 + Pick(100))});
            return "filter";
        case 9:
            Make(FillDown(m_model, SomeBlock()));
            return "fill";
        case 10:
            m_model.Paste(SomeCells(row), "paste");
            return "paste";
        case 11:
            if (Pick(4) == 0)
                Save();
            return "save";
        case 12:
            Make(RevertToSaved(m_model, m_model.Saved(), SomeBlock()));
            return "revert";
        case 13:
        case 14:
        case 15: {
            QUndoStack& stack = m_document.UndoStack();
            m_isRedo = true;
            for (int steps = 1 + Pick(6), back = Pick(3); steps > 0; --steps)
                back > 0 ? stack.undo() : stack.redo();
            m_model.Sync();
            return "undo or redo";
        }
        default:
            m_model.setData(m_model.index(row, 1 + Pick(m_model.columnCount() - 1)), QString::number(Pick(200)),
                            Qt::EditRole);
            m_model.Store();
            return "typing";
        }
    }

    CKavo0_hdDoc& m_document;
    CGridModel& m_model;
    std::mt19937 m_random;
    TestFolder m_folder;
    std::vector<State> m_states; // by the index of the undo stack
    std::map<int, std::vector<CellValue>> m_saved;
    int m_nextNumber = 0;
    bool m_isSave = false, m_isRedo = false;
};

} // namespace

class SavedLinesTest : public FlowPagesTest
{
protected:
    /// The marks of the lines, from the top.
    static std::string Marks(const CGenGrid& of)
    {
        std::string marks;
        for (int row = 0; row < of.Model()->StoredRows(); ++row)
            marks += ".*+"[int(of.Model()->Saved().MarkOf(row))];
        return marks;
    }
    std::string Marks() const { return Marks(*grid); }
    void Save() { ASSERT_TRUE(document.OnSaveDocument(QString::fromStdString(folder.Path("a.HDKV")))); }
    void Undo(int steps = 1)
    {
        for (; steps > 0; --steps)
            document.UndoStack().undo();
    }
    QString CellTip(int row, int column) const
    {
        return grid->model()->index(row - 1, column - 1).data(Qt::ToolTipRole).toString();
    }
    QString LineData(int row, Qt::ItemDataRole role) const
    {
        return grid->model()->headerData(row - 1, Qt::Vertical, role).toString();
    }

    TestFolder folder;
};

TEST_F(SavedLinesTest, AreThoseThatSomebodyRemembers)
{
    int marked = 0, isNew = 0;
    for (unsigned seed = 1; seed <= 20 && !HasFatalFailure(); ++seed) {
        document.DeleteContents();
        for (int line = 0; line < 60; ++line)
            Add(line % 2 ? "A" : "B", line, 2 * line, 3 * line);
        Open(MakeInitPage);
        RandomEdits edits(document, *grid->Model(), seed);
        for (int step = 0; step < 150 && !HasFatalFailure(); ++step) {
            SCOPED_TRACE(QString("seed %1, step %2").arg(seed).arg(step).toStdString());
            edits.Step();
        }
        marked += edits.marked;
        isNew += edits.isNew;
        view.reset();
    }
    EXPECT_GT(marked, 5000);
    EXPECT_GT(isNew, 5000);
}

TEST_F(SavedLinesTest, AreToldAndReverted)
{
    Add("A", 1, 10.25, 20);
    Add("B", 2, 11, 21);
    Open(MakeInitPage);
    Type(1, 3, "12");
    EXPECT_EQ(Marks(), "..") << "nothing is taken yet";
    QTest::keyClick(Editor(), Qt::Key_Return);
    QTest::keyClick(grid, Qt::Key_Insert);
    EXPECT_EQ(Marks(), "*.+");
    EXPECT_TRUE(CellTip(1, 3).endsWith("\nWas 10.25 m at the last save")) << CellTip(1, 3).toStdString();
    EXPECT_FALSE(CellTip(1, 4).contains("save"));
    EXPECT_EQ(LineData(1, Qt::AccessibleDescriptionRole), "Changed since the last save");
    EXPECT_TRUE(LineData(1, Qt::ToolTipRole).endsWith(": was 10.25 m at the last save"));
    EXPECT_EQ(LineData(3, Qt::ToolTipRole), "New since the last save");
    EXPECT_EQ(LineData(2, Qt::ToolTipRole), "");
    Enter(1, 3, "10.25");
    EXPECT_EQ(Marks(), "..+") << "what was saved, typed again";

    Enter(1, 3, "7");
    Enter(2, 1, "c");
    const int steps = document.UndoStack().count();
    SelectRows(1, 3);
    QTest::keyClick(grid, Qt::Key_Backspace, Qt::ControlModifier | Qt::ShiftModifier);
    EXPECT_EQ(document.UndoStack().count(), steps + 1) << "one step";
    EXPECT_EQ(Stored(), "A 1 10.25 20, B 2 11 21,  10000000000 0 0");
    EXPECT_EQ(Marks(), "..+");
    Undo();
    EXPECT_EQ(Marks(), "**+");
    Save();
    EXPECT_EQ(Marks(), "..") << "the line without a place is dropped";
    EXPECT_FALSE(CGridCommands::CanRun(GridAction::RevertToSaved, *grid));
    Undo();
    grid->Refresh();
    EXPECT_EQ(Marks(), "..+");
    Undo();
    EXPECT_EQ(Marks(), ".*+") << "saved with its new name";
}

TEST_F(SavedLinesTest, ArePaintedBesideTheNumber)
{
    Add("A", 1, 10);
    Add("B", 1, 10);
    Open(MakeInitPage);
    QHeaderView& numbers = *grid->verticalHeader();
    const auto dots = [&numbers](int row) {
        const QImage image = numbers.viewport()->grab().toImage();
        const QRgb color = numbers.palette().color(QPalette::Highlight).rgb();
        int found = 0;
        for (int y = 0; y < numbers.sectionSize(row); ++y)
            for (int x = 0; x < numbers.width(); ++x)
                found += image.pixel(x, numbers.sectionViewportPosition(row) + y) == color;
        return found;
    };
    Enter(1, 3, "11");
    QTest::keyClick(grid, Qt::Key_Insert);
    EXPECT_GT(dots(0), 20);
    EXPECT_EQ(dots(1), 0);
    EXPECT_GT(dots(2), 20);
    EXPECT_NE(dots(0), dots(2)) << "another mark";
}

TEST_F(SavedLinesTest, MarksOfWhatIsBeingTypedArePaintedAtOnce)
{
    struct PaintCount : QObject
    {
        bool eventFilter(QObject*, QEvent* event) override
        {
            count += event->type() == QEvent::Paint;
            return false;
        }
        int count = 0;
    } paints;
    Add("A", 1, 10);
    Add("B", 1, 10);
    Open(MakeInitPage);
    grid->verticalHeader()->viewport()->installEventFilter(&paints);
    for (const int row : {0, 1}) { // no step is made by either
        QApplication::processEvents();
        paints.count = 0;
        grid->Model()->setData(grid->model()->index(row, 2), "11", Qt::EditRole);
        QApplication::processEvents();
        EXPECT_GT(paints.count, 0) << row;
    }
    EXPECT_EQ(Marks(), "**");
}

TEST_F(SavedLinesTest, ASaveIsForgottenByNoLine)
{
    Add("A", 1, 10);
    Add("B", 1, 10);
    Open(MakeInitPage);
    Enter(1, 3, "11");
    EXPECT_EQ(Marks(), "*.");
    Save();
    grid->Model()->setData(grid->model()->index(1, 2), "12", Qt::EditRole); // typed, and not stored yet
    EXPECT_EQ(Marks(), ".*") << "the first one is as it was saved by now";
}

TEST(SavedMarks, AreSeenOnSelectedCellsToo)
{
    QPalette palette;
    palette.setColor(QPalette::Highlight, Qt::blue);
    palette.setColor(QPalette::HighlightedText, Qt::yellow);
    for (const bool isSelected : {false, true}) {
        QImage image(40, 20, QImage::Format_RGB32);
        image.fill(isSelected ? Qt::blue : Qt::white);
        QPainter painter(&image);
        PaintCellMark(painter, image.rect(), palette, isSelected);
        painter.end();
        EXPECT_EQ(image.pixelColor(0, 10), QColor(isSelected ? Qt::yellow : Qt::blue));
    }
}

TEST_F(SavedLinesTest, WhatABoxWasIsSaid)
{
    globals.MarkTitles = {"LOW", "HIGH"};
    globals.MarkInterpolate = {true, false};
    Open(MakeWLMarkPage);
    auto* titles = view->page->findChild<CGenGrid*>("titles_1075");
    titles->setFocus();
    for (const int line : {1, 2}) {
        titles->SetCurrentCell(line, 2);
        QTest::keyClick(titles, Qt::Key_Space);
    }
    ASSERT_EQ(Marks(*titles), "**");
    EXPECT_EQ(titles->Model()->Saved().CellText(0, 1), "was on at the last save");
    EXPECT_EQ(titles->Model()->Saved().CellText(1, 1), "was off at the last save");
}

/// What was saved is nowhere on the stack of steps any more.
TEST_F(SavedLinesTest, OutliveTheWayBackToTheSavedState)
{
    Add("A", 1, 10, 20);
    Add("B", 2, 11, 21);
    Open(MakeInitPage);
    Enter(1, 3, "12");
    QTest::keyClick(grid, Qt::Key_U, Qt::ControlModifier); // B twice
    Save();
    Undo(2);
    EXPECT_EQ(Marks(), "*.");
    Enter(2, 3, "5");
    EXPECT_FALSE(document.UndoStack().canRedo());
    EXPECT_EQ(Marks(), "**");
    EXPECT_TRUE(CellTip(1, 3).contains("Was 12 m")) << CellTip(1, 3).toStdString();
    Enter(1, 3, "12");
    EXPECT_EQ(Marks(), ".*");
    grid->selectAll();
    CGridCommands::Run(GridAction::RevertToSaved, *grid);
    EXPECT_EQ(Stored(), "A 1 12 20, B 2 11 21");
    EXPECT_EQ(Marks(), "..");
    EXPECT_TRUE(document.IsModified()) << "a line less";
    Save();
    Undo(document.UndoStack().count());
    EXPECT_EQ(Marks(), "*.");
}

TEST_F(SavedLinesTest, WhatASaveLeavesOutMayBeLeftOutAgain)
{
    for (const char* name : {"A", "B", "C"})
        Add(name, 1);
    Open(MakeInitPage);
    grid->Model()->InsertRow(0);
    grid->Model()->DuplicateRows(3, 1);
    Save(); // without the line that has no place
    Undo(3);
    Save();
    EXPECT_EQ(Marks(), "...");
    while (document.UndoStack().canRedo())
        document.UndoStack().redo();
    EXPECT_EQ(Marks(), "...+");
}

TEST_F(SavedLinesTest, OfOtherContentNobodyKnowsWhichIsWhich)
{
    Add("A", 1, 10);
    Open(MakeInitPage);
    ASSERT_TRUE(document.TakeContent(document.ContentText().value(), "Recovery"));
    view->page->LoadFromDocument(&document);
    Enter(1, 3, "11");
    QTest::keyClick(grid, Qt::Key_Insert);
    EXPECT_EQ(Marks(), ".+");
    grid->SetCurrentCell(1, 3);
    CGridCommands::Run(GridAction::RevertToSaved, *grid);
    EXPECT_EQ(init.GetAt(0).InitialH, 11);
    Save();
    Enter(1, 3, "12");
    EXPECT_EQ(Marks(), "*");
}

TEST_F(SavedLinesTest, TheConversionOfResistancesIsAChangeOfTheirLines)
{
    globals.G_resistance = 40;
    for (const double resistance : {32, 0, 16}) {
        HD_Resistfact bed;
        bed.RiverName = "A";
        bed.Chainage = resistance;
        bed.Resistance = bed.ZoneResistance1 = bed.ZoneResistance2 = bed.ZoneResistance3 = resistance;
        document.Parameters().BedList.Add(bed);
        HDBedResTool tool;
        tool.RiverName = "A";
        tool.Chainage = resistance;
        tool.MinRes = resistance;
        tool.VeloRes = {{1, resistance}, {2, 0}};
        document.Parameters().BedResistanceToolboxList.Add(tool);
    }
    Open(MakeBedPage);
    answer = QMessageBox::Yes;
    auto* formula = Find<QComboBox>(1300);
    formula->setFocus();
    QTest::keyClick(formula, Qt::Key_Down);
    EXPECT_EQ(Marks(), "*.*");
    EXPECT_TRUE(CellTip(3, 3).contains("Was 16 ")) << CellTip(3, 3).toStdString();
    Undo();
    EXPECT_EQ(Marks(), "...");
    document.UndoStack().redo();
    Open(MakeBedToolboxPage);
    auto* pairs = Find<CGenGrid>(1320);
    EXPECT_EQ(Marks(), "*.*") << LineData(2, Qt::ToolTipRole).toStdString();
    EXPECT_EQ(Marks(*pairs), "*.");
    EXPECT_EQ(pairs->Model()->Saved().Before(0, 1), CellValue(32.0));
    Save();
    Undo();
    EXPECT_EQ(Marks(), "*.*") << "also of what is taken back";
    EXPECT_EQ(pairs->Model()->Saved().Before(0, 1), CellValue(1 / 32.0));
}

TEST_F(SavedLinesTest, LinesOfALineAreNewWithIt)
{
    for (const char* name : {"A", "B"}) {
        HDBedResTool tool;
        tool.RiverName = name;
        tool.Chainage = 1;
        tool.VeloRes = {{1, 2}, {3, 4}, {5, 6}};
        document.Parameters().BedResistanceToolboxList.Add(tool);
    }
    globals.BedResist.Method = 9; // unknown: may use anything
    Open(MakeBedToolboxPage);
    auto* pairs = Find<CGenGrid>(1320);
    grid->SetCurrentCell(1, 1);
    CGridCommands::Run(GridAction::Duplicate, *grid);
    EXPECT_EQ(Marks(), ".+.");
    EXPECT_EQ(Marks(*pairs), "+++");
    grid->SetCurrentCell(3, 1);
    EXPECT_EQ(Marks(*pairs), "...");
    pairs->Model()->MoveRows(2, 1, true);
    pairs->Model()->setData(pairs->model()->index(1, 1), "7", Qt::EditRole);
    EXPECT_EQ(Marks(*pairs), ".*.") << "what is typed counts at once";
    pairs->Model()->Store();
    pairs->Model()->InsertRow(0);
    pairs->Model()->RemoveRows(1, 1);
    EXPECT_EQ(Marks(*pairs), "+*.");
    EXPECT_EQ(pairs->Model()->Saved().Before(1, 1), CellValue(6.0));
    CGridCommands::Run(GridAction::MoveUp, *grid);
    EXPECT_EQ(Marks(*pairs), "+*.") << "the line that owns them has moved";
    pairs->selectAll();
    CGridCommands::Run(GridAction::RevertToSaved, *pairs);
    EXPECT_EQ(Marks(*pairs), "+..");
}

TEST_F(SavedLinesTest, AFixedRowIsNoLine)
{
    HDWLCurve curve;
    curve.RiverName = "A";
    curve.Chainage = 10;
    document.Parameters().WLCurveList.Add(curve);
    curve.RiverName = "B";
    document.Parameters().WLCurveList.Add(curve);
    Open(MakeWLCurvePage);
    // As another editor does, who knows nothing of the row.
    const auto lines = MakeListRows(document.Parameters().WLCurveList);
    InsertLines(document, lines, 1, lines->NewRows(1));
    grid->Refresh();
    EXPECT_EQ(Marks(), "..+.");
    grid->Model()->setData(grid->model()->index(3, 1), "11", Qt::EditRole);
    grid->Model()->Store();
    EXPECT_EQ(Marks(), "..+*");
    DeleteLines(document, lines, 0, 1);
    grid->Refresh();
    EXPECT_EQ(Marks(), ".+*");
}

TEST_F(SavedLinesTest, SetupsAreNewAsAWhole)
{
    auto& setup = document.Parameters().EncroachList.Add();
    for (int line = 0; line < 2; ++line) {
        HDEncroach& added = setup.Add();
        added.RiverName = "A";
        added.Chainage = line;
    }
    Open(MakeEncroachPage);
    EXPECT_EQ(Marks(), "..");
    view->page->findChild<QAbstractButton*>("duplicate_1345")->click();
    EXPECT_EQ(Marks(), "++");
    Save();
    EXPECT_EQ(Marks(), "..");
    view->page->findChild<QAbstractButton*>("delete_1346")->click();
    EXPECT_EQ(Marks(), "..");
    Save();
    Undo();
    EXPECT_EQ(Marks(), "++") << "the file does not have it";
}

TEST_F(SavedLinesTest, WhereTitlesMoveTheLevelsNothingIsGuessed)
{
    globals.MarkTitles = {"LOW", "HIGH"};
    HDWLMark mark;
    mark.RiverName = "A";
    mark.Chainage = 1;
    mark.MarkLevels = {1, 2};
    document.Parameters().WaterLevelMarkList.Add(mark);
    mark.MarkLevels = {3}; // one fewer
    document.Parameters().WaterLevelMarkList.Add(mark);
    Open(MakeWLMarkPage);
    const auto typeLevel = [this] {
        grid->Model()->setData(grid->model()->index(1, 3), "5", Qt::EditRole);
        grid->Model()->Store();
    };
    typeLevel();
    EXPECT_EQ(Marks(), ".*");
    EXPECT_TRUE(CellTip(2, 4).contains("Was empty at the last save"));
    grid->selectAll();
    CGridCommands::Run(GridAction::RevertToSaved, *grid);
    EXPECT_EQ(Marks(), "..") << "a level that is not given is as good as one that is not there";
    typeLevel();
    auto* titles = view->page->findChild<CGenGrid*>("titles_1075");
    titles->Model()->InsertRow(0);
    view->page->LoadFromDocument(&document);
    EXPECT_EQ(Marks(*titles), "+..");
    EXPECT_EQ(Marks(), "..");
    Undo();
    EXPECT_EQ(Marks(), ".*");
}
