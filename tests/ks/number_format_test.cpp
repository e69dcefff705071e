#include "ks/units/edit_style.h"

#include <QLocale>
#include <clocale>
#include <cmath>
#include <cstdio>
#include <gtest/gtest.h>
#include <limits>
#include <random>

namespace {

QString Printf(const char* format, double value)
{
    char buffer[512];
    std::snprintf(buffer, sizeof buffer, format, value);
    return QString::fromLatin1(buffer);
}

} // namespace

TEST(NumberFormat, PrintsWhatPrintfPrintsInTheCLocale)
{
    const double values[] = {0, -0.0, 1, -1, 0.5, 1.0 / 3, 1500.6, 123456789.125, 1e10, -1e-7, 1e22, 5e-324, 1.7e308};
    const char* formats[] = {"%-lf", "%lf", "%.3lf", "%.0f", "%.6lg", "%.3g", "%.0g", "%-.3E", "%e", "%.16lg"};
    for (const char* format : formats) {
        for (const double value : values)
            EXPECT_EQ(KsFormatNumber(format, value), Printf(format, value)) << format << " " << value;
    }
    EXPECT_EQ(KsFormatNumber("%-.*lf", 1.5), "1.500000");
    EXPECT_EQ(KsFormatNumber("%.3lf", std::numeric_limits<double>::infinity()), "inf");
    EXPECT_EQ(KsFormatNumber("%.3lf", std::nan("")), "nan");
    EXPECT_EQ(KsFormatNumber("%.3E", -std::numeric_limits<double>::infinity()), "-INF");
    for (const char* none : {"", "text", "%d", "%", "%.3", "%s", "%f%f", "%999.999f"})
        EXPECT_EQ(KsFormatNumber(none, 2.5), "2.5") << none;
}

TEST(NumberFormat, LocaleMakesNoDifference)
{
    const QLocale before;
    QLocale::setDefault(QLocale(QLocale::German));
    EXPECT_EQ(KsFormatNumber("%-lf", 1234.5), "1234.500000");
    EXPECT_EQ(KsShortestNumber(1234.5), "1234.5");
    QLocale::setDefault(before);
}

TEST(NumberFormat, TheShortestFormReadsBack)
{
    EXPECT_EQ(KsShortestNumber(100000), "100000");
    EXPECT_EQ(KsShortestNumber(0.0001), "0.0001");
    EXPECT_EQ(KsShortestNumber(1e-6), "1e-06");
    EXPECT_EQ(KsShortestNumber(1e22), "1e+22");
    EXPECT_EQ(KsShortestNumber(-0.1), "-0.1");
    std::mt19937_64 random(7);
    for (int i = 0; i < 2000; ++i) {
        const std::uint64_t bits = random();
        double value;
        std::memcpy(&value, &bits, sizeof value);
        if (std::isfinite(value)) {
            EXPECT_EQ(KsShortestNumber(value).toDouble(), value);
        }
    }
}

TEST(NumberFormat, FifteenDigitsAreTheNearestDecimalNumber)
{
    for (const auto& [value, expected] : {std::pair(64.52 * 1.1, 70.972), {0.1 + 0.2, 0.3}, {-0.1 * 3, -0.3}, {0.0, 0.0},
                                          {1e300 / 3, 1e300 / 3}, {1e15, 1e15}, {123456789012345678.0, 123456789012345678.0},
                                          {5e-324, 5e-324}, {1e-7 * 3, 3e-7}})
        EXPECT_EQ(KsFifteenDigits(value), expected) << value;
    for (double value = 1e-7; value < 1e14; value *= 7.3)
        EXPECT_EQ(KsFifteenDigits(value / 3), std::stod(KsFormatNumber("%.15lg", value / 3).toStdString())) << value;
}
