// Reads the lines of GIS files with GDAL/OGR.
#include "editors/network/gis_lines.h"

#include "editors/network/gis_errors.h"
#include "editors/network/gis_systems.h"
#include "editors/network/measured_line.h"

#include <QCoreApplication>
#include <QFileInfo>
#include <memory>

#include <ogr_spatialref.h>
#include <ogrsf_frmts.h>

namespace {

struct GisLines
{
    Q_DECLARE_TR_FUNCTIONS(GisLines)
};

QString GeometryName(OGRwkbGeometryType type)
{
    return QString::fromUtf8(OGRGeometryTypeToName(wkbFlatten(type)));
}

CGisLine LineOf(const OGRLineString& geometry, bool swapped)
{
    CGisLine line;
    line.reserve(std::size_t(geometry.getNumPoints()));
    for (int i = 0; i < geometry.getNumPoints(); ++i) {
        const QPointF at(geometry.getX(i), geometry.getY(i));
        line.push_back(swapped ? at.transposed() : at);
    }
    return line;
}

/// Curves as short segments.
std::vector<CGisLine> PartsOf(const OGRGeometry& geometry, bool swapped)
{
    std::vector<CGisLine> parts;
    const std::unique_ptr<OGRGeometry> straight(geometry.getLinearGeometry());
    const OGRwkbGeometryType type = straight ? wkbFlatten(straight->getGeometryType()) : wkbUnknown;
    if (type == wkbLineString)
        parts.push_back(LineOf(*straight->toLineString(), swapped));
    if (type == wkbMultiLineString) {
        for (const OGRLineString* part : *straight->toMultiLineString())
            parts.push_back(LineOf(*part, swapped));
    }
    return parts;
}

QStringList FieldValues(OGRFeature& feature)
{
    QStringList values;
    for (int i = 0; i < feature.GetFieldCount(); ++i)
        values << (feature.IsFieldSetAndNotNull(i) ? QString::fromUtf8(feature.GetFieldAsString(i)) : QString());
    return values;
}

/// Whether the layer's coordinates stand north first.
bool IsSwapped(const OGRSpatialReference* reference)
{
    if (!reference)
        return false;
    OGRSpatialReference usual(*reference);
    usual.SetAxisMappingStrategy(OAMS_TRADITIONAL_GIS_ORDER);
    return usual.GetDataAxisToSRSAxisMapping() != reference->GetDataAxisToSRSAxisMapping();
}

/// Some formats take a file that names no coordinate system for one in degrees; its numbers may tell otherwise.
bool AreBeyondDegrees(const CGisLayer& layer)
{
    CExtent around;
    for (const CGisFeature& feature : layer.features) {
        for (const CGisLine& line : feature.parts)
            around.Add(line);
    }
    return around.left < -360 || around.right > 360 || around.top < -90 || around.bottom > 90;
}

CGisFeature ReadFeature(OGRFeature& source, bool swapped, CGisErrors& errors)
{
    CGisFeature feature{source.GetFID(), FieldValues(source), {}, {}, {}};
    if (const OGRGeometry* geometry = source.GetGeometryRef()) {
        feature.geometry = GeometryName(geometry->getGeometryType());
        feature.parts = PartsOf(*geometry, swapped);
    }
    feature.error = errors.Take().join(u' ');
    return feature;
}

CGisLayer ReadLayer(OGRLayer& source, CGisErrors& errors)
{
    CGisLayer layer;
    layer.name = QString::fromUtf8(source.GetName());
    layer.geometry = GeometryName(source.GetGeomType());
    layer.system = DescribeSystem(source.GetSpatialRef());
    const OGRFeatureDefn* definition = source.GetLayerDefn();
    for (int i = 0; i < definition->GetFieldCount(); ++i)
        layer.fields << QString::fromUtf8(definition->GetFieldDefn(i)->GetNameRef());
    layer.announced = source.GetFeatureCount();
    const bool swapped = IsSwapped(source.GetSpatialRef());
    errors.Take();
    for (const auto& feature : source)
        layer.features.push_back(ReadFeature(*feature, swapped, errors));
    layer.errors = errors.Take(); // of a feature that did not come any more
    if (layer.system.degrees && AreBeyondDegrees(layer))
        layer.system = {};
    return layer;
}

CGisFile ReadFile(const QString& path)
{
    GDALAllRegister();
    CGisErrors errors;
    CGisFile file;
    const std::unique_ptr<GDALDataset> data(
        GDALDataset::Open(path.toUtf8().constData(), GDAL_OF_VECTOR | GDAL_OF_READONLY));
    if (!data) {
        const QString reason = errors.Take().join(u' ');
        file.error =
            GisLines::tr("%1 could not be read as a GIS file: %2")
                .arg(QFileInfo(path).fileName(), reason.isEmpty() ? GisLines::tr("the format is not known.") : reason);
        return file;
    }
    for (OGRLayer* source : data->GetLayers())
        file.layers.push_back(ReadLayer(*source, errors));
    if (file.layers.empty())
        file.error = GisLines::tr("%1 has no layers.").arg(QFileInfo(path).fileName());
    return file;
}

} // namespace

extern "C" Q_DECL_EXPORT const CGisLibrary* KvrGisLibrary()
{
    static constexpr CGisLibrary library{&ReadFile, &FindGisSystem, &FindUtmZone, &ProjectLayer};
    return &library;
}
