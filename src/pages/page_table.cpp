#include "pages/page_table.h"

std::span<const PageEntry> PageTable()
{
    static const PageEntry pages[] = {
#define KVR_PAGE(name, caption, tab, offersBranchNames) {Make##name, Str::caption, tab, offersBranchNames},
#include "pages/page_list.inc"
#undef KVR_PAGE
    };
    return pages;
}
