#include "grid/grid_input.h"

#include "grid/cell_commands.h"
#include "grid/filter_fields.h"
#include "grid/gen_grid.h"
#include "grid/grid_clipboard.h"
#include "grid/grid_commands.h"
#include "grid/grid_header.h"
#include "grid/grid_host.h"
#include "grid/grid_keys.h"
#include "grid/grid_texts.h"
#include "grid/lines_view.h"
#include "ks/fc/doc.h"

#include <QKeyEvent>
#include <QMenu>
#include <algorithm>

CGridInput::CGridInput(CGenGrid& grid) : QObject(&grid), m_grid(grid)
{
    grid.installEventFilter(this);
}

bool CGridInput::eventFilter(QObject* object, QEvent* event)
{
    // The grid's own keys come before menu shortcuts of the same name, and before Qt's moves of the focus.
    if (event->type() != QEvent::ShortcutOverride && event->type() != QEvent::KeyPress)
        return QObject::eventFilter(object, event);
    const GridKey* key = FindGridKey(*static_cast<QKeyEvent*>(event));
    if (!key || m_grid.Header().Fields().HaveFocus())
        return QObject::eventFilter(object, event);
    event->accept();
    if (event->type() == QEvent::KeyPress)
        Run(key->action);
    return true;
}

void CGridInput::Run(GridAction action)
{
    switch (action) {
    case GridAction::NextCell:
        return NextCell();
    case GridAction::PreviousCell:
        return PreviousCell();
    case GridAction::CopyAndAppend:
        CopyCells(m_grid);
        return Ask(GridAction::AppendLine);
    case GridAction::PasteAndAppend:
        if (!CanPasteCells(m_grid) || PasteCells(m_grid))
            Ask(GridAction::AppendLine);
        return;
    case GridAction::Copy:
        return CopyCells(m_grid);
    case GridAction::Paste:
        PasteCells(m_grid);
        return;
    case GridAction::Cut:
        return Cut();
    case GridAction::SelectLine:
        return m_grid.SelectLines(m_grid.CurrentRow(), m_grid.CurrentRow());
    default:
        if (const int command = LinesView::CommandOf(action))
            return LinesView::Run(command, m_grid);
        if (GridCommands::Knows(action)) {
            if (GridCommands::CanRun(action, m_grid) || GridCommands::SaysWhyNot(action))
                GridCommands::Run(action, m_grid);
            return;
        }
        return Ask(action);
    }
}

void CGridInput::Ask(GridAction action)
{
    if ((action == GridAction::AppendLine || action == GridAction::DeleteLine) && !m_grid.MayChange())
        return;
    if (action == GridAction::DeleteLine && m_grid.LinesToDelete() == 0 && m_grid.Model()->Document())
        m_grid.Model()->Document()->Say(
            GridTexts::tr("Delete takes whole lines: select them by their numbers. Cut empties cells."));
    if (action != GridAction::Undo && action != GridAction::Redo)
        m_grid.StoreEditedLine();
    if (m_grid.Host())
        m_grid.Host()->Run(m_grid, action);
}

/// Whole lines go; of others only what the cells hold does.
void CGridInput::Cut()
{
    if (!CanCopyCells(m_grid) || !m_grid.MayChange())
        return;
    const auto selected = m_grid.SelectedBlock();
    const bool isWhole = selected && selected->width() == m_grid.ColumnCount();
    CopyCells(m_grid);
    if (isWhole && m_grid.LinesToDelete() > 0)
        Ask(GridAction::DeleteLine);
    else if (m_grid.currentIndex().isValid())
        ClearCells(m_grid, NameOf(GridAction::Cut));
}

void CGridInput::NextCell()
{
    if (m_grid.HasLostItsLine())
        return; // the next cell of none
    if (m_grid.CurrentColumn() < m_grid.ColumnCount())
        m_grid.SetCurrentCell(m_grid.CurrentRow(), m_grid.CurrentColumn() + 1);
    else if (m_grid.CurrentRow() < m_grid.RowCount())
        m_grid.SetCurrentCell(m_grid.CurrentRow() + 1, 1);
    else if (m_grid.MayGrow())
        Ask(GridAction::AppendLine);
    else
        m_grid.StoreEditedLine();
}

void CGridInput::PreviousCell()
{
    if (m_grid.HasLostItsLine())
        return;
    if (m_grid.CurrentColumn() > 1)
        m_grid.SetCurrentCell(m_grid.CurrentRow(), m_grid.CurrentColumn() - 1);
    else if (m_grid.CurrentRow() > 1)
        m_grid.SetCurrentCell(m_grid.CurrentRow() - 1, m_grid.ColumnCount());
    else
        m_grid.LeaveBackwards();
}

void CGridInput::ShowMenu(const QPoint& at)
{
    QMenu menu(&m_grid);
    const auto add = [&](GridAction action, bool enabled) {
        QAction* const entry = menu.addAction(MenuText(action), KeyOf(action), this, [this, action] { Run(action); });
        entry->setEnabled(enabled);
        return entry;
    };
    const CGridModel& model = *m_grid.Model();
    const bool changes = model.Document() && !model.Document()->IsReadOnly();
    const bool grows = changes && model.Rows() && m_grid.MayGrow(), copies = CanCopyCells(m_grid);
    add(GridAction::AppendLine, changes && model.Rows());
    for (const GridAction action : GridCommands::OnLines())
        add(action, GridCommands::CanRun(action, m_grid));
    add(GridAction::CopyAndAppend, grows && copies);
    add(GridAction::PasteAndAppend, grows && CanPasteCells(m_grid));
    const int lines = m_grid.LinesToDelete();
    QAction* const deletion = add(GridAction::DeleteLine, changes && lines > 0);
    if (lines > 0)
        deletion->setText(
            GridTexts::Counted(std::size_t(lines), GridTexts::tr("Delete Line"), GridTexts::tr("Delete %1 Lines")));
    add(GridAction::SelectLine, m_grid.CurrentRow() > 0);
    menu.addSeparator();
    add(GridAction::Cut, changes && copies);
    add(GridAction::Copy, copies);
    add(GridAction::Paste, changes && CanPasteCells(m_grid));
    menu.addSeparator();
    for (const GridAction action : GridCommands::OnCells())
        add(action, GridCommands::CanRun(action, m_grid));
    if (m_grid.Host() && m_grid.Host()->CanSearch(m_grid)) {
        menu.addSeparator();
        add(GridAction::Search, true);
    }
    menu.addSeparator();
    LinesView::AddTo(*menu.addMenu(GridTexts::tr("Sort and Filter")), m_grid, std::max(0, m_grid.CurrentColumn() - 1));
    menu.exec(at);
}
