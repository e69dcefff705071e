#include "shown_tips.h"

#include <QAbstractItemView>
#include <QAbstractScrollArea>
#include <QApplication>
#include <QHeaderView>
#include <QHelpEvent>
#include <QPointer>
#include <set>

namespace {

/// What has a tool tip of its own at a place of the widget: the same thing, the same answer.
std::pair<int, void*> ThingAt(QWidget& widget, QPoint position)
{
    auto* view = qobject_cast<QAbstractItemView*>(widget.parentWidget());
    if (!view || view->viewport() != &widget)
        return {position.x() * 10000 + position.y(), nullptr};
    if (auto* header = qobject_cast<QHeaderView*>(view))
        return {header->logicalIndexAt(position), nullptr};
    const QModelIndex index = view->indexAt(position);
    return {index.row() * 1000 + index.column(), index.internalPointer()};
}

/// Whether a widget has more tool tips than one.
bool HasPlaces(const QWidget& widget)
{
    const auto* area = qobject_cast<const QAbstractScrollArea*>(widget.parentWidget());
    return (area && area->viewport() == &widget) || widget.hasMouseTracking();
}

} // namespace

const QLabel* ToolTipLabel()
{
    for (const QWidget* widget : QApplication::topLevelWidgets())
        if (widget->inherits("QTipLabel") && widget->isVisible())
            return qobject_cast<const QLabel*>(widget);
    return nullptr;
}

void ShownTips::RestOn(QWidget& window)
{
    QList<QPointer<QWidget>> widgets; // a tool tip is one, too, and goes
    for (QWidget* widget : window.findChildren<QWidget*>())
        widgets << widget;
    for (QWidget* widget : widgets) {
        if (!widget || !widget->isVisible())
            continue;
        if (HasPlaces(*widget))
            Sweep(*widget);
        else if (!widget->toolTip().isEmpty())
            At(*widget, widget->rect().center());
    }
}

void ShownTips::Sweep(QWidget& widget)
{
    constexpr int across = 24, down = 12; // pixels: no cell is smaller
    const QRect seen = widget.visibleRegion().boundingRect();
    std::set<std::pair<int, void*>> known;
    for (int y = seen.top() + down / 2; y <= seen.bottom(); y += down)
        for (int x = seen.left() + across / 2; x <= seen.right(); x += across)
            if (known.insert(ThingAt(widget, {x, y})).second)
                At(widget, {x, y});
}

void ShownTips::At(QWidget& widget, QPoint position)
{
    delete ToolTipLabel(); // it would take its time to go
    QHelpEvent rest(QEvent::ToolTip, position, widget.mapToGlobal(position));
    QApplication::sendEvent(&widget, &rest);
    const QLabel* tip = ToolTipLabel();
    if (!tip)
        return;
    all << tip->text();
    if (tip->textFormat() != Qt::PlainText)
        rich << tip->text();
    if (tip->text().contains(QChar(0x202E)))
        turned << widget.metaObject()->className() + (": " + tip->text());
}
