#include "document/store_value.h"

#include "document/document.h"
#include "ks/fc/doc_command.h"
#include "res/strings.h"

#include <QUndoStack>

template <typename T>
void StoreValue(CKavo0_hdDoc& document, T& target, T value)
{
    if (target != value)
        document.UndoStack().push(new CSetValue<T>(document, LoadString(Str::UndoValue), target, std::move(value)));
}
template void StoreValue(CKavo0_hdDoc&, double&, double);
template void StoreValue(CKavo0_hdDoc&, std::int32_t&, std::int32_t);
template void StoreValue(CKavo0_hdDoc&, bool&, bool);
template void StoreValue(CKavo0_hdDoc&, std::string&, std::string);
template void StoreValue(CKavo0_hdDoc&, HDDateTime&, HDDateTime);
