// A library that exports some of what an editor must, but not all.
#include "ks/fc/plugin.h"

extern "C" {

int KsGetNumDocTemplates()
{
    return 1;
}

CMultiDocTemplate* KsGetDocTemplatePtr(int)
{
    return nullptr;
}

} // extern "C"
