#include "grid/cell_commands.h"

#include "grid/cell_dialogs.h"
#include "grid/cell_operations.h"
#include "grid/gen_grid.h"
#include "grid/grid_host.h"
#include "grid/grid_texts.h"
#include "ks/fc/doc.h"
#include "ks/fc/message_box.h"

#include <algorithm>

namespace {

constexpr int FirstCommand = 42640; // of the menu; the actions follow

struct MenuText
{
    GridAction action;
    const char* text;
};
constexpr MenuText MenuTexts[] = {
    {GridAction::FillDown, QT_TRANSLATE_NOOP("GridTexts", "Fill Dow&n")},
    {GridAction::FillSeries, QT_TRANSLATE_NOOP("GridTexts", "Fill with a Se&ries...")},
    {GridAction::Interpolate, QT_TRANSLATE_NOOP("GridTexts", "Inter&polate...")},
    {GridAction::Calculate, QT_TRANSLATE_NOOP("GridTexts", "Calc&ulate...")},
};

const GridKey& KeyOf(GridAction action)
{
    return *std::ranges::find(GridKeys(), action, &GridKey::action);
}

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
    const auto hasNumbers = [&] {
        return std::any_of(model.Columns().begin() + block.left, model.Columns().begin() + block.right + 1,
                           [](const ColumnSpec& column) { return column.IsRightAligned(); });
    };
    switch (action) {
    case GridAction::FillDown:
        return block.bottom > 0;
    case GridAction::FillSeries:
        return block.bottom > block.top && hasNumbers();
    case GridAction::Interpolate:
        return grid.Host() && grid.Host()->CanSearch(grid) && block.right > 1 && block.bottom > block.top && hasNumbers();
    default:
        return hasNumbers();
    }
}

void RunOnCells(CGenGrid& grid, GridAction action)
{
    grid.StoreEditedLine();
    const CGridModel& model = *grid.Model();
    const CellBlock block = BlockOf(grid);
    if (action == GridAction::FillDown)
        return Make(grid, FillDown(model, block), KeyOf(action).Text());
    if (auto results = AskForCells(action, model, block, grid))
        Make(grid, std::move(*results), KeyOf(action).Text());
}

std::vector<CKsMenuCommand> CCellCommands::MenuCommands()
{
    std::vector<CKsMenuCommand> commands;
    for (const MenuText& entry : MenuTexts) {
        const GridKey& key = KeyOf(entry.action);
        commands.push_back({FirstCommand + int(commands.size()), GridTexts::tr(entry.text),
                            QKeySequence(QKeyCombination(key.held, key.key)), key.Text()});
    }
    return commands;
}

bool CCellCommands::Knows(int command)
{
    return command >= FirstCommand && command < FirstCommand + int(std::size(MenuTexts));
}

bool CCellCommands::CanRun(int command, const CGenGrid* grid)
{
    return Knows(command) && grid && CanRunOnCells(*grid, MenuTexts[command - FirstCommand].action);
}

void CCellCommands::Run(int command, CGenGrid& grid)
{
    RunOnCells(grid, MenuTexts[command - FirstCommand].action);
}
