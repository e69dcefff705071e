// A library is tried before it is loaded: its initialisation may throw, which leaves the system's loader locked for
// every other thread, end the program, or never end itself.
#pragma once

#include <QString>

/// Loads a library in a copy of this process, for at most some seconds. Why that failed, for the user; empty when it
/// went well, when the loader itself has a reason against the library, or where the system has no such copies.
QString TryLibrary(const QString& file);

/// What a library or one of its functions threw, for the user; null for what is no std::exception.
QString ThrownText(const char* what);
