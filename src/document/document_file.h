// The file that a document was read from: what of it was not taken as it stands, and how a save replaces it.
#pragma once

#include "files/finding.h"
#include "ks/fc/types.h"
#include "tql/tql.h"

#include <vector>

struct HD_Parameters;

class CDocumentFile
{
public:
    /// Reads a file into the parameters. One that cannot be parsed leaves them as they are, and nobody is told here:
    /// several files may be opening, and the view says it as long as it is so.
    void Read(const CString& path, HD_Parameters& parameters);
    /// Whether the file may be replaced by a save to `target`: asks when it holds what the document does not.
    bool MayReplace(const CString& target) const;
    /// Writes to `target`, the file's own name with its extension in capitals, or another; Path() says what the file is
    /// called then, for where it cannot be renamed it keeps its name. On failure the user has been told. What the file held that the document does not is kept in a copy beside it.
    bool Write(const HD_Parameters& parameters, const CString& target);

    const CString& Path() const { return m_path; }
    /// The file could not be parsed; the document holds nothing of it.
    bool IsUnreadable() const;
    /// What is wrong with it and where, in the user's language; empty when it was read.
    CString Error() const;
    /// What was not taken as it stands.
    const std::vector<Finding>& Findings() const { return m_findings; }
    /// Where the last save kept what it replaced; empty when there was no need.
    const CString& KeptCopy() const { return m_keptCopy; }
    /// "river.hdkv is now river.HDKV", when the last save renamed the file; otherwise empty.
    const CString& Renamed() const { return m_renamed; }

    /// The name that a save to `path` writes: the extension is always ".HDKV".
    static CString SavePathFor(const CString& path);

private:
    bool IsReplacedBy(const CString& target) const;
    CString EntryFor(const CString& target) const;
    const char* CopySuffix() const;
    bool KeepCopy();

    CString m_path, m_keptCopy, m_renamed;
    TqlSyntaxError m_error;
    std::vector<Finding> m_findings;
};
