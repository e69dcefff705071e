#include "page_fixture.h"

#include "grid/cell_text.h"

#include <QAbstractItemModelTester>
#include <bit>
#include <cmath>
#include <limits>

namespace {

constexpr double Odd[] = {0.1, -0.0, 1.0 / 3, 123456789.123456789, 5e-324, 1.7976931348623157e308, NotGiven, 1500.6};

/// Every single field of a record, bit by bit.
std::string Bits(const CGenList& list)
{
    std::string bits;
    const auto add = [&](double value) { bits += std::to_string(std::bit_cast<std::uint64_t>(value)) + ' '; };
    for (std::size_t i = 0; i < list.GetCount(); ++i) {
        add(list.GetAt(i).Chainage);
        for (const Field& field : list.Fields())
            if (field.kind == FieldKind::Number)
                add(field.In<double>(&list.GetAt(i)));
    }
    return bits;
}

} // namespace

class ModelTest : public PageTest
{
};

TEST_F(ModelTest, EveryFamily)
{
    for (const ListEntry& entry : HDLists()) {
        CListSection& section = entry.list(document.Parameters());
        if (section.HasSets())
            continue;
        SCOPED_TRACE(entry.section);
        document.SetModifiedFlag(false);
        CGenList& list = section.ListAt(0);
        auto& page = Open<FamilyPage>(list);
        CGridModel& model = *grid->Model();
        QAbstractItemModelTester tester(&model, QAbstractItemModelTester::FailureReportingMode::Fatal);
        ASSERT_EQ(list.GetCount(), 0u);
        ASSERT_EQ(model.rowCount(), 1); // the page shows a line
        EXPECT_FALSE(document.IsModified());

        // Every cell takes a value and gives it back; a line's cells do not touch each other.
        const int last = grid->ColumnCount();
        const auto typed = [&model](int column) {
            const ColumnSpec& spec = model.Columns()[std::size_t(column - 1)];
            return column == 1                       ? QStringLiteral("RHINE")
                   : spec.Kind() == CellKind::Choice ? spec.choices.entries().last()
                                                     : QString::number(column);
        };
        for (int column = 1; column <= last; ++column) {
            const bool text = column == 1;
            EXPECT_TRUE(model.setData(model.index(0, column - 1), text ? "Rhine" : typed(column), Qt::EditRole));
            page.StoreToDocument();
        }
        for (int column = 1; column <= last; ++column)
            EXPECT_EQ(model.index(0, column - 1).data(Qt::EditRole).toString(), typed(column));
        page.AppendLine();
        page.AppendLine();
        SelectRows(1, 2);
        page.DeleteLines();
        EXPECT_EQ(model.rowCount(), 1);
        while (document.UndoStack().canUndo())
            document.UndoStack().undo();
        EXPECT_EQ(model.rowCount(), 1);
        EXPECT_TRUE(list.IsEmpty());
        EXPECT_EQ(boxes, QStringList());
    }
}

TEST_F(ModelTest, VisitingChangesNoBit)
{
    for (const KsUnitSystem system : {KsUnitSystem::Metric, KsUnitSystem::UsCustomary}) {
        KsUnits::Instance().SetSystem(system);
        init.RemoveAll();
        document.UndoStack().clear();
        document.SetModifiedFlag(false);
        for (double value : Odd)
            Add("ODD", value, value, -value);
        Add("NAN", 1, std::nan("7"), std::numeric_limits<double>::infinity());
        const std::string before = Bits(init);
        auto& page = Open<FamilyPage>(init);
        const int rows = grid->RowCount(); // Tab behind the last cell adds one
        for (int row = 1; row <= rows; ++row)
            for (int column = 1; column <= grid->ColumnCount(); ++column) {
                grid->SetCurrentCell(row, column);
                QTest::keyClick(grid, Qt::Key_F2); // open the editor, and leave it
                ASSERT_TRUE(Editor());
                QTest::keyClick(Editor(), Qt::Key_Tab);
            }
        init.RemoveAt(init.GetCount() - 1);
        EXPECT_TRUE(page.OnKillActive());
        EXPECT_EQ(Bits(init), before);
        EXPECT_EQ(document.UndoStack().count(), 1); // the appended line
        EXPECT_EQ(boxes, QStringList());
    }
}

TEST_F(ModelTest, StoringTouchesOnlyTheCell)
{
    for (double value : Odd)
        Add("ODD", value, value, value);
    auto& page = Open<FamilyPage>(init);
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    const std::string before = Bits(init);
    CGridModel& model = *grid->Model();
    model.setData(model.index(3, 2), "10", Qt::EditRole);
    EXPECT_EQ(Bits(init), before) << "typed, not stored";
    EXPECT_EQ(grid->TextAt(4, 3), "10.000");
    page.LoadFromDocument(&document);
    EXPECT_EQ(grid->TextAt(4, 3), "10.000") << "a reload keeps what was typed";
    page.StoreToDocument();
    EXPECT_NEAR(init.GetAt(3).InitialH, 3.048, 1e-6);
    document.UndoStack().undo();
    EXPECT_EQ(Bits(init), before);
    page.LoadFromDocument(&document);
    page.StoreToDocument();
    EXPECT_EQ(Bits(init), before) << "what was typed is not stored twice";
}

