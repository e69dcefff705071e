// The shell's libraries are one shared library, since shell and editors share its registries.
#pragma once
#include <QtGlobal>

#ifdef KS_BUILD
#define KS_API Q_DECL_EXPORT
#else
#define KS_API Q_DECL_IMPORT
#endif
