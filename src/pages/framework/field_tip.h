// What a field's tool tip says about its value.
#pragma once

#include <QString>

struct DeclaredKeyword;
struct Field;

/// What the value means to the computation, what stands beside it now (`shown`: its whole number, its unit), its range,
/// its default and how the file calls it.
QString FieldToolTip(const DeclaredKeyword& keyword, const Field& field, const QString& shown, const QString& unit);
