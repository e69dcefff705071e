#include "editors/network/map_selection.h"

#include <algorithm>
#include <utility>

CMapSelection::CMapSelection(const CNetworkDoc& document) : m_document(document) {}

void CMapSelection::SetLocations(std::vector<CMapLocation> locations)
{
    const auto before = std::exchange(m_locations, std::move(locations));
    const auto old = std::exchange(m_selected, std::nullopt);
    for (std::size_t i = 0; old && !m_selected && i < m_locations.size(); ++i) {
        const CMapLocation &each = m_locations[i], &selected = before[*old];
        if (each.kind == selected.kind && each.chainage == selected.chainage && each.branch == selected.branch &&
            each.file == selected.file)
            m_selected = i;
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

std::optional<CMapPlace> CMapSelection::Picked() const
{
    return m_picked && PointOf(*m_picked) ? m_picked : std::nullopt;
}

void CMapSelection::Pick(std::optional<CMapPlace> place)
{
    if (place == m_picked)
        return;
    m_picked = std::move(place);
    emit Changed();
    emit PickedChanged();
}

void CMapSelection::SetSelected(std::optional<std::size_t> location)
{
    if (std::exchange(m_selected, location) != location)
        emit Changed();
}

void CMapSelection::Select(std::size_t location)
{
    SetSelected(location);
    Pick(CMapPlace{m_locations[location].branch, m_locations[location].chainage});
}

void CMapSelection::Unselect()
{
    SetSelected(std::nullopt);
}

void CMapSelection::Show(std::optional<CMapPlace> place)
{
    m_shown = std::move(place);
    emit Changed();
}

std::optional<std::size_t> CMapSelection::Next(int step) const
{
    if (m_placed.empty())
        return std::nullopt;
    auto order = m_placed;
    std::stable_sort(order.begin(), order.end(), [this](const CPlacedLocation& a, const CPlacedLocation& b) {
        return std::pair(a.branch, m_locations[a.location].chainage) <
               std::pair(b.branch, m_locations[b.location].chainage);
    });
    const auto present = std::find_if(order.begin(), order.end(),
                                      [this](const CPlacedLocation& each) { return each.location == m_selected; });
    const auto count = std::ssize(order);
    const std::ptrdiff_t from = present == order.end() ? (step > 0 ? -1 : count) : present - order.begin();
    return order[std::size_t((from + step + count) % count)].location;
}

std::optional<CMapPlace> CMapSelection::Marked() const
{
    if (const auto picked = Picked())
        return picked;
    return m_shown && PointOf(*m_shown) ? m_shown : std::nullopt;
}
