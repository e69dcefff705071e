// Undo commands on the rows of a grid: cells changed, lines inserted, lines removed.
#pragma once

#include "grid/column_spec.h"
#include "grid/row_source.h"
#include "ks/fc/doc_command.h"

#include <vector>

/// The place of a row of the source; of the last one for a row past the end.
ChangePlace PlaceOf(const IRowSource& rows, std::size_t row, int column);

/// Puts new lines into a list.
class CInsertLines : public CDocumentCommand
{
public:
    /// The text is that of an insertion unless one is given.
    CInsertLines(CKsDoc& document, std::shared_ptr<IRowSource> rows, std::size_t row, std::unique_ptr<IRowBlock> lines,
                 const QString& text = {});

protected:
    ChangePlace Apply() override;
    ChangePlace Revert() override;

private:
    std::shared_ptr<IRowSource> m_rows;
    std::size_t m_row, m_count;
    std::unique_ptr<IRowBlock> m_lines; // while they are not in the list
};

/// Removes lines from a list.
class CDeleteLines : public CDocumentCommand
{
public:
    CDeleteLines(CKsDoc& document, std::shared_ptr<IRowSource> rows, std::size_t row, std::size_t count);

protected:
    ChangePlace Apply() override;
    ChangePlace Revert() override;

private:
    std::shared_ptr<IRowSource> m_rows;
    std::size_t m_row, m_count;
    std::unique_ptr<IRowBlock> m_lines; // while they are out of the list
};

/// Puts the lines of a list into its order.
class CArrangeLines : public CDocumentCommand
{
public:
    /// `order`: for each place the row to stand there. The line to look at is the one at `row`.
    CArrangeLines(CKsDoc& document, std::shared_ptr<IRowSource> rows, std::vector<std::size_t> order, std::size_t row);

protected:
    ChangePlace Apply() override;
    ChangePlace Revert() override;

private:
    std::shared_ptr<IRowSource> m_rows;
    std::vector<std::size_t> m_order, m_places; // the row at each place; the place of each row
    std::size_t m_row;
};

/// One cell of a row, before and after. The row may be in the list or in a command that took it out.
struct CellChange
{
    RowKey row;
    int column; // from 1
    std::shared_ptr<const CellAccess> access;
    CellValue before, after;
    std::function<void(void* row)> restore = {}; // instead of setting `before`; see CellAccess
};

/// Changes cells, and nothing but them.
class CSetCells : public CDocumentCommand
{
public:
    /// `changes` is not empty; `row` (from 0) is where the first of them stands.
    CSetCells(CKsDoc& document, std::shared_ptr<IRowSource> rows, std::vector<CellChange> changes, std::size_t row);

protected:
    ChangePlace Apply() override;
    ChangePlace Revert() override;

private:
    ChangePlace Place();

    std::shared_ptr<IRowSource> m_rows;
    std::vector<CellChange> m_changes;
    std::size_t m_row;
};
