// Between points of the map and places on branches.
//
// A chainage is interpolated between those of a branch's ends in proportion to the length along its line: an
// interpolative linear referencing method as in ISO 19148:2021, Geographic information - Linear referencing. The
// nearest point of a segment is the point's orthogonal projection, limited to the segment's ends (C. Ericson, Real-Time
// Collision Detection, 2005, section 5.1.2).
#pragma once

#include "editors/network/network.h"

#include <cmath>
#include <optional>

struct CNetworkPlace
{
    int branch = -1; // in the network
    double chainage = 0;
    QPointF point;       // on the line
    double distance = 0; // from the point that was asked for, metres
};

/// The lines of a network, prepared. Copies what it needs; to be made anew when the network changes.
class CLinearReference
{
public:
    CLinearReference() = default;
    explicit CLinearReference(const CNetwork& network);

    /// The nearest place not farther than `tolerance` metres. Branches without a line have no places.
    std::optional<CNetworkPlace> Nearest(const QPointF& point, double tolerance = HUGE_VAL) const;
    /// Where a chainage is; none outside the branch or for a branch without a line.
    std::optional<QPointF> PointAt(int branch, double chainage) const;
    /// Metres from the first vertex along the line, under the same conditions.
    std::optional<double> DistanceAt(int branch, double chainage) const;

private:
    struct Chunk // some segments that follow one another
    {
        std::size_t first, last; // vertices, both included
        QRectF box;
    };
    struct Line
    {
        double start = 0, end = 0;
        std::vector<QPointF> points;
        std::vector<double> along; // metres from the first vertex, for each vertex
        std::vector<Chunk> chunks;
        QRectF box;
    };
    static Line Prepare(const CNetworkBranch& branch);
    static void Search(const Line& line, const Chunk& chunk, const QPointF& point, CNetworkPlace& best, bool& found);
    std::vector<Line> m_lines; // as the network's branches
};

/// The point of a segment that is nearest to `point`, as the part of the way from `a` to `b`.
double NearestPart(const QPointF& point, const QPointF& a, const QPointF& b);
