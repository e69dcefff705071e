// Tables as text, as spreadsheets exchange them: a line a row, tabs between the cells.
#pragma once

#include <QStringList>
#include <deque>
#include <vector>

/// A text with tabs, line ends or quotes is put in quotes, its quotes doubled. No line end behind the last line, unless
/// that is one empty cell.
QString WriteTable(const std::vector<QStringList>& rows);

/// The cells of such a text, which is not copied for them. Lines and columns count from 0; lines may differ in width.
/// Takes LF, CRLF and CR as line ends; one line end behind the last line is no further line. Of several columns empty
/// lines behind the last one are none, either.
class CTextTable
{
public:
    explicit CTextTable(QString text, QChar separator = u'\t');

    std::size_t Lines() const { return m_starts.size(); }
    int Width(std::size_t line) const { return int(End(line) - m_starts[line]); }
    /// Of the widest line.
    int Columns() const;
    QStringView At(std::size_t line, int column) const { return m_cells[m_starts[line] + std::size_t(column)]; }
    QStringList Line(std::size_t line) const;
    void Set(std::size_t line, int column, QString text);
    void RemoveFirstLine() { m_starts.erase(m_starts.begin()); }

private:
    std::size_t End(std::size_t line) const { return line + 1 < m_starts.size() ? m_starts[line + 1] : m_cells.size(); }
    QStringView ReadCell(qsizetype& at, QChar separator);

    QString m_text;
    std::deque<QString> m_others; // cells that do not stand in the text so
    std::vector<QStringView> m_cells;
    std::vector<std::size_t> m_starts; // the first cell of each line
};
