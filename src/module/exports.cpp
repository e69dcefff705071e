// The functions that the shell calls.
#include "ks/fc/single_editor.h"
#include "module/kavo0_hd.h"
#include "res/strings.h"

namespace {

struct HDModule
{
    static constexpr int Bitmap = Resource::EditorBitmap;
    static void LoadResources() { LoadModuleResources(); }
    static void FreeResources() { FreeModuleResources(); }
    static CMultiDocTemplate* CreateTemplate() { return CKavo0_hd::CreateMainDlg(); }
    static CString EditorName() { return LoadString(Str::EditorName); }
    static CString ToolBarName() { return LoadString(Str::ToolBarName); }
    static BOOL InitToolBar(CKsToolBarEx* bar, CKsMDIFrameWnd* frame, unsigned style, unsigned controlId)
    {
        return CKavo0_hd::InitToolBar(bar, frame, style, controlId);
    }
};

} // namespace

KS_SINGLE_EDITOR(HDModule)
