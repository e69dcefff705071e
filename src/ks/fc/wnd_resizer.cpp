#include "ks/fc/wnd_resizer.h"

#include <QBoxLayout>
#include <QGridLayout>
#include <QWidget>

namespace {

constexpr unsigned Wide = CWndResizer::Left | CWndResizer::Right, High = CWndResizer::Top | CWndResizer::Bottom;

/// Gives the place of an item in its layout a share of the space that grows.
void Stretch(QLayout* layout, int index, bool wide, bool high)
{
    if (auto* box = qobject_cast<QBoxLayout*>(layout)) {
        const bool across = box->direction() == QBoxLayout::LeftToRight || box->direction() == QBoxLayout::RightToLeft;
        if (across ? wide : high)
            box->setStretch(index, 1);
    } else if (auto* grid = qobject_cast<QGridLayout*>(layout)) {
        int row, column, rows, columns;
        grid->getItemPosition(index, &row, &column, &rows, &columns);
        if (wide)
            grid->setColumnStretch(column + columns - 1, 1);
        if (high)
            grid->setRowStretch(row + rows - 1, 1);
    }
}

int IndexOf(const QLayout* layout, const QWidget* widget, const QLayout* inner)
{
    for (int i = 0; i < layout->count(); ++i) {
        QLayoutItem* item = layout->itemAt(i);
        if (inner ? item->layout() == inner : item->widget() == widget)
            return i;
    }
    return -1;
}

/// The layout, however deep inside `outer`, in which the widget itself stands.
QLayout* LayoutOf(QLayout* outer, const QWidget* widget)
{
    if (!outer || IndexOf(outer, widget, nullptr) >= 0)
        return outer;
    for (int i = 0; i < outer->count(); ++i) {
        if (QLayout* inner = outer->itemAt(i)->layout()) {
            if (QLayout* found = LayoutOf(inner, widget))
                return found;
        }
    }
    return nullptr;
}

Qt::Alignment AlignmentFor(unsigned mask)
{
    Qt::Alignment alignment;
    if ((mask & Wide) != Wide)
        alignment |= mask & CWndResizer::Right ? Qt::AlignRight : Qt::AlignLeft;
    if ((mask & High) != High)
        alignment |= mask & CWndResizer::Bottom ? Qt::AlignBottom : Qt::AlignTop;
    return alignment;
}

} // namespace

bool CWndResizer::SetAnchor(QWidget* widget, unsigned mask) const
{
    QWidget* parent = widget->parentWidget();
    if (!parent || (parent != m_page && !m_page->isAncestorOf(parent)))
        return false;
    QLayout* layout = LayoutOf(parent->layout(), widget);
    if (!layout)
        return false;
    const bool wide = (mask & Wide) == Wide, high = (mask & High) == High;
    QSizePolicy policy = widget->sizePolicy();
    policy.setHorizontalPolicy(wide ? QSizePolicy::Expanding : QSizePolicy::Preferred);
    policy.setVerticalPolicy(high ? QSizePolicy::Expanding : QSizePolicy::Preferred);
    widget->setSizePolicy(policy);
    layout->setAlignment(widget, AlignmentFor(mask));

    Stretch(layout, IndexOf(layout, widget, nullptr), wide, high);
    while (layout != parent->layout()) {
        QLayout* outer = qobject_cast<QLayout*>(layout->parent());
        if (!outer)
            break;
        Stretch(outer, IndexOf(outer, nullptr, layout), wide, high);
        layout = outer;
    }
    return true;
}
