// What a reader makes of files that are older, shorter or stranger than those it writes.
#include "hd_support.h"

TEST(Reading, OnlyGlobalValuesLeavesEverythingElseAtItsDefault)
{
    HD_Parameters read = FromSection("Global_Values", "G_waterlevel = 3\nG_wave = 2");
    EXPECT_EQ(read.Global.G_waterlevel, 3);
    EXPECT_EQ(read.Global.G_wave, 2);
    HD_Parameters expected;
    expected.Global.G_waterlevel = 3;
    expected.Global.G_wave = 2;
    for (HD_Parameters* p : {&read, &expected})
        p->Global.TextOutput.LimitedPeriodStart = p->Global.TextOutput.LimitedPeriodEnd = {};
    EXPECT_EQ(HDFileText(read), HDFileText(expected));
}

TEST(Reading, MissingTargetOrNothingAtAllKeepsValues)
{
    HD_Parameters parameters;
    parameters.Global.G_discharge = 7;
    parameters.Load(Parsed("[OTHER]\n[/OTHER]\n").Get());
    parameters.Load(nullptr);
    EXPECT_EQ(parameters.Global.G_discharge, 7);
    EXPECT_EQ(parameters.Unknown.Targets.size(), 1u);
}

TEST(Reading, BedResistanceTail)
{
    const struct
    {
        const char* params;
        double expected[4];
    } cases[] = {{"40", {40, 30, 25, 20}},
                 {"40, 1, 2, 3", {40, 1, 2, 3}},
                 {"40, 1", {40, 1, 25, 20}},
                 {"\"x\", 1, 2, 3", {30, 1, 2, 3}}};
    for (const auto& c : cases) {
        const HD_Parameters read = FromTarget(std::string("[BedList]\nDATA = \"R\", 5, ") + c.params + "\n[/BedList]");
        ASSERT_EQ(read.BedList.GetCount(), 1u);
        const HD_Resistfact& bed = read.BedList.GetAt(0);
        EXPECT_EQ(bed.Resistance, c.expected[0]) << c.params;
        EXPECT_EQ(bed.ZoneResistance1, c.expected[1]) << c.params;
        EXPECT_EQ(bed.ZoneResistance2, c.expected[2]) << c.params;
        EXPECT_EQ(bed.ZoneResistance3, c.expected[3]) << c.params;
    }
}

// A count is believed only as far as parameters are there, and nothing is allocated for it before.
TEST(Reading, CountsAreCheckedAgainstTheParameters)
{
    const struct
    {
        const char* params;
        std::size_t pairs; // 1 pair is there before
        double first;      // MixCoef1, 0.17 before
    } cases[] = {{"0, 1, 2, 3, 4", 0, 1},        {"1, 8, 9, 1, 2, 3, 4", 1, 1},
                 {"2, 1, 2, 3, 4", 2, 0.17},     {"3, 1, 2, 3, 4", 1, 0.17},
                 {"2147483647, 1, 2", 1, 0.17},  {"-1, 1, 2, 3, 4", 1, 0.17},
                 {"1.5, 1, 2, 3, 4", 1, 0.17},   {"", 1, 0.17},
                 {"1.0, 8, 9, 1, 2, 3, 4", 1, 1}};
    for (const auto& c : cases) {
        HD_Parameters parameters;
        parameters.Global.Mixing.CoefPairs.resize(1);
        const std::string text =
            "[KAVO0_HD]\n[Global_Variables]\n[MixingCoefficients]\nMixingCoef = " + std::string(c.params) +
            "\n[/MixingCoefficients]\n[/Global_Variables]\n[/KAVO0_HD]\n";
        parameters.Load(Parsed(text).Get());
        EXPECT_EQ(parameters.Global.Mixing.CoefPairs.size(), c.pairs) << c.params;
        EXPECT_EQ(parameters.Global.Mixing.MixCoef1, c.first) << c.params;
    }
}

TEST(Reading, AGroupStartsAfreshWhateverItHeld)
{
    HD_Parameters parameters;
    parameters.Global.Mixing.CoefPairs = {{7, 8}, {9, 10}};
    const TqlStructure structure =
        Parsed("[KAVO0_HD]\n[Global_Variables]\n[MixingCoefficients]\nMixingCoef = 1, \"x\", 2, "
               "3, 4, 5, 6\n[/MixingCoefficients]\n[/Global_Variables]\n[/KAVO0_HD]\n");
    parameters.Load(structure.Get());
    ASSERT_EQ(parameters.Global.Mixing.CoefPairs.size(), 1u);
    EXPECT_EQ(parameters.Global.Mixing.CoefPairs[0].First, 0) << "not what stood there before";
    EXPECT_EQ(parameters.Global.Mixing.CoefPairs[0].Second, 2);
}

