#include "grid/grid_menus.h"

#include "grid/cell_commands.h"
#include "grid/gen_grid.h"
#include "grid/grid_clipboard.h"
#include "grid/grid_commands.h"
#include "grid/grid_host.h"
#include "grid/grid_input.h"
#include "grid/grid_texts.h"
#include "grid/grid_widths.h"
#include "grid/line_commands.h"
#include "grid/lines_view.h"
#include "ks/fc/doc.h"

#include <QMenu>
#include <algorithm>

namespace {

/// A menu that runs actions of the grid, as their keys do.
class CMenu
{
public:
    CMenu(QMenu& menu, CGenGrid& grid) : m_menu(menu), m_grid(grid)
    {
        const CGridModel& model = *grid.Model();
        m_changes = model.Document() && !model.Document()->IsReadOnly() && model.Rows();
        m_copies = CanCopyCells(grid);
        m_pastes = m_changes && CanPasteCells(grid);
    }

    void Add(GridAction action, bool enabled)
    {
        m_menu
            .addAction(CGridCommands::TextFor(action, &m_grid), KeyOf(action), &m_grid,
                       [&grid = m_grid, action] { grid.Input().Run(action); })
            ->setEnabled(enabled);
    }
    void Add(GridAction action) { Add(action, CGridCommands::CanRun(action, m_grid)); }
    void AddClipboard()
    {
        m_menu.addSeparator();
        Add(GridAction::Cut);
        Add(GridAction::Copy, m_copies);
        Add(GridAction::CopyWithHeaders);
        Add(GridAction::Paste, m_pastes);
        Add(GridAction::PasteWithPreview);
    }
    void AddLines()
    {
        for (const GridAction action : LineActions)
            Add(action);
        Add(GridAction::DeleteLine, m_changes && m_grid.HasLinesToDelete());
    }
    void AddAppending()
    {
        const bool grows = m_changes && m_grid.MayGrow();
        Add(GridAction::AppendLine, m_changes);
        Add(GridAction::CopyAndAppend, grows && m_copies);
        Add(GridAction::PasteAndAppend, grows && m_pastes);
    }

private:
    QMenu& m_menu;
    CGenGrid& m_grid;
    bool m_changes, m_copies, m_pastes;
};

} // namespace

void GridMenus::AddForCells(QMenu& menu, CGenGrid& grid)
{
    CMenu entries(menu, grid);
    entries.AddAppending();
    entries.AddLines();
    entries.Add(GridAction::SelectLine, grid.CurrentRow() > 0);
    entries.AddClipboard();
    entries.Add(GridAction::Clear);
    menu.addSeparator();
    for (const GridAction action : CellActions)
        entries.Add(action);
    if (grid.Host() && grid.Host()->CanSearch(grid)) {
        menu.addSeparator();
        entries.Add(GridAction::Search, true);
    }
    menu.addSeparator();
    LinesView::AddTo(*menu.addMenu(GridTexts::tr("Sort and Filter")), grid, std::max(0, grid.CurrentColumn() - 1));
}

void GridMenus::AddForLines(QMenu& menu, CGenGrid& grid)
{
    CMenu entries(menu, grid);
    entries.AddLines();
    entries.AddClipboard();
    menu.addSeparator();
    entries.Add(GridAction::RevertToSaved);
}

void GridMenus::AddForColumn(QMenu& menu, CGenGrid& grid, int column)
{
    LinesView::AddTo(menu, grid, column);
    menu.addSeparator();
    menu.addAction(MenuText(GridAction::FitColumn), &grid, [&grid, column] { grid.Widths().Fit(column); });
}
