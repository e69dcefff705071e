#include "page_fixture.h"

#include "pages/init_page.h"

class SearchTest : public PageTest
{
protected:
    SearchTest()
    {
        Add("RIVER1", 100);
        Add("MYRIVER", 200.5);
        Add("RIVER2", 300);
        Add("RIV", NotGiven);
        Open<CInitPage>();
    }
    /// The rows found one after the other, as "search" and "search again" do.
    QList<int> Found(const char* name, double chainage, int chainageCriterion, int nameCriterion, int from = 0)
    {
        QList<int> rows;
        int row = from;
        while (grid->SearchRows(row, name, chainage, chainageCriterion, nameCriterion)) {
            EXPECT_EQ(row, grid->CurrentRow() + 1);
            rows << grid->CurrentRow();
        }
        EXPECT_EQ(row, 0);
        return rows;
    }
};

TEST_F(SearchTest, Criteria)
{
    enum
    {
        Less,
        Equal,
        Greater,
        NotUsed
    };
    enum
    {
        Partial,
        Full,
        Neither
    };
    const struct
    {
        const char* name;
        double chainage;
        int chainageCriterion, nameCriterion;
        QList<int> rows;
    } cases[] = {
        {"", 0, NotUsed, Partial, {1, 2, 3, 4}}, {"RIV", 0, NotUsed, Partial, {1, 3, 4}},
        {"RIV", 0, NotUsed, Full, {4}},          {"RIV", 0, NotUsed, Neither, {1, 2, 3, 4}},
        {"river1", 0, NotUsed, Full, {1}},       {"", 200.5, Equal, Partial, {2}},
        {"", 200, Equal, Partial, {}},           {"", 200.5, Less, Partial, {1, 4}}, // an empty cell reads as 0
        {"", 200.5, Greater, Partial, {3}},      {"", 0, Equal, Partial, {4}},
        {"RIVER", 100, Greater, Partial, {3}},   {"", 0, 7, Partial, {}},
    };
    for (const auto& c : cases)
        EXPECT_EQ(Found(c.name, c.chainage, c.chainageCriterion, c.nameCriterion), c.rows)
            << c.name << ' ' << c.chainage << ' ' << c.chainageCriterion << ' ' << c.nameCriterion;
    EXPECT_EQ(Found("", 0, NotUsed, Partial, 3), (QList<int>{3, 4}));
    EXPECT_TRUE(Found("", 0, NotUsed, Partial, 9).isEmpty());
}

TEST_F(SearchTest, ComparesWhatIsShownAndWhatWasTyped)
{
    KsUnits::Instance().SetSystem(KsUnitSystem::UsCustomary);
    Enter(1, 2, "1234.5"); // feet
    EXPECT_EQ(Found("", CKsEditStyle(UnitGroup::Chainage).UnitConvertFromBase(1234.5, 0), 1, 0), QList<int>{1});
    grid->Model()->setData(grid->Model()->index(1, 0), "typed", Qt::EditRole);
    EXPECT_EQ(Found("TYPED", 0, 3, 1), QList<int>{2}) << "a line that is not stored yet";
}

TEST_F(SearchTest, GotoLine)
{
    grid->SetCurrentCell(1, 3);
    view->page->GotoLine(3);
    EXPECT_EQ(Current(), std::pair(3, 1)) << "in the leftmost column shown";
    view->page->GotoLine(99);
    EXPECT_EQ(grid->CurrentRow(), 4);
}
