// What is marked on the map.
#pragma once

#include "editors/network/map_scene.h"

#include <QObject>
#include <optional>

/// A place on a branch, by name.
struct CMapPlace
{
    QString branch;
    double chainage = 0; // metres
    bool operator==(const CMapPlace&) const = default;
};

/// The locations on a map, and what is marked there: the place that the user picked, the location that he selected, the
/// place that another editor shows.
class CMapSelection : public QObject
{
    Q_OBJECT
public:
    /// The document outlives the selection.
    explicit CMapSelection(const CNetworkDoc& document);

    const std::vector<CMapLocation>& Locations() const { return m_locations; }
    /// Those that are at a place of the network.
    const std::vector<CPlacedLocation>& Placed() const { return m_placed; }
    /// A selection goes on with the same location, wherever it stands now.
    void SetLocations(std::vector<CMapLocation> locations);
    /// Finds their places anew, after the network changed.
    void PlaceAll();
    /// In map coordinates; none for a place that is not in the network.
    std::optional<QPointF> PointOf(const CMapPlace& place) const;

    /// While it is in the network.
    std::optional<CMapPlace> Picked() const;
    void Pick(std::optional<CMapPlace> place);
    /// By its place in the list.
    std::optional<std::size_t> Selected() const { return m_selected; }
    /// The location is the place picked, too.
    void Select(std::size_t location);
    void Unselect();
    const std::optional<CMapPlace>& Shown() const { return m_shown; }
    void Show(std::optional<CMapPlace> place);
    /// The location that follows the one selected along the branches, or precedes it; none when there are none.
    std::optional<std::size_t> Next(int step) const;

    /// The place picked, else the one shown, while it is in the network.
    std::optional<CMapPlace> Marked() const;

signals:
    void LocationsChanged();
    void PickedChanged();
    /// Anything that is marked is another.
    void Changed();

private:
    void SetSelected(std::optional<std::size_t> location);

    const CNetworkDoc& m_document;
    std::vector<CMapLocation> m_locations;
    std::vector<CPlacedLocation> m_placed;
    std::optional<CMapPlace> m_picked, m_shown;
    std::optional<std::size_t> m_selected;
};
