#include "ks/fc/project_view.h"

#include "ks/fc/after_paint.h"
#include "ks/fc/file_bar.h"
#include "ks/fc/outside_change.h"
#include "ks/fc/view_states.h"
#include "ks/language/language.h"
#include "ks/units/edit_style.h"

#include <QTimer>
#include <QVBoxLayout>
#include <utility>

CKsProjectView::~CKsProjectView()
{
    if (CKsProjectDoc* document = ProjectDoc()) {
        document->LeaveProject(this);
        document->DataChanged();
    }
}

void CKsProjectView::OnInitialUpdate()
{
    CView::OnInitialUpdate();
    ProjectDoc()->JoinProject(this);
    KsAfterPaint(this, ProjectDoc(), [document = ProjectDoc()] { document->Outside().Watch(); });
    connect(ProjectDoc(), &CKsDoc::Said, this, &CKsProjectView::Say);
    connect(ProjectDoc(), &CKsDoc::Reveal, this, &CKsProjectView::RevealChange);
    for (auto switched : {&KsUnits::Changed, &KsUnits::DigitsChanged})
        connect(&KsUnits::Instance(), switched, this, [this] { OnUpdate(nullptr, CKsDoc::ReloadHint, nullptr); });
    connect(&KsLanguage::Instance(), &KsLanguage::Changed, this, &CKsProjectView::ShowStatus);
}

void CKsProjectView::SetContent(QWidget* content)
{
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(new CKsFileBar(*ProjectDoc(), this));
    layout->addWidget(content, 1);
}

void CKsProjectView::OnUpdate(CView*, int, CHint*)
{
    MovedOn(); // a paste or an undone step may have changed the lines and the current cell
}

void CKsProjectView::OnActivateView(bool activate, CView* activated, CView* deactivated)
{
    if (activate) {
        SendToolbarMessage(KsMessage::ShowToolbar());
        ShowStatus();
    } else if (activated && (activated == deactivated || activated->metaObject() != metaObject())) {
        SendToolbarMessage(KsMessage::HideToolbar()); // another editor's turn
    }
    if (!activate)
        KeepArrangement(); // the program may not come to its end
    CView::OnActivateView(activate, activated, deactivated);
}

void CKsProjectView::KeepArrangement() const
{
    if (ProjectDoc())
        KsViewStates::Keep(ProjectDoc()->GetPathName(), Arrangement());
}

QVariantMap CKsProjectView::KeptArrangement() const
{
    return KsViewStates::Of(ProjectDoc()->GetPathName());
}

CKsMDIFrameWnd* CKsProjectView::MainFrame() const
{
    return qobject_cast<CKsMDIFrameWnd*>(window());
}

bool CKsProjectView::IsActive() const
{
    return !MainFrame() || MainFrame()->GetActiveView() == this;
}

void CKsProjectView::ShowStatus()
{
    if (!MainFrame() || !IsActive())
        return;
    const CString place = PlaceText();
    if (m_saidAt.isEmpty()) // while a dialog was up
        m_saidAt = place;
    if (place != m_saidAt)
        m_said.clear();
    QStringList parts{place, SelectionText(), m_said};
    parts.removeAll(CString());
    MainFrame()->TellStatus(parts.join(QStringLiteral("   ")));
}

void CKsProjectView::MovedOn()
{
    m_said.clear();
    ShowStatus();
}

/// When the present event is over: lines that become current in it are shown first, and would hide what is said.
void CKsProjectView::Say(const CString& text)
{
    QTimer::singleShot(0, this, [this, text] {
        m_said = text;
        m_saidAt = PlaceText();
        ShowStatus();
    });
}

void CKsProjectView::SendToolbarMessage(unsigned message)
{
    CKSComm_Package package;
    package.view = this;
    KsSendMessage(KsMainWindow(), message, 0, reinterpret_cast<LPARAM>(&package));
}

LRESULT CKsProjectView::WindowProc(unsigned message, WPARAM wParam, LPARAM lParam)
{
    if (message == KsMessage::BetweenEditors()) {
        auto* package = reinterpret_cast<CKSComm_Package*>(lParam);
        if (package)
            return OnRequest(wParam, *package);
        qDebug("%s: request %llu without a package", metaObject()->className(),
               static_cast<unsigned long long>(wParam));
        return 0;
    }
    if (message == KsMessage::ProjectManagement()) {
        OnProjectsChanged();
        return 0;
    }
    return CView::WindowProc(message, wParam, lParam);
}

LRESULT CKsProjectView::OnRequest(WPARAM request, CKSComm_Package&)
{
    qDebug("%s: unknown request %llu", metaObject()->className(), static_cast<unsigned long long>(request));
    return 0;
}
