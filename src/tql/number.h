// Numbers as the text has them; locale plays no part.
#pragma once

#include "tql/char_class.h"
#include "tql/tql.h"

#include <cstdint>
#include <string>

namespace tql {

struct NumberScan
{
    const char* end = nullptr;            // past the number, or past what looked like one
    TqlType type = TqlType::None;         // Int, Double, or None when it is no number or is out of range
    TqlPhrase expected = TqlPhrase::None; // what would have been right, when type is None
};

/// End of a plain number, digits with or without a point, that is in range for its few digits; null for anything else,
/// which ScanNumber then has to look at.
inline const char* SkipPlainNumber(const char* p)
{
    constexpr std::ptrdiff_t safeInteger = 9, safeFloat = 300;
    const char* const digits = p + (*p == '-');
    const char* end = SkipDigits(digits);
    const bool point = *end == '.';
    if (point)
        end = SkipDigits(end + 1);
    const std::ptrdiff_t length = end - digits;
    return length > point && length <= (point ? safeFloat : safeInteger) && Is(*end, WordEnd) ? end : nullptr;
}

/// Looks at the number, `nan` or `inf` at `p`, in a text that ends in a line feed.
NumberScan ScanNumber(const char* p);

// Values of numbers that were scanned well; both return the number's end.
const char* ReadInt(const char* p, std::int32_t& value);
/// Of integers, too.
const char* ReadDouble(const char* p, double& value);

void AppendInt(std::string& out, std::int32_t value);
/// The shortest text from which ReadDouble gives the same bits (of NaNs, the sign only).
void AppendDouble(std::string& out, double value);

} // namespace tql
