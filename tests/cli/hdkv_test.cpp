// The program itself: exit codes, what goes to which output, and what happens to files.
#include "cli/terminal.h"
#include "data/hd_support.h"

#include "base/utf8_path.h"
#include "files/file_lock.h"
#include "files/temporary_file.h"

#include <algorithm>
#include <cstdlib>
#include <rapidjson/document.h>
#include <sstream>

#ifndef _WIN32
#include <sys/stat.h>
#include <unistd.h>
#endif

namespace {

#ifdef _WIN32
int ExitCode(int status)
{
    return status;
}
#else
int ExitCode(int status)
{
    return status >> 8 & 255;
}
#endif

class Hdkv : public FolderTest
{
protected:
    Hdkv()
    {
        Write("bad.hdkv", "[KAVO0_HD]\n  [InitList]\n");
        Write("found.hdkv", "[KAVO0_HD]\n[InitList]\nDATA = \"\", 1, 2, 3\n[/InitList]\n[/KAVO0_HD]\n");
        Write("loses.hdkv", "[KAVO0_HD]\n[InitList]\nDATA = \"R\", 1, 2, true\n[/InitList]\n[/KAVO0_HD]\n");
        Write("cut.hdkv", "// KVR par");
        Write("huge.hdkv", "");
        std::filesystem::resize_file(m_folder / "huge.hdkv", std::uintmax_t{2} << 30); // takes no room on the disk
        Write("other.hdkv", "[KVR_PROJECT]\n[/KVR_PROJECT]\n");
        Write("n.kvnw", "[KVR_NETWORK]\n[Branch]\nName = \"E\"\nChainage = 0, 9\n[/Branch]\n[/KVR_NETWORK]\n");
        HD_Parameters parameters;
        HD_Initial record;
        record.RiverName = "A\xC3\x9F, \"x\"";
        record.Chainage = 12.5;
        record.InitialH = 1e-7;
        record.InitialQ = std::numeric_limits<double>::quiet_NaN();
        parameters.InitList.Add(record);
        parameters.InitList.Add();
        HDMixingCoef mixing;
        mixing.RiverName = "M";
        mixing.CoefPairs = {{1, 2}, {3, 4.5}};
        parameters.MixingCoefList.Add(mixing);
        HDEncroach set;
        set.RiverName = "E";
        parameters.EncroachList.Add().Add(set); // one line only: the editor would not keep it
        EXPECT_TRUE(SaveHDFile(parameters, Path("a.hdkv"), {.everySet = true}));
    }

    /// Runs hdkv in the folder of the test.
    int Run(const std::string& arguments)
    {
        const std::string command =
            "cd \"" + m_folder.string() + "\" && " + m_prefix + "\"" HDKV "\" " + arguments + " >out.txt 2>err.txt";
        const int code = ExitCode(std::system(command.c_str()));
        out = Text("out.txt");
        err = Text("err.txt");
        return code;
    }
    std::string Got(const std::string& keyword)
    {
        EXPECT_EQ(Run("get a.hdkv " + keyword), 0) << err;
        return out;
    }

    /// Whether `out` has these lines, apart from further columns behind them.
    void ExpectLines(const std::string& expected) const
    {
        std::istringstream lines(out), beginnings(expected);
        for (std::string line, beginning; std::getline(beginnings, beginning);) {
            ASSERT_TRUE(std::getline(lines, line)) << out;
            beginning.erase(std::min(beginning.find('}'), beginning.size()));
            EXPECT_TRUE(line.starts_with(beginning)) << line;
            EXPECT_TRUE(line.size() == beginning.size() ||
                        std::string_view(" ,}").find(line[beginning.size()]) != std::string_view::npos)
                << line;
        }
        EXPECT_EQ(std::ranges::count(out, '\n'), std::ranges::count(expected, '\n')) << out;
    }

    std::string out, err, m_prefix;
};

} // namespace

