#include "files/read_number.h"

#include <charconv>

namespace {

bool IsDigit(char c)
{
    return c >= '0' && c <= '9';
}

/// The library knows no plus.
std::string_view WithoutPlus(std::string_view text)
{
    return text.substr(text.starts_with('+') && !text.starts_with("+-"));
}

template <typename Value>
std::errc ParseWhole(std::string_view text, Value& value)
{
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
    return end == text.data() + text.size() ? error : std::errc::invalid_argument;
}

/// The library's number syntax takes more: words, a point without digits behind it.
std::errc Parse(std::string_view text, double& value)
{
    text = WithoutPlus(text);
    for (std::size_t i = 0; i < text.size(); ++i) {
        const char c = text[i];
        const bool isSign = c == 'e' || c == 'E' || c == '+' || c == '-';
        if (!IsDigit(c) && !isSign && (c != '.' || i + 1 == text.size() || !IsDigit(text[i + 1])))
            return std::errc::invalid_argument;
    }
    return ParseWhole(text, value);
}

/// Whether a valid number that no double holds is too small rather than too large.
bool IsTiny(std::string_view text)
{
    const auto exponent = text.find_first_of("eE");
    if (exponent != std::string_view::npos)
        return text.substr(exponent + 1, 1) == "-";
    return text.substr(0, text.find('.')).find_first_of("123456789") == std::string_view::npos;
}

} // namespace

bool IsValidNumber(std::string_view text)
{
    double value = 0;
    return Parse(text, value) != std::errc::invalid_argument;
}

std::optional<double> ReadNumber(std::string_view text)
{
    double value = 0;
    const std::errc error = Parse(text, value);
    if (error == std::errc::result_out_of_range && IsTiny(text))
        return 0.0;
    return error == std::errc() ? std::optional(value) : std::nullopt;
}

std::optional<std::int32_t> ReadInteger(std::string_view text)
{
    std::int32_t value = 0;
    return ParseWhole(WithoutPlus(text), value) == std::errc() ? std::optional(value) : std::nullopt;
}
