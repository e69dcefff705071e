// A cross section: the ground across the river at a place of a branch.
#pragma once

#include "files/declared_section.h"
#include "ks/fc/exchange.h"

#include <QString>
#include <optional>
#include <tuple>
#include <vector>

struct CSectionPoint
{
    double offset = 0; // across the section from its left end, looking downstream; metres
    double level = 0;  // of the ground; metres above datum
    bool operator==(const CSectionPoint&) const = default;

    static FieldList DeclaredFields();
};

/// Metres; KsUnset for what is not known.
struct CCrossSection
{
    std::string branch;
    double chainage = 0;
    std::string topoId;                // names the survey; several may have measured the same place
    double radius = KsUnset;           // of curvature
    double width = KsUnset;            // of the water surface
    std::vector<CSectionPoint> points; // from left to right; offsets do not decrease
    KeptContent kept;                  // what the file says beyond that

    static FieldList DeclaredFields();
    QString Branch() const { return QString::fromStdString(branch); }
    QString TopoId() const { return QString::fromStdString(topoId); }
    /// Branch, survey and PlaceOf(chainage): no two sections share it.
    std::tuple<QString, QString, double> Key() const;
};

/// Chainages in metres that the tables do not tell apart have the same place.
double PlaceOf(double chainage);

struct CCrossSections
{
    std::vector<CCrossSection> sections;
    KeptContent kept; // what the file says beyond that

    /// Whether a section but the one at `except` (-1: any) has the key of `section`.
    bool IsTaken(const CCrossSection& section, int except = -1) const;
    /// The section of the branch nearest to the chainage; -1 without any.
    int Nearest(const QString& branch, double chainage) const;
    /// The branches in the order in which they are first met.
    QStringList Branches() const;
    /// Indexes of the sections: branches in the order of Branches(), chainages increasing within one.
    std::vector<int> ByPlace() const;
    void SortByPlace();
};

/// The water surface in a section: its level, and where it meets the ground.
struct CWaterSurface
{
    double level = 0, left = 0, right = 0; // metres
    bool operator==(const CWaterSurface&) const = default;
};

/// The lowest surface about the deepest point that is as wide as the section's width says. Nothing without a width, or
/// where such a surface would run over an end of the section. Where a bank is overtopped the surface widens at once:
/// the width may be less than asked for.
std::optional<CWaterSurface> WaterSurface(const CCrossSection& section);
