#include "hd_support.h"

#include "data/hd_file.h"

#include <algorithm>

namespace {

std::vector<Finding> CheckReading(tqlHandle structure)
{
    LoadReport report(structure, LoadReport::Wanted::Everything);
    HD_Parameters parameters;
    parameters.Load(structure, &report);
    return report.Take();
}

std::vector<std::string> Texts(const std::string& text)
{
    std::vector<std::string> texts;
    for (const Finding& finding : CheckReading(Parsed(text).Get()))
        texts.push_back(std::to_string(finding.line) + ':' + std::to_string(finding.column) + ": " +
                        FindingText(finding) + (finding.LosesContent() ? " (loses)" : ""));
    return texts;
}

std::string InSection(const std::string& section, const std::string& line)
{
    return "[KAVO0_HD]\n[Global_Variables]\n[" + section + "]\n" + line + "\n[/" + section +
           "]\n[/Global_Variables]\n[/KAVO0_HD]\n";
}

std::string InList(const std::string& list, const std::string& line)
{
    return "[KAVO0_HD]\n[" + list + "]\n" + line + "\n[/" + list + "]\n[/KAVO0_HD]\n";
}

} // namespace

TEST(Check, FindsWhatIsNotInOrder)
{
    const struct
    {
        std::string text;
        const char* finding; // null for none
    } cases[] = {
        {InSection("Global_Values", "G_f = 1"), nullptr},
        {InSection("Global_Values", "G_f = \"x\""),
         "4:7: G_f: parameter 1 (G_f) should be a number, found a text (loses)"},
        {InSection("Global_Values", "G_wave = 1.0"),
         "4:10: G_wave: parameter 1 (G_wave) should be an integer, found a number; taken as 1"},
        {InSection("Global_Values", "G_wave = 1.5"),
         "4:10: G_wave: parameter 1 (G_wave) should be an integer, found a number (loses)"},
        {InSection("Global_Values", "G_f ="), "4:1: G_f: parameter 1 (G_f) is missing"},
        {InSection("Global_Values", "ResisZone = 1, 2"),
         "4:1: ResisZone: parameter 3 (ZoneResistance2) and those behind it are missing"},
        {InSection("Global_Values", "G_f = 1, 2"), "4:10: G_f: unknown parameters from number 2 on"},
        {InSection("Global_Values", "g_f = 1"), "4:1: unknown keyword \"g_f\""},
        {InSection("Default_Values", ""), "3:1: unknown section [Default_Values]"},
        {InSection("Leakage", "LeakageCoefficient = 1\nLeakageCoefficient = 1"),
         "5:1: keyword \"LeakageCoefficient\" is there more than once; only the first counts"},
        {InSection("WaterLevelMarkTitles", "MarkTitles = 0, \"\""), nullptr},
        {InSection("WaterLevelMarkTitles", "MarkTitles = 0"), nullptr},
        {InSection("WaterLevelMarkTitles", "MarkTitles = 0, \"\", \"\""),
         "4:21: MarkTitles: unknown parameters from number 3 on"},
        {InSection("WaterLevelMarkTitles", "MarkTitles = 2, \"A\""),
         "4:14: MarkTitles: the count 2 of MarkTitles does not fit the 1 parameters behind it (loses)"},
        {InSection("WaterLevelMarkTitles", "MarkTitles = 1, \"A\"\nMarkInterpolate = 1, 2"),
         "5:22: MarkInterpolate: parameter 2 (Interpolate) should be true or false, found an integer (loses)"},
        {InSection("WaterLevelMarkTitles", "MarkTitles = 1, \"A\"\nMarkInterpolate = 2, true, false"),
         "5:1: MarkInterpolate: there are more flags than the 1 titles (loses)"},
        {InSection("MixingCoefficients", "MixingCoef = -1, 1, 1, 1, 1"),
         "4:14: MixingCoef: the count -1 of CoefPairs does not fit the 4 parameters behind it (loses)"},
        {InSection("TextOutput", "LimitedPeriodEnd = 2023, 2, 29, 0, 0, 0"),
         "4:20: LimitedPeriodEnd: the six integers of LimitedPeriodEnd are no date and time"},
        {InSection("TextOutput", "LimitedPeriodEnd = 2023, 2"),
         "4:20: LimitedPeriodEnd: LimitedPeriodEnd needs six integers (loses)"},
        {InSection("TextOutput", "LimitedPeriodEnd = 2023, 2, 1, 0, 0.0, 0"),
         "4:35: LimitedPeriodEnd: parameter 5 (LimitedPeriodEnd) should be an integer, found a number; taken as 2023, "
         "2, 1, 0, 0, 0"},
        {InSection("TextOutput", "Delimiter = <;>"),
         "4:13: Delimiter: parameter 1 (Delimiter) should be a text in quotes, found a file name; taken as \";\""},
        {InSection("TextOutput", "[OutputItems]\ndata = 1\n[/OutputItems]"),
         "5:1: OutputItems: parameter 2 (UserName) and those behind it are missing"},
        {InSection("MapOutput", "GeoDb = <a>"), "4:1: GeoDb is not read, because ApplyDemGroundElevation is missing"},
        {InList("InitList", "DATA = \"R\", 1, 2, 3"), nullptr},
        {InList("InitList", "DATA = \"\", 1, 2, 3"), nullptr},
        {InList("BedList", "DATA = \"R\", 1, 2"), nullptr},
        {InList("BedList", "DATA = \"R\", 1, 2, 3"),
         "3:1: BedList: parameter 5 (ZoneResistance2) and those behind it are missing"},
        {InList("WindList", "// \xC3\xBC\nnote = 1"), "4:1: unknown keyword \"note\""},
        {InList("Enc_Simulation", "[Encroachment_Setup]\nDATA = \"\", 1, 1, 1, 0, 0, 0, 0, 0, 1, 0, 0, 0, 0, 0\n"
                                  "[/Encroachment_Setup]"),
         nullptr},
        {"[KAVO0_HD]\n[/KAVO0_HD]\n[X]\n[/X]\n", "3:1: unknown section [X]"},
        {"[X]\n[/X]\n", "1:1: there is no target [KAVO0_HD] (loses)"},
    };
    for (const auto& c : cases) {
        const auto expected = c.finding ? std::vector<std::string>{c.finding} : std::vector<std::string>{};
        EXPECT_EQ(Texts(c.text), expected) << c.text;
    }
}

