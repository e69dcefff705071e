// What is kept of the changes of all documents until they are saved.
#pragma once

#include "shell/snapshot.h"

#include <map>
#include <utility>
#include <vector>

class CMultiDocTemplate;

/// One snapshot for each open document.
class CSnapshots : public QObject
{
    Q_OBJECT
public:
    explicit CSnapshots(CRecoveryFolder& folder) : m_folder(folder) {}

    /// Keeps the changes of a template's documents.
    void Follow(const CMultiDocTemplate& documents);
    /// Null for a document that is not open.
    CSnapshot* Of(const CKsDoc* document) const;
    /// Of documents that are opened from now on; for tests.
    void SetDelay(std::chrono::milliseconds delay) { m_delay = delay; }

    /// The documents whose changes are not kept, and why.
    std::vector<std::pair<const CKsDoc*, std::error_code>> Failures() const;

signals:
    void FailuresChanged();

private:
    void Open(CKsDoc* document);
    void Close(const CKsDoc* document);

    CRecoveryFolder& m_folder;
    std::chrono::milliseconds m_delay = CSnapshot::Delay;
    std::map<const CKsDoc*, std::unique_ptr<CSnapshot>> m_snapshots;
};
