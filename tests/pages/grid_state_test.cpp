#include "page_fixture.h"
#include "pages/page_table.h"

#include "grid/gen_grid.h"
#include "grid/grid_state.h"
#include "grid/grid_widths.h"

class GridStateTest : public PageTest
{
protected:
    GridStateTest()
    {
        Add("A", 1, 10, 20);
        Add("B", 2, 11, 21);
        Add("A", 3, 12, 22);
        Open(MakeInitPage);
    }
    std::string Chainages() const
    {
        std::string text;
        for (int row = 1; row <= grid->RowCount(); ++row)
            text += grid->TextAt(row, 2).toStdString();
        return text;
    }
};

TEST_F(GridStateTest, WhatWasArrangedComesBackAndTheDocumentIsLeftAlone)
{
    EXPECT_TRUE(GridState::Of(*grid).isEmpty()) << "a table as it comes";
    grid->SetCurrentCell(3, 4);
    grid->setColumnWidth(1, 133);
    grid->Widths().SetChosen();
    grid->ChangeView([](CGridModel& model) {
        model.SortBy({{1, true}});
        model.Filter({"a"});
    });
    const QVariantMap state = GridState::Of(*grid);
    Open(MakeInitPage);
    EXPECT_EQ(Chainages(), "123");
    GridState::Restore(*grid, state);
    EXPECT_EQ(Chainages(), "31");
    EXPECT_EQ(Current(), std::pair(1, 4));
    EXPECT_EQ(grid->columnWidth(1), 133);
    EXPECT_EQ(GridState::Of(*grid), state);
    EXPECT_EQ(document.UndoStack().count(), 0);
    EXPECT_FALSE(document.IsModified());
}

TEST_F(GridStateTest, WhatIsDamagedOrOfAnotherTableDoesNoHarm)
{
    grid->ChangeView([](CGridModel& model) { model.SortBy({{1, true}}); });
    grid->SetCurrentCell(2, 2);
    const QVariantMap whole = GridState::Of(*grid);
    Open(MakeInitPage);
    const auto with = [&whole](const char* key, const QVariant& value) {
        QVariantMap state = whole;
        state[key] = value;
        return state;
    };
    for (const QVariantMap& state :
         {QVariantMap(), with("columns", 3), with("columns", "many"), with("columns", QVariantList{4})}) {
        GridState::Restore(*grid, state);
        EXPECT_EQ(Chainages(), "123");
    }
    GridState::Restore(*grid, with("order", QVariantList{0, 99, -7, "x", QVariantMap()}));
    GridState::Restore(*grid, with("filter", QStringList{"", "", "", "", ">0"}));
    GridState::Restore(*grid, with("widths", QVariantList{-5, 1 << 30, "x", 0}));
    GridState::Restore(*grid, with("line", -3));
    GridState::Restore(*grid, with("line", 1 << 30));
    GridState::Restore(*grid, with("column", 1 << 30));
    EXPECT_EQ(grid->RowCount(), 3);
    for (int column = 0; column < grid->ColumnCount(); ++column)
        EXPECT_TRUE(grid->columnWidth(column) > 10 && grid->columnWidth(column) < 3000) << column;
    EXPECT_EQ(document.UndoStack().count(), 0);
}
