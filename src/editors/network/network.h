// The river network: branches with their course on the map and the channel along them.
#pragma once

#include "files/declared_section.h"
#include "ks/fc/exchange.h"

#include <QPointF>
#include <QRectF>
#include <QString>
#include <vector>

/// The channel at a place of a branch. Metres; KsUnset for what is not known.
struct CChannelRow
{
    double chainage = 0;
    double radius = KsUnset; // of curvature
    double width = KsUnset;  // of the water surface

    static FieldList DeclaredFields();
};

struct CNetworkBranch
{
    std::string name;
    double start = 0, end = 0;        // chainages of the first and the last vertex, metres; they differ
    bool downstream = true;           // water flows towards increasing chainage
    std::vector<QPointF> line;        // map coordinates, metres: x to the east, y to the north
    std::vector<CChannelRow> channel; // by increasing chainage
    KeptContent kept;                 // what the file says beyond that

    static FieldList DeclaredFields();
    QString Name() const { return QString::fromStdString(name); }
    /// Whether water flows from the first vertex to the last.
    bool FlowsAlongLine() const { return downstream == (end >= start); }
    /// Metres along the line.
    double Length() const;
    void SortChannel();
};

struct CNetwork
{
    std::vector<CNetworkBranch> branches;
    std::string system; // that the coordinates lie in, as "EPSG:25832" or in WKT; empty when the file names none
    KeptContent kept;   // what the file says beyond that

    QString System() const { return QString::fromStdString(system); }
    /// -1 for none.
    int FindBranch(const QString& name) const;
    /// Around all vertices; null without any.
    QRectF Extent() const;
};

/// A value of the channel at a chainage: between the nearest rows that have it, in proportion to the distance. KsUnset
/// outside the rows that have it: nothing is extrapolated.
double ChannelValue(const std::vector<CChannelRow>& channel, double CChannelRow::*value, double chainage);
