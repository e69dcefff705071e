#include "files/declared_section.h"

#include "files/field_io.h"
#include "files/structure.h"

#include <algorithm>

namespace {

void ReadKeyword(tqlHandle keyword, FieldList fields, void* object, LoadReport& report)
{
    ParamCursor params(keyword, &report);
    params.onlyFinite = true;
    ReadFields(params, fields, object);
    if (params.param)
        report.Add(params.param, keyword,
                   {.kind = Finding::SurplusParams,
                    .parameter = params.number,
                    .found = std::string(tqlGetRawParamsFrom(params.param))});
}

bool IsRepeated(const DeclaredKeyword& keyword)
{
    return keyword.fields.front().kind == FieldKind::Group;
}

/// One element a keyword. A line without all of its values would be another place or another shape: it is left out.
void ReadLines(tqlHandle section, const DeclaredKeyword& declared, GroupValue<void> group, LoadReport& report)
{
    group.Renew(0);
    for (int line = 1; line <= tqlGetNoKeywords(section, declared.name); ++line) {
        const tqlHandle keyword = tqlKeywordByNameNum(section, declared.name, line);
        const std::size_t lost = report.Lost(), taken = group.size();
        group.Resize(taken + 1);
        ReadKeyword(keyword, group.Elements(), group[taken], report);
        if (report.Lost() != lost) {
            report.LeaveOut(keyword);
            group.Resize(taken);
        }
    }
}

void ReadKeywords(tqlHandle section, const DeclaredKeyword& declared, void* object, LoadReport& report)
{
    if (IsRepeated(declared)) {
        ReadLines(section, declared, declared.fields.front().GroupIn(object), report);
    } else if (const tqlHandle keyword = tqlKeywordByNameNum(section, declared.name, 1)) {
        ReadKeyword(keyword, declared.fields, object, report);
    } else if (declared.presence == Presence::Required) {
        report.Add(section, nullptr,
                   {.kind = Finding::NoKeyword,
                    .keyword = std::string(declared.name),
                    .used = ParamsText(declared.fields, object)});
    }
}

void ReadSection(tqlHandle section, const DeclaredSection& declared, void* object, LoadReport& report);

void ReadSections(tqlHandle parent, const DeclaredSection& declared, void* object, LoadReport& report)
{
    if (declared.each) {
        std::size_t count = 0;
        while (tqlSectionByNameNum(parent, declared.name, int(count) + 1))
            ++count;
        const auto group = declared.each->GroupIn(object);
        group.Renew(count);
        for (std::size_t i = 0; i < count; ++i)
            ReadSection(tqlSectionByNameNum(parent, declared.name, int(i) + 1), declared, group[i], report);
    } else if (const tqlHandle section = tqlSectionByNameNum(parent, declared.name, 1)) {
        ReadSection(section, declared, object, report);
    } else if (declared.required) {
        report.Add(parent, nullptr, {.kind = Finding::NoSection, .section = std::string(declared.name)});
    }
}

void ReadSection(tqlHandle section, const DeclaredSection& declared, void* object, LoadReport& report)
{
    report.InSection(declared.name);
    for (const DeclaredKeyword& keyword : declared.keywords)
        ReadKeywords(section, keyword, object, report);
    for (const DeclaredSection& inner : declared.Sections())
        ReadSections(section, inner, object, report);
    report.InSection(declared.name);
    const auto known = [&](std::string_view name, bool isSection) {
        if (isSection) {
            const auto found = std::ranges::find(declared.Sections(), name, &DeclaredSection::name);
            return found == declared.Sections().end() ? Known::No : found->each ? Known::Every : Known::First;
        }
        const auto found = std::ranges::find(declared.keywords, name, &DeclaredKeyword::name);
        return found == declared.keywords.end() ? Known::No : IsRepeated(*found) ? Known::Every : Known::First;
    };
    CollectUnknown(section, known, *declared.kept.of(object), &report);
}

bool IsEmptyText(const Field& field, const void* object)
{
    return Visit(field, object,
                 Overloads{[](const std::string& value) { return value.empty(); }, [](const auto&) { return false; }});
}

void WriteKeywords(tqlHandle structure, const DeclaredKeyword& declared, const void* object)
{
    const auto write = [&](FieldList fields, const void* values) {
        tqlAddKeyword(structure, declared.name);
        WriteFields(structure, fields, values);
    };
    if (IsRepeated(declared)) {
        const auto group = declared.fields.front().GroupIn(object);
        for (std::size_t i = 0; i < group.size(); ++i)
            write(group.Elements(), group[i]);
    } else if (declared.presence != Presence::WhenSet || !IsEmptyText(declared.fields.front(), object)) {
        write(declared.fields, object);
    }
}

void WriteContent(tqlHandle structure, const DeclaredSection& declared, const void* object)
{
    for (const DeclaredKeyword& keyword : declared.keywords)
        WriteKeywords(structure, keyword, object);
    const auto write = [&](const DeclaredSection& section, const void* content) {
        tqlAddSection(structure, section.name);
        WriteContent(structure, section, content);
        tqlEndSection(structure);
    };
    for (const DeclaredSection& section : declared.Sections()) {
        if (!section.each) {
            write(section, object);
            continue;
        }
        const auto group = section.each->GroupIn(object);
        for (std::size_t i = 0; i < group.size(); ++i)
            write(section, group[i]);
    }
    WriteUnknown(structure, *declared.kept.constOf(object));
}

/// The keyword that became element `number` of its lines; null when there is none.
tqlHandle TakenKeyword(const LoadReport& report, tqlHandle section, std::string_view name, int number)
{
    if (!report.HasLeftOut())
        return tqlKeywordByNameNum(section, name, number);
    tqlHandle keyword = nullptr;
    for (int place = 1; number > 0 && (keyword = tqlKeywordByNameNum(section, name, place)); ++place)
        number -= !report.IsLeftOut(keyword);
    return keyword;
}

TqlStructure Build(const DeclaredFile& file, const void* object)
{
    TqlStructure structure(tqlCreate());
    tqlAddTarget(structure.Get(), file.target.name);
    WriteContent(structure.Get(), file.target, object);
    tqlEndSection(structure.Get());
    WriteUnknownTargets(structure.Get(), *file.otherTargets.constOf(object));
    return structure;
}

} // namespace

