// What stands on the map and does not move with it: legend, scale bar, marks. All in pixels of the user.
#pragma once

#include "editors/network/map_selection.h"
#include "editors/network/map_style.h"

#include <QPainter>
#include <array>

/// A place as the user reads it: "BRANCH 1234.5 m", in the user's unit of chainages.
QString PlaceText(const CMapPlace& place);

/// The kinds of locations, with how many of each are drawn.
struct CLegend
{
    std::array<int, HDDataTypeCount> counts{};
    int elsewhere = 0; // locations that are not in the network
};
CLegend LegendOf(const CMapSelection& marks);
/// Where the legend stands: in the upper right corner; empty where it would cover most of a small map.
QRect LegendBox(const QFontMetrics& metrics, const QRect& window, const CLegend& legend);

struct CMapOverlay
{
    CLegend legend;
    double scale;                                   // pixels a metre
    std::optional<QPointF> shown, selected, picked; // where they are
    QString label;                                  // of what is marked
    QString hint;                                   // instead of a map
    bool focus;                                     // has the map
};
void PaintOverlay(QPainter& painter, const CMapStyle& style, const QRect& window, const CMapOverlay& overlay);
