// The functions that other editors call.
#include "ks/fc/hd_messages.h"

#include "module/data_exchange.h"
#include "module/kavo0_hd.h"

extern "C" {

CObList* KvrMSGGetData(const CString& path, CKsDoc* document)
{
    return ItemsOf(path, document, &DataItems).release();
}

CObList* KvrMSGGetHDUserDefMark(const CString& path, CKsDoc* document)
{
    return ItemsOf(path, document, &MarkItems).release();
}

CObList* KvrMSGGetHDMaps(const CString& path, CKsDoc* document)
{
    return ItemsOf(path, document, &MapItems).release();
}

void KvrMSGInsertData(const CString& path, CView* view, CObList* items)
{
    CKavo0_hd::InsertData(path, view, items);
}

void KvrMSGDeleteData(const CString& path, CView* view, CObList* items)
{
    CKavo0_hd::DeleteData(path, view, items);
}

void KvrMSGSelectData(const CString& path, CView* view, CObList* items)
{
    CKavo0_hd::SelectData(path, view, items);
}

} // extern "C"
