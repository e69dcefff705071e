#include "ks/fc/frames.h"

#include "ks/fc/help_window.h"

#include "ks/fc/doc_template.h"
#include "ks/fc/shown_text.h"

#include <QAction>
#include <QApplication>
#include <QCloseEvent>
#include <QMenu>
#include <QMenuBar>
#include <QPainter>
#include <QStatusBar>
#include <QStatusTipEvent>
#include <QStyle>
#include <QTabBar>
#include <algorithm>
#include <set>
#include <utility>

// ---- commands ----------------------------------------------------------------------------------

CCommandTarget::~CCommandTarget() = default;

bool CCommandTarget::OnCommand(int)
{
    return false;
}

bool CCommandTarget::IsCommandEnabled(int) const
{
    return false;
}

std::vector<CKsMenuCommand> CCommandTarget::LinesMenu() const
{
    return {};
}

std::vector<CKsMenuCommand> CCommandTarget::EditMenu() const
{
    return {};
}

// ---- document window ---------------------------------------------------------------------------

CKsMDIChildWnd::CKsMDIChildWnd(QWidget* parent) : QMdiSubWindow(parent)
{
    setAttribute(Qt::WA_DeleteOnClose);
    // The frame closes windows by its own keys; a second owner would make them ambiguous, and then nobody acts.
    if (QMenu* menu = systemMenu())
        for (QAction* action : menu->actions())
            action->setShortcuts({});
}

CKsMDIChildWnd::~CKsMDIChildWnd()
{
    CKsDoc* document = m_view ? m_view->GetDocument() : nullptr;
    delete m_view; // it still talks to its document
    if (document && document->Views().empty() && document->GetDocTemplate())
        document->GetDocTemplate()->CloseDocument(document);
}

bool CKsMDIChildWnd::OnCreateClient(CView* view)
{
    m_view = view;
    setWidget(view);
    if (CKsDoc* document = view->GetDocument()) {
        connect(document, &CKsDoc::TitleChanged, this, &CKsMDIChildWnd::UpdateTitle);
        UpdateTitle();
    }
    return true;
}

CKsMDIChildWnd* CKsMDIChildWnd::Of(const CView* view)
{
    for (QWidget* widget = view ? view->parentWidget() : nullptr; widget; widget = widget->parentWidget()) {
        if (auto* window = qobject_cast<CKsMDIChildWnd*>(widget))
            return window;
    }
    return nullptr;
}

void CKsMDIChildWnd::BringToFront()
{
    if (isMinimized())
        showNormal();
    if (mdiArea())
        mdiArea()->setActiveSubWindow(this);
}

void CKsMDIChildWnd::UpdateTitle()
{
    if (!m_view || !m_view->GetDocument())
        return;
    setWindowTitle(KsTitleText(m_view->GetDocument()->GetTitle()) + QStringLiteral("[*]"));
    setWindowModified(m_view->GetDocument()->IsModified());
    setToolTip({});
}

CString CKsMDIChildWnd::ListedTitle() const
{
    const CKsDoc* document = m_view ? m_view->GetDocument() : nullptr;
    const CString title = document ? document->GetTitle() : windowTitle();
    return KsWithoutMnemonics(isWindowModified() ? title + u'*' : title);
}

bool CKsMDIChildWnd::IsLastOfDocument() const
{
    return m_view && m_view->GetDocument() && m_view->GetDocument()->Views().size() == 1;
}

void CKsMDIChildWnd::closeEvent(QCloseEvent* event)
{
    if (!m_asked && IsLastOfDocument() && !m_view->GetDocument()->SaveModified()) {
        event->ignore();
        return;
    }
    m_closing = true;
    QMdiSubWindow::closeEvent(event);
}

// ---- area of the document windows --------------------------------------------------------------

void CKsMDIArea::SetHint(const CString& hint)
{
    m_hint = hint;
    viewport()->update();
}

/// The area itself takes a window's title for that of its tab, as if & marked a letter there.
void CKsMDIArea::UpdateTabs()
{
    auto* bar = findChild<QTabBar*>(QString(), Qt::FindDirectChildrenOnly);
    const auto windows = subWindowList(QMdiArea::CreationOrder); // that of the tabs
    for (int tab = 0; bar && tab < bar->count() && tab < windows.size(); ++tab) {
        const auto* window = qobject_cast<CKsMDIChildWnd*>(windows[tab]);
        if (window && bar->tabText(tab) != window->ListedTitle())
            bar->setTabText(tab, window->ListedTitle());
    }
}

