#include "hand_coded.h"

#include <charconv>
#include <cstring>
#include <fstream>
#include <iostream>
#include <string_view>

namespace {

std::string_view NextLine(const char*& p, const char* end)
{
    const char* const start = p;
    const char* const feed = static_cast<const char*>(std::memchr(p, '\n', std::size_t(end - p)));
    p = feed ? feed + 1 : end;
    std::string_view line(start, std::size_t((feed ? feed : end) - start));
    line.remove_prefix(std::min(line.find_first_not_of(' '), line.size()));
    return line;
}

double Number(const char*& p, const char* end)
{
    while (p < end && (*p == ' ' || *p == ','))
        ++p;
    double value = 0;
    p = std::from_chars(p, end, value).ptr;
    return value;
}

void ReadRecord(std::string_view line, std::vector<PlainRecord>& records)
{
    const std::size_t open = line.find('"'), close = line.find('"', open + 1);
    PlainRecord& record = records.emplace_back();
    record.name = line.substr(open + 1, close - open - 1);
    const char* p = line.data() + close + 1;
    const char* const end = line.data() + line.size();
    record.chainage = Number(p, end);
    record.h = Number(p, end);
    record.q = Number(p, end);
}

void AppendNumber(std::string& text, double value)
{
    char buffer[32];
    const auto result = std::to_chars(buffer, buffer + sizeof buffer, value);
    text.append(buffer, result.ptr);
}

} // namespace

std::string ReadText(const std::string& path)
{
    std::ifstream in(path, std::ios::binary | std::ios::ate);
    std::string text(std::size_t(in.tellg()), '\0');
    in.seekg(0);
    in.read(text.data(), static_cast<std::streamsize>(text.size()));
    return text;
}

PlainFile HandCodedRead(const std::string& path)
{
    const std::string text = ReadText(path);
    PlainFile file;
    bool inList = false;
    const char* p = text.data();
    for (const char* const end = p + text.size(); p < end;) {
        const std::string_view line = NextLine(p, end);
        if (line.starts_with("DATA = ")) {
            if (inList)
                ReadRecord(line, file.records);
        } else if (line.starts_with('[')) {
            inList = line == "[InitList]";
        } else if (const std::size_t equals = line.find(" = "); equals != line.npos) {
            file.globals.emplace_back(line.substr(0, equals), line.substr(equals + 3));
        }
    }
    return file;
}

void HandCodedWrite(const PlainFile& file, const std::string& path)
{
    std::string text = "[KAVO0_HD]\n  [Global_Variables]\n";
    for (const auto& [name, value] : file.globals)
        text += "    " + name + " = " + value + "\n";
    text += "  [/Global_Variables]\n  [InitList]\n";
    for (const PlainRecord& record : file.records) {
        text += "    DATA = \"";
        text += record.name;
        text += '"';
        for (const double value : {record.chainage, record.h, record.q}) {
            text += ", ";
            AppendNumber(text, value);
        }
        text += '\n';
    }
    text += "  [/InitList]\n[/KAVO0_HD]\n";
    std::ofstream out(path, std::ios::binary);
    out.write(text.data(), static_cast<std::streamsize>(text.size()));
    out.close();
    if (!out)
        std::cerr << "could not write " << path << "\n";
}
