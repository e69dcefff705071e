// Which part of a network a window shows.
#pragma once

#include "editors/network/map_projection.h"
#include "editors/network/network.h"

/// A window of the user's pixels, and how many pixels of the device one of them is.
struct CMapWindow
{
    QRectF rect;
    double ratio = 1;
};

/// Shows the whole network: in the whole window, or, when the legend would cover branches, in the larger part beside
/// it; but the legend rather covers something than that the network becomes small.
void FitNetwork(CMapProjection& projection, const CNetwork& network, const CMapWindow& window, const QRectF& legend);
/// Zooms around a point of the window, not farther out than half of what shows everything.
void ZoomNetwork(CMapProjection& projection, const CNetwork& network, const CMapWindow& window, const QPointF& at,
                 double factor);
