// The numbers of the unit groups. Free of any library, so that data declarations can name a field's quantity.
// What a group converts between is declared in unit_groups.cpp, one row a group.
#pragma once

enum class UnitGroup : int
{
    None = 0,            // no quantity: shown as stored
    WaterLevel = 100000, // water level, depth, height
    Discharge = 100001,
    Velocity = 100016,
    Volume = 100023,
    Slope = 100025,
    Area = 100026,
    Radius = 100028,
    FloodPlainResistance = 100030,
    Viscosity = 100123,
    Chainage = 100143, // position or length along a branch
    Factor = 100144,   // dimensionless
    Width = 100147,
    GeoAngle = 100157, // latitude, longitude
    Coordinate = 100183,
    Rotation = 100184,
    GridSize = 100211,
    TimeDisplacement = 100316, // time zone meridian and displacement
    LightAttenuation = 100317,
    LeakageCoefficient = 100362
};
