#include "ks/fc/single_editor.h"

CMultiDocTemplate* KsSingleEditor::CreateTemplate() const
{
    return new CMultiDocTemplate(documentResource, documentStrings, classes);
}

bool KsSingleEditor::InitToolBar(CKsToolBarEx* bar, CKsMDIFrameWnd* frame, unsigned style, unsigned controlId) const
{
    if (!bar || !bar->Create(frame, style, controlId) || !bar->LoadToolBar(buttons()))
        return false;
    bar->setWindowTitle(toolBarName().trimmed());
    bar->SetBarStyle(bar->GetBarStyle() | CBRS_TOOLTIPS | CBRS_FLYBY | CBRS_SIZE_DYNAMIC);
    bar->EnableDocking(CBRS_ALIGN_ANY);
    return true;
}

CKsToolBarEx* KsSingleEditor::CreateToolBar(CKsMDIFrameWnd* frame, unsigned style, unsigned controlId) const
{
    auto bar = std::make_unique<CKsToolBarEx>();
    return InitToolBar(bar.get(), frame, style, controlId) ? bar.release() : nullptr;
}

CKsEditorResources::CKsEditorResources(const KsSingleEditor& editor)
{
    KsLangLoadResDll(editor.texts, &m_texts, 0);
    if (editor.load)
        editor.load();
}