TEST_F(Hdkv, ExitCodesAndMessages)
{
    const struct
    {
        const char* arguments;
        int code;
        const char* out; // what the outputs contain
        const char* err;
    } cases[] = {
        {"check found.hdkv", 1, "found.hdkv:3:8: warning HD101: InitList: RiverName: the branch name is empty\n", ""},
        {"check found.hdkv", 1, "found.hdkv: 1 finding\n", ""},
        {"check other.hdkv", 1, "other.hdkv:1:1: error HD001: there is no target [KAVO0_HD]", ""},
        {"check --network n.kvnw a.hdkv", 1, ": error HD105: InitList: RiverName: the network has no branch A", ""},
        {"check --network other.hdkv a.hdkv", 3, "", "other.hdkv is no river network: it has no target [KVR_NETWORK]"},
        {"check --network missing.kvnw a.hdkv", 3, "", "missing.kvnw"},
        {"check --format csv a.hdkv", 2, "", "csv"},
        {"check bad.hdkv", 3, "", "bad.hdkv, line 2, column 13: expected [/InitList]"},
        {"check missing.hdkv", 3, "", "missing.hdkv"},
        {"show cut.hdkv", 3, "",
         "cut.hdkv, line 1, column 11: expected a target in brackets, such as [Name], found the end"},
        {"check huge.hdkv", 3, "", "expected a file smaller than 2 GiB, found one of 2147483648 bytes"},
        {"check bad.hdkv found.hdkv", 3, "found.hdkv: 1 finding\n", "bad.hdkv"},
        {"", 2, "", "subcommand"},
        {"check", 2, "", "FILE"},
        {"frobnicate a.hdkv", 2, "", "no command \"frobnicate\"; the commands are check, show, get, set, fmt, new"},
        {"show a.hdkv InitList --format xml", 2, "", "xml"},
        {"--help", 0, "check", ""},
        {"set --help", 0, "FILE KEYWORD VALUE...", ""},
        {"--version", 0, "hdkv ", ""},
        {"show a.hdkv", 0, "MixingCoefList               records       1\n", ""},
        {"show a.hdkv NoList", 2, "", "the lists are InitList, WindList"},
        {"show other.hdkv", 3, "", "no HD parameter file"},
        {"get a.hdkv GenerateOutput", 2, "", "TextOutput/GenerateOutput, MapOutput/GenerateOutput"},
        {"get a.hdkv g_wave", 2, "", "Did you mean Global_Values/G_wave?"},
        {"get bad.hdkv G_wave", 3, "", "line 2"},
        {"set a.hdkv G_wave 1.5", 2, "", "Global_Values/G_wave: G_wave should be an integer, found \"1.5\""},
        {"set a.hdkv G_wave", 2, "", "at least one value"},
        {"set a.hdkv G_wave 1 2", 2, "", "takes 1 value, 2 were given"},
        {"set a.hdkv ResisZone 1 2", 2, "", "ZoneResistance2 is missing"},
        {"set a.hdkv G_f 1e400", 2, "", "should be a number"},
        {"set a.hdkv delta 0.4999", 2, "", "delta should be 0.5 to 1, found \"0.4999\""},
        {"set a.hdkv delta nan", 2, "", "delta should be 0.5 to 1"},
        {"set a.hdkv zeta_min -- -1", 2, "", "zeta_min should be at least 0, found \"-1\""},
        {"set a.hdkv MarkTitles 2 A", 2, "", "does not fit the 1 values behind it"},
        {"set a.hdkv LimitedPeriodStart 2024 2 30 0 0 0", 2, "", "found 2024-02-30 00:00:00"},
        {"set a.hdkv G_f --loud", 2, "", "no option --loud"},
        {"set loses.hdkv G_f 1", 1, "", "loses.hdkv:3:19: error HD005: InitList: parameter 4 (InitialQ)"},
        {"fmt loses.hdkv", 1, "", "Nothing was written"},
        {"fmt found.hdkv --check", 1, "", "not in canonical form"},
        {"fmt a.hdkv --check", 0, "", ""},
        {"fmt a.hdkv -o missing/b.hdkv", 4, "", "No such file or directory"},
        {"fmt a.hdkv --hard-links", 2, "", "keep|split"},
        {"fmt a.hdkv --hard-links both", 2, "", "both"},
        {"new a.hdkv", 4, "", "exists already"},
    };
    const std::string before = Text("a.hdkv") + Text("loses.hdkv") + Text("found.hdkv");
    for (const auto& c : cases) {
        EXPECT_EQ(Run(c.arguments), c.code) << c.arguments << '\n' << out << err;
        EXPECT_NE(out.find(c.out), std::string::npos) << c.arguments << '\n' << out;
        EXPECT_NE(err.find(c.err), std::string::npos) << c.arguments << '\n' << err;
        EXPECT_TRUE(*c.out || out.empty()) << out;
        EXPECT_TRUE(*c.err || err.empty()) << err;
    }
    EXPECT_EQ(Text("a.hdkv") + Text("loses.hdkv") + Text("found.hdkv"), before);
}

