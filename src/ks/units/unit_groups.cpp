#include "ks/units/unit_groups.h"

#include <QDebug>
#include <QRegularExpression>
#include <algorithm>
#include <array>
#include <cmath>
#include <cstdio>
#include <cstdlib>
#include <functional>
#include <limits>
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

// What a user may type besides these two, as far as it is worth saying.
constexpr auto Lengths = "mm, cm, km, in, yd, mi", Areas = "ha, km2, acre", Volumes = "l, acre_foot",
               Discharges = "l/s, m3/h, m3/d, cfs, gpm, mgd", Velocities = "cm/s, km/h, mph, knot",
               Viscosities = "mm2/s", PerLength = "1/cm", Ratios = "%, ‰", Angles = "rad";

constexpr std::array Groups{
    KsUnitGroupRow{UnitGroup::WaterLevel, "water level or depth", Metre, Foot, Lengths},
    KsUnitGroupRow{UnitGroup::Discharge, "discharge", CubicMetrePerSecond, CubicFootPerSecond, Discharges},
    KsUnitGroupRow{UnitGroup::Velocity, "velocity", MetrePerSecond, FootPerSecond, Velocities},
    KsUnitGroupRow{UnitGroup::Volume, "volume", CubicMetre, CubicFoot, Volumes},
    KsUnitGroupRow{UnitGroup::Slope, "slope", Number, Number, Ratios},
    KsUnitGroupRow{UnitGroup::Area, "area", SquareMetre, SquareFoot, Areas},
    KsUnitGroupRow{UnitGroup::Radius, "radius", Metre, Foot, Lengths},
    KsUnitGroupRow{UnitGroup::FloodPlainResistance, "flood plain resistance", AsStored, AsStored},
    KsUnitGroupRow{UnitGroup::Viscosity, "kinematic viscosity", SquareMetrePerSecond, SquareFootPerSecond, Viscosities},
    KsUnitGroupRow{UnitGroup::Chainage, "chainage", Metre, Foot, Lengths},
    KsUnitGroupRow{UnitGroup::Factor, "factor", Number, Number, Ratios},
    KsUnitGroupRow{UnitGroup::Width, "width", Metre, Foot, Lengths},
    KsUnitGroupRow{UnitGroup::GeoAngle, "latitude or longitude", Degree, Degree, Angles},
    KsUnitGroupRow{UnitGroup::Coordinate, "map coordinate", Metre, Foot, Lengths},
    KsUnitGroupRow{UnitGroup::Rotation, "rotation", Degree, Degree, Angles},
    KsUnitGroupRow{UnitGroup::GridSize, "grid size", Metre, Foot, Lengths},
    KsUnitGroupRow{UnitGroup::TimeDisplacement, "time displacement", AsStored, AsStored},
    KsUnitGroupRow{UnitGroup::LightAttenuation, "light attenuation", PerMetre, PerFoot, PerLength},
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

/// Read at the first need: that takes time which whoever types plain metric numbers need not spend. Null when the
/// definitions cannot be read.
ut_system* Definitions()
{
    static const std::unique_ptr<ut_system, decltype(&ut_free_system)> system = [] {
        ut_set_error_message_handler(ut_ignore);
        return std::unique_ptr<ut_system, decltype(&ut_free_system)>(ut_read_xml(nullptr), ut_free_system);
    }();
    return system.get();
}

UnitPtr Parse(const char* spelling)
{
    return {Definitions() ? ut_parse(Definitions(), spelling, UT_UTF8) : nullptr, ut_free};
}

/// Nothing where there is no conversion, and where it is more than a factor: the definitions also convert a metre into
/// a 1/metre, by dividing.
std::optional<double> FactorBetween(const UnitPtr& from, const UnitPtr& to)
{
    cv_converter* converter = from && to ? ut_get_converter(from.get(), to.get()) : nullptr;
    if (!converter)
        return std::nullopt;
    const double factor = cv_convert_double(converter, 1), twice = cv_convert_double(converter, 2);
    cv_free(converter);
    return std::fabs(twice - 2 * factor) <= 1e-12 * std::fabs(twice) ? std::optional(factor) : std::nullopt;
}

double FactorToBase(const KsUnitGroupRow& row)
{
    if (IsSame(row.base, row.usCustomary))
        return 1;
    const auto factor = FactorBetween(Parse(row.usCustomary.spelling), Parse(row.base.spelling));
    if (!factor)
        qDebug("units: no conversion of %s from %s to %s", row.quantity, row.usCustomary.spelling, row.base.spelling);
    return factor.value_or(1);
}

/// Of the US customary units, row by row.
std::array<double, Groups.size()> Factors()
{
    std::array<double, Groups.size()> factors;
    factors.fill(1);
    if (Definitions())
        std::ranges::transform(Groups, factors.begin(), FactorToBase);
    else
        qDebug("units: the unit definitions could not be read; values are shown as stored");
    return factors;
}

/// What water people write and the definitions do not know, or know as something else.
constexpr std::pair<const char*, const char*> Spellings[] = {
    {"cfs", "ft3/s"},       {"cms", "m3/s"}, {"gpm", "231 in3/min"},  {"mgd", "231e6 in3/day"},  {"gal", "231 in3"}, {"gallon", "231 in3"},
    {"mph", "mi/h"},        {"fps", "ft/s"}, {"kph", "km/h"},         {"ac-ft", "acre_foot"},    {"deg", "degree"},
    {"\xE2\x80\xB0", "0.001"}, // per mille
    {"nmi", "nautical_mile"}, {"lps", "l/s"}, {"ac", "acre"},
};

constexpr const char* AngleUnits[] = {"\xC2\xB0", "deg", "degree", "degrees", "rad", "radian", "radians"};

/// A word of a unit, and the exponent behind it.
constexpr auto Word = "[\\p{L}%‰°µ_][\\p{L}_]*(?:-ft)?";
constexpr auto Exponent = "(?:\\^?-?[1-9]|⁻?[¹²³])?";

/// Units multiplied and divided, without numbers and blanks between them: the definitions would take "12 5" for 60 and
/// "12 m 3 cm" for an area.
bool IsUnitText(const CString& text)
{
    static const QRegularExpression form(QStringLiteral("^(1?/)?U([/*·]U)*$")
                                             .replace(u'U', CString::fromUtf8(Word) + CString::fromUtf8(Exponent)));
    return form.match(text).hasMatch();
}

/// The definitions put prefixes before every unit: "nmi" are thousand millionths of a mile to them, "Mm3" are a million
/// million million cubic metres. Nobody means these.
bool HasOddPrefix(const CString& word)
{
    static const QRegularExpression odd(
        QStringLiteral("^([YZEPTGMkhdcmunpfazyµ]|da)(mi|mile|in|inch|ft|foot|feet|yd|yard|acre|gallon|min|knot)s?$|^Mm$"));
    return word != QStringLiteral("min") && odd.match(word).hasMatch();
}

/// Null for what is no unit.
UnitPtr Parsed(const CString& unit)
{
    static const QRegularExpression words(CString::fromUtf8(Word));
    CString spelt;
    qsizetype end = 0;
    for (auto match = words.globalMatch(unit); match.hasNext();) {
        const auto word = match.next();
        CString text = word.captured();
        for (const auto& [written, spelling] : Spellings)
            if (text == CString::fromUtf8(written))
                text = u'(' + CString::fromUtf8(spelling) + u')';
        if (HasOddPrefix(text))
            return {nullptr, ut_free};
        spelt += unit.mid(end, word.capturedStart() - end) + text;
        end = word.capturedEnd();
    }
    spelt += unit.mid(end);
    return Parse((spelt.startsWith(u'/') ? u'1' + spelt : spelt).toUtf8().constData());
}

/// In capitals throughout, "FT" or "M3/S", it is read as if it were not, unless it is a unit.
CString InItsCase(const CString& unit)
{
    return unit == unit.toUpper() && !Parsed(unit) ? unit.toLower() : unit;
}

/// The definitions multiply out of powers of ten, which leaves something in the last places: 0.0010000000000000002
/// for a litre. The factors themselves are decimal numbers.
long double AsDecimal(double factor)
{
    char text[32];
    std::snprintf(text, sizeof text, "%.14Lg", static_cast<long double>(factor));
    const long double decimal = std::strtold(text, nullptr);
    constexpr double LastPlaces = 4 * std::numeric_limits<double>::epsilon();
    return std::fabs(double(decimal) - factor) <= LastPlaces * factor ? decimal : factor;
}

} // namespace

