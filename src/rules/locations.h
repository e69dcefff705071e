// Which line of a list was the first for its location.
#pragma once

#include <cstdint>
#include <vector>

/// Grows and goes without a pause, whatever it holds: a check runs between the keys of a user.
class CLocations
{
public:
    /// For up to that many lines.
    explicit CLocations(std::size_t lines);
    /// The number of the line that was added for this location before, or `line`, when none was.
    std::size_t Add(std::uint32_t branch, double chainage, std::size_t line);

private:
    struct Slot
    {
        double chainage = 0;
        std::uint32_t branch = 0;
        std::uint32_t line = 0; // from 1; 0 for none
    };
    std::vector<Slot> m_slots; // their number is a power of two, and at least twice that of the lines
};
