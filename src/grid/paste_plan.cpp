#include "grid/paste_plan.h"

#include "files/read_number.h"
#include "grid/branch_lines.h"
#include "grid/grid_texts.h"
#include "ks/units/typed_number.h"
#include "ks/units/unit_groups.h"

#include <algorithm>
#include <cmath>
#include <set>

namespace {

constexpr std::size_t Nowhere = std::size_t(-1), New = Nowhere - 1;
constexpr int MostRuleFaults = 20; // each is looked for among all rows

QString BaseSymbol(UnitGroup quantity)
{
    const KsUnitGroupRow* row = KsFindUnitGroup(quantity);
    return row ? QString::fromUtf8(row->base.symbol) : QString();
}

/// Whether numbers with the unit may stand in the column.
bool IsUnitOf(const ColumnSpec& column, const QString& unit)
{
    return unit == column.UnitSymbol() || KsTypedUnitFactor(column.style.Group(), unit);
}

} // namespace

PasteChoice AsItStands(const CTableRows& rows, const CopiedTable& copied, int row, int column)
{
    PasteChoice choice{.row = row};
    const int count = int(rows.Columns().size());
    for (int i = 0; i < copied.texts.Columns(); ++i)
        choice.columns.emplace_back(column + i < count ? column + i : -1);
    TakeUnits(rows, copied, choice);
    return choice;
}

void TakeUnits(const CTableRows& rows, const CopiedTable& copied, PasteChoice& choice)
{
    for (std::size_t i = 0; i < copied.columns.size(); ++i) {
        auto& [target, unit] = choice.columns[i];
        const QString& own = copied.columns[i].unit;
        if (target >= 0 && !own.isEmpty() && IsUnitOf(rows.Column(target), own))
            unit = own == rows.Column(target).UnitSymbol() ? QString() : own;
    }
}

CPastePlan::CPastePlan(const CTableRows& rows, const CopiedTable& copied, PasteChoice choice)
    : m_rows(&rows), m_copied(&copied), m_choice(std::move(choice)), m_first(m_choice.hasHeaders)
{
    m_values.resize(std::size_t(Columns()));
    m_left.resize(std::size_t(Columns()));
    FindComplaint();
    FindRows();
    for (int column = 0; column < Columns(); ++column)
        ReadColumn(column);
    FindRuleFaults();
    std::ranges::stable_sort(m_faults, {}, [](const Fault& fault) { return std::pair(fault.line, fault.column); });
}

void CPastePlan::FindComplaint()
{
    std::set<int> targets;
    for (const auto& column : m_choice.columns) {
        if (column.target < 0)
            continue;
        const ColumnSpec& target = m_rows->Column(column.target);
        if (!targets.insert(column.target).second)
            m_complaint = GridTexts::tr("Two columns go to \"%1\".").arg(target.header());
        else if (!column.unit.isEmpty() && !IsUnitOf(target, column.unit))
            m_complaint = GridTexts::tr("\"%1\" is no unit of \"%2\". Possible are %3.")
                              .arg(column.unit, target.header(),
                                   KsTypedUnits(target.style, target.UnitSymbol()).join(QStringLiteral(", ")));
    }
    if (targets.empty())
        m_complaint = GridTexts::tr("No column goes anywhere.");
    else if (m_choice.place == PastePlace::ByPlace && !(targets.contains(0) && targets.contains(1)))
        m_complaint = GridTexts::tr("Which line is which is told by \"%1\" and \"%2\": columns have to go there.")
                          .arg(m_rows->Column(0).header(), m_rows->Column(1).header());
}

// ---- lines -------------------------------------------------------------------------------------

