// What the module offers the shell, as static members; the exported functions call these.
#pragma once

#include "ks/fc/doc_template.h"
#include "ks/fc/frames.h"

class CKavo0_hd
{
public:
    /// A new document template; the caller owns it.
    static CMultiDocTemplate* CreateMainDlg();
    /// Builds the editor's tool bar in the given object and docks it; false when it cannot be created or filled.
    static BOOL InitToolBar(CKsToolBarEx* bar, CKsMDIFrameWnd* frame, unsigned style, unsigned controlId);
};

/// Makes the module's texts and pictures available; at load. Unload gives them back.
void LoadModuleResources();
void FreeModuleResources();

namespace Resource {
inline constexpr int Document = 4953; // template string, tool bar, menu, icon
inline constexpr int EditorBitmap = 4965;
} // namespace Resource