TEST_F(ModelTest, TextsOfNumbers)
{
    struct
    {
        double value;
        const char* format;
        GridControl control;
        const char *shown, *edited;
    } const cases[] = {
        {1234.5, "%-lf", Control::Chainage, "1234", "1234.5"}, // half to even, as the platform rounds
        {1500.6, "%-lf", Control::Chainage, "1501", "1500.6"},
        {1234567.891, "%.6lg", Control::Number, "1234567.891", "1234567.891"},
        {1211.6568, "%.6lg", Control::Number, "1211.657", "1211.6568"}, // no zeros that nobody typed
        {0.0325, "%.6lg", Control::Formatted, "0.0325", "0.0325"},
        {0.1 + 0.2, "%.6lg", Control::Number, "0.300", "0.30000000000000004"},
        {1e-7, "%-lf", Control::Number, "0.000", "1e-07"},
        {NotGiven, "%-lf", Control::Number, "10000000000.000", "10000000000"},
        {std::nan(""), "%-lf", Control::Number, "nan", "nan"},
    };
    for (const auto& c : cases) {
        ColumnSpec column;
        column.control = c.control;
        column.style = CKsEditStyle(UnitGroup::None, c.format);
        EXPECT_EQ(ShownText(column, c.value), c.shown) << c.value;
        EXPECT_EQ(EditText(column, c.value), c.edited) << c.value;
    }
    ColumnSpec chainage;
    chainage.emptyIsNotGiven = true;
    EXPECT_EQ(ShownText(chainage, NotGiven), "");
    EXPECT_NE(ShownText(chainage, std::nextafter(NotGiven, 0)), "");
}

TEST_F(ModelTest, FollowsTheListWithoutLosingPlaceOrTypedText)
{
    for (int i = 0; i < 10; ++i)
        Add("R", i);
    auto& page = Open<FamilyPage>(init);
    QAbstractItemModelTester tester(grid->Model(), QAbstractItemModelTester::FailureReportingMode::Fatal);
    grid->SetCurrentCell(8, 3);
    grid->Model()->setData(grid->Model()->index(7, 3), "5", Qt::EditRole);
    init.RemoveAt(0, 2); // another editor's doing
    page.LoadFromDocument(&document);
    EXPECT_EQ(grid->RowCount(), 8);
    EXPECT_EQ(Current(), std::pair(6, 3)) << "with its line";
    EXPECT_EQ(Texts(6), "R|7|0.000|5.000") << "what was typed follows its line";
    init.RemoveAt(3, 5);
    page.LoadFromDocument(&document);
    EXPECT_EQ(Current(), std::pair(0, 0)) << "no other line takes the place of one that is gone";
    const std::string left = Bits(init);
    page.StoreToDocument();
    EXPECT_EQ(Bits(init), left) << "what was typed into it goes with it";
    init.RemoveAll();
    page.LoadFromDocument(&document);
    EXPECT_EQ(Texts(1), "||0.000|0.000");
}

TEST_F(ModelTest, LockedCells)
{
    class LockedPage : public CLocationPage
    {
    public:
        explicit LockedPage(CKavo0_hdDoc* doc) : CLocationPage(doc, &HD_Parameters::InitList)
        {
            auto* table = new CGenGrid;
            (new QVBoxLayout(this))->addWidget(table);
            Grid(table).BranchName({}).Chainage({}).Value(&HD_Initial::InitialH, {.locked = [](const void* row) {
                return static_cast<const HD_RiverPos*>(row)->RiverName == "FIXED";
            }});
        }
    };
    Add("FIXED", 1, 2);
    Add("FREE", 1, 2);
    Open<LockedPage>();
    const auto cell = [&](int row) { return grid->Model()->index(row - 1, 2); };
    EXPECT_FALSE(cell(1).flags() & Qt::ItemIsEditable);
    EXPECT_EQ(cell(1).data(Qt::BackgroundRole).value<QBrush>(), qApp->palette().brush(QPalette::Button));
    EXPECT_FALSE(grid->Model()->setData(cell(1), "3", Qt::EditRole));
    EXPECT_TRUE(cell(2).flags() & Qt::ItemIsEditable);
    EXPECT_FALSE(cell(2).data(Qt::BackgroundRole).isValid());
    grid->Model()->setData(grid->Model()->index(0, 0), "free", Qt::EditRole);
    view->page->StoreToDocument();
    EXPECT_TRUE(cell(1).flags() & Qt::ItemIsEditable);
}
