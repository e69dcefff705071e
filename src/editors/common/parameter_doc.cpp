#include "editors/common/parameter_doc.h"

#include "ks/fc/message_box.h"

#include <QDir>
#include <QUndoStack>

BOOL CParameterDoc::OnOpenDocument(const CString& path)
{
    if (!CKsDoc::OnOpenDocument(path))
        return false;
    const QString reason = ReadFile(path);
    if (!reason.isEmpty())
        KsMessageBox(reason);
    return reason.isEmpty();
}

BOOL CParameterDoc::OnSaveDocument(const CString& path)
{
    UpdateAllViews(nullptr, StoreHint);
    const QString reason = WriteFile(path);
    if (!reason.isEmpty()) {
        KsMessageBox(tr("%1 could not be saved.\n%2").arg(QDir::toNativeSeparators(path), reason));
        return false;
    }
    UndoStack().setClean();
    SetModifiedFlag(false);
    return true;
}
