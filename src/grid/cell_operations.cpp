#include "grid/cell_operations.h"

#include "base/not_given.h"
#include "grid/cell_text.h"
#include "grid/grid_texts.h"
#include "grid/saved_lines.h"
#include "ks/fc/branch_name.h"
#include "ks/units/formula.h"

#include <QRegularExpression>
#include <algorithm>
#include <cmath>
#include <map>
#include <ranges>
#include <span>

namespace {

/// In the unit shown; nothing for an empty cell and for what is no number.
std::optional<double> ShownNumber(const ColumnSpec& column, const CellValue& value)
{
    if (const auto* integer = std::get_if<std::int32_t>(&value))
        return *integer;
    const auto* number = std::get_if<double>(&value);
    if (!number || IsEmptyCell(column, value) || std::isnan(*number))
        return std::nullopt;
    return column.style.UnitConvertFromBase(*number, 1);
}
std::optional<double> ShownNumber(const CTableRows& rows, int row, int column)
{
    return ShownNumber(rows.Column(column), rows.Value(row, column));
}

template <typename Do>
void ForCells(const CTableRows& rows, const CellBlock& block, const Do& action)
{
    const int last = std::min(block.bottom, rows.StoredRows() - 1);
    for (int column = block.left; column <= block.right; ++column)
        for (int row = block.top; row <= last; ++row)
            action(row, column);
}

} // namespace

// ---- fill --------------------------------------------------------------------------------------

CCellResults FillDown(const CTableRows& rows, CellBlock block)
{
    if (block.top == block.bottom)
        block.top = std::max(block.top - 1, 0);
    CCellResults results(rows, block);
    ForCells(rows, {block.top + 1, block.left, block.bottom, block.right}, [&](int row, int column) {
        if (rows.Column(column).Kind() == CellKind::Button)
            return;
        // Of the row for global values, cells of columns that have none say nothing, or what the row is called.
        const bool isNone = block.top < rows.FixedRows() && rows.IsLocked(block.top, column);
        if (isNone)
            results.Keep(row, column, GridTexts::tr("There is no value above to fill it with."));
        else
            results.Add(row, column, rows.Value(row, column), rows.Value(block.top, column));
    });
    return results;
}

CCellResults Clear(const CTableRows& rows, const CellBlock& block)
{
    CCellResults results(rows, block);
    ForCells(rows, block, [&](int row, int column) {
        const ColumnSpec& spec = rows.Column(column);
        if (spec.Kind() == CellKind::Button)
            return;
        if (spec.isRequired)
            results.Keep(row, column, ReadCell(spec, {}).refusal);
        else
            results.Add(row, column, rows.Value(row, column), spec.fill ? spec.FillValue() : spec.EmptyValue());
    });
    return results;
}

CCellResults ResetToGlobal(const CTableRows& rows, const CellBlock& block)
{
    CCellResults results(rows, block);
    ForCells(rows, block, [&](int row, int column) {
        if (const ColumnSpec& spec = rows.Column(column); spec.fill && row >= rows.FixedRows())
            results.Add(row, column, rows.Value(row, column), spec.GlobalValue());
    });
    return results;
}

CCellResults RevertToSaved(const CTableRows& rows, const CSavedLines& saved, const CellBlock& block)
{
    CCellResults results(rows, block);
    const int last = std::min(block.bottom, rows.StoredRows() - 1);
    for (int row = std::max(block.top, rows.FixedRows()); row <= last; ++row) {
        const CSavedLines::Line line = saved.Find(row);
        for (int column = block.left; column <= block.right; ++column) {
            if (const auto before = saved.Before(line, row, column))
                results.PutBack(row, column, rows.Value(row, column), *before);
            else if (line.origin == KsLineOrigin::New)
                results.Keep(row, column, GridTexts::tr("The line is new since the last save."));
            else if (line.origin == KsLineOrigin::Unknown)
                results.Keep(row, column, GridTexts::tr("What the line was at the last save is not known."));
        }
    }
    return results;
}

