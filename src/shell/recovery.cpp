#include "shell/recovery.h"

#include "files/structure.h"
#include "ks/fc/doc_template.h"
#include "ks/fc/frames.h"
#include "ks/fc/message_box.h"
#include "shell/plugin_loader.h"
#include "shell/recovery_dialog.h"
#include "shell/recovery_folder.h"
#include "shell/snapshots.h"

#include <QFile>
#include <QFileInfo>
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

} // namespace

QString CRecoverable::Name() const
{
    return header.path.isEmpty() ? header.title : QFileInfo(header.path).fileName();
}

void CRecovery::Offer()
{
    std::vector<CRecoverable> found = Find();
    if (!found.empty())
        (new CRecoveryDialog(*this, std::move(found), &m_frame))->open();
}

std::vector<CRecoverable> CRecovery::Find()
{
    std::vector<CRecoverable> found;
    for (const QString& file : m_folder.TakeOver())
        found.push_back(Look(file));
    std::ranges::stable_sort(found, std::greater(), [](const CRecoverable& item) { return item.header.time; });
    return found;
}

CRecoverable CRecovery::Look(const QString& file) const
{
    CRecoverable item{.file = file};
    const auto header = ReadRecoveryFile(file);
    if (!header)
        return item;
    item.header = *header;
    item.editor = m_plugins.TemplateFor(QStringLiteral("x") + header->extension);
    item.state = item.editor ? StateOf(*header) : CRecoverable::NoEditor;
    return item;
}

bool CRecovery::Open(const CRecoverable& item)
{
    std::string content;
    if (!item.CanOpen() || !ReadRecoveryFile(item.file, &content)) {
        KsMessageBox(
            tr("The changes to %1 could not be recovered: what was kept of them cannot be read.").arg(item.Name()));
        return false;
    }
    const CKsDoc* open = item.state == CRecoverable::Same ? m_plugins.FindDocument(item.header.path) : nullptr;
    bool isBeside = StateOf(item.header) != CRecoverable::Same || (open && open->IsModified());
    CKsDoc* document = item.editor->OpenDocumentFile(&m_frame, isBeside ? QString() : item.header.path);
    if (document && document->IsInUse()) {
        isBeside = true;
        document = item.editor->OpenDocumentFile(&m_frame, {});
    }
    if (!document)
        return false;
    if (!document->TakeContent(std::move(content), tr("Recovered changes"))) {
        KsMessageBox(tr("The changes to %1 could not be recovered: what was kept of them is no file of this kind.")
                         .arg(item.Name()));
        return false;
    }
    if (isBeside && !item.header.path.isEmpty())
        document->SetTitle(tr("%1 (recovered)").arg(QFileInfo(item.header.path).completeBaseName()));
    if (CSnapshot* snapshot = m_snapshots.Of(document))
        snapshot->Continue(item.file);
    return true;
}

std::optional<Differences> CRecovery::Compare(const CRecoverable& item) const
{
    std::string content;
    if (!item.CanOpen() || !ReadRecoveryFile(item.file, &content))
        return {};
    // Both as the editor writes them: what is written otherwise in the file is no change.
    const bool hasFile = item.state == CRecoverable::Same || item.state == CRecoverable::Changed;
    const auto document = item.editor->ReadDocument(hasFile ? item.header.path : QString());
    Result<std::string> before = document ? document->ContentText() : Result<std::string>(Error{});
    if (!before)
        return {};
    const Result<TqlStructure> structures[] = {ParseText(std::move(before.value()), {}),
                                               ParseText(std::move(content), {})};
    if (!structures[0] || !structures[1])
        return {};
    return FindDifferences(structures[0].value().Get(), structures[1].value().Get());
}

void CRecovery::Discard(const CRecoverable& item)
{
    QFile::remove(item.file);
}
