// Storing single values of the document.
#pragma once

#include "document/document.h"
#include "ks/fc/doc_command.h"

#include <QUndoStack>

/// Stores a value of the document as one undo step; nothing happens when it is the stored one already.
template <typename T>
void StoreValue(CKavo0_hdDoc& document, T& target, T value)
{
    if (target != value)
        document.UndoStack().push(new CSetValue<T>(document, LoadString(Str::UndoValue), target, std::move(value)));
}
