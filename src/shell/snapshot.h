// What is kept of a document's changes until they are saved.
#pragma once

#include "files/process_copy.h"

#include <QObject>
#include <QStringList>
#include <QTimer>
#include <chrono>
#include <memory>
#include <optional>

class CKsDoc;
class CRecoveryFolder;
class QSocketNotifier;

/// Keeps one document's content in a recovery file while it is unsaved. A copy of the process writes the file, so that
/// the user does not wait. The file goes when nothing is left to save, and with this.
class CSnapshot : public QObject
{
    Q_OBJECT
public:
    /// How far the file may be behind: so many steps, or so long. What a writer needs is part of ten seconds.
    static constexpr int Steps = 50;
    static constexpr std::chrono::milliseconds Delay{5000};

    /// Both outlive it.
    CSnapshot(CKsDoc& document, CRecoveryFolder& folder, std::chrono::milliseconds delay);
    ~CSnapshot() override;

    /// The changes have been recovered from this file, which keeps them from now on.
    void Continue(const QString& file);
    const QString& File() const { return m_file; } // empty until it is first needed
    bool IsWriting() const { return m_writer.has_value(); }

    /// Why the changes are not kept; none while they are, or there are none.
    std::error_code Failure() const { return m_failure; }

signals:
    void FailureChanged();

private:
    void StepMade();
    void StateChanged();
    void LookAtTyping();
    void Write();
    std::error_code StartWriter();
    void WriterEnded();
    void Fail(std::error_code why);
    void SetFailure(std::error_code why);
    void Drop();
    void FinishWriter();

    CKsDoc& m_document;
    CRecoveryFolder& m_folder;
    std::chrono::milliseconds m_delay;
    QTimer m_timer, m_look;
    QStringList m_typed; // texts not stored yet that the file, or who writes it, knows of
    int m_steps = 0; // that the file, or who writes it, does not know of
    std::error_code m_failure;
    QString m_file;
    std::optional<ProcessCopy> m_writer;
    bool m_isDropped = false; // what the writer was told to stop for is not wanted any more
    std::unique_ptr<QSocketNotifier> m_writerEnds;
};
