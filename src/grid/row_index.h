// Finds rows among many by their keys. Numbers of four bytes and a quarter of them, whatever a key is worth.
#pragma once

#include "grid/row_source.h"

#include <algorithm>
#include <bit>
#include <span>

class CRowIndex
{
public:
    bool IsMade() const { return !m_ends.empty(); }
    /// Of `count` rows, fewer than 2^32; `keyOf` knows their keys by number.
    template <typename KeyOf>
    void Make(std::size_t count, const KeyOf& keyOf)
    {
        m_bits = std::max(1, int(std::bit_width(count / RowsInBucket)));
        std::vector<std::uint32_t> ends((std::size_t(1) << m_bits) + 1);
        m_numbers.resize(count);
        for (std::size_t number = 0; number < count; ++number)
            ++ends[Bucket(keyOf(number)) + 1];
        for (std::size_t bucket = 1; bucket < ends.size(); ++bucket)
            ends[bucket] += ends[bucket - 1];
        auto next = ends;
        for (std::size_t number = 0; number < count; ++number)
            m_numbers[next[Bucket(keyOf(number))]++] = std::uint32_t(number);
        m_ends = std::move(ends);
    }
    /// The numbers of rows that may have the key, those that have it among them, in their order.
    std::span<const std::uint32_t> Candidates(RowKey key) const
    {
        const std::size_t bucket = Bucket(key);
        return std::span(m_numbers).subspan(m_ends[bucket], m_ends[bucket + 1] - m_ends[bucket]);
    }

private:
    static constexpr std::size_t RowsInBucket = 4;
    std::size_t Bucket(RowKey key) const
    {
        return std::size_t((std::uint64_t(key) * 0x9E3779B97F4A7C15u) >> (64 - m_bits)); // Knuth's multiplicative hash
    }

    int m_bits = 1;
    std::vector<std::uint32_t> m_ends, m_numbers; // where each bucket ends among the numbers, behind a zero
};
