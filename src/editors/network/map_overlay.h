// What stands on the map and does not move with it: legend, scale bar, marks. All in pixels of the user.
#pragma once

#include "editors/network/map_style.h"
#include "ks/fc/exchange.h"

#include <QPainter>
#include <QString>
#include <array>

/// A place as the user reads it: "BRANCH 1234.5", in the user's unit of chainages.
QString PlaceText(const QString& branch, double chainage);

/// Names the kinds of locations, with how many of each are drawn. `elsewhere`: locations that are not in the network.
void PaintLegend(QPainter& painter, const CMapStyle& style, const QRect& window,
                 const std::array<int, HDDataTypeCount>& counts, int elsewhere);
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
