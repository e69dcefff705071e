#include "tql/tql_support.h"

#include <bit>
#include <cmath>
#include <gtest/gtest.h>
#include <limits>
#include <random>

namespace {

TEST(Values, EachTypeIsItself)
{
    const Params p("-12, 0.5, true, false, \"a\", <b>");
    const TqlType types[] = {TqlType::Int,  TqlType::Double, TqlType::Bool,
                             TqlType::Bool, TqlType::String, TqlType::FileName};
    ASSERT_EQ(tqlGetNoParams(p.Keyword()), 6);
    for (int i = 0; i < 6; ++i)
        EXPECT_EQ(tqlGetType(p[i + 1]), types[i]) << i;
}

TEST(Values, AnotherTypeLeavesTheValueUntouched)
{
    const Params p("-12, 0.5, true, \"a\", <b>");
    for (int i = 0; i <= 6; ++i) { // 0 and 6 are not there
        std::int32_t integer = 77;
        double number = 7.5;
        bool flag = true;
        std::string text = "kept";
        EXPECT_EQ(tqlGetInt(p[i], &integer), i == 1);
        EXPECT_EQ(integer, i == 1 ? -12 : 77);
        EXPECT_EQ(tqlGetDouble(p[i], &number), i == 1 || i == 2);
        EXPECT_EQ(number, i == 1 ? -12 : i == 2 ? 0.5 : 7.5);
        flag = i != 3;
        EXPECT_EQ(tqlGetBool(p[i], &flag), i == 3);
        EXPECT_TRUE(flag);
        EXPECT_EQ(tqlGetString(p[i], &text), i == 4 || i == 5);
        EXPECT_EQ(text, i == 4 ? "a" : i == 5 ? "b" : "kept");
    }
}

TEST(Values, TakingGoesThroughAllParametersWhateverTheirType)
{
    const Params p("\"a, \\\"b\" , 2,true , 1e3, <f>,7 // c");
    tqlHandle param = p[1];
    std::string text;
    std::int32_t integer = 0, kept = 77;
    bool flag = false;
    double number = 0;
    EXPECT_TRUE(tqlTake(&param, &text));
    EXPECT_TRUE(tqlTake(&param, &number)) << "an integer is a float, too";
    EXPECT_TRUE(text == "a, \"b" && number == 2);
    EXPECT_TRUE(tqlTake(&param, &flag));
    EXPECT_FALSE(tqlTake(&param, &kept));
    EXPECT_FALSE(tqlTake(&param, &kept));
    EXPECT_EQ(param, p[6]);
    EXPECT_TRUE(tqlTake(&param, &integer));
    EXPECT_TRUE(flag && integer == 7 && kept == 77);
    EXPECT_EQ(param, nullptr);
    EXPECT_FALSE(tqlTake(&param, &kept));
}

TEST(Values, NumbersInEveryNotation)
{
    const std::pair<const char*, double> floats[] = {
        {"0.5", 0.5},
        {".5", 0.5},
        {"1.", 1},
        {"-1.e3", -1000},
        {"1e-05", 1e-5},
        {"1E+5", 1e5},
        {"007", 7},
        {"-0.0", -0.0},
        {"-0", 0.0},
        {"-0000000000000000000000", 0.0},
        {"-0e0", -0.0},
        {"0000000000000000000000000000000012.5", 12.5},
        {"9007199254740993.0", 9007199254740992.0},
        {"0.12345678901234567890123", 0.12345678901234567890123},
        {"-0", 0.0},
        {"-0000000000000000000000", 0.0},
        {"-0e0", -0.0},
        {"0000000000000000000000000000000012.5", 12.5},
        {"9007199254740993.0", 9007199254740992.0},
        {"0.12345678901234567890123", 0.12345678901234567890123},
        {"0.1", 0.1},
        {"4.9e-324", 5e-324},
        {"inf", INFINITY},
        {"-inf", -INFINITY},
        {"2147483648.0", 2147483648.0},
        {"123456789012345678901234567890.0", 123456789012345678901234567890.0},
        {"179769313486231570000000000000000000000e270", 1.7976931348623157e308},
    };
    for (const auto& [text, expected] : floats) {
        double value = 99;
        EXPECT_TRUE(tqlGetDouble(Params(text)[1], &value)) << text;
        EXPECT_EQ(std::bit_cast<std::uint64_t>(value), std::bit_cast<std::uint64_t>(expected)) << text;
    }
    for (const auto& [text, expected] :
         {std::pair("2147483647", 2147483647), {"-2147483648", -2147483647 - 1}, {"-0", 0}}) {
        std::int32_t value = 99;
        EXPECT_TRUE(tqlGetInt(Params(text)[1], &value)) << text;
        EXPECT_EQ(value, expected);
    }
    double nan = 0;
    EXPECT_TRUE(tqlGetDouble(Params("-nan")[1], &nan));
    EXPECT_TRUE(std::isnan(nan) && std::signbit(nan));
}

// What is written reads back to the same bits, and as a float again.
TEST(Values, FloatsRoundTripToTheBit)
{
    std::vector<double> values{0.0,
                               -0.0,
                               30.0,
                               -99.0,
                               1e10,
                               12345678901.0,
                               -2147483648.0,
                               2147483648.0,
                               1e15,
                               1e16,
                               1e21,
                               1e22,
                               0.1,
                               1.0 / 3,
                               5e-324,
                               std::numeric_limits<double>::max(),
                               std::numeric_limits<double>::min(),
                               INFINITY,
                               -INFINITY};
    std::mt19937_64 random(42);
    while (values.size() < 20000)
        if (const double value = std::bit_cast<double>(random()); !std::isnan(value))
            values.push_back(value);
    for (int i = 0; i < 5000; ++i) // what modellers type
        values.push_back(double(std::int64_t(random() % 2000000) - 1000000) / 1000);
    const Structure out(tqlCreate());
    tqlAddTarget(out, "T");
    for (const double value : values)
        tqlPutParam(out, "K", value);
    tqlEndSection(out);
    const Structure in = LoadText(std::string(tqlGetText(out)));
    const tqlHandle target = tqlTargetByNameNum(in, "T", 1);
    for (std::size_t i = 0; i < values.size(); ++i) {
        double value = 99;
        ASSERT_TRUE(tqlGetParam(target, "K", &value, int(i) + 1));
        ASSERT_EQ(std::bit_cast<std::uint64_t>(value), std::bit_cast<std::uint64_t>(values[i])) << values[i];
    }
}

TEST(Values, NotationOfFloatsIsShort)
{
    const std::pair<double, const char*> cases[] = {
        {30, "30"},      {-0.0, "-0.0"}, {0.5, "0.5"},   {1e-5, "1e-05"},    {12345678901.0, "12345678901.0"},
        {1e22, "1e+22"}, {NAN, "nan"},   {-NAN, "-nan"}, {-INFINITY, "-inf"}};
    for (const auto& [value, text] : cases) {
        const Structure out(tqlCreate());
        tqlAddTarget(out, "T");
        tqlPutParam(out, "K", value);
        tqlEndSection(out);
        EXPECT_EQ(tqlGetText(out), std::string("// KVR parameter file 1\n[T]\n  K = ") + text + "\n[/T]\n");
    }
}

TEST(Values, EscapesInStringsAndFileNames)
{
    const std::pair<const char*, std::string> cases[] = {
        {R"("a\"b\\c\n\r\t")", "a\"b\\c\n\r\t"},
        {R"("\u{41}\u{e9}\u{20AC}\u{01F30A}\u{10FFFF}")", "A\xC3\xA9\xE2\x82\xAC\xF0\x9F\x8C\x8A\xF4\x8F\xBF\xBF"},
        {R"("\u{0}")", std::string(1, '\0')},
        {"\"a\tb // no, comment\"", "a\tb // no, comment"},
        {R"(<C:\\data\\a\>b"c.kvt0>)", "C:\\data\\a>b\"c.kvt0"},
        {"\"\"", ""},
    };
    for (const auto& [text, expected] : cases) {
        std::string value = "kept";
        EXPECT_TRUE(tqlGetString(Params(text)[1], &value)) << text;
        EXPECT_EQ(value, expected) << text;
    }
}

