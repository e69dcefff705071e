// The functions that the shell calls, and the module's start and end.
#include "editors/cross_sections/module.h"
#include "ks/fc/frames.h"
#include "ks/fc/plugin.h"

#include <memory>

namespace {

// Texts and pictures live as long as the library is loaded.
struct ModuleState
{
    ModuleState() { CrossSectionModule::LoadResources(); }
    ~ModuleState() { CrossSectionModule::FreeResources(); }
} g_module;

} // namespace

extern "C" {

Q_DECL_EXPORT int KsGetNumDocTemplates()
{
    return 1;
}

Q_DECL_EXPORT CMultiDocTemplate* KsGetDocTemplatePtr(int index)
{
    return index == 0 ? CrossSectionModule::CreateTemplate() : nullptr;
}

Q_DECL_EXPORT BOOL KsGetEditorString(CString* text)
{
    if (!text)
        return false;
    *text = CrossSectionModule::EditorName();
    return true;
}

Q_DECL_EXPORT int KsGetBitmapId()
{
    return CrossSectionModule::Bitmap;
}

Q_DECL_EXPORT int KsGetNumToolbars()
{
    return 1;
}

Q_DECL_EXPORT BOOL KsGetToolbarString(CString* text, int index)
{
    if (index != 0)
        return false;
    *text = CrossSectionModule::ToolBarName();
    return true;
}

Q_DECL_EXPORT BOOL KsInitToolbar(CKsToolBarEx* bar, CKsMDIFrameWnd* frame, unsigned style, unsigned controlId,
                                 unsigned index)
{
    return index == 0 && CrossSectionModule::InitToolBar(bar, frame, style, controlId);
}

Q_DECL_EXPORT CKsToolBarEx* KsCreateToolbar(CKsMDIFrameWnd* frame, unsigned style, unsigned controlId, int index)
{
    if (index != 0)
        return nullptr;
    auto bar = std::make_unique<CKsToolBarEx>();
    return CrossSectionModule::InitToolBar(bar.get(), frame, style, controlId) ? bar.release() : nullptr;
}

} // extern "C"
