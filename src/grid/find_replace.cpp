#include "grid/find_replace.h"

#include "grid/cell_operations.h"
#include "grid/cell_text.h"
#include "grid/row_filter.h"
#include "ks/units/formula.h"

#include <algorithm>
#include <memory>

namespace {

bool IsText(const ColumnSpec& column)
{
    return !column.IsNumeric() && column.Kind() != CellKind::Button;
}

bool FindsEmptyCells(const ReplaceQuery& query)
{
    return query.find.trimmed() == QStringLiteral("\"\"");
}

Qt::CaseSensitivity CaseOf(const ReplaceQuery& query)
{
    return query.isCaseSensitive ? Qt::CaseSensitive : Qt::CaseInsensitive;
}

/// Puts what takes the place of a cell's value into the results.
using Replacer = std::function<void(int row, int column, const CellValue& before)>;

void AddText(CCellResults& results, const ColumnSpec& spec, int row, int column, const CellValue& before,
             const CellReading& after)
{
    if (!after.refusal.isEmpty())
        results.Keep(row, column, after.refusal);
    else
        results.Add(row, column, before,
                    std::holds_alternative<std::monostate>(after.value) ? spec.EmptyValue() : after.value);
}

Replacer TextReplacer(CCellResults& results, const ColumnSpec& spec, const ReplaceQuery& query)
{
    const bool isPart = IsText(spec) && !query.isWholeCell && !FindsEmptyCells(query);
    if (!isPart)
        return [&results, &spec, after = ReadCell(spec, query.with)](int row, int column, const CellValue& before) {
            AddText(results, spec, row, column, before, after);
        };
    return [&results, &spec, &query](int row, int column, const CellValue& before) {
        const QString text = EditText(spec, before).replace(query.find, query.with, CaseOf(query));
        AddText(results, spec, row, column, before, ReadCell(spec, text));
    };
}

Replacer FormulaReplacer(CCellResults& results, const CTableRows& rows, int column, const ReplaceQuery& query)
{
    const FormulaNames names = NamesForFormula(rows);
    const auto formula = std::make_shared<CKsFormula>(query.with.trimmed().sliced(1), names.names);
    if (!formula->Fault().isEmpty()) // a column that another table has, say
        return
            [&results, fault = formula->Fault()](int row, int at, const CellValue&) { results.Keep(row, at, fault); };
    return [&results, formula, cells = CCellFormula(rows, *formula, names, column)](
               int row, int, const CellValue&) mutable { cells.Add(results, row); };
}

} // namespace

std::function<bool(const CellValue& value)> CellFinder(const ColumnSpec& column, const ReplaceQuery& query)
{
    if (query.find.isEmpty() || column.Kind() == CellKind::Button)
        return {};
    if (column.IsNumeric() || FindsEmptyCells(query)) {
        const auto condition = std::make_shared<CCellFilter>(column, query.find);
        if (condition->IsForAll()) // as yet no number
            return {};
        return [condition](const CellValue& value) { return condition->Passes(value); };
    }
    return [&column, text = query.find, isWhole = query.isWholeCell, letters = CaseOf(query)](const CellValue& value) {
        const QString cell = EditText(column, value);
        return isWhole ? cell.compare(text, letters) == 0 : cell.contains(text, letters);
    };
}

CReplaced ReplaceCells(const CTableRows& rows, const CellBlock& block, const ReplaceQuery& query)
{
    CReplaced replaced{CCellResults(rows, CellBlock())}; // how many there are nobody knows yet
    const int last = std::min(block.bottom, rows.StoredRows() - 1);
    for (int column = block.left; column <= block.right; ++column) {
        const ColumnSpec& spec = rows.Column(column);
        const auto finds = CellFinder(spec, query);
        if (!finds || (query.IsFormula() && !spec.IsNumeric()))
            continue;
        const Replacer replace = query.IsFormula() ? FormulaReplacer(replaced.results, rows, column, query)
                                                   : TextReplacer(replaced.results, spec, query);
        for (int row = block.top; row <= last; ++row) {
            const CellValue before = rows.Value(row, column);
            if (!finds(before))
                continue;
            ++replaced.found;
            replace(row, column, before);
        }
    }
    return replaced;
}
