// Functions that editors export for each other. An editor never links another one: it asks for a function by name, and
// does without when there is none.
#pragma once

#include "ks/ks_export.h"

#include <QFunctionPointer>
#include <functional>

/// The shell tells where the functions of one editor are. The resolver answers null for a name it does not know.
KS_API void KsAddExports(std::function<QFunctionPointer(const char* name)> resolver);
/// Forgets all of them; the shell does so at its end.
KS_API void KsClearExports();
/// The function of that name of the first editor that has it; null when none has.
KS_API QFunctionPointer KsFindExport(const char* name);

/// KsFindExportAs<decltype(KvrMSGGetData)>("KvrMSGGetData")
template <typename Function>
Function* KsFindExportAs(const char* name)
{
    return reinterpret_cast<Function*>(KsFindExport(name));
}
