// Finds rows among many by their keys. Lines that were read one after the other mostly stand in memory one after the
// other, too: then it needs next to no memory of its own, and else five bytes a row.
#pragma once

#include "grid/row_source.h"

#include <algorithm>
#include <bit>
#include <ranges>

class CRowIndex
{
public:
    bool IsMade() const { return !m_runs.empty() || !m_ends.empty(); }
    /// Of `count` rows, fewer than 2^32, but more than none; `keyOf` knows their keys by number.
    template <typename KeyOf>
    void Make(std::size_t count, const KeyOf& keyOf)
    {
        m_count = std::uint32_t(count);
        m_runs = {0};
        for (std::uint32_t number = 1; number < m_count && m_runs.size() <= MostRuns; ++number)
            if (keyOf(number) < keyOf(number - 1))
                m_runs.push_back(number);
        if (m_runs.size() > MostRuns)
            MakeBuckets(keyOf);
    }
    /// The numbers of the rows with the key, in their order or, unless `forward`, from the last one on.
    template <typename KeyOf, typename Do>
    void ForRowsOf(RowKey key, bool forward, const KeyOf& keyOf, const Do& action) const
    {
        if (!m_ends.empty()) {
            const std::size_t bucket = Bucket(key);
            return ForEach(m_ends[bucket], m_ends[bucket + 1], forward, [&](std::uint32_t place) {
                if (keyOf(m_numbers[place]) == key)
                    action(m_numbers[place]);
            });
        }
        ForEach(0, std::uint32_t(m_runs.size()), forward, [&](std::uint32_t run) {
            const std::uint32_t first = m_runs[run], end = run + 1 < m_runs.size() ? m_runs[run + 1] : m_count;
            if (key < keyOf(first) || key > keyOf(end - 1))
                return;
            const auto numbers = std::views::iota(first, end);
            const auto found = std::ranges::equal_range(numbers, key, {}, keyOf);
            const auto at = first + std::uint32_t(found.begin() - numbers.begin());
            ForEach(at, at + std::uint32_t(found.size()), forward, action);
        });
    }

private:
    static constexpr std::size_t MostRuns = 256, RowsInBucket = 4;

    template <typename KeyOf>
    void MakeBuckets(const KeyOf& keyOf)
    {
        m_runs = {};
        m_bits = std::max(1, int(std::bit_width(m_count / RowsInBucket)));
        std::vector<std::uint32_t> ends((std::size_t(1) << m_bits) + 1);
        m_numbers.resize(m_count);
        for (std::uint32_t number = 0; number < m_count; ++number)
            ++ends[Bucket(keyOf(number)) + 1];
        for (std::size_t bucket = 1; bucket < ends.size(); ++bucket)
            ends[bucket] += ends[bucket - 1];
        m_ends = ends;
        for (std::uint32_t number = 0; number < m_count; ++number)
            m_numbers[ends[Bucket(keyOf(number))]++] = number;
    }
    std::size_t Bucket(RowKey key) const
    {
        return std::size_t((std::uint64_t(key) * 0x9E3779B97F4A7C15u) >> (64 - m_bits)); // Knuth's multiplicative hash
    }
    template <typename Do>
    static void ForEach(std::uint32_t first, std::uint32_t end, bool forward, const Do& action)
    {
        for (std::uint32_t i = first; i < end; ++i)
            action(forward ? i : end - 1 - (i - first));
    }

    std::uint32_t m_count = 0;
    std::vector<std::uint32_t> m_runs;            // where each ascending run of keys begins
    std::vector<std::uint32_t> m_ends, m_numbers; // or where each bucket ends among the numbers, behind a zero
    int m_bits = 1;
};
