#include "grid/grid_input.h"

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

#include <QApplication>
#include <QContextMenuEvent>
#include <QKeyEvent>

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
    // A key that the open editor of a cell left to the table is about the table with what was typed.
    if (event->type() == QEvent::KeyPress && (key->whileEditing || m_grid.CommitEditor()))
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
    case GridAction::OpenMenu: {
        QContextMenuEvent event(QContextMenuEvent::Keyboard, QPoint(), QPoint());
        QApplication::sendEvent(m_grid.viewport(), &event);
        return;
    }
    case GridAction::SelectLine:
        return m_grid.SelectLines(m_grid.CurrentRow(), m_grid.CurrentRow());
    default:
        if (CGridCommands::Knows(action))
            return CGridCommands::Run(action, m_grid);
        if (const int command = LinesView::CommandOf(action))
            return LinesView::Run(command, m_grid);
        return Ask(action);
    }
}

void CGridInput::Ask(GridAction action)
{
    if ((action == GridAction::AppendLine || action == GridAction::DeleteLine) && !m_grid.MayChange())
        return;
    if (action == GridAction::DeleteLine && !m_grid.HasLinesToDelete() && m_grid.Model()->Document())
        m_grid.Model()->Document()->Say(
            GridTexts::tr("Delete takes away lines that are selected by their numbers. %1 clears cells.")
                .arg(KeyOf(GridAction::Clear).toString(QKeySequence::NativeText)));
    if (action != GridAction::Undo && action != GridAction::Redo)
        m_grid.StoreEditedLine();
    if (m_grid.Host())
        m_grid.Host()->Run(m_grid, action);
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
