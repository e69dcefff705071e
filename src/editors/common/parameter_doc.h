// The document of an editor that keeps one parameter file.
#pragma once

#include "ks/fc/project_doc.h"

class CParameterDoc : public CKsProjectDoc
{
    Q_OBJECT
public:
    using CKsProjectDoc::CKsProjectDoc;

    /// A file that cannot be read is not opened, after a message that names the line.
    BOOL OnOpenDocument(const CString& path) override;
    /// When that fails, the document stays as it is, after a message that tells why.
    BOOL OnSaveDocument(const CString& path) override;

protected:
    /// Both return why not, for the user; nothing when it went well.
    virtual QString ReadFile(const CString& path) = 0;
    virtual QString WriteFile(const CString& path) const = 0;
};
