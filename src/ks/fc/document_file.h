// The file that a document was read from: what of it was not taken as it stands, and how a save replaces it.
#pragma once

#include "files/finding.h"
#include "files/safe_file.h"
#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <QCoreApplication>
#include <functional>
#include <optional>
#include <vector>

/// Writes a document to a path as the options want it.
using KsFileWriter = std::function<Result<WriteReport>(const std::string& path, const SafeFileOptions& options)>;

class KS_API CKsDocumentFile
{
    Q_DECLARE_TR_FUNCTIONS(CKsDocumentFile)
public:
    /// Reads a file: `load` takes what was parsed. `savedAs` is what a save of the file under its own name writes. One
    /// that cannot be parsed is not loaded, and nobody is told here: several files may be opening.
    void Read(const CString& path, const CString& savedAs, const std::function<void(tqlHandle, LoadReport&)>& load);
    /// Whether the file may be replaced by a save to `target`: asks when it holds what the document does not.
    bool MayReplace(const CString& target) const;
    /// Has `write` write to `target` or to where that leads, and asks what is the user's to decide: whether to replace
    /// what somebody else has written meanwhile, what becomes of other names of the file, and whether it may lose what
    /// cannot be kept. Path() says what the file is called then, for where it cannot be renamed to a target of another
    /// spelling it keeps its name. What the file held that the document does not is kept in a copy beside it.
    bool Write(const CString& target, const KsFileWriter& write);
    /// That a file could not be written for want of memory.
    static CString WhyNoMemory(const CString& path);
    /// What somebody else has written may be replaced without a question, as the user has been told and wants it. It is
    /// kept in a copy all the same.
    void MayReplaceOthers(bool may) { m_mayReplaceOthers = may; }
    /// Why the last write failed; empty when it did not, or when the user did not want it.
    const CString& WhyNotWritten() const { return m_whyNotWritten; }

    const CString& Path() const { return m_path; }
    /// What the file held when the document was last the same; none when it could not be read.
    const std::optional<FileVersion>& Version() const { return m_version; }
    /// What the file was then, without its content: taken before a read, so that whoever writes to it from then on
    /// makes it another, and after a write.
    const FileStatus& Seen() const { return m_seen; }
    /// The file could not be parsed; the document holds nothing of it.
    bool IsUnreadable() const { return m_error.code != TqlError::None; }
    /// What is wrong with a file that could not be parsed and where, in the user's language.
    CString Error() const;
    /// Why nothing of the file was taken: it could not be parsed, or is no file of the kind. Empty when something was.
    CString WhyNothing() const;
    /// What was not taken as it stands.
    const std::vector<Finding>& Findings() const { return m_findings; }
    /// Where the last save kept what it replaced; empty when there was no need.
    const CString& KeptCopy() const { return m_keptCopy; }
    /// Likewise of a file that the caller has read as a text of this version, and of which nothing was left out.
    void Know(const CString& path, const FileVersion& version);
    /// Finds what saves that were cut off have left behind, which SaveNotes tells; what they had displaced only for who
    /// holds the file's lock.
    void LookForLeftBehind(bool isLocked);
    /// What there is to say of the last save: that the disk did not confirm it, what could not be kept of the file that
    /// was replaced, and where what somebody else wrote meanwhile is kept. Mostly empty.
    CString SaveNotes() const { return NotesOn(m_path, m_report); }
    static CString NotesOn(const CString& path, const WriteReport& report);
    /// "river.hdkv is now river.HDKV", when the last save renamed the file; otherwise empty.
    const CString& Renamed() const { return m_renamed; }

private:
    Result<bool> IsReplacedBy(const CString& target) const;
    Result<void> Save(const CString& target, const KsFileWriter& write);
    const char* CopySuffix() const;
    Result<void> KeepCopy();
    WriteAnswer Ask(const WriteQuestion& question);

    CString m_path, m_savedAs, m_keptCopy, m_renamed, m_whyNotWritten;
    std::optional<FileVersion> m_version;
    FileStatus m_seen;
    bool m_mayReplaceOthers = false;
    std::optional<WriteAnswer> m_otherNames; // what becomes of them, as the user said once
    WriteReport m_report;
    TqlSyntaxError m_error;
    std::vector<Finding> m_findings;
};
