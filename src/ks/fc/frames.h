// The main frame, the document windows in it, and the tool bars an editor adds.
#pragma once

#include "ks/fc/doc.h"

#include <QKeySequence>
#include <QMainWindow>
#include <QMdiArea>
#include <QMdiSubWindow>
#include <QPointer>
#include <QToolBar>
#include <vector>

/// Numbers of the commands that the main frame's Edit and Help menus hand to whatever has the focus, or to the active
/// view (CCommandTarget).
namespace KsCommand {
inline constexpr int Copy = 57634, Cut = 57635, Paste = 57637, Help = 57670;
inline constexpr int FindField = 57680;   // leads to a page or a field by its name
inline constexpr int LongProfile = 57681; // shows or hides a plot along the branch
inline constexpr int Problems = 57682;    // shows or hides a list of what is wrong
inline constexpr int NextProblem = 57683, PreviousProblem = 57684; // lead to one after the other
} // namespace KsCommand

/// A command of a view in the frame's "Edit" or "Lines" menu. Without a text it is a separator.
struct CKsMenuCommand
{
    int id = 0;
    CString text{}; // with mnemonic
    QKeySequence shortcut{};
    CString statusTip{};
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
    /// What the third menu of the frame shows while this view is active; nothing greys the menu.
    virtual std::vector<CKsMenuCommand> LinesMenu() const;
    /// What the Edit menu shows below Paste while this view is active. The keys belong to what has the focus: they are
    /// only shown.
    virtual std::vector<CKsMenuCommand> EditMenu() const;
};

/// A document window: holds one view. Closing it asks to save when it is the document's last.
class KS_API CKsMDIChildWnd : public QMdiSubWindow
{
    Q_OBJECT
public:
    explicit CKsMDIChildWnd(QWidget* parent = nullptr);
    /// Destroys the view, and closes the document when that was its last.
    ~CKsMDIChildWnd() override;

    /// Puts the view into the window; an editor's frame may prepare something first. False gives the window up.
    virtual bool OnCreateClient(CView* view);
    CView* GetActiveView() const { return m_view; }
    /// The window that a view is in; null for none.
    static CKsMDIChildWnd* Of(const CView* view);
    /// Makes it the area's active window, in its usual size if it was an icon.
    void BringToFront();
    /// The document's title for a menu or a tab, with the mark of what is modified.
    CString ListedTitle() const;
    /// Closed by the user; the window lives until control returns to the event loop.
    bool IsClosing() const { return m_closing; }

protected:
    void closeEvent(QCloseEvent* event) override;

private:
    friend class CKsMDIFrameWnd;
    bool IsLastOfDocument() const;
    void UpdateTitle();
    QPointer<CView> m_view;
    bool m_asked = false, m_closing = false;
};

/// The area of the document windows. While there are none it shows a hint.
class KS_API CKsMDIArea : public QMdiArea
{
    Q_OBJECT
public:
    using QMdiArea::QMdiArea;
    void SetHint(const CString& hint);
    /// Names the tabs by the documents of their windows; after tabs were made.
    void UpdateTabs();

protected:
    bool eventFilter(QObject* object, QEvent* event) override;
    void changeEvent(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    CString m_hint;
};

struct KsHelpChapter;

/// The main frame: document windows, menus by position, tool bars by editor. The shell derives from it.
class KS_API CKsMDIFrameWnd : public QMainWindow, public CKsWindow
{
    Q_OBJECT
public:
    explicit CKsMDIFrameWnd(QWidget* parent = nullptr);
    /// Destroys the document windows; a derived frame that answers messages calls DestroyWindows in its own destructor.
    ~CKsMDIFrameWnd() override;

    CKsMDIArea& MdiArea() const { return *m_area; }
    /// The view of the active window; null when there is none.
    CView* GetActiveView() const { return m_activeView; }
    CKsDoc* ActiveDocument() const;
    /// Enables or greys the menu at a position of the menu bar, counted from 0.
    void EnableMenuItem(int position, bool enable);
    /// Shows a window of the area for the first time, large enough to work in, and activates it.
    void ShowWindow(CKsMDIChildWnd* window);
    /// Where windows are shown from now on, in the area; an empty place: where there is room.
    void PlaceNewWindows(const QRect& place) { m_newPlace = place; }
    /// Asks for every modified document, then saves those that shall be saved, then closes all windows. False, and
    /// nothing closed, when one was kept, which leaves everything as it was, or when a save failed.
    bool CloseAllWindows();
    /// The same for some of them.
    bool CloseWindows(const QList<QMdiSubWindow*>& windows);
    /// Asks the active view before another window, a dialog or a command takes over; see CView::MayLeave.
    bool MayLeave();
    /// Sends a command to the active view; false when there is none or it cannot do it now.
    bool SendCommand(int id);
    /// Likewise; where the active view has no such command, the window that was active last and has it comes to the
    /// front.
    bool SendToNearest(int id);
    /// Whether SendToNearest finds anybody.
    bool HasCommand(int id) const { return NearestWith(id); }
    /// Shows a text in the status bar until another takes its place. The tips of menus and buttons cover it only while
    /// they are looked at.
    void TellStatus(const CString& text);

    /// What the frame itself has to say in the help.
    virtual std::vector<KsHelpChapter> HelpChapters() const;

signals:
    /// Which commands can be carried out may have changed: another view or another focus.
    void CommandStateChanged();

protected:
    /// A click outside the active view leaves it, so the view is asked before the click arrives.
    bool eventFilter(QObject* object, QEvent* event) override;
    bool event(QEvent* event) override;
    /// Another view, or none, became active. Called before the views hear of it.
    virtual void ActiveViewChanged(CView* view);
    void DestroyWindows();

private:
    QMdiSubWindow* NearestWith(int id) const;
    bool LeavesView(const QWidget* clicked) const;
    void SubWindowActivated();
    CKsMDIArea* m_area;
    QPointer<CView> m_activeView;
    QRect m_newPlace;
    CString m_told; // in the status bar, also while a tip covers it
};

/// A button of a tool bar resource; command 0 is a separator.
struct CKsToolBarButton
{
    int command;      // also the string number of its text
    const char* icon; // resource path
    CString text;     // "status text\ntool tip"
};

/// A tool bar of an editor. Buttons send their command to the frame's active view (CCommandTarget) and are greyed while
/// it cannot carry them out.
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

private:
    void UpdateButtons();
    QPointer<CKsMDIFrameWnd> m_frame;
    unsigned m_style = 0;
};

inline constexpr unsigned CBRS_TOOLTIPS = 0x10, CBRS_FLYBY = 0x20, CBRS_SIZE_DYNAMIC = 0x4;
inline constexpr unsigned CBRS_ALIGN_LEFT = 0x1000, CBRS_ALIGN_TOP = 0x2000, CBRS_ALIGN_RIGHT = 0x4000,
                          CBRS_ALIGN_BOTTOM = 0x8000, CBRS_ALIGN_ANY = 0xF000;