void CPastePlan::FindRows()
{
    m_rowOf.assign(Lines(), New);
    const int stored = m_rows->StoredRows();
    if (m_choice.place == PastePlace::AtCell) {
        const std::size_t there = std::size_t(std::max(stored - m_choice.row, 0));
        for (std::size_t line = 0; line < std::min(Lines(), there); ++line)
            m_rowOf[line] = m_rows->SourceRow(m_choice.row + int(line));
    } else if (m_choice.place == PastePlace::ByPlace && m_complaint.isEmpty()) {
        FindRowsByPlace();
    }
    if (m_rows->Rows()->MayGrow())
        return;
    for (std::size_t line = 0; line < Lines(); ++line) {
        if (m_rowOf[line] != New)
            continue;
        m_rowOf[line] = Nowhere;
        AddFault(line, -1,
                 m_choice.place == PastePlace::AtCell ? GridTexts::tr("From line %1 on the table has only %2 lines.")
                                                            .arg(m_rows->LineNumber(m_choice.row))
                                                            .arg(stored - m_choice.row)
                                                      : GridTexts::tr("The table takes no new lines."));
    }
}

void CPastePlan::FindRowsByPlace()
{
    const auto from = [this](int target) {
        return int(std::ranges::find(m_choice.columns, target, &PasteChoice::Column::target) -
                   m_choice.columns.begin());
    };
    const int branch = from(0), chainage = from(1);
    CPlacesInTable places(*m_rows);
    for (std::size_t line = 0; line < Lines(); ++line) {
        if (std::max(branch, chainage) >= m_copied->texts.Width(line + m_first))
            continue;
        const CellValue name = Read(line, branch).value, number = Read(line, chainage).value;
        if (std::holds_alternative<std::string>(name) && std::holds_alternative<double>(number))
            m_rowOf[line] = places.Take(QString::fromStdString(std::get<std::string>(name)), std::get<double>(number))
                                .value_or(New);
    }
}

std::optional<std::size_t> CPastePlan::RowOf(std::size_t line) const
{
    return m_rowOf[line] == New || m_rowOf[line] == Nowhere ? std::nullopt : std::optional(m_rowOf[line]);
}

bool CPastePlan::IsNew(std::size_t line) const
{
    return m_rowOf[line] == New;
}

std::size_t CPastePlan::NewLines() const
{
    return std::size_t(std::ranges::count(m_rowOf, New));
}

std::size_t CPastePlan::HiddenLines() const
{
    return std::size_t(std::ranges::count_if(
        m_rowOf, [this](std::size_t row) { return row != New && row != Nowhere && m_rows->ShownRow(row) < 0; }));
}

bool CPastePlan::HasShorterLines() const
{
    for (std::size_t line = 0; line < Lines(); ++line)
        if (m_copied->texts.Width(line + m_first) < Columns())
            return true;
    return false;
}

/// The cells of the column say which line theirs is, and stay as they are.
bool CPastePlan::NamesLine(int column) const
{
    const int target = m_choice.columns[std::size_t(column)].target;
    return m_choice.place == PastePlace::ByPlace && target >= 0 && target <= 1;
}

// ---- cells -------------------------------------------------------------------------------------

/// The number in base units that belongs to a text; empty where none does.
QStringView CPastePlan::WholeNumber(std::size_t line, int column) const
{
    if (!m_copied->numbers)
        return {};
    const auto& [quantity, unit] = m_copied->columns[std::size_t(column)];
    const QStringView whole = m_copied->numbers->At(line + m_first, column);
    const auto number = KsReadNumber(whole, CKsEditStyle());
    const auto shown = KsReadNumber(m_copied->texts.At(line + m_first, column), CKsEditStyle());
    const auto factor = KsTypedUnitFactor(quantity, unit);
    // What is on the clipboard may come from anywhere: the text is what users see there.
    const bool belongs =
        number && shown && factor && std::abs(*shown * double(*factor) - *number) <= 1e-9 * std::abs(*number);
    return belongs ? whole : QStringView();
}

