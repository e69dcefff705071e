// Date and time as a text in the user's locale, to the second.
#pragma once

#include "files/field.h"

#include <QString>
#include <optional>

/// "Invalid DateTime" for six integers that are no date and time, empty when all are 0: nothing is set.
QString DateTimeText(const HDDateTime& time);
/// Reads the short and long forms of the user's locale, with or without a time (then it is midnight) and seconds, with
/// years of four digits or two (1970 to 2069), or the international forms "2024-05-31 18:00:00", "2024-05-31T18:00Z",
/// "20240531T180000+0900". A zone behind the time is read over: the value is the clock time as it is written. Any kind
/// of digits and blanks will do. An empty text is nothing set; nothing is returned for a text that is no date and time,
/// or is not to the whole second.
std::optional<HDDateTime> ReadDateTime(const QString& text);
/// Says that the text is none, or why it is not taken, and how one looks.
QString DateTimeRefusal(const QString& text);
