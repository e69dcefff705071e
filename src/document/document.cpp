#include "document/document.h"

#include "files/safe_file.h"
#include "ks/fc/message_box.h"
#include "document/purged_lines.h"
#include "grid/row_source.h"
#include "res/strings.h"

#include <QApplication>
#include <QDir>
#include <QFileInfo>
#include <QPointer>
#include <QTimer>
#include <QUndoStack>
#include <algorithm>
#include <utility>

namespace {

constexpr int HDPackageKind = 8; // what this editor's packages call themselves

/// The rows of defaults that are written although nobody has edited them, in their tables during a save only.
class FirstRows
{
public:
    explicit FirstRows(const std::vector<CKavo0_hdDoc::ShownRows>& shown)
    {
        for (const auto& table : shown)
            if (table.writesFirstRow && table.rows->IsEmpty())
                m_filled.push_back(table.rows);
        for (const auto& rows : m_filled)
            rows->Put(0, rows->NewRows(1));
    }
    ~FirstRows()
    {
        for (const auto& rows : m_filled)
            rows->Take(0, 1);
    }
    FirstRows(const FirstRows&) = delete;
    FirstRows& operator=(const FirstRows&) = delete;

private:
    std::vector<std::shared_ptr<IRowSource>> m_filled;
};

} // namespace

CKavo0_hdDoc::CKavo0_hdDoc()
{
    connect(&UndoStack(), &QUndoStack::indexChanged, this, &CKavo0_hdDoc::StepMade);
}

bool CKavo0_hdDoc::HasExtension(const CString& path)
{
    // Mixed spellings are refused: the shell's file tables know these two.
    const CString extension = QFileInfo(path).suffix();
    return extension == QLatin1String("HDKV") || extension == QLatin1String("hdkv");
}

BOOL CKavo0_hdDoc::OnNewDocument()
{
    return CKsDoc::OnNewDocument();
}

BOOL CKavo0_hdDoc::OnOpenDocument(const CString& path)
{
    if (!CKsDoc::OnOpenDocument(path))
        return false;
    if (!HasExtension(path)) {
        KsMessageBox(LoadString(Str::UnsupportedFormat));
        return false;
    }
    m_file.Read(path, m_parameters);
    m_isReadOnly = m_file.IsUnreadable();
    emit FileStateChanged();
    return true;
}

CString CKavo0_hdDoc::SavePathFor(const CString& path) const
{
    return CDocumentFile::SavePathFor(path);
}

BOOL CKavo0_hdDoc::OnSaveDocument(const CString& path)
{
    if (!MayLeave())
        return false;
    const CString target = SavePathFor(path);
    UpdateAllViews(nullptr, Hint::Store);
    if (!MayReplace(target, path) || !m_file.MayReplace(target))
        return false;

    auto purged = std::make_unique<CPurgedLines>(*this);
    purged->TakeOut();
    if (!WriteData(target)) {
        purged->PutBack(); // what is in memory stays as the user left it
        UpdateAllViews(nullptr, Hint::Reload);
        return false;
    }
    const QString dropped = purged->Summary();
    if (!purged->IsEmpty())
        UndoStack().push(purged.release());
    UndoStack().setClean();

    m_isReadOnly = false;
    SetPathName(target);
    UpdateAllViews(nullptr, Hint::Reload);
    SetModifiedFlag(false);
    emit FileStateChanged();
    QString saved = dropped.isEmpty() ? LoadString(Str::Saved) : LoadString(Str::SavedDropping).arg(dropped);
    if (const std::size_t unwritten = UnwrittenSetups(); unwritten > 0)
        saved += QStringLiteral("   ") + LoadCounted(unwritten, Str::SetupNotWritten, Str::SetupsNotWritten);
    Say(m_file.Renamed().isEmpty() ? saved : saved + QStringLiteral("   ") + m_file.Renamed());
    return true;
}

bool CKavo0_hdDoc::MayReplace(const CString& target, const CString& path)
{
    // Only a plain save whose name changes case can meet a file nobody was asked about: Save As has asked already.
    if (path != GetPathName() || path == target || !QFileInfo::exists(target) ||
        SameFile(path.toStdString(), target.toStdString()))
        return true;
    const CString question =
        LoadString(Str::ReplaceOtherSpelling).arg(QFileInfo(target).fileName(), QFileInfo(path).fileName());
    return KsMessageBox(question, QMessageBox::Yes | QMessageBox::No) == QMessageBox::Yes;
}

