#include "pages/framework/output_matrix.h"

#include "pages/framework/binding.h"

#include <QCheckBox>
#include <QGridLayout>
#include <QLabel>
#include <QPainter>

COutputMatrix::COutputMatrix(QWidget* parent) : QWidget(parent) {}

void COutputMatrix::SetTitle(QCheckBox& box, const QString& title, const QString& toolTip)
{
    auto& cells = *static_cast<QGridLayout*>(layout());
    const auto labelAt = [&cells](int row, int column) {
        const QLayoutItem* item = cells.itemAtPosition(row, column);
        return item ? qobject_cast<QLabel*>(item->widget()) : nullptr;
    };
    int row = 0, column = 0, rows = 0, columns = 0;
    cells.getItemPosition(cells.indexOf(&box), &row, &column, &rows, &columns);
    QLabel* label = labelAt(row, 0);
    if (!label) {
        label = new QLabel;
        label->setMargin(2); // all rows have room in a low window
        label->setIndent(8);
        cells.addWidget(label, row, 0);
    }
    label->setText(title);
    label->setToolTip(toolTip);
    SetAccessibleName(box, title + ", " + labelAt(0, column)->text());
}

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
