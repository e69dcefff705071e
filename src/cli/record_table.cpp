#include "cli/record_table.h"

#include "cli/field_text.h"
#include "cli/terminal.h"

#include <algorithm>

namespace {

/// Width on screen, taking every code point for one column.
std::size_t Width(std::string_view text)
{
    return std::size_t(
        std::ranges::count_if(text, [](char c) { return (static_cast<unsigned char>(c) & 0xC0) != 0x80; }));
}

bool IsNumeric(FieldKind kind)
{
    return kind == FieldKind::Number || kind == FieldKind::Integer;
}

std::string CsvCell(const std::string& text)
{
    if (text.find_first_of(",\"\r\n") == std::string::npos)
        return text;
    std::string quoted = "\"";
    for (const char c : text)
        quoted += c == '"' ? std::string("\"\"") : std::string(1, c);
    return quoted + '"';
}

} // namespace

void RecordTable::SetFields(std::vector<FieldList> fields)
{
    m_columns.clear();
    for (const FieldList list : fields)
        for (const Field& field : list)
            m_columns.push_back(&field);
}

void RecordTable::AddSection(const CListSection& section)
{
    m_withSet = section.HasSets();
    SetFields({LocationFields(), section.RecordFields()});
    for (std::size_t index = 0; index < section.ListCount(); ++index)
        AddList(section.ListAt(index), m_withSet ? int(index + 1) : 0);
}

void RecordTable::AddList(const CGenParamListBase& list, int set)
{
    m_rows.reserve(m_rows.size() + list.GetCount());
    for (std::size_t index = 0; index < list.GetCount(); ++index)
        AddRow(&list.GetAt(index), set);
}

void RecordTable::AddItems(GroupValue<const void> items)
{
    SetFields({items.Elements()});
    for (std::size_t index = 0; index < items.size(); ++index)
        AddRow(items[index]);
}

std::vector<std::string> RecordTable::Headers() const
{
    std::vector<std::string> headers;
    if (m_withSet)
        headers.push_back("Set");
    for (const Field* field : m_columns)
        headers.emplace_back(field->name);
    return headers;
}

std::vector<std::string> RecordTable::Cells(const Row& row) const
{
    std::vector<std::string> cells;
    if (m_withSet)
        cells.push_back(std::to_string(row.set));
    for (const Field* field : m_columns)
        cells.push_back(CellText(*field, row.object));
    return cells;
}

void RecordTable::Print(std::ostream& stream, Format format) const
{
    switch (format) {
    case Format::Table:
        PrintTable(stream);
        break;
    case Format::Csv:
        PrintCsv(stream);
        break;
    case Format::Json:
        PrintJson(stream);
        break;
    }
}

void RecordTable::PrintTable(std::ostream& stream) const
{
    const auto printable = [this](const Row& row) { // a line of a table must stay one line
        auto cells = Cells(row);
        std::ranges::transform(cells, cells.begin(), Printable);
        return cells;
    };
    const std::vector<std::string> headers = Headers();
    std::vector<std::size_t> widths;
    for (const std::string& header : headers)
        widths.push_back(Width(header));
    for (const Row& row : m_rows) {
        const auto cells = printable(row);
        for (std::size_t i = 0; i < cells.size(); ++i)
            widths[i] = std::max(widths[i], Width(cells[i]));
    }
    const std::size_t fixed = headers.size() - m_columns.size();
    const auto print = [&](const std::vector<std::string>& cells) {
        std::string line;
        for (std::size_t i = 0; i < cells.size(); ++i) {
            const std::string pad(widths[i] - Width(cells[i]), ' ');
            const bool right = i < fixed || IsNumeric(m_columns[i - fixed]->kind);
            line += (i ? "  " : "") + (right ? pad + cells[i] : cells[i] + pad);
        }
        line.erase(line.find_last_not_of(' ') + 1);
        stream << line << '\n';
    };
    print(headers);
    for (const Row& row : m_rows)
        print(printable(row));
}

void RecordTable::PrintCsv(std::ostream& stream) const
{
    const auto print = [&stream](const std::vector<std::string>& cells) {
        for (std::size_t i = 0; i < cells.size(); ++i)
            stream << (i ? "," : "") << CsvCell(cells[i]);
        stream << '\n';
    };
    print(Headers());
    for (const Row& row : m_rows)
        print(Cells(row));
}

void RecordTable::PrintJson(std::ostream& stream) const
{
    stream << '[';
    for (const Row& row : m_rows) {
        stream << (&row == m_rows.data() ? "\n  {" : ",\n  {");
        if (m_withSet)
            stream << "\"Set\": " << row.set << ", ";
        for (std::size_t i = 0; i < m_columns.size(); ++i)
            stream << (i ? ", " : "") << JsonString(m_columns[i]->name) << ": " << JsonText(*m_columns[i], row.object);
        stream << '}';
    }
    stream << (m_rows.empty() ? "]\n" : "\n]\n");
}
