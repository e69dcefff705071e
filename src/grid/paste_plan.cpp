#include "grid/paste_plan.h"

#include "files/read_number.h"
#include "grid/branch_lines.h"
#include "grid/grid_texts.h"
#include "ks/fc/shown_text.h"
#include "ks/units/typed_number.h"
#include "ks/units/unit_groups.h"

#include <algorithm>
#include <cmath>
#include <set>

namespace {

constexpr std::size_t MostNamed = 5; // lines in one reason

QString BaseSymbol(UnitGroup quantity)
{
    const KsUnitGroupRow* row = KsFindUnitGroup(quantity);
    return row ? QString::fromUtf8(row->base.symbol) : QString();
}

bool IsBlank(QStringView text)
{
    return text.trimmed().isEmpty();
}

bool IsBlank(const CTextTable& texts, std::size_t line)
{
    for (int column = 0; column < texts.Width(line); ++column)
        if (!IsBlank(texts.At(line, column)))
            return false;
    return true;
}

} // namespace

bool IsUnitOf(const ColumnSpec& column, const QString& unit)
{
    return unit == column.UnitSymbol() || KsTypedUnitFactor(column.style.Group(), unit);
}

std::vector<PasteChoice::Column> ColumnsInOrder(const CTableRows& rows, int count, int column)
{
    std::vector<PasteChoice::Column> columns;
    for (int i = 0; i < count; ++i)
        columns.emplace_back(column + i < int(rows.Columns().size()) ? column + i : -1);
    return columns;
}

PasteChoice AsItStands(const CTableRows& rows, const CopiedTable& copied, int row, int column)
{
    PasteChoice choice{.columns = ColumnsInOrder(rows, copied.texts.Columns(), column), .row = row};
    TakeUnits(rows, copied, choice);
    return choice;
}

void TakeUnits(const CTableRows& rows, const CopiedTable& copied, PasteChoice& choice)
{
    for (std::size_t i = 0; i < copied.columns.size(); ++i) {
        auto& [target, unit] = choice.columns[i];
        const auto& [quantity, own] = copied.columns[i];
        if (target >= 0 && rows.Column(target).IsNumeric() && KsTypedUnitFactor(quantity, own))
            unit = own == rows.Column(target).UnitSymbol() ? QString() : own;
    }
}

CPastePlan::CPastePlan(const CTableRows& rows, const CopiedTable& copied, PasteChoice choice)
    : m_rows(&rows), m_copied(&copied), m_choice(std::move(choice))
{
    m_values.resize(std::size_t(Columns()));
    m_left.resize(std::size_t(Columns()));
    m_isRead.resize(std::size_t(Columns()));
    FindComplaint();
    FindLines();
    FindRows();
    for (const bool hasLocks : {false, true}) // what others decide about comes when they are known
        for (int column = 0; column < Columns(); ++column)
            if (const int target = m_choice.columns[std::size_t(column)].target;
                target >= 0 && bool(m_rows->Column(target).locked) == hasLocks) {
                ReadColumn(column);
                m_isRead[std::size_t(column)] = true;
            }
    LeaveUnnamedLines();
    FindRuleFaults();
    CountCells();
    std::ranges::stable_sort(m_faults, {}, [](const Fault& fault) { return std::pair(fault.line, fault.column); });
}

void CPastePlan::FindComplaint()
{
    std::set<int> targets;
    for (int i = 0; i < Columns(); ++i) {
        const auto& [column, unit] = m_choice.columns[std::size_t(i)];
        if (column < 0)
            continue;
        const ColumnSpec& target = m_rows->Column(column);
        const bool isTwice = !targets.insert(column).second;
        if (!isTwice && (unit.isEmpty() || IsUnitOf(target, unit)))
            continue;
        m_complaintColumn = i;
        const QStringList units = KsTypedUnits(target.style, target.UnitSymbol());
        if (isTwice)
            m_complaint = GridTexts::tr("Two columns go to \"%1\".").arg(target.header());
        else if (units.isEmpty())
            m_complaint = GridTexts::tr("\"%1\" is no unit of \"%2\", which has none.").arg(unit, target.header());
        else
            m_complaint = GridTexts::tr("\"%1\" is no unit of \"%2\". Possible are %3.")
                              .arg(unit, target.header(), units.join(QStringLiteral(", ")));
    }
    if (targets.empty())
        m_complaint = GridTexts::tr("No column goes anywhere.");
    else if (m_choice.place == PastePlace::ByPlace && !(targets.contains(0) && targets.contains(1)))
        m_complaint = GridTexts::tr("Which line is which is told by \"%1\" and \"%2\": columns have to go there.")
                          .arg(m_rows->Column(0).header(), m_rows->Column(1).header());
}

// ---- lines -------------------------------------------------------------------------------------

