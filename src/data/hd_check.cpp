#include "data/hd_check.h"

#include "data/field_io.h"
#include "data/hd_parameters.h"

#include <algorithm>

namespace {

std::string Quoted(std::string_view text)
{
    return '"' + std::string(text) + '"';
}

const char* KindText(FieldKind kind)
{
    switch (kind) {
    case FieldKind::Number:
        return "a number";
    case FieldKind::Boolean:
        return "true or false";
    case FieldKind::Text:
        return "a text in quotes";
    case FieldKind::FileName:
        return "a file name in < >";
    case FieldKind::Integer:
    case FieldKind::Choice:
    case FieldKind::DateTime:
    case FieldKind::Group:
        break;
    }
    return "an integer";
}

const char* TypeText(TqlType type)
{
    switch (type) {
    case TqlType::Int:
        return "an integer";
    case TqlType::Double:
        return "a number";
    case TqlType::Bool:
        return "true or false";
    case TqlType::String:
        return "a text";
    case TqlType::FileName:
        return "a file name";
    case TqlType::None:
        break;
    }
    return "nothing";
}

enum class Match
{
    Fits,
    Convertible,
    No
};

Match MatchType(FieldKind kind, TqlType type)
{
    const auto fits = [](bool matches) { return matches ? Match::Fits : Match::No; };
    switch (kind) {
    case FieldKind::Number:
        return fits(type == TqlType::Double || type == TqlType::Int);
    case FieldKind::Boolean:
        return fits(type == TqlType::Bool);
    case FieldKind::Text:
        return type == TqlType::FileName ? Match::Convertible : fits(type == TqlType::String);
    case FieldKind::FileName:
        return type == TqlType::String ? Match::Convertible : fits(type == TqlType::FileName);
    case FieldKind::Integer:
    case FieldKind::Choice:
    case FieldKind::DateTime:
    case FieldKind::Group:
        break;
    }
    return fits(type == TqlType::Int);
}

class Checker
{
public:
    Checker(tqlHandle structure, std::vector<Finding>& findings) : m_structure(structure), m_findings(findings) {}

    void CheckStructure();

private:
    void Add(tqlHandle node, std::string text, bool loses = false)
    {
        const TqlPosition position = tqlGetPosition(m_structure, node);
        m_findings.push_back({position.line, position.column, std::move(text), loses});
    }
    void CheckUnknown(tqlHandle section, const KnownNames& known);
    void CheckGlobal(tqlHandle global);
    void CheckGlobalSection(tqlHandle section, const GlobalSection& table);
    void CheckItems(tqlHandle section, const Field& items);
    void CheckList(tqlHandle section, FieldList fields, bool firstMayBeBlank);
    void CheckEncroachment(tqlHandle outer);
    void CheckComplete(tqlHandle record);

    /// Checks the parameters of a keyword that belongs to `owner` (a keyword's or a section's name).
    void CheckKeyword(tqlHandle keyword, std::string_view owner, FieldList location, FieldList fields);
    /// These leave the cursor behind what they checked; false when the rest of the keyword cannot be told apart.
    bool CheckFields(FieldList fields, ParamCursor& params);
    bool CheckGroup(const Field& field, ParamCursor& params);
    void CheckDate(const Field& field, ParamCursor& params);
    bool CheckType(const Field& field, const ParamCursor& params);

