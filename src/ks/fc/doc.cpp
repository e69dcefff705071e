#include "ks/fc/doc.h"

#include "ks/fc/doc_template.h"
#include "ks/fc/message_box.h"
#include "ks/fc/shown_text.h"
#include "ks/fc/system_reason.h"
#include "ks/fc/unsaved_changes.h"

#include <QApplication>
#include <QDir>
#include <QFileInfo>
#include <QUndoStack>
#include <algorithm>
#include <cerrno>
#include <fstream>
#include <utility>

static std::optional<HDDateTime> dateOfFiles;

CKsDatesOfFiles::CKsDatesOfFiles(const HDDateTime& date)
    : m_before(std::exchange(dateOfFiles, date.IsValid() ? std::optional(date) : dateOfFiles))
{
}

CKsDatesOfFiles::~CKsDatesOfFiles()
{
    dateOfFiles = m_before;
}

CKsDoc::CKsDoc()
    : m_dateOfFile(dateOfFiles.value_or(HDDateTime::Now())),
      m_undo(new QUndoStack(this)),
      m_unsaved(std::make_unique<CKsUnsavedChanges>())
{
    // Undoing back to what was saved leaves nothing to save.
    connect(m_undo, &QUndoStack::cleanChanged, this, [this](bool clean) {
        if (clean)
            m_unsaved->Clear();
        SetModifiedFlag(!clean);
    });
    connect(m_undo, &QUndoStack::indexChanged, this, &CKsDoc::StepMade);
}

CKsDoc::~CKsDoc()
{
    for (CView* view : m_views)
        view->m_document = nullptr;
}

BOOL CKsDoc::OnNewDocument()
{
    DeleteContents();
    SetPathName({});
    SetModifiedFlag(false);
    return true;
}

BOOL CKsDoc::OnOpenDocument(const CString& path)
{
    const QFileInfo info(path);
    errno = 0;
    const CString reason = !info.exists()   ? tr("The file does not exist.")
                           : !info.isFile() ? tr("This is not a file.")
                           : !std::ifstream(info.filesystemFilePath())
                               ? KsSystemSentence({errno, std::generic_category()})
                               : CString();
    if (!reason.isEmpty()) {
        KsMessageBox(tr("%1 could not be opened.\n%2").arg(QDir::toNativeSeparators(path), reason));
        return false;
    }
    DeleteContents();
    SetModifiedFlag(false);
    return true;
}

void CKsDoc::DeleteContents()
{
    m_undo->clear();
}

Result<std::string> CKsDoc::ContentText() const
{
    return Error{.message = "The document has no text.",
                 .code = std::make_error_code(std::errc::operation_not_supported)};
}

bool CKsDoc::TakeContent(std::string, const CString&)
{
    return false;
}

void CKsDoc::HoldFile(const CString&) {}

CString CKsDoc::HolderOf(const CString&) const
{
    return {};
}

bool CKsDoc::MayChange()
{
    if (!IsReadOnly())
        return true;
    Say(WhyReadOnly());
    return false;
}

void CKsDoc::OnCloseDocument()
{
    DeleteContents();
}

void CKsDoc::SetPathName(const CString& path)
{
    m_named = true;
    if (path == m_path)
        return;
    const CString old = std::exchange(m_path, path);
    if (!path.isEmpty())
        m_title.clear(); // from now on the file's name
    emit PathNameChanged(old, path);
    emit TitleChanged();
}

CString CKsDoc::GetTitle() const
{
    return m_title.isEmpty() && !m_path.isEmpty() ? KsVisibleText(QFileInfo(m_path).fileName()) : m_title;
}

void CKsDoc::SetTitle(const CString& title)
{
    if (std::exchange(m_title, title) != title)
        emit TitleChanged();
}

void CKsDoc::SetModifiedFlag(bool modified)
{
    if (std::exchange(m_modified, modified) != modified)
        emit TitleChanged();
}

void CKsDoc::UpdateAllViews(CView* sender, int hint, CHint* object)
{
    const auto views = m_views; // a view may come or go meanwhile
    for (CView* view : views) {
        if (view != sender && std::find(m_views.begin(), m_views.end(), view) != m_views.end())
            view->OnUpdate(sender, hint, object);
    }
}

void CKsDoc::UpdateAll(CView* sender, int hint, CHint* object)
{
    SetModifiedFlag(true);
    UpdateAllViews(sender, hint, object);
    if (sender && !sender->isAncestorOf(QApplication::focusWidget()))
        sender->setFocus();
}

/// What a complete step that was undone or redone has changed.
void CKsDoc::StepMade(int index)
{
    const bool isUndo = index < std::exchange(m_steps, index);
    if (!m_stepShows)
        return; // a new step
    emit Reveal(*std::exchange(m_stepShows, std::nullopt));
    Say(isUndo ? tr("Undone: %1").arg(m_undo->redoText()) : tr("Redone: %1").arg(m_undo->undoText()));
}

void CKsDoc::AddView(CView* view)
{
    if (view->m_document == this)
        return;
    if (view->m_document)
        view->m_document->RemoveView(view);
    view->m_document = this;
    m_views.push_back(view);
}

void CKsDoc::RemoveView(CView* view)
{
    if (std::erase(m_views, view))
        view->m_document = nullptr;
}