double StepOf(const CTableRows& rows, const CellBlock& block)
{
    const auto isNumber = [&](int column) { return rows.Column(column).IsNumeric(); };
    for (int column = block.left; column <= block.right && block.bottom > block.top; ++column) {
        if (!isNumber(column))
            continue;
        const auto first = ShownNumber(rows, block.top, column), second = ShownNumber(rows, block.top + 1, column);
        if (!first || !second)
            return 0;
        return KsFifteenDigits(*second - *first, std::max(std::fabs(*first), std::fabs(*second)));
    }
    return 0;
}

CCellResults FillSeries(const CTableRows& rows, const CellBlock& block, double step)
{
    CCellResults results(rows, block);
    std::optional<double> first;
    ForCells(rows, block, [&](int row, int column) {
        if (!rows.Column(column).IsNumeric())
            return;
        if (row == block.top) {
            first = ShownNumber(rows, row, column);
            if (!first)
                results.Keep(row, column, GridTexts::tr("The cell is empty."));
        } else if (first) {
            results.AddShown(row, column, rows.Value(row, column), *first + step * (row - block.top));
        }
    });
    return results;
}

// ---- interpolate -------------------------------------------------------------------------------

namespace {

constexpr int BranchColumn = 0, ChainageColumn = 1;

struct LineOfBranch
{
    double chainage;
    std::uint32_t line; // of the source: what is known of a line that is hidden is known
    int row;            // where it is shown

    bool IsIn(const CellBlock& block) const { return row >= block.top && row <= block.bottom; }
};
using Branches = std::vector<std::vector<LineOfBranch>>;

/// The lines of each branch by chainage. Lines of one branch mostly follow each other.
Branches LinesByBranch(const CTableRows& rows, const CellBlock& block, CCellResults& results)
{
    std::map<QString, std::size_t> places;
    Branches branches;
    std::string last;
    std::size_t place = 0;
    IRowSource& source = *rows.Rows();
    const CellAccess &names = *rows.Column(BranchColumn).access, &chainages = *rows.Column(ChainageColumn).access;
    for (std::size_t line = source.FixedRows(), end = source.Count(); line < end; ++line) {
        const int row = rows.ShownRow(line);
        const void* const object = source.At(line);
        const CellValue name = names.get(object), chainage = chainages.get(object);
        const auto& branch = std::get<std::string>(name);
        const auto* number = std::get_if<double>(&chainage);
        const bool isInBlock = row >= block.top && row <= block.bottom;
        if (branch.empty() || !number || *number == NotGiven) {
            if (isInBlock)
                results.Keep(row, ChainageColumn, GridTexts::tr("The line has no branch or no chainage."));
            continue;
        }
        if (branches.empty() || branch != last) {
            place = places.try_emplace(KsBranchKey(QString::fromStdString(branch)), branches.size()).first->second;
            branches.resize(std::max(branches.size(), place + 1));
            last = branch;
        }
        branches[place].push_back({*number, std::uint32_t(line), row});
    }
    for (auto& lines : branches)
        if (!std::ranges::is_sorted(lines, {}, &LineOfBranch::chainage))
            std::ranges::stable_sort(lines, {}, &LineOfBranch::chainage);
    return branches;
}

struct Known
{
    double chainage, value;
};

/// On the line through the two known values around the chainage, or the two nearest ones.
std::optional<double> OnLine(const std::vector<Known>& known, double chainage, bool extrapolates)
{
    if (known.empty())
        return std::nullopt;
    const bool isBeyond = chainage < known.front().chainage || chainage > known.back().chainage;
    if (isBeyond && (!extrapolates || known.size() == 1))
        return std::nullopt;
    auto after = std::ranges::lower_bound(known, chainage, {}, &Known::chainage);
    if (after != known.end() && after->chainage == chainage)
        return after->value;
    after = std::clamp(after, known.begin() + 1, known.end() - 1);
    const auto before = after - 1;
    const double part = (chainage - before->chainage) / (after->chainage - before->chainage);
    return before->value + part * (after->value - before->value);
}

/// The first of the lines that is in the block, or is not, and has a value.
std::optional<Known> FirstKnown(const CTableRows& rows, auto lines, const CellBlock& block, int column, bool isInBlock)
{
    const ColumnSpec& spec = rows.Column(column);
    for (const LineOfBranch& line : lines) {
        if (line.IsIn(block) != isInBlock)
            continue;
        if (const auto value = ShownNumber(spec, spec.access->get(rows.Rows()->At(line.line))))
            return Known{line.chainage, *value};
    }
    return std::nullopt;
}

/// Of two values at one place the first one counts, or at the end of the block the last.
std::vector<Known> KnownOf(const CTableRows& rows, const std::vector<LineOfBranch>& lines, const CellBlock& block,
                           int column, KnownValues which)
{
    std::vector<Known> known;
    const auto add = [&known](const std::optional<Known>& value) {
        if (value && (known.empty() || known.back().chainage != value->chainage))
            known.push_back(*value);
    };
    if (which == KnownValues::Ends) {
        add(FirstKnown(rows, std::views::all(lines), block, column, true));
        add(FirstKnown(rows, std::views::reverse(lines), block, column, true));
        return known;
    }
    for (std::size_t line = 0; line < lines.size(); ++line)
        add(FirstKnown(rows, std::span(lines).subspan(line, 1), block, column, false));
    return known;
}

} // namespace

