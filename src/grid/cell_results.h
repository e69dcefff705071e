// What an operation on many cells comes to, before anything changes: it is shown first.
#pragma once

#include "grid/cell_changes.h"
#include "grid/shown_numbers.h"

#include <QString>
#include <algorithm>
#include <map>

/// Cells of a table, each bound included; rows and columns count from 0.
struct CellBlock
{
    int top = 0, left = 0, bottom = -1, right = -1;
};

class CCellResults
{
public:
    CCellResults(const CTableRows& rows, const CellBlock& block) : m_rows(&rows), m_hasRules(rows.Rows()->HasRules())
    {
        m_changes.Expect(std::size_t(std::max(block.bottom - block.top + 1, 0)));
    }

    /// The cell, which holds `before`, becomes `after` unless that is the same, or cannot be.
    void Add(int row, int column, const CellValue& before, const CellValue& after);
    /// The cell becomes the number in the unit that the user sees, to fifteen digits; an integer in a column of them.
    void AddShown(int row, int column, double after) { AddShown(row, column, m_rows->UntouchedObject(row), after); }
    void AddShown(int row, int column, const void* untouchedObject, double after);
    /// The cell, which holds `before`, becomes what it was once, whatever cells may become now.
    void PutBack(int row, int column, const CellValue& before, const CellValue& after);
    /// The cell stays as it is.
    void Keep(int row, int column, const QString& why);

    struct Cell
    {
        int row, column;
        QString before, after; // as texts to edit; `after` is the reason for a cell that stays
    };
    /// The first cells that change, and the first that cannot, as many as one looks at.
    const std::vector<Cell>& Changed() const { return m_changed; }
    const std::vector<Cell>& Kept() const { return m_kept; }
    std::size_t KeptCount() const { return m_keptCount; }
    std::size_t ChangedCount() const { return m_changes.Count(); }
    /// What the rows together do not allow; empty when they do. See IRowSource::FindFault.
    QString RuleFault() const;

    int FirstRow() const { return m_firstRow; }
    CCellChanges TakeChanges() { return std::move(m_changes); }

private:
    struct Numbers
    {
        int column;
        CShownNumbers shown;
    };
    const CShownNumbers& NumbersOf(int column);
    void AddNumber(int row, int column, const CShownNumbers& numbers, double before, double after);
    bool IsTaken(int row, int column, const ColumnSpec& spec, const double* number);
    template <typename T>
    void Change(int row, int column, const ColumnSpec& spec, const T& before, const T& after);
    void List(int row, int column, const CellValue& before, const CellValue& after);

    const CTableRows* m_rows;
    std::optional<Numbers> m_numbers; // of the column whose cells come at present
    bool m_hasRules;
    CCellChanges m_changes;
    std::vector<Cell> m_changed, m_kept;
    std::map<int, std::map<int, CellValue>> m_ruled; // what changes, by column and row, of rows that have rules
    std::size_t m_keptCount = 0;
    int m_firstRow = 0;
};
