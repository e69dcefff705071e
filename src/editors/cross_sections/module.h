// The plug-in KAVO0_XS: its resources, its document template and its tool bar.
#pragma once

#include "ks/fc/types.h"

class CKsMDIFrameWnd;
class CKsToolBarEx;
class CMultiDocTemplate;

namespace CrossSectionModule {
inline constexpr int DocumentResource = 6953, Bitmap = 6965;

void LoadResources();
void FreeResources();
CMultiDocTemplate* CreateTemplate();
CString EditorName();
CString ToolBarName();
/// False when the bar or the frame is missing.
bool InitToolBar(CKsToolBarEx* bar, CKsMDIFrameWnd* frame, unsigned style, unsigned controlId);
} // namespace CrossSectionModule
