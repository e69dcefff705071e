// Content that no table knows comes back where it was, behind the known content of its section.
#include "hd_support.h"

#include <algorithm>

namespace {

/// The lines of a text without their indentation.
std::vector<std::string> Lines(const std::string& text)
{
    std::vector<std::string> lines;
    for (std::size_t at = 0; at < text.size();) {
        const std::size_t end = text.find('\n', at);
        const std::size_t start = text.find_first_not_of(' ', at);
        lines.push_back(text.substr(start, end - start));
        at = end + 1;
    }
    return lines;
}

/// The line behind the first one that is `line`, searched from the first one that is `from`.
std::string Behind(const std::vector<std::string>& lines, const std::string& line, const std::string& from)
{
    const auto start = std::find(lines.begin(), lines.end(), from);
    const auto found = std::find(start, lines.end(), line);
    return lines.end() - found > 1 ? *(found + 1) : "(not there)";
}

constexpr const char* file = R"([KAVO0_HD]
  loose = 1
  [Global_Variables]
    wind = "w" // at the second level
    [Global_Values]
      G_f = 1
      G_f = 2
      Zukunft = <a\>b>, "\u{fc}", 0.10, -0
      empty =
      [Inner]
        [Deeper]
          k = 1
        [/Deeper]
      [/Inner]
    [/Global_Values]
    [TextOutput]
      [OutputItems]
        data = 1, "x", 2, <more>, 0.1, true
        datum = 5
      [/OutputItems]
    [/TextOutput]
    [Global_Values]
      G_f = 3
    [/Global_Values]
    [Ice]
      Thickness = 0.3
    [/Ice]
  [/Global_Variables]
  [InitList]
    DATA = "R", 1, 2, 3, 4, "five"
    note = "n"
    DATA = "R", 2, 2, 3, 4
    [Sub]
    [/Sub]
  [/InitList]
  [InitList]
    DATA = "SECOND", 1, 2, 3
  [/InitList]
  [Enc_Simulation]
    [Encroachment_Setup]
      DATA = "R", 1, 1, 1, 0, 0, 0, 0, 0, 1, 0, 0, 0, 0, 0
      mode = 2
    [/Encroachment_Setup]
    [Other_Setup]
    [/Other_Setup]
  [/Enc_Simulation]
  [DikeList]
    DATA = "R", 1
  [/DikeList]
[/KAVO0_HD]
[KAVO0_HD]
  [InitList]
    DATA = "THIRD", 1, 2, 3
  [/InitList]
[/KAVO0_HD]
[KVR_OTHER]
  [S]
    k = 7
  [/S]
[/KVR_OTHER]
)";

} // namespace

TEST(Unknown, IsKeptAtEveryDepthBehindTheKnown)
{
    HD_Parameters parameters;
    parameters.Load(Parsed(file).Get());
    EXPECT_EQ(parameters.Global.G_f, 1);
    ASSERT_EQ(parameters.InitList.GetCount(), 2u);

    const std::string text = HDFileText(parameters);
    const auto lines = Lines(text);
    const auto& values = *std::ranges::find(HDGlobals().Sections(), "Global_Values", &DeclaredSection::name);
    const std::string lastKeyword = *std::ranges::find_if(lines, [&](const std::string& line) {
        return line.starts_with(std::string(values.keywords.back().name) + " =");
    });
    const struct
    {
        const char *line, *behind, *from;
    } cases[] = {
        {"G_f = 1", "G_k_100 = 1", "[Global_Values]"},
        {lastKeyword.c_str(), "G_f = 2", "[Global_Values]"},
        {"G_f = 2", R"(Zukunft = <a\>b>, "\u{fc}", 0.10, -0)", "[Global_Values]"}, // in its own notation
        {"empty =", "[Inner]", "[Global_Values]"},
        {"[Deeper]", "k = 1", "[Inner]"},
        {R"(data = 1, "x", 2, <more>, 0.1, true)", "datum = 5", "[OutputItems]"},
        {"[/Leakage]", R"(wind = "w")", "[Global_Variables]"},
        {"[Global_Values]", "G_f = 3", "[/Leakage]"},
        {"[Ice]", "Thickness = 0.3", "[/Leakage]"},
        {R"(DATA = "R", 1, 2, 3, 4, "five")", R"(DATA = "R", 2, 2, 3, 4)", "[InitList]"},
        {R"(DATA = "R", 2, 2, 3, 4)", R"(note = "n")", "[InitList]"},
        {R"(note = "n")", "[Sub]", "[InitList]"},
        {"mode = 2", "[/Encroachment_Setup]", "[Encroachment_Setup]"},
        {"[/Encroachment_Setup]", "[Other_Setup]", "[Enc_Simulation]"},
        {"[InitList]", R"(DATA = "SECOND", 1, 2, 3)", "loose = 1"},
        {"[DikeList]", R"(DATA = "R", 1)", "loose = 1"},
        {"[/KAVO0_HD]", "[KAVO0_HD]", "[DikeList]"},
        {"[S]", "k = 7", "[KVR_OTHER]"},
    };
    for (const auto& c : cases)
        EXPECT_EQ(Behind(lines, c.line, c.from), c.behind) << text;
    EXPECT_EQ(Behind(lines, "[/" + std::string(HDLists().back().section) + "]", "[KAVO0_HD]"), "loose = 1") << text;

    HD_Parameters again;
    again.Load(Parsed(text).Get());
    EXPECT_EQ(HDFileText(again), text);
    again.RemoveAllRecords();
    const HD_Parameters plain = FromSection("Global_Values", "G_f = 1");
    again.Global.TextOutput = plain.Global.TextOutput;
    EXPECT_EQ(HDFileText(again), HDFileText(plain));
}

TEST(Unknown, ParametersTravelWithTheirRecord)
{
    std::string known;
    for (std::size_t i = 0; i < HDLeakage::DeclaredFields().size(); ++i)
        known += ", 2";
    const std::string r = "DATA = \"R\", 1" + known + ", 1.50, <f>, \"t\", false, -3\n";
    const std::string s = "DATA = \"S\", 1" + known + '\n';
    const HD_Parameters read = FromTarget("[LeakageList]\n" + r + s + "[/LeakageList]");
    HD_Parameters copy;
    copy.LeakageList.Add(read.LeakageList.GetAt(1));
    copy.LeakageList.Add(read.LeakageList.GetAt(0));
    copy.LeakageList.GetAt(1) = copy.LeakageList.GetAt(1);
    EXPECT_NE(HDFileText(copy).find(s + "    " + r), std::string::npos);
}

TEST(Unknown, GlobalParametersAreReplacedByTheNextFile)
{
    HD_Parameters parameters = FromSection("Leakage", "LeakageCoefficient = 1, 2, 3");
    EXPECT_NE(HDFileText(parameters).find("LeakageCoefficient = 1, 2, 3\n"), std::string::npos);
    const std::string next = "[KAVO0_HD]\n[Global_Variables]\n[Leakage]\nLeakageCoefficient = 4\n[/Leakage]\n"
                             "[/Global_Variables]\n[/KAVO0_HD]\n";
    parameters.Load(Parsed(next).Get());
    EXPECT_NE(HDFileText(parameters).find("LeakageCoefficient = 4\n"), std::string::npos);
}
