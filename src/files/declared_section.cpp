#include "files/declared_section.h"

#include "files/field_io.h"
#include "files/structure.h"

#include <algorithm>
#include <iterator>

namespace {

/// What a keyword holds whose reading hangs on another one.
std::string ValuesWith(const DeclaredSection& section, const DeclaredKeyword& keyword, const void* object)
{
    const auto opener = std::ranges::find(section.keywords, keyword.onlyWith, &DeclaredKeyword::name);
    return ParamsText(keyword.Fields(), object) + ParamsText(opener->Fields(), object);
}

void Keep(tqlHandle section, const KnownNames& known, KeptContent& kept, std::string_view name, LoadReport* report)
{
    UnknownNodes nodes;
    CollectUnknown(section, known, nodes, report);
    if (!nodes.empty())
        std::ranges::move(nodes, std::back_inserter(kept.sections[name]));
}

class Reader
{
public:
    /// A strict one takes finite numbers and whole lines only, and asks for what is required.
    Reader(bool isStrict, LoadReport* report) : m_isStrict(isStrict), m_report(report) {}

    void ReadSection(tqlHandle section, const DeclaredSection& declared, void* object)
    {
        InSection(declared.name);
        for (const DeclaredKeyword& keyword : declared.keywords)
            ReadKeyword(section, declared, keyword, object);
        for (const DeclaredSection& inner : declared.Sections())
            ReadSections(section, inner, object);
        InSection(declared.name);
        const auto known = [&](std::string_view name, bool isSection) {
            if (isSection) {
                const auto found = std::ranges::find(declared.Sections(), name, &DeclaredSection::name);
                return found == declared.Sections().end() ? Known::No : found->each ? Known::Every : Known::First;
            }
            const auto found = std::ranges::find(declared.keywords, name, &DeclaredKeyword::name);
            return found == declared.keywords.end()        ? Known::No
                   : found->presence == Presence::EachLine ? Known::Every
                                                           : Known::First;
        };
        Keep(section, known, declared.kept.of(object), declared.name, m_report);
    }

    void ReadSections(tqlHandle parent, const DeclaredSection& declared, void* object)
    {
        if (declared.each) {
            std::size_t count = 0;
            while (tqlSectionByNameNum(parent, declared.name, int(count) + 1))
                ++count;
            const auto group = declared.each->GroupIn(object);
            group.Renew(count);
            for (std::size_t i = 0; i < count; ++i)
                ReadSection(tqlSectionByNameNum(parent, declared.name, int(i) + 1), declared, group[i]);
        } else if (const tqlHandle section = tqlSectionByNameNum(parent, declared.name, 1)) {
            ReadSection(section, declared, object);
        } else if (declared.required) {
            Report(parent, nullptr, {.kind = Finding::NoSection, .section = std::string(declared.name)});
        }
    }

private:
    void InSection(std::string_view name) const
    {
        if (m_report)
            m_report->InSection(name);
    }
    void Report(tqlHandle place, tqlHandle keyword, Finding finding) const
    {
        if (m_report)
            m_report->Add(place, keyword, std::move(finding));
    }

    /// `extra` gives the place of what stands behind the fields' parameters; null for none.
    void ReadParams(tqlHandle keyword, FieldList fields, void* object, const auto& extra) const
    {
        ParamCursor params(keyword, m_report);
        params.onlyFinite = m_isStrict;
        ReadFields(params, fields, object);
        if (!params.param)
            return;
        if (ExtraParams* const place = extra())
            ReadExtra(params, *place);
        else
            Report(params.param, keyword,
                   {.kind = Finding::SurplusParams,
                    .parameter = params.number,
                    .found = std::string(tqlGetRawParamsFrom(params.param))});
    }

    /// A line without all of its values would be another place or another shape: a strict reader leaves it out.
    void ReadLines(tqlHandle section, std::string_view name, GroupValue<void> group) const
    {
        group.Renew(0);
        const auto lost = [this] { return m_report ? m_report->Lost() : 0; };
        for (int line = 1; line <= tqlGetNoKeywords(section, name); ++line) {
            const tqlHandle keyword = tqlKeywordByNameNum(section, name, line);
            const std::size_t before = lost(), taken = group.size();
            group.Resize(taken + 1);
            ReadParams(keyword, group.Elements(), group[taken], [&] { return group.ExtraOf(taken); });
            if (m_isStrict && lost() != before) {
                m_report->LeaveOut(keyword);
                group.Resize(taken);
            }
        }
    }

    void ReadKeyword(tqlHandle section, const DeclaredSection& in, const DeclaredKeyword& declared, void* object) const
    {
        const FieldList fields = declared.Fields();
        if (declared.presence == Presence::EachLine)
            return ReadLines(section, declared.name, fields.front().GroupIn(object));
        const tqlHandle keyword = tqlKeywordByNameNum(section, declared.name, 1);
        if (!keyword) {
            if (m_isStrict && declared.presence == Presence::Required)
                Report(section, nullptr,
                       {.kind = Finding::NoKeyword,
                        .keyword = std::string(declared.name),
                        .used = ParamsText(fields, object)});
            return;
        }
        auto& all = in.kept.of(object).keywords;
        all.erase(&declared); // of another file
        const auto kept = [&]() -> KeptContent::Keyword& { return all[&declared]; };
        if (!declared.onlyWith.empty() && !tqlKeywordByNameNum(section, declared.onlyWith, 1)) {
            kept() = {{}, std::string(tqlGetRawParams(keyword)), ValuesWith(in, declared, object)};
            Report(keyword, keyword, {.kind = Finding::NotRead, .field = std::string(declared.onlyWith)});
        } else {
            ReadParams(keyword, fields, object, [&] { return m_isStrict ? nullptr : &kept().extra; });
        }
    }

