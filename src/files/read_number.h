// The number syntax of cells, fields, dialogs and command lines. No blanks, no thousands separators, the point as
// decimal separator.
#pragma once

#include <cstdint>
#include <optional>
#include <string_view>

/// [sign] digits [. digits] [e [sign] digits]; digits before the point may be missing, digits behind it may not.
bool IsValidNumber(std::string_view text);

/// The number of a valid text. Empty for an invalid text and for a number too large for a double; one too small is 0.
std::optional<double> ReadNumber(std::string_view text);

/// [sign] digits, of 32 bits; empty for anything else.
std::optional<std::int32_t> ReadInteger(std::string_view text);
