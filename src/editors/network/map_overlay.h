// What stands on the map and does not move with it: legend, scale bar, marks. All in pixels of the user.
#pragma once

#include "editors/network/map_style.h"
#include "ks/fc/exchange.h"

#include <QPainter>
#include <QString>
#include <array>

/// A place as the user reads it: "BRANCH 1234.5 m", in the user's unit of chainages.
QString PlaceText(const QString& branch, double chainage);

/// The kinds of locations, with how many of each are drawn.
struct CLegend
{
    std::array<int, HDDataTypeCount> counts{};
    int elsewhere = 0; // locations that are not in the network
};
/// Where the legend stands: in the upper right corner.
QRect LegendBox(const QFontMetrics& metrics, const QRect& window, const CLegend& legend);
void PaintLegend(QPainter& painter, const CMapStyle& style, const QRect& window, const CLegend& legend);
/// `scale`: pixels a metre.
void PaintScaleBar(QPainter& painter, const CMapStyle& style, const QRect& window, double scale);
void PaintPicked(QPainter& painter, const CMapStyle& style, const QRect& window, const QPointF& at,
                 const QString& label);
void PaintPlaceLabel(QPainter& painter, const CMapStyle& style, const QRect& window, const QPointF& at,
                     const QString& label);
void PaintSelected(QPainter& painter, const CMapStyle& style, const QPointF& at);
void PaintShown(QPainter& painter, const CMapStyle& style, const QPointF& at);
void PaintHint(QPainter& painter, const CMapStyle& style, const QRect& window, const QString& text);
void PaintFocus(QPainter& painter, const CMapStyle& style, const QRect& window);
