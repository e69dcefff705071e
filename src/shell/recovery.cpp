#include "shell/recovery.h"

#include "ks/fc/dialog_turn.h"
#include "ks/fc/doc_template.h"
#include "ks/fc/findings_dialog.h"
#include "ks/fc/frames.h"
#include "ks/fc/message_box.h"
#include "ks/fc/project_doc.h"
#include "ks/fc/shown_text.h"
#include "shell/plugin_loader.h"
#include "shell/recovery_dialog.h"
#include "shell/recovery_folder.h"
#include "shell/snapshots.h"

#include <QFile>
#include <QFileInfo>
#include <QUndoStack>
#include <algorithm>

namespace {

CRecoverable::State StateOf(const CRecoveryHeader& header)
{
    const QFileInfo file(header.path);
    if (header.path.isEmpty())
        return CRecoverable::New;
    if (!file.exists())
        return CRecoverable::Missing;
    const bool isSame = !header.hash.isEmpty() && file.size() == header.size && FileHash(header.path) == header.hash;
    return isSame ? CRecoverable::Same : CRecoverable::Changed;
}

/// The program ended in the middle of the save: what was kept is what the file holds, byte for byte.
bool IsSaved(const CRecoveryHeader& header)
{
    const QFileInfo file(header.path);
    return !header.path.isEmpty() && header.typed.isEmpty() && file.isFile() && file.size() == header.contentSize &&
           FileHash(header.path) == header.contentHash;
}

/// Of a document that stands beside its file; files of one name in two folders are told apart by a number.
QString FreeTitle(const QString& file)
{
    const QString name = KsVisibleText(file);
    QString title = CRecovery::tr("%1 (recovered)").arg(name);
    const auto isTaken = [&title](const CMultiDocTemplate* documents) {
        return std::ranges::any_of(documents->findChildren<const CKsDoc*>(Qt::FindDirectChildrenOnly),
                                   [&](const CKsDoc* each) { return each->GetTitle() == title; });
    };
    for (int number = 2; std::ranges::any_of(CMultiDocTemplate::All(), isTaken); ++number)
        title = CRecovery::tr("%1 (recovered %2)").arg(name, QString::number(number));
    return title;
}

/// A document that was open before has read the dates that its file lacks at another time: they would be changes.
void TakeDates(CKsDoc& document, const HDDateTime& date)
{
    auto* const reader = qobject_cast<CKsProjectDoc*>(&document);
    const bool isAsRead = reader && document.UndoStack().count() == 0;
    document.TakeDateOfFile(date);
    CString why;
    if (isAsRead && reader->Reload(why)) // undo leads to them, too
        document.UndoStack().clear();
}

} // namespace

QString CRecoverable::Name() const
{
    return header.path.isEmpty() ? header.title : QFileInfo(header.path).fileName();
}

void CRecovery::Offer()
{
    std::vector<CRecoverable> found = Find();
    if (found.empty())
        return;
    // It comes first: what it opens has lists of its own to show.
    QList<CKsFindingsDialog*> lists = m_frame.findChildren<CKsFindingsDialog*>();
    lists.removeIf([](const CKsFindingsDialog* list) { return !list->isVisible(); });
    for (CKsFindingsDialog* list : lists)
        list->hide();
    auto* dialog = new CRecoveryDialog(*this, std::move(found), &m_frame);
    dialog->setWindowModality(Qt::WindowModal);
    KsShowInTurn(dialog);
    for (CKsFindingsDialog* list : lists)
        KsShowInTurn(list);
}

std::vector<CRecoverable> CRecovery::Find()
{
    std::vector<CRecoverable> found;
    for (const QString& file : m_folder.TakeOver()) {
        const auto header = ReadRecoveryHeader(file);
        if (header && IsSaved(*header)) {
            QFile::remove(file);
            continue;
        }
        CRecoverable& item = found.emplace_back(CRecoverable{.file = file});
        if (header) {
            item.header = *header;
            item.editor = m_plugins.TemplateFor(QStringLiteral("x") + header->extension);
        } else {
            item.state = CRecoverable::Damaged;
        }
    }
    std::ranges::stable_sort(found, std::greater(), [](const CRecoverable& item) { return item.header.time; });
    return found;
}

void CRecovery::Examine(CRecoverable& item) const
{
    item.state = !ReadRecoveryFile(item.file) ? CRecoverable::Damaged
                 : item.editor                ? StateOf(item.header)
                                              : CRecoverable::NoEditor;
}

bool CRecovery::Open(const CRecoverable& item)
{
    std::string content;
    if (!item.CanOpen() || !ReadRecoveryFile(item.file, &content)) {
        KsMessageBox(
            tr("The changes to %1 could not be recovered: what was kept of them cannot be read.").arg(item.Name()));
        return false;
    }
    const CKsDatesOfFiles dates(item.header.dateOfFile);
    const bool isSame = StateOf(item.header) == CRecoverable::Same;
    const CKsDoc* open = isSame ? m_plugins.FindDocument(item.header.path) : nullptr;
    bool isBeside = !isSame || (open && open->IsModified());
    CKsDoc* document = item.editor->OpenDocumentFile(&m_frame, isBeside ? QString() : item.header.path);
    if (document && document->IsInUse()) {
        isBeside = true;
        document = item.editor->OpenDocumentFile(&m_frame, {});
    }
    if (!document)
        return false;
    if (document == open)
        TakeDates(*document, item.header.dateOfFile);
    if (!document->TakeContent(std::move(content), tr("Recovered changes"))) {
        if (document != open)
            Close(document);
        KsMessageBox(tr("The changes to %1 could not be recovered: what was kept of them is no file of this kind.")
                         .arg(item.Name()));
        return false;
    }
    if (isBeside && !item.header.path.isEmpty()) {
        document->StandBeside(item.header.path);
        document->SetTitle(FreeTitle(QFileInfo(item.header.path).completeBaseName()));
    }
    if (CSnapshot* snapshot = m_snapshots.Of(document))
        snapshot->Continue(item.file);
    return true;
}

/// One that was opened for nothing.
void CRecovery::Close(const CKsDoc* document)
{
    QList<QMdiSubWindow*> windows;
    for (const CView* view : document->Views())
        windows << CKsMDIChildWnd::Of(view);
    m_frame.CloseWindows(windows);
}

std::optional<Differences> CRecovery::Compare(const CRecoverable& item) const
{
    std::string content;
    if (!item.CanOpen() || !ReadRecoveryFile(item.file, &content))
        return {};
    // Both as the editor writes them: what is written otherwise in the file is no change.
    const bool hasFile = QFileInfo(item.header.path).isFile();
    const CKsDatesOfFiles dates(item.header.dateOfFile);
    Result<std::string> before = item.editor->ContentOf(hasFile ? item.header.path : QString());
    return before ? FindDifferences(std::move(before.value()), std::move(content)) : std::nullopt;
}

void CRecovery::Discard(const CRecoverable& item)
{
    QFile::remove(item.file);
}
