#include "grid/table_text.h"
#include "properties.h"

std::string CheckTable(const std::string& text)
{
    const QString pasted = QString::fromStdString(text);
    const auto rows = ReadTable(pasted);
    if (rows.empty() || rows.front().isEmpty())
        return "a text became no table";
    const std::vector<QStringList> cell = {{pasted}};
    for (const auto& table : {rows, cell})
        if (ReadTable(WriteTable(table)) != table)
            return "a table that was copied is pasted otherwise: " + WriteTable(table).toStdString();
    return "";
}
