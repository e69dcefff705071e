// The text of a tool tip that describes a column or a field.
#pragma once

#include "files/field.h"
#include "ks/units/edit_style.h"

#include <QStringList>
#include <string_view>

/// The lines that say something, broken where they are long: a tool tip of plain text is as wide as its longest line.
QString ToolTipText(const QStringList& lines);

// Lines of one; empty where there is nothing to say.
QString RangeLine(const Bounds& bounds, const CKsEditStyle& style, const QString& unit);
QString DefaultLine(const QString& value);
QString NameInFileLine(std::string_view name);
