// What the grid has other than its base for columns that stay at the left: where cells are seen, how far it scrolls.
#include "grid/frozen_columns.h"
#include "grid/gen_grid.h"

#include <QHeaderView>
#include <QPaintEvent>
#include <QPainter>
#include <QScrollBar>
#include <QSignalBlocker>
#include <algorithm>

QRect CGenGrid::FrozenPart() const
{
    return {0, 0, m_frozen->Width(), viewport()->height()};
}

int CGenGrid::FirstColumnInSight() const
{
    return columnAt(m_frozen->LaidOut(0)) + 1;
}

QRect CGenGrid::visualRect(const QModelIndex& cell) const
{
    return m_frozen->Seen(QTableView::visualRect(cell), cell.column());
}

QModelIndex CGenGrid::indexAt(const QPoint& point) const
{
    return QTableView::indexAt(m_frozen->LaidOut(point));
}

QRegion CGenGrid::visualRegionForSelection(const QItemSelection& selection) const
{
    const QRegion laidOut = QTableView::visualRegionForSelection(selection);
    const bool isFrozen = std::ranges::any_of(
        selection, [count = m_frozen->Count()](const QItemSelectionRange& range) { return range.left() < count; });
    return isFrozen ? laidOut + FrozenPart() : laidOut;
}

/// From cell to cell, not from place to place: where a drag began may be out of sight, or below the frozen columns.
void CGenGrid::setSelection(const QRect& dragged, QItemSelectionModel::SelectionFlags command)
{
    const QModelIndex to = indexAt(dragged.bottomRight());
    const QModelIndex from = command.testFlag(QItemSelectionModel::Current) ? QModelIndex(m_pressed) : to;
    if (from.isValid() && to.isValid())
        selectionModel()->select(QItemSelection(from, to), command);
}

void CGenGrid::scrollTo(const QModelIndex& cell, ScrollHint hint)
{
    if (!cell.isValid() || m_frozen->Needed() == 0)
        return QTableView::scrollTo(cell, hint);
    QScrollBar& bar = *horizontalScrollBar();
    const int before = bar.value();
    {
        const QSignalBlocker quiet(bar);
        QTableView::scrollTo(cell, hint); // up or down; sideways it knows nothing of what covers a cell
        bar.setValue(before);
    }
    bar.setValue(m_frozen->ScrolledFor(cell.column()));
}

/// Sideways what is frozen stays, with the editor in it.
void CGenGrid::scrollContentsBy(int dx, int dy)
{
    const int frozen = dx != 0 ? m_frozen->Needed() : 0;
    if (frozen == 0)
        return QTableView::scrollContentsBy(dx, dy);
    horizontalHeader()->setOffset(horizontalScrollBar()->value());
    horizontalHeader()->viewport()->update();
    if (IsEditing())
        viewport()->update();
    else
        viewport()->scroll(dx, 0, QRect(frozen, 0, viewport()->width() - frozen, viewport()->height()));
    viewport()->update(frozen - 1, 0, 1, viewport()->height()); // the edge comes and goes
    updateEditorGeometries();
    QTableView::scrollContentsBy(0, dy);
}

void CGenGrid::updateGeometries()
{
    QTableView::updateGeometries();
    if (m_frozen->Needed() > 0)
        horizontalScrollBar()->setPageStep(viewport()->width() - m_frozen->Needed());
}

void CGenGrid::PaintCells(const QRegion& dirty)
{
    const QRect frozen = FrozenPart() & dirty.boundingRect();
    if (const QRegion rest = dirty - frozen; !rest.isEmpty()) {
        QPaintEvent scrolled(rest);
        QTableView::paintEvent(&scrolled);
    }
    if (frozen.isEmpty())
        return;
    QPainter painter(viewport());
    QStyleOptionViewItem option;
    initViewItemOption(&option);
    m_frozen->PaintCells(painter, option, frozen);
    m_frozen->PaintEdge(painter, viewport()->height());
}
