// The table of the branches.
#include "editors/network/table_models.h"

#include "editors/common/quantity.h"

#include <array>

namespace {

constexpr UnitGroup NoUnit = UnitGroup::None;
constexpr Qt::ItemFlags ReadOnly = Qt::ItemIsEnabled | Qt::ItemIsSelectable;

struct BranchColumn
{
    const char* name;
    UnitGroup group;
};
constexpr std::array<BranchColumn, CBranchTable::ColumnCount> BranchColumns{{
    {QT_TRANSLATE_NOOP("CBranchTable", "Branch"), NoUnit},
    {QT_TRANSLATE_NOOP("CBranchTable", "From"), UnitGroup::Chainage},
    {QT_TRANSLATE_NOOP("CBranchTable", "To"), UnitGroup::Chainage},
    {QT_TRANSLATE_NOOP("CBranchTable", "Vertices"), NoUnit},
    {QT_TRANSLATE_NOOP("CBranchTable", "Flow"), NoUnit},
}};

bool IsNumberColumn(int column)
{
    return column == CBranchTable::From || column == CBranchTable::To || column == CBranchTable::Vertices;
}

} // namespace

CBranchTable::CBranchTable(CNetworkDoc& document, QObject* parent) : CNetworkTable(document, parent)
{
    connect(&document, &CNetworkDoc::NetworkChanged, this, &CNetworkTable::Reload);
    Reload();
}

int CBranchTable::Lines() const
{
    return static_cast<int>(m_document.Network().branches.size());
}

int CBranchTable::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : ColumnCount;
}

Qt::ItemFlags CBranchTable::flags(const QModelIndex& index) const
{
    if (!index.isValid())
        return Qt::NoItemFlags;
    switch (index.column()) {
    case Vertices:
        return ReadOnly;
    case Flow:
        return ReadOnly | Qt::ItemIsUserCheckable;
    default:
        return ReadOnly | Qt::ItemIsEditable;
    }
}

QVariant CBranchTable::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole)
        return CNetworkTable::headerData(section, orientation, role);
    const BranchColumn& column = BranchColumns.at(static_cast<std::size_t>(section));
    return column.group == NoUnit ? tr(column.name) : WithUnit(tr(column.name), column.group);
}

QVariant CBranchTable::data(const QModelIndex& index, int role) const
{
    if (!index.isValid())
        return {};
    const CNetworkBranch& branch = m_document.Network().branches.at(std::size_t(index.row()));
    const bool edit = role == Qt::EditRole;
    if (role == Qt::TextAlignmentRole)
        return int(Qt::AlignVCenter | (IsNumberColumn(index.column()) ? Qt::AlignRight : Qt::AlignLeft));
    if (role == Qt::CheckStateRole && index.column() == Flow)
        return branch.downstream ? Qt::Checked : Qt::Unchecked;
    if (role == Qt::ToolTipRole && index.column() == Flow)
        return tr("Checked: water flows towards increasing chainages");
    if (role != Qt::DisplayRole && !edit)
        return {};
    const auto chainage = [&](double value) {
        return edit ? EditQuantity(UnitGroup::Chainage, value) : ShowQuantity(UnitGroup::Chainage, value);
    };
    switch (index.column()) {
    case Name:
        return branch.name;
    case From:
        return chainage(branch.start);
    case To:
        return chainage(branch.end);
    case Vertices:
        return static_cast<int>(branch.line.size());
    default:
        return branch.downstream ? tr("increasing") : tr("decreasing");
    }
}

bool CBranchTable::setData(const QModelIndex& index, const QVariant& value, int role)
{
    if (role == Qt::EditRole && value.toString() == data(index, Qt::EditRole).toString())
        return false; // untouched: the stored value keeps its last digit
    CNetworkBranch branch = m_document.Network().branches.at(std::size_t(index.row()));
    QString text;
    switch (index.column()) {
    case Name:
        branch.name = value.toString().trimmed();
        text = tr("Name of Branch");
        break;
    case From:
    case To:
        if (const auto typed = ReadQuantity(UnitGroup::Chainage, value.toString()))
            (index.column() == From ? branch.start : branch.end) = *typed;
        else
            return Refuse(index, tr("expected a number, found \"%1\".").arg(value.toString()));
        text = tr("Chainage of Branch");
        break;
    default:
        if (role != Qt::CheckStateRole)
            return false;
        branch.downstream = value.toInt() == Qt::Checked;
        text = tr("Flow Direction");
    }
    if (const QString reason = m_document.WhyNot(index.row(), branch); !reason.isEmpty())
        return Refuse(index, reason);
    m_document.ReplaceBranch(index.row(), std::move(branch), text);
    return true;
}

void CBranchTable::RemoveLines(const std::vector<int>& rows)
{
    m_document.RemoveBranches(rows, tr("Delete Branches"));
}
