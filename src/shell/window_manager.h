// How the document windows stand in the frame.
#pragma once

#include <QList>
#include <QObject>
#include <QPointer>
#include <QRect>

class CKsMDIChildWnd;
class CKsMDIFrameWnd;
class CView;
class QMdiArea;
class QMdiSubWindow;

/// Arranges the document windows: as tabs, or as windows that may stand side by side.
class CWindowManager : public QObject
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

protected:
    bool eventFilter(QObject* object, QEvent* event) override;

private:
    QMdiArea& Area() const;
    QRect FirstPlace() const;
    void Place(const QList<QMdiSubWindow*>& windows);

    CKsMDIFrameWnd& m_frame;
    struct Placed
    {
        QPointer<QMdiSubWindow> window;
        QRect place;
    };
    QList<Placed> m_placed; // side by side, the first one first
};
