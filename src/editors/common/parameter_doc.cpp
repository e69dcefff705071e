#include "editors/common/parameter_doc.h"

#include "ks/fc/message_box.h"

BOOL CParameterDoc::OnOpenDocument(const CString& path)
{
    if (!CKsDoc::OnOpenDocument(path))
        return false;
    ReadFile(path, [this](tqlHandle structure, LoadReport& report) { Load(structure, report); });
    const CString reason = m_file.WhyNothing();
    if (!reason.isEmpty())
        KsMessageBox(reason);
    return reason.isEmpty();
}

BOOL CParameterDoc::OnSaveDocument(const CString& path)
{
    UpdateAllViews(nullptr, StoreHint);
    if (!m_file.MayReplace(path) ||
        !WriteFile(path, [this](const std::string& written, const SafeFileOptions& options) {
            const Declared content = Content();
            return SaveDeclaredFile(written, content.file, content.object, options);
        }))
        return false;
    FileWritten();
    if (!m_file.Renamed().isEmpty())
        Say(m_file.Renamed());
    return true;
}

Result<std::string> CParameterDoc::ContentText() const
{
    const Declared content = Content();
    return DeclaredText(content.file, content.object);
}
