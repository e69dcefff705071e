// Cells of the rows of a source, before and after. Kept column by column: of a million numbers nothing but the rows and
// the two numbers of each.
#pragma once

#include "grid/column_spec.h"
#include "grid/row_index.h"
#include "grid/row_source.h"

#include <variant>
#include <vector>

/// Equal to the last bit; numbers that are none are equal to themselves.
bool SameCell(const CellValue& a, const CellValue& b);
bool SameCell(double a, double b);

/// What many cells of one column hold.
class CCellValues
{
public:
    /// The first one says of which type they are; then there is room for `expected` of them.
    void Add(CellValue value, std::size_t expected = 0);
    /// The same for a number, without the way over a value of any type.
    void Add(double number, std::size_t expected = 0);
    CellValue operator[](std::size_t index) const;
    void ShrinkToFit();

private:
    // As values of one type as long as they are of one, which they are but for empty cells.
    std::variant<std::vector<double>, std::vector<std::int32_t>, std::vector<std::string>, std::vector<HDDateTime>,
                 std::vector<CellValue>>
        m_values;
    bool m_hasType = false;
};

class CCellChanges
{
public:
    /// The row may be in the source or in a command that took it out. `column` counts from 1. The columns of a row are
    /// changed in the order in which they came first.
    void Add(RowKey row, int column, const std::shared_ptr<const CellAccess>& access, CellValue before,
             CellValue after);
    void Add(RowKey row, int column, const std::shared_ptr<const CellAccess>& access, double before, double after);
    /// So many cells of each column may come: makes room for them at once.
    void Expect(std::size_t cells) { m_expected = cells; }
    bool IsEmpty() const { return m_columns.empty(); }
    std::size_t Count() const;
    // Of the first cell that was added; not for an empty one.
    RowKey FirstRow() const { return m_columns.front().rows.front(); }
    int FirstColumn() const { return m_columns.front().column; }

    void Apply(IRowSource& rows);
    void Revert(IRowSource& rows);
    /// Does one of both, Apply if `forward`, to the cells of one row only, in an object that holds what the row does.
    /// It is asked for when there are such cells.
    void RunOn(RowKey row, const std::function<void*()>& object, bool forward) const;
    /// Nothing is added any more.
    void ShrinkToFit();

private:
    struct Column
    {
        int column;
        std::shared_ptr<const CellAccess> access;
        std::vector<RowKey> rows;
        CCellValues before, after;
        std::vector<std::function<void(void* row)>> restore = {}; // instead of setting `before`; see CellAccess
        mutable CRowIndex index = {};                             // of many rows, from the first search on

        void Set(std::size_t cell, void* object, bool forward) const;
        template <typename Do>
        void ForCellsOf(RowKey row, bool forward, const Do& action) const;
    };

    Column& ColumnFor(int column, const std::shared_ptr<const CellAccess>& access);

    std::vector<Column> m_columns;
    std::size_t m_expected = 0;
};
