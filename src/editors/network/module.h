// The plug-in KAVO0_NW: its resources, its document template and its tool bar.
#pragma once

#include "ks/fc/types.h"

class CKsMDIFrameWnd;
class CKsToolBarEx;
class CMultiDocTemplate;

namespace NetworkModule {
inline constexpr int DocumentResource = 5953, Bitmap = 5965;

void LoadResources();
void FreeResources();
CMultiDocTemplate* CreateTemplate();
CString EditorName();
CString ToolBarName();
/// False when the bar or the frame is missing.
bool InitToolBar(CKsToolBarEx* bar, CKsMDIFrameWnd* frame, unsigned style, unsigned controlId);
} // namespace NetworkModule
