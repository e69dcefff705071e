// Names that the plug-in boundary uses.
#pragma once

#include <QString>
#include <cstdint>

using BOOL = int;
using CString = QString;
using WPARAM = std::uintptr_t;
using LPARAM = std::intptr_t;
using LRESULT = std::intptr_t;
