#include "grid/row_order.h"

#include "base/not_given.h"
#include "ks/fc/branch_name.h"

#include <algorithm>
#include <bit>
#include <cmath>
#include <numeric>
#include <unordered_map>

namespace {

using Ranks = std::vector<std::uint64_t>; // of the rows by one column

constexpr std::uint64_t Last = ~std::uint64_t(0);

/// Grows with the number.
std::uint64_t RankOf(double number)
{
    constexpr std::uint64_t sign = std::uint64_t(1) << 63;
    const auto bits = std::bit_cast<std::uint64_t>(number + 0.0); // no zero is less than another
    return bits & sign ? ~bits : bits | sign;
}

std::uint64_t RankOf(const HDDateTime& time)
{
    std::uint64_t rank = std::uint64_t(std::max(time.Year, 0));
    for (const std::int32_t part : {time.Month, time.Day, time.Hour, time.Minute, time.Second})
        rank = rank * 100 + std::uint64_t(std::clamp(part, 0, 99));
    return rank;
}

/// Names as they are compared everywhere: in capitals, without blanks around them.
std::string SortedAs(const std::string& name)
{
    const auto isPlain = [](char c) { return c > ' ' && c < '\x7f' && !(c >= 'a' && c <= 'z'); };
    if (std::ranges::all_of(name, isPlain))
        return name;
    return KsBranchKey(QString::fromStdString(name)).toStdString();
}

/// The names of a column, each once, while the rows are walked.
class CNames
{
public:
    std::uint64_t Number(std::string name)
    {
        if (m_last && m_last->first == name)
            return m_last->second; // neighbours mostly are of one branch
        m_last = &*m_numbers.emplace(std::move(name), m_numbers.size()).first;
        return m_last->second;
    }
    /// For each number the place of its name among the names.
    Ranks Places() const
    {
        std::vector<std::pair<std::string, std::uint64_t>> sorted;
        sorted.reserve(m_numbers.size());
        for (const auto& [name, number] : m_numbers)
            sorted.emplace_back(SortedAs(name), number);
        std::ranges::sort(sorted);
        Ranks places(sorted.size());
        std::uint64_t place = 0;
        for (std::size_t i = 0; i < sorted.size(); ++i) {
            if (i > 0 && sorted[i].first != sorted[i - 1].first)
                ++place;
            places[sorted[i].second] = sorted[i].first.empty() ? Last : place;
        }
        return places;
    }

private:
    std::unordered_map<std::string, std::uint64_t> m_numbers;
    const std::pair<const std::string, std::uint64_t>* m_last = nullptr;
};

Ranks RanksBy(IRowSource& rows, const ColumnSpec& column, bool descending)
{
    const std::size_t first = rows.FixedRows(), count = rows.Count();
    Ranks ranks(count);
    CNames names;
    const bool isText = column.Kind() == CellKind::Text || column.Kind() == CellKind::TextChoice;
    for (std::size_t row = first; row < count; ++row) {
        CellValue value = column.access->get(rows.At(row));
        ranks[row] = std::visit(
            Overloads{[](std::monostate) { return Last; },
                      [](double number) { return std::isnan(number) || number == NotGiven ? Last : RankOf(number); },
                      [](std::int32_t number) { return RankOf(double(number)); },
                      [&](std::string& text) { return names.Number(std::move(text)); },
                      [](const HDDateTime& time) { return RankOf(time); }},
            value);
    }
    if (isText) {
        const Ranks places = names.Places();
        for (std::size_t row = first; row < count; ++row)
            ranks[row] = places[ranks[row]];
    }
    for (std::size_t row = first; descending && row < count; ++row)
        ranks[row] = ranks[row] == Last ? Last : ~ranks[row] - 1;
    return ranks;
}

} // namespace

SourceRows SortedRows(IRowSource& rows, const std::vector<ColumnSpec>& columns, const std::vector<SortKey>& keys)
{
    struct Ranked
    {
        std::uint64_t rank;
        std::uint32_t row;
    };
    std::vector<Ranked> ranked(rows.Count());
    for (std::uint32_t row = 0; row < ranked.size(); ++row)
        ranked[row].row = row;
    const auto lines = ranked.begin() + std::ptrdiff_t(std::min(rows.FixedRows(), ranked.size()));
    // Sorted by the least key first, and each time what is the same stays in its order.
    for (auto key = keys.rbegin(); key != keys.rend(); ++key) {
        const Ranks ranks = RanksBy(rows, columns[std::size_t(key->column)], key->descending);
        for (Ranked& each : ranked)
            each.rank = ranks[each.row];
        const auto isLess = [](const Ranked& a, const Ranked& b) { return a.rank < b.rank; };
        if (!std::is_sorted(lines, ranked.end(), isLess))
            std::stable_sort(lines, ranked.end(), isLess);
    }
    SourceRows order(ranked.size());
    std::ranges::transform(ranked, order.begin(), &Ranked::row);
    return order;
}
