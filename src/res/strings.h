// The module's texts by number, in English; translations stand in res/translations/Kavo0_hd_*.ts.
#pragma once

#include <QString>

enum class Str : int {
#define KVR_STRING(number, name, text) name = number,
#include "res/string_table.inc"
#undef KVR_STRING
};

/// The text in the user's language.
QString LoadString(Str id);
/// By number, as resources are addressed; empty for a number that is not in the table.
QString LoadString(int number);