// What is beyond doubt is taken, and told.
TEST_F(Hdkv, ValuesOfAnotherTypeAreTakenWhenTheirMeaningIsBeyondDoubt)
{
    Write("taken.hdkv", "[KAVO0_HD]\n[WaveList]\nDATA = \"R\", 1, 2, 2.0\n[/WaveList]\n[/KAVO0_HD]\n");
    EXPECT_EQ(Run("set taken.hdkv G_f 1"), 0) << err;
    EXPECT_EQ(
        err,
        "taken.hdkv:3:19: note HD006: WaveList: parameter 4 (WaveApproximation) should be an integer, found a number; "
        "taken as 2\n");
    EXPECT_NE(Text("taken.hdkv").find("DATA = \"R\", 1, 2, 2"), std::string::npos);
    EXPECT_EQ(Text("taken.hdkv").find("2.0"), std::string::npos);
    EXPECT_EQ(Run("check taken.hdkv"), 0) << out;
}

// A name is no command to the terminal that it is printed on, and no line of its own.
TEST_F(Hdkv, NamesAreShownSoThatTheyDoNothing)
{
    const std::string name = "a\x1B[2J\nb\x7F\xC2\x9B\xE2\x80\xAE\xFF\xC3\x9F.hdkv";
    const std::string shown = R"(a\x1B[2J\x0Ab\x7F\xC2\x9B\xE2\x80\xAE\xFF)"
                              "\xC3\x9F.hdkv";
    for (const char* arguments : {"check", "show", "fmt --check", "new", "frobnicate"}) {
        EXPECT_NE(Run(std::string(arguments) + " '" + name + "' '" + name + '\''), 0);
        std::istringstream lines(err);
        for (std::string line; std::getline(lines, line);)
            EXPECT_EQ(line, Printable(line)) << arguments;
    }
    Write(name.c_str(), Text("found.hdkv"));
    EXPECT_EQ(Run("check '" + name + '\''), 1);
    EXPECT_EQ(out,
              shown + ":3:8: warning HD101: InitList: RiverName: the branch name is empty\n" + shown + ": 1 finding\n");
    EXPECT_EQ(Run("fmt --check '" + name + '\''), 1);
    EXPECT_EQ(err, "hdkv: " + shown + " is not in canonical form.\n");

    Write("names.hdkv", "[KAVO0_HD]\n[WindList]\nDATA = \"a\\u{1B}c\\n\", 1, 2\n[/WindList]\n[/KAVO0_HD]\n");
    EXPECT_EQ(Run("show names.hdkv WindList"), 0);
    ExpectLines("RiverName   Chainage  WindFactor\na\\x1Bc\\x0A         1           2\n");
}

