#include "grid/grid_clipboard.h"

#include "grid/cell_text.h"
#include "grid/gen_grid.h"
#include "grid/grid_host.h"
#include "grid/grid_texts.h"
#include "grid/grid_widths.h"
#include "grid/paste_dialog.h"
#include "ks/fc/doc.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QMimeData>
#include <algorithm>

bool CanCopyCells(const CGenGrid& grid)
{
    return grid.selectionModel()->hasSelection() || grid.currentIndex().isValid();
}

/// As one line: "Initial h [m]".
static QString HeaderText(const ColumnSpec& column)
{
    return (column.header() + u' ' + column.UnitLine()).simplified();
}

/// Texts say less than numbers do where a unit comes between.
static bool HidesInUnits(const ColumnSpec& column)
{
    return column.IsNumeric() && column.style.UnitConvertFromBase(1, 1) != 1;
}

static void Copy(const CGenGrid& grid, bool withHeaders)
{
    if (!CanCopyCells(grid))
        return;
    const CGridModel& model = *grid.Model();
    const QItemSelection selection = grid.selectionModel()->selection();
    const QItemSelectionRange range =
        selection.isEmpty() ? QItemSelectionRange(grid.currentIndex()) : selection.front();
    std::vector<QStringList> texts, numbers;
    std::vector<CopiedTable::Column> columns;
    bool hides = false;
    for (int column = range.left(); column <= range.right(); ++column) {
        const ColumnSpec& spec = model.Column(column);
        const UnitGroup quantity = spec.IsNumeric() ? spec.style.Group() : UnitGroup::None;
        columns.push_back({quantity, quantity == UnitGroup::None ? QString() : spec.UnitSymbol()});
        hides = hides || HidesInUnits(spec);
    }
    texts.reserve(std::size_t(range.height()) + withHeaders);
    if (withHeaders) {
        QStringList& headers = texts.emplace_back();
        for (int column = range.left(); column <= range.right(); ++column)
            headers << HeaderText(model.Column(column));
        if (hides)
            numbers.emplace_back(headers.size());
    }
    for (int row = range.top(); row <= range.bottom(); ++row) {
        QStringList& cells = texts.emplace_back();
        if (hides)
            numbers.emplace_back();
        for (int column = range.left(); column <= range.right(); ++column) {
            const ColumnSpec& spec = model.Column(column);
            const CellValue value = model.Value(row, column);
            cells << EditText(spec, value);
            const auto* const number = std::get_if<double>(&value);
            if (hides)
                numbers.back() << (number && !IsEmptyCell(spec, value) ? KsShortestNumber(*number) : QString());
        }
    }
    QGuiApplication::clipboard()->setMimeData(ToClipboard(texts, columns, numbers).release()); // owns it
}

void CopyCells(const CGenGrid& grid)
{
    Copy(grid, false);
}

void CopyCellsWithHeaders(const CGenGrid& grid)
{
    Copy(grid, true);
}

bool CanPasteCells(const CGenGrid& grid)
{
    const QMimeData* content = QGuiApplication::clipboard()->mimeData();
    return content && HasCells(*content) && grid.Model()->Rows() &&
           (grid.currentIndex().isValid() || grid.RowCount() == 0);
}

