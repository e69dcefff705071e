// Storing single values of the document.
#pragma once

#include "files/field.h"

#include <cstdint>
#include <string>

class CKavo0_hdDoc;

/// Stores a value of the document as one undo step; nothing happens when it is the stored one already.
template <typename T>
void StoreValue(CKavo0_hdDoc& document, T& target, T value);
extern template void StoreValue(CKavo0_hdDoc&, double&, double);
extern template void StoreValue(CKavo0_hdDoc&, std::int32_t&, std::int32_t);
extern template void StoreValue(CKavo0_hdDoc&, bool&, bool);
extern template void StoreValue(CKavo0_hdDoc&, std::string&, std::string);
extern template void StoreValue(CKavo0_hdDoc&, HDDateTime&, HDDateTime);