bool CKsMDIArea::eventFilter(QObject* object, QEvent* event)
{
    const bool taken = QMdiArea::eventFilter(object, event);
    if (event->type() == QEvent::WindowTitleChange || event->type() == QEvent::ModifiedChange ||
        event->type() == QEvent::Show)
        UpdateTabs();
    return taken;
}

void CKsMDIArea::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::PaletteChange)
        setBackground(palette().window());
    QMdiArea::changeEvent(event);
}

void CKsMDIArea::paintEvent(QPaintEvent* event)
{
    QMdiArea::paintEvent(event);
    if (m_hint.isEmpty() || !subWindowList().isEmpty())
        return;
    QPainter painter(viewport());
    painter.setPen(palette().color(QPalette::WindowText)); // on the frame's colour; a fainter one is hard to read
    painter.drawText(viewport()->rect().adjusted(20, 20, -20, -20), Qt::AlignCenter | Qt::TextWordWrap, m_hint);
}

// ---- main frame --------------------------------------------------------------------------------

CKsMDIFrameWnd::CKsMDIFrameWnd(QWidget* parent) : QMainWindow(parent), m_area(new CKsMDIArea(this))
{
    m_area->setBackground(palette().window());
    setCentralWidget(m_area);
    connect(m_area, &QMdiArea::subWindowActivated, this, &CKsMDIFrameWnd::SubWindowActivated);
    connect(qApp, &QApplication::focusChanged, this, &CKsMDIFrameWnd::CommandStateChanged);
    qApp->installEventFilter(this);
}

CKsMDIFrameWnd::~CKsMDIFrameWnd()
{
    DestroyWindows();
    if (KsMainWindow() == this)
        KsSetMainWindow(nullptr);
}

void CKsMDIFrameWnd::DestroyWindows()
{
    disconnect(m_area, nullptr, this, nullptr);
    disconnect(qApp, nullptr, this, nullptr);
    qApp->removeEventFilter(this);
    // Also those that are closed and wait for their deletion, which the area no longer lists.
    const auto windows = m_area->findChildren<CKsMDIChildWnd*>();
    for (CKsMDIChildWnd* window : windows)
        delete window;
    m_activeView = nullptr;
}

std::vector<KsHelpChapter> CKsMDIFrameWnd::HelpChapters() const
{
    return {};
}

void CKsMDIFrameWnd::EnableMenuItem(int position, bool enable)
{
    if (QAction* menu = menuBar()->actions().value(position))
        menu->setEnabled(enable);
}

void CKsMDIFrameWnd::ShowWindow(CKsMDIChildWnd* window)
{
    if (m_newPlace.isValid()) {
        window->setGeometry(m_newPlace);
        window->show();
        m_area->setActiveSubWindow(window);
        return;
    }
    const QSize area = m_area->viewport()->size();
    window->resize(window->sizeHint().expandedTo(area * 2 / 3).boundedTo(area));
    window->show();
    if (m_area->viewMode() == QMdiArea::SubWindowView) {
        // One behind the other, every title in sight.
        const int step = window->style()->pixelMetric(QStyle::PM_TitleBarHeight), places = 6;
        const int place = int(m_area->subWindowList().size() - 1) % places;
        window->move(place * step, place * step);
    }
    m_area->setActiveSubWindow(window);
}

CKsDoc* CKsMDIFrameWnd::ActiveDocument() const
{
    return m_activeView ? m_activeView->GetDocument() : nullptr;
}

bool CKsMDIFrameWnd::CloseAllWindows()
{
    return CloseWindows(m_area->subWindowList());
}

