#include "editors/network/table_models.h"

#include "editors/network/quantity.h"

#include <algorithm>
#include <array>
#include <numeric>

namespace {

constexpr UnitGroup NoUnit = UnitGroup::None;
constexpr Qt::ItemFlags ReadOnly = Qt::ItemIsEnabled | Qt::ItemIsSelectable;

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

const ChannelColumn& ChannelAt(int column)
{
    return ChannelColumns.at(static_cast<std::size_t>(column));
}

} // namespace

// ---- both --------------------------------------------------------------------------------------

int CNetworkTable::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : m_rows;
}

void CNetworkTable::Reload()
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

bool CNetworkTable::Refuse(const QModelIndex& index, const QString& message)
{
    emit Refused(tr("Line %1, %2: %3")
                     .arg(index.row() + 1)
                     .arg(headerData(index.column(), Qt::Horizontal, Qt::DisplayRole).toString(), message));
    return false;
}

// ---- branches ----------------------------------------------------------------------------------

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

// ---- channel -----------------------------------------------------------------------------------

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
    return index.isValid() ? ReadOnly | Qt::ItemIsEditable : Qt::ItemFlags(Qt::NoItemFlags);
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
