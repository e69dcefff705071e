#include "grid/paste_models.h"

#include "grid/grid_texts.h"
#include "ks/fc/shown_text.h"

#include <QApplication>
#include <QPalette>
#include <QStyle>

void CUnderstoodModel::Renew()
{
    beginResetModel();
    m_faulty.clear();
    for (const auto& fault : m_plan->Faults())
        m_faulty.insert({fault.line, fault.column});
    endResetModel();
}

int CUnderstoodModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() || !m_plan ? 0 : int(m_plan->Lines());
}

int CUnderstoodModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() || !m_plan ? 0 : m_plan->Columns();
}

QVariant CUnderstoodModel::data(const QModelIndex& index, int role) const
{
    const auto line = std::size_t(index.row());
    const int column = index.column(), target = Target(column);
    const bool isFaulty = target >= 0 && m_faulty.contains({line, column});
    const bool goesNowhere = !isFaulty && (target < 0 || m_plan->GoesNowhere(line));
    switch (role) {
    case Qt::DisplayRole:
        return KsVisibleText(m_plan->Understood(line, column), true);
    case Qt::ToolTipRole:
        return GridTexts::tr("Copied: %1").arg(KsVisibleText(m_plan->Text(line, column), true));
    case Qt::ForegroundRole:
        return goesNowhere ? QVariant(QApplication::palette().brush(QPalette::Disabled, QPalette::Text)) : QVariant();
    case Qt::FontRole: {
        QFont font = QApplication::font("QAbstractItemView");
        font.setStrikeOut(goesNowhere);
        font.setBold(isFaulty);
        return goesNowhere || isFaulty ? QVariant(font) : QVariant();
    }
    case Qt::DecorationRole:
        return isFaulty ? QVariant(QApplication::style()->standardIcon(QStyle::SP_MessageBoxWarning)) : QVariant();
    case Qt::TextAlignmentRole:
        return int(Qt::AlignVCenter |
                   (target >= 0 && m_rows.Column(target).IsNumeric() ? Qt::AlignRight : Qt::AlignLeft));
    default:
        return {};
    }
}

QVariant CUnderstoodModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (role != Qt::DisplayRole || !m_plan)
        return {};
    if (orientation == Qt::Horizontal)
        return Target(section) < 0 ? GridTexts::tr("(left out)") : m_rows.Column(Target(section)).header();
    const auto line = std::size_t(section);
    if (const auto row = m_plan->RowOf(line))
        return QString::number(*row + 1);
    return m_plan->IsNew(line) ? GridTexts::tr("new") : QStringLiteral("-");
}

void CFaultModel::Renew()
{
    beginResetModel();
    endResetModel();
}

int CFaultModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() || !m_plan ? 0 : int(m_plan->Faults().size());
}

int CFaultModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : Count;
}

QVariant CFaultModel::data(const QModelIndex& index, int role) const
{
    if (role != Qt::DisplayRole && role != Qt::EditRole && role != Qt::ToolTipRole)
        return {};
    const CPastePlan::Fault& fault = FaultAt(index);
    const PasteChoice& choice = m_plan->Choice();
    switch (index.column()) {
    case Line:
        return QString::number(m_plan->CopiedLine(fault.line) + 1);
    case Name:
        return fault.column < 0 ? QString() : m_rows.Column(choice.columns[std::size_t(fault.column)].target).header();
    case Text: {
        const QString text = m_plan->Text(fault.line, std::max(fault.column, 0));
        return role == Qt::EditRole ? text : KsVisibleText(text, true);
    }
    default:
        return fault.reason;
    }
}

QVariant CFaultModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (role != Qt::DisplayRole || orientation != Qt::Horizontal)
        return {};
    const QString titles[] = {GridTexts::tr("Copied line"), GridTexts::tr("Column"), GridTexts::tr("Text"),
                              GridTexts::tr("Reason")};
    return titles[section];
}

Qt::ItemFlags CFaultModel::flags(const QModelIndex& index) const
{
    const auto flags = QAbstractTableModel::flags(index);
    return index.column() == Text && FaultAt(index).column >= 0 ? flags | Qt::ItemIsEditable : flags;
}

bool CFaultModel::setData(const QModelIndex& index, const QVariant& value, int role)
{
    if (role != Qt::EditRole || value.toString() == index.data(Qt::EditRole).toString())
        return false;
    m_mend(index.row(), value.toString());
    return true;
}
