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
        if (const GlobalPlace global = rows.Column(column).Global(); global && row >= rows.FixedRows())
            results.Add(row, column, rows.Value(row, column), global.Value());
    });
    return results;
}

CCellResults RevertToSaved(const CTableRows& rows, const CSavedLines& saved, const CellBlock& block)
{
    CCellResults results(rows, block);
    const int last = std::min(block.bottom, rows.StoredRows() - 1);
    for (int row = block.top; row < rows.FixedRows(); ++row)
        for (int column = block.left; column <= block.right; ++column)
            results.Keep(row, column, GridTexts::tr("Only lines can be reverted; global values can be undone."));
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
    for (int column = block.left; column <= block.right && block.bottom > block.top; ++column) {
        if (!rows.Column(column).IsNumeric())
            continue;
        const CShownNumbers numbers(rows, column);
        const double first = numbers.At(block.top), second = numbers.At(block.top + 1);
        if (std::isnan(first) || std::isnan(second))
            return 0;
        return KsFifteenDigits(second - first, std::max(std::fabs(first), std::fabs(second)));
    }
    return 0;
}

CCellResults FillSeries(const CTableRows& rows, const CellBlock& block, double step)
{
    CCellResults results(rows, block);
    const int last = std::min(block.bottom, rows.StoredRows() - 1);
    for (int column = block.left; column <= block.right && block.top <= last; ++column) {
        if (!rows.Column(column).IsNumeric())
            continue;
        const double first = CShownNumbers(rows, column).At(block.top);
        if (std::isnan(first)) {
            results.Keep(block.top, column, GridTexts::tr("The cell is empty."));
            continue;
        }
        for (int row = block.top + 1; row <= last; ++row)
            results.AddShown(row, column, first + step * (row - block.top));
    }
    return results;
}

// ---- interpolate -------------------------------------------------------------------------------

namespace {

constexpr int BranchColumn = 0, ChainageColumn = 1;

struct LineOfBranch
{
    double chainage;
    const void* object; // of the source: what is known of a line that is hidden is known
    int row;            // where it is shown

