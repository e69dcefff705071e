// What is marked on the map.
#pragma once

#include "editors/network/map_scene.h"

#include <QObject>
#include <optional>

/// The locations on a map, and what is marked there: the place that the user picked, the location that he selected, the
/// place that another editor shows.
class CMapSelection : public QObject
{
    Q_OBJECT
public:
    /// The document outlives the selection.
    explicit CMapSelection(const CNetworkDoc& document) : m_document(document) {}

    const std::vector<CMapLocation>& Locations() const { return m_locations; }
    /// Those that are at a place of the network.
    const std::vector<CPlacedLocation>& Placed() const { return m_placed; }
    /// A selection goes on with the same location, wherever it stands now.
    void SetLocations(std::vector<CMapLocation> locations);
    /// Finds their places anew, after the network changed.
    void PlaceAll();
    /// In map coordinates; none for a place that is not in the network.
    std::optional<QPointF> PointOf(const CMapPlace& place) const;

    /// While they are in the network.
    std::optional<CMapPlace> Picked() const { return InNetwork(m_picked); }
    std::optional<CMapPlace> Shown() const { return InNetwork(m_shown); }
    void Pick(std::optional<CMapPlace> place);
    void Show(std::optional<CMapPlace> place);
    /// Null for none. Valid until the locations change.
    const CMapLocation* Selected() const { return m_selected ? &m_locations[*m_selected] : nullptr; }
    const std::optional<std::size_t>& SelectedIndex() const { return m_selected; }
    /// The place picked, else the one shown, while it is in the network.
    std::optional<CMapPlace> Marked() const;
    /// One of the list, which is the place picked, too; or none.
    void Select(std::optional<std::size_t> location);
    /// The location that follows the one selected along the branches, or precedes it; none when there are none.
    std::optional<std::size_t> Next(int step) const;

signals:
    void LocationsChanged();
    void PickedChanged();
    /// Anything that is marked is another.
    void Changed();

private:
    std::optional<CMapPlace> InNetwork(const std::optional<CMapPlace>& place) const;

    const CNetworkDoc& m_document;
    std::vector<CMapLocation> m_locations;
    std::vector<CPlacedLocation> m_placed;
    std::optional<CMapPlace> m_picked, m_shown;
    std::optional<std::size_t> m_selected;
};
