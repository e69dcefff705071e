#include "editors/common/project_view.h"

CProjectView::~CProjectView()
{
    if (const CProjectDoc* document = ProjectDoc()) {
        ProjectDoc()->LeaveProject(this);
        document->DataChanged();
    }
}

void CProjectView::OnInitialUpdate()
{
    CView::OnInitialUpdate();
    ProjectDoc()->JoinProject(this);
}

void CProjectView::OnActivateView(bool activate, CView* activated, CView* deactivated)
{
    if (activate)
        SendToolbarMessage(KsMessage::ShowToolbar());
    else if (activated && (activated == deactivated || activated->metaObject() != metaObject()))
        SendToolbarMessage(KsMessage::HideToolbar()); // another editor's turn
    CView::OnActivateView(activate, activated, deactivated);
}

void CProjectView::SendToolbarMessage(unsigned message)
{
    CKSComm_Package package;
    package.view = this;
    KsSendMessage(KsMainWindow(), message, 0, reinterpret_cast<LPARAM>(&package));
}

LRESULT CProjectView::WindowProc(unsigned message, WPARAM wParam, LPARAM lParam)
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

LRESULT CProjectView::OnRequest(WPARAM request, CKSComm_Package&)
{
    qDebug("%s: unknown request %llu", metaObject()->className(), static_cast<unsigned long long>(request));
    return 0;
}
