// The tables of docs/hdkv.md are what the declarations say.
#include "files/field_io.h"
#include "hd_support.h"
#include "texts/text_numbers.h"

#include <sstream>

namespace {

std::string EnglishText(Str number)
{
#define QT_TRANSLATE_NOOP(context, text) text
#define KVR_STRING(id, name, text)                                                                                     \
    if (number == Str::name)                                                                                           \
        return text;
#include "texts/string_table.inc"
#undef KVR_STRING
#undef QT_TRANSLATE_NOOP
    return {};
}

/// " (0.5 to 1)", " (0 Max, 1 Min, 2 Dynamic)": what is known about a value beyond its type.
std::string Values(const Field& field)
{
    std::string known = BoundsWords(field.bounds);
    std::istringstream entries(EnglishText(field.choices.text));
    std::int32_t index = field.firstChoice;
    for (std::string entry; std::getline(entries, entry); ++index) {
        entry = PlainText(entry);
        const bool isNumbered = entry.starts_with(std::to_string(index) + ' ');
        known += (known.empty() ? "" : ", ") +
                 (isNumbered || field.kind == FieldKind::Text ? entry : std::to_string(index) + ' ' + entry);
    }
    return known.empty() ? "" : " (" + known + ')';
}

std::string EnglishLine(const TextLine& text)
{
    std::istringstream lines(EnglishText(text.text));
    std::string found;
    for (int line = std::max(text.line, 0); line >= 0; --line)
        std::getline(lines, found);
    return found;
}

/// " "Delta"": what the value is called on its page.
std::string Title(const Field& field)
{
    const std::string title = EnglishLine(field.title);
    return title.empty() ? "" : " \"" + PlainText(title) + '"';
}

const char* TypeName(FieldKind kind)
{
    const char* const text = kind == FieldKind::FileName ? "file name" : "string";
    return VisitKind(kind, Overloads{[](std::type_identity<double>) { return "float"; },
                                     [](std::type_identity<std::int32_t>) { return "integer"; },
                                     [](std::type_identity<bool>) { return "boolean"; },
                                     [=](std::type_identity<std::string>) { return text; },
                                     [](std::type_identity<HDDateTime>) { return "6 integers"; },
                                     [](std::type_identity<GroupType>) { return "group"; }});
}

std::string Described(FieldList fields, std::string_view keyword);

std::string Described(const Field& field, std::string_view keyword)
{
    if (field.kind == FieldKind::Group) {
        const std::string text = "count N, then N x (" + Described(field.group->elements(), {}) + ')';
        return field.padWhenEmpty ? text + "; one empty element when N is 0" : text;
    }
    std::string text = TypeName(field.kind);
    if (field.name != keyword)
        text += ' ' + std::string(field.name);
    return text + (field.optionalTail ? "?" : "") + Title(field) + Values(field);
}

std::string Described(FieldList fields, std::string_view keyword)
{
    std::string text;
    for (const Field& field : fields) // the name of the only one is the keyword's
        text += (text.empty() ? "" : ", ") + Described(field, fields.size() == 1 ? keyword : std::string_view());
    return text;
}

std::string Default(FieldList fields, const void* object)
{
    return fields.front().kind == FieldKind::DateTime ? "time of creation" : ParamsText(fields, object);
}

std::string GlobalTable()
{
    const HD_Global_Var global;
    std::string table = "| Section | Keyword | Parameters | Default |\n|---|---|---|---|\n";
    for (const DeclaredSection& section : HDGlobals().Sections()) {
        std::string name = '`' + std::string(section.name) + '`';
        for (const DeclaredKeyword& row : section.keywords) {
            table += "| " + name + " | `" + std::string(row.name) + "` | " + Described(row.Fields(), row.name) + " | " +
                     Default(row.Fields(), &global) + " |\n";
            name.clear();
        }
        for (const DeclaredSection& items : section.Sections()) {
            const DeclaredKeyword& line = items.keywords.front();
            table += "| " + name + "| sub-section `" + std::string(items.name) + "`: keywords `" +
                     std::string(line.name) + "` | " + Described(line.Fields().front().group->elements(), {}) +
                     " | none |\n";
        }
    }
    return table;
}

std::string ListTable()
{
    HD_Parameters parameters;
    parameters.EncroachList.Add();
    std::string table = "| Section | Parameters behind branch name and chainage | Default |\n|---|---|---|\n";
    for (const ListEntry& entry : HDLists()) {
        const CGenParamListBase& list = entry.list(parameters).ListAt(0);
        table += "| `" + std::string(entry.section) + "` | " + Described(list.Fields(), {}) + " | " +
                 Default(list.Fields(), list.NewRecord().get()) + " |\n";
    }
    return table;
}

/// The fields on the pages, those of repeated groups included.
void AddMeanings(FieldList fields, const std::string& place, std::string& table)
{
    for (const Field& field : fields) {
        if (field.group)
            AddMeanings(field.group->elements(), place, table);
        const std::string meaning = EnglishLine(field.meaning);
        EXPECT_TRUE(!meaning.empty() || !(field.title || field.choices)) << place << ' ' << field.name;
        if (!meaning.empty())
            table += "| `" + place + "` | `" + std::string(field.name) + "` | " + meaning + " |\n";
    }
}

std::string MeaningTable()
{
    std::string table = "| Section | Value | Meaning |\n|---|---|---|\n";
    for (const DeclaredSection& section : HDGlobals().Sections()) {
        for (const DeclaredKeyword& row : section.keywords)
            AddMeanings(row.Fields(), std::string(section.name), table);
        for (const DeclaredSection& items : section.Sections())
            AddMeanings(items.keywords.front().Fields(), std::string(items.name), table);
    }
    HD_Parameters parameters;
    parameters.EncroachList.Add();
    for (const ListEntry& entry : HDLists())
        AddMeanings(entry.list(parameters).ListAt(0).Fields(), entry.section, table);
    return table;
}

} // namespace

TEST(DocumentTables, AreWhatTheDeclarationsSay)
{
    const char* const path = KVR_SOURCE_DIR "/docs/hdkv.md";
    const std::string is = ReadText(path);
    const std::string tables =
        WithTable(WithTable(is, "global values", GlobalTable()), "location records", ListTable());
    ExpectRecorded(WithTable(tables, "meanings", MeaningTable()), path);
}
