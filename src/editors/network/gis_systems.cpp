#include "editors/network/gis_systems.h"

#include "editors/network/gis_errors.h"
#include "editors/network/measured_line.h"

#include <QCoreApplication>
#include <algorithm>
#include <cmath>
#include <memory>

#include <geodesic.h>
#include <ogr_spatialref.h>

namespace {

struct GisSystems
{
    Q_DECLARE_TR_FUNCTIONS(GisSystems)
};

/// A system by its definition, its coordinates in the order of GIS files: east first.
std::unique_ptr<OGRSpatialReference> Reference(const QString& definition)
{
    auto reference = std::make_unique<OGRSpatialReference>();
    // It may come out of a file: nothing is fetched from anywhere for it.
    if (definition.isEmpty() ||
        reference->SetFromUserInput(definition.toUtf8().constData(),
                                    OGRSpatialReference::SET_FROM_USER_INPUT_LIMITATIONS) != OGRERR_NONE)
        return nullptr;
    reference->SetAxisMappingStrategy(OAMS_TRADITIONAL_GIS_ORDER);
    return reference;
}

QString CodeOf(const OGRSpatialReference& reference)
{
    const char *authority = reference.GetAuthorityName(nullptr), *code = reference.GetAuthorityCode(nullptr);
    return authority && code ? QStringLiteral("%1:%2").arg(QLatin1String(authority), QLatin1String(code)) : QString();
}

/// Description of a system without a code, on one line.
QString Description(const OGRSpatialReference& reference)
{
    const char* const options[] = {"FORMAT=WKT2_2019", "MULTILINE=NO", nullptr};
    char* text = nullptr;
    const QString description =
        reference.exportToWkt(&text, options) == OGRERR_NONE ? QString::fromUtf8(text) : QString();
    CPLFree(text);
    return description;
}

using Transformation = std::unique_ptr<OGRCoordinateTransformation>;

Transformation Between(const OGRSpatialReference& from, const OGRSpatialReference& to)
{
    return Transformation(OGRCreateCoordinateTransformation(&from, &to));
}

/// False when one of the points has no place in the other system.
bool Transform(const Transformation& transformation, CGisLine& line)
{
    std::vector<double> x, y;
    for (const QPointF& at : line) {
        x.push_back(at.x());
        y.push_back(at.y());
    }
    std::vector<int> good(line.size());
    const bool done =
        line.empty() || transformation->Transform(int(line.size()), x.data(), y.data(), nullptr, good.data());
    for (std::size_t i = 0; i < line.size(); ++i)
        line[i] = {x[i], y[i]};
    return done && std::ranges::all_of(good, std::identity()) && std::ranges::all_of(line, &IsFinite);
}

/// Compares lengths on the plane with those on the ellipsoid. C. Karney, Algorithms for geodesics, 2013.
class CScaleMeter
{
public:
    explicit CScaleMeter(const OGRSpatialReference& plane)
    {
        const std::unique_ptr<OGRSpatialReference> globe(plane.CloneGeogCS());
        if (!globe)
            return;
        globe->SetAxisMappingStrategy(OAMS_TRADITIONAL_GIS_ORDER);
        m_toGlobe = Between(plane, *globe);
        m_degrees = globe->GetAngularUnits() * 180 / M_PI;
        const double flattening = globe->GetInvFlattening() > 0 ? 1 / globe->GetInvFlattening() : 0;
        geod_init(&m_ellipsoid, globe->GetSemiMajor(), flattening);
    }

