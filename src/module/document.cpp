#include "module/document.h"

#include "data/safe_file.h"
#include "ks/fc/message_box.h"
#include "module/purged_lines.h"
#include "module/row_source.h"
#include "res/strings.h"

#include <QApplication>
#include <QDir>
#include <QFileInfo>
#include <QPointer>
#include <QTimer>
#include <QUndoStack>
#include <utility>

namespace {

constexpr int HDPackageKind = 8; // what this editor's packages call themselves

/// Takes the focus from the field or cell being edited, so that it commits its text, and gives it back afterwards.
class FocusPause
{
public:
    FocusPause() : m_widget(QApplication::focusWidget())
    {
        if (m_widget)
            m_widget->clearFocus();
    }
    ~FocusPause()
    {
        if (m_widget && !QApplication::focusWidget())
            m_widget->setFocus(Qt::OtherFocusReason);
    }

private:
    QPointer<QWidget> m_widget;
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
    const CString target = SavePathFor(path);
    // Questions come first: behind one the window would give the focus to its first widget.
    if (!MayReplace(target, path) || !m_file.MayReplace(target))
        return false;
    const FocusPause pause;
    UpdateAllViews(nullptr, Hint::Store);

    RemovePlaceholders();
    auto purged = std::make_unique<CPurgedLines>(*this);
    purged->Apply();
    if (!m_file.Write(m_parameters, target)) {
        purged->Revert(); // what is in memory stays as the user left it
        UpdateAllViews(nullptr, Hint::Reload);
        return false;
    }
    if (!purged->IsEmpty())
        UndoStack().push(purged.release());
    UndoStack().setClean();

    m_isReadOnly = false;
    SetPathName(target);
    UpdateAllViews(nullptr, Hint::Reload);
    SetModifiedFlag(false);
    emit FileStateChanged();
    if (!m_file.Renamed().isEmpty())
        emit Said(m_file.Renamed());
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

void CKavo0_hdDoc::EditUnreadable()
{
    m_isReadOnly = false;
    emit FileStateChanged();
}

void CKavo0_hdDoc::AddPlaceholder(CGenList& list, std::unique_ptr<HD_RiverPos> record)
{
    m_placeholders.insert(record.get());
    list.InsertAt(0, std::move(record));
}

void CKavo0_hdDoc::CleanAtSave(std::shared_ptr<IRowSource> rows, std::function<bool(const void* row)> isIncomplete)
{
    m_cleanedRows.push_back({std::move(rows), std::move(isIncomplete)});
}

void CKavo0_hdDoc::RemovePlaceholders()
{
    for (const CCleanedRows& cleaned : m_cleanedRows)
        cleaned.rows->TakeFirstRow();
    for (const ListEntry& entry : HDLists())
        if (entry.purgedAtSave)
            RemovePlaceholder(*entry.list(m_parameters));
    for (std::size_t setup = 0; setup < m_parameters.EncroachList.GetCount(); ++setup)
        RemovePlaceholder(m_parameters.EncroachList.GetAt(setup));
}

void CKavo0_hdDoc::RemovePlaceholder(CGenList& list)
{
    if (list.GetCount() == 1 && list.GetAt(0).IsBlank() && m_placeholders.erase(&list.GetAt(0)))
        list.RemoveAt(0);
}

void CKavo0_hdDoc::DeleteContents()
{
    UndoStack().clear();
    m_placeholders.clear();
    m_placeholderRows.clear();
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

/// A step comes in the middle of things: the page that made it goes on storing, and whoever hears of it may ask at
/// once.
void CKavo0_hdDoc::StepMade()
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
