#include "page_fixture.h"
#include "pages/page_table.h"

#include "grid/grid_search.h"

class SearchTest : public PageTest
{
protected:
    SearchTest()
    {
        Add("RIVER1", 100);
        Add("MYRIVER", 200.5);
        Add("RIVER2", 300);
        Add("RIV", NotGiven);
        Open(MakeInitPage);
    }
    /// The rows found one after the other, as "search" and "search again" do.
    QList<int> Found(const LineQuery& query, int from = 0)
    {
        QList<int> rows;
        int row = from;
        while (SearchRows(*grid, row, query)) {
            EXPECT_EQ(row, grid->CurrentRow() + 1);
            rows << grid->CurrentRow();
        }
        EXPECT_EQ(row, 0);
        return rows;
    }
};

TEST_F(SearchTest, Criteria)
{
    using enum ChainageMatch;
    using enum NameMatch;
    const struct
    {
        LineQuery query;
        QList<int> rows;
    } cases[] = {
        {{}, {1, 2, 3, 4}},
        {{"RIV"}, {1, 3, 4}},
        {{"RIV", 0, Any, Whole}, {4}},
        {{"", 0, Any, Whole}, {1, 2, 3, 4}},
        {{"river1", 0, Any, Whole}, {1}},
        {{"", 200.5, Equal}, {2}},
        {{"", 200, Equal}, {}},
        {{"", 200.5, Less}, {1, 4}}, // an empty cell reads as 0
        {{"", 200.5, Greater}, {3}},
        {{"", 0, Equal}, {4}},
        {{"RIVER", 100, Greater}, {3}},
    };
    for (const auto& c : cases)
        EXPECT_EQ(Found(c.query), c.rows) << c.query.name.toStdString() << ' ' << c.query.chainage;
    EXPECT_EQ(Found({}, 3), (QList<int>{3, 4}));
    EXPECT_TRUE(Found({}, 9).isEmpty());
}

TEST_F(SearchTest, ComparesWhatIsShownAndWhatWasTyped)
{
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    Enter(1, 2, "1234.5"); // feet
    const double wanted = CKsEditStyle(UnitGroup::Chainage).UnitConvertFromBase(1234.5, 0);
    EXPECT_EQ(Found({"", wanted, ChainageMatch::Equal}), QList<int>{1});
    init.GetAt(2).Chainage = 1000 / 3.0; // 1093.6132983... feet, compared to six decimals
    const double third = CKsEditStyle(UnitGroup::Chainage).UnitConvertFromBase(1093.613298, 0);
    EXPECT_EQ(Found({"", third, ChainageMatch::Equal}), QList<int>{3});
    grid->Model()->setData(grid->Model()->index(1, 0), "typed", Qt::EditRole);
    EXPECT_EQ(Found({"TYPED", 0, ChainageMatch::Any, NameMatch::Whole}), QList<int>{2})
        << "a line that is not stored yet";
}

TEST_F(SearchTest, GotoLine)
{
    grid->SetCurrentCell(1, 3);
    view->page->GotoLine(3);
    EXPECT_EQ(Current(), std::pair(3, 1)) << "in the leftmost column shown";
    view->page->GotoLine(99);
    EXPECT_EQ(grid->CurrentRow(), 4);
}
