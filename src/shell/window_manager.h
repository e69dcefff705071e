// How the document windows stand in the frame.
#pragma once

#include <QList>
#include <QRect>

class CKsMDIChildWnd;
class CKsMDIFrameWnd;
class CView;
class QMdiArea;

/// Arranges the document windows: as tabs, or as windows that may stand side by side.
class CWindowManager
{
public:
    explicit CWindowManager(CKsMDIFrameWnd& frame);

    QList<CKsMDIChildWnd*> All() const;
    /// The window of a view; null for none, and for one that closes.
    CKsMDIChildWnd* Of(const CView* view) const;

    bool HasTabs() const;
    void ShowTabs(bool tabs);
    /// What the user chose is kept; a project that stands side by side by itself is no choice of tabs or windows.
    void ChooseTabs(bool tabs);
    /// Whether the user chose tabs, which single documents have also when nobody chose.
    static bool ChoseTabs();

    /// The active window stands at the left, the others stand one below the other beside it.
    void PlaceSideBySide();
    /// New windows go where the first of several stands side by side - or, without this, where there is room.
    void PlaceNewWindowsFirst(bool first);

private:
    QMdiArea& Area() const;
    QRect FirstPlace() const;

    CKsMDIFrameWnd& m_frame;
};
