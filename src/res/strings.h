// The module's texts by number, in English; translations stand in res/translations/Kavo0_hd_*.ts.
#pragma once

#include "texts/text_numbers.h"

#include <QString>
#include <cstddef>

/// The text in the user's language.
QString LoadString(Str id);
/// One line of a text that holds several, counted from 0; the whole text for a number below.
QString LoadLine(Str id, int line);
/// As it stands in the source, in English, with line ends; null for a number that is not in the table.
const char* SourceText(Str id);
/// The name of their translations, as a module and as a context.
inline constexpr const char* TextsOfModule = "Kavo0_hd";
/// The title of a control as a message calls it (PlainText).
QString PlainTitle(const QString& title);
/// The text for one, or the one for many with their number.
QString LoadCounted(std::size_t count, Str one, Str many);
/// By number, as resources are addressed; empty for a number that is not in the table.
QString LoadString(int number);