// For scripts: the keys stay.
TEST_F(Hdkv, FindingsAreWrittenForPrograms)
{
    Write("sp\xC3\xA4t %1.hdkv",
          "[KAVO0_HD]\n[WindList]\nDATA = \"R\", 1, 2\nDATA = \"r\", 1, 2\n[/WindList]\n[/KAVO0_HD]\n");
    const std::string files = "'sp\xC3\xA4t %1.hdkv' bad.hdkv";
    EXPECT_EQ(Run("check --format json " + files), 3);
    rapidjson::Document json;
    ASSERT_FALSE(json.Parse(out.c_str()).HasParseError()) << out;
    EXPECT_EQ(json["version"].GetInt(), 1);
    const auto& file = json["files"][0];
    EXPECT_STREQ(file["file"].GetString(), "sp\xC3\xA4t %1.hdkv");
    EXPECT_FALSE(file.HasMember("error"));
    ASSERT_EQ(file["findings"].Size(), 1u);
    const auto& finding = file["findings"][0];
    EXPECT_STREQ(finding["code"].GetString(), "HD104");
    EXPECT_STREQ(finding["severity"].GetString(), "note");
    EXPECT_EQ(finding["line"].GetInt(), 4);
    EXPECT_EQ(finding["column"].GetInt(), 13);
    EXPECT_STREQ(finding["section"].GetString(), "WindList");
    EXPECT_STREQ(finding["field"].GetString(), "Chainage");
    EXPECT_EQ(finding["record"].GetInt(), 2);
    EXPECT_STREQ(finding["branch"].GetString(), "r");
    EXPECT_EQ(finding["chainage"].GetDouble(), 1);
    EXPECT_STREQ(finding["fix"].GetString(), "remove the line");
    EXPECT_STREQ(finding["message"].GetString(), "WindList: Chainage: line 1 is the same");
    EXPECT_TRUE(std::string(json["files"][1]["error"].GetString()).find("expected [/InitList]") != std::string::npos);

    EXPECT_EQ(Run("check --format sarif " + files), 3);
    ASSERT_FALSE(json.Parse(out.c_str()).HasParseError()) << out;
    EXPECT_STREQ(json["version"].GetString(), "2.1.0");
    const auto& run = json["runs"][0];
    EXPECT_FALSE(run["invocations"][0]["executionSuccessful"].GetBool());
    EXPECT_EQ(run["invocations"][0]["toolExecutionNotifications"].Size(), 1u);
    ASSERT_EQ(run["results"].Size(), 1u);
    const auto& result = run["results"][0];
    const auto& rule = run["tool"]["driver"]["rules"][result["ruleIndex"].GetUint()];
    EXPECT_STREQ(rule["id"].GetString(), result["ruleId"].GetString());
    EXPECT_STREQ(rule["id"].GetString(), "HD104");
    EXPECT_STREQ(rule["defaultConfiguration"]["level"].GetString(), "note");
    const auto& place = result["locations"][0]["physicalLocation"];
    EXPECT_STREQ(place["artifactLocation"]["uri"].GetString(), "sp%C3%A4t%20%251.hdkv");
    EXPECT_EQ(place["region"]["startLine"].GetInt(), 4);

    EXPECT_EQ(Run("check --format json n\xFF.hdkv"), 3);
    EXPECT_FALSE(json.Parse<rapidjson::kParseValidateEncodingFlag>(out.c_str()).HasParseError()) << out;
}

TEST_F(Hdkv, FindingsWithoutEndAreCounted)
{
    std::string text = "[KAVO0_HD]\n[InitList]\n";
    for (int line = 0; line < 1500; ++line)
        text += "DATA = \"\", 1, 2, 3\n";
    Write("many.hdkv", text + "MINE = 1\n[/InitList]\n[/KAVO0_HD]\n");
    EXPECT_EQ(Run("check many.hdkv"), 1);
    EXPECT_EQ(std::ranges::count(out, '\n'), 1000 + 1 + 1 + 1);
    EXPECT_NE(out.find("\nmany.hdkv: 500 more like the one in line 1002, column 8 (HD101)\nmany.hdkv: 1501 findings\n"),
              std::string::npos);
    EXPECT_NE(out.find("\nmany.hdkv:1503:1: note HD012: unknown keyword"), std::string::npos) << "of another kind";
}

