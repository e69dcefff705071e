// Dates and times as texts.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

class QDateTime;

/// In the short form of the user's locale, made exact: a year of four digits, and seconds.
KS_API CString KsDateTimeText(const QDateTime& time);
