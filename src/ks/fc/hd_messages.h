// The functions that the HD parameter editor exports for other editors; find them with KsFindExport.
//
// All are called on the user-interface thread and never throw. A null list, an unknown type, a record that is not
// there, a file that cannot be read: nothing happens, and the answer is null. Whoever makes a list owns it and its
// items: the caller owns what it passes, and the lists that the first three functions return are the caller's to
// delete.
#pragma once

#include "ks/fc/exchange.h"

class CKsDoc;
class CView;

/// HD_EXPORTED_FUNCTION(result, name, arguments), a row each.
#define KVR_HD_FUNCTIONS(HD_EXPORTED_FUNCTION)                                                                         \
    /* Locations of seven tables, as CKvr_CBE_ModelDataItem in the order of the type codes and of the lists. Of */     \
    /* `document` when it is one of this editor's, as it is stored there; otherwise of the file `path`. */             \
    HD_EXPORTED_FUNCTION(CObList*, KvrMSGGetData, (const CString& path, CKsDoc* document))                             \
    /* Titles and locations of the user-defined marks, as CKvrCBEUserDefMark. */                                       \
    HD_EXPORTED_FUNCTION(CObList*, KvrMSGGetHDUserDefMark, (const CString& path, CKsDoc* document))                    \
    /* The maps to be written, as CKvr_CBE_HDMaps. */                                                                  \
    HD_EXPORTED_FUNCTION(CObList*, KvrMSGGetHDMaps, (const CString& path, CKsDoc* document))                           \
    /* A new line at the end of a table, from the first item. Without a view of this editor the file `path` is */      \
    /* opened in a new window. */                                                                                      \
    HD_EXPORTED_FUNCTION(void, KvrMSGInsertData, (const CString& path, CView* view, CObList* items))                   \
    /* Removes the first line with exactly the branch and chainage of the first item. */                               \
    HD_EXPORTED_FUNCTION(void, KvrMSGDeleteData, (const CString& path, CView* view, CObList* items))                   \
    /* Shows that line. */                                                                                             \
    HD_EXPORTED_FUNCTION(void, KvrMSGSelectData, (const CString& path, CView* view, CObList* items))

#define KVR_HD_DECLARE(result, name, arguments) extern "C" Q_DECL_EXPORT result name arguments;
KVR_HD_FUNCTIONS(KVR_HD_DECLARE)
#undef KVR_HD_DECLARE
