// Writing JSON with RapidJSON.
#pragma once

#include <ostream>
#include <rapidjson/ostreamwrapper.h>
#include <rapidjson/prettywriter.h>
#include <string_view>

using JsonWriter = rapidjson::PrettyWriter<rapidjson::OStreamWrapper>;

inline void Put(JsonWriter& json, std::string_view text)
{
    json.String(text.data(), rapidjson::SizeType(text.size()));
}
inline void Put(JsonWriter& json, const char* text)
{
    Put(json, std::string_view(text));
}
inline void Put(JsonWriter& json, std::size_t number)
{
    json.Uint64(number);
}
inline void Put(JsonWriter& json, int number)
{
    json.Int(number);
}
inline void Put(JsonWriter& json, double number)
{
    json.Double(number);
}
inline void Put(JsonWriter& json, bool is)
{
    json.Bool(is);
}
template <typename Value>
void Put(JsonWriter& json, const char* key, const Value& value)
{
    json.Key(key);
    Put(json, value);
}
template <typename Inside>
void PutObject(JsonWriter& json, const Inside& inside)
{
    json.StartObject();
    inside();
    json.EndObject();
}
template <typename Inside>
void PutObject(JsonWriter& json, const char* key, const Inside& inside)
{
    json.Key(key);
    PutObject(json, inside);
}
template <typename Items, typename Inside>
void PutArray(JsonWriter& json, const char* key, const Items& items, const Inside& inside)
{
    json.Key(key);
    json.StartArray();
    for (const auto& item : items)
        inside(item);
    json.EndArray();
}
