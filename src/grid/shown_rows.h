// Which rows of a source a table shows, and in which order: those of the file, unless the user sorts or filters. The
// source knows nothing of it.
#pragma once

#include "grid/row_source.h"

#include <cstdint>
#include <optional>
#include <vector>

/// Row numbers of a source.
using SourceRows = std::vector<std::uint32_t>;

/// Rows of the source and rows of the table, both from 0.
class CShownRows
{
public:
    /// Neither order nor hidden rows: a row is that of the source, and nothing is kept.
    bool IsPlain() const { return !m_isSorted && !m_isFiltered; }
    bool IsSorted() const { return m_isSorted; }
    bool IsFiltered() const { return m_isFiltered; }

    // Not while it is plain.
    std::size_t Count() const { return m_rows.size(); }
    std::size_t SourceRow(std::size_t row) const { return m_rows[row]; }
    /// Nothing for a hidden row.
    std::optional<std::size_t> RowOf(std::size_t sourceRow) const;
    /// All rows of the source as the order has them, hidden ones too.
    const SourceRows& Order() const { return m_order; }

    /// Every row of the source, in the order to be shown.
    void Sort(IRowSource& rows, SourceRows order);
    void SortAsSource();
    /// For each row of the source whether it is hidden.
    void Hide(IRowSource& rows, std::vector<bool> hidden);
    void HideNothing();
    /// A hidden row comes into sight, until others are hidden.
    void Show(std::size_t sourceRow);
    /// New rows of the source are shown below one of it, until it is sorted afresh. Only while it is sorted.
    void PlaceBehind(std::size_t sourceRow, std::size_t first, std::size_t count);
    void Clear() { *this = CShownRows(); }

    /// Rows have come, gone or moved: those that stayed are shown where they were, new ones before the row that follows
    /// them in the source, and none of these is hidden. `changedAt` is where they came or went in a source whose keys
    /// do not tell. False when that is not known, or nothing has stayed: order and hidden rows are to be found afresh.
    bool Follow(IRowSource& rows, std::optional<std::size_t> changedAt);

private:
    static constexpr std::uint32_t Nowhere = std::uint32_t(-1);

    void Look(IRowSource& rows);
    void Derive();
    SourceRows MovedRows(IRowSource& rows, std::size_t head, std::size_t tail) const;
    void Move(const SourceRows& moved, std::size_t count);

    bool m_isSorted = false, m_isFiltered = false;
    SourceRows m_order;           // empty: as the source
    std::vector<bool> m_hidden;   // by rows of the source; empty: none
    SourceRows m_rows;            // of the source, as they are shown
    SourceRows m_places;          // where the source's rows are shown, or Nowhere
    std::vector<RowKey> m_keys;   // of the source's rows, as they were at the last look
    std::size_t m_rearranged = 0; // how often they had been put in order by then
};
