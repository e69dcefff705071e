// The main frame, the document windows in it, and the tool bars an editor adds.
#pragma once

#include "ks/fc/doc.h"

#include <QMainWindow>
#include <QMdiArea>
#include <QMdiSubWindow>
#include <QToolBar>
#include <functional>

/// A document window: holds one view. Closing it asks to save when it is the document's last.
class KS_API CKsMDIChildWnd : public QMdiSubWindow
{
    Q_OBJECT
public:
    explicit CKsMDIChildWnd(QWidget* parent = nullptr);
    ~CKsMDIChildWnd() override;

    /// Puts the view into the window; an editor's frame may prepare something first. False gives the window up.
    virtual bool OnCreateClient(CView* view);
    CView* GetActiveView() const { return m_view; }

protected:
    void closeEvent(QCloseEvent* event) override;

private:
    void UpdateTitle();
    CView* m_view = nullptr;
};

/// Commands that a main frame offers and an active view carries out. Numbers are those of the tool bar resources;
/// a view says which it can do now.
class KS_API CCommandTarget
{
public:
    virtual ~CCommandTarget();
    /// Carries a command out; false when it does not know it.
    virtual bool OnCommand(int id);
    /// Whether the command can be carried out now.
    virtual bool IsCommandEnabled(int id) const;
};

/// The main frame: document windows, menus by position, tool bars by editor. The shell derives from it.
class KS_API CKsMDIFrameWnd : public QMainWindow, public CKsWindow
{
    Q_OBJECT
public:
    explicit CKsMDIFrameWnd(QWidget* parent = nullptr);

    QMdiArea& MdiArea() const { return *m_area; }
    /// The view of the active window; null when there is none.
    CView* GetActiveView() const;
    /// Enables or greys the menu at a position of the menu bar, counted from 0.
    void EnableMenuItem(int position, bool enable);

private:
    void SubWindowActivated(QMdiSubWindow* window);
    QMdiArea* m_area;
    QPointer<CView> m_activeView;
};

/// A button of a tool bar resource.
struct CKsToolBarButton
{
    int command;         // also the string number of its "status text\ntool tip"
    const char* icon;    // resource path
    CString text;        // "status text\ntool tip"
};

/// A tool bar of an editor. Buttons send their command to the frame's active view (CCommandTarget).
class KS_API CKsToolBarEx : public QToolBar
{
    Q_OBJECT
public:
    explicit CKsToolBarEx(QWidget* parent = nullptr);
    /// Attaches the bar to the frame; false for a null frame.
    bool Create(CKsMDIFrameWnd* frame, unsigned style, unsigned controlId);
    /// Fills the bar; false when there are no buttons or Create has not succeeded.
    bool LoadToolBar(const std::vector<CKsToolBarButton>& buttons);
    unsigned GetBarStyle() const { return m_style; }
    void SetBarStyle(unsigned style) { m_style = style; }
    /// Lets the bar dock on the given sides and docks it at the top.
    void EnableDocking(unsigned sides);
    unsigned ControlId() const { return m_controlId; }

private:
    CKsMDIFrameWnd* m_frame = nullptr;
    unsigned m_style = 0, m_controlId = 0;
};

inline constexpr unsigned CBRS_TOOLTIPS = 0x10, CBRS_FLYBY = 0x20, CBRS_SIZE_DYNAMIC = 0x4, CBRS_ALIGN_ANY = 0xF000;
