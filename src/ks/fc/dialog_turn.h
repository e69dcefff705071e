// Dialogs that nobody has asked for come one after the other.
#pragma once

#include "ks/ks_export.h"

class QDialog;

/// Shows a dialog, with the keyboard, as soon as no modal one is up: of two at a time one would block the other, and
/// neither could be sure of the keyboard.
KS_API void KsShowInTurn(QDialog* dialog);
