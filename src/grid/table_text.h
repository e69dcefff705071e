// Tables as tab-separated text, as spreadsheets exchange them.
#pragma once

#include <QStringList>
#include <vector>

/// A text with tabs, line ends or quotes is put in quotes, its quotes doubled. No line end behind the last line, unless
/// that is one empty cell.
QString WriteTable(const std::vector<QStringList>& rows);
/// Takes LF, CRLF and CR as line ends; one line end behind the last line is no further line. Of several columns empty
/// lines behind the last one are none, either.
std::vector<QStringList> ReadTable(const QString& text);
