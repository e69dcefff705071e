// Who may write a document's file while it is open.
#pragma once

#include "files/file_lock.h"
#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <QObject>
#include <QTimer>

/// Holds the lock of a document's file from before it is read until the document is closed or saved elsewhere. It looks
/// now and then whether another program that has it still does, and whether somebody has removed the own one, which is
/// taken again then.
class KS_API CKsFileUse : public QObject
{
    Q_OBJECT
public:
    explicit CKsFileUse(QObject* parent = nullptr);
    ~CKsFileUse() override;

    /// A lock of this program. A command that changes the file and ends is waited for. One that this program holds
    /// where the file stood before goes to whoever asks for it where the file stands now.
    static FileLock Lock(const CString& path);

    /// The document's file from now on.
    void Take(const CString& path);

    bool IsHeld() const { return m_lock.IsHeld(); }
    /// Somebody else has the file, or had it when it was taken.
    bool IsElsewhere() const { return m_lock.HeldBy().has_value(); }
    /// He has let go of it; it is not taken yet.
    bool IsFree() const { return m_isFree; }
    /// Who has it, or had it: "anna on server (kvrshell, process 4711) since 2026-03-05 14:07:00".
    CString Holder() const;
    /// Who has taken the lock after somebody had removed it here, so that both edit; empty when nobody has.
    CString Rival() const { return m_rival.HeldBy() ? NameOf(m_rival) : CString(); }
    /// Why nobody can be kept from writing a file that can be written; empty when that is no matter.
    std::error_code WhyNone() const;

    /// A save is about to write a file, which may be another one: false when somebody else has that.
    bool TakeTarget(const CString& target);
    /// Whether others are kept from it meanwhile.
    bool IsTargetHeld() const { return m_target.IsHeld() || (m_lock.IsHeld() && !m_target.WhyNone()); }
    /// Who has it then.
    CString TargetHolder() const;
    /// Whether it was written: then it is the document's file, at this path.
    void TargetWritten(bool written, const CString& path);
    /// Who else has a file at present; empty when nobody has.
    CString HolderOf(const CString& path) const;
    /// The document's file may have got other names, or be another.
    void Follow(const CString& path);

signals:
    /// Whether somebody else has it is another matter now.
    void Changed();
    /// Rival() is another, or the file cannot be kept from others any more.
    void LockLost();

private:
    static CString NameOf(const FileLock& lock);
    static FileLock* OwnAt(const CString& path);
    static FileLock Try(const CString& path);
    void Look();
    void LookAtHolder();
    void TakeAgain();

    CString m_path;
    FileLock m_lock, m_target;
    FileLock m_rival; // that somebody else has: who it is
    bool m_isFree = false, m_isLooking = false;
    QTimer m_timer;
};
