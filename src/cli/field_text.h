// Declared fields as text: for reading by people, by other programs, and back from a command line.
#pragma once

#include "base/result.h"
#include "files/field.h"

#include <optional>
#include <string>
#include <string_view>
#include <vector>

/// The field's value as one cell, numbers in the shortest text that reads back to the same bits, whatever the locale;
/// the elements of a group are parted by "; ", their values by blanks.
std::string CellText(const Field& field, const void* object);
/// The field's value in JSON; a number that JSON cannot express is null.
std::string JsonText(const Field& field, const void* object);
std::string JsonString(std::string_view text);

/// A number of a command line: as cells take it, or the file's words for what is none.
std::optional<double> ReadArgument(std::string_view text);

/// One text a parameter, in file order: a group gives its count first, a date-time its six integers.
std::vector<std::string> ParamTexts(FieldList fields, const void* object);

/// Stores texts in the same order into the object. On failure the error says what was expected, and the object holds
/// part of them.
Result<void> ParseParams(FieldList fields, const std::vector<std::string>& texts, void* object);
