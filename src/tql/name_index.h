// Children of one parent by name and occurrence.
#pragma once

#include <cstddef>
#include <cstdint>
#include <string_view>
#include <unordered_map>
#include <vector>

namespace tql {

/// Finds the n-th of a name in constant time, in any order of n and any mixture of names. The names must outlive it.
class NameIndex
{
public:
    static constexpr std::size_t NotFound = std::size_t(-1);

    explicit NameIndex(const std::vector<std::string_view>& names);

    /// Position (from 0) of occurrence `number` (from 1).
    std::size_t Find(std::string_view name, int number) const;
    int Count(std::string_view name) const;

private:
    struct Run // of m_order
    {
        std::size_t first = 0, count = 0;
    };
    std::unordered_map<std::string_view, Run> m_runs;
    std::vector<std::uint32_t> m_order; // positions, the occurrences of a name side by side
};

} // namespace tql
