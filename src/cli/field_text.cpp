#include "cli/field_text.h"

#include "files/field_io.h"
#include "files/read_number.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <iterator>
#include <limits>

namespace {

template <typename T>
std::string Shortest(T value)
{
    char buffer[32];
    return {buffer, std::to_chars(buffer, buffer + sizeof buffer, value).ptr};
}

std::string JsonElement(FieldList fields, const void* element)
{
    if (fields.size() == 1)
        return JsonText(fields[0], element);
    std::string text = "{";
    for (const Field& field : fields)
        text += (text.size() > 1 ? ", " : "") + JsonString(field.name) + ": " + JsonText(field, element);
    return text + '}';
}

/// Walks the texts of a command line along the fields.
class Parser
{
public:
    explicit Parser(const std::vector<std::string>& texts) : m_texts(texts) {}

    Result<void> Parse(FieldList fields, void* object)
    {
        for (const Field& field : fields)
            if (Result<void> stored = ParseField(field, object); !stored)
                return stored;
        return {};
    }
    std::size_t Used() const { return m_next; }

private:
    Result<void> ParseField(const Field& field, void* object)
    {
        if (Result<void> read = Visit(field, object, [&](auto&& value) { return ParseValue(field.name, value); });
            !read || field.kind != FieldKind::Number || IsAllowed(field, field.In<double>(object)))
            return read;
        return Error{std::string(field.name) + " should be " + BoundsWords(field.bounds) + ", found \"" +
                     m_texts[m_next - 1] + '"'};
    }

    static bool IsAllowed(const Field& field, double value)
    {
        const bool isKnown = !std::isnan(value) || field.mayBeUnknown || field.bounds == Bounds();
        return isKnown && field.bounds.Allow(value);
    }

    Result<void> ParseValue(std::string_view name, double& value)
    {
        return Take(name, value, "a number", &ReadArgument);
    }
    Result<void> ParseValue(std::string_view name, std::int32_t& value)
    {
        return Take(name, value, "an integer", &ReadInteger);
    }
    Result<void> ParseValue(std::string_view name, bool& value)
    {
        return Take(name, value, "true or false", &ReadFlag);
    }

    static std::optional<bool> ReadFlag(std::string_view text)
    {
        return text == "true" || text == "false" ? std::optional(text == "true") : std::nullopt;
    }

    template <typename T>
    Result<void> Take(std::string_view name, T& value, const char* expected, std::optional<T> (*read)(std::string_view))
    {
        if (m_next == m_texts.size())
            return Error{"value for " + std::string(name) + " is missing, expected " + expected};
        const std::string& text = m_texts[m_next];
        std::optional<T> taken = read(text);
        if (!taken)
            return Error{std::string(name) + " should be " + expected + ", found \"" + text + '"'};
        value = *std::move(taken);
        ++m_next;
        return {};
    }

    Result<void> ParseValue(std::string_view name, std::string& value)
    {
        return Take<std::string>(name, value, "a text",
                                 [](std::string_view text) { return std::optional(std::string(text)); });
    }

    Result<void> ParseValue(std::string_view name, HDDateTime& value)
    {
        HDDateTime date;
        std::int32_t* const parts[] = {&date.Year, &date.Month, &date.Day, &date.Hour, &date.Minute, &date.Second};
        for (std::int32_t* part : parts)
            if (Result<void> read = Take(name, *part, "six integers: year month day hour minute second", &ReadInteger);
                !read)
                return read;
        if (!date.IsValid())
            return Error{std::string(name) + " should be a date and time, found " + DateText(date)};
        value = date;
        return {};
    }

