// UTF-8: checking, counting, encoding.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string>
#include <string_view>

namespace tql {

/// First byte of [begin, end) that is a NUL or starts a malformed sequence (overlong forms, surrogates and values past
/// U+10FFFF included); `end` when all is well. ReadAhead bytes behind `end` have to be readable.
const char* FindBadByte(const char* begin, const char* end);

/// Characters (code points) in well-formed text.
std::size_t CountCharacters(std::string_view text);

/// Length in bytes of the well-formed sequence at the front of `text`, 0 when it is malformed or empty.
std::size_t SequenceLength(std::string_view text);

/// A code point that stands for itself: up to U+10FFFF and no surrogate.
constexpr bool IsScalarValue(std::uint32_t c)
{
    return c < 0xD800 || (c >= 0xE000 && c <= 0x10FFFF);
}
void AppendCodePoint(std::string& out, std::uint32_t c);

} // namespace tql
