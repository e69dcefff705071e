// What the rules find, where, and what they leave alone.
#include "rules/file_check.h"
#include "rules/hd_check.h"

#include "data/hd_file.h"
#include "test_folder.h"

#include <algorithm>
#include <fstream>
#include <gtest/gtest.h>

namespace {

std::string InSection(const std::string& section, const std::string& lines)
{
    return "[Global_Variables]\n[" + section + "]\n" + lines + "\n[/" + section + "]\n[/Global_Variables]\n";
}
std::string InList(const std::string& list, const std::string& lines)
{
    return "[" + list + "]\n" + lines + "\n[/" + list + "]\n";
}
std::string File(const std::string& content)
{
    return "[KAVO0_HD]\n" + content + "[/KAVO0_HD]\n";
}

/// "line:column code text" of what the rules say, one after the other.
std::string Found(const std::string& content, const CRiver* river = nullptr, const std::string& path = "f/a.hdkv")
{
    const auto structure = ParseText(File(content), "a.hdkv");
    if (!structure)
        return structure.error().message;
    std::string found;
    for (const FileFinding& finding : CheckHDFile(structure.value().Get(), river, path).findings)
        found += (found.empty() ? "" : "; ") + std::to_string(finding.line) + ':' + std::to_string(finding.column) +
                 ' ' + RuleOf(finding.rule).code + ' ' + finding.text.substr(finding.text.find(": ") + 2);
    return found;
}

const char* const withManningsN = "[Global_Variables]\n[Global_Values]\nG_resistance = 0.03\n[/Global_Values]\n"
                                  "[Defalt_Values]\nresist_num = 1\n[/Defalt_Values]\n[/Global_Variables]\n";
const char* const maps =
    "GenerateOutput = true\nApplyDemGroundElevation = true\nMapAreaGeoDb = true\nGeoDb = <grid.kvt2>\n"
    "[MapOutputFiles]\ndata = 0,0,0,9,1,1,0,%1,0,1,0,1,%2,2020,2,3,4,5,6,%3\n[/MapOutputFiles]\n"
    "[DemInputFiles]\ndata = <in/dem.kvt2>, 1, 1\n[/DemInputFiles]";

std::string Map(const std::string& name, const std::string& isWhole, const std::string& end)
{
    std::string text = maps;
    for (const auto& [mark, with] : {std::pair("%1", name), std::pair("%2", isWhole), std::pair("%3", end)})
        text.replace(text.find(mark), 2, with);
    return InSection("MapOutput", text);
}

} // namespace

