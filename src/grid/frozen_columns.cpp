#include "grid/frozen_columns.h"

#include "grid/gen_grid.h"

#include <QHeaderView>
#include <QPainter>
#include <algorithm>

int CFrozenColumns::Offset() const
{
    return m_grid.horizontalHeader()->offset();
}

int CFrozenColumns::Named() const
{
    const auto& columns = m_grid.Model()->Columns();
    return int(std::ranges::find(columns, false, &ColumnSpec::namesLine) - columns.begin());
}

int CFrozenColumns::Needed() const
{
    const int named = Named();
    if (named == 0 || named == m_grid.ColumnCount() || m_grid.isRightToLeft())
        return 0;
    const int width = m_grid.horizontalHeader()->sectionPosition(named);
    return width > 0 && 2 * width <= m_grid.viewport()->width() ? width : 0;
}

int CFrozenColumns::Left(int column) const
{
    const int laidOut = m_grid.horizontalHeader()->sectionViewportPosition(column);
    return column < Count() ? laidOut + Offset() : laidOut;
}

QRect CFrozenColumns::Seen(const QRect& laidOut, int column) const
{
    const int width = Width();
    if (width == 0 || !laidOut.isValid())
        return laidOut;
    if (column < Count())
        return laidOut.translated(Offset(), 0);
    if (laidOut.right() < width)
        return laidOut.translated(-width, 0);
    return {QPoint(std::max(laidOut.left(), width), laidOut.top()), laidOut.bottomRight()};
}

int CFrozenColumns::ScrolledFor(int column) const
{
    const QHeaderView& header = *m_grid.horizontalHeader();
    const int frozen = Needed(), now = Offset();
    if (frozen > 0 && column < Named())
        return now;
    const int left = header.sectionPosition(column), width = header.sectionSize(column);
    const int room = m_grid.viewport()->width();
    if (left - frozen < now || width > room - frozen)
        return left - frozen;
    return std::max(now, left + width - room);
}

void CFrozenColumns::PaintCells(QPainter& painter, QStyleOptionViewItem option, const QRect& dirty) const
{
    const QWidget& view = *m_grid.viewport();
    const int top = m_grid.rowAt(dirty.top()), end = m_grid.rowAt(dirty.bottom());
    const QStyle::State common = option.state;
    const QPoint mouse = view.mapFromGlobal(QCursor::pos());
    const QModelIndex hovered = view.underMouse() ? m_grid.indexAt(mouse) : QModelIndex();
    painter.fillRect(dirty, view.palette().brush(view.backgroundRole()));
    const QColor lines = QRgb(m_grid.style()->styleHint(QStyle::SH_Table_GridLineColor, &option, &m_grid));
    const auto paint = [&](const QModelIndex& cell) {
        option.rect = m_grid.visualRect(cell);
        option.state = common;
        option.state.setFlag(QStyle::State_Selected, m_grid.selectionModel()->isSelected(cell));
        option.state.setFlag(QStyle::State_MouseOver, cell == hovered);
        option.state.setFlag(QStyle::State_HasFocus, cell == m_grid.currentIndex() && m_grid.hasFocus());
        option.palette.setCurrentColorGroup(common.testFlag(QStyle::State_Enabled) ? QPalette::Normal
                                                                                   : QPalette::Disabled);
        m_grid.style()->drawPrimitive(QStyle::PE_PanelItemViewRow, &option, &painter, &m_grid);
        m_grid.itemDelegate()->paint(&painter, option, cell);
        painter.setPen(lines);
        const QRect box = option.rect.adjusted(0, 0, 1, 1);
        painter.drawLine(box.bottomLeft(), box.bottomRight());
        painter.drawLine(box.topRight(), box.bottomRight());
    };
    for (int row = top; row >= 0 && row <= (end < 0 ? m_grid.RowCount() - 1 : end); ++row)
        for (int column = 0; column < Count(); ++column)
            paint(m_grid.Model()->index(row, column));
}

void CFrozenColumns::PaintEdge(QPainter& painter, int height) const
{
    QColor color = m_grid.palette().color(QPalette::Text); // seen in every palette
    color.setAlphaF(0.5F);
    painter.fillRect(Width() - 1, 0, 1, height, color);
}
