// Many cells at once: filled, continued, interpolated, calculated.
#include "page_fixture.h"
#include "pages/page_table.h"

#include "grid/cell_commands.h"
#include "grid/cell_operations.h"
#include "ks/units/formula.h"

#include <QCheckBox>
#include <QDialogButtonBox>
#include <QLabel>
#include <QPushButton>
#include <QRadioButton>
#include <QTableWidget>
#include <QTimer>

class CellOperationsTest : public PageTest
{
protected:
    CellOperationsTest()
    {
        Add("A", 0, 10, 1);
        Add("A", 100, 0, 2);
        Add("B", 50, 7, 3);
        Add("A", 400, 20, 4);
        Add("A", 300, 0, 5);
        Open(MakeInitPage);
    }
    /// Makes the results one step, as the commands do.
    void Make(CCellResults results)
    {
        EXPECT_EQ(results.RuleFault(), "");
        grid->Model()->ChangeCells("step", results.FirstRow(), results.TakeChanges());
    }
    CCellResults Calculated(const CellBlock& block, const char* text)
    {
        const FormulaNames names = NamesForFormula(*grid->Model());
        const CKsFormula formula(text, names.names);
        EXPECT_EQ(formula.Fault(), "") << text;
        return Calculate(*grid->Model(), block, formula, names);
    }
    QList<double> Levels() const
    {
        QList<double> levels;
        for (std::size_t i = 0; i < init.GetCount(); ++i)
            levels << init.GetAt(i).InitialH;
        return levels;
    }
    /// Does something in the dialog that comes up, and presses a button of it.
    void InDialog(const std::function<void(QDialog&)>& act, QDialogButtonBox::StandardButton button)
    {
        QTimer::singleShot(0, grid, [act, button] {
            auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
            ASSERT_TRUE(dialog);
            act(*dialog);
            dialog->findChild<QDialogButtonBox*>()->button(button)->click();
            if (dialog->isVisible())
                dialog->reject();
        });
    }
    static constexpr int Name = 0, Chainage = 1, Level = 2, Discharge = 3; // columns
};

TEST_F(CellOperationsTest, EachIsOneStepAndUndoneToTheLastBit)
{
    const auto& rows = *grid->Model();
    const QString before = Stored();
    Make(FillDown(rows, {0, Level, 3, Discharge}));
    EXPECT_EQ(Stored(), "A 0 10 1, A 100 10 1, B 50 10 1, A 400 10 1, A 300 0 5");
    document.UndoStack().undo();
    EXPECT_EQ(Stored(), before);

    Make(FillDown(rows, {2, Name, 2, Name})); // of one cell: from the one above
    EXPECT_EQ(init.GetAt(2).RiverName, "A");
    document.UndoStack().undo();

    EXPECT_EQ(StepOf(rows, {0, Name, 4, Level}), 100) << "of the first column of numbers";
    Make(FillSeries(rows, {0, Level, 4, Level}, 0.5));
    EXPECT_EQ(Levels(), (QList<double>{10, 10.5, 11, 11.5, 12}));
    document.UndoStack().undo();
    EXPECT_EQ(Stored(), before);

    Make(Calculated({0, Level, 4, Level}, "max(value, initial_q) * 2 + Chainage"));
    EXPECT_EQ(Levels(), (QList<double>{20, 104, 64, 440, 310}));
    document.UndoStack().undo();
    EXPECT_EQ(Stored(), before);
    document.UndoStack().redo();
    EXPECT_EQ(document.UndoStack().count(), 1);
}

