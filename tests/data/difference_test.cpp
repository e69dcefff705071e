#include "hd_support.h"

#include "files/difference.h"

#include <gtest/gtest.h>

namespace {

/// "section keyword number.parameter@line: before -> after", a line each; then the counts.
std::string Told(const std::string& before, const std::string& after, std::size_t most = 1000)
{
    const auto file = [](const std::string& text) { return "[T]\n" + text + "[/T]\n"; };
    const TqlStructure a = Parsed(file(before)), b = Parsed(file(after));
    const Differences found = FindDifferences(a.Get(), b.Get(), most);
    std::string told;
    for (const Difference& each : found.list)
        told += each.section + ' ' + each.keyword + ' ' + std::to_string(each.number) + '.' +
                std::to_string(each.parameter) + '@' + std::to_string(each.line) + ": " + each.before + " -> " +
                each.after + '\n';
    return told + std::to_string(found.changed) + ' ' + std::to_string(found.added) + ' ' +
           std::to_string(found.removed) + ' ' + std::to_string(found.sections);
}

std::string Lines(int from, int to, int without = -100)
{
    std::string lines = "[L]\n";
    for (int i = from; i < to; ++i)
        if (i != without)
            lines += "D = \"A\", " + std::to_string(i) + "\n";
    return lines + "[/L]\n";
}

} // namespace

TEST(Difference, IsToldValueByValue)
{
    const struct
    {
        std::string before, after;
        const char* told;
    } cases[] = {
        {"K = 1, 2.0, \"a\"\n", "K = 1.0, 2e0, \"a\"\n", "0 0 0 0"},
        {"K = 1, 2, \"a\"\n", "K = 1, 3, \"b\"\n", " K 1.2@2: 2 -> 3\n K 1.3@2: \"a\" -> \"b\"\n2 0 0 1"},
        {"K = 1, 2\n", "K = 1, 2, 3\n", " K 1.0@2: 1, 2 -> 1, 2, 3\n1 0 0 1"},
        {"K = 1\n", "K = \"1\"\n", " K 1.1@2: 1 -> \"1\"\n1 0 0 1"},
        {"K = 0, 0, 0, 0, 0, 0\n", "K = 2024, 5, 0, 0, 0, 0\n", " K 1.1@2: 0 -> 2024\n K 1.2@2: 0 -> 5\n2 0 0 1"},
        {"K = <a>\n", "K = \"a\"\n", " K 1.1@2: <a> -> \"a\"\n1 0 0 1"},
        {"K = true\nM = 1\n", "M = 1\nN = 2\n", " K 1.0@2: true -> \n N 1.0@3:  -> 2\n0 1 1 1"},
        {"K = 1e10, 2\nM = 1e+10, 2\n", "K = 5, 1e10\n",
         " K 1.1@2:  -> 5\n K 1.2@2: 2 -> \n M 1.0@3: , 2 -> \n2 0 1 1"},
        {"[S]\n[/S]\n", "[S]\nK = 1\n[/S]\n", "S K 1.0@3:  -> 1\n0 1 0 1"},
        // A line that comes, goes or changes among others is one difference, wherever it stands.
        {Lines(0, 9), Lines(-1, 9), "L D 1.0@3:  -> \"A\", -1\n0 1 0 1"},
        {Lines(0, 9), Lines(0, 9, 4), "L D 5.0@7: \"A\", 4 -> \n0 0 1 1"},
        {Lines(0, 3) + Lines(5, 8), Lines(0, 3) + Lines(5, 9), "L 2 D 4.0@11:  -> \"A\", 8\n0 1 0 1"},
        // So is a section of several.
        {Lines(0, 3) + Lines(5, 8), Lines(5, 8), "L 1  0.0@2: 3 -> \n0 0 3 1"},
    };
    for (const auto& [before, after, told] : cases)
        EXPECT_EQ(Told(before, after), told) << before << after;
    EXPECT_EQ(Told("K = 1\nM = 1\n", "K = 2\nM = 2\n", 1), " K 1.1@2: 1 -> 2\n2 0 0 1") << "counted beyond the list";
}

TEST(Difference, IsToldOfFurtherTargets)
{
    const TqlStructure a = Parsed("[T]\n[/T]\n[U]\nK = 1\n[/U]\n"),
                       b = Parsed("[T]\n[/T]\n[U]\nK = 2\n[/U]\n[V]\nM = 1\n[/V]\n");
    const Differences found = FindDifferences(a.Get(), b.Get());
    ASSERT_EQ(found.list.size(), 2u);
    EXPECT_EQ(found.list[0].section + found.list[0].before + found.list[0].after, "U12");
    EXPECT_EQ(found.list[1].section + found.list[1].keyword, "V");
    EXPECT_EQ(found.changed + 10 * found.added, 11u);
}

TEST(Difference, LinesInAnotherOrderAreFewAndLongFilesTakeNoTimeToSpeakOf)
{
    constexpr int many = 50'000;
    std::string before = Lines(0, many), after = Lines(0, many, 7);
    after.insert(after.size() - 5, "D = \"A\", 7\n");
    EXPECT_EQ(Told(before, after), "L D 8.0@10: \"A\", 7 -> \nL D 50000.0@50002:  -> \"A\", 7\n0 1 1 1");
    // Nothing in common, and no name either.
    std::string others = "[L]\n";
    for (int i = 0; i < many; ++i)
        others += "K" + std::to_string(i) + " = 1\n";
    EXPECT_TRUE(Told(before, others + "[/L]\n", 0).starts_with("0 50000 50000"));
}
