#include "ks/fc/keep_in_sight.h"

#include <QScrollArea>

void KsKeepInSight(QWidget& widget, const QRect& part)
{
    constexpr int around = 4; // pixels
    for (QWidget* parent = widget.parentWidget(); parent; parent = parent->parentWidget())
        if (auto* area = qobject_cast<QScrollArea*>(parent);
            area && area->widget() && area->widget()->isAncestorOf(&widget)) {
            const QPoint middle = widget.mapTo(area->widget(), part.center());
            area->ensureVisible(middle.x(), middle.y(), part.width() / 2 + around, part.height() / 2 + around);
        }
}
