#include "grid/table_text.h"
#include "properties.h"

static std::vector<QStringList> Read(const QString& text)
{
    const CTextTable table(text);
    std::vector<QStringList> lines;
    for (std::size_t line = 0; line < table.Lines(); ++line)
        lines.push_back(table.Line(line));
    return lines;
}

std::string CheckTable(const std::string& text)
{
    const QString pasted = QString::fromStdString(text);
    const auto rows = Read(pasted);
    if (rows.empty() || rows.front().isEmpty())
        return "a text became no table";
    const std::vector<QStringList> cell = {{pasted}};
    for (const auto& table : {rows, cell})
        if (Read(WriteTable(table)) != table)
            return "a table that was copied is pasted otherwise: " + WriteTable(table).toStdString();
    return "";
}
