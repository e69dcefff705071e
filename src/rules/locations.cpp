#include "rules/locations.h"

#include <bit>

CLocations::CLocations(std::size_t lines) : m_slots(std::bit_ceil(lines * 2 + 2)) {}

std::size_t CLocations::Add(std::uint32_t branch, double chainage, std::size_t line)
{
    // The high bits of a product with a large odd number depend on all bits of the factors (Fibonacci hashing). The sign
    // of a number ends in the highest one, which no table is large enough for: -0 is 0.
    constexpr std::uint64_t scatter = 0x9E3779B97F4A7C15;
    const std::uint64_t hash = (std::bit_cast<std::uint64_t>(chainage) * scatter ^ branch) * scatter;
    const std::size_t mask = m_slots.size() - 1;
    for (std::size_t at = std::size_t(hash >> 32) & mask;; at = (at + 1) & mask) {
        Slot& slot = m_slots[at];
        if (slot.line == 0) {
            slot = {chainage, branch, std::uint32_t(line + 1)};
            return line;
        }
        if (slot.branch == branch && slot.chainage == chainage)
            return slot.line - 1;
    }
}
