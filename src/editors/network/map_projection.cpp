#include "editors/network/map_projection.h"

#include "editors/network/network.h"

#include <algorithm>
#include <cmath>

namespace {

constexpr double FitMargin = 56;   // pixels of the user
constexpr double MostMargin = 0.2; // of the window, on either side
constexpr double MaxScale = 40;  // of these a metre

/// The projection that shows all of the network in a part of the window.
CMapProjection FitInto(CMapProjection projection, const CNetwork& network, const QRectF& part, double ratio)
{
    const QRectF extent = network.Extent();
    const auto inside = [ratio](double size) {
        return std::max(size - 2 * std::min(FitMargin * ratio, MostMargin * size), 1.0);
    };
    const double width = inside(part.width()), height = inside(part.height());
    if (extent.width() > 0 || extent.height() > 0)
        projection.scale = std::min(extent.width() > 0 ? width / extent.width() : HUGE_VAL,
                                    extent.height() > 0 ? height / extent.height() : HUGE_VAL);
    projection.scale = std::min(projection.scale, MaxScale * ratio);
    projection.offset = (part.center() - projection.ToPlane(extent.center())).toPoint();
    return projection;
}

/// Whether a branch goes through a part of the window.
bool IsUnder(const CMapProjection& projection, const CNetwork& network, const QRectF& part)
{
    const QRectF map = QRectF(projection.ToMap(part.topLeft()), projection.ToMap(part.bottomRight())).normalized();
    return std::ranges::any_of(network.branches, [&map](const CNetworkBranch& branch) {
        return std::ranges::any_of(branch.line, [&map](const QPointF& point) { return map.contains(point); });
    });
}

} // namespace

void CMapProjection::Fit(const CNetwork& network, const QRectF& window, const QRectF& legend, double ratio)
{
    constexpr double small = 0.6; // of the scale that the whole window allows
    origin = network.Extent().center();
    *this = FitInto(*this, network, window, ratio);
    if (legend.isEmpty())
        return;
    const double beside = FitMargin * ratio; // where symbols of a branch may stand
    if (!IsUnder(*this, network, legend.adjusted(-beside, 0, 0, beside)))
        return;
    QRectF left = window, below = window;
    left.setRight(legend.left());
    below.setTop(legend.bottom());
    const CMapProjection parts[] = {FitInto(*this, network, left, ratio), FitInto(*this, network, below, ratio)};
    const CMapProjection& larger = parts[parts[0].scale > parts[1].scale ? 0 : 1];
    if (larger.scale >= small * scale)
        *this = larger;
}

void CMapProjection::Zoom(const CNetwork& network, const QRectF& window, const QPointF& at, double factor, double ratio)
{
    const double low = std::min(FitInto(*this, network, window, ratio).scale / 2, scale);
    const QPointF there = ToMap(at);
    scale = std::clamp(scale * factor, low, std::max(low, MaxScale * ratio));
    offset = (at - ToPlane(there)).toPoint();
}
