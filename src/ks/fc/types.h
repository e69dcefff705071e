// Names that the plug-in boundary uses.
#pragma once

#include <QString>
#include <cstdint>

using BOOL = int;
inline constexpr BOOL FALSE_ = 0; // TRUE and FALSE are macros on some platforms
using CString = QString;
using WPARAM = std::uintptr_t;
using LPARAM = std::intptr_t;
using LRESULT = std::intptr_t;
