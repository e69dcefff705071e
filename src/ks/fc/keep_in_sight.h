// Brings something into sight in windows that scroll because they are too small for what stands in them.
#pragma once

#include "ks/ks_export.h"

#include <QRect>

class QWidget;

/// A part of a widget, in its own coordinates: all of it if there is room, for a field or a cell that is half in sight
/// cannot be read.
KS_API void KsKeepInSight(QWidget& widget, const QRect& part);
