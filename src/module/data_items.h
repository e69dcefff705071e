// What a document tells other editors, as exchange items.
#pragma once

#include "ks/fc/exchange.h"

#include <memory>

class CKavo0_hdDoc;

/// The lines of the exchanged tables, incomplete ones included, in the order of the type codes and of the lists.
std::unique_ptr<CObList> DataItems(CKavo0_hdDoc& document);
/// Titles and locations of the user-defined marks.
std::unique_ptr<CObList> MarkItems(CKavo0_hdDoc& document);
/// The maps to be written.
std::unique_ptr<CObList> MapItems(CKavo0_hdDoc& document);