TEST(Check, FindingsComeInFileOrderAndQuickly)
{
    EXPECT_TRUE(Texts(HDFileText({}, true)).empty());
    // Ten thousand findings at the end of a long file: positions are looked up, not counted anew each time.
    std::string lines(200'000, '\n');
    for (int i = 0; i < 10'000; ++i)
        lines += "MINE = 1\n";
    const auto findings = CheckReading(Parsed(InList("InitList", lines)).Get());
    ASSERT_EQ(findings.size(), 10'000u);
    EXPECT_EQ(findings.back().line, 210'002u);
    EXPECT_TRUE(std::ranges::is_sorted(findings, {}, &Finding::line));
}

// What opening a file tells: only what must be known, with what stands there and what is used instead.
TEST(Check, OpeningTellsWhatWasNotTakenAsItStands)
{
    const std::string text = "[KAVO0_HD]\n[Global_Variables]\n[Global_Values]\nG_wave = 2.0\nG_f = \"x\"\nodd = 1\n"
                             "[/Global_Values]\n[Quasi_steady]\nEnergyEquation = 1, 3.0\n[/Quasi_steady]\n"
                             "[/Global_Variables]\n[MixingCoefList]\n"
                             "DATA = \"R\", 5, 1.0, 7, 8, 1, 2, 3, 4\n"
                             "DATA = \"R\", 6, 5, 7, 8, 1, 2, 3, 4\n"
                             "DATA = \"R\", 7, 2, 7, 8, 1, 2, 3, 4\n"
                             "DATA = \"R\", 8, 0.5, 1, 2, 3, 4\n[/MixingCoefList]\n"
                             "[WaveList]\nDATA = \"R\", 1, 2, 2.0\nDATA = \"\", 1, 2, 2\n[/WaveList]\n[/KAVO0_HD]\n";
    const TqlStructure structure = Parsed(text);
    LoadReport report(structure.Get());
    HD_Parameters read;
    read.Load(structure.Get(), &report);
    EXPECT_EQ(read.Global.G_wave, 2);
    EXPECT_TRUE(read.Global.EnergyEquation);
    EXPECT_EQ(read.Global.FrictionSlope, 3);
    EXPECT_EQ(read.MixingCoefList.GetAt(0).CoefPairs.size(), 1u);
    EXPECT_EQ(read.MixingCoefList.GetAt(0).MixCoef4, 4);
    EXPECT_TRUE(read.MixingCoefList.GetAt(1).CoefPairs.empty());
    EXPECT_EQ(read.WaveList.GetAt(0).WaveApproximation, 2);

    const struct
    {
        Finding::Kind kind;
        std::size_t line;
        const char *section, *keyword;
        int parameter;
        const char *found, *used;
    } expected[] = {
        {Finding::OtherType, 4, "Global_Values", "G_wave", 1, "2.0", "2"},
        {Finding::WrongType, 5, "Global_Values", "G_f", 1, "\"x\"", "0"},
        {Finding::OtherType, 9, "Quasi_steady", "EnergyEquation", 1, "1", "true"},
        {Finding::OtherType, 9, "Quasi_steady", "EnergyEquation", 2, "3.0", "3"},
        {Finding::OtherType, 13, "MixingCoefList", "DATA", 3, "1.0", "1"},
        {Finding::CountDoesNotFit, 14, "MixingCoefList", "DATA", 3, "5, 7, 8, 1, 2, 3, 4", "0, 0, 0, 0, 0"},
        // The count leaves nothing for the last two coefficients: perhaps it was meant to be 1.
        {Finding::Missing, 15, "MixingCoefList", "DATA", 10, "\"R\", 7, 2, 7, 8, 1, 2, 3, 4", "0, 0"},
        {Finding::WrongType, 16, "MixingCoefList", "DATA", 3, "0.5, 1, 2, 3, 4", "0, 0, 0, 0, 0"},
        {Finding::OtherType, 19, "WaveList", "DATA", 4, "2.0", "2"},
    };
    const auto findings = report.Take();
    ASSERT_EQ(findings.size(), std::size(expected));
    for (std::size_t i = 0; i < findings.size(); ++i) {
        const Finding& finding = findings[i];
        EXPECT_EQ(finding.kind, expected[i].kind) << i;
        EXPECT_EQ(finding.line, expected[i].line) << i;
        EXPECT_EQ(finding.section, expected[i].section) << i;
        EXPECT_EQ(finding.keyword, expected[i].keyword) << i;
        EXPECT_EQ(finding.parameter, expected[i].parameter) << i;
        EXPECT_EQ(finding.found, expected[i].found) << i;
        const std::string used = finding.used + ", "; // of all values from there on
        EXPECT_TRUE(used.starts_with(std::string(expected[i].used) + ", ")) << i << ": " << used;
    }
}

TEST(Check, LongTextsAreCutBetweenCharacters)
{
    for (const std::size_t before : {0, 1}) {
        std::string value = '"' + std::string(before, 'x');
        while (value.size() < 600)
            value += "\xC3\xBC";
        value += '"';
        const TqlStructure structure = Parsed(InSection("Global_Values", "G_f = " + value));
        LoadReport report(structure.Get());
        HD_Parameters().Load(structure.Get(), &report);
        const auto findings = report.Take();
        ASSERT_EQ(findings.size(), 1u);
        EXPECT_EQ(findings[0].found, value.substr(0, 399 + before) + "...");
    }
}
