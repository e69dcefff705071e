#include "editors/network/map_fit.h"

namespace {

constexpr double FitMargin = 56; // pixels of the user
constexpr double MaxScale = 40;  // pixels a metre

void FitInto(CMapProjection& projection, const CNetwork& network, const CMapWindow& part)
{
    projection.Fit(network.Extent(), QRectF(part.rect.topLeft() * part.ratio, part.rect.size() * part.ratio),
                   FitMargin * part.ratio, MaxScale * part.ratio);
}

/// Whether a branch goes through a part of the window.
bool IsUnder(const CMapProjection& projection, const CNetwork& network, const CMapWindow& part)
{
    const QRectF map = QRectF(projection.ToMap(part.rect.topLeft() * part.ratio),
                              projection.ToMap(part.rect.bottomRight() * part.ratio))
                           .normalized();
    return std::any_of(network.branches.begin(), network.branches.end(), [&map](const CNetworkBranch& branch) {
        return std::any_of(branch.line.begin(), branch.line.end(),
                           [&map](const QPointF& point) { return map.contains(point); });
    });
}

} // namespace

void FitNetwork(CMapProjection& projection, const CNetwork& network, const CMapWindow& window, const QRectF& legend)
{
    constexpr double small = 0.6; // of the scale that the whole window allows
    projection.origin = network.Extent().center();
    FitInto(projection, network, window);
    // Symbols stand beside their branch.
    if (!IsUnder(projection, network, {legend.adjusted(-FitMargin, 0, 0, FitMargin), window.ratio}))
        return;
    CMapProjection beside = projection, below = projection;
    CMapWindow left = window, under = window;
    left.rect.setRight(legend.left());
    under.rect.setTop(legend.bottom());
    FitInto(beside, network, left);
    FitInto(below, network, under);
    const CMapProjection& larger = beside.scale > below.scale ? beside : below;
    if (larger.scale >= small * projection.scale)
        projection = larger;
}

void ZoomNetwork(CMapProjection& projection, const CNetwork& network, const CMapWindow& window, const QPointF& at,
                 double factor)
{
    CMapProjection all = projection;
    FitInto(all, network, window);
    const double low = std::min(all.scale / 2, projection.scale), high = std::max(low, MaxScale * window.ratio);
    projection.ZoomAt(at * window.ratio, std::clamp(projection.scale * factor, low, high));
}
