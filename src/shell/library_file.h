// The file of a library, looked at before the system maps it.
#pragma once

#include <QString>

/// Why a file cannot be loaded as a library, in the user's language; empty when nothing speaks against it. Of a file
/// that was cut off the system would map what is not there, and end the program at the first look at it.
QString WhyNoLibrary(const QString& file);
