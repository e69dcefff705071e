#include "editors/common/quantity.h"
#include "editors/cross_sections/table_models.h"

#include <array>
#include <numeric>

namespace {

/// A text or a number.
struct SectionColumn
{
    const char* name;
    QString CCrossSection::*text;
    double CCrossSection::*value;
    UnitGroup group;
};
constexpr std::array<SectionColumn, CSectionTable::ColumnCount> Columns{{
    {QT_TRANSLATE_NOOP("CSectionTable", "Branch"), &CCrossSection::branch, nullptr, UnitGroup::None},
    {QT_TRANSLATE_NOOP("CSectionTable", "Chainage"), nullptr, &CCrossSection::chainage, UnitGroup::Chainage},
    {QT_TRANSLATE_NOOP("CSectionTable", "Radius"), nullptr, &CCrossSection::radius, UnitGroup::Radius},
    {QT_TRANSLATE_NOOP("CSectionTable", "Width"), nullptr, &CCrossSection::width, UnitGroup::Width},
    {QT_TRANSLATE_NOOP("CSectionTable", "Topo ID"), &CCrossSection::topoId, nullptr, UnitGroup::None},
}};

const SectionColumn& ColumnAt(int column)
{
    return Columns.at(static_cast<std::size_t>(column));
}

} // namespace

CSectionTable::CSectionTable(CCrossSectionDoc& document, QObject* parent) : CSectionLines(document, parent)
{
    Reload();
}

int CSectionTable::Lines() const
{
    return static_cast<int>(m_document.Sections().sections.size());
}

int CSectionTable::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : ColumnCount;
}

QVariant CSectionTable::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole)
        return CSectionLines::headerData(section, orientation, role);
    const SectionColumn& column = ColumnAt(section);
    return column.value ? WithUnit(tr(column.name), column.group) : tr(column.name);
}

QVariant CSectionTable::data(const QModelIndex& index, int role) const
{
    const SectionColumn& column = ColumnAt(index.column());
    if (role == Qt::TextAlignmentRole)
        return int(Qt::AlignVCenter | (column.value ? Qt::AlignRight : Qt::AlignLeft));
    const CCrossSection* section = m_document.Section(index.row());
    if (!section || (role != Qt::DisplayRole && role != Qt::EditRole))
        return {};
    if (!column.value)
        return section->*column.text;
    const double value = section->*column.value;
    return role == Qt::EditRole ? EditQuantity(column.group, value) : ShowQuantity(column.group, value);
}

bool CSectionTable::setData(const QModelIndex& index, const QVariant& value, int role)
{
    const QString typed = value.toString().trimmed();
    if (role != Qt::EditRole || typed == data(index, Qt::EditRole).toString())
        return false; // untouched: the stored value keeps its last digit
    const SectionColumn& column = ColumnAt(index.column());
    CCrossSection section = m_document.Sections().sections.at(std::size_t(index.row()));
    if (column.text) {
        section.*column.text = typed;
    } else {
        const bool unset = typed.isEmpty() && index.column() != Chainage;
        const auto number = unset ? std::optional(KsUnset) : ReadQuantity(column.group, typed);
        if (!number)
            return RefuseNumber(index, typed);
        section.*column.value = *number;
    }
    return Replace(index, index.row(), std::move(section), tr("%1 of Cross Section").arg(tr(column.name)));
}

void CSectionTable::RemoveLines(const std::vector<int>& rows)
{
    m_document.RemoveSections(rows, tr("Delete Cross Sections"));
}

int CSectionTable::InsertLine(int row, const QString& branch)
{
    constexpr double step = 100; // metres, behind the only section of a branch
    const auto& all = m_document.Sections().sections;
    CCrossSection line;
    line.branch = branch;
    const int at = row < 0 ? Lines() - 1 : row;
    if (const CCrossSection* before = m_document.Section(at)) {
        line.branch = before->branch;
        line.topoId = before->topoId;
        const CCrossSection *next = m_document.Section(at + 1), *previous = m_document.Section(at - 1);
        if (next && next->branch == line.branch)
            line.chainage = std::midpoint(before->chainage, next->chainage);
        else if (previous && previous->branch == line.branch)
            line.chainage = 2 * before->chainage - previous->chainage;
        else
            line.chainage = before->chainage + step;
        while (m_document.Sections().IsTaken(line)) // by a section that stands elsewhere in the table
            line.chainage += step;
    }
    const int place = all.empty() ? 0 : at + 1;
    m_document.InsertSection(place, std::move(line), tr("Insert Cross Section"));
    return place;
}
