// What a user may enter as a number, in words.
#pragma once

#include "files/field.h"
#include "ks/units/edit_style.h"

/// "0.5 to 1", "at least 0" and so on, in the user's unit; empty without bounds.
QString BoundsText(const Bounds& bounds, const CKsEditStyle& style);
