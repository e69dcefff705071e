#include "ks/units/unit_groups.h"

#include <QDebug>
#include <algorithm>
#include <array>
#include <functional>
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

constexpr std::array Groups{
    KsUnitGroupRow{UnitGroup::WaterLevel, "water level or depth", Metre, Foot},
    KsUnitGroupRow{UnitGroup::Discharge, "discharge", CubicMetrePerSecond, CubicFootPerSecond},
    KsUnitGroupRow{UnitGroup::Velocity, "velocity", MetrePerSecond, FootPerSecond},
    KsUnitGroupRow{UnitGroup::Volume, "volume", CubicMetre, CubicFoot},
    KsUnitGroupRow{UnitGroup::Slope, "slope", Number, Number},
    KsUnitGroupRow{UnitGroup::Area, "area", SquareMetre, SquareFoot},
    KsUnitGroupRow{UnitGroup::Radius, "radius", Metre, Foot},
    KsUnitGroupRow{UnitGroup::FloodPlainResistance, "flood plain resistance", AsStored, AsStored},
    KsUnitGroupRow{UnitGroup::Viscosity, "kinematic viscosity", SquareMetrePerSecond, SquareFootPerSecond},
    KsUnitGroupRow{UnitGroup::Chainage, "chainage", Metre, Foot},
    KsUnitGroupRow{UnitGroup::Factor, "factor", Number, Number},
    KsUnitGroupRow{UnitGroup::Width, "width", Metre, Foot},
    KsUnitGroupRow{UnitGroup::GeoAngle, "latitude or longitude", Degree, Degree},
    KsUnitGroupRow{UnitGroup::Coordinate, "map coordinate", Metre, Foot},
    KsUnitGroupRow{UnitGroup::Rotation, "rotation", Degree, Degree},
    KsUnitGroupRow{UnitGroup::GridSize, "grid size", Metre, Foot},
    KsUnitGroupRow{UnitGroup::TimeDisplacement, "time displacement", AsStored, AsStored},
    KsUnitGroupRow{UnitGroup::LightAttenuation, "light attenuation", PerMetre, PerFoot},
    KsUnitGroupRow{UnitGroup::LeakageCoefficient, "leakage coefficient", AsStored, AsStored},
};

static_assert(std::ranges::adjacent_find(Groups, std::ranges::greater_equal{}, &KsUnitGroupRow::group) == Groups.end(),
              "one row a group, by number");

/// Nothing to convert: one spelling, or none at all.
bool IsSame(const KsUnit& base, const KsUnit& display)
{
    return !base.spelling || base.spelling == display.spelling;
}

using UnitPtr = std::unique_ptr<ut_unit, decltype(&ut_free)>;

double FactorToBase(ut_system* system, const KsUnitGroupRow& row)
{
    if (IsSame(row.base, row.usCustomary))
        return 1;
    const UnitPtr from(ut_parse(system, row.usCustomary.spelling, UT_ASCII), ut_free);
    const UnitPtr to(ut_parse(system, row.base.spelling, UT_ASCII), ut_free);
    cv_converter* converter = from && to ? ut_get_converter(from.get(), to.get()) : nullptr;
    if (!converter) {
        qDebug("units: no conversion of %s from %s to %s", row.quantity, row.usCustomary.spelling, row.base.spelling);
        return 1;
    }
    const double factor = cv_convert_double(converter, 1);
    cv_free(converter);
    return factor;
}

/// Of the US customary units, row by row.
std::array<double, Groups.size()> Factors()
{
    std::array<double, Groups.size()> factors;
    factors.fill(1);
    ut_set_error_message_handler(ut_ignore);
    ut_system* system = ut_read_xml(nullptr);
    if (system)
        std::ranges::transform(Groups, factors.begin(), [system](auto& row) { return FactorToBase(system, row); });
    else
        qDebug("units: the unit definitions could not be read; values are shown as stored");
    ut_free_system(system);
    return factors;
}

} // namespace

const KsUnitGroupRow* KsFindUnitGroup(UnitGroup group)
{
    const auto* row = std::ranges::find(Groups, group, &KsUnitGroupRow::group);
    return row == Groups.end() ? nullptr : row;
}

double KsUnitFactor(UnitGroup group, KsUnitSystem system)
{
    const KsUnitGroupRow* row = KsFindUnitGroup(group);
    if (system == KsUnitSystem::Metric || !row || IsSame(row->base, row->usCustomary))
        return 1;
    static const auto factors = Factors(); // reading the unit definitions takes time that metric users need not spend
    return factors[std::size_t(row - Groups.data())];
}
