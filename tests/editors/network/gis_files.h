// GIS files for the tests of the import, written by the library that other programs write them with.
#pragma once

#include <QString>
#include <string>
#include <vector>

struct CTestFeature
{
    std::string name; // empty for none
    std::string wkt;  // empty for no geometry
    double from = 0, to = 0;
};

struct CTestLayer
{
    std::string name;
    int epsg = 0; // 0: no coordinate system
    std::vector<CTestFeature> features;
};

/// Fields of each layer: River, from, to.
void MakeGisFile(const char* format, const QString& path, const std::vector<CTestLayer>& layers);