TEST(Rules, FindWhatBreaksThemAndNothingElse)
{
    const struct
    {
        std::string content, found;
    } cases[] = {
        // Locations.
        {InList("InitList", "DATA = \"\", 1, 2, 3"), "3:8 HD101 RiverName: the branch name is empty"},
        {InList("InitList", "DATA = \"R\", 1e10, 2, 3"), "3:13 HD102 Chainage: the chainage is not given"},
        {InList("Enc_Simulation", "[Encroachment_Setup]\nDATA = \"\", 1e10, 1, 1, 0, 0, 0, 0, 0, 1, 0, 0, 0, 0, 0\n"
                                  "DATA = \"\", 1e10, 1, 1, 0, 0, 0, 0, 0, 1, 0, 0, 0, 0, 0\n[/Encroachment_Setup]"),
         "5:8 HD101 RiverName: the branch name is empty"},
        {InList("WindList", "DATA = \"R\", 1, 1\nDATA = \" r\", 1.0, 2\nDATA = \"R\", 2, 1"),
         "4:14 HD103 Chainage: line 1 is for the same location and has other values"},
        {InList("WindList", "DATA = \"R\", 0, 1\nDATA = \"r\", -0.0, 1"), "4:13 HD104 Chainage: line 1 is the same"},
        {InList("WindList", "DATA = \"R\", 1, 1\nDATA = \"R\", 1, 1, 7"), // more than is known
         "4:13 HD103 Chainage: line 1 is for the same location and has other values; 4:19 HD013 unknown parameters "
         "from "
         "number 4 on"},
        // Reaches.
        {InList("WaveList", "DATA = \"R\", 1, 2, 1\nDATA = \"R\", 2, 3, 1\nDATA = \"S\", 0, 9, 1"), ""},
        {InList("WaveList", "DATA = \"R\", 3, 2, 1"),
         "3:16 HD201 DownstreamChainage: the reach ends at 2, before it starts at 3"},
        {InList("WaveList", "DATA = \"R\", 3, 3, 1"), "3:16 HD202 DownstreamChainage: the reach ends where it starts"},
        {InList("OutputGridPoints", "DATA = \"R\", 3, 1e10"),
         "3:16 HD203 PointValue: the end of the reach is not given"},
        {InList("OutputGridPoints", "DATA = \"R\", 5, 9\nDATA = \"R\", 1, 6\nDATA = \"R\", 6, 7"),
         "4:1 HD204 the reach overlaps that of line 1; 5:1 HD204 the reach overlaps that of line 1"},
        {InList("OutputGridPoints", "DATA = \"R\", 0, 100\nDATA = \"R\", 10, 20\nDATA = \"R\", 50, 60"),
         "4:1 HD204 the reach overlaps that of line 1; 5:1 HD204 the reach overlaps that of line 1"},
        {InList("WindList", "DATA = \"R\", 1, 1\nDATA = \"S\", 1, 1"), ""},
        // Values.
        {InSection("Defalt_Values", "delta = 0.4\nzeta_min = 0"),
         "4:9 HD301 delta: 0.4 is less than 0.5, the least that "
         "is allowed"},
        {InSection("Defalt_Values", "delta = 1.5"), "4:9 HD302 delta: 1.5 is more than 1, the most that is allowed"},
        {InSection("Global_Values", "ResisZone = 2, 30, 25, 20"),
         "4:13 HD303 ResisZone: 2 is the number of no entry; they go from 0 to 1"},
        {InList("Enc_Simulation", "[Encroachment_Setup]\nDATA = \"R\", 1, 0, 1, 0, 0, 0, 0, 0, 1, 0, 0, 0, 0, 0\n"
                                  "DATA = \"R\", 2, 5, 1, 0, 0, 0, 0, 0, 1, 0, 0, 0, 0, 0\n"
                                  "[/Encroachment_Setup]"),
         "4:16 HD303 EncOption1: 0 is the number of no entry; they go from 1 to 5"},
        {InList("WindList", "DATA = \"R\", 1, -0.5"),
         "3:16 HD304 WindFactor: -0.5 is less than 0: the factor is 1 in open "
         "terrain and less where something shelters the river"},
        {withManningsN + InList("BedList", "DATA = \"R\", 1, 32, 30, 25, 20\nDATA = \"R\", 2, 0.03, 0, 0, 0"),
         "11:16 HD305 Resistance: 32 is more than 1: Manning's n is 0.008 for glass and 0.8 for dense grass"},
        {InList("FloodList", "DATA = \"R\", 1, -99\nDATA = \"R\", 2, 0\nDATA = \"R\", 3, 30"), ""},
        {InSection("Heat_Balance", "Calc = false\nLatitude = 999"), ""},
        {InSection("Heat_Balance", "Calc = true\nLatitude = 90"), ""},
        {InList("BedResistanceToolboxList", "DATA = \"R\", 1, 1, 1, 30, 20, 2, 1, 30, 1, 20"),
         "3:22 HD306 MinRes: the least resistance, 30, is above the greatest, 20; 3:40 HD307 Velocity: velocity 1 "
         "stands "
         "behind 1"},
        {InSection("BedResistTools", "BRTools = 0, true, true, true, 2, 3, 30, 2, 20, 0, 0, 50, 20"),
         "4:42 HD307 Velocity: velocity 2 stands behind 3; 4:55 HD306 MinRes: the least resistance, 50, is above the "
         "greatest, 20"},
        {InList("KlrInitList", "DATA = \"R\", 1, 5, 5, 0, 0\nDATA = \"R\", 2, 5, 6, 0, 0"),
         "4:19 HD308 h0: the interface of the layers, 6, lies above the water level, 5"},
        // Time and files.
        {InSection("TextOutput", "GenerateOutput = true\nLimitedPeriod = true\nLimitedPeriodStart = 2020,1,1,0,0,0\n"
                                 "LimitedPeriodEnd = 2020,1,1,0,0,0"),
         "7:20 HD401 LimitedPeriodEnd: the period ends at 2020-01-01 00:00:00, not after it starts at 2020-01-01 "
         "00:00:00"},
        {InSection("TextOutput", "GenerateOutput = true\nLimitedPeriod = false\nLimitedPeriodStart = 2020,1,1,0,0,0\n"
                                 "LimitedPeriodEnd = 2019,1,1,0,0,0"),
         ""},
        {Map("<o.kvt2>", "false", "2020,2,3,4,5,5"),
         "9:60 HD401 EndTime: the period ends at 2020-02-03 04:05:05, not after it starts at 2020-02-03 04:05:06"},
        {Map("<o.kvt2>", "true", "2020,2,3,4,5,5"), ""},
        {Map("<in/../in/dem.kvt2>", "true", "2020,1,1,0,0,0"),
         "9:22 HD402 FileName: the simulation writes in/../in/dem.kvt2, which it also reads"},
        {Map("<in\\\\dem.kvt2>", "true", "2020,1,1,0,0,0"),
         "9:22 HD402 FileName: the simulation writes in\\dem.kvt2, which it also reads"},
        {Map("<grid.kvt2>", "true", "2020,1,1,0,0,0"),
         "9:22 HD402 FileName: the simulation writes grid.kvt2, which it also reads"},
        {InSection("TextOutput", "GenerateOutput = true\n[OutputFiles]\ndata = \"kvt Timeseries Bridge\", false, "
                                 "<../f/a.hdkv>\ndata = \"\", true, <a.hdkv>\n[/OutputFiles]"),
         "6:40 HD402 FileName: the simulation writes ../f/a.hdkv, which it also reads"},
        {InSection("TextOutput",
                   "GenerateOutput = true\n[OutputFiles]\ndata = \"\", false, <b>\ndata = \"\", false, <>\n"
                   "data = \"\", false, <./b>\n[/OutputFiles]"),
         "7:19 HD404 FileName: the output has no file name; 8:19 HD403 FileName: line 1 writes the same file"},
    };
    for (const auto& c : cases)
        EXPECT_EQ(Found(c.content), c.found) << c.content;
    EXPECT_EQ(CheckHDFile(ParseText(HDFileText({}, true), "new")->Get(), nullptr, "new").Count(), 0u);
}

