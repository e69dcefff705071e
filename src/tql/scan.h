// The grammar of one parameter: recognising it in text that is not trusted, and stepping over it in text that was
// recognised before. All text ends in a line feed and has ReadAhead readable bytes behind it.
#pragma once

#include "tql/char_class.h"
#include "tql/tql.h"

#include <cstdint>
#include <string>

namespace tql {

struct ParamScan
{
    const char* end = nullptr;            // past the parameter; where it went wrong, when `expected` is set
    TqlPhrase expected = TqlPhrase::None; // none: the parameter is well formed
};

/// Checks the parameter that starts at `p` (no blank).
ParamScan ScanParam(const char* p);

// For parameters that were checked:
const char* SkipParam(const char* p);
/// The parameter behind the end of another one in its line, null behind the last.
inline const char* ParamBehind(const char* end)
{
    end = SkipBlanks(end);
    return *end == ',' ? SkipBlanks(end + 1) : nullptr;
}
inline const char* NextParam(const char* p)
{
    return ParamBehind(SkipParam(p));
}
inline bool StartsNumber(char c)
{
    return Is(c, Digit) || c == '-' || c == '.' || c == 'n' || c == 'i';
}
TqlType ParamType(const char* p);
/// Text of a string or a file name with its escapes resolved; returns its end.
const char* UnescapeParam(const char* p, std::string& out);

/// Appends a string in quotes, or a file name in angle brackets. Bytes that are no UTF-8 become U+FFFD.
void AppendString(std::string& out, std::string_view value);
void AppendFilename(std::string& out, std::string_view value);

} // namespace tql
