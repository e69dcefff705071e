#include "rapid_json.h"

#include <charconv>
#include <fstream>
#include <rapidjson/document.h>
#include <rapidjson/reader.h>

namespace {

// Numbers to the last bit, as std::from_chars reads them.
constexpr unsigned Exact = rapidjson::kParseFullPrecisionFlag;

class RecordHandler : public rapidjson::BaseReaderHandler<rapidjson::UTF8<>, RecordHandler>
{
public:
    std::vector<PlainRecord> records;

    bool StartObject()
    {
        records.emplace_back();
        return true;
    }
    bool Key(const char* key, rapidjson::SizeType, bool)
    {
        m_key = key[0] == 'I' ? key[7] : key[0]; // RiverName, Chainage, InitialH, InitialQ
        return true;
    }
    bool String(const char* text, rapidjson::SizeType length, bool)
    {
        records.back().name.assign(text, length);
        return true;
    }
    bool Double(double value)
    {
        PlainRecord& record = records.back();
        (m_key == 'C' ? record.chainage : m_key == 'H' ? record.h : record.q) = value;
        return true;
    }
    bool Int(int value) { return Double(value); }
    bool Uint(unsigned value) { return Double(value); }

private:
    char m_key = 0;
};

} // namespace

void WriteJson(const std::vector<PlainRecord>& records, const std::string& path)
{
    std::string text = "[\n";
    const auto number = [&](const char* key, double value) {
        char buffer[32];
        text += key;
        text.append(buffer, std::to_chars(buffer, buffer + sizeof buffer, value).ptr);
    };
    for (const PlainRecord& record : records) {
        text += text.size() > 2 ? ",\n{\"RiverName\":\"" : "{\"RiverName\":\"";
        text += record.name;
        number("\",\"Chainage\":", record.chainage);
        number(",\"InitialH\":", record.h);
        number(",\"InitialQ\":", record.q);
        text += '}';
    }
    text += "\n]\n";
    std::ofstream(path, std::ios::binary) << text;
}

std::vector<PlainRecord> ReadJsonDom(const std::string& path)
{
    const std::string text = ReadText(path);
    rapidjson::Document document;
    document.Parse<Exact>(text.c_str());
    std::vector<PlainRecord> records;
    for (const auto& item : document.GetArray())
        records.push_back({item["RiverName"].GetString(), item["Chainage"].GetDouble(), item["InitialH"].GetDouble(),
                           item["InitialQ"].GetDouble()});
    return records;
}

std::vector<PlainRecord> ReadJsonSax(const std::string& path)
{
    const std::string text = ReadText(path);
    RecordHandler handler;
    rapidjson::StringStream stream(text.c_str());
    rapidjson::Reader().Parse<Exact>(stream, handler);
    return std::move(handler.records);
}
