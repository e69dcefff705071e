// Between points of the map and places on branches.
//
// A chainage is interpolated between those of a branch's ends in proportion to the length along its line: an
// interpolative linear referencing method as in ISO 19148:2021, Geographic information - Linear referencing. The
// nearest point of a segment is the point's orthogonal projection, limited to the segment's ends (C. Ericson, Real-Time
// Collision Detection, 2005, section 5.1.2).
#pragma once

#include "editors/network/measured_line.h"
#include "editors/network/network.h"

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

private:
    struct Line : CMeasuredLine
    {
        explicit Line(const CNetworkBranch& branch);
        double start, end;
        QRectF box;
    };
    std::vector<Line> m_lines; // as the network's branches
};
