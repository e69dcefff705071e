#include "grid/saved_mark.h"

#include <QPainter>
#include <QPalette>

namespace {

constexpr int LineWidth = 3, CellWidth = 2; // pixels; a cell's touches no text

/// Seen in every theme, as the selection has to be.
QColor MarkColor(const QPalette& palette, bool isSelected = false)
{
    return palette.color(isSelected ? QPalette::HighlightedText : QPalette::Highlight);
}

} // namespace

void PaintLineMark(QPainter& painter, const QRect& number, const QPalette& palette, SavedMark mark)
{
    const QColor color = MarkColor(palette);
    if (mark == SavedMark::Changed)
        return painter.fillRect(number.left() + 1, number.top() + 1, LineWidth, number.height() - 3, color);
    if (mark != SavedMark::New)
        return;
    constexpr int size = 8, width = 2; // beside the longest number, too
    const int left = number.left() + 1, middle = number.top() + (number.height() - width) / 2;
    painter.fillRect(left, middle, size, width, color);
    painter.fillRect(left + (size - width) / 2, middle - (size - width) / 2, width, size, color);
}

void PaintCellMark(QPainter& painter, const QRect& cell, const QPalette& palette, bool isSelected)
{
    const int height = cell.height() / 2;
    painter.fillRect(cell.left(), cell.top() + (cell.height() - height) / 2, CellWidth, height,
                     MarkColor(palette, isSelected));
}
