#include "shell/snapshots.h"

#include "ks/fc/doc_template.h"

void CSnapshots::Follow(const CMultiDocTemplate& documents)
{
    connect(&documents, &CMultiDocTemplate::DocumentOpened, this, &CSnapshots::Open);
    connect(&documents, &CMultiDocTemplate::DocumentClosing, this, &CSnapshots::Close);
}

void CSnapshots::Open(CKsDoc* document)
{
    auto snapshot = std::make_unique<CSnapshot>(*document, m_folder, m_delay);
    connect(snapshot.get(), &CSnapshot::FailureChanged, this, &CSnapshots::FailuresChanged);
    m_snapshots[document] = std::move(snapshot);
}

void CSnapshots::Close(const CKsDoc* document)
{
    m_snapshots.erase(document);
    emit FailuresChanged();
}

std::vector<std::pair<const CKsDoc*, std::error_code>> CSnapshots::Failures() const
{
    std::vector<std::pair<const CKsDoc*, std::error_code>> failures;
    for (const auto& [document, snapshot] : m_snapshots)
        if (snapshot->Failure())
            failures.emplace_back(document, snapshot->Failure());
    return failures;
}

CSnapshot* CSnapshots::Of(const CKsDoc* document) const
{
    const auto found = m_snapshots.find(document);
    return found == m_snapshots.end() ? nullptr : found->second.get();
}
