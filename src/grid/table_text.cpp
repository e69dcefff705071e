#include "grid/table_text.h"

#include <algorithm>

QString WriteTable(const std::vector<QStringList>& rows)
{
    QString text;
    for (const QStringList& row : rows) {
        if (&row != &rows.front())
            text += QLatin1Char('\n');
        for (qsizetype column = 0; column < row.size(); ++column) {
            if (column > 0)
                text += QLatin1Char('\t');
            const QString& cell = row[column];
            const bool special = std::any_of(
                cell.begin(), cell.end(), [](QChar c) { return c == u'\t' || c == u'\n' || c == u'\r' || c == u'"'; });
            text += special ? u'"' + QString(cell).replace(u'"', QStringLiteral("\"\"")) + u'"' : cell;
        }
    }
    // A last line that is one empty cell would be taken for the end of the line before.
    if (rows.size() > 1 && rows.back() == QStringList(QString()))
        text += QLatin1Char('\n');
    return text;
}

/// Reads one cell from `at` on and leaves `at` on what ended it.
QStringView CTextTable::ReadCell(qsizetype& at, QChar separator)
{
    const QStringView text = m_text;
    const qsizetype start = at;
    const auto readPlain = [&] {
        const QChar* const end = std::find_if(
            text.begin() + at, text.end(), [separator](QChar c) { return c == separator || c == u'\n' || c == u'\r'; });
        at = end - text.begin();
    };
    // Quotes that are not closed are part of the text.
    if (at == text.size() || text[at] != u'"' || text.indexOf(u'"', at + 1) < 0) {
        readPlain();
        return text.sliced(start, at - start);
    }
    QString cell;
    for (bool quoted = (++at, true); quoted;) {
        const qsizetype quote = text.indexOf(u'"', at);
        cell += text.sliced(at, (quote < 0 ? text.size() : quote) - at);
        quoted = quote >= 0 && quote + 1 < text.size() && text[quote + 1] == u'"';
        if (quoted)
            cell += u'"';
        at = quote < 0 ? text.size() : quote + 1 + quoted;
    }
    const qsizetype behind = at;
    readPlain();
    return m_others.emplace_back(cell.append(text.sliced(behind, at - behind)));
}

CTextTable::CTextTable(QString text, QChar separator) : m_text(std::move(text))
{
    const qsizetype size = m_text.size();
    qsizetype at = 0;
    bool isOneColumn = true;
    while (at < size || m_starts.empty()) {
        m_starts.push_back(m_cells.size());
        m_cells.push_back(ReadCell(at, separator));
        while (at < size && m_text.at(at) == separator) {
            m_cells.push_back(ReadCell(++at, separator));
            isOneColumn = false;
        }
        if (Lines() == 1) { // the others are likely to be like the first one
            const auto lines = std::size_t(size / std::max<qsizetype>(at, 1));
            m_starts.reserve(lines);
            m_cells.reserve(lines * m_cells.size());
        }
        if (at < size)
            at += m_text.at(at) == u'\r' && at + 1 < size && m_text.at(at + 1) == u'\n' ? 2 : 1;
    }
    // In a single column an empty line is an empty cell.
    while (!isOneColumn && Width(Lines() - 1) == 1 && m_cells.back().isEmpty()) {
        m_cells.pop_back();
        m_starts.pop_back();
    }
}

int CTextTable::Columns() const
{
    int columns = 0;
    for (std::size_t line = 0; line < Lines(); ++line)
        columns = std::max(columns, Width(line));
    return columns;
}

QStringList CTextTable::Line(std::size_t line) const
{
    QStringList cells;
    for (int column = 0; column < Width(line); ++column)
        cells << At(line, column).toString();
    return cells;
}

void CTextTable::Set(std::size_t line, int column, QString text)
{
    m_cells[m_starts[line] + std::size_t(column)] = m_others.emplace_back(std::move(text));
}
