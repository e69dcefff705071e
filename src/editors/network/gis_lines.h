// Lines of GIS files, and the coordinate systems they lie in. What reads them is a library of its own, loaded when the
// first file is imported: the library that it needs is large, and starting the program does not wait for it.
#pragma once

#include <QPointF>
#include <QString>
#include <QStringList>
#include <limits>
#include <vector>

/// A coordinate system of the plane, or of the globe.
struct CGisSystem
{
    QString definition;   // "EPSG:25832" where it has such a code, otherwise its description in WKT; empty: not known
    QString name;         // for the user, with the code
    bool degrees = false; // longitude and latitude

    bool IsKnown() const { return !definition.isEmpty(); }
};

using CGisLine = std::vector<QPointF>;

struct CGisFeature
{
    qint64 number = 0;           // as the format counts
    QStringList values;          // a text a field of the layer
    std::vector<CGisLine> parts; // none for what is no line
    QString geometry;            // what it is, in the words of the format; empty for a feature without a geometry
    QString error;               // why it could not be read; empty when it was
};

struct CGisLayer
{
    QString name;
    QString geometry; // what its features are, in the words of the format
    CGisSystem system;
    QStringList fields;
    std::vector<CGisFeature> features;
    qint64 announced = 0; // how many features the file says there are
    QStringList errors;   // what was said while it was read, beside the errors of the features

    int Lines() const; // features that are lines
    /// False when the file is cut off or damaged: `features` is what could be read of it.
    bool IsComplete() const;
};

struct CGisFile
{
    std::vector<CGisLayer> layers; // all of them, with lines or without
    QString error;                 // for the user; empty when the file could be opened
};

/// The lines of a layer on the plane of one coordinate system.
struct CGisMap
{
    std::vector<std::vector<CGisLine>> parts; // metres; as the layer's features, without parts that have no place there
    // Lengths on this map in those on the ground: over all lines, and of the lines with the least and the largest one.
    // NaN when the ground is not known.
    double scale = std::numeric_limits<double>::quiet_NaN();
    double least = scale, largest = scale;
    QString error; // for the user; then there are no parts
};

/// What the library does.
struct CGisLibrary
{
    /// Reads a file in any format, in the units of its coordinate systems.
    CGisFile (*Read)(const QString& path);
    /// The system of a definition, or of a code ("EPSG:25832", "25832"); not known when nobody knows it, or when places
    /// on a plane or on the globe are not what it is about.
    CGisSystem (*FindSystem)(const QString& definition);
    /// The UTM zone in the middle of a layer; not known when the layer's system is not.
    CGisSystem (*UtmZone)(const CGisLayer& layer);
    /// `target` may be the layer's own system, or one that is not known: then the numbers stay as they are.
    CGisMap (*MapOf)(const CGisLayer& layer, const CGisSystem& target);
};

/// Name of the library, beside the program, and of the function that gives what it does.
inline constexpr const char* GisLibraryName = "KVR_GIS";
inline constexpr const char* GisLibraryFunction = "KvrGisLibrary";
using GisLibraryGetter = const CGisLibrary*();
