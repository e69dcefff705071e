// At the start of the program: what sessions have left over that ended without a save.
#pragma once

#include "files/difference.h"
#include "shell/recovery_file.h"

#include <QCoreApplication>
#include <optional>
#include <vector>

class CKsDoc;
class CKsMDIFrameWnd;
class CMultiDocTemplate;
class CPlugins;
class CRecoveryFolder;
class CSnapshots;

/// The changes of one document that can be recovered.
struct CRecoverable
{
    enum State
    {
        Unknown,  // it has not been looked at: that takes as long as its files are large
        Damaged,  // the recovery file is not as it was written
        NoEditor, // that reads files of the kind
        New,      // the document never had a file
        Same,     // its file is as the document knew it
        Changed,  // somebody has changed its file since
        Missing   // its file is gone
    };
    QString file; // what keeps them
    State state = Unknown;
    CRecoveryHeader header{}; // of a file that is not damaged
    CMultiDocTemplate* editor = nullptr;

    bool CanOpen() const { return editor != nullptr && state != Damaged; }
    QString Name() const;
};

/// Lists what can be recovered and opens it. A recovered document is modified; undo leads back to what its file holds.
class CRecovery
{
    Q_DECLARE_TR_FUNCTIONS(CRecovery)
public:
    /// All outlive it.
    CRecovery(CKsMDIFrameWnd& frame, const CPlugins& plugins, CRecoveryFolder& folder, CSnapshots& snapshots)
        : m_frame(frame), m_plugins(plugins), m_folder(folder), m_snapshots(snapshots)
    {
    }

    /// Shows what can be recovered, if there is anything; not modal to the caller.
    void Offer();
    /// What sessions that have ended left over, as far as the headers tell.
    std::vector<CRecoverable> Find();
    /// Finds out the state by reading everything.
    void Examine(CRecoverable& item) const;
    /// Opens the document with its changes: over its file when that is as the document knew it, otherwise beside it, as
    /// a new document. False when the user has been told why not.
    bool Open(const CRecoverable& item);
    /// What the changes are: against the file on the disk, where there is none against a new document. Nothing when the
    /// file cannot be read.
    std::optional<Differences> Compare(const CRecoverable& item) const;
    void Discard(const CRecoverable& item);

private:
    void Close(const CKsDoc* document);

    CKsMDIFrameWnd& m_frame;
    const CPlugins& m_plugins;
    CRecoveryFolder& m_folder;
    CSnapshots& m_snapshots;
};