TEST_F(Hdkv, SetThenGet)
{
    const struct
    {
        const char *keyword, *values, *printed;
    } cases[] = {{"G_flood_plan_res", "-98.5", "-98.5\n"},
                 {"alpha", "-1e-5", "-1e-05\n"},
                 {"wind_shear_stress", "true", "true\n"},
                 {"Defalt_Values/theta", "0.1", "0.1\n"},
                 {"ResisZone", "2 -1 nan inf", "2\n-1\nnan\ninf\n"},
                 {"MarkTitles", "2 \"A b\" C", "2\nA b\nC\n"},
                 {"MarkTitles", "0", "0\n"},
                 {"Delimiter", "-- --x", "--x\n"},
                 {"OutputFiles", "1 F true \"a b.txt\"", "1\nF\ntrue\na b.txt\n"},
                 {"LimitedPeriodEnd", "2024 2 29 1 2 3", "2024\n2\n29\n1\n2\n3\n"},
                 {"MixingCoef", "1 0.5 2 1 2 3 4", "1\n0.5\n2\n1\n2\n3\n4\n"}};
    for (const auto& c : cases) {
        EXPECT_EQ(Run(std::string("set a.hdkv ") + c.keyword + ' ' + c.values), 0) << err;
        EXPECT_EQ(out + err, "");
        EXPECT_EQ(Got(c.keyword), c.printed);
    }
    const std::string before = Text("a.hdkv");
    EXPECT_EQ(Run("set -o b.hdkv a.hdkv G_f 7"), 0) << err;
    EXPECT_EQ(Text("a.hdkv"), before);
    EXPECT_NE(Text("b.hdkv").find("G_f = 7\n"), std::string::npos);
    EXPECT_EQ(LoadHDFile(Path("b.hdkv"))->EncroachList.GetCount(), 1u); // nothing else changed, nothing is dropped
    EXPECT_EQ(LoadHDFile(Path("b.hdkv"))->InitList.GetCount(), 2u);
}

TEST_F(Hdkv, ShowFormats)
{
    const struct
    {
        const char *arguments, *printed;
    } cases[] = {
        {"initlist", "RiverName  Chainage  InitialH  InitialQ\n"
                     "A\xC3\x9F, \"x\"        12.5     1e-07       nan\n"
                     "              1e+10         0         0\n"},
        {"InitList --format csv", "RiverName,Chainage,InitialH,InitialQ\n"
                                  "\"A\xC3\x9F, \"\"x\"\"\",12.5,1e-07,nan\n,1e+10,0,0\n"},
        {"InitList --format json",
         "[\n  {\"RiverName\": \"A\xC3\x9F, \\\"x\\\"\", \"Chainage\": 12.5, \"InitialH\": 1e-07, \"InitialQ\": "
         "null},\n"
         "  {\"RiverName\": \"\", \"Chainage\": 1e+10, \"InitialH\": 0, \"InitialQ\": 0}\n]\n"},
        {"MixingCoefList --format csv",
         "RiverName,Chainage,CoefPairs,MixCoef1,MixCoef2,MixCoef3,MixCoef4\nM,1e+10,1 2; 3 4.5,0,0,0,0\n"},
        {"MixingCoefList --format json",
         "[\n  {\"RiverName\": \"M\", \"Chainage\": 1e+10, \"CoefPairs\": [{\"First\": 1, \"Second\": 2}, "
         "{\"First\": 3, \"Second\": 4.5}], \"MixCoef1\": 0, \"MixCoef2\": 0, \"MixCoef3\": 0, \"MixCoef4\": 0}\n]\n"},
        {"OutputItems --format csv", "Item,UserName,Decimals\n"},
        {"WindList --format json", "[]\n"},
        {"Enc_Simulation --format csv",
         "Set,RiverName,Chainage,EncOption1,EncOption2,EncValues1.1,EncValues1.2,EncValues1.3,EncValues1.4,"
         "EncValues1.5,EncOption3,EncValues2.1,EncValues2.2,EncValues2.3,EncValues2.4,EncValues2.5\n"
         "1,E,1e+10,1,1,0,0,0,0,0,1,0,0,0,0,0\n"}};
    for (const auto& c : cases) {
        EXPECT_EQ(Run(std::string("show a.hdkv ") + c.arguments), 0) << err;
        ExpectLines(c.printed);
    }
    EXPECT_EQ(Run("show a.hdkv Enc_Simulation --format json"), 0) << err;
    EXPECT_TRUE(out.starts_with("[\n  {\"Set\": 1, \"RiverName\": \"E\", ")) << out;
}

