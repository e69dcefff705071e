// What the map shows, computed on the plane of one scale: lines, arrows, names and symbols with their places.
#pragma once

#include "editors/network/document.h"
#include "editors/network/location_kinds.h"
#include "editors/network/plane_line.h"

#include <QFont>
#include <QPainterPath>
#include <array>

/// A location whose branch and chainage are on the map.
struct CPlacedLocation
{
    std::size_t location = 0; // in the list of locations
    int kind = 0;
    int branch = 0;
    double part = 0; // of the way along the line
    QPointF map;     // map coordinates
};

/// The places of locations; those that are nowhere in the network are left out. Kinds stand in the order of drawing.
std::vector<CPlacedLocation> PlaceLocations(const CNetworkDoc& document, const std::vector<CMapLocation>& locations);

/// The names of the branches as outlines around zero, in device pixels.
std::vector<QPainterPath> NameOutlines(const CNetwork& network, QFont font, double ratio);

/// All of it in device pixels.
struct CMapScene
{
    struct Arrow
    {
        QPointF at, direction;
    };
    struct Label
    {
        std::size_t branch;
        QPointF center;
        double angle; // degrees, clockwise
        QRectF box;   // around the turned text
    };
    struct Symbol
    {
        QPointF foot, at; // on the branch, and beside it where the symbol is
        int kind;
        std::size_t location;
    };

    /// `outlines` of the names outlive the scene; `pixels`: of the device a pixel of the user's.
    CMapScene(const CNetwork& network, const std::vector<CPlacedLocation>& placed, const CMapProjection& projection,
              const std::vector<QPainterPath>& outlines, double pixels);

    /// The symbol that is drawn at a place of the plane, of several the one nearest and, of equals, drawn last; null
    /// for none.
    const Symbol* SymbolAt(const QPointF& plane) const;
    /// The symbol of a location; null for one that is not on the map.
    const Symbol* SymbolOf(std::size_t location) const;

    static constexpr double SymbolSize = 11, LaneWidth = 10; // pixels of the user

    double ratio;                           // device pixels a pixel of the user's
    const std::vector<QPainterPath>& names; // as the network's branches
    std::vector<CPlaneLine> lines;          // likewise
    std::vector<Arrow> arrows;
    std::vector<Label> labels;
    std::vector<Symbol> symbols;
    bool leaders = false; // from symbols to their branch
    bool casings = false; // around lines
};