bool CKsMDIFrameWnd::CloseWindows(const QList<QMdiSubWindow*>& windows)
{
    std::set<CKsDoc*> asked;
    std::vector<CKsDoc*> toSave; // once every question is answered: a later Cancel takes back no save
    for (QMdiSubWindow* window : windows) {
        const auto* child = qobject_cast<CKsMDIChildWnd*>(window);
        CKsDoc* document = child && child->GetActiveView() ? child->GetActiveView()->GetDocument() : nullptr;
        if (!document || !asked.insert(document).second)
            continue;
        const KsClosing answer = document->AskToClose();
        if (answer == KsClosing::Keep)
            return false;
        if (answer == KsClosing::Save)
            toSave.push_back(document);
    }
    if (!std::ranges::all_of(toSave, [](CKsDoc* document) { return document->DoSave(document->GetPathName()); }))
        return false;
    for (QMdiSubWindow* window : windows) {
        if (auto* child = qobject_cast<CKsMDIChildWnd*>(window))
            child->m_asked = true;
        window->close();
    }
    return true;
}

bool CKsMDIFrameWnd::MayLeave()
{
    return !m_activeView || m_activeView->MayLeave(KsLeave::Page);
}

/// Menus, other dialogs and what floats above the frame do not leave a view: what is chosen there asks.
bool CKsMDIFrameWnd::LeavesView(const QWidget* clicked) const
{
    return m_activeView && clicked->window() == this && !m_activeView->isAncestorOf(clicked) &&
           clicked != m_activeView && !qobject_cast<const QMenuBar*>(clicked) && !QApplication::activePopupWidget() &&
           !QApplication::activeModalWidget();
}

/// Asked when the frame's window gets the click: the widget that gets it afterwards has the focus by then, and its
/// window is the active one.
bool CKsMDIFrameWnd::eventFilter(QObject* object, QEvent* event)
{
    if (event->type() == QEvent::MouseButtonPress && object == windowHandle()) {
        const QPointer<QWidget> clicked = childAt(static_cast<QMouseEvent*>(event)->position().toPoint());
        // What the question changes may take the clicked widget away.
        if (clicked && LeavesView(clicked) && (!MayLeave() || !clicked))
            return true;
    }
    return QMainWindow::eventFilter(object, event);
}

void CKsMDIFrameWnd::TellStatus(const CString& text)
{
    m_told = KsVisibleText(text);
    statusBar()->showMessage(m_told);
}

/// A tip that ends comes as an empty one, which would take away what had been told - by the command just chosen, too.
bool CKsMDIFrameWnd::event(QEvent* event)
{
    if (event->type() != QEvent::StatusTip)
        return QMainWindow::event(event);
    const CString tip = static_cast<QStatusTipEvent*>(event)->tip();
    statusBar()->showMessage(tip.isEmpty() ? m_told : tip);
    return true;
}

bool CKsMDIFrameWnd::SendCommand(int id)
{
    auto* target = dynamic_cast<CCommandTarget*>(m_activeView.data());
    return target && target->IsCommandEnabled(id) && m_activeView->MayLeave(KsLeave::Field) && target->OnCommand(id);
}

QMdiSubWindow* CKsMDIFrameWnd::NearestWith(int id) const
{
    const auto windows = m_area->subWindowList(QMdiArea::ActivationHistoryOrder);
    for (auto window = windows.rbegin(); window != windows.rend(); ++window) {
        const auto* child = qobject_cast<CKsMDIChildWnd*>(*window);
        CView* view = child && !child->IsClosing() ? child->GetActiveView() : nullptr;
        if (const auto* target = dynamic_cast<CCommandTarget*>(view); target && target->IsCommandEnabled(id))
            return *window;
    }
    return nullptr;
}

bool CKsMDIFrameWnd::SendToNearest(int id)
{
    QMdiSubWindow* window = NearestWith(id);
    if (!window || (m_activeView && !m_activeView->MayLeave(KsLeave::Field)))
        return false;
    m_area->setActiveSubWindow(window);
    return SendCommand(id);
}

void CKsMDIFrameWnd::ActiveViewChanged(CView*) {}

void CKsMDIFrameWnd::SubWindowActivated()
{
    // The area also reports that the whole program lost the focus; its current window is active still.
    const auto* window = qobject_cast<CKsMDIChildWnd*>(m_area->currentSubWindow());
    CView* view = window && !window->IsClosing() ? window->GetActiveView() : nullptr;
    if (view == m_activeView)
        return;
    const QPointer<CView> deactivated = std::exchange(m_activeView, view);
    ActiveViewChanged(view);
    if (deactivated)
        deactivated->OnActivateView(false, view, deactivated);
    if (view)
        view->OnActivateView(true, view, deactivated);
    emit CommandStateChanged();
}
