#include "ks/fc/doc_command.h"

#include <QTimer>

CDocumentCommand::CDocumentCommand(CKsDoc& document, const QString& text) : m_document(document)
{
    setText(text);
}

void CDocumentCommand::Run(bool forward)
{
    if (!m_repeated && !IsAllowed()) {
        setObsolete(true); // no step comes of it; who made it shows the document as it is
        QTimer::singleShot(0, &m_document, [document = &m_document] {
            document->UpdateAllViews(nullptr, CKsDoc::ReloadHint);
            document->MayChange(); // it says why not; the views have said where they are
        });
        return;
    }
    m_document.UnsavedChanges().MakeRoom();
    const ChangePlace place = forward ? Apply() : Revert();
    m_document.UnsavedChanges().Add(LineChange(), forward);
    m_document.UpdateAll();
    // The first time the change comes from what the user is looking at.
    if (m_repeated)
        m_document.StepShows(place);
    m_repeated = true;
}