TEST(Rules, KnowTheRiver)
{
    CRiver river;
    river.Add({"Main", 100, 200});
    river.Add({"BACK", 0, 50, false});
    const struct
    {
        std::string content, found;
    } cases[] = {
        {InList("InitList", "DATA = \"main \", 100, 2, 3\nDATA = \"MAIN\", 200.001, 2, 3"), ""},
        {InList("InitList", "DATA = \"MAIN\", 99.9, 2, 3\nDATA = \"MAINE\", 150, 2, 3"),
         "3:16 HD106 Chainage: 99.9 does not lie on branch Main, which runs from 100 to 200; 4:8 HD105 RiverName: the "
         "network has no branch MAINE"},
        {InList("WaveList", "DATA = \"MAIN\", 150, 250, 1"),
         "3:21 HD106 DownstreamChainage: 250 does not lie on branch Main, which runs from 100 to 200"},
        {InList("WaveList", "DATA = \"BACK\", 40, 20, 1\nDATA = \"BACK\", 0, 10, 1"),
         "4:19 HD201 DownstreamChainage: the reach ends at 10, before it starts at 0"},
    };
    for (const auto& c : cases)
        EXPECT_EQ(Found(c.content, &river), c.found) << c.content;
}

TEST(Rules, MarksKeepTheOrderThatNearlyAllLinesHave)
{
    const std::string titles =
        "[Global_Variables]\n[WaterLevelMarkTitles]\nMarkTitles = 2, \"ALERT\", \"FLOOD\"\nMarkInterpolate = 2, true, "
        "true\n[/WaterLevelMarkTitles]\n[/Global_Variables]\n";
    const auto marks = [](int rising, int falling) {
        std::string lines;
        for (int i = 0; i < rising + falling; ++i)
            lines += "DATA = \"R\", " + std::to_string(i) + (i < rising ? ", 2, 5, 6\n" : ", 2, 7.5, 6\n");
        return InList("WaterLevelMarkList", lines + "DATA = \"R\", 1000, 2, 1e10, 3\nDATA = \"R\", 1001, 0");
    };
    EXPECT_EQ(
        Found(titles + marks(9, 1)),
        "18:19 HD309 Level: mark ALERT (7.5) and mark FLOOD (6) stand the other way round than at other locations");
    EXPECT_EQ(Found(titles + marks(8, 1)), "") << "that may be meant so";
    EXPECT_EQ(Found(titles + marks(10, 0)), "");
}