void ReadDeclared(tqlHandle structure, const DeclaredFile& file, void* object, LoadReport& report)
{
    const tqlHandle target = tqlTargetByNameNum(structure, file.target.name, 1);
    if (!target) {
        report.Add(nullptr, nullptr, {.kind = Finding::NoTarget, .section = std::string(file.target.name)});
        return;
    }
    ReadSection(target, file.target, object, report);
    const auto known = [&](std::string_view name, bool isSection) {
        return isSection && name == file.target.name ? Known::First : Known::No;
    };
    CollectUnknown(structure, known, *file.otherTargets.of(object), &report);
}

void ReportRule(LoadReport& report, tqlHandle section, std::string_view name, int number, std::string used,
                std::function<std::string()> rule)
{
    const tqlHandle keyword = TakenKeyword(report, section, name, number);
    if (report.Use(keyword ? keyword : section, name, used))
        return; // a consequence of what was told of it
    report.Add(keyword ? keyword : section, keyword,
               {.kind = Finding::Rule,
                .section = std::string(tqlName(section)),
                .keyword = std::string(name),
                .found = std::string(tqlGetRawParams(keyword)),
                .used = std::move(used),
                .rule = std::move(rule)});
}

Result<void> SaveDeclared(const std::string& path, const DeclaredFile& file, const void* object)
{
    return SaveStructure(Build(file, object).Get(), path);
}

Result<std::string> DeclaredText(const DeclaredFile& file, const void* object)
{
    const TqlStructure structure = Build(file, object);
    return TextOf(structure.Get());
}
