// A window beside the document windows, which comes back as the user left it.
#pragma once

#include "ks/ks_export.h"

#include <QDockWidget>

class CKsMDIFrameWnd;

class KS_API CKsDock : public QDockWidget
{
    Q_OBJECT
public:
    /// Whether the user had the dock of that name in sight last.
    static bool IsWanted(const QString& name);
    /// Shows it, or hides it: as the user wants it from now on.
    void Want(bool shown);
    /// Hides it when it is in sight, otherwise brings it there.
    void Toggle() { Want(!IsInSight()); }
    /// Not hidden, and not behind another one.
    bool IsInSight() const { return isVisible() && !visibleRegion().isEmpty(); }

protected:
    /// In the frame, where the user had it; otherwise at the bottom, in one place with others, and at first so high
    /// (pixels). Takes the content over. The name is that of the window and of its settings.
    CKsDock(CKsMDIFrameWnd& frame, const QString& name, QWidget* content, int firstHeight);
    /// Its title in the user's language.
    virtual void Retranslate() = 0;

    void changeEvent(QEvent* event) override;
    void closeEvent(QCloseEvent* event) override;
};

/// The dock of a class in a frame, which has one at most; null before it was made.
template <typename Dock>
Dock* KsDockOf(const QObject* frame)
{
    return frame ? frame->findChild<Dock*>(QString(), Qt::FindDirectChildrenOnly) : nullptr;
}
/// Makes it if need be.
template <typename Dock, typename Frame>
Dock& KsDockIn(Frame& frame)
{
    Dock* dock = KsDockOf<Dock>(&frame);
    return *(dock ? dock : new Dock(frame));
}
