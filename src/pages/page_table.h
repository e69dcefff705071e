// The pages of the sheet, as page_list.inc declares them.
#pragma once

#include "pages/framework/page.h"
#include "res/strings.h"

#include <memory>
#include <span>

using PageMaker = std::unique_ptr<CGenPropertyPage> (*)(CKavo0_hdDoc* document);

template <typename Page>
std::unique_ptr<CGenPropertyPage> MakePage(CKavo0_hdDoc* document)
{
    return std::make_unique<Page>(document);
}

#define KVR_PAGE(name, caption, tab, offersBranchNames) extern const PageMaker Make##name;
#include "pages/page_list.inc"
#undef KVR_PAGE

struct PageEntry
{
    PageMaker make;
    Str caption;            // of its tab
    int tab;                // place on the sheet, ascending; NotOnSheet for a page that is only constructed
    bool offersBranchNames; // inside a project its location grid offers the network's branch names in column 1
};

inline constexpr int NotOnSheet = -1;

/// In the order of construction.
std::span<const PageEntry> PageTable();
