// The boundary between the shell and an editor: a library in the plug-in folder that exports these C functions.
//
// The shell finds them by name and calls them on the user-interface thread, after the application object exists, in the
// order below. No function throws (of one that does, the editor is not used); none shows a message. A library stays
// loaded until the program ends. Shell and editors are built with the same compiler and the same `ks` library: the
// pointers are to C++ objects of that library.
#pragma once

#include "ks/fc/types.h"

#include <QtGlobal>

class CKsMDIFrameWnd;
class CKsToolBarEx;
class CMultiDocTemplate;

/// KS_PLUGIN_FUNCTION(result, name, arguments), one row for each function that an editor must export.
#define KS_PLUGIN_FUNCTIONS(KS_PLUGIN_FUNCTION)                                                                        \
    /* How many document templates the editor offers. */                                                               \
    KS_PLUGIN_FUNCTION(int, KsGetNumDocTemplates, ())                                                                  \
    /* A new template; the caller owns it. Null for an index that there is none for. */                                \
    KS_PLUGIN_FUNCTION(CMultiDocTemplate*, KsGetDocTemplatePtr, (int index))                                           \
    /* The editor's name in the user's language. False for a null pointer. */                                          \
    KS_PLUGIN_FUNCTION(BOOL, KsGetEditorString, (CString * text))                                                      \
    /* Number of the editor's picture, a Qt resource (KsBitmapPath). */                                                \
    KS_PLUGIN_FUNCTION(int, KsGetBitmapId, ())                                                                         \
    /* How many tool bars the editor offers. */                                                                        \
    KS_PLUGIN_FUNCTION(int, KsGetNumToolbars, ())                                                                      \
    /* Name of a tool bar; false, and the text untouched, for an index that there is none for. `text` is not null. */  \
    KS_PLUGIN_FUNCTION(BOOL, KsGetToolbarString, (CString * text, int index))                                          \
    /* Builds a tool bar in an object of the caller's; false when that failed. */                                      \
    KS_PLUGIN_FUNCTION(                                                                                                \
        BOOL, KsInitToolbar,                                                                                           \
        (CKsToolBarEx * bar, CKsMDIFrameWnd * frame, unsigned style, unsigned controlId, unsigned index))              \
    /* A new tool bar, docked in the frame, which owns it from then on; null when that failed. */                      \
    KS_PLUGIN_FUNCTION(CKsToolBarEx*, KsCreateToolbar,                                                                 \
                       (CKsMDIFrameWnd * frame, unsigned style, unsigned controlId, int index))

#define KS_PLUGIN_DECLARE(result, name, arguments) Q_DECL_EXPORT result name arguments;
extern "C" {
KS_PLUGIN_FUNCTIONS(KS_PLUGIN_DECLARE)
}
#undef KS_PLUGIN_DECLARE

/// Where the picture of a number stands among the resources of all editors; it may be missing.
inline CString KsBitmapPath(int id)
{
    return QStringLiteral(":/bitmaps/%1.svg").arg(id);
}
