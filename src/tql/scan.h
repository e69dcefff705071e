// The grammar of one parameter: recognising it in text that is not trusted, and stepping over it in text that was
// recognised before. All text ends in a line feed.
#pragma once

#include "tql/tql.h"

#include <cstdint>
#include <string>

namespace tql {

struct ParamScan
{
    const char* end = nullptr;      // past the parameter; where it went wrong, when `expected` is set
    const char* expected = nullptr; // null: the parameter is well formed
};

/// Checks the parameter that starts at `p` (no blank).
ParamScan ScanParam(const char* p);

// For parameters that were checked:
const char* SkipParam(const char* p);
/// The parameter after this one in its line, null after the last.
const char* NextParam(const char* p);
TqlType ParamType(const char* p);
/// Text of a string or a file name with its escapes resolved.
void UnescapeParam(const char* p, std::string& out);

/// Appends a string in quotes, or a file name in angle brackets. Bytes that are no UTF-8 become U+FFFD.
void AppendString(std::string& out, std::string_view value);
void AppendFilename(std::string& out, std::string_view value);

} // namespace tql