CCellResults Interpolate(const CTableRows& rows, const CellBlock& block, KnownValues which, bool extrapolates)
{
    CCellResults results(rows, block);
    const Branches branches = LinesByBranch(rows, block, results);
    for (int column = std::max(block.left, ChainageColumn + 1); column <= block.right; ++column) {
        if (rows.Column(column).Kind() != CellKind::Number)
            continue;
        for (const auto& lines : branches) {
            if (std::ranges::none_of(lines, [&block](const LineOfBranch& line) { return line.IsIn(block); }))
                continue;
            const std::vector<Known> known = KnownOf(rows, lines, block, column, which);
            for (const LineOfBranch& line : lines) {
                if (!line.IsIn(block))
                    continue;
                if (const auto value = OnLine(known, line.chainage, extrapolates))
                    results.AddShown(line.row, column, rows.Value(line.row, column), *value);
                else
                    results.Keep(line.row, column, GridTexts::tr("There is no known value on both sides of it."));
            }
        }
    }
    return results;
}

// ---- calculate ---------------------------------------------------------------------------------

FormulaNames NamesForFormula(const CTableRows& rows)
{
    static const QRegularExpression separator(QStringLiteral("[^\\p{L}\\p{N}]+"));
    FormulaNames result{{QStringLiteral("value")}, {-1}};
    const auto add = [&result](const QString& name, int column) {
        if (name.isEmpty() || result.names.contains(name))
            return;
        result.names << name;
        result.columns.push_back(column);
    };
    const auto asName = [](const QString& text) {
        const QString name = text.split(separator, Qt::SkipEmptyParts).join(u'_');
        return name.isEmpty() || !name.front().isDigit() ? name : u'_' + name;
    };
    for (int column = 0; column < int(rows.Columns().size()); ++column) {
        if (!rows.Column(column).IsNumeric())
            continue;
        const QString name = asName(rows.Column(column).header().section(u'[', 0, 0));
        add(name, column);
        add(name.toLower(), column);
        add(asName(QString::fromUtf8(rows.Column(column).name)), column); // in every language
    }
    return result;
}

CCellFormula::CCellFormula(const CTableRows& rows, const CKsFormula& formula, const FormulaNames& names)
    : m_rows(&rows), m_formula(&formula), m_numbers(names.columns.size())
{
    for (std::size_t name = 0; name < names.columns.size(); ++name)
        if (formula.Uses(name))
            m_used.emplace_back(name, names.columns[name]);
}

void CCellFormula::Add(CCellResults& results, int row, int column, const CellValue& before)
{
    for (const auto& [name, from] : m_used) {
        const auto number = from < 0 ? ShownNumber(m_rows->Column(column), before) : ShownNumber(*m_rows, row, from);
        if (!number)
            return results.Keep(row, column, GridTexts::tr("A cell that the formula names is empty."));
        m_numbers[name] = *number;
    }
    results.AddShown(row, column, before, m_formula->Value(m_numbers));
}

CCellResults Calculate(const CTableRows& rows, const CellBlock& block, const CKsFormula& formula,
                       const FormulaNames& names)
{
    CCellFormula cells(rows, formula, names);
    CCellResults results(rows, block);
    ForCells(rows, block, [&](int row, int column) {
        if (rows.Column(column).IsNumeric())
            cells.Add(results, row, column, rows.Value(row, column));
    });
    return results;
}
