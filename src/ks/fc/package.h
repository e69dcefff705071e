// What is passed by address with the shell's messages.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <memory>
#include <vector>

class CView;

/// Base of everything editors exchange.
class KS_API CKsCBEItem
{
public:
    virtual ~CKsCBEItem();
};

/// An ordered list of exchange items. Whoever creates the list owns it and its items.
using CObList = std::vector<std::unique_ptr<CKsCBEItem>>;

/// The package of a message. It lives on the sender's stack for the duration of the call; a receiver keeps no address.
class KS_API CKSComm_Package : public CKsCBEItem
{
public:
    CView* view = nullptr;      // the sender
    CString text;               // a document's path name
    int kind = 0;               // 8: HD parameters
    std::intptr_t project = 0;  // handle from joining, 0 for none
    CObList* objects = nullptr; // the sender's list, for what the request asks or brings; null for none
};
