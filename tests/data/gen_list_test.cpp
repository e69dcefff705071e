#include "hd_support.h"

#include <algorithm>
#include <cmath>

namespace {

HD_Initial At(const char* name, double chainage)
{
    HD_Initial record;
    record.RiverName = name;
    record.Chainage = chainage;
    return record;
}

template <typename T>
void Add(CGenParamList<T>& list, const char* name, double chainage)
{
    T record;
    record.RiverName = name;
    record.Chainage = chainage;
    list.Add(std::move(record));
}

using InitList = CGenParamList<HD_Initial>;
using Sets = CGenMetaList<HDEncroach>;

} // namespace

TEST(GenList, BlankIsNoNameOrExactlyTheMarker)
{
    EXPECT_TRUE(HD_Initial().IsBlank());
    EXPECT_TRUE(At("", 5).IsBlank());
    EXPECT_TRUE(At("R", 1e10).IsBlank());
    EXPECT_FALSE(At("R", std::nextafter(1e10, 0)).IsBlank());
    EXPECT_FALSE(At("R", std::numeric_limits<double>::quiet_NaN()).IsBlank());
}

TEST(GenList, IncompleteLinesGoAfterOneQuestionAtMost)
{
    const auto filled = [] {
        auto list = std::make_unique<InitList>("InitList");
        for (const auto& [name, chainage] : {std::pair("A", 1.0), {"", 2.0}, {"B", 1e10}, {"C", 3.0}, {"", 1e10}})
            list->Add(At(name, chainage));
        return list;
    };
    int questions = 0;
    const auto answer = [&questions](bool yes) {
        return [&questions, yes] {
            ++questions;
            return yes;
        };
    };
    bool asked = false;
    auto list = filled();
    const HD_RiverPos* const kept = &list->GetAt(3);
    EXPECT_FALSE(list->RemoveIncompleteLines(asked, answer(false)));
    EXPECT_EQ(list->GetCount(), 5u);
    EXPECT_FALSE(asked);
    EXPECT_FALSE(list->RemoveIncompleteLines(asked)); // nobody to agree
    EXPECT_TRUE(list->RemoveIncompleteLines(asked, answer(true)));
    EXPECT_TRUE(asked);
    ASSERT_EQ(list->GetCount(), 2u);
    EXPECT_EQ(&list->GetAt(1), kept); // records stay where they are in memory
    EXPECT_EQ(questions, 2);
    auto second = filled();
    EXPECT_TRUE(second->RemoveIncompleteLines(asked, answer(false))); // asked is set already
    EXPECT_EQ(second->GetCount(), 2u);
    asked = false;
    EXPECT_TRUE(second->RemoveIncompleteLines(asked, answer(false))); // nothing to ask about
    EXPECT_FALSE(asked);
    EXPECT_EQ(questions, 2);
}

TEST(GenList, LookUpsGoOnBehindTheLastHit)
{
    InitList list("InitList");
    for (const auto& [name, chainage] : {std::pair("MAIN", 1.0), {"MILL", 2.0}, {"MAIN UPPER", 1.0}, {"main", 4.0}})
        list.Add(At(name, chainage));
    std::size_t position = 0;
    EXPECT_EQ(list.FindByName("MAIN", position), &list.GetAt(0));
    EXPECT_EQ(list.FindByName("MAIN", position), &list.GetAt(2));
    EXPECT_EQ(position, 3u);
    EXPECT_EQ(list.FindByName("MAIN", position), nullptr);
    EXPECT_EQ(position, CGenList::End);
    EXPECT_EQ(list.FindByName("", position), nullptr);
    position = 1;
    EXPECT_EQ(list.FindByChainage(1, position), &list.GetAt(2));
    EXPECT_EQ(list.FindByChainage(std::nextafter(4.0, 5), position), nullptr);
}

TEST(GenList, InsertAndRemoveRanges)
{
    InitList list("InitList");
    list.Add(At("A", 1));
    std::vector<std::unique_ptr<HD_RiverPos>> block;
    for (const char* name : {"B", "C", "D"})
        block.push_back(std::make_unique<HD_Initial>(At(name, 2)));
    list.InsertAt(0, std::move(block));
    list.InsertAt(4, std::make_unique<HD_Initial>(At("E", 3)));
    const auto removed = list.RemoveAt(1, 2);
    ASSERT_EQ(removed.size(), 2u);
    EXPECT_EQ(removed[1]->RiverName, "D");
    EXPECT_EQ(list.RemoveAt(0)->RiverName, "B");
    ASSERT_EQ(list.GetCount(), 2u);
    EXPECT_EQ(list.GetAt(0).RiverName, "A");
    EXPECT_EQ(list.GetAt(1).RiverName, "E");
}

TEST(MetaList, ASetNeedsAFilledLineBehindItsFirst)
{
    HD_Parameters parameters;
    for (const std::vector<const char*>& names : {std::vector{"A"}, {"A", ""}, {"", "B", ""}, {}, {"", "", "C"}}) {
        auto& set = parameters.EncroachList.Add();
        for (const char* name : names)
            Add(set, name, 5);
    }
    HD_Parameters read;
    read.Load(Parsed(HDFileText(parameters)).Get());
    ASSERT_EQ(read.EncroachList.GetCount(), 2u);
    EXPECT_EQ(read.EncroachList.GetAt(0).GetCount(), 3u); // blank lines included
    EXPECT_EQ(read.EncroachList.GetAt(1).GetAt(2).RiverName, "C");
    EXPECT_EQ(read.EncroachList.GetAt(0).SectionName(), "Encroachment_Setup");

    HD_Parameters all;
    all.Load(Parsed(HDFileText(parameters, true)).Get());
    EXPECT_EQ(all.EncroachList.GetCount(), 5u);
    auto taken = all.EncroachList.RemoveAt(2);
    all.EncroachList.InsertAt(0, std::move(taken));
    EXPECT_EQ(all.EncroachList.GetAt(0).GetCount(), 3u);
    all.RemoveAllRecords();
    EXPECT_TRUE(all.EncroachList.IsEmpty());
}

TEST(Lists, ThoseThatSayItAreCleanedAtSave)
{
    HD_Parameters parameters;
    parameters.EncroachList.Add();
    ForEachList(parameters, parameters, [](const char*, CGenParamListBase& list, CGenParamListBase&) {
        list.AddTail(list.NewRecord());
        list.AddTail(list.NewRecord()).RiverName.assign(1, 'R');
    });
    bool asked = true;
    EXPECT_TRUE(parameters.RemoveIncompleteLines(asked));
    for (const ListEntry& entry : HDLists())
        EXPECT_EQ(entry.list(parameters).ListAt(0).GetCount(), entry.purgedAtSave ? 0u : 2u) << entry.section;
}
