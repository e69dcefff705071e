// Columns, tables and fields are as wide as what they hold, and give way where there is no room.
#include "page_fixture.h"

#include "grid/grid_widths.h"
#include "pages/framework/ctrl_edit.h"
#include "pages/page_table.h"

#include <QHeaderView>
#include <QScrollBar>

namespace {

/// Columns that are wider than their texts and headers.
class GenerousPage : public CLocationPage
{
public:
    GenerousPage(CKavo0_hdDoc* document, CGenList& list) : CLocationPage(document, list)
    {
        auto* grid = new CGenGrid;
        (new QVBoxLayout(this))->addWidget(grid);
        GridColumns columns = Grid(grid);
        columns.BranchName({}).Chainage({});
        for (const Field& field : list.Fields())
            columns.Value(field, {.width = 150});
    }
};

class WidthsTest : public PageTest
{
protected:
    ~WidthsTest() override { view.reset(); }
    /// The width of each column in a window of that width.
    std::vector<int> WidthsIn(int window)
    {
        view->resize(window, view->height());
        QTest::qWait(1);
        std::vector<int> widths;
        for (int column = 0; column < grid->ColumnCount(); ++column)
            widths.push_back(grid->columnWidth(column));
        return widths;
    }
    int Needed(int column) const
    {
        int needed = 0;
        for (const QString& line : grid->Model()->Column(column).HeaderLines())
            needed = std::max(needed, grid->fontMetrics().horizontalAdvance(line));
        for (int row = 1; row <= grid->RowCount(); ++row)
            needed = std::max(needed, grid->fontMetrics().horizontalAdvance(grid->TextAt(row, column + 1)));
        return needed;
    }
    bool Scrolls() const { return grid->horizontalScrollBar()->maximum() > 0; }

    CGenParamList<HDEncroach> lines{"Lines"};
};

} // namespace

TEST_F(WidthsTest, ColumnsGiveWhatTheyDoNotNeedAndTakeItBack)
{
    HDEncroach record;
    record.RiverName = "A LONG NAME OF A RIVER";
    record.Chainage = 123456.5;
    lines.Add(record);
    Open<GenerousPage>(lines);
    constexpr int wide = 3000, tiny = 300;
    const std::vector<int> usual = WidthsIn(wide), least = WidthsIn(tiny);
    EXPECT_TRUE(Scrolls()) << "nothing more to give";
    int sumOfUsual = 0, sumOfLeast = 0;
    for (std::size_t column = 0; column < usual.size(); ++column) {
        EXPECT_GE(least[column], Needed(int(column))) << column;
        EXPECT_LE(least[column], usual[column]) << column;
        sumOfUsual += usual[column];
        sumOfLeast += least[column];
    }
    ASSERT_LT(sumOfLeast + 50, sumOfUsual);
    const int beside = view->width() - grid->viewport()->width();
    WidthsIn((sumOfUsual + sumOfLeast) / 2 + beside);
    EXPECT_FALSE(Scrolls()) << "they share what is missing";
    EXPECT_EQ(WidthsIn(wide), usual);

    grid->Widths().SetChosen();
    EXPECT_EQ(WidthsIn(tiny), usual) << "the user's";
}

TEST_F(WidthsTest, AWiderTextIsNoLongerGivenAway)
{
    lines.Add(HDEncroach());
    Open<GenerousPage>(lines);
    const int before = WidthsIn(300)[0];
    EXPECT_TRUE(grid->model()->setData(grid->model()->index(0, 0), "A LONG NAME OF A RIVER"));
    QTest::qWait(1);
    EXPECT_GT(grid->columnWidth(0), before);
    WidthsIn(3000);
    EXPECT_GE(WidthsIn(300)[0], Needed(0));
}

TEST_F(WidthsTest, FieldsAreAsWideAsANumberWhateverTheWindow)
{
    for (const PageEntry& entry : PageTable()) {
        Open(entry.make);
        QList<int> widths;
        for (const int window : {900, 2500}) {
            view->resize(window, 700);
            QTest::qWait(1);
            for (const auto* field : view->page->findChildren<CCtrlEdit*>())
                if (field->isVisible())
                    widths << field->width();
        }
        EXPECT_EQ(widths.count(widths.value(0)), widths.size()) << view->page->objectName().toStdString();
    }
}
