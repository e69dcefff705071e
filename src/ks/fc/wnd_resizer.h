// Lets a page's controls follow the size of the page.
#pragma once

#include "ks/ks_export.h"

class QLayout;
class QWidget;

/// Anchors to the sides of a page, as a mask: a control anchored to two opposite sides takes the extra space between
/// them, one anchored to a single side keeps its size and stays there. The controls stand in Qt layouts; the resizer
/// sets size policies, stretch and alignment in them.
class KS_API CWndResizer
{
public:
    enum Anchor : unsigned
    {
        Left = 1,
        Top = 2,
        Right = 4,
        Bottom = 8,
        All = 15
    };

    explicit CWndResizer(QWidget* page) : m_page(page) {}
    /// False, and nothing done, when the widget stands in no layout of the page.
    bool SetAnchor(QWidget* widget, unsigned mask) const;

private:
    QWidget* m_page;
};
