// Date and time as a text in the user's locale, to the second.
#pragma once

#include "data/field.h"

#include <QString>
#include <optional>

/// "Invalid DateTime" for six integers that are no date and time, empty when all are 0: nothing is set.
QString DateTimeText(const HDDateTime& time);
/// Reads a text in the user's locale, with or without seconds, or the international form "2024-05-31 18:00:00". An
/// empty text is nothing set; nothing is returned for a text that is no date and time.
std::optional<HDDateTime> ReadDateTime(const QString& text);
/// Says that the text is none, and how one looks.
QString DateTimeRefusal(const QString& text);