/// Where each line names its branch a blank one is none; elsewhere it goes to a line of the table, as the others do.
void CPastePlan::FindLines()
{
    const CTextTable& texts = m_copied->texts;
    m_lines.reserve(texts.Lines());
    for (std::size_t line = m_choice.hasHeaders + m_choice.hasUnits; line < texts.Lines(); ++line)
        m_lines.push_back(line);
    const bool isNamed = std::ranges::any_of(m_choice.columns, [this](const PasteChoice::Column& column) {
        return column.target >= 0 && m_rows->Column(column.target).NamesBranch();
    });
    if (!isNamed || Columns() == 1)
        return;
    const auto blank = [&texts](std::size_t line) { return IsBlank(texts, line); };
    if (std::ranges::all_of(m_lines, blank))
        return; // cells of these are cleared
    m_blankLines = std::erase_if(m_lines, blank);
}

/// Where the column of the table comes from; -1 for none.
int CPastePlan::ColumnFor(int target) const
{
    const auto column = std::ranges::find(m_choice.columns, target, &PasteChoice::Column::target);
    return column == m_choice.columns.end() ? -1 : int(column - m_choice.columns.begin());
}

/// A blank line that is no line of cells has none.
int CPastePlan::WidthOf(std::size_t line) const
{
    const int width = m_copied->texts.Width(m_lines[line]);
    return width == 1 && Columns() > 1 && IsBlank(TextAt(line, 0)) ? 0 : width;
}

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
                 m_choice.place == PastePlace::AtCell
                     ? GridTexts::tr("The table ends with line %1 and takes no new ones.").arg(m_rows->LineCount())
                     : GridTexts::tr("The table takes no new lines."));
    }
}

