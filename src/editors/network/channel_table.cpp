// The table of radius and width along a branch.
#include "editors/common/quantity.h"
#include "editors/network/table_models.h"

#include <algorithm>
#include <array>
#include <numeric>

namespace {

struct ChannelColumn
{
    const char* name;
    UnitGroup group;
    double CChannelRow::*value;
};
constexpr std::array<ChannelColumn, CChannelTable::ColumnCount> ChannelColumns{{
    {QT_TRANSLATE_NOOP("CChannelTable", "Chainage"), UnitGroup::Chainage, &CChannelRow::chainage},
    {QT_TRANSLATE_NOOP("CChannelTable", "Radius"), UnitGroup::Radius, &CChannelRow::radius},
    {QT_TRANSLATE_NOOP("CChannelTable", "Width"), UnitGroup::Width, &CChannelRow::width},
}};

const ChannelColumn& ChannelAt(int column)
{
    return ChannelColumns.at(static_cast<std::size_t>(column));
}

} // namespace

CChannelTable::CChannelTable(CNetworkDoc& document, QObject* parent) : CNetworkTable(document, parent)
{
    connect(&document, &CNetworkDoc::NetworkChanged, this, &CNetworkTable::Reload);
}

const CNetworkBranch* CChannelTable::Current() const
{
    const auto& branches = m_document.Network().branches;
    return m_branch >= 0 && std::size_t(m_branch) < branches.size() ? &branches[std::size_t(m_branch)] : nullptr;
}

int CChannelTable::Lines() const
{
    return Current() ? static_cast<int>(Current()->channel.size()) : 0;
}

void CChannelTable::SetBranch(int branch)
{
    m_branch = branch;
    Reload();
}

int CChannelTable::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : ColumnCount;
}

Qt::ItemFlags CChannelTable::flags(const QModelIndex& index) const
{
    return index.isValid() ? Qt::ItemIsEnabled | Qt::ItemIsSelectable | Qt::ItemIsEditable : Qt::ItemFlags();
}

QVariant CChannelTable::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole)
        return CNetworkTable::headerData(section, orientation, role);
    return WithUnit(tr(ChannelAt(section).name), ChannelAt(section).group);
}

QVariant CChannelTable::data(const QModelIndex& index, int role) const
{
    if (role == Qt::TextAlignmentRole)
        return int(Qt::AlignVCenter | Qt::AlignRight);
    if (!index.isValid() || !Current() || (role != Qt::DisplayRole && role != Qt::EditRole))
        return {};
    const ChannelColumn& column = ChannelAt(index.column());
    const double value = Current()->channel.at(std::size_t(index.row())).*column.value;
    return role == Qt::EditRole ? EditQuantity(column.group, value) : ShowQuantity(column.group, value);
}

bool CChannelTable::setData(const QModelIndex& index, const QVariant& value, int role)
{
    const QString typed = value.toString().trimmed();
    if (role != Qt::EditRole || !Current() || typed == data(index, Qt::EditRole).toString())
        return false;
    const ChannelColumn& column = ChannelAt(index.column());
    const bool unset = typed.isEmpty() && index.column() != Chainage;
    const auto number = unset ? std::optional(KsUnset) : ReadQuantity(column.group, typed);
    if (!number)
        return Refuse(index, tr("expected a number, found \"%1\".").arg(typed));
    CNetworkBranch branch = *Current();
    const bool taken = std::any_of(branch.channel.begin(), branch.channel.end(),
                                   [&](const CChannelRow& row) { return row.chainage == *number; });
    if (index.column() == Chainage && taken)
        return Refuse(index, tr("there is a line at this chainage already."));
    CChannelRow& row = branch.channel.at(std::size_t(index.row()));
    row.*column.value = *number;
    const double chainage = row.chainage;
    m_document.ReplaceBranch(m_branch, std::move(branch), tr("Channel"));
    const auto& rows = Current()->channel;
    const auto now =
        std::find_if(rows.begin(), rows.end(), [&](const CChannelRow& r) { return r.chainage == chainage; });
    if (const int at = static_cast<int>(now - rows.begin()); at != index.row())
        emit LineMoved(at, index.column());
    return true;
}

void CChannelTable::RemoveLines(const std::vector<int>& rows)
{
    if (!Current() || rows.empty())
        return;
    CNetworkBranch branch = *Current();
    std::vector<CChannelRow> left;
    for (std::size_t i = 0; i < branch.channel.size(); ++i) {
        if (std::find(rows.begin(), rows.end(), static_cast<int>(i)) == rows.end())
            left.push_back(branch.channel[i]);
    }
    branch.channel = std::move(left);
    m_document.ReplaceBranch(m_branch, std::move(branch), tr("Delete Lines"));
}

int CChannelTable::InsertLine(int row)
{
    if (!Current())
        return -1;
    CNetworkBranch branch = *Current();
    const auto& rows = branch.channel;
    CChannelRow line;
    if (rows.empty()) {
        line.chainage = std::min(branch.start, branch.end);
    } else {
        const std::size_t at = row < 0 ? rows.size() - 1 : std::min(std::size_t(row), rows.size() - 1);
        const double high = std::max(branch.start, branch.end);
        double next = at + 1 < rows.size() ? rows[at + 1].chainage : high;
        if (next <= rows[at].chainage) // the last one is at the end of the branch
            next = at > 0 ? rows[at - 1].chainage : std::min(branch.start, branch.end);
        line.chainage = std::midpoint(rows[at].chainage, next);
    }
    const double chainage = line.chainage;
    branch.channel.push_back(line);
    m_document.ReplaceBranch(m_branch, std::move(branch), tr("Insert Line"));
    const auto& now = Current()->channel;
    const auto found =
        std::find_if(now.begin(), now.end(), [&](const CChannelRow& r) { return r.chainage == chainage; });
    return static_cast<int>(found - now.begin());
}
