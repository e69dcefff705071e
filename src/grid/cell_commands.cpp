#include "grid/cell_commands.h"

#include "grid/cell_dialogs.h"
#include "grid/cell_operations.h"
#include "grid/gen_grid.h"
#include "grid/grid_host.h"
#include "grid/grid_texts.h"
#include "grid/replace_dialog.h"
#include "ks/fc/doc.h"
#include "ks/fc/message_box.h"

#include <algorithm>
#include <span>

namespace {

constexpr int FirstCommand = 42640; // of the menu; the actions follow

CellBlock BlockOf(const CGenGrid& grid)
{
    const auto selected = grid.SelectedBlock();
    const QItemSelectionRange block = selected ? *selected : QItemSelectionRange(grid.currentIndex());
    return {block.top(), block.left(), block.bottom(), block.right()};
}

void Make(CGenGrid& grid, CCellResults results, const QString& step)
{
    CGridModel& model = *grid.Model();
    if (const QString fault = results.RuleFault(); !fault.isEmpty()) {
        KsMessageBox(fault, QMessageBox::Ok, &grid);
        return;
    }
    const std::size_t changed = results.ChangedCount(), kept = results.KeptCount();
    model.ChangeCells(step, results.FirstRow(), results.TakeChanges());
    QString said = GridTexts::Counted(changed, GridTexts::tr("1 cell changed"), GridTexts::tr("%1 cells changed"));
    if (kept > 0)
        said += QStringLiteral("; ") +
                GridTexts::Counted(kept, GridTexts::tr("1 stays as it was"), GridTexts::tr("%1 stay as they were"));
    model.Document()->Say(said);
    if (grid.Host())
        grid.Host()->LineEdited(grid); // the project is told of what locations hold now
    grid.Reload();
}

} // namespace

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
    case GridAction::FillDown:
        return block.top < block.bottom || block.top > model.FixedRows(); // no line stands above the first one
    case GridAction::FillSeries:
        return block.bottom > block.top && hasNumbers();
    case GridAction::Interpolate:
        return grid.Host() && grid.Host()->CanSearch(grid) && block.right > 1 && block.bottom > block.top &&
               has([](const ColumnSpec& column) { return column.Kind() == CellKind::Number; });
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
    if (action == GridAction::FillDown)
        return Make(grid, FillDown(model, block), NameOf(action));
    if (auto results = AskForCells(action, model, block, grid))
        Make(grid, std::move(*results), NameOf(action));
}

std::vector<CKsMenuCommand> CCellCommands::MenuCommands()
{
    std::vector<CKsMenuCommand> commands;
    for (const GridAction action : CellActions)
        commands.push_back({FirstCommand + int(commands.size()), MenuText(action), KeyOf(action), TextOf(action)});
    return commands;
}

bool CCellCommands::Knows(int command)
{
    return command >= FirstCommand && command < FirstCommand + int(std::size(CellActions));
}

bool CCellCommands::CanRun(int command, const CGenGrid* grid)
{
    return Knows(command) && grid && CanRunOnCells(*grid, CellActions[command - FirstCommand]);
}

void CCellCommands::Run(int command, CGenGrid& grid)
{
    RunOnCells(grid, CellActions[command - FirstCommand]);
}
