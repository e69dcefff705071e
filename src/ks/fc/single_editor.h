// The exported functions of an editor that has one document template and one tool bar.
#pragma once

#include "ks/fc/frames.h"
#include "ks/fc/plugin.h"

#include <memory>

/// Defines them all, and the module's start and end. `Module` is a namespace or class with LoadResources and
/// FreeResources (texts and pictures, which live as long as the library is loaded), CreateTemplate, EditorName,
/// ToolBarName, the number Bitmap, and InitToolBar, which is false when the bar cannot be created or filled.
#define KS_SINGLE_EDITOR(Module)                                                                                       \
    namespace {                                                                                                        \
    const struct ModuleState                                                                                           \
    {                                                                                                                  \
        ModuleState() { Module::LoadResources(); }                                                                     \
        ~ModuleState() { Module::FreeResources(); }                                                                    \
    } g_module;                                                                                                        \
    }                                                                                                                  \
    extern "C" {                                                                                                       \
    Q_DECL_EXPORT int KsGetNumDocTemplates()                                                                           \
    {                                                                                                                  \
        return 1;                                                                                                      \
    }                                                                                                                  \
    Q_DECL_EXPORT CMultiDocTemplate* KsGetDocTemplatePtr(int index)                                                    \
    {                                                                                                                  \
        return index == 0 ? Module::CreateTemplate() : nullptr;                                                        \
    }                                                                                                                  \
    Q_DECL_EXPORT BOOL KsGetEditorString(CString* text)                                                                \
    {                                                                                                                  \
        if (text)                                                                                                      \
            *text = Module::EditorName();                                                                              \
        return text != nullptr;                                                                                        \
    }                                                                                                                  \
    Q_DECL_EXPORT int KsGetBitmapId()                                                                                  \
    {                                                                                                                  \
        return Module::Bitmap;                                                                                         \
    }                                                                                                                  \
    Q_DECL_EXPORT int KsGetNumToolbars()                                                                               \
    {                                                                                                                  \
        return 1;                                                                                                      \
    }                                                                                                                  \
    Q_DECL_EXPORT BOOL KsGetToolbarString(CString* text, int index)                                                    \
    {                                                                                                                  \
        if (index == 0)                                                                                                \
            *text = Module::ToolBarName();                                                                             \
        return index == 0;                                                                                             \
    }                                                                                                                  \
    Q_DECL_EXPORT BOOL KsInitToolbar(CKsToolBarEx* bar, CKsMDIFrameWnd* frame, unsigned style, unsigned controlId,     \
                                     unsigned index)                                                                   \
    {                                                                                                                  \
        return index == 0 && Module::InitToolBar(bar, frame, style, controlId);                                        \
    }                                                                                                                  \
    Q_DECL_EXPORT CKsToolBarEx* KsCreateToolbar(CKsMDIFrameWnd* frame, unsigned style, unsigned controlId, int index)  \
    {                                                                                                                  \
        if (index != 0)                                                                                                \
            return nullptr;                                                                                            \
        auto bar = std::make_unique<CKsToolBarEx>();                                                                   \
        return Module::InitToolBar(bar.get(), frame, style, controlId) ? bar.release() : nullptr;                      \
    }                                                                                                                  \
    }
