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

namespace {

/// Reads one cell from `at` on and leaves `at` on what ended it.
QString ReadTableCell(const QString& text, qsizetype& at)
{
    QString cell;
    // Quotes that are not closed are part of the text.
    bool quoted = at < text.size() && text[at] == u'"' && text.indexOf(u'"', at + 1) >= 0;
    at += quoted;
    for (; at < text.size(); ++at) {
        const QChar c = text[at];
        if (quoted && c == u'"') {
            if (at + 1 < text.size() && text[at + 1] == u'"')
                cell += text[++at];
            else
                quoted = false;
        } else if (!quoted && (c == u'\t' || c == u'\n' || c == u'\r')) {
            break;
        } else {
            cell += c;
        }
    }
    return cell;
}

} // namespace

std::vector<QStringList> ReadTable(const QString& text)
{
    std::vector<QStringList> rows;
    qsizetype at = 0;
    while (at < text.size() || rows.empty()) {
        QStringList& row = rows.emplace_back();
        row << ReadTableCell(text, at);
        while (at < text.size() && text[at] == u'\t')
            row << ReadTableCell(text, ++at);
        if (at < text.size())
            at += text[at] == u'\r' && at + 1 < text.size() && text[at + 1] == u'\n' ? 2 : 1;
    }
    // In a single column an empty line is an empty cell.
    if (std::ranges::any_of(rows, [](const QStringList& row) { return row.size() > 1; }))
        while (rows.back() == QStringList(QString()))
            rows.pop_back();
    return rows;
}
