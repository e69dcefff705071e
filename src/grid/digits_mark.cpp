#include "grid/digits_mark.h"

#include <QPainter>
#include <QPalette>

void PaintDigitsMark(QPainter& painter, const QRect& box, const QPalette& palette, bool isSelected)
{
    constexpr int Size = 5; // pixels; smaller is taken for dirt, larger touches the digits
    const QPoint corner(box.right() + 1, box.top());
    const QPoint triangle[] = {corner, corner - QPoint(Size, 0), corner + QPoint(0, Size)};
    painter.save();
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    // Seen on the background in every theme, as the selection has to be; a theme may have no colour for links.
    painter.setBrush(palette.color(isSelected ? QPalette::HighlightedText : QPalette::Highlight));
    painter.drawConvexPolygon(triangle, 3);
    painter.restore();
}
