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