TEST_F(Hdkv, ShowEscapesWhatItsFormatsCannotHold)
{
    HD_Parameters parameters;
    for (const char* name : {"\"", "a\x0F\x10\x1F\x7F"}) {
        HD_Windfact record;
        record.RiverName = name;
        parameters.WindList.Add(record);
    }
    ASSERT_TRUE(SaveHDFile(parameters, Path("e.hdkv")));
    EXPECT_EQ(Run("show e.hdkv WindList --format csv"), 0) << err;
    ExpectLines("RiverName,Chainage,WindFactor\n\"\"\"\",1e+10,0\na\x0F\x10\x1F\x7F,1e+10,0\n");
    EXPECT_EQ(Run("show e.hdkv WindList --format json"), 0) << err;
    EXPECT_NE(out.find("\"a\\u000f\\u0010\\u001f\x7F\""), std::string::npos) << out;
}

TEST_F(Hdkv, FmtAndNewWriteCanonicalFiles)
{
    EXPECT_EQ(Run("fmt found.hdkv -o b.hdkv"), 0) << err;
    EXPECT_EQ(Run("fmt --check b.hdkv"), 0) << err;
    EXPECT_NE(Text("b.hdkv").find("    DATA = \"\", 1, 2, 3"), std::string::npos); // incomplete lines too
    EXPECT_EQ(Run("fmt found.hdkv"), 0);
    EXPECT_EQ(Run("check found.hdkv"), 1);
    EXPECT_NE(Text("found.hdkv").find("LimitedPeriodEnd = 0, 0, 0, 0, 0, 0\n"), std::string::npos)
        << "a time of day would be another one in the next run";
    Write("short.hdkv", "[KAVO0_HD]\n[Global_Variables]\n[MapOutput]\n[MapOutputFiles]\ndata = 0, 0, 0, 100, 9, 9, 0\n"
                        "[/MapOutputFiles]\n[/MapOutput]\n[/Global_Variables]\n[/KAVO0_HD]\n");
    EXPECT_EQ(Run("fmt short.hdkv"), 0) << err;
    EXPECT_NE(Text("short.hdkv").find("false, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0, 0\n"), std::string::npos);
    EXPECT_EQ(Run("new n.hdkv"), 0) << err;
    EXPECT_EQ(Text("n.hdkv").find("LimitedPeriodEnd = 0,"), std::string::npos) << "the time of creation";
    EXPECT_EQ(Run("check n.hdkv"), 0) << out;
    EXPECT_EQ(out, "n.hdkv: 0 findings\n");
    EXPECT_EQ(Run("fmt --check n.hdkv"), 0);
    EXPECT_EQ(Run("check \"" KVR_SOURCE_DIR "/examples/river/river.HDKV\""), 0) << out;
    EXPECT_EQ(Run("fmt --check \"" KVR_SOURCE_DIR "/examples/river/river.HDKV\""), 0) << err;
}

#ifndef _WIN32
TEST_F(Hdkv, AFullDiskCostsNothing)
{
    const std::string before = Text("a.hdkv");
    const std::size_t files = FileCount();
    m_prefix = "ulimit -f 4; ";
    EXPECT_EQ(Run("set a.hdkv G_f 7"), 4);
    EXPECT_NE(err.find("a.hdkv\": File too large."), std::string::npos) << err;
    EXPECT_EQ(Text("a.hdkv"), before);
    EXPECT_EQ(FileCount(), files + 2); // the outputs of the run
    m_prefix.clear();
    for (const char* command : {"show a.hdkv", "--version", "set --help"})
        EXPECT_EQ(Run(command + std::string(" >/dev/full 2>err.txt; exit $? #")), 4) << command;
}

TEST_F(Hdkv, TheNamesOfAFileStayOrPartAsTheUserSays)
{
    const std::string before = Text("a.hdkv");
    std::filesystem::create_hard_link(m_folder / "a.hdkv", m_folder / "b.hdkv");
    for (const char* command :
         {"set a.hdkv G_f 7", "fmt found.hdkv -o a.hdkv", "fmt found.hdkv -o a.hdkv --lose-metadata"}) {
        EXPECT_EQ(Run(command), 4) << command;
        EXPECT_NE(err.find("\"a.hdkv\" was left as it is: it is one of 2 names of the same file"), std::string::npos)
            << err;
        EXPECT_NE(err.find("--hard-links keep "), std::string::npos) << err;
        EXPECT_EQ(Text("a.hdkv"), before);
    }
    EXPECT_EQ(Run("set a.hdkv G_f 7 --hard-links keep"), 0) << err;
    EXPECT_EQ(std::filesystem::hard_link_count(m_folder / "a.hdkv"), 2u);
    EXPECT_EQ(Got("G_f"), "7\n");
    const std::string kept = Text("b.hdkv");
    EXPECT_EQ(kept, Text("a.hdkv"));
    EXPECT_EQ(Run("set a.hdkv --hard-links=split G_f 8"), 0) << err;
    EXPECT_EQ(Got("G_f"), "8\n");
    EXPECT_EQ(Text("b.hdkv"), kept);
    EXPECT_EQ(err, "");
}