    Result<void> ParseValue(std::string_view name, GroupValue<void> group)
    {
        const std::string what = "the number of " + std::string(name);
        std::int32_t count = 0;
        if (Result<void> read = Take(what, count, "an integer", &ReadInteger); !read)
            return read;
        const std::size_t given = m_texts.size() - m_next;
        if (!CountFits(group.Elements(), count, int(given)))
            return Error{what + " is " + Shortest(count) + ", which does not fit the " + std::to_string(given) +
                         " values behind it"};
        group.Renew(std::size_t(count));
        for (std::size_t i = 0; i < group.size(); ++i)
            if (Result<void> read = Parse(group.Elements(), group[i]); !read)
                return read;
        return {};
    }

    const std::vector<std::string>& m_texts;
    std::size_t m_next = 0;
};

} // namespace

std::string CellText(const Field& field, const void* object)
{
    return Visit(field, object,
                 Overloads{[](bool value) { return std::string(value ? "true" : "false"); },
                           [](const std::string& value) { return value; },
                           [](const HDDateTime& value) { return DateText(value); },
                           [](GroupValue<const void> group) {
                               std::string text;
                               for (std::size_t i = 0; i < group.size(); ++i) {
                                   text += i ? "; " : "";
                                   const FieldList parts = group.Elements();
                                   for (const Field& part : parts)
                                       text.append(&part == parts.data() ? "" : " ").append(CellText(part, group[i]));
                               }
                               return text;
                           },
                           [](auto value) { return Shortest(value); }});
}

std::string JsonText(const Field& field, const void* object)
{
    return Visit(field, object,
                 Overloads{[](double value) { return std::isfinite(value) ? Shortest(value) : "null"; },
                           [](std::int32_t value) { return Shortest(value); },
                           [&](bool) { return CellText(field, object); },
                           [](GroupValue<const void> group) {
                               std::string text = "[";
                               for (std::size_t i = 0; i < group.size(); ++i)
                                   text += (i ? ", " : "") + JsonElement(group.Elements(), group[i]);
                               return text + ']';
                           },
                           [&](const auto&) { return JsonString(CellText(field, object)); }});
}

std::string JsonString(std::string_view text)
{
    constexpr char hex[] = "0123456789abcdef";
    std::string json = "\"";
    for (const char c : text) {
        if (c == '"' || c == '\\')
            json += '\\';
        if (static_cast<unsigned char>(c) >= 0x20)
            json += c;
        else
            json += std::string("\\u00") + hex[c >> 4] + hex[c & 15];
    }
    return json + '"';
}

std::vector<std::string> ParamTexts(FieldList fields, const void* object)
{
    std::vector<std::string> texts;
    for (const Field& field : fields)
        Visit(field, object,
              Overloads{[&](GroupValue<const void> group) {
                            texts.push_back(std::to_string(group.size()));
                            for (std::size_t i = 0; i < group.size(); ++i)
                                std::ranges::move(ParamTexts(group.Elements(), group[i]), std::back_inserter(texts));
                        },
                        [&](const HDDateTime& d) {
                            for (const std::int32_t part : {d.Year, d.Month, d.Day, d.Hour, d.Minute, d.Second})
                                texts.push_back(Shortest(part));
                        },
                        [&](const auto&) { texts.push_back(CellText(field, object)); }});
    return texts;
}

std::optional<double> ReadArgument(std::string_view text)
{
    const bool negative = text.starts_with('-');
    const std::string_view word = text.substr(negative);
    if (word == "nan" || word == "inf") {
        const double value =
            word == "nan" ? std::numeric_limits<double>::quiet_NaN() : std::numeric_limits<double>::infinity();
        return negative ? -value : value;
    }
    return ReadNumber(text);
}

Result<void> ParseParams(FieldList fields, const std::vector<std::string>& texts, void* object)
{
    Parser parser(texts);
    if (Result<void> parsed = parser.Parse(fields, object); !parsed)
        return parsed;
    if (parser.Used() != texts.size())
        return Error{"takes " + std::to_string(parser.Used()) + (parser.Used() == 1 ? " value, " : " values, ") +
                     std::to_string(texts.size()) + " were given"};
    return {};
}
