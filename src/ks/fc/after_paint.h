// Work that waits until the user sees something.
#pragma once

#include "ks/ks_export.h"

#include <functional>

class QObject;
class QWidget;

/// Runs an action once a widget has been painted; after half a second also when it is not. The action goes with
/// `owner`.
KS_API void KsAfterPaint(QWidget* painted, QObject* owner, std::function<void()> action);
