// The pages of the sheet, as page_list.inc declares them.
#pragma once

#include "res/strings.h"

#include <memory>
#include <span>

class CGenPropertyPage;
class CKavo0_hdDoc;

#define KVR_PAGE(name, caption, tab, offersBranchNames)                                                                \
    std::unique_ptr<CGenPropertyPage> Make##name(CKavo0_hdDoc* document);
#include "pages/page_list.inc"
#undef KVR_PAGE

struct PageEntry
{
    std::unique_ptr<CGenPropertyPage> (*make)(CKavo0_hdDoc* document);
    Str caption;            // of its tab
    int tab;                // place on the sheet, ascending; NotOnSheet for a page that is only constructed
    bool offersBranchNames; // inside a project its location grid offers the network's branch names in column 1
};

inline constexpr int NotOnSheet = -1;

/// In the order of construction.
std::span<const PageEntry> PageTable();