const KsUnitGroupRow* KsFindUnitGroup(UnitGroup group)
{
    const auto* row = std::ranges::find(Groups, group, &KsUnitGroupRow::group);
    return row == Groups.end() ? nullptr : row;
}

double KsUnitFactor(UnitGroup group, KsUnitSystem system)
{
    if (system == KsUnitSystem::Metric)
        return 1;
    const KsUnitGroupRow* row = KsFindUnitGroup(group);
    if (!row || IsSame(row->base, row->usCustomary))
        return 1;
    static const auto factors = Factors(); // reading the unit definitions takes time that metric users need not spend
    return factors[std::size_t(row - Groups.data())];
}

std::optional<long double> KsTypedUnitFactor(UnitGroup group, const CString& unit)
{
    const KsUnitGroupRow* row = KsFindUnitGroup(group);
    if (!row || !row->base.spelling || !IsUnitText(unit))
        return std::nullopt;
    for (const KsUnit& own : {row->base, row->usCustomary})
        if (unit == CString::fromUtf8(own.symbol))
            return AsDecimal(own.spelling == row->base.spelling ? 1 : FactorToBase(*row));
    // An angle is a ratio to the definitions, but a slope of 5 degrees is none of 0.087, and no latitude is given in %.
    const auto is = [&unit](const char* written) { return unit == CString::fromUtf8(written); };
    if (row->base.spelling == Number.spelling && unit != u'%' && unit != u'‰')
        return std::nullopt;
    if (row->base.spelling == Degree.spelling && std::ranges::none_of(AngleUnits, is))
        return std::nullopt;
    const UnitPtr base = Parse(row->base.spelling);
    const auto factor = FactorBetween(Parsed(InItsCase(unit)), base);
    return factor && *factor > 0 ? std::optional(AsDecimal(*factor)) : std::nullopt;
}

bool KsIsUnit(const CString& unit)
{
    // "12e" is a number that somebody has not finished, rather than twelve electrons.
    return unit.toLower() != u'e' && IsUnitText(unit) && Parsed(InItsCase(unit));
}
