// The status bar of the main window.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

class QWidget;

/// Shows a text in the status bar of the window that the widget is in, until another takes its place.
KS_API void KsTellStatus(const QWidget& inside, const CString& text);
