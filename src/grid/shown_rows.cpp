#include "grid/shown_rows.h"

#include <algorithm>
#include <numeric>
#include <unordered_map>

std::optional<std::size_t> CShownRows::RowOf(std::size_t sourceRow) const
{
    if (sourceRow >= m_places.size() || m_places[sourceRow] == Nowhere)
        return std::nullopt;
    return m_places[sourceRow];
}

void CShownRows::Look(IRowSource& rows)
{
    m_keys.resize(rows.Count());
    for (std::size_t row = 0; row < m_keys.size(); ++row)
        m_keys[row] = rows.KeyAt(row);
    m_rearranged = rows.Rearranged();
}

void CShownRows::Derive()
{
    m_rows.clear();
    m_rows.reserve(m_keys.size());
    m_places.assign(m_keys.size(), Nowhere);
    for (std::size_t i = 0; i < m_keys.size(); ++i) {
        const std::uint32_t row = m_order.empty() ? std::uint32_t(i) : m_order[i];
        if (!m_hidden.empty() && m_hidden[row])
            continue;
        m_places[row] = std::uint32_t(m_rows.size());
        m_rows.push_back(row);
    }
}

void CShownRows::Sort(IRowSource& rows, SourceRows order)
{
    m_isSorted = true;
    m_order = std::move(order);
    Look(rows);
    Derive();
}

void CShownRows::SortAsSource()
{
    m_isSorted = false;
    m_order.clear();
    if (IsPlain())
        Clear();
    else
        Derive();
}

void CShownRows::Hide(IRowSource& rows, std::vector<bool> hidden)
{
    m_isFiltered = true;
    m_hidden = std::move(hidden);
    Look(rows);
    Derive();
}

void CShownRows::HideNothing()
{
    m_isFiltered = false;
    m_hidden.clear();
    if (IsPlain())
        Clear();
    else
        Derive();
}

void CShownRows::Show(std::size_t sourceRow)
{
    if (sourceRow >= m_hidden.size() || !m_hidden[sourceRow])
        return;
    m_hidden[sourceRow] = false;
    Derive();
}

void CShownRows::PlaceBehind(std::size_t sourceRow, std::size_t first, std::size_t count)
{
    if (m_order.empty())
        return;
    std::erase_if(m_order, [=](std::uint32_t row) { return row >= first && row < first + count; });
    const auto place = std::ranges::find(m_order, std::uint32_t(sourceRow));
    SourceRows added(count);
    std::iota(added.begin(), added.end(), std::uint32_t(first));
    m_order.insert(place == m_order.end() ? place : place + 1, added.begin(), added.end());
    Derive();
}

bool CShownRows::Follow(IRowSource& rows, std::optional<std::size_t> changedAt)
{
    if (IsPlain())
        return true;
    const std::size_t was = m_keys.size(), is = rows.Count(), common = std::min(was, is);
    std::size_t head = 0, tail = 0; // so many rows have stayed at both ends
    if (rows.KeysLast()) {
        while (head < common && m_keys[head] == rows.KeyAt(head))
            ++head;
        while (tail < common - head && m_keys[was - 1 - tail] == rows.KeyAt(is - 1 - tail))
            ++tail;
    } else if (was == is) {
        return m_rearranged == rows.Rearranged();
    } else if (!changedAt) {
        return false;
    } else {
        head = std::min(*changedAt, common);
        tail = common - head;
    }
    if (head == was && head == is)
        return true;
    const SourceRows moved = MovedRows(rows, head, tail);
    const std::size_t stayed = was - std::size_t(std::ranges::count(moved, Nowhere)), fixed = rows.FixedRows();
    if (was > fixed && is > fixed && stayed <= fixed)
        return false; // a file was read
    Move(moved, is);
    Look(rows);
    Derive();
    return true;
}

/// Where the rows of the last look are now.
SourceRows CShownRows::MovedRows(IRowSource& rows, std::size_t head, std::size_t tail) const
{
    const std::size_t was = m_keys.size(), is = rows.Count();
    SourceRows moved(was, Nowhere);
    std::iota(moved.begin(), moved.begin() + std::ptrdiff_t(head), 0u);
    std::iota(moved.end() - std::ptrdiff_t(tail), moved.end(), std::uint32_t(is - tail));
    std::unordered_map<RowKey, std::uint32_t> between; // where rows were put in order
    if (head + tail < was)
        for (std::size_t row = head; row < is - tail; ++row)
            between.emplace(rows.KeyAt(row), std::uint32_t(row));
    for (std::size_t row = head; !between.empty() && row < was - tail; ++row)
        if (const auto found = between.find(m_keys[row]); found != between.end())
            moved[row] = found->second;
    return moved;
}

void CShownRows::Move(const SourceRows& moved, std::size_t count)
{
    std::vector<bool> isNew(count, true), hidden(m_hidden.empty() ? 0 : count, false);
    for (std::size_t row = 0; row < moved.size(); ++row) {
        if (moved[row] == Nowhere)
            continue;
        isNew[moved[row]] = false;
        if (!m_hidden.empty())
            hidden[moved[row]] = m_hidden[row];
    }
    m_hidden = std::move(hidden);
    if (!m_isSorted)
        return;
    SourceRows order;
    order.reserve(count);
    const auto addNewBefore = [&](std::size_t row) {
        std::size_t first = row;
        while (first > 0 && isNew[first - 1])
            --first;
        for (; first < row; ++first)
            order.push_back(std::uint32_t(first));
    };
    for (const std::uint32_t row : m_order) {
        if (moved[row] == Nowhere)
            continue;
        addNewBefore(moved[row]);
        order.push_back(moved[row]);
    }
    addNewBefore(count);
    m_order = std::move(order);
}
