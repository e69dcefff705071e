#include "shell/snapshots.h"

#include "ks/fc/doc_template.h"

void CSnapshots::Follow(const CMultiDocTemplate& documents)
{
    connect(&documents, &CMultiDocTemplate::DocumentOpened, this, &CSnapshots::Open);
    connect(&documents, &CMultiDocTemplate::DocumentClosing, this,
            [this](const CKsDoc* document) { m_snapshots.erase(document); });
}

void CSnapshots::Open(CKsDoc* document)
{
    auto snapshot = std::make_unique<CSnapshot>(*document, m_folder, m_delay);
    connect(snapshot.get(), &CSnapshot::Failed, this,
            [this, document](std::error_code why) { emit Failed(document, why); });
    m_snapshots[document] = std::move(snapshot);
}

CSnapshot* CSnapshots::Of(const CKsDoc* document) const
{
    const auto found = m_snapshots.find(document);
    return found == m_snapshots.end() ? nullptr : found->second.get();
}
