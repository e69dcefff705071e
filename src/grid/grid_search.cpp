// Searching lines by branch name and chainage.
#include "data/river_pos.h"
#include "grid/cell_text.h"
#include "grid/gen_grid.h"
#include "grid/number_syntax.h"

#include <algorithm>

namespace {

enum ChainageCriterion
{
    Below = 0,
    Equal = 1,
    Above = 2,
    NotUsed = 3
};
enum NameCriterion
{
    Partial = 0,
    Full = 1
};

/// A chainage as the column's text says it; an empty cell reads as 0.
double AsShown(const ColumnSpec& column, double chainage)
{
    if (chainage == NotGiven)
        return 0;
    return ReadNumber(column.style.UnitConvertFromBase_T(chainage, 1).toStdString()).value_or(chainage);
}

/// A name of a file that was not written by this editor may have small letters.
std::string InCapitals(const std::string& name)
{
    const bool plain =
        std::none_of(name.begin(), name.end(), [](char c) { return (c >= 'a' && c <= 'z') || (c & 0x80); });
    return plain ? name : QString::fromStdString(name).toUpper().toStdString();
}

bool NamePasses(const std::string& name, const std::string& wanted, int criterion)
{
    if (wanted.empty())
        return true;
    return criterion == Partial ? name.starts_with(wanted) : criterion != Full || name == wanted;
}

bool ChainagePasses(double shown, double wanted, int criterion)
{
    switch (criterion) {
    case Below:
        return shown < wanted;
    case Equal:
        return shown == wanted;
    case Above:
        return shown > wanted;
    default:
        return criterion == NotUsed;
    }
}

} // namespace

bool CGenGrid::SearchRows(int& row, const QString& name, double chainage, int chainageCriterion, int nameCriterion)
{
    constexpr int NameColumn = 0, ChainageColumn = 1;
    const std::string wantedName = name.toUpper().toStdString(); // as the column stores them
    const ColumnSpec& chainageColumn = m_model->Columns()[ChainageColumn];
    const double wanted = AsShown(chainageColumn, chainage);
    for (row = std::max(row, m_model->FixedRows() + 1); row <= RowCount();) {
        const int line = row++ - 1;
        if (!NamePasses(InCapitals(std::get<std::string>(m_model->Value(line, NameColumn))), wantedName, nameCriterion))
            continue;
        if (chainageCriterion != NotUsed) {
            const CellValue value = m_model->Value(line, ChainageColumn);
            const auto* number = std::get_if<double>(&value);
            if (!ChainagePasses(AsShown(chainageColumn, number ? *number : NotGiven), wanted, chainageCriterion))
                continue;
        }
        clearSelection();
        GotoLine(line + 1);
        return true;
    }
    row = 0;
    return false;
}
