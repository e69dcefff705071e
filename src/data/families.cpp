#include "data/families.h"

namespace {

constexpr Field mixingPair[] = {Number<&CMixingWCCoef::First>("First"), Number<&CMixingWCCoef::Second>("Second")};
constexpr Field velocityResistance[] = {Number<&CBRTVeloRes::Velocity>("Velocity", UnitGroup::Velocity),
                                        Number<&CBRTVeloRes::ResValue>("ResValue")};
constexpr Field markLevel[] = {Plain(FieldKind::Number, "Level", UnitGroup::WaterLevel)};
constexpr GroupAccess markLevels = GroupOf<std::vector<double>>(markLevel);

} // namespace

constexpr GroupAccess MixingPairs = GroupOf<std::vector<CMixingWCCoef>>(mixingPair);
constexpr GroupAccess VelocityResistances = GroupOf<std::vector<CBRTVeloRes>>(velocityResistance);

FieldList HDMixingCoef::DeclaredFields()
{
    static constexpr Field fields[] = {
        Group<&HDMixingCoef::CoefPairs>("CoefPairs", MixingPairs), Number<&HDMixingCoef::MixCoef1>("MixCoef1"),
        Number<&HDMixingCoef::MixCoef2>("MixCoef2"), Number<&HDMixingCoef::MixCoef3>("MixCoef3"),
        Number<&HDMixingCoef::MixCoef4>("MixCoef4")};
    return fields;
}

FieldList HDWLMark::DeclaredFields()
{
    static constexpr Field fields[] = {Group<&HDWLMark::MarkLevels>("MarkLevels", markLevels)};
    return fields;
}

FieldList HDBedResTool::DeclaredFields()
{
    static constexpr Field fields[] = {Number<&HDBedResTool::CoefA>("CoefA"), Number<&HDBedResTool::CoefB>("CoefB"),
                                       Number<&HDBedResTool::MinRes>("MinRes"), Number<&HDBedResTool::MaxRes>("MaxRes"),
                                       Group<&HDBedResTool::VeloRes>("VeloRes", VelocityResistances)};
    return fields;
}

FieldList HDEncroach::DeclaredFields()
{
    using E = HDEncroach;
    static constexpr Field fields[] = {
        Choice<&E::EncOption1>("EncOption1"),
        Choice<&E::EncOption2>("EncOption2"),
        NumberAt<0, &E::EncValues1>("EncValues1.1", UnitGroup::Width),
        NumberAt<1, &E::EncValues1>("EncValues1.2", UnitGroup::Width),
        NumberAt<2, &E::EncValues1>("EncValues1.3", UnitGroup::Width),
        NumberAt<3, &E::EncValues1>("EncValues1.4", UnitGroup::Width),
        NumberAt<4, &E::EncValues1>("EncValues1.5", UnitGroup::Width),
        Choice<&E::EncOption3>("EncOption3"),
        NumberAt<0, &E::EncValues2>("EncValues2.1"),
        NumberAt<1, &E::EncValues2>("EncValues2.2"),
        NumberAt<2, &E::EncValues2>("EncValues2.3"),
        NumberAt<3, &E::EncValues2>("EncValues2.4", UnitGroup::WaterLevel),
        NumberAt<4, &E::EncValues2>("EncValues2.5", UnitGroup::WaterLevel),
    };
    return fields;
}