TEST(Reading, MarkTitlesArePaddedWhenEmpty)
{
    const HD_Parameters empty;
    const std::string text = HDFileText(empty);
    EXPECT_NE(text.find("MarkTitles = 0, \"\"\n"), std::string::npos);
    EXPECT_NE(text.find("MarkInterpolate = 0, false\n"), std::string::npos);
    EXPECT_NE(text.find("MixingCoef = 0, 0.17, 0.04, 0.1, 0.03\n"), std::string::npos);
    EXPECT_NE(text.find("BRTools = 0, false, false, false, 0, 0, 0, 0, 0\n"), std::string::npos);

    HD_Parameters read = FromSection("WaterLevelMarkTitles", "MarkTitles = 0, \"\"\nMarkInterpolate = 0");
    EXPECT_TRUE(read.Global.MarkTitles.empty());
    EXPECT_EQ(HDFileText(read).find("MarkTitles = 0, \"\", \"\""), std::string::npos);
    read = FromSection("WaterLevelMarkTitles", "MarkTitles = 2, \"A\", \"\"\nMarkInterpolate = 1, true");
    EXPECT_EQ(read.Global.MarkTitles, (std::vector<std::string>{"A", ""}));
    EXPECT_EQ(read.Global.MarkInterpolate, std::deque<bool>{true});
}

TEST(Reading, GroundElevationOpensTheKeywordsThatRefineIt)
{
    const char* const lines = "MapAreaGeoDb = true\nGeoDb = <a>\nAddToCalculation = true\nGenerateOutput = true\n";
    const HD_Parameters without = FromSection("MapOutput", lines);
    EXPECT_TRUE(without.Global.MapOutput.GenerateOutput);
    EXPECT_FALSE(without.Global.MapOutput.ApplyDemGroundElevation || without.Global.MapOutput.MapAreaGeoDb ||
                 without.Global.MapOutput.AddToCalculation);
    EXPECT_EQ(without.Global.MapOutput.GeoDb, "");
    const HD_Parameters with = FromSection("MapOutput", std::string(lines) + "ApplyDemGroundElevation = false");
    EXPECT_TRUE(with.Global.MapOutput.MapAreaGeoDb && with.Global.MapOutput.AddToCalculation);
    EXPECT_EQ(with.Global.MapOutput.GeoDb, "a");
}

// What is not read is kept as it stands, until somebody sets it or the keyword that opens it.
TEST(Reading, WhatGroundElevationClosesIsKept)
{
    HD_Parameters read = FromSection("MapOutput", "MapAreaGeoDb = true\nGeoDb = <a>\nAddToCalculation = true");
    const auto holds = [&](const char* line) { return HDFileText(read).find(line) != std::string::npos; };
    EXPECT_TRUE(holds("MapAreaGeoDb = true\n") && holds("GeoDb = <a>\n") && holds("AddToCalculation = true\n"));
    read.Global.MapOutput.GeoDb = "b";
    EXPECT_TRUE(holds("MapAreaGeoDb = true\n") && holds("GeoDb = <b>\n"));
    read.Global.MapOutput.ApplyDemGroundElevation = true;
    EXPECT_TRUE(holds("MapAreaGeoDb = false\n") && holds("AddToCalculation = false\n"));
}

TEST(Reading, ThereIsOneFlagATitle)
{
    const std::pair<const char*, const char*> cases[] = {
        {"1, true", "2, true, false"}, {"3, true, true, true", "2, true, true"}, {"0, false", "2, false, false"}};
    for (const auto& [flags, written] : cases) {
        const HD_Parameters read = FromSection("WaterLevelMarkTitles",
                                               std::string("MarkTitles = 2, \"A\", \"B\"\nMarkInterpolate = ") + flags);
        EXPECT_NE(HDFileText(read).find(std::string("MarkInterpolate = ") + written + '\n'), std::string::npos)
            << flags;
    }
}

TEST(Reading, ItemListsFollowTheirKeywordsAndMissingOnesStay)
{
    HD_Parameters parameters;
    parameters.Global.TextOutput.OutputItems.resize(3);
    parameters.Global.TextOutput.OutputFiles.resize(2);
    parameters.Load(Parsed("[KAVO0_HD]\n[Global_Variables]\n[TextOutput]\n[OutputItems]\ndata = 5, \"V\", 4\n"
                           "data = 6\n[/OutputItems]\n[/TextOutput]\n[/Global_Variables]\n[/KAVO0_HD]\n")
                        .Get());
    const auto& items = parameters.Global.TextOutput.OutputItems;
    ASSERT_EQ(items.size(), 2u);
    EXPECT_EQ(items[0].UserName, "V");
    EXPECT_EQ(items[1].Item, 6);
    EXPECT_EQ(items[1].Decimals, 2);
    EXPECT_EQ(parameters.Global.TextOutput.OutputFiles.size(), 2u);
}

