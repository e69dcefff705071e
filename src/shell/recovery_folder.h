// Where the program keeps what has not been saved, for the case that it ends without being asked to.
#pragma once

#include "files/file_lock.h"

#include <QDeadlineTimer>
#include <QString>
#include <QStringList>
#include <optional>
#include <vector>

/// Each run of the program - a session - has a folder of its own in the user's folder of states, and holds it as long
/// as it lives: what stands in a folder that nobody holds is left over, and is for the next session to recover.
class CRecoveryFolder
{
public:
    CRecoveryFolder();
    /// What is not needed any more goes; what nobody has recovered yet stays for the next session.
    ~CRecoveryFolder();
    CRecoveryFolder(const CRecoveryFolder&) = delete;
    CRecoveryFolder& operator=(const CRecoveryFolder&) = delete;

    /// The path of a file that is not there yet, in this session's folder.
    Result<QString> NewFile();
    /// Has the folder of a file that this session holds stand and be held: somebody may have removed it.
    Result<void> Secure(const QString& file);
    /// Told of each writer. What one that was stopped leaves half done goes when none is at work.
    void WriterStarts() { ++m_writers; }
    void WriterEnds(bool stopped);
    /// What sessions have left over. From now on it is held by this one.
    QStringList TakeOver();

private:
    struct Session
    {
        QString folder;
        FileLock lock{};
    };
    static std::optional<Session> Hold(const QString& folder, const QDeadlineTimer& deadline);
    static void Tidy(Session& session);
    Result<void> Secure(Session& session) const;

    QString m_root;
    std::optional<Session> m_own; // made when first needed
    std::vector<Session> m_others;
    int m_writers = 0;
    bool m_isUntidy = false;
};
