#include "tql/number.h"

#include "tql/char_class.h"

#include <charconv>
#include <cmath>
#include <cstring>
#include <limits>
#include <string_view>

namespace tql {

namespace {

constexpr const char* AnyNumber = "a number such as -12, 0.5 or 1e-05";
constexpr const char* IntRange = "an integer from -2147483648 to 2147483647";
constexpr const char* DoubleRange = "a number within the range of 64-bit floats";

const char* SkipDigits(const char* p)
{
    while (Is(*p, Digit))
        ++p;
    return p;
}

const char* WordEndAt(const char* p)
{
    while (!Is(*p, WordEnd))
        ++p;
    return p;
}

bool FitsInt(const char* digits, const char* end, bool negative)
{
    std::int64_t value = 0;
    for (; digits < end; ++digits) {
        value = value * 10 + (*digits - '0');
        if (value > std::int64_t{std::numeric_limits<std::int32_t>::max()} + negative)
            return false;
    }
    return true;
}

// A value whose text has no exponent and fewer digits than this is in range whatever the digits are.
constexpr std::ptrdiff_t SafeLength = 300;

bool FitsDouble(const char* p, const char* end)
{
    double value;
    return std::from_chars(p, end, value).ec == std::errc();
}

} // namespace

NumberScan ScanNumber(const char* const p)
{
    const bool negative = *p == '-';
    const char* const digits = p + negative;
    if (*digits == 'n' || *digits == 'i') {
        const char* const end = WordEndAt(digits);
        const std::string_view word(digits, static_cast<std::size_t>(end - digits));
        if (word == "nan" || word == "inf")
            return {end, TqlType::Double, nullptr};
        return {end, TqlType::None, AnyNumber};
    }
    const char* end = SkipDigits(digits);
    if (Is(*end, WordEnd) && end != digits) {
        if (!FitsInt(digits, end, negative))
            return {end, TqlType::None, IntRange};
        return {end, TqlType::Int, nullptr};
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
        return {WordEndAt(end), TqlType::None, AnyNumber};
    if ((exponent || end - p > SafeLength) && !FitsDouble(p, end))
        return {end, TqlType::None, DoubleRange};
    return {end, TqlType::Double, nullptr};
}

std::int32_t IntValue(const char* p)
{
    const bool negative = *p == '-';
    std::int64_t value = 0;
    for (p += negative; Is(*p, Digit); ++p)
        value = value * 10 + (*p - '0');
    return static_cast<std::int32_t>(negative ? -value : value);
}

double DoubleValue(const char* p)
{
    const char* const digits = p + (*p == '-');
    if (*digits == 'n')
        return std::copysign(std::numeric_limits<double>::quiet_NaN(), digits == p ? 1.0 : -1.0);
    double value = 0;
    std::from_chars(p, WordEndAt(p), value);
    return value;
}

void AppendInt(std::string& out, std::int32_t value)
{
    char buffer[16];
    const auto result = std::to_chars(buffer, buffer + sizeof buffer, value);
    out.append(buffer, static_cast<std::size_t>(result.ptr - buffer));
}

void AppendDouble(std::string& out, double value)
{
    if (std::isnan(value)) {
        out += std::signbit(value) ? "-nan" : "nan";
        return;
    }
    char buffer[40];
    const char* const end = std::to_chars(buffer, buffer + sizeof buffer, value).ptr;
    out.append(buffer, static_cast<std::size_t>(end - buffer));
    // Whole numbers look like integers; these must be ones, or say that they are floats.
    const char* const digits = buffer + (buffer[0] == '-');
    for (const char* p = digits; p < end; ++p)
        if (!Is(*p, Digit))
            return;
    if (!FitsInt(digits, end, digits != buffer) || (value == 0 && std::signbit(value)))
        out += ".0";
}

} // namespace tql