    bool IsIn(const CellBlock& block) const { return row >= block.top && row <= block.bottom; }
};
/// Lines of the source that follow each other.
struct Run
{
    std::size_t first, end;
};
/// All lines of a branch; mostly it is one run.
using Branch = std::vector<Run>;

void KeepUnplaced(CCellResults& results, int row, const CellBlock& block)
{
    if (row >= block.top && row <= block.bottom)
        results.Keep(row, ChainageColumn, GridTexts::tr("The line has no branch or no chainage."));
}

std::vector<Branch> BranchesOf(const CTableRows& rows, const CellBlock& block, CCellResults& results)
{
    std::map<QString, std::size_t> places;
    std::vector<Branch> branches;
    IRowSource& source = *rows.Rows();
    const CellAccess& names = *rows.Column(BranchColumn).access;
    CellValue copy;
    const std::size_t end = source.Count();
    for (std::size_t line = source.FixedRows(); line < end;) {
        const std::size_t first = line;
        const std::string branch = *names.TextIn(source.At(first), copy);
        for (++line; line < end && *names.TextIn(source.At(line), copy) == branch;)
            ++line;
        if (branch.empty()) {
            for (std::size_t unplaced = first; unplaced < line; ++unplaced)
                KeepUnplaced(results, rows.ShownRow(unplaced), block);
            continue;
        }
        const auto place = places.try_emplace(KsBranchKey(QString::fromStdString(branch)), branches.size()).first;
        branches.resize(std::max(branches.size(), place->second + 1));
        branches[place->second].push_back({first, line});
    }
    return branches;
}

/// Those with a chainage, in the order of that.
void GetLines(std::vector<LineOfBranch>& lines, const Branch& branch, const CTableRows& rows, const CellBlock& block,
              CCellResults& results)
{
    const CellAccess& chainages = *rows.Column(ChainageColumn).access;
    CellValue copy;
    lines.clear();
    for (const Run& run : branch) {
        for (std::size_t line = run.first; line < run.end; ++line) {
            const int row = rows.ShownRow(line);
            const void* const object = rows.Rows()->At(line);
            const double* const chainage = chainages.NumberIn(object, copy);
            if (chainage && *chainage != NotGiven)
                lines.push_back({*chainage, object, row});
            else
                KeepUnplaced(results, row, block);
        }
    }
    if (!std::ranges::is_sorted(lines, {}, &LineOfBranch::chainage))
        std::ranges::stable_sort(lines, {}, &LineOfBranch::chainage);
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
std::optional<Known> FirstKnown(const CShownNumbers& numbers, auto lines, const CellBlock& block, bool isInBlock)
{
    for (const LineOfBranch& line : lines) {
        if (line.IsIn(block) != isInBlock)
            continue;
        if (const double value = numbers.In(line.object); !std::isnan(value))
            return Known{line.chainage, value};
    }
    return std::nullopt;
}

/// Of two values at one place the first one counts, or at the end of the block the last.
std::vector<Known> KnownOf(const std::vector<LineOfBranch>& lines, const CellBlock& block, const CShownNumbers& numbers,
                           KnownValues which)
{
    std::vector<Known> known;
    const auto add = [&known](const std::optional<Known>& value) {
        if (value && (known.empty() || known.back().chainage != value->chainage))
            known.push_back(*value);
    };
    if (which == KnownValues::Ends) {
        add(FirstKnown(numbers, std::views::all(lines), block, true));
        add(FirstKnown(numbers, std::views::reverse(lines), block, true));
        return known;
    }
    for (std::size_t line = 0; line < lines.size(); ++line)
        add(FirstKnown(numbers, std::span(lines).subspan(line, 1), block, false));
    return known;
}

} // namespace

CCellResults Interpolate(const CTableRows& rows, const CellBlock& block, KnownValues which, bool extrapolates)
{
    CCellResults results(rows, block);
    std::vector<std::pair<int, CShownNumbers>> columns;
    for (int column = std::max(block.left, ChainageColumn + 1); column <= block.right; ++column)
        if (rows.Column(column).Kind() == CellKind::Number)
            columns.emplace_back(column, CShownNumbers(rows, column));
    std::vector<LineOfBranch> lines;
    for (const Branch& branch : BranchesOf(rows, block, results)) {
        GetLines(lines, branch, rows, block, results);
        if (std::ranges::none_of(lines, [&block](const LineOfBranch& line) { return line.IsIn(block); }))
            continue;
        for (const auto& [column, numbers] : columns) {
            const std::vector<Known> known = KnownOf(lines, block, numbers, which);
            for (const LineOfBranch& line : lines) {
                if (!line.IsIn(block))
                    continue;
                if (const auto value = OnLine(known, line.chainage, extrapolates))
                    results.AddShown(line.row, column, rows.HasTyped() ? nullptr : line.object, *value);
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

CCellFormula::CCellFormula(const CTableRows& rows, const CKsFormula& formula, const FormulaNames& names, int column)
    : m_rows(&rows), m_column(column), m_formula(&formula)
{
    for (std::size_t name = 0; name < names.columns.size(); ++name)
        if (const int from = names.columns[name]; formula.Uses(name))
            m_used.push_back({&formula.Number(name), CShownNumbers(rows, from < 0 ? column : from)});
}

void CCellFormula::Add(CCellResults& results, int row)
{
    const void* const object = m_rows->UntouchedObject(row);
    for (const auto& [name, numbers] : m_used) {
        *name = numbers.At(row, object);
        if (std::isnan(*name))
            return results.Keep(row, m_column, GridTexts::tr("A cell that the formula names is empty."));
    }
    results.AddShown(row, m_column, object, m_formula->Value());
}

CCellResults Calculate(const CTableRows& rows, const CellBlock& block, const CKsFormula& formula,
                       const FormulaNames& names)
{
    CCellResults results(rows, block);
    const int last = std::min(block.bottom, rows.StoredRows() - 1);
    for (int column = block.left; column <= block.right; ++column) {
        if (!rows.Column(column).IsNumeric())
            continue;
        CCellFormula cells(rows, formula, names, column);
        for (int row = block.top; row <= last; ++row)
            cells.Add(results, row);
    }
    return results;
}
