// An editor that has one document template and one tool bar: what it is, and the functions that its plug-in exports.
#pragma once

#include "ks/fc/doc_template.h"
#include "ks/fc/frames.h"
#include "ks/fc/plugin.h"
#include "ks/language/language.h"

/// Functions are asked whenever a text is shown, and answer in the user's language of the moment.
struct KS_API KsSingleEditor
{
    const char* texts;        // the module of its translations
    void (*load)() = nullptr; // makes available what else it needs
    int documentResource = 0; // numbers
    int bitmap = 0;
    CMultiDocTemplate::Strings documentStrings;
    CMultiDocTemplate::Classes classes;
    std::function<CString()> name, toolBarName;
    std::function<std::vector<CKsToolBarButton>()> buttons;

    /// A new template, which the caller owns.
    CMultiDocTemplate* CreateTemplate() const;
    /// Fills the bar and docks it; false when the bar or the frame is missing, or there are no buttons.
    bool InitToolBar(CKsToolBarEx* bar, CKsMDIFrameWnd* frame, unsigned style, unsigned controlId) const;
    CKsToolBarEx* CreateToolBar(CKsMDIFrameWnd* frame, unsigned style, unsigned controlId) const;
};

/// What an editor needs while its library is loaded.
class KS_API CKsEditorResources
{
public:
    explicit CKsEditorResources(const KsSingleEditor& editor);
    ~CKsEditorResources() { KsLangFreeResDll(m_texts); }
    CKsEditorResources(const CKsEditorResources&) = delete;
    CKsEditorResources& operator=(const CKsEditorResources&) = delete;

private:
    KsResourceHandle m_texts = nullptr;
};

/// Defines the functions that the shell calls. `Editor` is a function that gives the KsSingleEditor, always the same.
#define KS_SINGLE_EDITOR(Editor)                                                                                       \
    static const CKsEditorResources g_resources(Editor());                                                             \
    extern "C" {                                                                                                       \
    Q_DECL_EXPORT int KsGetNumDocTemplates()                                                                           \
    {                                                                                                                  \
        return 1;                                                                                                      \
    }                                                                                                                  \
    Q_DECL_EXPORT CMultiDocTemplate* KsGetDocTemplatePtr(int index)                                                    \
    {                                                                                                                  \
        return index == 0 ? Editor().CreateTemplate() : nullptr;                                                       \
    }                                                                                                                  \
    Q_DECL_EXPORT BOOL KsGetEditorString(CString* text)                                                                \
    {                                                                                                                  \
        return text && (*text = Editor().name(), true);                                                                \
    }                                                                                                                  \
    Q_DECL_EXPORT int KsGetBitmapId()                                                                                  \
    {                                                                                                                  \
        return Editor().bitmap;                                                                                        \
    }                                                                                                                  \
    Q_DECL_EXPORT int KsGetNumToolbars()                                                                               \
    {                                                                                                                  \
        return 1;                                                                                                      \
    }                                                                                                                  \
    Q_DECL_EXPORT BOOL KsGetToolbarString(CString* text, int index)                                                    \
    {                                                                                                                  \
        return index == 0 && (*text = Editor().toolBarName(), true);                                                   \
    }                                                                                                                  \
    Q_DECL_EXPORT BOOL KsInitToolbar(CKsToolBarEx* bar, CKsMDIFrameWnd* frame, unsigned style, unsigned controlId,     \
                                     unsigned index)                                                                   \
    {                                                                                                                  \
        return index == 0 && Editor().InitToolBar(bar, frame, style, controlId);                                       \
    }                                                                                                                  \
    Q_DECL_EXPORT CKsToolBarEx* KsCreateToolbar(CKsMDIFrameWnd* frame, unsigned style, unsigned controlId, int index)  \
    {                                                                                                                  \
        return index == 0 ? Editor().CreateToolBar(frame, style, controlId) : nullptr;                                 \
    }                                                                                                                  \
    }
