#include "editors/cross_sections/table_models.h"

Qt::ItemFlags CSectionLines::flags(const QModelIndex& index) const
{
    return index.isValid() ? Qt::ItemIsEnabled | Qt::ItemIsSelectable | Qt::ItemIsEditable : Qt::NoItemFlags;
}

bool CSectionLines::RefuseNumber(const QModelIndex& index, const QString& typed)
{
    return Refuse(index, tr("expected a number, found \"%1\".").arg(typed));
}

bool CSectionLines::Replace(const QModelIndex& index, int section, CCrossSection changed, const QString& text)
{
    if (const QString reason = m_document.WhyNot(section, changed); !reason.isEmpty())
        return Refuse(index, reason);
    m_document.ReplaceSection(section, std::move(changed), text);
    return true;
}

QString CSectionLines::TextOf(const std::vector<int>& rows) const
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
