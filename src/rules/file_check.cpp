#include "rules/file_check.h"

#include "rules/file_position.h"
#include "rules/hd_check.h"

#include <algorithm>
#include <limits>
#include <numeric>

namespace {

FileFinding MakeFileFinding(const Problem& problem, const HD_Parameters& parameters, tqlHandle structure)
{
    const ProblemPlace& place = problem.place;
    FileFinding found{.rule = problem.rule, .remedy = RemedyOf(problem.rule)};
    const TqlPosition position = PositionOf(place, parameters, structure);
    found.line = position.line;
    found.column = position.column;
    found.section = place.section;
    found.keyword = place.keyword;
    if (place.field)
        found.field = place.field->name;
    if (place.line != ProblemPlace::None) {
        const HD_RiverPos& record = RecordAt(place, parameters);
        found.record = place.line + 1;
        found.branch = record.RiverName;
        if (record.Chainage != NotGiven)
            found.chainage = record.Chainage;
    }
    found.text = found.section + ": " + (found.field.empty() ? "" : found.field + ": ") + ProblemText(problem);
    return found;
}

FileFinding MakeFileFinding(const Finding& finding)
{
    return {.rule = RuleOf(finding.kind).id,
            .line = finding.line,
            .column = finding.column,
            .section = finding.section,
            .keyword = finding.keyword,
            .field = finding.field,
            .text = FindingText(finding)};
}

} // namespace

std::size_t FileCheck::Count() const
{
    return std::accumulate(counts.begin(), counts.end(), std::size_t(0));
}

FileCheck MakeFileCheck(const std::vector<Finding>& findings)
{
    FileCheck check;
    for (const Finding& finding : findings)
        if (++check.counts[std::size_t(RuleOf(finding.kind).id)] <= CProblems::MostOfARule)
            check.findings.push_back(MakeFileFinding(finding));
    return check;
}

FileCheck CheckHDFile(tqlHandle structure, const CRiver* river, const std::string& path)
{
    LoadReport report(structure, LoadReport::Wanted::Everything);
    // No temporary with braces: should memory end there, the compiler destroys parts of it twice.
    HD_Parameters parameters;
    parameters.Load(structure, &report);
    FileCheck check = MakeFileCheck(report.Take());
    if (check.counts[std::size_t(RuleId::NoTarget)]) // that says it all
        return check;

    CHDCheck rules(parameters, river, path);
    while (rules.Step(std::numeric_limits<std::size_t>::max()))
        ;
    for (const Problem& problem : rules.Take())
        check.findings.push_back(MakeFileFinding(problem, parameters, structure));
    for (const Rule& rule : HDRules())
        check.counts[std::size_t(rule.id)] += rules.Count(rule.id);
    std::ranges::stable_sort(check.findings, {}, [](const FileFinding& f) { return std::pair(f.line, f.column); });
    return check;
}
