// The lines of a grid and what is done with them: selected, inserted, deleted; keys and menu that do so.
#include "grid/gen_grid.h"
#include "grid/grid_clipboard.h"
#include "grid/grid_host.h"
#include "grid/grid_keys.h"
#include "grid/grid_widths.h"

#include <QContextMenuEvent>
#include <QMenu>
#include <QScopedValueRollback>
#include <algorithm>

// ---- keys and menu -----------------------------------------------------------------------------

/// The selection grows from its other end to a cell. The table itself would select from where a key or the mouse went
/// last, which the grid's own moves are not.
static void GrowSelection(CGenGrid& grid, const QModelIndex& to)
{
    const QItemSelectionRange selected = grid.SelectedBlock().value_or(QItemSelectionRange(grid.currentIndex()));
    const int row = grid.CurrentRow() - 1, column = grid.CurrentColumn() - 1;
    const int fromRow = row == selected.top() ? selected.bottom() : selected.top();
    const int fromColumn = column == selected.left() ? selected.right() : selected.left();
    const auto cell = [&](int r, int c) { return grid.model()->index(r, c); };
    grid.selectionModel()->setCurrentIndex(to, QItemSelectionModel::NoUpdate);
    grid.selectionModel()->select({cell(std::min(fromRow, to.row()), std::min(fromColumn, to.column())),
                                   cell(std::max(fromRow, to.row()), std::max(fromColumn, to.column()))},
                                  QItemSelectionModel::ClearAndSelect);
}

bool CGenGrid::event(QEvent* event)
{
    // The grid's own keys come before menu shortcuts of the same name.
    if (event->type() == QEvent::ShortcutOverride && FindGridKey(*static_cast<QKeyEvent*>(event))) {
        event->accept();
        return true;
    }
    // Tab is a cell move here, which QWidget would take for a change of focus.
    if (event->type() == QEvent::KeyPress) {
        if (const GridKey* key = FindGridKey(*static_cast<QKeyEvent*>(event))) {
            Run(key->action);
            event->accept();
            return true;
        }
        const auto& key = *static_cast<QKeyEvent*>(event);
        constexpr std::pair<Qt::Key, CursorAction> moves[] = {
            {Qt::Key_Up, MoveUp},         {Qt::Key_Down, MoveDown},         {Qt::Key_Left, MoveLeft},
            {Qt::Key_Right, MoveRight},   {Qt::Key_Home, MoveHome},         {Qt::Key_End, MoveEnd},
            {Qt::Key_PageUp, MovePageUp}, {Qt::Key_PageDown, MovePageDown},
        };
        const auto* move = std::ranges::find(moves, key.key(), [](const auto& each) { return int(each.first); });
        if (move != std::end(moves) && key.modifiers().testFlag(Qt::ShiftModifier) && currentIndex().isValid()) {
            const QScopedValueRollback choosing(m_choosingLines, m_linesChosen); // whole lines grow by whole lines
            GrowSelection(*this, moveCursor(move->second, key.modifiers()));
            event->accept();
            return true;
        }
    }
    return QTableView::event(event);
}

void CGenGrid::Run(GridAction action)
{
    switch (action) {
    case GridAction::NextCell:
        return NextCell();
    case GridAction::PreviousCell:
        return PreviousCell();
    case GridAction::CopyAndAppend:
        CopyCells(*this);
        return Ask(GridAction::AppendLine);
    case GridAction::PasteAndAppend:
        if (!CanPaste() || Paste())
            Ask(GridAction::AppendLine);
        return;
    case GridAction::Copy:
        return CopyCells(*this);
    case GridAction::Paste:
        Paste();
        return;
    case GridAction::SelectLine:
        return SelectLines(CurrentRow(), CurrentRow());
    default:
        return Ask(action);
    }
}

void CGenGrid::Ask(GridAction action)
{
    if (action != GridAction::Undo && action != GridAction::Redo)
        StoreEditedLine();
    if (m_host)
        m_host->Run(*this, action);
}

void CGenGrid::NextCell()
{
    if (m_lineGone)
        return; // the next cell of none
    if (CurrentColumn() < ColumnCount())
        SetCurrentCell(CurrentRow(), CurrentColumn() + 1);
    else if (CurrentRow() < RowCount())
        SetCurrentCell(CurrentRow() + 1, 1);
    else if (MayGrow())
        Ask(GridAction::AppendLine);
    else
        StoreEditedLine();
}