    bool m_isStrict;
    LoadReport* m_report;
};

bool IsEmptyText(const Field& field, const void* object)
{
    return Visit(field, object,
                 Overloads{[](const std::string& value) { return value.empty(); }, [](const auto&) { return false; }});
}

void WriteKeyword(tqlHandle structure, std::string_view name, FieldList fields, const void* object,
                  const ExtraParams* extra)
{
    tqlAddKeyword(structure, name);
    WriteFields(structure, fields, object);
    if (extra)
        extra->Write(structure);
}

/// Whether a further keyword of the name is kept: without this one that would be the first, and be read.
bool HoldsPlace(const DeclaredSection& in, const DeclaredKeyword& declared, const void* object)
{
    const auto& sections = in.kept.constOf(object).sections;
    const auto kept = sections.find(in.name);
    return kept != sections.end() && std::ranges::any_of(kept->second, [&](const UnknownNode& node) {
               return !node.IsSection && node.Name == declared.name;
           });
}

void WriteKeywords(tqlHandle structure, const DeclaredSection& in, const DeclaredKeyword& declared, const void* object)
{
    const FieldList fields = declared.Fields();
    if (declared.presence == Presence::EachLine) {
        const auto group = fields.front().GroupIn(object);
        for (std::size_t i = 0; i < group.size(); ++i)
            WriteKeyword(structure, declared.name, group.Elements(), group[i], group.ExtraOf(i));
        return;
    }
    if (declared.presence == Presence::WhenSet && IsEmptyText(fields.front(), object) &&
        !HoldsPlace(in, declared, object))
        return;
    const auto& all = in.kept.constOf(object).keywords;
    const auto found = all.find(&declared);
    const KeptContent::Keyword* const kept = found == all.end() ? nullptr : &found->second;
    // What was not read stays as it stood, unless its value or the one that opens it has been set since.
    if (kept && kept->unread && kept->whenUnread == ValuesWith(in, declared, object))
        tqlAddRawKeyword(structure, declared.name, *kept->unread);
    else
        WriteKeyword(structure, declared.name, fields, object, kept ? &kept->extra : nullptr);
}

void WriteKept(const KeptContent& kept, std::string_view name, const auto& write)
{
    if (const auto found = kept.sections.find(name); found != kept.sections.end())
        write(found->second);
}

void WriteContent(tqlHandle structure, const DeclaredSection& declared, const void* object)
{
    for (const DeclaredKeyword& keyword : declared.keywords)
        WriteKeywords(structure, declared, keyword, object);
    for (const DeclaredSection& section : declared.Sections()) {
        if (!section.each) {
            WriteDeclared(structure, section, object);
            continue;
        }
        const auto group = section.each->GroupIn(object);
        for (std::size_t i = 0; i < group.size(); ++i)
            WriteDeclared(structure, section, group[i]);
    }
    WriteKept(declared.kept.constOf(object), declared.name,
              [&](const UnknownNodes& nodes) { WriteUnknown(structure, nodes); });
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

TqlStructure Build(const DeclaredSection& target, const void* object)
{
    TqlStructure structure(tqlCreate());
    tqlAddTarget(structure.Get(), target.name);
    WriteContent(structure.Get(), target, object);
    tqlEndSection(structure.Get());
    WriteKept(target.kept.constOf(object), {},
              [&](const UnknownNodes& nodes) { WriteUnknownTargets(structure.Get(), nodes); });
    return structure;
}

} // namespace

void ReadDeclared(tqlHandle parent, const DeclaredSection& section, void* object, LoadReport* report)
{
    Reader(false, report).ReadSections(parent, section, object);
}

void WriteDeclared(tqlHandle structure, const DeclaredSection& section, const void* object)
{
    tqlAddSection(structure, section.name);
    WriteContent(structure, section, object);
    tqlEndSection(structure);
}

void ReadDeclaredFile(tqlHandle structure, const DeclaredSection& target, void* object, LoadReport& report)
{
    const tqlHandle read = tqlTargetByNameNum(structure, target.name, 1);
    if (!read) {
        report.Add(nullptr, nullptr, {.kind = Finding::NoTarget, .section = std::string(target.name)});
        return;
    }
    Reader(true, &report).ReadSection(read, target, object);
    const auto known = [&](std::string_view name, bool isSection) {
        return isSection && name == target.name ? Known::First : Known::No;
    };
    Keep(structure, known, target.kept.of(object), {}, &report);
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

Result<WriteReport> SaveDeclaredFile(const std::string& path, const DeclaredSection& target, const void* object,
                                     const SafeFileOptions& options)
{
    return SaveStructure(Build(target, object).Get(), path, options);
}

Result<std::string> DeclaredText(const DeclaredSection& target, const void* object)
{
    const TqlStructure structure = Build(target, object);
    return TextOf(structure.Get());
}
