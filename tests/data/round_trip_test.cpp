// A file in which nothing has its default comes back bit for bit; the tests walk the tables, so that no keyword and no
// field can be forgotten.
#include "hd_support.h"

#include "sample_river.h"

#include <set>

namespace {

void DisturbRecord(HD_RiverPos& record, int& seed)
{
    Disturb(LocationFields(), &record, seed);
    Disturb(record.Fields(), &record, seed);
}

HD_Parameters Disturbed()
{
    HD_Parameters parameters;
    int seed = 0;
    ForEachGlobal([&](const std::string&, FieldList fields) { Disturb(fields, &parameters.Global, seed); });
    parameters.EncroachList.Add();
    parameters.EncroachList.Add();
    ForEachList(parameters, parameters, [&seed](const char*, CGenParamListBase& list, CGenParamListBase&) {
        for (int i = 0; i < 3; ++i)
            DisturbRecord(list.AddTail(list.NewRecord()), seed);
    });
    return parameters;
}

/// Every single field differs, in groups by their length.
void ExpectAllDiffer(const std::string& name, FieldList fields, const void* a, const void* b)
{
    for (const Field& field : fields)
        EXPECT_FALSE(SameFields({&field, 1}, a, b)) << name << ' ' << field.name;
}

} // namespace

TEST(RoundTrip, EveryValueDiffersFromItsDefaultAndComesBack)
{
    HD_Parameters before = Disturbed();
    const HD_Parameters defaults;
    ForEachGlobal([&](const std::string& name, FieldList fields) {
        ExpectAllDiffer(name, fields, &before.Global, &defaults.Global);
    });
    ForEachList(before, before, [](const std::string& name, CGenParamListBase& list, CGenParamListBase&) {
        ExpectAllDiffer(name, LocationFields(), &list.GetAt(0), list.NewRecord().get());
        ExpectAllDiffer(name, list.Fields(), &list.GetAt(0), list.NewRecord().get());
        ExpectAllDiffer(name, list.Fields(), &list.GetAt(0), &list.GetAt(1));
    });

    const std::string text = HDFileText(before);
    HD_Parameters after;
    after.Load(Parsed(text).Get());
    ForEachGlobal([&](const std::string& name, FieldList fields) {
        EXPECT_TRUE(SameFields(fields, &before.Global, &after.Global)) << name;
    });
    ASSERT_EQ(after.EncroachList.GetCount(), 2u);
    ForEachList(before, after, [](const std::string& name, CGenParamListBase& a, CGenParamListBase& b) {
        ASSERT_EQ(a.GetCount(), b.GetCount()) << name;
        for (std::size_t i = 0; i < a.GetCount(); ++i) {
            EXPECT_TRUE(SameFields(LocationFields(), &a.GetAt(i), &b.GetAt(i))) << name;
            EXPECT_TRUE(SameFields(a.Fields(), &a.GetAt(i), &b.GetAt(i))) << name;
        }
    });
    EXPECT_EQ(HDFileText(after), text);
    EXPECT_TRUE(after.Unknown.InTarget.empty() && after.Unknown.Targets.empty());
}

TEST(RoundTrip, AClonedRecordIsEqualAndIndependent)
{
    HD_Parameters source = Disturbed();
    const auto clone = source.MixingCoefList.GetAt(0).Clone();
    EXPECT_TRUE(SameFields(LocationFields(), clone.get(), &source.MixingCoefList.GetAt(0)));
    EXPECT_TRUE(SameFields(clone->Fields(), clone.get(), &source.MixingCoefList.GetAt(0)));
    clone->CoefPairs.clear();
    EXPECT_FALSE(source.MixingCoefList.GetAt(0).CoefPairs.empty());
}

TEST(RoundTrip, ComparisonSeesTheLastBit)
{
    HD_Initial a, b;
    a.InitialH = 0.0;
    b.InitialH = -0.0;
    EXPECT_FALSE(SameFields(a.Fields(), &a, &b));
    a.InitialH = b.InitialH = std::numeric_limits<double>::quiet_NaN();
    EXPECT_TRUE(SameFields(a.Fields(), &a, &b));
}

// The names, their order, the parameter types and the defaults are the format; this file is their record.
TEST(Layout, ANewFileIsTheRecordedOne)
{
    HD_Parameters parameters;
    parameters.Global.TextOutput.LimitedPeriodStart = {2024, 2, 29, 23, 59, 58};
    parameters.Global.TextOutput.LimitedPeriodEnd = {2024, 3, 1, 0, 0, 0};
    ExpectRecorded(HDFileText(parameters), KVR_SOURCE_DIR "/tests/corpus/hd/defaults.hdkv");
}

// Likewise one record of every family and one element of every item list with their defaults.
TEST(Layout, NewRecordsAreTheRecordedOnes)
{
    HD_Parameters parameters;
    parameters.EncroachList.Add();
    ForEachList(parameters, parameters, [](const char*, CGenParamListBase& list, CGenParamListBase&) {
        list.AddTail(list.NewRecord()).RiverName = "RIVER";
    });
    HD_Global_Var& global = parameters.Global;
    global.TextOutput.LimitedPeriodStart = global.TextOutput.LimitedPeriodEnd = {2024, 2, 29, 23, 59, 58};
    global.TextOutput.OutputItems.resize(1);
    global.TextOutput.OutputFiles.resize(1);
    global.MapOutput.MapOutputFiles.resize(1);
    global.MapOutput.MapOutputFiles[0].StartTime = global.MapOutput.MapOutputFiles[0].EndTime = {2024, 1, 2, 3, 4, 5};
    global.MapOutput.DemInputFiles.resize(1);
    ExpectRecorded(HDFileText(parameters, true), KVR_SOURCE_DIR "/tests/corpus/hd/records.hdkv");
}

TEST(Layout, NamesInTheTablesAreUnique)
{
    std::set<std::string_view> sections{HDGlobals().name};
    for (const DeclaredSection& section : HDGlobals().Sections()) {
        EXPECT_TRUE(sections.insert(section.name).second) << section.name;
        std::set<std::string_view> names;
        for (const DeclaredKeyword& row : section.keywords) {
            EXPECT_TRUE(names.insert(row.name).second) << row.name;
            EXPECT_TRUE(row.onlyWith.empty() || names.contains(row.onlyWith)) << row.name;
        }
        for (const DeclaredSection& items : section.Sections()) {
            EXPECT_TRUE(sections.insert(items.name).second) << items.name;
            EXPECT_TRUE(items.keywords.front().Fields().front().group->extra) << items.name;
        }
    }
    HD_Parameters parameters;
    for (const ListEntry& entry : HDLists()) {
        EXPECT_TRUE(sections.insert(entry.section).second) << entry.section;
        EXPECT_EQ(entry.list(parameters).SectionName(), entry.section);
    }
}

TEST(Example, TheCommittedFilesAreWhatTheGeneratorMakes)
{
    const std::string text = HDFileText(SampleRiver());
    ExpectRecorded(text, KVR_SOURCE_DIR "/examples/river/river.HDKV");
    HD_Parameters sample = SampleRiver();
    ForEachList(sample, sample, [](const std::string& name, CGenParamListBase& list, CGenParamListBase&) {
        EXPECT_GE(list.GetCount(), 12u) << name;
        EXPECT_LE(list.GetCount(), 100u) << name;
    });
    EXPECT_EQ(LongRiver(1000).InitList.GetCount(), 1000u);
}
