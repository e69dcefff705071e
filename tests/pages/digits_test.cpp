// What the formats of cells and fields hide can be seen: a mark, the tool tip, the status bar's text, all digits.
#include "page_fixture.h"

#include "grid/cell_text.h"
#include "pages/framework/ctrl_edit.h"

namespace {

class DigitsTest : public PageTest
{
protected:
    ~DigitsTest() override { KsUnits::Instance().SetAllDigits(false); }
    QModelIndex Cell(int row, int column) const { return grid->model()->index(row - 1, column - 1); }
    QString Tip(int row, int column) const { return Cell(row, column).data(Qt::ToolTipRole).toString(); }
    /// Whether the upper right corner of the cell, as it is on the screen, has the mark's colour.
    bool IsMarked(int row, int column) const
    {
        const QImage shot = grid->viewport()->grab().toImage();
        const QRect cell = grid->visualRect(Cell(row, column));
        const QPoint corner = QPoint(cell.right(), cell.top()) * shot.devicePixelRatio();
        const QColor colour = shot.pixelColor(corner);
        const bool isSelected = grid->selectionModel()->isSelected(Cell(row, column));
        return colour == grid->palette().color(isSelected ? QPalette::HighlightedText : QPalette::Highlight);
    }
};

} // namespace

TEST_F(DigitsTest, ACellThatHidesDigitsSaysSo)
{
    Add("A", 1500.6, 0.00012, 2.5);
    Add("B", 1500, 1.125, 1234567.89012);
    Open<FamilyPage>(init);
    grid->SetCurrentCell(1, 1);
    const struct
    {
        int row, column;
        const char *shown, *tip;
    } cells[] = {{1, 2, "1501", "Full value: 1500.6 m\nUnit: m"},
                 {1, 3, "0.000", "Full value: 0.00012 m\nUnit: m"},
                 {1, 4, "2.500", "Unit: m³/s"},
                 {2, 2, "1500", "Unit: m"},
                 {2, 3, "1.125", "Unit: m"},
                 {2, 4, "1234567.890", "Full value: 1234567.89012 m³/s\nUnit: m³/s"}};
    for (const auto& cell : cells) {
        SCOPED_TRACE(cell.shown);
        const bool hides = QString(cell.tip).startsWith("Full");
        EXPECT_EQ(grid->TextAt(cell.row, cell.column), cell.shown);
        EXPECT_EQ(Tip(cell.row, cell.column), cell.tip);
        EXPECT_EQ(IsMarked(cell.row, cell.column), hides);
        grid->SetCurrentCell(cell.row, cell.column);
        EXPECT_EQ(IsMarked(cell.row, cell.column), hides) << "the current cell too";
        EXPECT_EQ(grid->LineText().contains(':'), hides) << grid->LineText().toStdString();
    }
    grid->SetCurrentCell(1, 2);
    EXPECT_EQ(grid->LineText(), "Line 1 of 2, Chainage: 1500.6 m");
    grid->SetCurrentCell(2, 2);
    EXPECT_EQ(grid->LineText(), "Line 2 of 2");
}

TEST_F(DigitsTest, AConversionHidesOnlyWhatItHas)
{
    Add("A", 304.8, 3.048, 0.3048 * 0.3048 * 0.3048);
    Add("B", 1500.6);
    Open<FamilyPage>(init);
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    EXPECT_EQ(Texts(1), "A|1000|10.000|1.000");
    for (int column = 2; column <= 4; ++column)
        EXPECT_FALSE(Tip(1, column).startsWith("Full")) << "the last place of a double is no digit of the number";
    EXPECT_TRUE(Tip(2, 2).startsWith("Full value: 4923.228346456"));
}

TEST_F(DigitsTest, WhatWasTypedInAnotherUnitReadsAsItWasTyped)
{
    Add("A", 0);
    Open<FamilyPage>(init);
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    for (const char* typed : {"7", "3.3", "1000.25", "0.1", "123456.789", "1e-07"}) {
        for (const int column : {2, 3, 4}) {
            Enter(1, column, typed);
            EXPECT_EQ(Cell(1, column).data(Qt::EditRole).toString(), typed) << column;
        }
    }
}

TEST_F(DigitsTest, AllDigitsShowsEveryCellAndFieldInFull)
{
    Add("A", 1500.6, 0.1 + 0.2, 1e-7);
    globals.G_waterlevel = -1.2345678901234567e-100;
    Open<FamilyPage>(init);
    auto* field = new CCtrlEdit(view.get());
    view->layout()->addWidget(field);
    field->setFixedWidth(400);
    field->Setup(globals.G_waterlevel, {.name = "level", .unit = UnitGroup::WaterLevel, .digits = 3}, {});
    EXPECT_EQ(field->text(), "-1.23e-100");
    EXPECT_EQ(field->toolTip(), "Full value: -1.2345678901234567e-100 m\nUnit: m");
    EXPECT_EQ(Texts(1), "A|1501|0.300|0.000");
    const int width = grid->columnWidth(2);

    Type(1, 3, "7.25"); // what is being typed stays
    KsUnits::Instance().SetAllDigits(true);
    field->Show();
    ASSERT_TRUE(Editor());
    QTest::keyClick(Editor(), Qt::Key_Escape);
    EXPECT_EQ(Texts(1), "A|1500.6|0.30000000000000004|1e-07");
    EXPECT_FALSE(IsMarked(1, 2));
    EXPECT_GT(grid->columnWidth(2), width) << "an elided number shows no digits";
    EXPECT_EQ(field->text(), "-1.2345678901234567e-100") << "longer than what may be typed";
    EXPECT_EQ(field->toolTip(), "Unit: m");
    field->setFixedWidth(90);
    view->layout()->activate();
    field->Show();
    EXPECT_EQ(field->toolTip(), "Full value: -1.2345678901234567e-100 m\nUnit: m") << "no room for all of it";
    EXPECT_TRUE(document.UndoStack().isClean());

    KsUnits::Instance().SetAllDigits(false);
    field->Show();
    EXPECT_EQ(Texts(1), "A|1501|0.300|0.000");
    EXPECT_EQ(field->text(), "-1.23e-100");
    EXPECT_EQ(field->maxLength(), 20);
}
