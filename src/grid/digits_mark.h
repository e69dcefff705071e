// The mark of a number that is shown with fewer digits than it has.
#pragma once

class QPainter;
class QPalette;
class QRect;

/// A small triangle in the upper right corner of `box`, a cell or a field.
void PaintDigitsMark(QPainter& painter, const QRect& box, const QPalette& palette, bool isSelected = false);
