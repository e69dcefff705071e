// The pages of the sheet, one row a page.
#pragma once

#include "res/strings.h"

#include <memory>
#include <span>

class CGenPropertyPage;
class CKavo0_hdDoc;

struct PageEntry
{
    std::unique_ptr<CGenPropertyPage> (*make)(CKavo0_hdDoc* document);
    Str caption;             // of its tab
    int tab;                 // place on the sheet, ascending; NotOnSheet for a page that is only constructed
    bool offersBranchNames;  // inside a project its location grid offers the network's branch names in column 1
};

inline constexpr int NotOnSheet = -1;

/// In the order of construction.
std::span<const PageEntry> PageTable();
