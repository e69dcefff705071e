// What the module offers the shell and other editors, as static members; the exported functions call these.
#pragma once

#include "ks/fc/package.h"
#include "ks/fc/single_editor.h"

const KsSingleEditor& HDEditor();

class CKavo0_hd
{
public:
    /// A new document template; the caller owns it.
    static CMultiDocTemplate* CreateMainDlg();
    /// Builds the editor's tool bar in the given object and docks it; false when it cannot be created or filled.
    static BOOL InitToolBar(CKsToolBarEx* bar, CKsMDIFrameWnd* frame, unsigned style, unsigned controlId);

    // What another editor asks for (ks/fc/hd_messages.h). `path` counts only without a view; `view` is one of this
    // editor's, and the items stay the caller's. A request that cannot be met leaves a line in the debug log and does
    // nothing else; so does one that comes while another is being met, or while the document opens, saves or closes.

    /// The locations of the exchanged tables; the caller owns the list. Null when the request cannot be met.
    static CObList* GetData(const CString& path, CView* view);
    /// Adds the first item to the end of its table, as one undo step, and shows its tab.
    static void InsertData(const CString& path, CView* view, CObList* items);
    /// Removes the first line at exactly the first item's branch and chainage, as one undo step.
    static void DeleteData(const CString& path, CView* view, CObList* items);
    /// Nothing: a line is changed by removing it and adding another.
    static void ChangeData(const CString& path, CView* view, CObList* items);
    /// Makes that line current on the tab of its table.
    static void SelectData(const CString& path, CView* view, CObList* items);
};