TEST(Values, EveryCharacterRoundTripsInStringsAndFileNames)
{
    std::string all;
    for (int c = 0; c < 128; ++c)
        all += char(c);
    all += "\xE6\xB2\xB3\xE5\xB7\x9D \xF0\x9F\x8C\x8A \xEF\xBB\xBF \xC2\x85";
    const Structure out(tqlCreate());
    tqlAddTarget(out, "T");
    tqlPutParam(out, "S", std::string_view(all));
    tqlPutParamFilename(out, "F", all);
    tqlPutParam(out, "Bad", std::string_view("a\xFFz\xE6\xB2"));
    tqlEndSection(out);
    const Structure in = LoadText(std::string(tqlGetText(out)));
    const tqlHandle target = tqlTargetByNameNum(in, "T", 1);
    std::string text, file, bad;
    EXPECT_TRUE(tqlGetParam(target, "S", &text));
    EXPECT_TRUE(tqlGetParamFilename(target, "F", &file));
    EXPECT_TRUE(tqlGetParam(target, "Bad", &bad));
    EXPECT_EQ(text, all);
    EXPECT_EQ(file, all);
    EXPECT_EQ(bad, "a\xEF\xBF\xBDz\xEF\xBF\xBD\xEF\xBF\xBD");
    EXPECT_FALSE(tqlGetParamFilename(target, "S", &file)) << "a string is no file name";
}

TEST(Values, ListParametersAreAllOrNothing)
{
    const Params p("true, 4, 2, 0.5, \"a\", <b>");
    bool flag = false;
    std::int32_t integer = 0;
    double whole = 0, number = 0;
    std::string text, file;
    EXPECT_TRUE(tqlGetListParam(p.Target(), "K", 1, "biddsn", {&flag, &integer, &whole, &number, &text, &file}));
    EXPECT_TRUE(flag && integer == 4 && whole == 2 && number == 0.5 && text == "a" && file == "b");

    struct Case
    {
        const char* signature;
        std::vector<TqlOut> out;
    };
    bool otherFlag = false;
    std::int32_t otherInteger = 9;
    const Case refused[] = {
        {"bb", {&otherFlag, &otherFlag}},    // second is an integer
        {"bi", {&otherFlag}},                // fewer pointers than letters
        {"bd", {&otherFlag, &otherInteger}}, // pointer of another type
        {"bi", {&otherFlag, static_cast<std::int32_t*>(nullptr)}},
        {"bx", {&otherFlag, &otherInteger}},
        {"biddsni",
         {&otherFlag, &otherInteger, &whole, &number, &text, &file, &otherInteger}}, // one too few in the file
    };
    for (const Case& c : refused)
        EXPECT_FALSE(tqlGetListParam(p.Target(), "K", 1, c.signature, c.out)) << c.signature;
    EXPECT_FALSE(tqlGetListParam(p.Target(), "K", 2, "b", {&otherFlag}));
    EXPECT_TRUE(!otherFlag && otherInteger == 9);
}

} // namespace
