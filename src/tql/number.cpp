#include "tql/number.h"

#include <charconv>
#include <cmath>
#include <cstring>
#include <limits>
#include <string_view>

namespace tql {

namespace {

const char* WordEndAt(const char* p)
{
    while (!Is(*p, WordEnd))
        ++p;
    return p;
}

// A value whose text has no exponent and fewer digits than this is in range whatever the digits are.
constexpr std::ptrdiff_t SafeLength = 300;

template <typename Value>
bool Fits(const char* p, const char* end)
{
    Value value;
    return std::from_chars(p, end, value).ec == std::errc();
}

} // namespace

NumberScan ScanNumber(const char* const p)
{
    const bool negative = *p == '-';
    const char* const digits = p + negative;
    if (*digits == 'n' || *digits == 'i') {
        const char* const end = WordEndAt(digits);
        const std::string_view word(digits, std::size_t(end - digits));
        if (word == "nan" || word == "inf")
            return {end, TqlType::Double};
        return {end, TqlType::None, TqlPhrase::Number};
    }
    const char* end = SkipDigits(digits);
    if (Is(*end, WordEnd) && end != digits) {
        if (!Fits<std::int32_t>(p, end))
            return {end, TqlType::None, TqlPhrase::IntRange};
        return {end, TqlType::Int};
    }
    bool anyDigit = end != digits, exponent = false;
    if (*end == '.') {
        const char* const fraction = end + 1;
        end = SkipDigits(fraction);
        anyDigit = anyDigit || end != fraction;
    }
    if (anyDigit && (*end == 'e' || *end == 'E')) {
        exponent = true;
        const char* const first = end + 1 + (end[1] == '-' || end[1] == '+');
        end = SkipDigits(first);
        anyDigit = end != first;
    }
    if (!anyDigit || !Is(*end, WordEnd))
        return {WordEndAt(end), TqlType::None, TqlPhrase::Number};
    if ((exponent || end - p > SafeLength) && !Fits<double>(p, end))
        return {end, TqlType::None, TqlPhrase::DoubleRange};
    return {end, TqlType::Double};
}

const char* ReadInt(const char* p, std::int32_t& value)
{
    const bool negative = *p == '-';
    std::uint64_t digits = 0;
    p = ReadDigits(p + negative, digits);
    const auto number = std::int64_t(digits);
    value = std::int32_t(negative ? -number : number);
    return p;
}

namespace {

// Powers of ten that are exact as floats.
constexpr double ExactPowers[] = {1e0,  1e1,  1e2,  1e3,  1e4,  1e5,  1e6,  1e7,  1e8,  1e9,  1e10, 1e11,
                                  1e12, 1e13, 1e14, 1e15, 1e16, 1e17, 1e18, 1e19, 1e20, 1e21, 1e22};

// Everything else: long, with an exponent, `nan` or `inf`.
const char* ReadAnyDouble(const char* p, double& value)
{
    const char* const end = WordEndAt(p);
    const bool negative = *p == '-';
    if (p[negative] == 'n')
        value = std::copysign(std::numeric_limits<double>::quiet_NaN(), negative ? -1.0 : 1.0);
    else
        std::from_chars(p, end, value);
    if (value == 0 && SkipDigits(p + negative) == end)
        value = 0; // the integer -0 is 0
    return end;
}

} // namespace

// Most numbers have few digits: both the digits as one whole number and the power of ten are exact then, and so their
// quotient is rounded once, as it should be (W. D. Clinger, How to Read Floating Point Numbers Accurately, 1990).
const char* ReadDouble(const char* const p, double& value)
{
    constexpr std::uint64_t exactLimit = std::uint64_t{1} << 53;
    constexpr std::ptrdiff_t noOverflow = 19;
    const bool negative = *p == '-';
    const char* end = p + negative;
    std::uint64_t digits = 0;
    std::size_t places = 0;
    const std::uint64_t block = LoadBlock(end);
    const int whole = FirstIn(NoDigitMask(block));
    const bool point = whole < 8 && end[whole] == '.';
    const int fraction = point ? FirstIn(NoDigitMask(block >> 8 >> whole * 8)) : 0;
    if (whole + fraction > 0 && whole + point + fraction < 8) { // all of it is in the block
        const std::uint64_t kept = (std::uint64_t{1} << whole * 8) - 1;
        digits = DigitsValue((block & kept) | (block >> 8 * point & ~kept), whole + fraction);
        end += whole + point + fraction;
        places = std::size_t(fraction);
    } else {
        end = ReadDigits(end, digits);
        if (*end == '.') {
            const char* const first = end + 1;
            end = ReadDigits(first, digits);
            places = std::size_t(end - first);
        }
    }
    if (!Is(*end, WordEnd) || end - p > noOverflow || digits > exactLimit || (negative && digits == 0))
        return ReadAnyDouble(p, value);
    const double quotient = double(digits) / ExactPowers[places];
    value = negative ? -quotient : quotient;
    return end;
}

void AppendInt(std::string& out, std::int32_t value)
{
    char buffer[16];
    const auto result = std::to_chars(buffer, buffer + sizeof buffer, value);
    out.append(buffer, std::size_t(result.ptr - buffer));
}

void AppendDouble(std::string& out, double value)
{
    if (std::isnan(value)) {
        out += std::signbit(value) ? "-nan" : "nan";
        return;
    }
    char buffer[40 + ReadAhead];
    char* const end = std::to_chars(buffer, buffer + sizeof buffer - ReadAhead, value).ptr;
    std::memset(end, 0, ReadAhead);
    out.append(buffer, std::size_t(end - buffer));
    // Whole numbers look like integers; these must be ones, or say that they are floats.
    const char* const digits = buffer + (buffer[0] == '-');
    if (SkipDigits(digits) != end)
        return;
    if (!Fits<std::int32_t>(buffer, end) || (value == 0 && std::signbit(value)))
        out += ".0";
}

} // namespace tql