// An editor looks at some lines between two keys.
TEST(Rules, FindTheSameInSlices)
{
    HD_Parameters parameters;
    for (int i = 0; i < 3000; ++i) {
        auto& reach = parameters.WaveList.Add();
        reach.RiverName = i % 2 ? "A" : "B";
        reach.Chainage = (i * 7919) % 3001;
        reach.DownstreamChainage = reach.Chainage + (i % 3);
        auto& wind = parameters.WindList.Add();
        wind.RiverName = i % 5 ? "A" : "";
        wind.Chainage = i % 1000;
        wind.WindFactor = i % 13;
    }
    const auto find = [&parameters](std::size_t slice) {
        CHDCheck check(parameters, nullptr, "");
        int steps = 0;
        while (check.Step(slice))
            ++steps;
        std::string found = std::to_string(check.Count(RuleId::NoBranch));
        for (const Problem& problem : check.Take())
            found += ' ' + std::string(RuleOf(problem.rule).code) + ':' + std::to_string(problem.place.line);
        return std::pair(found, steps);
    };
    const auto [whole, once] = find(1'000'000);
    const auto [sliced, often] = find(7);
    EXPECT_EQ(whole, sliced);
    EXPECT_GT(often, 1000);
    EXPECT_EQ(whole.substr(0, 4), "600 ");
    EXPECT_NE(whole.find("HD204"), std::string::npos);
}

// The list may have become shorter, or longer, before the editor has told so.
TEST(Rules, OutliveChangesBetweenTwoSlices)
{
    HD_Parameters parameters;
    const auto add = [&parameters](int count) {
        for (int i = 0; i < count; ++i) {
            HD_Windfact& record = parameters.WindList.Add();
            record.RiverName = "R";
            record.Chainage = double(parameters.WindList.GetCount());
            record.WindFactor = -1;
        }
    };
    add(100);
    CHDCheck check(parameters, nullptr, "");
    while (check.Count(RuleId::ImplausiblyLow) == 0)
        ASSERT_TRUE(check.Step(10));
    add(5000); // it is looked at as far as it was long
    for (int i = 0; i < 15; ++i)
        check.Step(10);
    EXPECT_EQ(check.Count(RuleId::ImplausiblyLow), 100u);

    CHDCheck other(parameters, nullptr, "");
    while (other.Count(RuleId::ImplausiblyLow) == 0)
        ASSERT_TRUE(other.Step(10));
    parameters.WindList.RemoveAll();
    while (other.Step(10))
        ;
    EXPECT_EQ(other.Count(RuleId::ImplausiblyLow), 10u);
}

TEST(Rules, CountWhatTheyDoNotList)
{
    HD_Parameters parameters;
    for (int i = 0; i < 1500; ++i)
        parameters.InitList.Add();
    CHDCheck check(parameters, nullptr, "");
    while (check.Step(400))
        ;
    EXPECT_EQ(check.Count(RuleId::NoBranch), 1500u);
    const auto listed = check.Take();
    EXPECT_EQ(listed.size(), CProblems::MostOfARule);
    EXPECT_EQ(listed.back().place.line, CProblems::MostOfARule - 1);
}

TEST(River, IsReadFromANetworkFile)
{
    const TestFolder folder;
    const std::string path = (folder.Path() / "n.kvnw").string();
    std::ofstream(path)
        << "[KVR_NETWORK]\n[Branch]\nName = \"Neckar\"\nChainage = 900, 100\nFlowsDownstream = false\n[/Branch]\n"
           "[Branch]\nName = 5\n[/Branch]\n[Branch]\nName = \"neckar\"\nChainage = 50.5, 60\n[/Branch]\n"
           "[/KVR_NETWORK]\n";
    const auto river = LoadRiver(path);
    ASSERT_TRUE(river);
    const RiverBranch* const branch = river.value().Find("NECKAR");
    ASSERT_TRUE(branch);
    EXPECT_EQ(branch->first, 50.5);
    EXPECT_EQ(branch->last, 900);
    EXPECT_FALSE(branch->downstream);
    EXPECT_FALSE(river.value().Find("5"));

    std::ofstream(path) << "[OTHER]\n[/OTHER]\n";
    EXPECT_NE(LoadRiver(path).error().message.find("no target [KVR_NETWORK]"), std::string::npos);
    EXPECT_FALSE(LoadRiver(path + "x"));
}
