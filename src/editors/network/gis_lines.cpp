// The one source that uses GDAL/OGR.
#include "editors/network/gis_lines.h"

#include <QCoreApplication>
#include <QFileInfo>
#include <cmath>
#include <memory>

#include <cpl_conv.h>
#include <ogr_spatialref.h>
#include <ogrsf_frmts.h>

namespace {

struct GisLines
{
    Q_DECLARE_TR_FUNCTIONS(GisLines)
};

/// Keeps the library's messages to itself; the last one is asked for when something failed.
struct QuietErrors
{
    QuietErrors() { CPLPushErrorHandler(CPLQuietErrorHandler); }
    ~QuietErrors() { CPLPopErrorHandler(); }
};

QString LastReason()
{
    const QString reason = QString::fromUtf8(CPLGetLastErrorMsg()).simplified();
    return reason.isEmpty() ? GisLines::tr("the format is not known.") : reason;
}

/// Metres a unit of the layer's coordinates.
double MetresPerUnit(const OGRSpatialReference* reference)
{
    return reference && reference->IsProjected() ? reference->GetLinearUnits() : 1.0;
}

void AddLine(const OGRLineString& geometry, double toMetres, const QStringList& values, CGisLayer& layer)
{
    CGisLine line{{}, values};
    for (int i = 0; i < geometry.getNumPoints(); ++i) {
        const QPointF at(geometry.getX(i) * toMetres, geometry.getY(i) * toMetres);
        if (std::isfinite(at.x()) && std::isfinite(at.y()) && (line.points.empty() || line.points.back() != at))
            line.points.push_back(at);
    }
    if (line.points.size() > 1)
        layer.lines.push_back(std::move(line));
}

/// False when the geometry holds no line.
bool AddGeometry(const OGRGeometry* geometry, double toMetres, const QStringList& values, CGisLayer& layer)
{
    if (!geometry)
        return false;
    const std::unique_ptr<OGRGeometry> straight(geometry->getLinearGeometry()); // curves as short segments
    const OGRwkbGeometryType type = straight ? wkbFlatten(straight->getGeometryType()) : wkbUnknown;
    if (type == wkbLineString) {
        AddLine(*straight->toLineString(), toMetres, values, layer);
        return true;
    }
    if (type != wkbMultiLineString)
        return false;
    for (const OGRLineString* part : *straight->toMultiLineString())
        AddLine(*part, toMetres, values, layer);
    return true;
}

QStringList FieldValues(OGRFeature& feature)
{
    QStringList values;
    for (int i = 0; i < feature.GetFieldCount(); ++i)
        values << (feature.IsFieldSetAndNotNull(i) ? QString::fromUtf8(feature.GetFieldAsString(i)) : QString());
    return values;
}

CGisLayer ReadLayer(OGRLayer& source)
{
    CGisLayer layer;
    layer.name = QString::fromUtf8(source.GetName());
    const OGRFeatureDefn* definition = source.GetLayerDefn();
    for (int i = 0; i < definition->GetFieldCount(); ++i)
        layer.fields << QString::fromUtf8(definition->GetFieldDefn(i)->GetNameRef());
    const double toMetres = MetresPerUnit(source.GetSpatialRef());
    for (const auto& feature : source) {
        if (!AddGeometry(feature->GetGeometryRef(), toMetres, FieldValues(*feature), layer))
            ++layer.others;
    }
    return layer;
}

/// A file that names no coordinate system is taken for degrees by some formats, so its numbers decide.
bool IsGeographic(const OGRLayer& source, const CGisLayer& layer)
{
    const OGRSpatialReference* reference = const_cast<OGRLayer&>(source).GetSpatialRef();
    if (!reference || !reference->IsGeographic())
        return false;
    for (const CGisLine& line : layer.lines) {
        for (const QPointF& at : line.points) {
            if (std::abs(at.x()) > 360 || std::abs(at.y()) > 90)
                return false;
        }
    }
    return true;
}

void ReadFile(const QString& path, CGisFile& file)
{
    const QString name = QFileInfo(path).fileName();
    GDALAllRegister();
    const QuietErrors quiet;
    CPLErrorReset();
    const std::unique_ptr<GDALDataset> data(
        GDALDataset::Open(path.toUtf8().constData(), GDAL_OF_VECTOR | GDAL_OF_READONLY));
    if (!data) {
        file.error = GisLines::tr("%1 could not be read as a GIS file: %2").arg(name, LastReason());
        return;
    }
    int others = 0;
    for (OGRLayer* source : data->GetLayers()) {
        CGisLayer layer = ReadLayer(*source);
        others += layer.others;
        if (layer.lines.empty())
            continue;
        if (IsGeographic(*source, layer)) {
            file.layers.clear();
            file.error = GisLines::tr("%1: the layer \"%2\" is in degrees of longitude and latitude. Distances along "
                                      "a branch need map coordinates in meters: project the file first.")
                             .arg(name, layer.name);
            return;
        }
        file.layers.push_back(std::move(layer));
    }
    if (file.layers.empty())
        file.error = GisLines::tr("%1 holds no lines (%2 features of other kinds).").arg(name).arg(others);
}

} // namespace

extern "C" Q_DECL_EXPORT void KvrReadGisLines(const QString& path, CGisFile& file)
{
    ReadFile(path, file);
}
