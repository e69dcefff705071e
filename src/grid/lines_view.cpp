#include "grid/lines_view.h"

#include "grid/filter_fields.h"
#include "grid/gen_grid.h"
#include "grid/grid_header.h"
#include "grid/grid_host.h"
#include "grid/grid_keys.h"
#include "ks/fc/doc.h"

#include <QMenu>
#include <algorithm>

namespace {

struct Entry
{
    int command = 0; // 0: a separator
    GridAction action = GridAction::None;
};

constexpr Entry Entries[] = {
    {Command::SortAscending, GridAction::SortAscending},
    {Command::SortDescending, GridAction::SortDescending},
    {Command::SortByPlace, GridAction::SortByPlace},
    {Command::FileOrder, GridAction::FileOrder},
    {Command::KeepOrder, GridAction::KeepOrder},
    {},
    {Command::Filter, GridAction::Filter},
    {Command::ShowAllLines, GridAction::ShowAllLines},
    {Command::ShowAfresh, GridAction::ShowAfresh},
};

/// What was sorted by before decides where the new column has the same values.
std::vector<SortKey> KeysWith(const CGenGrid& grid, SortKey key)
{
    std::vector<SortKey> keys = grid.Model()->SortedBy();
    std::erase_if(keys, [&key](const SortKey& each) { return each.column == key.column; });
    keys.insert(keys.begin(), key);
    return keys;
}

void SortBy(CGenGrid& grid, std::vector<SortKey> keys)
{
    grid.ChangeView([&keys](CGridModel& model) { model.SortBy(std::move(keys)); });
}

void Run(int command, CGenGrid& grid, int column)
{
    switch (command) {
    case Command::SortAscending:
    case Command::SortDescending:
        return SortBy(grid, KeysWith(grid, {column, command == Command::SortDescending}));
    case Command::SortByPlace:
        return SortBy(grid, {{0}, {1}});
    case Command::FileOrder:
        return SortBy(grid, {});
    case Command::KeepOrder: {
        std::size_t line = 0;
        grid.ChangeView([&](CGridModel& model) { line = model.KeepOrder(grid.CurrentRow() - 1); });
        if (grid.CurrentRow() > 0)
            grid.ShowLine(int(line) + 1, grid.CurrentColumn());
        return;
    }
    case Command::ShowAfresh:
        return grid.ChangeView([](CGridModel& model) { model.ShowAfresh(); });
    case Command::Filter:
        return grid.Header().Fields().Enter(column);
    default:
        return grid.Header().Fields().Leave();
    }
}

} // namespace

std::vector<CKsMenuCommand> LinesView::MenuCommands()
{
    std::vector<CKsMenuCommand> menu;
    for (const Entry& entry : Entries)
        menu.push_back(entry.command ? CKsMenuCommand{entry.command, MenuText(entry.action), KeyOf(entry.action),
                                                      TextOf(entry.action)}
                                     : CKsMenuCommand());
    return menu;
}

bool LinesView::Knows(int command)
{
    return std::ranges::any_of(Entries, [command](const Entry& each) { return command && each.command == command; });
}

bool LinesView::CanRun(int command, const CGenGrid* grid)
{
    if (!Knows(command) || !grid || !grid->isEnabled() || !grid->Model()->MayRearrangeView())
        return false;
    const CGridModel& model = *grid->Model();
    const bool isSorted = !model.SortedBy().empty();
    switch (command) {
    case Command::SortByPlace:
        return grid->Host() && grid->Host()->CanSearch(*grid);
    case Command::FileOrder:
        return isSorted;
    case Command::KeepOrder:
        return isSorted && model.Document() && !model.Document()->IsReadOnly();
    case Command::ShowAllLines:
        return model.Shown().IsFiltered();
    case Command::ShowAfresh:
        return isSorted || model.Shown().IsFiltered();
    default:
        return true;
    }
}

void LinesView::Run(int command, CGenGrid& grid)
{
    if (CanRun(command, &grid) && grid.CommitEditor())
        ::Run(command, grid, std::max(0, grid.CurrentColumn() - 1));
}

int LinesView::CommandOf(GridAction action)
{
    const auto* entry = std::ranges::find(Entries, action, &Entry::action);
    return action != GridAction::None && entry != std::end(Entries) ? entry->command : 0;
}

void LinesView::SortByClick(CGenGrid& grid, int column)
{
    if (!CanRun(Command::SortAscending, &grid))
        return;
    const auto& keys = grid.Model()->SortedBy();
    const bool isSorted = !keys.empty() && keys.front() == SortKey{column};
    ::Run(isSorted ? Command::SortDescending : Command::SortAscending, grid, column);
    grid.SetCurrentCell(grid.Model()->FixedRows() + 1, column + 1); // the line that was clicked is nobody's choice
}

void LinesView::AddTo(QMenu& menu, CGenGrid& grid, int column)
{
    for (const Entry& entry : Entries) {
        if (entry.command)
            menu.addAction(MenuText(entry.action), KeyOf(entry.action), &grid,
                           [&grid, column, command = entry.command] { ::Run(command, grid, column); })
                ->setEnabled(CanRun(entry.command, &grid));
        else
            menu.addSeparator();
    }
}
