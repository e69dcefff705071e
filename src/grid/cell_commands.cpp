#include "grid/cell_commands.h"

#include "grid/cell_dialogs.h"
#include "grid/cell_operations.h"
#include "grid/gen_grid.h"
#include "grid/grid_clipboard.h"
#include "grid/grid_host.h"
#include "grid/grid_texts.h"
#include "grid/replace_dialog.h"
#include "ks/fc/doc.h"
#include "ks/fc/message_box.h"

#include <algorithm>
#include <span>

namespace {

CellBlock BlockOf(const CGenGrid& grid)
{
    const auto selected = grid.SelectedBlock();
    const QItemSelectionRange block = selected ? *selected : QItemSelectionRange(grid.currentIndex());
    return {block.top(), block.left(), block.bottom(), block.right()};
}

/// What is said of a number of cells.
struct Words
{
    QString one, many;
};

/// Why cells stay as they were, where all that are listed have one reason.
QString ReasonOf(const std::vector<CCellResults::Cell>& kept)
{
    const auto isAsFirst = [&kept](const CCellResults::Cell& cell) { return cell.after == kept.front().after; };
    return !kept.empty() && std::ranges::all_of(kept, isAsFirst) ? QStringLiteral(": ") + kept.front().after
                                                                 : QString();
}

void Make(CGenGrid& grid, CCellResults results, const QString& step, const Words& words)
{
    MakeResults(grid, std::move(results), step, words.one, words.many);
}

void Cut(CGenGrid& grid, const CellBlock& block)
{
    const bool areLines = grid.Selection().AreLines();
    CopyCells(grid);
    if (areLines && grid.HasLinesToDelete() && grid.Host()) {
        CGridModel& model = *grid.Model();
        const int before = model.LineCount();
        const QString lost = model.Rows()->LostWhenCut();
        grid.Host()->Run(grid, GridAction::DeleteLine);
        if (model.LineCount() < before && !lost.isEmpty())
            model.Document()->Say(lost);
    } else {
        Make(grid, Clear(*grid.Model(), block), NameOf(GridAction::Cut),
             {GridTexts::tr("1 cell cut"), GridTexts::tr("%1 cells cut")});
    }
}

} // namespace

bool MakeResults(CGenGrid& grid, CCellResults results, const QString& step, const QString& one, const QString& many)
{
    CGridModel& model = *grid.Model();
    if (const QString fault = results.RuleFault(); !fault.isEmpty()) {
        KsMessageBox(fault, QMessageBox::Ok, &grid);
        return false;
    }
    const std::size_t changed = results.ChangedCount(), kept = results.KeptCount();
    const QString reason = ReasonOf(results.Kept());
    model.ChangeCells(step, results.FirstRow(), results.TakeChanges());
    QString said = GridTexts::Counted(changed, one, many);
    if (kept > 0)
        said += QStringLiteral("; ") +
                GridTexts::Counted(kept, GridTexts::tr("1 stays as it was"), GridTexts::tr("%1 stay as they were")) +
                reason;
    model.Document()->Say(said);
    if (grid.Host())
        grid.Host()->LineEdited(grid); // the project is told of what locations hold now
    grid.Reload();
    return true;
}

bool CanRunOnCells(const CGenGrid& grid, GridAction action)
{
    const CGridModel& model = *grid.Model();
    if (!grid.isEnabled() || !model.Document() || model.Document()->IsReadOnly() || !grid.currentIndex().isValid() ||
        model.StoredRows() == 0)
        return false;
    const CellBlock block = BlockOf(grid);
    const auto has = [&](const auto& isMeant) {
        const std::size_t first = std::size_t(block.left), count = std::size_t(block.right - block.left + 1);
        return std::ranges::any_of(std::span(model.Columns()).subspan(first, count), isMeant);
    };
    const auto hasNumbers = [&] { return has(&ColumnSpec::IsNumeric); };
    switch (action) {
    case GridAction::Cut:
    case GridAction::Clear:
        return has([](const ColumnSpec& column) { return column.Kind() != CellKind::Button; });
    case GridAction::FillDown:
        return block.top < block.bottom || block.top > model.FixedRows(); // no line stands above the first one
    case GridAction::FillSeries:
        return block.bottom > block.top && hasNumbers();
    case GridAction::Interpolate:
        return grid.Host() && grid.Host()->CanSearch(grid) && block.right > 1 && block.bottom > block.top &&
               has([](const ColumnSpec& column) { return column.Kind() == CellKind::Number; });
    case GridAction::ResetToGlobal:
        return has([](const ColumnSpec& column) { return bool(column.Global()); });
    case GridAction::RevertToSaved:
        return model.Saved().MayDiffer();
    case GridAction::Replace:
        return true;
    default:
        return hasNumbers();
    }
}

void RunOnCells(CGenGrid& grid, GridAction action)
{
    grid.StoreEditedLine();
    if (action == GridAction::Replace)
        return FindAndReplace(grid);
    const CGridModel& model = *grid.Model();
    const CellBlock block = BlockOf(grid);
    const Words changed{GridTexts::tr("1 cell changed"), GridTexts::tr("%1 cells changed")};
    if (action == GridAction::Cut)
        return Cut(grid, block);
    if (action == GridAction::Clear)
        return Make(grid, Clear(model, block), NameOf(action),
                    {GridTexts::tr("1 cell cleared"), GridTexts::tr("%1 cells cleared")});
    if (action == GridAction::FillDown)
        return Make(grid, FillDown(model, block), NameOf(action), changed);
    if (action == GridAction::ResetToGlobal)
        return Make(grid, ResetToGlobal(model, block), NameOf(action), changed);
    if (action == GridAction::RevertToSaved)
        return Make(grid, RevertToSaved(model, model.Saved(), block), NameOf(action),
                    {GridTexts::tr("1 cell reverted"), GridTexts::tr("%1 cells reverted")});
    if (auto results = AskForCells(action, model, block, grid))
        Make(grid, std::move(*results), NameOf(action), changed);
}
