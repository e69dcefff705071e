// The one walker over declared fields: keyword parameters into an object and back, and objects with one another.
#pragma once

#include "data/field.h"
#include "tql/tql.h"

/// Number of file parameters of one element of a group (elements hold no groups).
std::size_t ParamsOf(FieldList fields);

/// Whether `count` elements of the group fit into the parameters that are left in its keyword.
bool CountFits(const GroupAccess& group, std::int32_t count, int paramsLeft);

/// Reads parameters from number `first` on into the object, by number. What is missing or of another type keeps its
/// value. A group whose count does not fit the parameters that are there keeps its elements, and nothing behind it can
/// be told apart, so reading ends. `count` is the number of the keyword's parameters. Returns the number of the first
/// parameter that no field stands for.
int ReadFields(tqlHandle keyword, int first, int count, FieldList fields, void* object);

/// Appends the object's parameters to the keyword being written.
void WriteFields(tqlHandle structure, FieldList fields, const void* object);

/// Whether all fields are equal, numbers to the last bit.
bool SameFields(FieldList fields, const void* a, const void* b);
void CopyFields(FieldList fields, const void* from, void* to);
