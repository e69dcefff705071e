#include "tql/tql_support.h"

#include <chrono>
#include <gtest/gtest.h>

namespace {

TEST(LookUp, NamesAndOccurrencesAreExact)
{
    const Structure file =
        LoadText("[A]\nx = 1\ny = 2\n[S]\nx = 3\n[/S]\nx = 4\n[s]\n[/s]\n[S]\n[/S]\n[/A]\n[B]\n[/B]\n[A]\n[/A]\n");
    EXPECT_EQ(tqlGetNoSections(file), 3);
    EXPECT_EQ(tqlName(tqlSectionByNum(file, 2)), "B");
    const tqlHandle a = tqlTargetByNameNum(file, "A", 1);
    EXPECT_NE(tqlTargetByNameNum(file, "A", 2), nullptr);
    EXPECT_EQ(tqlGetNoSections(a), 3);
    EXPECT_EQ(tqlGetNoKeywords(a), 3);
    EXPECT_EQ(tqlGetNoKeywords(a, "x"), 2);
    EXPECT_EQ(tqlGetNoKeywords(a, "X"), 0);
    EXPECT_EQ(tqlSectionByNameNum(a, "S", 2), tqlSectionByNum(a, 3));
    EXPECT_EQ(tqlSectionByNameNum(a, "s", 1), tqlSectionByNum(a, 2));
    std::int32_t value = 0;
    EXPECT_TRUE(tqlGetParam(a, "x", &value, 2));
    EXPECT_EQ(value, 4) << "the keyword of the inner section is not one of the outer";
    const tqlHandle missing[] = {tqlTargetByNameNum(file, "a", 1),
                                 tqlTargetByNameNum(file, "A", 3),
                                 tqlTargetByNameNum(file, "A", 0),
                                 tqlTargetByNameNum(a, "S", 1),
                                 tqlSectionByNameNum(a, "S", 3),
                                 tqlSectionByNameNum(a, "S", -1),
                                 tqlKeywordByNameNum(a, "z", 1),
                                 tqlKeywordByNameNum(a, "x", 3),
                                 tqlKeywordByNum(a, 4),
                                 tqlKeywordByNum(a, 0),
                                 tqlSectionByNum(a, 4),
                                 tqlParamByNum(tqlKeywordByNum(a, 1), 2)};
    for (const tqlHandle handle : missing)
        EXPECT_EQ(handle, nullptr);
}

// Any handle may be passed anywhere: what it is not, it does not have.
TEST(LookUp, HandlesOfAnotherKindAreNotFound)
{
    const Structure file = LoadText("[A]\nx = 1, \"s\"\n[/A]\n");
    const Structure created(tqlCreate());
    const tqlHandle a = tqlTargetByNameNum(file, "A", 1), x = tqlKeywordByNum(a, 1);
    for (const tqlHandle handle :
         {tqlHandle{}, tqlHandle(file), tqlHandle(created), a, x, tqlParamByNum(x, 1), tqlParamByNum(x, 2)}) {
        TqlSyntaxError error;
        std::int32_t integer = 7;
        EXPECT_EQ(tqlTargetByNameNum(handle, "A", 1) != nullptr, handle == file);
        EXPECT_EQ(tqlKeywordByNameNum(handle, "x", 1) != nullptr, handle == a);
        EXPECT_EQ(tqlGetNoKeywords(handle), handle == a);
        EXPECT_EQ(tqlGetNoKeywords(handle, "x"), handle == a);
        EXPECT_EQ(tqlGetNoSections(handle), handle == file);
        EXPECT_EQ(tqlGetNoParams(handle), handle == x ? 2 : 0);
        EXPECT_EQ(tqlParamByNum(handle, 1) != nullptr, handle == x);
        EXPECT_EQ(tqlGetRawParams(handle), handle == x ? "1, \"s\"" : "");
        const bool first = handle && handle == tqlParamByNum(x, 1), second = handle && handle == tqlParamByNum(x, 2);
        EXPECT_EQ(tqlGetRawParamsFrom(handle), first ? "1, \"s\"" : second ? "\"s\"" : "");
        EXPECT_EQ(tqlGetRawParam(handle), first ? "1" : second ? "\"s\"" : "");
        EXPECT_EQ(tqlName(handle), handle == a ? "A" : handle == x ? "x" : "");
        EXPECT_EQ(tqlGetInt(handle, &integer), handle == tqlParamByNum(x, 1) && handle);
        EXPECT_FALSE(tqlGetSyntaxErr(handle, &error));
        EXPECT_EQ(tqlGetText(handle).empty(), handle != created);
        tqlAddSection(handle, "S"); // nothing to see but that it does no harm
        tqlAddInt(handle, 1);
    }
}

TEST(LookUp, RawParametersAreTheLineWithoutItsComment)
{
    const std::pair<const char*, const char*> cases[] = {
        {"1 ,\t\"a, // b\" , <c>   // note", "1 ,\t\"a, // b\" , <c>"}, {"", ""}, {"// none", ""}, {"007", "007"}};
    for (const auto& [line, raw] : cases)
        EXPECT_EQ(tqlGetRawParams(Params(line).Keyword()), raw);
}

TEST(LookUp, ManyParametersByNumberInAnyOrder)
{
    std::string line = "0";
    for (int i = 1; i < 300000; ++i)
        line += ", " + std::to_string(i);
    const Params p(line);
    ASSERT_EQ(tqlGetNoParams(p.Keyword()), 300000);
    for (int i = 0; i < 300000; ++i) {
        const int number = int(i * 7919LL % 300000) + 1;
        std::int32_t value = -1;
        ASSERT_TRUE(tqlGetInt(p[number], &value));
        ASSERT_EQ(value, number - 1);
    }
    EXPECT_EQ(p[300001], nullptr);
}

TEST(LookUp, PositionsAreLinesAndCharacters)
{
    const Structure file =
        LoadText("\xEF\xBB\xBF[A]\r\n  \xE6\xB2\xB3 = \"\xE5\xB7\x9D\", 2\r\n\r\n\t[S]\r\n\t[/S]\r\n[/A]");
    const tqlHandle a = tqlTargetByNameNum(file, "A", 1), keyword = tqlKeywordByNum(a, 1);
    const std::pair<tqlHandle, std::pair<int, int>> cases[] = {{a, {1, 1}},
                                                               {keyword, {2, 3}},
                                                               {tqlParamByNum(keyword, 1), {2, 7}},
                                                               {tqlParamByNum(keyword, 2), {2, 12}},
                                                               {tqlSectionByNum(a, 1), {4, 2}},
                                                               {file, {0, 0}},
                                                               {nullptr, {0, 0}}};
    for (const auto& [handle, expected] : cases)
        for (const TqlPosition at : {tqlGetPosition(file, handle)})
            EXPECT_EQ(std::pair(int(at.line), int(at.column)), expected);
}

// A look-up that walked from the front would take minutes here.
TEST(LookUp, CostsTheSameInAnyOrderAndMixture)
{
    constexpr int count = 200000;
    const auto name = [](int i) { return std::string("N").append(std::to_string(i)); };
    for (const bool mixed : {false, true}) {
        std::string text = "[T]\n";
        for (int i = 0; i < count; ++i) {
            text += "DATA = " + std::to_string(i) + "\n";
            if (mixed)
                text += name(i) + " = " + std::to_string(i) + "\n[" + name(i % 3) + "]\n[/" + name(i % 3) + "]\n";
        }
        const Structure file = LoadText(text + "[/T]\n");
        const tqlHandle target = tqlTargetByNameNum(file, "T", 1);
        ASSERT_EQ(tqlGetNoKeywords(target, "DATA"), count);
        const auto start = std::chrono::steady_clock::now();
        for (int i = 0; i < count; ++i) {
            const int number = int((i * 99991LL + 17) % count);
            std::int32_t value = -1;
            ASSERT_TRUE(tqlGetParam(target, "DATA", &value, number + 1));
            ASSERT_EQ(value, number);
            if (mixed) {
                ASSERT_TRUE(tqlGetParam(target, name(number), &value));
                ASSERT_EQ(value, number);
                ASSERT_NE(tqlSectionByNameNum(target, "N1", number / 3 + 1), nullptr);
            }
        }
        EXPECT_LT(std::chrono::steady_clock::now() - start, std::chrono::seconds(10));
    }
}

} // namespace
