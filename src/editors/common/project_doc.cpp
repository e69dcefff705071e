#include "editors/common/project_doc.h"

#include "ks/fc/exchange.h"
#include "ks/fc/message_box.h"

#include <QDir>
#include <QUndoStack>

namespace {

LRESULT Send(CKsWindow* window, unsigned message, WPARAM request, CKSComm_Package& package)
{
    return KsSendMessage(window, message, request, reinterpret_cast<LPARAM>(&package));
}

} // namespace

CProjectDoc::CProjectDoc(int kind) : m_kind(kind) {}

BOOL CProjectDoc::OnOpenDocument(const CString& path)
{
    if (!CKsDoc::OnOpenDocument(path))
        return false;
    const QString reason = ReadFile(path);
    if (!reason.isEmpty())
        KsMessageBox(reason);
    return reason.isEmpty();
}

BOOL CProjectDoc::OnSaveDocument(const CString& path)
{
    UpdateAllViews(nullptr, StoreHint);
    const QString reason = WriteFile(path);
    if (!reason.isEmpty()) {
        KsMessageBox(tr("%1 could not be saved.\n%2").arg(QDir::toNativeSeparators(path), reason));
        return false;
    }
    UndoStack().setClean();
    SetModifiedFlag(false);
    return true;
}

CKSComm_Package CProjectDoc::Package(CView* view, CObList* objects) const
{
    CKSComm_Package package;
    package.view = view;
    package.text = GetPathName();
    package.kind = m_kind;
    package.project = m_project;
    package.objects = objects;
    return package;
}

bool CProjectDoc::JoinProject(CView* view)
{
    m_project = 0;
    CKSComm_Package package = Package(view, nullptr);
    m_project = Send(KsMainWindow(), KsMessage::SwitchBoard(), KsRequest::JoinProject, package);
    return m_project != 0;
}

void CProjectDoc::LeaveProject(CView* view)
{
    if (!m_project)
        return;
    CKSComm_Package package = Package(view, nullptr);
    Send(KsMainWindow(), KsMessage::SwitchBoard(), KsRequest::LeaveProject, package);
}

void CProjectDoc::DataChanged() const
{
    if (!m_project)
        return;
    CKSComm_Package package = Package(nullptr, nullptr);
    Send(KsMainWindow(), KsMessage::BetweenEditors(), KsRequest::DataChanged, package);
}

void CProjectDoc::LocationShown(CView* view, const CString& branch, double chainage) const
{
    if (!m_project)
        return;
    auto item = std::make_unique<CKvrCBELocation>();
    item->branch = branch;
    item->chainage = chainage;
    CObList objects;
    objects.push_back(std::move(item));
    CKSComm_Package package = Package(view, &objects);
    Send(KsMainWindow(), KsMessage::BetweenEditors(), KsRequest::LocationShown, package);
}

LRESULT CProjectDoc::AskProject(WPARAM request, CView* view, CObList* objects) const
{
    if (!m_project)
        return 0;
    CKSComm_Package package = Package(view, objects);
    return Send(KsMainWindow(), KsMessage::SwitchBoard(), request, package);
}

LRESULT CProjectDoc::AskView(CView* receiver, WPARAM request, CView* sender, CObList* objects) const
{
    CKSComm_Package package = Package(sender, objects);
    return Send(receiver, KsMessage::BetweenEditors(), request, package);
}

std::vector<CView*> CProjectDoc::ProjectViews(CView* view) const
{
    CObList items;
    AskProject(KsRequest::ProjectViews, view, &items);
    std::vector<CView*> views;
    for (const auto& item : items) {
        const auto* each = dynamic_cast<const CKvrCBEView*>(item.get());
        if (each && each->view && each->view->GetDocument())
            views.push_back(each->view);
    }
    return views;
}