TEST_F(Hdkv, MetadataGoesOnlyWhenTheUserSaysSo)
{
    const std::string file = Path("a.hdkv"), before = Text("a.hdkv");
    if (::chown(file.c_str(), 1234, 4321) != 0)
        GTEST_SKIP() << "needs a file of somebody else's";
    ::chmod(file.c_str(), 0640);
    m_prefix = "setpriv --bounding-set=-chown "; // even root may give away nothing then
    const std::size_t files = FileCount();
    EXPECT_EQ(Run("set a.hdkv G_f 7"), 4);
    EXPECT_NE(
        err.find("\"a.hdkv\" was left as it is: this would not be kept of it as it was before: owner, group, mode. "
                 "--lose-metadata "),
        std::string::npos)
        << err;
    EXPECT_EQ(Text("a.hdkv"), before);
    EXPECT_EQ(FileCount(), files + 2); // the outputs of the run
    EXPECT_EQ(Run("set a.hdkv G_f 7 --lose-metadata"), 0);
    EXPECT_NE(err.find("not kept of it as it was before: owner, group, mode."), std::string::npos) << err;
    m_prefix.clear();
    EXPECT_EQ(Got("G_f"), "7\n");
}

TEST_F(Hdkv, ProgramsThatChangeOneFileAtOnceLoseNothing)
{
    const std::string hdkv = "\"" HDKV "\" ";
    for (int round = 1; round <= 50; ++round) {
        const std::string number = std::to_string(round);
        m_prefix = "true; " + hdkv + "set a.hdkv G_f " + number + " & other=$!; ";
        EXPECT_EQ(Run("set a.hdkv G_waterlevel " + number + "; code=$?; wait $other && exit $code; exit 99 #"), 0);
        m_prefix.clear();
        EXPECT_EQ(Got("G_f") + Got("G_waterlevel"), number + "\n" + number + "\n");
    }
    const std::string before = Text("a.hdkv");
    const FileLock lock = FileLock::Try(Path("a.hdkv"), "somebody");
    ASSERT_TRUE(lock.IsHeld());
    EXPECT_EQ(Run("set a.hdkv G_f 1"), 4);
    EXPECT_NE(err.find("\"a.hdkv\" was left as it is: it is in use by "), std::string::npos) << err;
    EXPECT_NE(err.find("(somebody, process "), std::string::npos) << err;
    EXPECT_EQ(Run("show a.hdkv"), 0) << "reading needs no lock";
    EXPECT_EQ(Run("fmt --check a.hdkv"), 0) << err;
    EXPECT_EQ(Text("a.hdkv"), before);
}

TEST_F(Hdkv, WhatAKilledSaveDisplacedIsNamed)
{
    {
        TemporaryFile left(PlatformFile::Native());
        ASSERT_FALSE(left.Create(PathFromUtf8(Path("a.hdkv")).parent_path()));
        ASSERT_FALSE(left.Write("theirs") || left.Finish(false) || left.Protect({PathFromUtf8(Path("a.hdkv"))}));
        left.Release();
    }
    EXPECT_EQ(Run("get a.hdkv G_f"), 0);
    EXPECT_TRUE(err.empty()) << "it only reads";
    EXPECT_EQ(Run("set a.hdkv G_f 1"), 0);
    EXPECT_NE(err.find("A save of \"a.hdkv\" was cut off; what another program may have written"), std::string::npos)
        << err;
    EXPECT_EQ(Text("a.hdkv.displaced-1"), "theirs");
    EXPECT_EQ(Run("set a.hdkv G_f 2"), 0);
    EXPECT_TRUE(err.empty()) << err;
}
#endif
