#include "ks/fc/doc_command.h"

CDocumentCommand::CDocumentCommand(CKsDoc& document, const QString& text) : m_document(document)
{
    setText(text);
}

void CDocumentCommand::Run(bool forward)
{
    const ChangePlace place = forward ? Apply() : Revert();
    m_document.UpdateAll();
    // The first time the change comes from what the user is looking at.
    if (m_repeated)
        m_document.StepShows(place);
    m_repeated = true;
}
