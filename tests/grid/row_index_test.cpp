// Rows by their keys, as they stand in memory and not.
#include "grid/row_index.h"

#include <gtest/gtest.h>
#include <random>

TEST(RowIndex, FindsEveryRowInEveryOrder)
{
    std::mt19937 random(1);
    for (const std::size_t count : {1, 2, 300, 5000}) {
        std::vector<RowKey> ascending(count);
        for (std::size_t i = 0; i < count; ++i)
            ascending[i] = 1000 + 48 * (i - i % 7); // some of them more than once
        std::vector<RowKey> runs = ascending, shuffled = ascending;
        std::ranges::rotate(runs, runs.begin() + std::ptrdiff_t(count / 3));
        std::ranges::shuffle(shuffled, random);
        for (const auto& keys : {ascending, runs, shuffled}) {
            const auto keyOf = [&keys](std::uint32_t number) { return keys[number]; };
            CRowIndex index;
            index.Make(count, keyOf);
            for (RowKey key = 1000 - 48; key < 1000 + 48 * (count + 1); key += 24) {
                std::vector<std::uint32_t> expected, found, back;
                for (std::uint32_t i = 0; i < count; ++i)
                    if (keys[i] == key)
                        expected.push_back(i);
                index.ForRowsOf(key, true, keyOf, [&](std::uint32_t i) { found.push_back(i); });
                index.ForRowsOf(key, false, keyOf, [&](std::uint32_t i) { back.insert(back.begin(), i); });
                ASSERT_EQ(found, expected);
                ASSERT_EQ(back, expected);
            }
        }
    }
}
