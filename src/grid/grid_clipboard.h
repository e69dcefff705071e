// Tables as tab-separated text, as spreadsheets exchange them.
#pragma once

#include <QStringList>
#include <vector>

class CGenGrid;

/// A text with tabs, line ends or quotes is put in quotes, its quotes doubled. No line end behind the last line.
QString WriteTable(const std::vector<QStringList>& rows);
/// Takes LF, CRLF and CR as line ends; one line end behind the last line is no further line.
std::vector<QStringList> ReadTable(const QString& text);

bool CanCopyCells(const CGenGrid& grid);
/// Puts the selected cells of a grid, or the current one, on the clipboard.
void CopyCells(const CGenGrid& grid);
bool CanPasteCells(const CGenGrid& grid);
/// Pastes at the selection. False, after a message, when a cell refuses its text; then nothing changed.
bool PasteCells(CGenGrid& grid);
