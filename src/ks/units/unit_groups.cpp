#include "ks/units/unit_groups.h"

#include <QDebug>
#include <array>
#include <cmath>
#include <memory>
#include <udunits2.h>

namespace {

constexpr KsUnit Metre{"m", "m"}, Foot{"ft", "ft"};
constexpr KsUnit SquareMetre{"m2", "m²"}, SquareFoot{"ft2", "ft²"};
constexpr KsUnit CubicMetre{"m3", "m³"}, CubicFoot{"ft3", "ft³"};
constexpr KsUnit MetrePerSecond{"m/s", "m/s"}, FootPerSecond{"ft/s", "ft/s"};
constexpr KsUnit CubicMetrePerSecond{"m3/s", "m³/s"}, CubicFootPerSecond{"ft3/s", "ft³/s"};
constexpr KsUnit SquareMetrePerSecond{"m2/s", "m²/s"}, SquareFootPerSecond{"ft2/s", "ft²/s"};
constexpr KsUnit PerMetre{"1/m", "1/m"}, PerFoot{"1/ft", "1/ft"};
constexpr KsUnit Degree{"degree", "°"};
constexpr KsUnit Number{"1", ""};       // a ratio
constexpr KsUnit AsStored{nullptr, ""}; // the file format leaves the unit open, so nothing may be converted

// The metric display units are the base units: with them what is shown is what is stored.
constexpr std::array Groups{
    KsUnitGroupRow{UnitGroup::WaterLevel, "water level or depth", Metre, Metre, Foot},
    KsUnitGroupRow{UnitGroup::Discharge, "discharge", CubicMetrePerSecond, CubicMetrePerSecond, CubicFootPerSecond},
    KsUnitGroupRow{UnitGroup::Velocity, "velocity", MetrePerSecond, MetrePerSecond, FootPerSecond},
    KsUnitGroupRow{UnitGroup::Volume, "volume", CubicMetre, CubicMetre, CubicFoot},
    KsUnitGroupRow{UnitGroup::Slope, "slope", Number, Number, Number},
    KsUnitGroupRow{UnitGroup::Area, "area", SquareMetre, SquareMetre, SquareFoot},
    KsUnitGroupRow{UnitGroup::Radius, "radius", Metre, Metre, Foot},
    KsUnitGroupRow{UnitGroup::FloodPlainResistance, "flood plain resistance", AsStored, AsStored, AsStored},
    KsUnitGroupRow{UnitGroup::Viscosity, "kinematic viscosity", SquareMetrePerSecond, SquareMetrePerSecond,
                   SquareFootPerSecond},
    KsUnitGroupRow{UnitGroup::Chainage, "chainage", Metre, Metre, Foot},
    KsUnitGroupRow{UnitGroup::Factor, "factor", Number, Number, Number},
    KsUnitGroupRow{UnitGroup::Width, "width", Metre, Metre, Foot},
    KsUnitGroupRow{UnitGroup::GeoAngle, "latitude or longitude", Degree, Degree, Degree},
    KsUnitGroupRow{UnitGroup::Coordinate, "map coordinate", Metre, Metre, Foot},
    KsUnitGroupRow{UnitGroup::Rotation, "rotation", Degree, Degree, Degree},
    KsUnitGroupRow{UnitGroup::GridSize, "grid size", Metre, Metre, Foot},
    KsUnitGroupRow{UnitGroup::TimeDisplacement, "time displacement", AsStored, AsStored, AsStored},
    KsUnitGroupRow{UnitGroup::LightAttenuation, "light attenuation", PerMetre, PerMetre, PerFoot},
    KsUnitGroupRow{UnitGroup::LeakageCoefficient, "leakage coefficient", AsStored, AsStored, AsStored},
};

/// Nothing to convert: one spelling, or none at all.
bool IsSame(const KsUnit& base, const KsUnit& display)
{
    return !base.spelling || base.spelling == display.spelling;
}

using UnitPtr = std::unique_ptr<ut_unit, decltype(&ut_free)>;

double FactorToBase(ut_system* system, const KsUnitGroupRow& row, const KsUnit& display)
{
    if (IsSame(row.base, display))
        return 1;
    const UnitPtr from(ut_parse(system, display.spelling, UT_ASCII), ut_free);
    const UnitPtr to(ut_parse(system, row.base.spelling, UT_ASCII), ut_free);
    cv_converter* converter = from && to ? ut_get_converter(from.get(), to.get()) : nullptr;
    if (!converter) {
        qDebug("units: no conversion of %s from %s to %s", row.quantity, display.spelling, row.base.spelling);
        return 1;
    }
    const double factor = cv_convert_double(converter, 1);
    cv_free(converter);
    return factor;
}

struct Conversions
{
    struct Pair
    {
        KsConversion metric, usCustomary;
    };
    std::array<Pair, Groups.size()> pairs;

    Conversions()
    {
        ut_set_error_message_handler(ut_ignore);
        ut_system* system = ut_read_xml(nullptr);
        if (!system) {
            qDebug("units: the unit definitions could not be read; values are shown as stored");
            return;
        }
        for (std::size_t i = 0; i < Groups.size(); ++i) {
            pairs[i].metric.toBase = FactorToBase(system, Groups[i], Groups[i].metric);
            pairs[i].usCustomary.toBase = FactorToBase(system, Groups[i], Groups[i].usCustomary);
        }
        ut_free_system(system);
    }
};

} // namespace

std::span<const KsUnitGroupRow> KsUnitGroups()
{
    return Groups;
}

const KsUnitGroupRow* KsFindUnitGroup(UnitGroup group)
{
    for (const KsUnitGroupRow& row : Groups) {
        if (row.group == group)
            return &row;
    }
    return nullptr;
}

KsConversion KsUnitConversion(UnitGroup group, KsUnitSystem system)
{
    const KsUnitGroupRow* row = KsFindUnitGroup(group);
    if (!row || IsSame(row->base, row->Display(system)))
        return {};
    static const Conversions conversions; // reading the unit definitions takes time that metric users need not spend
    const auto& pair = conversions.pairs[std::size_t(row - Groups.data())];
    return system == KsUnitSystem::Metric ? pair.metric : pair.usCustomary;
}
