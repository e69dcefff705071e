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

class CMapScene
{
public:
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

    /// `ratio`: device pixels a pixel of the user's. `names` outlives the scene.
    CMapScene(const CNetwork& network, const std::vector<CPlacedLocation>& placed, const CMapProjection& projection,
              const std::vector<QPainterPath>& names, double ratio);
    ~CMapScene();

    const std::vector<CPlaneLine>& Lines() const { return m_lines; } // as the network's branches
    const std::vector<Arrow>& Arrows() const { return m_arrows; }
    const std::vector<Label>& Labels() const { return m_labels; }
    const std::vector<Symbol>& Symbols() const { return m_symbols; }
    /// The symbol that is drawn at a place of the plane, of several the one nearest and, of equals, drawn last; null
    /// for none.
    const Symbol* SymbolAt(const QPointF& plane) const;
    /// The symbol of a location; null for one that is not on the map.
    const Symbol* SymbolOf(std::size_t location) const;
    const QPainterPath& Text(std::size_t branch) const { return m_texts[branch]; }
    bool HasLeaders() const { return m_leaders; }
    bool HasCasings() const { return m_casings; }
    double Ratio() const { return m_ratio; }

    static constexpr double SymbolSize = 11, LaneWidth = 10; // pixels of the user

private:
    void AddSymbols(const std::vector<CPlacedLocation>& placed, const CMapProjection& projection);
    void AddArrows(const CNetwork& network);
    void AddObstacles();
    void AddLabels();
    void AddLabel(std::size_t branch, double distance, double shift, const QRectF& text);
    Label LabelAt(std::size_t branch, double distance, double side, const QRectF& text, double& bulge) const;

    double m_ratio;
    double m_length = 0; // of all lines
    double m_lanes = 0;  // half the width of the symbols' band
    bool m_leaders = false, m_casings = false;
    std::vector<CPlaneLine> m_lines;
    std::vector<Arrow> m_arrows;
    std::vector<Label> m_labels;
    std::vector<Symbol> m_symbols;
    const std::vector<QPainterPath>& m_texts;
    class Boxes;
    std::unique_ptr<Boxes> m_labelBoxes, m_obstacles; // while labels are placed
};
