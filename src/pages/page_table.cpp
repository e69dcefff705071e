#include "pages/page_table.h"

#include "pages/framework/page.h"

namespace {

constexpr PageEntry Pages[] = {
#define KVR_PAGE(name, caption, tab, offersBranchNames) {&Make##name, Str::caption, tab, offersBranchNames},
#include "pages/page_list.inc"
#undef KVR_PAGE
};

} // namespace

std::span<const PageEntry> PageTable()
{
    return Pages;
}
