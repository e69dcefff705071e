// The table of rules is whole, means declarations that are there, and docs/findings.md is what it says.
#include "rules/plausible.h"
#include "rules/problem.h"

#include "data/hd_parameters.h"
#include "recorded_text.h"

#include <algorithm>
#include <gtest/gtest.h>
#include <set>
#include <sstream>

namespace {

std::string RuleTable()
{
    std::string table;
    for (const Severity severity : {Severity::Error, Severity::Warning, Severity::Note}) {
        table += std::string(table.empty() ? "" : "\n") + "## " +
                 (severity == Severity::Error     ? "Errors"
                  : severity == Severity::Warning ? "Warnings"
                                                  : "Notes") +
                 "\n\n| Code | What is wrong | Explanation | Fix |\n|---|---|---|---|\n";
        for (const Rule& rule : HDRules())
            if (rule.severity == severity)
                table += "| " + std::string(rule.code) + " | " + rule.title + " | " + rule.explanation + " | " +
                         RemedyName(RemedyOf(rule.id)) + " |\n";
    }
    return table;
}

std::string PlausibleTable()
{
    std::string table = "| Section | Value | Least | Most | Reason |\n|---|---|---|---|---|\n";
    for (const Plausible& row : PlausibleValues()) {
        std::ostringstream line;
        line << "| `" << row.section << "` | `" << row.field << "` | " << row.minimum << " | ";
        if (row.maximum < 1e9)
            line << row.maximum;
        table += line.str() + " | " + row.reason + " |\n";
    }
    return table;
}

bool HasField(FieldList fields, std::string_view name)
{
    return std::ranges::any_of(fields, [name](const Field& field) {
        return field.name == name || (field.group && HasField(field.group->elements(), name));
    });
}

bool HasField(const DeclaredSection& section, const Plausible& row)
{
    const auto inKeyword = [&row](const DeclaredKeyword& keyword) { return HasField(keyword.Fields(), row.field); };
    if (section.name == row.section)
        return std::ranges::any_of(section.keywords, inKeyword);
    return std::ranges::any_of(section.Sections(),
                               [&row](const DeclaredSection& inner) { return HasField(inner, row); });
}

} // namespace

TEST(Rules, AreWhatTheDocumentSays)
{
    const char* const path = KVR_SOURCE_DIR "/docs/findings.md";
    const std::string rules = WithTable(ReadText(path), "rules", RuleTable());
    ExpectRecorded(WithTable(rules, "plausible values", PlausibleTable()), path);
}

TEST(Rules, HaveCodesOfTheirOwnAndWords)
{
    std::set<std::string> codes;
    for (const Rule& rule : HDRules()) {
        EXPECT_TRUE(codes.insert(rule.code).second) << rule.code;
        EXPECT_EQ(&RuleOf(rule.id), &rule);
        EXPECT_TRUE(*rule.title && *rule.explanation) << rule.code;
        EXPECT_EQ(*rule.text == 0, std::string_view(rule.code) < "HD1") << rule.code << " has words of its finding";
    }
    std::set<RuleId> ofFindings;
    for (int kind = 0; kind <= Finding::UnknownParams; ++kind)
        EXPECT_TRUE(ofFindings.insert(RuleOf(Finding::Kind(kind)).id).second) << kind;
}

TEST(Rules, MeanFieldsThatAreDeclared)
{
    const HD_Parameters parameters;
    for (const Plausible& row : PlausibleValues()) {
        const auto entry = std::ranges::find(HDLists(), row.section, &ListEntry::section);
        const bool isThere = entry == HDLists().end()
                                 ? HasField(HDGlobals(), row)
                                 : HasField(entry->constList(parameters).RecordFields(), row.field);
        EXPECT_TRUE(isThere) << row.section << ' ' << row.field;
        EXPECT_LT(row.minimum, row.maximum) << row.section << ' ' << row.field;
    }
}
