#include "ks/fc/project_doc.h"

#include "files/structure.h"
#include "ks/fc/exchange.h"
#include "ks/fc/outside_change.h"

#include <QTimer>
#include <QUndoStack>
#include <new>
#include <utility>

CKsProjectDoc::CKsProjectDoc(int kind) : m_kind(kind), m_outside(new CKsOutsideChange(*this))
{
    connect(&UndoStack(), &QUndoStack::indexChanged, this, &CKsProjectDoc::StepMade);
}

void CKsProjectDoc::ReadFile(const CString& path, const std::function<void(tqlHandle, LoadReport&)>& load)
{
    m_file.Read(path, SavePathFor(path), load);
    m_isReadOnly = m_file.IsUnreadable();
    FileIsKnown();
}

bool CKsProjectDoc::Reload(CString& why)
{
    if (!MayLeave())
        return false;
    CKsDocumentFile file;
    std::unique_ptr<QUndoCommand> step;
    file.Read(m_file.Path(), SavePathFor(m_file.Path()), [&](tqlHandle structure, LoadReport& report) {
        step = MakeContentStep(structure, report, tr("Reload"));
    });
    why = file.WhyNothing();
    if (!step || !why.isEmpty())
        return false;
    m_file = std::move(file);
    m_isReadOnly = false;
    UndoStack().push(step.release());
    UndoStack().setClean();
    SetModifiedFlag(false);
    FileIsKnown();
    return true;
}

/// The document and its file are the same.
void CKsProjectDoc::FileIsKnown()
{
    m_isNoticeClosed = false;
    m_outside->Expect();
    emit FileStateChanged();
}

bool CKsProjectDoc::SaveOverOthers()
{
    m_file.MayReplaceOthers(true);
    const bool saved = DoSave(GetPathName());
    m_file.MayReplaceOthers(false);
    return saved;
}

bool CKsProjectDoc::WriteFile(const CString& target, const KsFileWriter& write)
{
    const bool written = m_file.Write(target, write);
    if (!written && !m_file.WhyNotWritten().isEmpty())
        TellNotSaved(m_file.WhyNotWritten());
    return written;
}

void CKsProjectDoc::FileWritten()
{
    UndoStack().setClean();
    SetPathName(m_file.Path());
    SetModifiedFlag(false);
    m_isReadOnly = false;
    try {
        FileIsKnown();
    } catch (const std::bad_alloc&) { // it is saved all the same; what others do to it shows at the next save
    }
}

void CKsProjectDoc::EditUnreadable()
{
    m_isReadOnly = false;
    emit FileStateChanged();
}

bool CKsProjectDoc::TakeContent(std::string text, const CString& step)
{
    const Result<TqlStructure> structure = ParseText(std::move(text), GetTitle().toStdString());
    if (!structure)
        return false;
    LoadReport report(structure.value().Get());
    auto command = MakeContentStep(structure.value().Get(), report, step);
    const auto findings = report.Take();
    if (!command || (!findings.empty() && findings.front().kind == Finding::NoTarget))
        return false;
    if (m_isReadOnly) // somebody has edited it already
        EditUnreadable();
    UndoStack().push(command.release());
    return true;
}

std::unique_ptr<QUndoCommand> CKsProjectDoc::MakeContentStep(tqlHandle, LoadReport&, const CString&)
{
    return nullptr;
}

LRESULT CKsProjectDoc::Send(CKsWindow* window, unsigned message, WPARAM request, CView* sender, CObList* objects) const
{
    CKSComm_Package package;
    package.view = sender;
    package.text = GetPathName();
    package.kind = m_kind;
    package.project = m_project;
    package.objects = objects;
    return KsSendMessage(window, message, request, reinterpret_cast<LPARAM>(&package));
}

bool CKsProjectDoc::JoinProject(CView* view)
{
    m_project = 0;
    m_project = Send(KsMainWindow(), KsMessage::SwitchBoard(), KsRequest::JoinProject, view, nullptr);
    return m_project != 0;
}

void CKsProjectDoc::LeaveProject(CView* view)
{
    AskProject(KsRequest::LeaveProject, view);
}

/// A step comes in the middle of things: the view that made it goes on storing, and whoever hears of it may ask at
/// once.
void CKsProjectDoc::StepMade()
{
    if (!m_project || UndoStack().count() == 0) // a cleared stack is no step
        return;
    if (m_untold++ == 0)
        QTimer::singleShot(0, this, &CKsProjectDoc::TellChanges);
}

void CKsProjectDoc::TellChanges()
{
    for (int steps = std::exchange(m_untold, 0); steps > 0; --steps)
        DataChanged();
}

void CKsProjectDoc::LocationShown(CView* view, const CString& branch, double chainage)
{
    auto shown = std::make_unique<CKvrCBELocation>();
    shown->branch = branch;
    shown->chainage = chainage;
    CObList objects;
    objects.push_back(std::move(shown));
    TellProject(KsRequest::LocationShown, view, &objects);
}

LRESULT CKsProjectDoc::AskProject(WPARAM request, CView* view, CObList* objects) const
{
    return m_project ? Send(KsMainWindow(), KsMessage::SwitchBoard(), request, view, objects) : 0;
}

void CKsProjectDoc::TellProject(WPARAM news, CView* view, CObList* objects) const
{
    if (m_project)
        Send(KsMainWindow(), KsMessage::BetweenEditors(), news, view, objects);
}

LRESULT CKsProjectDoc::AskView(CView* receiver, WPARAM request, CView* sender, CObList* objects) const
{
    return Send(receiver, KsMessage::BetweenEditors(), request, sender, objects);
}

std::vector<CView*> CKsProjectDoc::ProjectViews(CView* view) const
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

QStringList CKsProjectDoc::BranchNames(CView* view) const
{
    CObList items;
    AskProject(KsRequest::BranchNames, view, &items);
    QStringList names;
    for (const auto& item : items) {
        const auto* name = dynamic_cast<const CKvrCBEText*>(item.get());
        if (name && !name->text.isEmpty())
            names << name->text;
    }
    return names;
}