    /// `line` in the system's units, `planar` its length in metres.
    void Add(CGisLine line, double planar, CGisMap& map)
    {
        if (!m_toGlobe || !Transform(m_toGlobe, line))
            return;
        double ground = 0;
        for (std::size_t i = 1; i < line.size(); ++i) {
            double distance = 0;
            geod_inverse(&m_ellipsoid, m_degrees * line[i - 1].y(), m_degrees * line[i - 1].x(),
                         m_degrees * line[i].y(), m_degrees * line[i].x(), &distance, nullptr, nullptr);
            ground += distance;
        }
        if (!(ground > 0) || !(planar > 0))
            return;
        m_ground += ground;
        m_planar += planar;
        map.scale = m_planar / m_ground;
        map.least = std::fmin(map.least, planar / ground); // of a number and none the number
        map.largest = std::fmax(map.largest, planar / ground);
    }

private:
    Transformation m_toGlobe;
    geod_geodesic m_ellipsoid{};
    double m_degrees = 1; // a unit of the globe's coordinates
    double m_ground = 0, m_planar = 0;
};

/// The layer's parts as they stand, without numbers that are none.
std::vector<std::vector<CGisLine>> PartsOf(const CGisLayer& layer)
{
    std::vector<std::vector<CGisLine>> parts;
    parts.reserve(layer.features.size());
    for (const CGisFeature& feature : layer.features) {
        parts.push_back(feature.parts);
        for (CGisLine& line : parts.back())
            std::erase_if(line, std::not_fn(&IsFinite));
    }
    return parts;
}

/// Databases give a layer for which nobody has named a system one of this name.
bool IsUndefined(const OGRSpatialReference& reference)
{
    return QLatin1String(reference.GetName()).startsWith(QLatin1String("Undefined"), Qt::CaseInsensitive);
}

} // namespace

CGisSystem DescribeSystem(const OGRSpatialReference* reference)
{
    if (!reference || IsUndefined(*reference) || !(reference->IsProjected() || reference->IsGeographic()))
        return {};
    CGisSystem system;
    const QString code = CodeOf(*reference);
    system.definition = code.isEmpty() ? Description(*reference) : code;
    system.name = QString::fromUtf8(reference->GetName());
    if (!code.isEmpty())
        system.name += QStringLiteral(" (%1)").arg(code);
    system.degrees = reference->IsGeographic();
    return system;
}

CGisSystem FindGisSystem(const QString& definition)
{
    const CGisErrors quiet;
    bool isNumber = false;
    const int code = definition.trimmed().toInt(&isNumber);
    const auto reference = Reference(isNumber ? QStringLiteral("EPSG:%1").arg(code) : definition.trimmed());
    return DescribeSystem(reference.get());
}

CGisSystem FindUtmZone(const CGisLayer& layer)
{
    constexpr double zoneWidth = 6, zones = 60; // degrees
    const CGisErrors quiet;
    const auto reference = Reference(layer.system.definition), globe = Reference(QStringLiteral("EPSG:4326"));
    const Transformation toGlobe = reference && globe ? Between(*reference, *globe) : nullptr;
    if (!toGlobe)
        return {};
    CExtent around;
    for (auto& parts : PartsOf(layer)) {
        for (CGisLine& line : parts) {
            if (Transform(toGlobe, line))
                around.Add(line);
        }
    }
    if (around.left > around.right)
        return {};
    const QPointF middle = around.Box().center();
    const double zone = std::clamp(std::floor((middle.x() + 180) / zoneWidth) + 1, 1.0, zones);
    constexpr int northern = 32600, southern = 32700; // EPSG codes of WGS 84 / UTM zones
    return FindGisSystem(QString::number((middle.y() < 0 ? southern : northern) + int(zone)));
}

CGisMap ProjectLayer(const CGisLayer& layer, const CGisSystem& target)
{
    CGisErrors errors;
    CGisMap map;
    map.parts = PartsOf(layer);
    const auto to = Reference(target.definition);
    if (!to) // taken as metres
        return map;
    const bool same = target.definition == layer.system.definition;
    const auto from = same ? nullptr : Reference(layer.system.definition);
    const Transformation transformation = from ? Between(*from, *to) : nullptr;
    if (!to->IsProjected() || (!same && !transformation)) {
        const QStringList reasons = errors.Take();
        map.parts.clear();
        map.error =
            !to->IsProjected()
                ? GisSystems::tr("%1 is in degrees: distances along a branch need a map in meters.").arg(target.name)
                : GisSystems::tr("%1 cannot be projected to %2. %3")
                      .arg(layer.system.IsKnown() ? layer.system.name : layer.name, target.name, reasons.value(0))
                      .trimmed();
        return map;
    }
    const double toMetres = to->GetLinearUnits();
    CScaleMeter meter(*to);
    for (auto& parts : map.parts) {
        if (transformation)
            std::erase_if(parts, [&](CGisLine& line) { return !Transform(transformation, line); });
        for (CGisLine& line : parts) {
            meter.Add(line, toMetres * LengthOf(line), map);
            for (QPointF& at : line)
                at *= toMetres;
        }
    }
    return map;
}