void CPastePlan::FindRowsByPlace()
{
    const int branch = ColumnFor(0), chainage = ColumnFor(1);
    CPlacesInTable places(*m_rows);
    CPlacedLines placed;
    for (std::size_t line = 0; line < Lines(); ++line) {
        if (std::max(branch, chainage) >= WidthOf(line)) {
            m_rowOf[line] = Nowhere;
            AddFault(line, -1, GridTexts::tr("The line does not tell its place."));
            continue;
        }
        const CellValue name = Read(line, branch).value, number = Read(line, chainage).value;
        if (!std::holds_alternative<std::string>(name) || !std::holds_alternative<double>(number))
            continue;
        const auto key = QString::fromStdString(std::get<std::string>(name));
        const auto row = places.Take(key, std::get<double>(number));
        m_rowOf[line] = row.value_or(New);
        placed.Add(line, key, std::get<double>(number), row.has_value());
    }
    for (const auto& crowd : placed.Crowds()) {
        QStringList numbers;
        for (std::size_t i = 0; i < std::min(crowd.size(), MostNamed); ++i)
            numbers << QString::number(CopiedLine(crowd[i]) + 1);
        if (crowd.size() > MostNamed)
            numbers << QStringLiteral("...");
        for (const std::size_t line : crowd)
            AddFault(line, chainage,
                     GridTexts::tr("The copied lines %1 have the same place.").arg(numbers.join(QStringLiteral(", "))));
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

bool CPastePlan::GoesNowhere(std::size_t line) const
{
    return m_rowOf[line] == Nowhere;
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
        if (WidthOf(line) < Columns())
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
    const QStringView whole = m_copied->numbers->At(m_lines[line], column);
    const auto number = KsReadNumber(whole, CKsEditStyle());
    const auto shown = KsReadNumber(TextAt(line, column), CKsEditStyle());
    const auto factor = KsTypedUnitFactor(quantity, unit);
    // What is on the clipboard may come from anywhere: the text is what users see there.
    const bool belongs =
        number && shown && factor && std::abs(*shown * double(*factor) - *number) <= 1e-9 * std::abs(*number);
    return belongs ? whole : QStringView();
}

/// A number with its unit: to the last digit where the table that it comes from has it so.
QString CPastePlan::NumberText(std::size_t line, int column, const QString& text) const
{
    const auto& [target, unit] = m_choice.columns[std::size_t(column)];
    const ColumnSpec& spec = m_rows->Column(target);
    if (const QStringView number = WholeNumber(line, column); !number.isEmpty()) {
        const auto& own = m_copied->columns[std::size_t(column)];
        const QString base = BaseSymbol(own.quantity);
        if (own.unit == (unit.isEmpty() ? spec.UnitSymbol() : unit) && IsUnitOf(spec, base))
            return number.toString() + u' ' + base;
    }
    const QString plain = m_choice.decimal ? PlainNumber(text, *m_choice.decimal) : text;
    return !unit.isEmpty() && IsValidNumber(plain.toStdString()) ? plain + u' ' + unit : plain;
}

/// A number is one that may be typed into the cell.
bool CPastePlan::IsAsTyped(int column) const
{
    return m_choice.columns[std::size_t(column)].unit.isEmpty() && !m_copied->numbers &&
           m_choice.decimal != DecimalSign::Comma;
}

/// What surrounds or pads a number, a choice or a time unseen is none of it.
CellReading CPastePlan::Read(std::size_t line, int column) const
{
    const ColumnSpec& spec = m_rows->Column(m_choice.columns[std::size_t(column)].target);
    if (spec.Kind() == CellKind::Text)
        return ReadCell(spec, TextAt(line, column));
    const QString text = KsWithoutUnseen(TextAt(line, column).toString()).trimmed();
    if (!spec.IsNumeric() || IsAsTyped(column)) {
        CellReading read = ReadCell(spec, text);
        if (read.refusal.isEmpty() || !spec.IsNumeric() || !m_choice.decimal)
            return read;
    }
    return ReadCell(spec, NumberText(line, column, text));
}

/// Why a line cannot be without a name or a place; empty when it can.
QString CPastePlan::WhyNoName(int target, const CellValue& value) const
{
    const ColumnSpec& spec = m_rows->Column(target);
    if (spec.NamesBranch() && IsEmptyCell(spec, value))
        return GridTexts::tr("A line needs the name of its branch.");
    const bool isPlace = m_choice.place == PastePlace::ByPlace && target == 1;
    return isPlace && IsEmptyCell(spec, value) ? GridTexts::tr("The line does not tell its place.") : QString();
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
    const ColumnSpec& spec = m_rows->Column(target);
    const bool isKey = NamesLine(column);
    const bool isPlain = spec.Kind() == CellKind::Number && !spec.locked && IsAsTyped(column);
    const CellValue nothing = m_rows->Resolved(target, {}, BlankRule::Fill); // as a cell that is cleared
    CCellValues& values = m_values[std::size_t(column)];
    CellReading read;
    QStringView last;
    for (std::size_t line = 0; line < Lines(); ++line) {
        const std::size_t row = m_rowOf[line];
        if (column >= WidthOf(line) || row == Nowhere || (isKey && row != New)) {
            values.Add(nothing, Lines());
            Leave(line, column);
            continue;
        }
        const QStringView text = TextAt(line, column);
        if (const auto number = isPlain ? ReadPlainNumber(spec, text) : std::nullopt) {
            values.Add(*number, Lines()); // nearly all of a large table
            continue;
        }
        if (spec.IsNumeric() || text != last || last.isNull()) // names of branches come many times in turn
            read = Read(line, column);
        last = text;
        if (read.refusal.isEmpty())
            read.refusal = WhyNoName(target, read.value);
        bool isLeft = false;
        if (row != New && (!spec.IsNumeric() || !read.refusal.isEmpty() || spec.locked)) {
            const void* const object = m_rows->Rows()->At(row);
            isLeft = text == EditText(spec, spec.access->get(object)); // may be what nobody could type
            if (!isLeft && spec.IsLocked(object) && IsLockedThen(line, column))
                read.refusal = GridTexts::tr("The cell is locked.");
        }
        if (!isLeft && !read.refusal.isEmpty())
            AddFault(line, column, read.refusal);
        if (isLeft || !read.refusal.isEmpty()) {
            Leave(line, column);
            values.Add(nothing, Lines());
            last = {};
        } else {
            values.Add(m_rows->Resolved(target, read.value, BlankRule::Fill), Lines());
        }
    }
}

/// Whether a cell of a line that is there is locked by what the line holds once the columns are pasted that were read
/// before: which kind of map it is, say.
bool CPastePlan::IsLockedThen(std::size_t line, int column) const
{
    const auto decides = [this](const PasteChoice::Column& each) {
        const CellKind kind = each.target < 0 ? CellKind::Text : m_rows->Column(each.target).Kind();
        return kind == CellKind::Choice || kind == CellKind::Flag || kind == CellKind::TextChoice;
    };
    const ColumnSpec& spec = m_rows->Column(m_choice.columns[std::size_t(column)].target);
    const std::size_t row = m_rowOf[line];
    IRowSource& rows = *m_rows->Rows();
    if (row < rows.FixedRows() || std::ranges::none_of(m_choice.columns, decides))
        return spec.IsLocked(rows.At(row));
    const auto then = rows.Copies({row});
    for (int other = 0; other < Columns(); ++other) {
        const auto& left = m_left[std::size_t(other)];
        if (other != column && m_isRead[std::size_t(other)] && !(!left.empty() && left[line]))
            m_rows->Column(m_choice.columns[std::size_t(other)].target)
                .access->set(then->At(0), m_values[std::size_t(other)][line]);
    }
    return spec.IsLocked(then->At(0));
}

void CPastePlan::AddFault(std::size_t line, int column, const QString& reason)
{
    m_faults.push_back({line, column, reason});
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
    return column < m_copied->texts.Width(m_lines[line]) ? TextAt(line, column).toString() : QString();
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
