// The marks of what differs from the last save.
#pragma once

#include "grid/saved_lines.h"

class QPainter;
class QPalette;
class QRect;

/// At the left edge of a line's number: a bar for one that was changed, a plus sign for a new one.
void PaintLineMark(QPainter& painter, const QRect& number, const QPalette& palette, SavedMark mark);
/// At the left edge of a cell that was changed: a short bar.
void PaintCellMark(QPainter& painter, const QRect& cell, const QPalette& palette, bool isSelected);
