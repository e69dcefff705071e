// Parameter files of the editors: reading with messages that name the line, safe writing, and what a file holds that
// its editor does not know.
#pragma once

#include "ks/fc/types.h"
#include "tql/tql.h"

#include <string>
#include <string_view>
#include <vector>

/// Owns a structure of the parameter-file library.
class CParameterFile
{
public:
    explicit CParameterFile(tqlHandle handle) : m_handle(handle) {}
    ~CParameterFile() { tqlClose(&m_handle); }
    CParameterFile(const CParameterFile&) = delete;
    CParameterFile& operator=(const CParameterFile&) = delete;
    tqlHandle Get() const { return m_handle; }
    /// What the parser says, with file, line and column, in the user's language; empty when the file was read well.
    CString SyntaxError() const;
    /// "river.kvnw, line 12: <what>" for a section, keyword or parameter of the file `path`.
    static CString ErrorAt(const CString& path, tqlHandle node, const CString& what);

private:
    tqlHandle m_handle;
};

/// Puts the text built so far into the place of a file: the old content stays until the new one is complete. The reason
/// when that failed, otherwise empty.
CString WriteParameterFile(const CString& path, tqlHandle built);

/// A section that is kept as it stands: keywords with their parameters, and sections within.
struct CKeptSection
{
    std::string name;
    std::vector<std::pair<std::string, std::string>> keywords; // name, parameters in file notation
    std::vector<CKeptSection> sections;

    bool IsEmpty() const { return keywords.empty() && sections.empty(); }
    bool operator==(const CKeptSection&) const = default;
};

/// What `section` holds beside the keywords and sections of the given names.
CKeptSection KeepUnknown(tqlHandle section, const std::vector<std::string_view>& known);
/// Writes keywords and sections of `kept` into the section that is open.
void WriteKept(tqlHandle built, const CKeptSection& kept);
