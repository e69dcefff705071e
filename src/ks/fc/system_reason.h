// Why the system refused something, in the user's language.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <system_error>

/// The reason as a phrase, "no space is left on the device"; of rare ones the system's own text.
KS_API CString KsSystemReason(std::error_code error);
/// Likewise as a sentence.
KS_API CString KsSystemSentence(std::error_code error);