TEST_F(CellOperationsTest, InterpolationGoesAlongEachBranch)
{
    const auto& rows = *grid->Model();
    const CellBlock all{0, Name, 4, Level};
    const auto levels = [&](const CellBlock& block, KnownValues known, bool extrapolates, std::size_t kept) {
        CCellResults results = Interpolate(rows, block, known, extrapolates);
        EXPECT_EQ(results.KeptCount(), kept);
        Make(std::move(results));
        const QList<double> result = Levels();
        document.UndoStack().undo();
        return result;
    };
    EXPECT_EQ(levels(all, KnownValues::Ends, false, 0), (QList<double>{10, 12.5, 7, 20, 17.5}));
    init.GetAt(3).RiverName = "a"; // as a file may have it
    EXPECT_EQ(levels(all, KnownValues::Ends, false, 0), (QList<double>{10, 12.5, 7, 20, 17.5}));
    // Of lines that are not selected: A at 0 and 400 for those between, nothing behind 300.
    EXPECT_DOUBLE_EQ(levels({1, Level, 1, Level}, KnownValues::Neighbours, false, 0)[1], 10 - 10.0 / 3);
    EXPECT_EQ(levels({3, Level, 3, Level}, KnownValues::Neighbours, false, 1), (QList<double>{10, 0, 7, 20, 0}));
    EXPECT_EQ(levels({2, Level, 2, Level}, KnownValues::Neighbours, true, 1), Levels()) << "one line, nothing known";
    grid->ChangeView([](CGridModel& model) { model.Filter({"", "!=0"}); }); // hides the first of A, which is known
    EXPECT_DOUBLE_EQ(levels({0, Level, 0, Level}, KnownValues::Neighbours, false, 0)[1], 10 - 10.0 / 3);
    grid->ChangeView([](CGridModel& model) { model.Filter({}); });
    init.GetAt(1).RiverName = "B";
    EXPECT_EQ(levels({1, Level, 1, Level}, KnownValues::Neighbours, true, 1), Levels()) << "no line through one value";
    init.GetAt(1).RiverName = "A";
    init.GetAt(4).InitialH = 6;
    EXPECT_EQ(levels({3, Level, 3, Level}, KnownValues::Neighbours, true, 0), (QList<double>{10, 0, 7, 9, 6}));
    init.GetAt(4).Chainage = 400; // two at one place
    EXPECT_EQ(levels(all, KnownValues::Ends, false, 0), (QList<double>{10, 9, 7, 6, 6})) << "the last of them";
    init.GetAt(0).Chainage = NotGiven;
    EXPECT_EQ(levels(all, KnownValues::Ends, false, 1)[0], 10);
}

TEST_F(CellOperationsTest, WhatCannotChangeStaysAndIsListed)
{
    const auto& rows = *grid->Model();
    init.GetAt(1).Chainage = NotGiven;
    CCellResults results = Calculated({0, Chainage, 4, Chainage}, "Chainage / Chainage");
    EXPECT_EQ(results.ChangedCount(), 3u);
    ASSERT_EQ(results.KeptCount(), 2u);
    EXPECT_EQ(results.Kept()[0].after, "The result is no number.");
    EXPECT_EQ(results.Kept()[1].after, "A cell that the formula names is empty.");
    EXPECT_EQ(results.Kept()[1].row, 1);
    EXPECT_EQ(Calculated({0, Name, 4, Name}, "1").ChangedCount(), 0u) << "a name is no number";
    EXPECT_EQ(Calculated({0, Level, 99, Level}, "1").ChangedCount(), 5u) << "rows that there are";

    // A unit that is shown converted: what a formula leaves alone keeps its last bit.
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    init.GetAt(0).InitialH = 1.0 / 3;
    init.GetAt(3).InitialH = 0.1;
    EXPECT_EQ(Calculated({0, Level, 4, Level}, "value").ChangedCount(), 0u);
    EXPECT_EQ(FillSeries(rows, {0, Level, 0, Level}, 1).ChangedCount(), 0u);
    Make(Calculated({0, Level, 0, Level}, "value * 0 + 1"));
    EXPECT_EQ(init.GetAt(0).InitialH, 0.3048) << "one foot";
    init.GetAt(0).InitialH = 100;
    Make(Calculated({0, Level, 0, Level}, "value + 1"));
    EXPECT_EQ(init.GetAt(0).InitialH, 100.3048) << "without what the conversion makes of the last places";
    init.GetAt(0).InitialH = 8.5 * 0.3048;
    init.GetAt(1).InitialH = 8.7 * 0.3048;
    EXPECT_EQ(StepOf(rows, {0, Level, 1, Level}), 0.2);

    auto& beds = document.Parameters().BedList;
    for (const double value : {30, 40})
        beds.Add().Resistance = value;
    globals.ResisZone = 1; // the zones count, the value of the whole section is locked
    Open(MakeBedPage);
    CCellResults locked = FillDown(*grid->Model(), {0, 2, 1, 2});
    EXPECT_EQ(locked.KeptCount(), 1u);
    EXPECT_TRUE(locked.TakeChanges().IsEmpty());
}

