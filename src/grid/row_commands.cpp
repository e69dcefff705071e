#include "grid/row_commands.h"

#include "grid/grid_texts.h"

#include <algorithm>

ChangePlace PlaceOf(const IRowSource& rows, std::size_t row, int column)
{
    const std::size_t last = std::max<std::size_t>(rows.Count(), 1) - 1;
    row = std::min(row, last);
    return {rows.Data(), int(row) + 1, column, rows.List(), int(rows.ListRow(row)) + 1};
}

CInsertLines::CInsertLines(CKsDoc& document, std::shared_ptr<IRowSource> rows, std::size_t row,
                           std::unique_ptr<IRowBlock> lines, const QString& text)
    : CDocumentCommand(document, text.isEmpty() ? GridTexts::tr("Insertion of lines") : text),
      m_rows(std::move(rows)),
      m_row(row),
      m_count(lines->Count()),
      m_lines(std::move(lines))
{
}

ChangePlace CInsertLines::Apply()
{
    m_row = m_rows->Put(m_row, std::move(m_lines));
    return PlaceOf(*m_rows, m_row, 1);
}

ChangePlace CInsertLines::Revert()
{
    m_lines = m_rows->TakeBack(m_row, m_count);
    return PlaceOf(*m_rows, m_row, 1);
}

CDeleteLines::CDeleteLines(CKsDoc& document, std::shared_ptr<IRowSource> rows, std::size_t row, std::size_t count)
    : CDocumentCommand(document, GridTexts::tr("Deletion of lines")),
      m_rows(std::move(rows)),
      m_row(row),
      m_count(count)
{
}

ChangePlace CDeleteLines::Apply()
{
    m_lines = m_rows->Take(m_row, m_count);
    return PlaceOf(*m_rows, m_row, 1);
}

ChangePlace CDeleteLines::Revert()
{
    m_row = m_rows->Put(m_row, std::move(m_lines));
    return PlaceOf(*m_rows, m_row, 1);
}

CArrangeLines::CArrangeLines(CKsDoc& document, std::shared_ptr<IRowSource> rows, std::vector<std::size_t> order,
                             std::size_t row)
    : CDocumentCommand(document, {}),
      m_rows(std::move(rows)),
      m_order(std::move(order)),
      m_places(m_order.size()),
      m_row(row)
{
    for (std::size_t place = 0; place < m_order.size(); ++place)
        m_places[m_order[place]] = place;
}

ChangePlace CArrangeLines::Apply()
{
    m_rows->Rearrange(m_order);
    return PlaceOf(*m_rows, m_places[m_row], 1);
}

ChangePlace CArrangeLines::Revert()
{
    m_rows->Rearrange(m_places);
    return PlaceOf(*m_rows, m_row, 1);
}

CSetCells::CSetCells(CKsDoc& document, std::shared_ptr<IRowSource> rows, std::vector<CellChange> changes,
                     std::size_t row)
    : CDocumentCommand(document, GridTexts::tr("Change of cells")),
      m_rows(std::move(rows)),
      m_changes(std::move(changes)),
      m_row(row)
{
}

ChangePlace CSetCells::Apply()
{
    for (CellChange& change : m_changes) {
        void* row = m_rows->Object(change.row);
        if (change.access->restore)
            change.restore = change.access->restore(row);
        change.access->set(row, change.after);
    }
    return Place();
}

ChangePlace CSetCells::Revert()
{
    for (auto change = m_changes.rbegin(); change != m_changes.rend(); ++change) {
        void* row = m_rows->Object(change->row);
        if (change->restore)
            change->restore(row);
        else
            change->access->set(row, change->before);
    }
    return Place();
}

ChangePlace CSetCells::Place()
{
    const CellChange& first = m_changes.front();
    m_row = m_rows->RowOf(first.row, m_row);
    return PlaceOf(*m_rows, m_row, first.column);
}
