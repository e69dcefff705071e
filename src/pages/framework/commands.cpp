#include "pages/framework/commands.h"

#include "module/document.h"
#include "res/strings.h"

#include <QUndoStack>

CSetCells::CSetCells(CKavo0_hdDoc& document, std::shared_ptr<IRowSource> rows, std::vector<CellChange> changes,
                     std::size_t row)
    : CDocumentCommand(document, LoadString(Str::UndoEditCells)),
      m_rows(std::move(rows)),
      m_changes(std::move(changes)),
      m_row(row)
{
}

ChangePlace CSetCells::Apply()
{
    for (const CellChange& change : m_changes) {
        m_rows->Touch(change.row);
        change.access->set(m_rows->Object(change.row), change.after);
    }
    return Place();
}

ChangePlace CSetCells::Revert()
{
    for (auto change = m_changes.rbegin(); change != m_changes.rend(); ++change)
        change->access->set(m_rows->Object(change->row), change->before);
    return Place();
}

ChangePlace CSetCells::Place()
{
    const CellChange& first = m_changes.front();
    m_row = m_rows->RowOf(first.row, m_row);
    return PlaceOf(*m_rows, m_row, first.column);
}

template <typename T>
void StoreValue(CKavo0_hdDoc& document, T& target, T value)
{
    if (target != value)
        document.UndoStack().push(new CSetValue<T>(document, LoadString(Str::UndoValue), target, value));
}
template void StoreValue(CKavo0_hdDoc&, double&, double);
template void StoreValue(CKavo0_hdDoc&, std::int32_t&, std::int32_t);
template void StoreValue(CKavo0_hdDoc&, bool&, bool);
