// Parameter files of the shell and the editors: read into declared objects, with messages in the user's language that
// name the line, and written safely.
#pragma once

#include "files/declared_section.h"
#include "files/structure.h"
#include "ks/fc/types.h"
#include "ks/ks_export.h"

/// A file that has been read; its places can be asked for as long as this lives.
class KS_API CKsParameterFile
{
public:
    /// Reads a file into the object, which holds part of it when there is an error.
    CKsParameterFile(const CString& path, const DeclaredFile& file, void* object);

    /// What is wrong and where, for the user: "river.kvnw, line 12: ..."; empty when the file was read well.
    const CString& Error() const { return m_error; }
    /// Null when the file could not be read.
    tqlHandle Target() const { return m_target; }
    /// What else is wrong, at a section, keyword or parameter of the file; the first counts.
    void Fail(tqlHandle place, const CString& what);
    /// The keyword, for a message about it; the section when it is missing.
    static tqlHandle PlaceOf(tqlHandle section, std::string_view keyword);

private:
    CString m_path, m_error;
    TqlStructure m_structure{nullptr};
    tqlHandle m_target = nullptr;
};

/// Puts the object into the place of a file: the old content stays until the new one is complete, and mode, owner and
/// attributes stay as they are. The reason when that failed, as a sentence for the user; otherwise empty.
KS_API CString KsWriteParameterFile(const CString& path, const DeclaredFile& file, const void* object);
