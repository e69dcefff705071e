// The file that a document was read from: what of it was not taken as it stands, and how a save replaces it.
#pragma once

#include "base/result.h"
#include "files/finding.h"
#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <QCoreApplication>
#include <functional>
#include <vector>

class KS_API CKsDocumentFile
{
    Q_DECLARE_TR_FUNCTIONS(CKsDocumentFile)
public:
    /// Reads a file: `load` takes what was parsed. `savedAs` is what a save of the file under its own name writes. One
    /// that cannot be parsed is not loaded, and nobody is told here: several files may be opening.
    void Read(const CString& path, const CString& savedAs, const std::function<void(tqlHandle, LoadReport&)>& load);
    /// Whether the file may be replaced by a save to `target`: asks when it holds what the document does not.
    bool MayReplace(const CString& target) const;
    /// Has `write` write to `target` or to where that leads. Path() says what the file is called then, for where it
    /// cannot be renamed to a target of another spelling it keeps its name. On failure the user has been told. What the
    /// file held that the document does not is kept in a copy beside it.
    bool Write(const CString& target, const std::function<Result<void>(const std::string& path)>& write);

    const CString& Path() const { return m_path; }
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
    /// "river.hdkv is now river.HDKV", when the last save renamed the file; otherwise empty.
    const CString& Renamed() const { return m_renamed; }

private:
    bool IsReplacedBy(const CString& target) const;
    CString EntryFor(const CString& target) const;
    const char* CopySuffix() const;
    bool KeepCopy();

    CString m_path, m_savedAs, m_keptCopy, m_renamed;
    TqlSyntaxError m_error;
    std::vector<Finding> m_findings;
};
