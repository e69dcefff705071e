#include "editors/cross_sections/table_models.h"

int CLinesTable::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : m_rows;
}

Qt::ItemFlags CLinesTable::flags(const QModelIndex& index) const
{
    return index.isValid() ? Qt::ItemIsEnabled | Qt::ItemIsSelectable | Qt::ItemIsEditable : Qt::NoItemFlags;
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

bool CLinesTable::RefuseNumber(const QModelIndex& index, const QString& typed)
{
    return Refuse(index, tr("expected a number, found \"%1\".").arg(typed));
}

bool CLinesTable::Replace(const QModelIndex& index, int section, CCrossSection changed, const QString& text)
{
    if (const QString reason = m_document.WhyNot(section, changed); !reason.isEmpty())
        return Refuse(index, reason);
    m_document.ReplaceSection(section, std::move(changed), text);
    return true;
}

QString CLinesTable::TextOf(const std::vector<int>& rows) const
{
    QString text;
    for (const int row : rows) {
        QStringList cells;
        for (int column = 0; column < columnCount(); ++column)
            cells << index(row, column).data(Qt::EditRole).toString();
        text += cells.join(u'\t') + u'\n';
    }
    return text;
}