/// A number with its unit: to the last digit where the table that it comes from has it so.
QString CPastePlan::NumberText(std::size_t line, int column) const
{
    const auto& [target, unit] = m_choice.columns[std::size_t(column)];
    const QStringView text = m_copied->texts.At(line + m_first, column);
    const ColumnSpec& spec = m_rows->Column(target);
    if (const QStringView number = WholeNumber(line, column); !number.isEmpty()) {
        const auto& own = m_copied->columns[std::size_t(column)];
        const QString base = BaseSymbol(own.quantity);
        if (own.unit == (unit.isEmpty() ? spec.UnitSymbol() : unit) && IsUnitOf(spec, base))
            return number.toString() + u' ' + base;
    }
    const QString plain = m_choice.decimal ? PlainNumber(text, *m_choice.decimal) : text.toString();
    return !unit.isEmpty() && IsValidNumber(plain.toStdString()) ? plain + u' ' + unit : plain;
}

/// A number is one that may be typed into the cell.
bool CPastePlan::IsAsTyped(int column) const
{
    return m_choice.columns[std::size_t(column)].unit.isEmpty() && !m_copied->numbers &&
           m_choice.decimal != DecimalSign::Comma;
}

CellReading CPastePlan::Read(std::size_t line, int column) const
{
    const ColumnSpec& spec = m_rows->Column(m_choice.columns[std::size_t(column)].target);
    const QStringView text = m_copied->texts.At(line + m_first, column);
    if (!spec.IsNumeric() || IsAsTyped(column)) {
        CellReading read = ReadCell(spec, text);
        if (read.refusal.isEmpty() || !spec.IsNumeric() || !m_choice.decimal)
            return read;
    }
    return ReadCell(spec, NumberText(line, column));
}

void CPastePlan::Leave(std::size_t line, int column)
{
    auto& left = m_left[std::size_t(column)];
    left.resize(Lines());
    left[line] = true;
}

void CPastePlan::ReadColumn(int column)
{
    const int target = m_choice.columns[std::size_t(column)].target;
    if (target < 0)
        return;
    const ColumnSpec& spec = m_rows->Column(target);
    const bool isKey = NamesLine(column);
    const bool isPlain = spec.Kind() == CellKind::Number && !spec.locked && IsAsTyped(column);
    const CellValue nothing = m_rows->Resolved(target, {}, BlankRule::Fill); // as a cell that is cleared
    CCellValues& values = m_values[std::size_t(column)];
    CellReading read;
    QStringView last;
    for (std::size_t line = 0; line < Lines(); ++line) {
        const std::size_t row = m_rowOf[line];
        const bool isThere = column < m_copied->texts.Width(line + m_first);
        if (!isThere || row == Nowhere || (isKey && row != New)) {
            values.Add(nothing, Lines());
            Leave(line, column);
            m_cellCount += isThere && isKey && row != Nowhere;
            continue;
        }
        const QStringView text = m_copied->texts.At(line + m_first, column);
        if (const auto number = isPlain ? ReadPlainNumber(spec, text) : std::nullopt) {
            values.Add(*number, Lines()); // nearly all of a large table
            ++m_cellCount;
            continue;
        }
        if (spec.IsNumeric() || text != last || last.isNull()) // names of branches come many times in turn
            read = Read(line, column);
        last = text;
        bool isLeft = false;
        if (row != New && (!spec.IsNumeric() || !read.refusal.isEmpty() || spec.locked)) {
            const void* const object = m_rows->Rows()->At(row);
            isLeft = text == EditText(spec, spec.access->get(object)); // may be what nobody could type
            if (!isLeft && spec.IsLocked(object))
                read.refusal = GridTexts::tr("The cell is locked.");
        }
        if (!isLeft && !read.refusal.isEmpty())
            AddFault(line, column, read.refusal);
        else
            ++m_cellCount;
        if (isLeft || !read.refusal.isEmpty()) {
            Leave(line, column);
            values.Add(nothing, Lines());
            last = {};
        } else {
            values.Add(m_rows->Resolved(target, read.value, BlankRule::Fill), Lines());
        }
    }
}

