#include "ks/fc/status.h"

#include "ks/fc/frames.h"

void KsTellStatus(const QWidget& inside, const CString& text)
{
    if (auto* frame = qobject_cast<CKsMDIFrameWnd*>(inside.window()))
        frame->TellStatus(text);
}
