// Lines of GIS files. What reads them is a library of its own, loaded when the first file is imported: the library that
// it needs is large, and starting the program does not wait for it.
#pragma once

#include <QPointF>
#include <QString>
#include <QStringList>
#include <vector>

struct CGisLine
{
    std::vector<QPointF> points; // metres
    QStringList values;          // a text a field of the layer
};

struct CGisLayer
{
    QString name;
    QStringList fields;
    std::vector<CGisLine> lines; // a line of several parts is several lines
    int others = 0;              // features that are no lines
};

struct CGisFile
{
    std::vector<CGisLayer> layers; // those that have lines
    QString error;                 // for the user; empty when the file was read
};

/// Name of the library, beside the program, and of its one function.
inline constexpr const char* GisLibrary = "KVR_GIS";
inline constexpr const char* GisFunction = "KvrReadGisLines";
/// Reads a file of lines in any format, in projected coordinates.
using GisReader = void(const QString& path, CGisFile& file);
