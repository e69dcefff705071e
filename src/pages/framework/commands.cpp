#include "pages/framework/commands.h"

#include "document/document.h"
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

template <typename T>
void StoreValue(CKavo0_hdDoc& document, T& target, T value)
{
    if (target != value)
        document.UndoStack().push(new CSetValue<T>(document, LoadString(Str::UndoValue), target, std::move(value)));
}
template void StoreValue(CKavo0_hdDoc&, double&, double);
template void StoreValue(CKavo0_hdDoc&, std::int32_t&, std::int32_t);
template void StoreValue(CKavo0_hdDoc&, bool&, bool);
template void StoreValue(CKavo0_hdDoc&, std::string&, std::string);
template void StoreValue(CKavo0_hdDoc&, HDDateTime&, HDDateTime);
