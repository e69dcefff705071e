#include "pages/output_matrix.h"

#include <QGridLayout>
#include <QPainter>

COutputMatrix::COutputMatrix(QWidget* parent) : QWidget(parent)
{
    setBackgroundRole(QPalette::Base);
    setAutoFillBackground(true);
}

void COutputMatrix::paintEvent(QPaintEvent*)
{
    const auto* cells = qobject_cast<const QGridLayout*>(layout());
    QPainter painter(this);
    for (int row = 0; cells && row < cells->rowCount(); row += 2) {
        const QRect first = cells->cellRect(row, 0);
        painter.fillRect(0, first.top(), width(), first.height(),
                         palette().brush(row == 0 ? QPalette::Button : QPalette::AlternateBase));
    }
}
