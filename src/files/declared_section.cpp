#include "files/declared_section.h"

#include "files/field_io.h"

#include <algorithm>
#include <cmath>

namespace {

using Fault = std::optional<ReadingFault>;

/// Takes a value only when it stands there exactly as declared.
bool TakeExactly(tqlHandle* param, const Field& field, void* object)
{
    return Visit(field, object,
                 Overloads{[&](double& value) {
                               return tqlTake(param, &value) &&
                                      (std::isfinite(value) || (field.mayBeUnknown && std::isnan(value)));
                           },
                           [&](HDDateTime&) { return false; }, [&](GroupValue<void>) { return false; },
                           [&](auto& value) { return tqlTake(param, &value); }});
}

Fault ReadKeyword(tqlHandle keyword, FieldList fields, void* object)
{
    bool good = tqlGetNoParams(keyword) == int(fields.size());
    tqlHandle param = tqlParamByNum(keyword, 1);
    for (const Field& field : fields)
        good = good && TakeExactly(&param, field, object);
    if (good)
        return {};
    return ReadingFault{ReadingFault::WrongValue, keyword, tqlName(keyword), {}, fields};
}

bool IsRepeated(const DeclaredKeyword& keyword)
{
    return keyword.fields.front().kind == FieldKind::Group;
}

Fault ReadKeywords(tqlHandle section, const DeclaredKeyword& declared, void* object)
{
    if (IsRepeated(declared)) {
        const auto group = declared.fields.front().GroupIn(object);
        group.Renew(std::size_t(tqlGetNoKeywords(section, declared.name)));
        for (std::size_t i = 0; i < group.size(); ++i) {
            const tqlHandle keyword = tqlKeywordByNameNum(section, declared.name, int(i) + 1);
            if (const Fault fault = ReadKeyword(keyword, group.Elements(), group[i]))
                return fault;
        }
        return {};
    }
    if (const tqlHandle second = tqlKeywordByNameNum(section, declared.name, 2))
        return ReadingFault{ReadingFault::Second, second, declared.name, tqlName(section)};
    if (const tqlHandle keyword = tqlKeywordByNameNum(section, declared.name, 1))
        return ReadKeyword(keyword, declared.fields, object);
    if (declared.presence == Presence::Required)
        return ReadingFault{ReadingFault::Missing, section, declared.name, tqlName(section), declared.fields};
    return {};
}

Fault ReadSection(tqlHandle section, const DeclaredSection& declared, void* object);

Fault ReadSections(tqlHandle parent, const DeclaredSection& declared, void* object)
{
    if (declared.each) {
        std::size_t count = 0;
        while (tqlSectionByNameNum(parent, declared.name, int(count) + 1))
            ++count;
        const auto group = declared.each->GroupIn(object);
        group.Renew(count);
        for (std::size_t i = 0; i < count; ++i) {
            const tqlHandle section = tqlSectionByNameNum(parent, declared.name, int(i) + 1);
            if (const Fault fault = ReadSection(section, declared, group[i]))
                return fault;
        }
        return {};
    }
    if (const tqlHandle second = tqlSectionByNameNum(parent, declared.name, 2))
        return ReadingFault{ReadingFault::Second, second, declared.name, tqlName(parent)};
    if (const tqlHandle section = tqlSectionByNameNum(parent, declared.name, 1))
        return ReadSection(section, declared, object);
    if (declared.required)
        return ReadingFault{ReadingFault::NoSection, parent, declared.name, tqlName(parent)};
    return {};
}

Fault ReadSection(tqlHandle section, const DeclaredSection& declared, void* object)
{
    for (const DeclaredKeyword& keyword : declared.keywords)
        if (const Fault fault = ReadKeywords(section, keyword, object))
            return fault;
    for (const DeclaredSection& inner : declared.Sections())
        if (const Fault fault = ReadSections(section, inner, object))
            return fault;
    const auto known = [&](std::string_view name, bool isSection) {
        const bool is = isSection ? std::ranges::count(declared.Sections(), name, &DeclaredSection::name) > 0
                                  : std::ranges::count(declared.keywords, name, &DeclaredKeyword::name) > 0;
        return is ? Known::Every : Known::No;
    };
    CollectUnknown(section, known, *declared.kept.of(object));
    return {};
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

} // namespace

std::optional<ReadingFault> ReadDeclared(tqlHandle structure, const DeclaredFile& file, void* object)
{
    const tqlHandle target = tqlTargetByNameNum(structure, file.target.name, 1);
    if (!target)
        return ReadingFault{ReadingFault::NoTarget, nullptr, file.target.name, {}};
    if (const Fault fault = ReadSection(target, file.target, object))
        return fault;
    const auto known = [&](std::string_view name, bool isSection) {
        return isSection && name == file.target.name ? Known::First : Known::No;
    };
    CollectUnknown(structure, known, *file.otherTargets.of(object));
    return {};
}

void WriteDeclared(tqlHandle structure, const DeclaredFile& file, const void* object)
{
    tqlAddTarget(structure, file.target.name);
    WriteContent(structure, file.target, object);
    tqlEndSection(structure);
    WriteUnknownTargets(structure, *file.otherTargets.constOf(object));
}