void CPastePlan::AddFault(std::size_t line, int column, const QString& reason)
{
    m_faults.push_back({line, column, reason});
}

/// How many texts of the line have a cell that takes them.
std::size_t CPastePlan::CellsOf(std::size_t line) const
{
    std::size_t count = 0;
    for (int column = 0; column < std::min(Columns(), m_copied->texts.Width(line + m_first)); ++column)
        count += m_choice.columns[std::size_t(column)].target >= 0;
    return count - std::size_t(std::ranges::count_if(m_faults, [line](const Fault& fault) {
               return fault.line == line && fault.column >= 0;
           }));
}

/// Rows that depend on each other: those that do not fit are left out one by one.
void CPastePlan::FindRuleFaults()
{
    if (!m_complaint.isEmpty() || !m_rows->Rows()->HasRules())
        return;
    for (int i = 0; i < MostRuleFaults; ++i) {
        std::vector<std::size_t> lines;
        for (std::size_t line = 0; line < Lines(); ++line)
            if (m_rowOf[line] != Nowhere)
                lines.push_back(line);
        const auto fault = m_rows->Fault(Cells(m_values, m_left));
        if (!fault)
            return;
        const std::size_t line = lines[fault->row];
        m_cellCount -= CellsOf(line);
        AddFault(line, -1, fault->text);
        m_rowOf[line] = Nowhere;
    }
    m_complaint = m_faults.back().reason;
}

PastedCells CPastePlan::TakeCells()
{
    return Cells(std::move(m_values), std::move(m_left));
}

PastedCells CPastePlan::Cells(std::vector<CCellValues> values, std::vector<std::vector<bool>> left) const
{
    PastedCells cells;
    cells.rows.reserve(Lines());
    std::size_t next = m_rows->Rows()->Count();
    for (const std::size_t row : m_rowOf)
        if (row != Nowhere)
            cells.rows.push_back(row == New ? next++ : row);
    for (int column = 0; column < Columns(); ++column) {
        const int target = m_choice.columns[std::size_t(column)].target;
        if (target < 0)
            continue;
        PastedCells::Column place{target, std::move(values[std::size_t(column)]), std::move(left[std::size_t(column)])};
        if (cells.rows.size() < Lines())
            place = WithoutLinesThatGoNowhere(std::move(place));
        cells.columns.push_back(std::move(place));
    }
    return cells;
}

PastedCells::Column CPastePlan::WithoutLinesThatGoNowhere(PastedCells::Column column) const
{
    PastedCells::Column kept{column.column, {}, {}};
    for (std::size_t line = 0; line < Lines(); ++line) {
        if (m_rowOf[line] == Nowhere)
            continue;
        kept.values.Add(column.values[line]);
        kept.left.push_back(column.Leaves(line));
    }
    return kept;
}

bool CPastePlan::IsClean() const
{
    return m_faults.empty() && m_complaint.isEmpty() &&
           std::ranges::none_of(m_choice.columns, [](const auto& column) { return column.target < 0; });
}

QString CPastePlan::Text(std::size_t line, int column) const
{
    return column < m_copied->texts.Width(line + m_first) ? m_copied->texts.At(line + m_first, column).toString()
                                                          : QString();
}

QString CPastePlan::Understood(std::size_t line, int column) const
{
    const int target = m_choice.columns[std::size_t(column)].target;
    const auto& left = m_left[std::size_t(column)];
    if (const auto row = RowOf(line); row && NamesLine(column)) {
        const ColumnSpec& spec = m_rows->Column(target);
        return EditText(spec, spec.access->get(m_rows->Rows()->At(*row)));
    }
    if (target < 0 || (!left.empty() && left[line]))
        return Text(line, column);
    return EditText(m_rows->Column(target), m_values[std::size_t(column)][line]);
}
