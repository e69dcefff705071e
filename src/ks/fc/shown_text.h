// Names and other data on the screen: they are text, and do nothing there.
//
// Labels and tool tips of every program that links this library show plain text, whatever it looks like, unless a label
// asks for another format itself (shown_text.cpp). Menus, tabs, buttons and window titles have signs of their own, see
// below.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

/// The text with U+FFFD for what cannot be seen and changes what can: control characters and those that turn the
/// direction of writing for what follows. Line feeds and tabs stay with `lines`.
KS_API CString KsVisibleText(CString text, bool lines = false);
/// The text without marks of the writing direction and other characters of no width, which nobody sees.
KS_API CString KsWithoutUnseen(CString text);
/// For menus, tabs and labels with a buddy: every & is one, and marks no letter to press with Alt.
KS_API CString KsWithoutMnemonics(CString text);
/// For window titles: [*] is no place for the mark of what is modified.
KS_API CString KsTitleText(CString text);