/// Set-ups of encroachment that hold too little for the file.
std::size_t CKavo0_hdDoc::UnwrittenSetups() const
{
    const auto& setups = m_parameters.EncroachList;
    std::size_t unwritten = 0;
    for (std::size_t setup = 0; setup < setups.GetCount(); ++setup)
        unwritten += !CGenMetaList<HDEncroach>::IsWorthKeeping(setups.GetAt(setup));
    return unwritten;
}

/// Writes the whole content; on failure the user has been told and the file is what it was.
bool CKavo0_hdDoc::WriteData(const CString& path)
{
    const FirstRows defaults(m_rowsShown);
    return m_file.Write(m_parameters, path);
}

void CKavo0_hdDoc::EditUnreadable()
{
    m_isReadOnly = false;
    emit FileStateChanged();
}

void CKavo0_hdDoc::AtSave(ShownRows shown)
{
    const auto sameTable = [&](const ShownRows& known) { return known.rows->Data() == shown.rows->Data(); };
    if (std::ranges::none_of(m_rowsShown, sameTable))
        m_rowsShown.push_back(std::move(shown));
}

void CKavo0_hdDoc::DeleteContents()
{
    UndoStack().clear();
    m_rowsShown.clear();
    m_parameters.RemoveAllRecords();
    CKsDoc::DeleteContents();
}

LRESULT CKavo0_hdDoc::SendToShell(unsigned message, WPARAM request, CView* view, const CString& name, CObList* objects)
{
    CKSComm_Package package;
    package.view = view;
    package.text = name;
    package.kind = HDPackageKind;
    package.project = m_hProject;
    package.objects = objects;
    return KsSendMessage(KsMainWindow(), message, request, reinterpret_cast<LPARAM>(&package));
}

BOOL CKavo0_hdDoc::GetProjectInfo(CView* view, const CString& name)
{
    m_hProject = 0;
    m_hProject = SendToShell(KsMessage::SwitchBoard(), KsRequest::JoinProject, view, name);
    return m_hProject != 0;
}

LRESULT CKavo0_hdDoc::AskShell(WPARAM request, CView* view, CObList* objects)
{
    return m_hProject ? SendToShell(KsMessage::SwitchBoard(), request, view, GetPathName(), objects) : 0;
}

void CKavo0_hdDoc::TellShell(WPARAM news, CView* view, CObList* objects)
{
    if (m_hProject)
        SendToShell(KsMessage::BetweenEditors(), news, view, GetPathName(), objects);
}

void CKavo0_hdDoc::LeaveProject(CView* view, const CString& name)
{
    if (m_hProject)
        SendToShell(KsMessage::SwitchBoard(), KsRequest::LeaveProject, view, name);
}

void CKavo0_hdDoc::StepMade(int index)
{
    ShowStep(index < std::exchange(m_steps, index));
    TellStep();
}

/// What a complete step that was undone or redone has changed.
void CKavo0_hdDoc::ShowStep(bool isUndo)
{
    if (!m_stepShows)
        return; // a new step
    emit Reveal(*std::exchange(m_stepShows, std::nullopt));
    Say(LoadString(isUndo ? Str::Undone : Str::Redone).arg(isUndo ? UndoStack().redoText() : UndoStack().undoText()));
}

/// A step comes in the middle of things: the page that made it goes on storing, and whoever hears of it may ask at
/// once.
void CKavo0_hdDoc::TellStep()
{
    if (!m_hProject || UndoStack().count() == 0) // a cleared stack is no step
        return;
    if (m_untold++ == 0)
        QTimer::singleShot(0, this, &CKavo0_hdDoc::TellChanges);
}

void CKavo0_hdDoc::TellChanges()
{
    for (int steps = std::exchange(m_untold, 0); steps > 0; --steps)
        DataChange(GetPathName());
}

void CKavo0_hdDoc::DataChange(const CString& name)
{
    if (m_hProject)
        SendToShell(KsMessage::BetweenEditors(), KsRequest::DataChanged, nullptr, name);
}

void CKavo0_hdDoc::UpdateAll(CView* sender, int hint, CHint* object)
{
    SetModifiedFlag(true);
    UpdateAllViews(sender, hint, object);
    if (sender && !sender->isAncestorOf(QApplication::focusWidget()))
        sender->setFocus();
}
