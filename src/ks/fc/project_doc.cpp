#include "ks/fc/project_doc.h"

#include "files/structure.h"
#include "ks/fc/exchange.h"
#include "ks/fc/file_name.h"
#include "ks/fc/outside_change.h"

#include <QTimer>
#include <QUndoStack>
#include <algorithm>
#include <new>
#include <utility>

CKsProjectDoc::CKsProjectDoc(int kind) : m_kind(kind), m_outside(new CKsOutsideChange(*this))
{
    connect(&UndoStack(), &QUndoStack::indexChanged, this, &CKsProjectDoc::StepMade);
    connect(&m_use, &CKsFileUse::Changed, this, &CKsProjectDoc::ReadOnlyChanged);
    connect(&m_use, &CKsFileUse::LockLost, this, &CKsProjectDoc::FileStateChanged);
}

void CKsProjectDoc::ReadFile(const CString& path, const std::function<void(tqlHandle, LoadReport&)>& load)
{
    m_file.Read(path, SavePathFor(path), load);
    m_showsDefaults = m_file.IsUnreadable();
    m_file.LookForLeftBehind(m_use.IsHeld());
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
    // What stood there for a file that could not be read was nobody's content.
    const bool undoes = !m_file.IsUnreadable() || IsModified();
    m_file = std::move(file);
    m_showsDefaults = false;
    UndoStack().push(step.release());
    if (!undoes)
        UndoStack().clear();
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

/// Who reads only has nothing to lose: what is shown is somebody else's, or nobody's.
bool CKsProjectDoc::IsFileGone() const
{
    // Something else may stand in its place, or in that of its folder. What cannot be read for another reason is there.
    constexpr std::errc others[] = {std::errc::is_a_directory, std::errc::operation_not_supported,
                                    std::errc::not_a_directory, std::errc::too_many_symbolic_link_levels};
    const KsFileSight& sight = m_outside->Sight();
    const bool isOther = sight.kind == KsFileSight::Unreadable &&
                         std::ranges::any_of(others, [&sight](std::errc other) { return sight.why == other; });
    return (sight.kind == KsFileSight::Gone || isOther) && !IsReadOnly();
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
    if (!m_use.TakeTarget(target)) {
        TellNotSaved(
            tr("%1 was left as it is: it is in use by %2.").arg(KsShownFileName(target), m_use.TargetHolder()));
        return false;
    }
    const KsFileWriter locked = [&](const std::string& path, SafeFileOptions options) {
        options.isLocked = m_use.IsTargetHeld();
        return write(path, options);
    };
    const bool written = m_file.Write(target, locked);
    if (!written && !m_file.WhyNotWritten().isEmpty())
        TellNotSaved(m_file.WhyNotWritten());
    try {
        if (written)
            EditUnreadable(); // a save may end with a step of its own
        m_use.TargetWritten(written, m_file.Path());
    } catch (const std::bad_alloc&) { // the file is what it is; the bar is shown anew with the next news
    }
    return written;
}

void CKsProjectDoc::FileWritten()
{
    UndoStack().setClean();
    SetModifiedFlag(false);
    try {
        FileIsKnown();
    } catch (const std::bad_alloc&) { // it is saved all the same; what others do to it shows at the next save
    }
    SetPathName(m_file.Path()); // at last: whoever follows the name may ask something
}

void CKsProjectDoc::EditUnreadable()
{
    if (std::exchange(m_showsDefaults, false))
        ReadOnlyChanged();
}

/// The views take what may be changed from the document whenever they show it.
void CKsProjectDoc::ReadOnlyChanged()
{
    emit FileStateChanged();
    emit FileGoneChanged(); // of a file that is read only that is no matter
    if (!IsExecuting())
        UpdateAllViews(nullptr, ReloadHint);
}

void CKsProjectDoc::EditFreed()
{
    m_use.Take(GetPathName());
    if (IsInUse()) // somebody else was faster
        return;
    if (!StatusBehind(GetPathName().toStdString()).IsUnchanged(m_file.Seen()))
        return m_outside->Reload();
    UndoStack().setClean(); // it is what the file holds
    SetModifiedFlag(false);
}

void CKsProjectDoc::EditCopy()
{
    m_outside->KeepBoth();
}

CString CKsProjectDoc::WhyReadOnly() const
{
    const CString name = KsShownFileName(m_file.Path());
    return IsInUse() ? tr("%1 is in use by %2, and is not changed here.").arg(name, m_use.Holder())
                     : tr("%1 could not be read, and is not changed.").arg(name);
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
    EditUnreadable(); // somebody has edited it already
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
    if (IsInUse() && UndoStack().count() > 0) // the file was read again; going back would be a change
        QTimer::singleShot(0, this, [this] {
            UndoStack().clear();
            SetModifiedFlag(false);
        });
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