void CGenGrid::PreviousCell()
{
    if (m_lineGone)
        return;
    if (CurrentColumn() > 1)
        SetCurrentCell(CurrentRow(), CurrentColumn() - 1);
    else if (CurrentRow() > 1)
        SetCurrentCell(CurrentRow() - 1, ColumnCount());
    else
        focusPreviousChild(); // the way out of the grid by keyboard
}

void CGenGrid::contextMenuEvent(QContextMenuEvent* event)
{
    if (!CommitEditor())
        return;
    QMenu menu(this);
    const auto add = [&](GridAction action, bool enabled) {
        const auto keys = GridKeys();
        const auto key = std::find_if(keys.begin(), keys.end(), [&](const GridKey& k) { return k.action == action; });
        menu.addAction(key->Text(), QKeySequence(QKeyCombination(key->held, key->key)), this,
                       [this, action] { Run(action); })
            ->setEnabled(enabled);
    };
    add(GridAction::AppendLine, m_model->Rows() != nullptr);
    add(GridAction::DeleteLine, HasLinesToDelete());
    menu.addSeparator();
    add(GridAction::Copy, CanCopy());
    add(GridAction::Paste, CanPaste());
    if (m_host && m_host->CanSearch(*this)) {
        menu.addSeparator();
        add(GridAction::Search, true);
    }
    menu.exec(event->globalPos());
}

// ---- selected lines ----------------------------------------------------------------------------

void CGenGrid::SelectLines(int first, int last)
{
    const QScopedValueRollback choosing(m_choosingLines, true);
    const QItemSelection lines(m_model->index(first - 1, 0), m_model->index(last - 1, ColumnCount() - 1));
    selectionModel()->select(lines, QItemSelectionModel::ClearAndSelect);
    m_linesChosen = true;
}

void CGenGrid::selectAll()
{
    const QScopedValueRollback choosing(m_choosingLines, true);
    QTableView::selectAll();
    m_linesChosen = true;
}

std::optional<QItemSelectionRange> CGenGrid::SelectedBlock() const
{
    const QItemSelection selection = selectionModel()->selection();
    if (selection.size() != 1)
        return std::nullopt;
    const QItemSelectionRange range = selection.front();
    // The current cell is always selected; alone it is no selection.
    if (range.width() == 1 && range.height() == 1)
        return std::nullopt;
    return range;
}

// ---- lines that come and go --------------------------------------------------------------------

int CGenGrid::InsertLine()
{
    const auto selected = SelectedBlock();
    const int below = m_insertsBelow && currentIndex().isValid() ? CurrentRow() : RowCount();
    const int row = selected && !m_insertsBelow ? std::max(selected->top(), m_model->FixedRows()) : below;
    const int line = m_model->InsertRow(row) + 1;
    m_widths->Update();
    clearSelection();
    SetCurrentCell(line, 1);
    return line;
}

/// Lines of the table among the selected ones.
std::optional<QItemSelectionRange> CGenGrid::LinesToDelete() const
{
    auto lines = SelectedBlock();
    const bool isWhole = lines && lines->width() == ColumnCount();
    const bool ofCells = m_lineChoice == LineChoice::LinesOfCells;
    if ((m_lineChoice == LineChoice::CurrentLine && !isWhole) || (ofCells && !lines))
        lines.emplace(currentIndex());
    else if (!ofCells && (!m_linesChosen || !isWhole))
        return std::nullopt;
    if (!lines->isValid() || lines->bottom() < m_model->FixedRows())
        return std::nullopt;
    const int top = std::max(lines->top(), m_model->FixedRows());
    return QItemSelectionRange(m_model->index(top, 0), m_model->index(lines->bottom(), ColumnCount() - 1));
}

bool CGenGrid::DeleteSelectedLines()
{
    const auto lines = LinesToDelete();
    if (!lines)
        return false;
    const int row = lines->top(), column = CurrentColumn();
    m_model->RemoveRows(row, lines->height());
    clearSelection();
    SetCurrentCell(row + 1, column);
    return true;
}
