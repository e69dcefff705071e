#include "cli/field_text.h"

#include <charconv>
#include <cmath>
#include <functional>

namespace {

template <typename T>
std::string Shortest(T value)
{
    char buffer[32];
    return {buffer, std::to_chars(buffer, buffer + sizeof buffer, value).ptr};
}

std::string TwoDigits(std::int32_t value)
{
    const std::string text = Shortest(value);
    return (text.size() == 1 ? "0" : "") + text;
}

std::string DateText(const HDDateTime& d)
{
    return Shortest(d.Year) + '-' + TwoDigits(d.Month) + '-' + TwoDigits(d.Day) + ' ' + TwoDigits(d.Hour) + ':' +
           TwoDigits(d.Minute) + ':' + TwoDigits(d.Second);
}

/// Text of a field that is no group.
std::string ScalarText(const Field& field, const void* object)
{
    switch (field.kind) {
    case FieldKind::Number:
        return Shortest(field.In<double>(object));
    case FieldKind::Integer:
    case FieldKind::Choice:
        return Shortest(field.In<std::int32_t>(object));
    case FieldKind::Boolean:
        return field.In<bool>(object) ? "true" : "false";
    case FieldKind::Text:
    case FieldKind::FileName:
        return field.In<std::string>(object);
    case FieldKind::DateTime:
        return DateText(field.In<HDDateTime>(object));
    case FieldKind::Group:
        break;
    }
    return {};
}

void ForEachElement(const Field& field, const void* object, const std::function<void(const void*)>& visit)
{
    void* const container = field.address(const_cast<void*>(object));
    for (std::size_t i = 0; i < field.group->size(container); ++i)
        visit(field.group->at(container, i));
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
        switch (field.kind) {
        case FieldKind::Number:
            return ParseNumber(field.name, field.In<double>(object), "a number");
        case FieldKind::Integer:
        case FieldKind::Choice:
            return ParseNumber(field.name, field.In<std::int32_t>(object), "an integer");
        case FieldKind::Boolean:
            return ParseBoolean(field, object);
        case FieldKind::Text:
        case FieldKind::FileName:
            if (AtEnd())
                return Missing(field.name, "a text");
            field.In<std::string>(object) = m_texts[m_next++];
            return {};
        case FieldKind::DateTime:
            return ParseDate(field, object);
        case FieldKind::Group:
            return ParseGroup(field, object);
        }
        return {};
    }

    bool AtEnd() const { return m_next == m_texts.size(); }
    static Error Missing(std::string_view name, const char* expected)
    {
        return {"value for " + std::string(name) + " is missing, expected " + expected};
    }
    Error Wrong(std::string_view name, const char* expected) const
    {
        return {std::string(name) + " should be " + expected + ", found \"" + m_texts[m_next] + '"'};
    }

    template <typename T>
    Result<void> ParseNumber(std::string_view name, T& value, const char* expected)
    {
        if (AtEnd())
            return Missing(name, expected);
        const std::string& text = m_texts[m_next];
        T read{};
        const auto [end, error] = std::from_chars(text.data(), text.data() + text.size(), read);
        if (error != std::errc() || end != text.data() + text.size())
            return Wrong(name, expected);
        value = read;
        ++m_next;
        return {};
    }

    Result<void> ParseBoolean(const Field& field, void* object)
    {
        if (AtEnd())
            return Missing(field.name, "true or false");
        const std::string& text = m_texts[m_next];
        if (text != "true" && text != "false")
            return Wrong(field.name, "true or false");
        field.In<bool>(object) = text == "true";
        ++m_next;
        return {};
    }

    Result<void> ParseDate(const Field& field, void* object)
    {
        HDDateTime date;
        std::int32_t* const parts[] = {&date.Year, &date.Month, &date.Day, &date.Hour, &date.Minute, &date.Second};
        for (std::int32_t* part : parts)
            if (Result<void> read = ParseNumber(field.name, *part, "six integers: year month day hour minute second");
                !read)
                return read;
        if (!date.IsValid())
            return Error{std::string(field.name) + " should be a date and time, found " + DateText(date)};
        field.In<HDDateTime>(object) = date;
        return {};
    }

    Result<void> ParseGroup(const Field& field, void* object)
    {
        const GroupAccess& group = *field.group;
        const std::string what = "the number of " + std::string(field.name);
        std::int32_t count = 0;
        if (Result<void> read = ParseNumber(what, count, "an integer"); !read)
            return read;
        std::size_t perElement = 0;
        for (const Field& element : group.elements)
            perElement += element.FixedParams();
        if (count < 0 || static_cast<std::size_t>(count) > (m_texts.size() - m_next) / perElement)
            return Error{what + " is " + Shortest(count) + ", which does not fit the " +
                         std::to_string(m_texts.size() - m_next) + " values behind it"};
        void* const container = field.address(object);
        group.resize(container, 0);
        group.resize(container, static_cast<std::size_t>(count));
        for (std::int32_t i = 0; i < count; ++i)
            if (Result<void> read = Parse(group.elements, group.at(container, static_cast<std::size_t>(i))); !read)
                return read;
        return {};
    }

    const std::vector<std::string>& m_texts;
    std::size_t m_next = 0;
};

} // namespace

std::string CellText(const Field& field, const void* object)
{
    if (field.kind != FieldKind::Group)
        return ScalarText(field, object);
    std::string text;
    ForEachElement(field, object, [&](const void* element) {
        if (!text.empty())
            text += "; ";
        for (const Field& part : field.group->elements) {
            if (&part != field.group->elements.data())
                text += ' ';
            text += ScalarText(part, element);
        }
    });
    return text;
}

std::string JsonText(const Field& field, const void* object)
{
    switch (field.kind) {
    case FieldKind::Number:
        return std::isfinite(field.In<double>(object)) ? ScalarText(field, object) : "null";
    case FieldKind::Text:
    case FieldKind::FileName:
    case FieldKind::DateTime:
        return JsonString(ScalarText(field, object));
    case FieldKind::Group: {
        std::string text = "[";
        ForEachElement(field, object, [&](const void* element) {
            text += (text.size() > 1 ? ", " : "") + JsonElement(field.group->elements, element);
        });
        return text + ']';
    }
    case FieldKind::Integer:
    case FieldKind::Choice:
    case FieldKind::Boolean:
        break;
    }
    return ScalarText(field, object);
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
    for (const Field& field : fields) {
        if (field.kind == FieldKind::Group) {
            texts.push_back(std::to_string(field.group->size(field.address(const_cast<void*>(object)))));
            ForEachElement(field, object, [&](const void* element) {
                for (std::string& text : ParamTexts(field.group->elements, element))
                    texts.push_back(std::move(text));
            });
        } else if (field.kind == FieldKind::DateTime) {
            const auto& d = field.In<HDDateTime>(object);
            for (const std::int32_t part : {d.Year, d.Month, d.Day, d.Hour, d.Minute, d.Second})
                texts.push_back(Shortest(part));
        } else {
            texts.push_back(ScalarText(field, object));
        }
    }
    return texts;
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
