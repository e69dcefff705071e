// What is kept of the changes of all documents until they are saved.
#pragma once

#include "shell/snapshot.h"

#include <map>

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

signals:
    void Failed(const CKsDoc* document, std::error_code why);

private:
    void Open(CKsDoc* document);

    CRecoveryFolder& m_folder;
    std::chrono::milliseconds m_delay = CSnapshot::Delay;
    std::map<const CKsDoc*, std::unique_ptr<CSnapshot>> m_snapshots;
};