namespace {

/// Where a paste begins, and what is pasted there.
struct PasteStart
{
    int row, column;
    ReadCopied read;
};

/// One cell over as many as a selection has.
CopiedTable Repeated(CopiedTable cell, int lines, int columns)
{
    const auto repeat = [&](CTextTable& texts) {
        texts = CTextTable(WriteTable({std::size_t(lines), QStringList(columns, texts.At(0, 0).toString())}));
    };
    repeat(cell.texts);
    if (cell.numbers)
        repeat(*cell.numbers);
    if (!cell.columns.empty())
        cell.columns.resize(std::size_t(columns), cell.columns.front());
    return cell;
}

PasteStart StartOf(const CGenGrid& grid)
{
    const auto selected = grid.SelectedBlock();
    const QItemSelectionRange block = selected ? *selected : QItemSelectionRange();
    return {selected ? block.top() : std::max(0, grid.currentIndex().row()),
            selected ? block.left() : std::max(0, grid.currentIndex().column()),
            [block, isBlock = selected.has_value(),
             content = HeldContent(*QGuiApplication::clipboard()->mimeData())](QChar separator) {
                CopiedTable copied = FromClipboard(*content, separator);
                const bool isCell = copied.texts.Lines() == 1 && copied.texts.Width(0) == 1;
                return isBlock && isCell ? Repeated(std::move(copied), block.height(), block.width()) : copied;
            }};
}

/// Nothing when the user has to be asked.
std::optional<PasteDecision> WithoutAsking(const CTableRows& rows, const PasteStart& start)
{
    const CopiedTable copied = start.read(u'\t');
    PasteChoice choice = AsItStands(rows, copied, start.row, start.column);
    choice.hasHeaders = HasHeadersInOrder(rows, copied.texts, start.column);
    if (!choice.hasHeaders && SeemsToHaveHeaders(rows, copied.texts, start.column))
        return std::nullopt;
    choice.hasUnits = choice.hasHeaders && SeemsToHaveUnits(copied.texts, rows, choice.columns);
    const auto asShown = choice.columns;
    if (choice.hasUnits)
        TakeUnitLine(copied.texts, rows, choice.columns);
    if (choice.columns != asShown)
        return std::nullopt;
    CPastePlan plan(rows, copied, std::move(choice));
    const bool isOwn = !copied.columns.empty(); // whose cells are known
    if (!plan.IsClean() || (!isOwn && plan.Columns() == 1 && SeemsDivided(start.read)))
        return std::nullopt;
    return DecisionOf(plan);
}

/// Rows of the table as it is shown; none by itself.
struct ShownLines
{
    int top = 0, bottom = -1;
};

/// Where the lines are shown, if they stand there one below the other, and all of them.
ShownLines ShownBlock(const CGridModel& model, const std::vector<std::size_t>& rows)
{
    std::vector<bool> isPasted(std::size_t(model.rowCount()));
    int top = model.rowCount(), bottom = -1;
    for (const std::size_t row : rows) {
        const int shown = model.ShownRow(row);
        if (shown < 0)
            return {};
        isPasted[std::size_t(shown)] = true;
        top = std::min(top, shown);
        bottom = std::max(bottom, shown);
    }
    const bool isWhole =
        std::find(isPasted.begin() + top, isPasted.begin() + bottom, false) == isPasted.begin() + bottom;
    return isWhole ? ShownLines{top, bottom} : ShownLines();
}

/// Brings the pasted columns into sight, the first ones rather than the last. Those that are frozen are.
void ScrollToColumns(CGenGrid& grid, int row, const PastedCells& cells)
{
    std::vector<int> columns;
    for (const PastedCells::Column& each : cells.columns)
        if (!grid.Model()->Column(each.column).namesLine)
            columns.push_back(each.column);
    if (columns.empty())
        return;
    const auto [first, last] = std::ranges::minmax(columns);
    grid.scrollTo(grid.Model()->index(row, last));
    grid.scrollTo(grid.Model()->index(row, first));
}

/// What was pasted is selected where it is one block, its beginning in sight; elsewhere its first line that is shown is
/// current.
void ShowPasted(CGenGrid& grid, const PastedCells& cells)
{
    const CGridModel& model = *grid.Model();
    const auto [left, right] = std::ranges::minmax(cells.columns, {}, &PastedCells::Column::column);
    const bool areBeside = right.column - left.column + 1 == int(cells.columns.size());
    const ShownLines block = areBeside ? ShownBlock(model, cells.rows) : ShownLines();
    const bool isBlock = block.top <= block.bottom;
    const auto shown = std::ranges::find_if(cells.rows, [&model](std::size_t row) { return model.ShownRow(row) >= 0; });
    if (shown == cells.rows.end())
        return;
    const int top = isBlock ? block.top : model.ShownRow(*shown);
    const bool isCell = isBlock && block.bottom == top && right.column == left.column;
    if (!isCell) {
        grid.SetCurrentCell(top + 1, left.column + 1);
        ScrollToColumns(grid, top, cells);
    }
    if (isBlock && !isCell)
        grid.selectionModel()->select({model.index(top, left.column), model.index(block.bottom, right.column)},
                                      QItemSelectionModel::ClearAndSelect);
}

QString Summary(const PasteDecision& decision)
{
    QString done =
        GridTexts::Counted(decision.cellCount, GridTexts::tr("1 cell pasted"), GridTexts::tr("%1 cells pasted"));
    if (!decision.leftOut.isEmpty())
        done += QStringLiteral("; ") + GridTexts::tr("left out: %1").arg(decision.leftOut);
    if (decision.hasShorterLines)
        done += GridTexts::tr("; shorter lines leave their other cells as they were");
    if (decision.hidden > 0)
        done +=
            QStringLiteral("; ") + GridTexts::Counted(decision.hidden, GridTexts::tr("1 line is hidden by the filter"),
                                                      GridTexts::tr("%1 lines are hidden by the filter"));
    if (decision.choice.hasHeaders)
        done += GridTexts::tr("; the line with the headers was left out");
    return done;
}

void Make(CGenGrid& grid, const PasteDecision& decision)
{
    if (decision.cells.rows.empty())
        return; // nothing goes anywhere
    const int current = std::max(1, grid.CurrentRow());
    grid.Model()->Paste(decision.cells, GridTexts::tr("Paste"));
    grid.Model()->Document()->Say(Summary(decision));
    if (grid.Host())
        grid.Host()->LineEdited(grid); // the project is told when locations came in
    grid.Reload();
    grid.Widths().MakeRoom();
    if (grid.CurrentRow() ==
        current) // else the table puts its lines in order, and the current one has gone to its place
        ShowPasted(grid, decision.cells);
}

bool Paste(CGenGrid& grid, bool asks)
{
    if (!CanPasteCells(grid) || !grid.Model()->Document()->MayChange())
        return false;
    grid.StoreEditedLine();
    const PasteStart start = StartOf(grid);
    auto decision = asks ? std::nullopt : WithoutAsking(*grid.Model(), start);
    if (!decision)
        decision = AskForPaste(*grid.Model(), start.read, start.row, start.column,
                               grid.Host() && grid.Host()->CanSearch(grid), grid);
    if (decision)
        Make(grid, *decision);
    return decision.has_value();
}

} // namespace

bool PasteCells(CGenGrid& grid)
{
    return Paste(grid, false);
}

bool PasteCellsWithPreview(CGenGrid& grid)
{
    return Paste(grid, true);
}
