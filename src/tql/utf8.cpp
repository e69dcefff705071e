#include "tql/utf8.h"

#include "tql/bytes.h"

namespace tql {

namespace {

bool IsContinuation(unsigned char byte)
{
    return (byte & 0xC0) == 0x80;
}

// Whether all bytes are ASCII and none is NUL: a NUL borrows from the bit that ASCII leaves free.
bool IsPlain(const char* p, const char* end)
{
    std::uint64_t bits = 0;
    const auto look = [&](std::uint64_t block) { bits |= block | (block - Repeat(1)); };
    for (; end - p >= 8; p += 8)
        look(LoadBlock(p));
    const std::uint64_t kept = (std::uint64_t{1} << (end - p) * 8) - 1; // of the last block
    look((LoadBlock(p) & kept) | (Repeat('a') & ~kept));
    return (bits & Repeat(0x80)) == 0;
}

} // namespace

std::size_t SequenceLength(std::string_view text)
{
    if (text.empty())
        return 0;
    const auto byte = [&](std::size_t i) { return static_cast<unsigned char>(text[i]); };
    const unsigned char first = byte(0);
    if (first < 0x80)
        return 1;
    const std::size_t length = first >= 0xF0 ? 4 : first >= 0xE0 ? 3 : 2;
    if (first < 0xC2 || first > 0xF4 || text.size() < length)
        return 0;
    for (std::size_t i = 1; i < length; ++i)
        if (!IsContinuation(byte(i)))
            return 0;
    const unsigned char second = byte(1);
    const bool overlong = (first == 0xE0 && second < 0xA0) || (first == 0xF0 && second < 0x90);
    const bool surrogate = first == 0xED && second >= 0xA0;
    const bool tooBig = first == 0xF4 && second >= 0x90;
    return overlong || surrogate || tooBig ? 0 : length;
}

const char* FindBadByte(const char* p, const char* end)
{
    if (IsPlain(p, end))
        return end;
    while (p < end) {
        const std::size_t length = SequenceLength({p, std::size_t(end - p)});
        if (length == 0 || *p == '\0')
            return p;
        p += length;
    }
    return end;
}

std::size_t CountCharacters(std::string_view text)
{
    std::size_t count = 0;
    for (const char c : text)
        count += !IsContinuation(static_cast<unsigned char>(c));
    return count;
}

void AppendCodePoint(std::string& out, std::uint32_t c)
{
    const auto put = [&](std::uint32_t byte) { out.push_back(char(byte)); };
    if (c < 0x80) {
        put(c);
    } else if (c < 0x800) {
        put(0xC0 | (c >> 6));
        put(0x80 | (c & 0x3F));
    } else if (c < 0x10000) {
        put(0xE0 | (c >> 12));
        put(0x80 | ((c >> 6) & 0x3F));
        put(0x80 | (c & 0x3F));
    } else {
        put(0xF0 | (c >> 18));
        put(0x80 | ((c >> 12) & 0x3F));
        put(0x80 | ((c >> 6) & 0x3F));
        put(0x80 | (c & 0x3F));
    }
}

} // namespace tql