    tqlHandle m_structure;
    std::vector<Finding>& m_findings;
    tqlHandle m_keyword = nullptr; // the one at hand, and whose it is
    std::string_view m_owner;
};

void Checker::CheckStructure()
{
    const tqlHandle target = tqlTargetByNameNum(m_structure, HDTargetName, 1);
    if (!target) {
        m_findings.push_back({1, 1, std::string("there is no target [") + HDTargetName + "]", true});
        return;
    }
    if (const tqlHandle global = tqlSectionByNameNum(target, HDGlobalSectionName, 1))
        CheckGlobal(global);
    HD_Parameters families; // its lists know their fields
    for (const ListEntry& entry : HDLists()) {
        const tqlHandle section = tqlSectionByNameNum(target, entry.section, 1);
        if (section && entry.list)
            CheckList(section, entry.list(families)->Fields(), false);
        else if (section)
            CheckEncroachment(section);
    }
    CheckUnknown(target, &HDKnownSection);
    CheckUnknown(m_structure, &HDKnownTarget);
}

void Checker::CheckUnknown(tqlHandle section, const KnownNames& known)
{
    ForEachUnknown(section, known, [&](tqlHandle node, bool isSection) {
        const std::string_view name = tqlName(node);
        const std::string what = isSection ? "section [" + std::string(name) + "]" : "keyword " + Quoted(name);
        Add(node, known(name, isSection) == Known::No ? "unknown " + what
                                                      : what + " is there more than once; only the first counts");
    });
}

void Checker::CheckGlobal(tqlHandle global)
{
    for (const GlobalSection& table : HDGlobalSections())
        if (const tqlHandle section = tqlSectionByNameNum(global, table.name, 1))
            CheckGlobalSection(section, table);
    CheckUnknown(global, &HDKnownGlobalSection);
}

void Checker::CheckGlobalSection(tqlHandle section, const GlobalSection& table)
{
    for (const GlobalKeyword& row : table.keywords) {
        const tqlHandle keyword = tqlKeywordByNameNum(section, row.name, 1);
        if (!keyword)
            continue;
        if (!row.onlyWith.empty() && !tqlKeywordByNameNum(section, row.onlyWith, 1))
            Add(keyword, std::string(row.name) + " is not read, because " + std::string(row.onlyWith) + " is missing",
                true);
        CheckKeyword(keyword, row.name, {}, row.Fields());
    }
    for (const Field& items : table.items)
        if (const tqlHandle inner = tqlSectionByNameNum(section, items.name, 1))
            CheckItems(inner, items);
    CheckUnknown(section,
                 [&table](std::string_view name, bool isSection) { return HDKnownInSection(table, name, isSection); });
}

void Checker::CheckItems(tqlHandle section, const Field& items)
{
    const int count = tqlGetNoKeywords(section, HDItemKeyword);
    for (int number = 1; number <= count; ++number)
        CheckKeyword(tqlKeywordByNameNum(section, HDItemKeyword, number), items.name, {}, items.group->elements);
    CheckUnknown(section, &HDKnownItem);
}

void Checker::CheckList(tqlHandle section, FieldList fields, bool firstMayBeBlank)
{
    const int count = tqlGetNoKeywords(section, "DATA");
    for (int number = 1; number <= count; ++number) {
        const tqlHandle record = tqlKeywordByNameNum(section, "DATA", number);
        CheckKeyword(record, tqlName(section), LocationFields(), fields);
        if (number > 1 || !firstMayBeBlank)
            CheckComplete(record);
    }
    CheckUnknown(section, &CGenParamListBase::KnownName);
}

void Checker::CheckEncroachment(tqlHandle outer)
{
    const HD_Parameters families;
    const std::string& inner = families.EncroachList.InnerSectionName();
    // The first line of a set does not count as a location: a set with that one only is not kept.
    for (int number = 1; const tqlHandle set = tqlSectionByNameNum(outer, inner, number); ++number)
        CheckList(set, HDEncroach::DeclaredFields(), true);
    CheckUnknown(outer, [&families](std::string_view name, bool isSection) {
        return families.EncroachList.KnownName(name, isSection);
    });
}

void Checker::CheckComplete(tqlHandle record)
{
    // A name or chainage that is missing or no name or number has been reported as such.
    std::string name;
    double chainage = 0;
    if (tqlGetString(tqlParamByNum(record, 1), &name) && name.empty())
        Add(record, std::string(m_owner) + ": incomplete line, the branch name is empty");
    else if (tqlGetDouble(tqlParamByNum(record, 2), &chainage) && chainage == NotGiven)
        Add(record, std::string(m_owner) + ": incomplete line, the chainage is not given");
}

void Checker::CheckKeyword(tqlHandle keyword, std::string_view owner, FieldList location, FieldList fields)
{
    m_keyword = keyword;
    m_owner = owner;
    ParamCursor params(keyword);
    if (CheckFields(location, params) && CheckFields(fields, params) && params.param)
        Add(params.param,
            std::string(owner) + ": unknown parameters from number " + std::to_string(params.number) + " on");
}

bool Checker::CheckFields(FieldList fields, ParamCursor& params)
{
    bool inTail = false; // an optional tail is there whole or not at all
    for (const Field& field : fields) {
        if (!params.param) {
            if (field.optionalTail && !inTail)
                return true;
            const bool last = &field == &fields.back();
            Add(m_keyword, std::string(m_owner) + ": parameter " + std::to_string(params.number) + " (" +
                               std::string(field.name) + (last ? ") is missing" : ") and those behind it are missing"));
            return false;
        }
        inTail = field.optionalTail;
        if (field.kind == FieldKind::Group) {
            if (!CheckGroup(field, params))
                return false;
        } else if (field.kind == FieldKind::DateTime) {
            CheckDate(field, params);
        } else {
            CheckType(field, params);
            params.Next();
        }
    }
    return true;
}

bool Checker::CheckGroup(const Field& field, ParamCursor& params)
{
    std::int32_t count = 0;
    if (!CheckType(field, params) || !tqlGetInt(params.param, &count))
        return false;
    const int left = params.Left() - 1;
    if (!CountFits(*field.group, count, left)) {
        Add(params.param,
            std::string(m_owner) + ": the count " + std::to_string(count) + " of " + std::string(field.name) +
                " does not fit the " + std::to_string(left) + " parameters behind it",
            true);
        return false;
    }
    params.Next();
    const int size = static_cast<int>(ParamsOf(field.group->elements));
    if (count == 0 && field.group->padWhenEmpty && left >= size)
        params.Skip(size);
    for (std::int32_t i = 0; i < count; ++i)
        CheckFields(field.group->elements, params);
    return true;
}

void Checker::CheckDate(const Field& field, ParamCursor& params)
{
    const tqlHandle first = params.param;
    if (params.Left() < 6) {
        Add(first, std::string(m_owner) + ": " + std::string(field.name) + " needs six integers", true);
        params.ToEnd();
        return;
    }
    HDDateTime date;
    bool whole = true;
    for (std::int32_t* const part : {&date.Year, &date.Month, &date.Day, &date.Hour, &date.Minute, &date.Second}) {
        whole = CheckType(field, params) && tqlGetInt(params.param, part) && whole;
        params.Next();
    }
    const bool isSet = date != HDDateTime{};
    if (whole && isSet && !date.IsValid())
        Add(first, std::string(m_owner) + ": the six integers of " + std::string(field.name) + " are no date and time");
}

bool Checker::CheckType(const Field& field, const ParamCursor& params)
{
    const TqlType type = tqlGetType(params.param);
    const Match match = MatchType(field.kind, type);
    if (match != Match::Fits)
        Add(params.param,
            std::string(m_owner) + ": parameter " + std::to_string(params.number) + " (" + std::string(field.name) +
                ") should be " + KindText(field.kind) + ", found " + TypeText(type),
            match == Match::No);
    return match != Match::No;
}

} // namespace

std::vector<Finding> CheckHDStructure(tqlHandle structure)
{
    std::vector<Finding> findings;
    Checker(structure, findings).CheckStructure();
    std::ranges::stable_sort(findings, {}, [](const Finding& f) { return std::pair(f.line, f.column); });
    return findings;
}
