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
    const QStyle& style = *m_grid.style();
    const QStyle::State common = option.state;
    const QModelIndex hovered = view.underMouse() ? m_grid.indexAt(view.mapFromGlobal(QCursor::pos())) : QModelIndex();
    const auto paint = [&](const QModelIndex& cell) {
        option.rect = m_grid.visualRect(cell);
        option.state = common;
        option.state.setFlag(QStyle::State_Selected, m_grid.selectionModel()->isSelected(cell));
        option.state.setFlag(QStyle::State_MouseOver, cell == hovered);
        option.state.setFlag(QStyle::State_HasFocus, cell == m_grid.currentIndex() && m_grid.hasFocus());
        option.palette.setCurrentColorGroup(common.testFlag(QStyle::State_Enabled) ? QPalette::Normal
                                                                                   : QPalette::Disabled);
        style.drawPrimitive(QStyle::PE_PanelItemViewRow, &option, &painter, &m_grid);
        m_grid.itemDelegate()->paint(&painter, option, cell);
    };
    const QColor color = QRgb(style.styleHint(QStyle::SH_Table_GridLineColor, &option, &m_grid));
    const auto paintLines = [&](const QRect& cell) {
        painter.fillRect(QRect(cell.bottomLeft() + QPoint(0, 1), QSize(cell.width() + 1, 1)), color);
        painter.fillRect(QRect(cell.topRight() + QPoint(1, 0), QSize(1, cell.height())), color);
    };
    const auto forCells = [&](const auto& visit) {
        const int top = m_grid.rowAt(dirty.top()), bottom = m_grid.rowAt(dirty.bottom());
        const int end = top < 0 ? 0 : bottom < 0 ? m_grid.RowCount() : bottom + 1;
        for (int row = std::max(top, 0); row < end; ++row)
            for (int column = 0; column < Count(); ++column)
                visit(m_grid.Model()->index(row, column));
    };
    painter.fillRect(dirty, view.palette().brush(view.backgroundRole()));
    forCells(paint);
    forCells([&](const QModelIndex& cell) { paintLines(m_grid.visualRect(cell)); });
}

void CFrozenColumns::PaintEdge(QPainter& painter, int height) const
{
    QColor color = m_grid.palette().color(QPalette::Text); // seen in every palette
    color.setAlphaF(0.5F);
    painter.fillRect(Width() - 1, 0, 1, height, color);
}
