// Coordinate systems of GIS files, by GDAL/OGR and PROJ.
#pragma once

#include "editors/network/gis_lines.h"

class OGRSpatialReference;

/// Not known for null, and for systems that are neither of the plane nor of the globe.
CGisSystem DescribeSystem(const OGRSpatialReference* reference);
CGisSystem FindGisSystem(const QString& definition);
CGisSystem FindUtmZone(const CGisLayer& layer);
CGisMap ProjectLayer(const CGisLayer& layer, const CGisSystem& target);
