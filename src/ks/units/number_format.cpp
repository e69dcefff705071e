// Numbers as text, without the locale.
#include "ks/units/edit_style.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <string>

namespace {

/// One conversion of a printf format, with the texts around it.
struct Format
{
    std::string before, after;
    bool left = false, plus = false, blank = false, zeros = false;
    int width = 0, precision = 6;
    char conversion = 0; // f, e or g; 0 when the format is none for a floating-point number
    bool upper = false;
};

/// Takes literal text up to a conversion or the end; "%%" is a percent sign.
std::string TakeLiteral(const char*& p)
{
    std::string text;
    for (; *p; ++p) {
        if (*p == '%' && *++p != '%') {
            --p;
            break;
        }
        text += *p;
    }
    return text;
}

int TakeNumber(const char*& p)
{
    constexpr int Longest = 400; // no number of a file needs more
    int number = 0;
    for (; *p >= '0' && *p <= '9'; ++p)
        number = std::min(number * 10 + (*p - '0'), Longest);
    return number;
}

Format Parse(const std::string& text)
{
    Format format;
    const char* p = text.c_str();
    format.before = TakeLiteral(p);
    if (!*p)
        return format;
    for (++p;; ++p) {
        if (*p == '-')
            format.left = true;
        else if (*p == '+')
            format.plus = true;
        else if (*p == ' ')
            format.blank = true;
        else if (*p == '0')
            format.zeros = true;
        else
            break;
    }
    format.width = TakeNumber(p);
    if (*p == '.') {
        ++p;
        if (*p == '*')
            ++p; // no precision is passed along: the usual one
        else
            format.precision = TakeNumber(p);
    }
    while (*p == 'l' || *p == 'L')
        ++p;
    const char conversion = char(*p | 0x20);
    if (conversion != 'f' && conversion != 'e' && conversion != 'g')
        return format;
    format.conversion = conversion;
    format.upper = conversion != *p;
    ++p;
    format.after = TakeLiteral(p);
    return format;
}

std::string Digits(const Format& format, double magnitude)
{
    const auto notation = format.conversion == 'f'   ? std::chars_format::fixed
                          : format.conversion == 'e' ? std::chars_format::scientific
                                                     : std::chars_format::general;
    char buffer[1024]; // 309 digits before the point and at most 400 after it
    const auto end = std::to_chars(buffer, buffer + sizeof buffer, magnitude, notation, format.precision);
    std::string digits(buffer, end.ptr);
    if (format.upper)
        std::transform(digits.begin(), digits.end(), digits.begin(),
                       [](char c) { return c >= 'a' ? char(c - 32) : c; });
    return digits;
}

std::string Print(const Format& format, double value)
{
    std::string digits = Digits(format, std::fabs(value));
    const std::string sign = std::signbit(value) && !std::isnan(value) ? "-"
                             : format.plus                             ? "+"
                             : format.blank                            ? " "
                                                                       : "";
    const std::size_t length = sign.size() + digits.size(), width = std::size_t(format.width);
    const std::string fill(width > length ? width - length : 0, format.zeros && std::isfinite(value) ? '0' : ' ');
    if (format.left)
        return format.before + sign + digits + std::string(fill.size(), ' ') + format.after;
    if (format.zeros && std::isfinite(value))
        return format.before + sign + fill + digits + format.after;
    return format.before + fill + sign + digits + format.after;
}

} // namespace

CString KsFormatNumber(const CString& format, double value)
{
    // Grids print a column of numbers in one format.
    thread_local CString lastText;
    thread_local Format last;
    if (format != lastText) {
        last = Parse(format.toStdString());
        lastText = format;
    }
    return last.conversion ? CString::fromStdString(Print(last, value)) : KsShortestNumber(value);
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
