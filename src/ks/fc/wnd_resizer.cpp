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

/// The layout, however deep inside `outer`, in which the widget itself stands.
QLayout* LayoutOf(QLayout* outer, QWidget* widget)
{
    if (!outer || outer->indexOf(widget) >= 0)
        return outer;
    for (int i = 0; i < outer->count(); ++i)
        if (QLayout* found = LayoutOf(outer->itemAt(i)->layout(), widget))
            return found;
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

    Stretch(layout, layout->indexOf(widget), wide, high);
    for (QLayout* inner = layout; inner != parent->layout();) {
        auto* outer = static_cast<QLayout*>(inner->parent());
        Stretch(outer, outer->indexOf(inner), wide, high);
        inner = outer;
    }
    return true;
}
