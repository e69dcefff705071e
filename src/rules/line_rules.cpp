#include "rules/line_rules.h"

#include "files/declare_field.h"

#include <utility>

namespace {

ProblemPlace At(ProblemPlace place, const Field& field, std::size_t element = ProblemPlace::None)
{
    place.field = &field;
    place.element = element;
    return place;
}

void ToolboxLine(const HD_RiverPos& record, const ProblemPlace& place, CProblems& problems)
{
    const auto& tools = static_cast<const HDBedResTool&>(record);
    CheckToolbox(tools.MinRes, FieldOf(&HDBedResTool::MinRes), tools.MaxRes, tools.VeloRes,
                 FieldOf(&CBRTVeloRes::Velocity), place, problems);
}

void LayersLine(const HD_RiverPos& record, const ProblemPlace& place, CProblems& problems)
{
    const auto& layers = static_cast<const HDKlrInit&>(record);
    CheckLayers(layers.h1, layers.h0, FieldOf(&HDKlrInit::h0), place, problems);
}

} // namespace

LineRules LineRulesOf(std::string_view section)
{
    constexpr std::pair<std::string_view, LineRules> rules[] = {{"BedResistanceToolboxList", ToolboxLine},
                                                                {"KlrInitList", LayersLine}};
    for (const auto& [list, check] : rules)
        if (list == section)
            return check;
    return nullptr;
}

void CheckToolbox(double least, const Field& leastField, double greatest, const std::vector<CBRTVeloRes>& table,
                  const Field& tableField, const ProblemPlace& place, CProblems& problems)
{
    // Without limits both are 0.
    if (least > greatest && greatest != 0)
        problems.Add({RuleId::LimitsSwapped, At(place, leastField), {Amount{least}, Amount{greatest}}});
    for (std::size_t i = 1; i < table.size(); ++i)
        if (table[i].Velocity <= table[i - 1].Velocity)
            problems.Add(
                {RuleId::VelocitiesNotRising,
                 At(place, tableField, i),
                 {Amount{table[i].Velocity, UnitGroup::Velocity}, Amount{table[i - 1].Velocity, UnitGroup::Velocity}}});
}

void CheckLayers(double level, double interface, const Field& interfaceField, const ProblemPlace& place,
                 CProblems& problems)
{
    if (interface > level && interface != NotGiven)
        problems.Add({RuleId::LayersSwapped,
                      At(place, interfaceField),
                      {Amount{interface, UnitGroup::WaterLevel}, Amount{level, UnitGroup::WaterLevel}}});
}