// Parameters 9 to 12 of a map row: type, storing frequency, item, component number.
TEST(Reading, MapRowsByParameterNumber)
{
    const HD_Parameters read = FromSection(
        "MapOutput", "[MapOutputFiles]\ndata = 1, 2, 3, 4, 5, 6, 7, <m>, 9, 10, 11, 12, true, 2020, 1, 2, 3, 4, 5, "
                     "2021, 6, 7, 8, 9, 10\n[/MapOutputFiles]");
    ASSERT_EQ(read.Global.MapOutput.MapOutputFiles.size(), 1u);
    const CMapsOutput& row = read.Global.MapOutput.MapOutputFiles[0];
    EXPECT_EQ((std::array{row.XOrigin, row.YOrigin, row.Rotation, row.GridSize}), (std::array<double, 4>{1, 2, 3, 4}));
    EXPECT_EQ(
        (std::array{row.JCells, row.KCells, row.Reserved, row.Type, row.StoringFrequency, row.Item, row.ComponentNo}),
        (std::array<std::int32_t, 7>{5, 6, 7, 9, 10, 11, 12}));
    EXPECT_EQ(row.FileName, "m");
    EXPECT_TRUE(row.DefaultPeriod);
    EXPECT_EQ(row.StartTime, (HDDateTime{2020, 1, 2, 3, 4, 5}));
    EXPECT_EQ(row.EndTime, (HDDateTime{2021, 6, 7, 8, 9, 10}));
}

TEST(Reading, DatesAreKeptWholeOrNotReadAtAll)
{
    const HD_Parameters no = FromSection("TextOutput", "LimitedPeriodStart = 2024, 13, 1, 0, 0, 0");
    EXPECT_EQ(no.Global.TextOutput.LimitedPeriodStart, (HDDateTime{2024, 13, 1, 0, 0, 0}));
    EXPECT_FALSE(no.Global.TextOutput.LimitedPeriodStart.IsValid());
    for (const char* half : {"2024, 12, 1, 0, 0", "2024, 12, 1, 0, 0, 1.5", "\"x\""}) {
        const HD_Parameters read = FromSection("TextOutput", std::string("LimitedPeriodStart = ") + half);
        EXPECT_TRUE(read.Global.TextOutput.LimitedPeriodStart.IsValid()) << half; // still the time of construction
    }
}

TEST(Reading, DateTimes)
{
    const struct
    {
        HDDateTime date;
        bool valid;
    } cases[] = {{{2024, 2, 29, 23, 59, 59}, true},  {{2023, 2, 29, 0, 0, 0}, false}, {{1900, 2, 29, 0, 0, 0}, false},
                 {{2000, 2, 29, 0, 0, 0}, true},     {{99, 1, 1, 0, 0, 0}, false},    {{100, 1, 1, 0, 0, 0}, true},
                 {{9999, 12, 31, 23, 59, 59}, true}, {{10000, 1, 1, 0, 0, 0}, false}, {{2024, 4, 31, 0, 0, 0}, false},
                 {{2024, 0, 1, 0, 0, 0}, false},     {{2024, 1, 0, 0, 0, 0}, false},  {{2024, 1, 1, 24, 0, 0}, false},
                 {{2024, 1, 1, 0, 60, 0}, false},    {{2024, 1, 1, 0, 0, 60}, false}, {{2024, 1, 1, -1, 0, 0}, false},
                 {{2024, 257, 1, 0, 0, 0}, false},   {{2024, 1, 257, 0, 0, 0}, false}};
    for (const auto& c : cases)
        EXPECT_EQ(c.date.IsValid(), c.valid) << c.date.Year << '-' << c.date.Month << '-' << c.date.Day;
    EXPECT_TRUE(HDDateTime::Now().IsValid());
}

TEST(Reading, RecordsAreAppendedUntilRemoved)
{
    HD_Parameters parameters;
    for (int i = 0; i < 2; ++i)
        parameters.Load(Parsed("[KAVO0_HD]\n[InitList]\nDATA = \"R\", 1, 2, 3\n[/InitList]\n[/KAVO0_HD]\n").Get());
    EXPECT_EQ(parameters.InitList.GetCount(), 2u);
    parameters.Global.G_f = 5;
    parameters.RemoveAllRecords();
    EXPECT_TRUE(parameters.InitList.IsEmpty());
    EXPECT_EQ(parameters.Global.G_f, 5);
}
