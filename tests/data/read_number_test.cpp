#include "files/read_number.h"

#include <gtest/gtest.h>
#include <limits>
#include <string>

TEST(NumberSyntax, AcceptsAndRejects)
{
    for (const char* text : {"0", "1", "-1", "+1", "007", "1.5", ".5", "-.5", "+.5", "1e5", "1E5", "+1E-05", ".5e+3",
                             "1.25e-300", "12345678901234567890"})
        EXPECT_TRUE(IsValidNumber(text)) << text;
    for (const char* text : {"",      "+",  "-",   ".",   "-.",  "1.",    "1.e5", "1e",   "1e+", "1 ",  " 1",  "1,5",
                             "1.5.2", "e5", ".e5", "--1", "+-1", "1e5.5", "1e5 ", "0x10", "nan", "inf", "1d5", "1-"})
        EXPECT_FALSE(IsValidNumber(text)) << text;
    EXPECT_FALSE(IsValidNumber(std::string("1\0", 2)));
    EXPECT_FALSE(IsValidNumber("１")); // a full-width digit
}

TEST(NumberSyntax, IntegersOf32Bits)
{
    const std::pair<const char*, std::int32_t> taken[] = {
        {"0", 0}, {"+3", 3}, {"-007", -7}, {"2147483647", 2147483647}, {"-2147483648", -2147483647 - 1}};
    for (const auto& [text, value] : taken)
        EXPECT_EQ(ReadInteger(text), value) << text;
    for (const char* text : {"", "+", "-", "--1", "+-1", "1.0", "1e3", " 1", "1 ", "0x10", "2147483648", "-2147483649"})
        EXPECT_EQ(ReadInteger(text), std::nullopt) << text;
}

TEST(NumberSyntax, Reads)
{
    const struct
    {
        std::string text;
        std::optional<double> value;
    } cases[] = {
        {"+1E-05", 1e-5},
        {"-.5", -0.5},
        {"0.1", 0.1},
        {"4.9e-324", std::numeric_limits<double>::denorm_min()},
        {"1e-999", 0.0},
        {"0." + std::string(400, '0') + "1", 0.0},
        {"1e999", std::nullopt},
        {"-1e999", std::nullopt},
        {std::string(400, '9'), std::nullopt},
        {"1.", std::nullopt},
    };
    for (const auto& c : cases)
        EXPECT_EQ(ReadNumber(c.text), c.value) << c.text;
}
