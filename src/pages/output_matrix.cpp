#include "pages/output_matrix.h"

#include <QGridLayout>
#include <QPainter>

COutputMatrix::COutputMatrix(QWidget* parent) : QWidget(parent) {}

void COutputMatrix::paintEvent(QPaintEvent*)
{
    // Boxes are filled with the base colour. So that they stand out in light and dark palettes alike, the rows stay
    // close to the window's colour: the text's colour, laid thinly over it.
    const auto* cells = qobject_cast<const QGridLayout*>(layout());
    QPainter painter(this);
    const auto fill = [&](const QRect& area, double strength) {
        QColor color = palette().color(QPalette::WindowText);
        color.setAlphaF(float(strength));
        painter.fillRect(0, area.top(), width(), area.height(), color);
    };
    for (int row = 0; cells && row < cells->rowCount(); row += 2)
        fill(cells->cellRect(row, 0), row == 0 ? 0.12 : 0.05);
}
