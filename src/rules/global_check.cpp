#include "rules/global_check.h"

#include "files/declare_field.h"
#include "rules/global_place.h"
#include "rules/line_rules.h"
#include "rules/output_files.h"
#include "rules/value_rules.h"

#include <tuple>

namespace {

/// Calls `see` with every keyword of a section and of those in it.
template <typename See>
void ForKeywords(const DeclaredSection& section, const See& see)
{
    for (const DeclaredKeyword& keyword : section.keywords)
        see(section, keyword);
    for (const DeclaredSection& inner : section.Sections())
        ForKeywords(inner, see);
}

void CheckPeriod(const HDDateTime& start, const HDDateTime& end, const ProblemPlace& place, CProblems& problems)
{
    const auto order = [](const HDDateTime& date) {
        return std::tie(date.Year, date.Month, date.Day, date.Hour, date.Minute, date.Second);
    };
    if (start.IsValid() && end.IsValid() && order(end) <= order(start))
        problems.Add({RuleId::PeriodBackwards, place, {end, start}});
}

void CheckPeriods(const HD_Global_Var& global, CProblems& problems)
{
    const HDTextOutput& text = global.TextOutput;
    if (text.GenerateOutput && text.LimitedPeriod)
        CheckPeriod(text.LimitedPeriodStart, text.LimitedPeriodEnd, GlobalPlace(global, &text.LimitedPeriodEnd),
                    problems);
    const auto& maps = global.MapOutput.MapOutputFiles;
    for (std::size_t i = 0; i < maps.size() && global.MapOutput.GenerateOutput; ++i)
        if (!maps[i].DefaultPeriod)
            CheckPeriod(maps[i].StartTime, maps[i].EndTime,
                        GlobalPlace(global, &maps, FieldOf(&CMapsOutput::EndTime), i), problems);
}

} // namespace

void CheckGlobals(const HD_Global_Var& global, const std::string& path, CProblems& problems)
{
    ForKeywords(HDGlobals(), [&](const DeclaredSection& section, const DeclaredKeyword& keyword) {
        const CValueRules rules(section.name, keyword.Fields(), global);
        rules.Check(&global, {.section = section.name, .keyword = keyword.name}, problems);
    });
    const HDBedResistTools& tools = global.BedResist;
    const ProblemPlace least = GlobalPlace(global, &tools.MinRes);
    CheckToolbox(tools.MinRes, *least.field, tools.MaxRes, tools.VeloRes, FieldOf(&CBRTVeloRes::Velocity), least,
                 problems);
    const ProblemPlace interface = GlobalPlace(global, &global.KlrInit.h0);
    CheckLayers(global.KlrInit.h1, global.KlrInit.h0, *interface.field, interface, problems);
    CheckPeriods(global, problems);
    CheckOutputFiles(global, path, problems);
}
