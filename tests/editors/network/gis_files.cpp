#include "gis_files.h"

#include <gtest/gtest.h>
#include <memory>

#include <ogr_spatialref.h>
#include <ogrsf_frmts.h>

namespace {

void AddFeature(OGRLayer& layer, const CTestFeature& each)
{
    const std::unique_ptr<OGRFeature> feature(OGRFeature::CreateFeature(layer.GetLayerDefn()));
    if (!each.name.empty())
        feature->SetField("River", each.name.c_str());
    feature->SetField("from", each.from);
    feature->SetField("to", each.to);
    OGRGeometry* geometry = nullptr;
    if (!each.wkt.empty()) {
        ASSERT_EQ(OGRGeometryFactory::createFromWkt(each.wkt.c_str(), nullptr, &geometry), OGRERR_NONE) << each.wkt;
        feature->SetGeometryDirectly(geometry);
    }
    ASSERT_EQ(layer.CreateFeature(feature.get()), OGRERR_NONE);
}

} // namespace

void MakeGisFile(const char* format, const QString& path, const std::vector<CTestLayer>& layers)
{
    GDALAllRegister();
    GDALDriver* driver = GetGDALDriverManager()->GetDriverByName(format);
    ASSERT_NE(driver, nullptr);
    const std::unique_ptr<GDALDataset> data(driver->Create(path.toUtf8().constData(), 0, 0, 0, GDT_Unknown, nullptr));
    ASSERT_NE(data, nullptr);
    for (const CTestLayer& each : layers) {
        OGRSpatialReference system;
        if (each.epsg) {
            ASSERT_EQ(system.importFromEPSG(each.epsg), OGRERR_NONE);
        }
        system.SetAxisMappingStrategy(OAMS_TRADITIONAL_GIS_ORDER);
        const bool shape = std::string(format) == "ESRI Shapefile";
        OGRLayer* layer = data->CreateLayer(each.name.c_str(), each.epsg ? &system : nullptr,
                                            shape ? wkbLineString : wkbUnknown, nullptr);
        ASSERT_NE(layer, nullptr);
        OGRFieldDefn name("River", OFTString), from("from", OFTReal), to("to", OFTReal);
        for (OGRFieldDefn* field : {&name, &from, &to})
            ASSERT_EQ(layer->CreateField(field), OGRERR_NONE);
        for (const CTestFeature& feature : each.features)
            AddFeature(*layer, feature);
    }
}
