// The menu of the active view's editor.
#pragma once

#include <QObject>

class CKsMDIFrameWnd;
class QMenu;

/// Fills the "Lines" menu with the commands of the active view and sends them there.
class CLinesMenu : public QObject
{
    Q_OBJECT
public:
    CLinesMenu(CKsMDIFrameWnd& frame, QMenu& menu, QObject* parent);
    /// For the view that is active now, in the language of now.
    void Fill();

private:
    void Update(bool open);

    CKsMDIFrameWnd& m_frame;
    QMenu& m_menu;
};