TEST_F(CellOperationsTest, IntegersStayWithinTheirBounds)
{
    std::vector<std::int32_t> numbers{-1, 1};
    CGridModel model;
    model.AddColumn({.header = [] { return QString("Count"); },
                     .control = Control::Integer,
                     .access = std::make_shared<CellAccess>(
                         CellAccess{[](const void* row) -> CellValue { return *static_cast<const std::int32_t*>(row); },
                                    [](void* row, const CellValue& value) {
                                        *static_cast<std::int32_t*>(row) = std::get<std::int32_t>(value);
                                    }})});
    model.SetSource(document, std::make_shared<VectorRows<std::int32_t>>(numbers));
    const FormulaNames names = NamesForFormula(model);
    const auto calculate = [&](const char* text) {
        CCellResults results = Calculate(model, {0, 0, 1, 0}, CKsFormula(text, names.names), names);
        EXPECT_EQ(results.ChangedCount() + results.KeptCount(), 2u);
        return results.ChangedCount();
    };
    EXPECT_EQ(calculate("value * 2147483648"), 1u) << "the least, and one more than the largest";
    EXPECT_EQ(calculate("value * 2147483647"), 2u);
    EXPECT_EQ(calculate("value * 2147483649"), 0u);
}

TEST_F(CellOperationsTest, TheDialogShowsWhatWouldChangeAndKeysRunIt)
{
    grid->setFocus();
    grid->SelectLines(1, 5);
    InDialog(
        [](QDialog& dialog) {
            auto* formula = dialog.findChild<QLineEdit*>();
            formula->selectAll();
            QTest::keyClicks(formula, "=value +");
            QTest::qWait(600);
            EXPECT_FALSE(dialog.findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok)->isEnabled());
            QTest::keyClicks(formula, " 1");
            QTest::qWait(600);
            const auto* first = dialog.findChild<QTableWidget*>();
            ASSERT_GT(first->rowCount(), 2);
            EXPECT_EQ(first->item(0, 2)->text() + " " + first->item(0, 3)->text(), "0 1");
        },
        QDialogButtonBox::Cancel);
    QTest::keyClick(grid, Qt::Key_E, Qt::ControlModifier);
    EXPECT_EQ(document.UndoStack().count(), 0);

    grid->selectionModel()->select({grid->model()->index(0, Level), grid->model()->index(4, Level)},
                                   QItemSelectionModel::ClearAndSelect);
    InDialog([](QDialog&) {}, QDialogButtonBox::Ok);
    QTest::keyClick(grid, Qt::Key_E, Qt::ControlModifier | Qt::ShiftModifier);
    EXPECT_EQ(Levels(), (QList<double>{10, 12.5, 7, 20, 17.5}));
    QTest::keyClick(grid, Qt::Key_D, Qt::ControlModifier);
    EXPECT_EQ(Levels(), (QList<double>{10, 10, 10, 10, 10}));
    EXPECT_EQ(document.UndoStack().count(), 2);
    EXPECT_EQ(boxes, QStringList());
}
