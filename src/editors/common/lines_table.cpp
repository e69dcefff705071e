#include "editors/common/lines_table.h"

int CLinesTable::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : m_rows;
}

void CLinesTable::Reload()
{
    if (Lines() != m_rows) {
        beginResetModel();
        m_rows = Lines();
        endResetModel();
    } else if (m_rows > 0) {
        emit dataChanged(index(0, 0), index(m_rows - 1, columnCount() - 1));
    }
    emit headerDataChanged(Qt::Horizontal, 0, columnCount() - 1);
}

bool CLinesTable::Refuse(const QModelIndex& index, const QString& message)
{
    emit Refused(tr("Line %1, %2: %3")
                     .arg(index.row() + 1)
                     .arg(headerData(index.column(), Qt::Horizontal, Qt::DisplayRole).toString(), message));
    return false;
}
