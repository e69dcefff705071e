#include "editors/common/quantity.h"
#include "editors/cross_sections/table_models.h"

#include <QRegularExpression>
#include <algorithm>
#include <array>
#include <numeric>

namespace {

struct PointColumn
{
    const char* name;
    double CSectionPoint::*value;
    UnitGroup group;
};
constexpr std::array<PointColumn, CPointTable::ColumnCount> Columns{{
    {QT_TRANSLATE_NOOP("CPointTable", "Offset"), &CSectionPoint::offset, UnitGroup::Width},
    {QT_TRANSLATE_NOOP("CPointTable", "Bed level"), &CSectionPoint::level, UnitGroup::WaterLevel},
}};

const PointColumn& ColumnAt(int column)
{
    return Columns.at(static_cast<std::size_t>(column));
}

} // namespace

CPointTable::CPointTable(CCrossSectionDoc& document, QObject* parent) : CSectionLines(document, parent) {}

int CPointTable::Lines() const
{
    return Current() ? static_cast<int>(Current()->points.size()) : 0;
}

void CPointTable::SetSection(int section)
{
    m_section = section;
    Reload();
}

int CPointTable::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : ColumnCount;
}

QVariant CPointTable::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation != Qt::Horizontal || role != Qt::DisplayRole)
        return CSectionLines::headerData(section, orientation, role);
    return WithUnit(tr(ColumnAt(section).name), ColumnAt(section).group);
}

QVariant CPointTable::data(const QModelIndex& index, int role) const
{
    if (role == Qt::TextAlignmentRole)
        return int(Qt::AlignVCenter | Qt::AlignRight);
    const auto row = static_cast<std::size_t>(index.row());
    if (!Current() || row >= Current()->points.size() || (role != Qt::DisplayRole && role != Qt::EditRole))
        return {};
    const PointColumn& column = ColumnAt(index.column());
    const double value = Current()->points[row].*column.value;
    return role == Qt::EditRole ? EditQuantity(column.group, value) : ShowQuantity(column.group, value);
}

bool CPointTable::setData(const QModelIndex& index, const QVariant& value, int role)
{
    const QString typed = value.toString().trimmed();
    if (role != Qt::EditRole || !Current() || typed == data(index, Qt::EditRole).toString())
        return false;
    const PointColumn& column = ColumnAt(index.column());
    const auto number = ReadQuantity(column.group, typed);
    if (!number)
        return RefuseNumber(index, typed);
    CCrossSection section = *Current();
    section.points.at(std::size_t(index.row())).*column.value = *number;
    return Replace(index, m_section, std::move(section), tr("%1 of Point").arg(tr(column.name)));
}

void CPointTable::RemoveLines(const std::vector<int>& rows)
{
    if (!Current() || rows.empty())
        return;
    CCrossSection section = *Current();
    section.points.clear();
    for (std::size_t i = 0; i < Current()->points.size(); ++i) {
        if (std::find(rows.begin(), rows.end(), static_cast<int>(i)) == rows.end())
            section.points.push_back(Current()->points[i]);
    }
    m_document.ReplaceSection(m_section, std::move(section), tr("Delete Points"));
}

int CPointTable::InsertLine(int row)
{
    if (!Current())
        return -1;
    constexpr double step = 1; // metres, behind the only point
    CCrossSection section = *Current();
    auto& points = section.points;
    const int last = static_cast<int>(points.size()) - 1;
    const int at = row < 0 ? last : std::min(row, last);
    CSectionPoint point;
    if (at >= 0) {
        point = points[std::size_t(at)];
        if (at < last) {
            const CSectionPoint& next = points[std::size_t(at) + 1];
            point = {std::midpoint(point.offset, next.offset), std::midpoint(point.level, next.level)};
        } else {
            point.offset += at > 0 ? point.offset - points[std::size_t(at) - 1].offset : step;
        }
    }
    points.insert(points.begin() + (at + 1), point);
    m_document.ReplaceSection(m_section, std::move(section), tr("Insert Point"));
    return at + 1;
}

int CPointTable::InsertText(int row, const QString& text)
{
    static const QRegularExpression lineEnd(QStringLiteral("\r\n|\r|\n")), separator(QStringLiteral("[\t;]"));
    const QStringList lines = text.split(lineEnd);
    if (!Current() || text.trimmed().isEmpty())
        return -1;
    std::vector<CSectionPoint> pasted;
    for (qsizetype i = 0; i < lines.size(); ++i) {
        if (lines[i].trimmed().isEmpty())
            continue;
        const QStringList cells = lines[i].split(separator);
        const auto offset = ReadQuantity(ColumnAt(Offset).group, cells.value(Offset));
        const auto level = ReadQuantity(ColumnAt(Level).group, cells.value(Level));
        if (!offset || !level || cells.size() != ColumnCount) {
            emit Refused(tr("Line %1 of the pasted text: expected an offset and a bed level, found \"%2\".")
                             .arg(i + 1)
                             .arg(lines[i].simplified()));
            return -1;
        }
        pasted.push_back({*offset, *level});
    }
    CCrossSection section = *Current();
    auto& points = section.points;
    const int last = static_cast<int>(points.size()) - 1;
    const int at = (row < 0 ? last : std::min(row, last)) + 1;
    points.insert(points.begin() + at, pasted.begin(), pasted.end());
    if (const QString reason = m_document.WhyNot(m_section, section); !reason.isEmpty()) {
        emit Refused(tr("The pasted text does not fit here: %1").arg(reason));
        return -1;
    }
    m_document.ReplaceSection(m_section, std::move(section), tr("Paste Points"));
    return at + static_cast<int>(pasted.size()) - 1;
}
