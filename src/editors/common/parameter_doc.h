// The document of an editor that keeps one parameter file.
#pragma once

#include "files/declared_section.h"
#include "ks/fc/project_doc.h"

class CParameterDoc : public CKsProjectDoc
{
    Q_OBJECT
public:
    using CKsProjectDoc::CKsProjectDoc;

    /// A file that cannot be parsed or is of another kind is not opened, after a message that says where and why. Of
    /// others, what is not taken as it stands is listed (File()).
    BOOL OnOpenDocument(const CString& path) override;
    /// When that fails, the document stays as it is, after a message that tells why.
    BOOL OnSaveDocument(const CString& path) override;
    Result<std::string> ContentText() const override;

protected:
    /// The object that the document keeps, and how its file is declared.
    struct Declared
    {
        const DeclaredSection& file;
        const void* object;
    };
    virtual Declared Content() const = 0;
    virtual void Load(tqlHandle structure, LoadReport& report) = 0;
};
