// Numbers as text, without the locale.
#include "ks/units/edit_style.h"

#include <QRegularExpression>
#include <array>
#include <bit>
#include <charconv>
#include <cmath>
#include <cstdint>
#include <optional>

namespace {

/// What a printf format says of a number that stands alone.
struct Format
{
    std::chars_format notation;
    int precision;
    bool upper;
};

/// Nothing when it is none for a floating-point number.
std::optional<Format> Parse(const CString& text)
{
    // Where the precision is to be passed along there is none: the usual one.
    static const QRegularExpression form(QStringLiteral("^%-?(?:\\.(\\d{1,2}|\\*))?l?([efgEG])$"));
    const auto match = form.match(text);
    if (!match.hasMatch())
        return {};
    bool isGiven = false;
    const int precision = match.captured(1).toInt(&isGiven);
    const QChar letter = match.captured(2).front();
    const auto notation = letter == u'f'             ? std::chars_format::fixed
                          : letter.toLower() == u'e' ? std::chars_format::scientific
                                                     : std::chars_format::general;
    return Format{notation, isGiven ? precision : 6, letter.isUpper()};
}

} // namespace

CString KsFormatNumber(const CString& format, double value)
{
    // Grids print a column of numbers in one format.
    thread_local CString lastText;
    thread_local std::optional<Format> last;
    if (format != lastText) {
        last = Parse(format);
        lastText = format;
    }
    if (!last || std::isnan(value))
        return last ? QStringLiteral("nan") : KsShortestNumber(value);
    char buffer[512]; // 309 digits before the point and at most 99 after it
    const auto end = std::to_chars(buffer, buffer + sizeof buffer, value, last->notation, last->precision);
    const CString text = CString::fromLatin1(buffer, end.ptr - buffer);
    return last->upper ? text.toUpper() : text;
}

CString KsShortestNumber(double value)
{
    const double magnitude = std::fabs(value);
    char buffer[64];
    const bool plain = magnitude == 0 || (magnitude >= 1e-5 && magnitude < 1e15);
    const auto end = plain ? std::to_chars(buffer, buffer + sizeof buffer, value, std::chars_format::fixed)
                           : std::to_chars(buffer, buffer + sizeof buffer, value);
    return CString::fromLatin1(buffer, int(end.ptr - buffer));
}

double KsFifteenDigits(double value)
{
    return KsFifteenDigits(value, value);
}

double KsFifteenDigits(double value, double of)
{
    // Up to 10^22 powers of ten are doubles, and so is a whole number of fifteen digits: the quotient is the nearest
    // double to the decimal number.
    static constexpr int LargestPower = 22;
    static constexpr auto powers = [] {
        std::array<double, LargestPower + 1> table{1};
        for (int power = 1; power <= LargestPower; ++power)
            table[std::size_t(power)] = table[std::size_t(power) - 1] * 10;
        return table;
    }();
    if (of == 0 || !std::isfinite(of) || !std::isfinite(value))
        return value;
    constexpr double MostDigits = 1e15;
    // 2^exponent is not more than the number, and 1233/4096 the decimal logarithm of 2 as far as there are powers.
    const int exponent = int(std::bit_cast<std::uint64_t>(of) >> 52 & 0x7ff) - 1023;
    int power = 14 - (exponent * 1233 >> 12);
    if (power < 0 || power > LargestPower)
        return value;
    power -= int(power >= 1) & int(std::fabs(of) * powers[std::size_t(power)] >= MostDigits); // nobody foresees which
    const double scale = powers[std::size_t(power)];
    return double(std::int64_t(value * scale + std::copysign(0.5, value))) / scale;
}
