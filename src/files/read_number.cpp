#include "files/read_number.h"

#include <charconv>

namespace {

/// Takes a run of digits off the front and returns whether there was one.
bool TakeDigits(std::string_view& text)
{
    std::size_t count = 0;
    while (count < text.size() && text[count] >= '0' && text[count] <= '9')
        ++count;
    text.remove_prefix(count);
    return count > 0;
}

bool TakeOneOf(std::string_view& text, std::string_view characters)
{
    if (text.empty() || characters.find(text.front()) == std::string_view::npos)
        return false;
    text.remove_prefix(1);
    return true;
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
    TakeOneOf(text, "+-");
    const bool whole = TakeDigits(text);
    if (text.empty())
        return whole;
    if (TakeOneOf(text, ".")) {
        if (!TakeDigits(text))
            return false;
        if (text.empty())
            return true;
    } else if (!whole) {
        return false;
    }
    if (!TakeOneOf(text, "eE"))
        return false;
    TakeOneOf(text, "+-");
    return TakeDigits(text) && text.empty();
}

std::optional<double> ReadNumber(std::string_view text)
{
    if (!IsValidNumber(text))
        return std::nullopt;
    if (text.front() == '+')
        text.remove_prefix(1);
    double value = 0;
    const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), value);
    if (error == std::errc::result_out_of_range)
        return IsTiny(text) ? std::optional(0.0) : std::nullopt;
    return value;
}
