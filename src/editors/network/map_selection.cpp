#include "editors/network/map_selection.h"

#include <algorithm>
#include <utility>

void CMapSelection::SetLocations(std::vector<CMapLocation> locations)
{
    const auto before = std::exchange(m_locations, std::move(locations));
    if (m_selected) {
        const auto found = std::ranges::find(m_locations, before[*m_selected]);
        m_selected = found == m_locations.end() ? std::nullopt : std::optional(found - m_locations.begin());
    }
    PlaceAll();
}

void CMapSelection::PlaceAll()
{
    m_placed = PlaceLocations(m_document, m_locations);
    emit LocationsChanged();
}

std::optional<QPointF> CMapSelection::PointOf(const CMapPlace& place) const
{
    return m_document.Reference().PointAt(m_document.Network().FindBranch(place.branch), place.chainage);
}

std::optional<CMapPlace> CMapSelection::InNetwork(const std::optional<CMapPlace>& place) const
{
    return place && PointOf(*place) ? place : std::nullopt;
}

std::optional<CMapPlace> CMapSelection::Marked() const
{
    const auto picked = Picked();
    return picked ? picked : Shown();
}

void CMapSelection::Pick(std::optional<CMapPlace> place)
{
    if (place == m_picked)
        return;
    m_picked = std::move(place);
    emit Changed();
    emit PickedChanged();
}

void CMapSelection::Show(std::optional<CMapPlace> place)
{
    m_shown = std::move(place);
    emit Changed();
}

void CMapSelection::Select(std::optional<std::size_t> location)
{
    if (std::exchange(m_selected, location) != location)
        emit Changed();
    if (location)
        Pick(m_locations[*location]);
}

std::optional<std::size_t> CMapSelection::Next(int step) const
{
    if (m_placed.empty())
        return std::nullopt;
    auto order = m_placed;
    std::ranges::stable_sort(order, {}, [this](const CPlacedLocation& each) {
        return std::pair(each.branch, m_locations[each.location].chainage);
    });
    const auto present = std::ranges::find(order, m_selected, &CPlacedLocation::location);
    const auto count = std::ssize(order);
    const std::ptrdiff_t from = present == order.end() ? (step > 0 ? -1 : count) : present - order.begin();
    return order[std::size_t((from + step + count) % count)].location;
}
