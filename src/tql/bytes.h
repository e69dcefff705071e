// Eight bytes at a time. Numbers and names are short, and a loop over their bytes costs most where it ends (the
// processor guesses that wrong); these find the end without a loop.
#pragma once

#include <bit>
#include <cstdint>
#include <cstring>

namespace tql {

/// What may be looked at past the end of any text that is scanned.
inline constexpr std::size_t ReadAhead = 8;

static_assert(std::endian::native == std::endian::little, "the first byte must be the lowest");

inline std::uint64_t LoadBlock(const char* p)
{
    std::uint64_t block;
    std::memcpy(&block, p, sizeof block);
    return block;
}

constexpr std::uint64_t Repeat(unsigned char c)
{
    return std::uint64_t{0x0101010101010101} * c;
}

// Each gives a mask whose lowest set bit is in the first byte that has the property; bits above it mean nothing.
constexpr std::uint64_t BelowMask(std::uint64_t block, unsigned char limit) // limit up to 0x80
{
    return (block - Repeat(limit)) & ~block & Repeat(0x80);
}
constexpr std::uint64_t EqualMask(std::uint64_t block, char c)
{
    return BelowMask(block ^ Repeat(static_cast<unsigned char>(c)), 1);
}
constexpr std::uint64_t NoDigitMask(std::uint64_t block)
{
    const std::uint64_t value = block ^ Repeat('0');
    return ((value + Repeat(0x80 - 10)) | value) & Repeat(0x80);
}

/// Byte that the lowest bit of a mask is in; 8 for none.
constexpr int FirstIn(std::uint64_t mask)
{
    return std::countr_zero(mask) / 8;
}

/// First byte that belongs to `maskOf`'s property.
template <typename MaskOf>
const char* FindByte(const char* p, MaskOf maskOf)
{
    for (;;) {
        if (const std::uint64_t mask = maskOf(LoadBlock(p)))
            return p + FirstIn(mask);
        p += 8;
    }
}

inline const char* SkipDigits(const char* p)
{
    return FindByte(p, NoDigitMask);
}

/// Value of the first `count` (1 to 8) digits of a block.
constexpr std::uint64_t DigitsValue(std::uint64_t block, int count)
{
    std::uint64_t v = (block ^ Repeat('0')) << (8 - count) * 8; // as if with leading zeros
    v = v * 10 + (v >> 8);                                      // pairs
    return ((v & 0x000000FF000000FF) * 0x000F424000000064 + ((v >> 16) & 0x000000FF000000FF) * 0x0000271000000001) >>
           32;
}

/// Appends the digits at `p` to `value` (which may overflow) and returns their end.
inline const char* ReadDigits(const char* p, std::uint64_t& value)
{
    static constexpr std::uint64_t powers[] = {1, 10, 100, 1000, 10000, 100000, 1000000, 10000000, 100000000};
    for (;;) {
        const std::uint64_t block = LoadBlock(p);
        const int count = FirstIn(NoDigitMask(block));
        if (count > 0)
            value = value * powers[count] + DigitsValue(block, count);
        p += count;
        if (count < 8)
            return p;
    }
}

} // namespace tql
