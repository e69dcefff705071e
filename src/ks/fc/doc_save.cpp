// How a document is saved: by name, under a new name, and before it is closed.
#include "files/safe_file.h"
#include "ks/fc/doc.h"
#include "ks/fc/doc_template.h"
#include "ks/fc/document_file.h"
#include "ks/fc/file_dialog.h"
#include "ks/fc/file_name.h"
#include "ks/fc/message_box.h"

#include <QDir>
#include <QFileInfo>
#include <algorithm>
#include <new>
#include <utility>

namespace {

/// Asks for a name until it is one that may be written; empty when the user gives up.
CString AskSavePath(const CKsDoc& document, const CString& proposal)
{
    KsFileQuestion question;
    question.save = true;
    question.title = CKsDoc::tr("Save As");
    question.proposal = !proposal.isEmpty()                  ? proposal
                        : !document.GetPathName().isEmpty()  ? document.GetPathName()
                        : !document.StandsBeside().isEmpty() ? KsFreeFileName(document.StandsBeside())
                                                             : document.GetTitle();
    const CMultiDocTemplate* const documents = document.GetDocTemplate();
    if (documents) {
        question.filters = documents->FileDialogFilter();
        question.extension = documents->GetDocString(CMultiDocTemplate::filterExt);
    }
    while (true) {
        const CString path = KsAskFileName(question);
        if (path.isEmpty())
            return {};
        const CString written = document.SavePathFor(path);
        question.proposal = path;
        const CKsDoc* other = documents ? documents->FindDocument(written) : nullptr;
        if (other && other != &document) {
            KsMessageBox(CKsDoc::tr("%1 is open in another window. Choose another name.")
                             .arg(QDir::toNativeSeparators(written)));
            continue;
        }
        if (const CString holder = document.HolderOf(written); !holder.isEmpty()) {
            KsMessageBox(
                CKsDoc::tr("%1 is in use by %2. Choose another name.").arg(QDir::toNativeSeparators(written), holder));
            continue;
        }
        // A file whose name differs in its case only is the one that the user means.
        const CString taken = KsExistingSpelling(written);
        if (!QFileInfo::exists(taken) || KsSameFile(taken, document.GetPathName()) ||
            KsMessageBox(CKsDoc::tr("%1 exists already. Replace it?").arg(QDir::toNativeSeparators(taken)),
                         QMessageBox::Yes | QMessageBox::No) == QMessageBox::Yes)
            return path;
    }
}

} // namespace

CString CKsDoc::SavePathFor(const CString& path) const
{
    return path;
}

BOOL CKsDoc::DoSave(const CString& path, const CString& proposal)
{
    if (!MayLeave())
        return false;
    if (!path.isEmpty() && path == m_path && IsInUse() && !m_modified)
        return MayChange(); // there is nothing to lose, and so nothing to ask
    CString target = path;
    do {
        if (target.isEmpty())
            target = AskSavePath(*this, proposal);
        if (target.isEmpty())
            return false;
        if (SaveTo(std::exchange(target, {})))
            return true;
    } while (!m_whyNotSaved.isEmpty() &&
             KsMessageBox(m_whyNotSaved + u'\n' + tr("The changes are not saved. Save them under another name?"),
                          QMessageBox::Yes | QMessageBox::No) == QMessageBox::Yes);
    return false;
}

bool CKsDoc::SaveTo(const CString& target)
{
    m_named = false;
    m_whyNotSaved.clear();
    m_executing = true;
    bool saved = false;
    try {
        saved = OnSaveDocument(target);
    } catch (const std::bad_alloc&) {
        TellNotSaved(CKsDocumentFile::WhyNoMemory(target));
    }
    m_executing = false;
    if (saved && !m_named)
        SetPathName(SavePathFor(target));
    return saved;
}

void CKsDoc::TellNotSaved(const CString& why)
{
    if (m_executing)
        m_whyNotSaved = why;
    else
        KsMessageBox(why);
}

bool CKsDoc::MayLeave()
{
    const auto views = m_views; // a message may close one
    return std::all_of(views.begin(), views.end(), [](CView* view) { return view->MayLeave(KsLeave::Page); });
}

KsClosing CKsDoc::AskToClose()
{
    if (!MayLeave())
        return KsClosing::Keep;
    UpdateAllViews(nullptr, StoreHint);
    if (!IsUnsaved())
        return KsClosing::Close;
    const CString question = IsFileGone() ? tr("%1 was removed or renamed by another program. What is shown is nowhere "
                                               "else, and is lost unless it is saved.\nSave it again?")
                                          : tr("Save the changes to %1?");
    switch (KsMessageBox(question.arg(GetTitle()), QMessageBox::Save | QMessageBox::Discard | QMessageBox::Cancel)) {
    case QMessageBox::Save:
        return KsClosing::Save;
    case QMessageBox::Discard:
        return KsClosing::Close;
    default:
        return KsClosing::Keep;
    }
}

BOOL CKsDoc::SaveModified()
{
    const KsClosing answer = AskToClose();
    return answer == KsClosing::Save ? DoSave(m_path) : answer == KsClosing::Close;
}
