// The cross sections' view among other editors: what it answers them, and the place it shows them.
#include "editors/cross_sections/view.h"

#include "ks/fc/branch_name.h"

#include <QScopedValueRollback>
#include <algorithm>
#include <cmath>
#include <functional>
#include <map>

CTablesView::Answer CCrossSectionView::AnswerTo(WPARAM request)
{
    switch (request) {
    case KsRequest::LoadLocations:
        return std::bind_front(&CCrossSectionView::LoadLocations, this);
    case KsRequest::LoadLocationsAndChannel:
        return std::bind_front(&CCrossSectionView::FillChannel, this);
    case KsRequest::BedLevels:
        return std::bind_front(&CCrossSectionView::LoadBedLevels, this);
    default:
        return nullptr;
    }
}

LRESULT CCrossSectionView::LoadLocations(CObList& objects) const
{
    const CCrossSections& all = Document()->Sections();
    for (const int index : all.ByPlace()) {
        const CCrossSection& section = all.sections[std::size_t(index)];
        auto item = std::make_unique<CKvrCBELocation>();
        item->branch = section.Branch();
        item->chainage = section.chainage;
        objects.push_back(std::move(item));
    }
    return !all.sections.empty();
}

LRESULT CCrossSectionView::LoadBedLevels(CObList& objects) const
{
    const CCrossSections& all = Document()->Sections();
    for (const int index : all.ByPlace()) {
        const CCrossSection& section = all.sections[std::size_t(index)];
        const auto& points = section.points;
        if (points.empty())
            continue;
        const auto deepest = std::ranges::min_element(points, {}, &CSectionPoint::level);
        auto item = std::make_unique<CKvrCBEBedLevel>();
        item->branch = section.Branch();
        item->chainage = section.chainage;
        item->bed = deepest->level;
        item->leftBank = std::ranges::max_element(points.begin(), deepest + 1, {}, &CSectionPoint::level)->level;
        item->rightBank = std::ranges::max_element(deepest, points.end(), {}, &CSectionPoint::level)->level;
        objects.push_back(std::move(item));
    }
    return !all.sections.empty();
}

/// Radius and width where the list lacks them and a section at the place has them.
LRESULT CCrossSectionView::FillChannel(const CObList& objects) const
{
    std::multimap<std::pair<QString, double>, const CCrossSection*> places;
    for (const CCrossSection& section : Document()->Sections().sections)
        places.emplace(std::pair(KsBranchKey(section.Branch()), PlaceOf(section.chainage)), &section);
    bool filled = false;
    for (const auto& object : objects) {
        auto* item = dynamic_cast<CKvrCBELocation*>(object.get());
        if (!item)
            continue;
        const auto [first, last] = places.equal_range({KsBranchKey(item->branch), PlaceOf(item->chainage)});
        for (auto place = first; place != last; ++place) {
            for (const auto& [to, from] : {std::pair(&CKvrCBELocation::radius, &CCrossSection::radius),
                                           std::pair(&CKvrCBELocation::width, &CCrossSection::width)}) {
                if (!std::isnan(item->*to) || std::isnan(place->second->*from))
                    continue;
                item->*to = place->second->*from;
                filled = true;
            }
        }
    }
    return filled;
}

/// Goes to the nearest section, unless the one that is shown is as near.
void CCrossSectionView::ShowLocation(const CKvrCBELocation& location)
{
    // An answer to what this view tells would move its user away, and so would any place while a cell is being typed.
    if (m_telling || IsEditing())
        return;
    const int nearest = Document()->Sections().Nearest(location.branch, location.chainage);
    const CCrossSection *there = Document()->Section(nearest), *here = Document()->Section(CurrentSection());
    if (!there || (here && KsSameBranch(here->Branch(), there->Branch()) &&
                   std::abs(here->chainage - location.chainage) <= std::abs(there->chainage - location.chainage)))
        return;
    const QScopedValueRollback showing(m_showing, true);
    GoToSection(nearest);
}

/// Tells the project where the user looks now; not while another editor leads.
void CCrossSectionView::TellLocation()
{
    const CCrossSection* section = Document()->Section(CurrentSection());
    if (!section || (section->Branch() == m_toldBranch && section->chainage == m_toldChainage))
        return;
    m_toldBranch = section->Branch();
    m_toldChainage = section->chainage;
    if (m_showing || m_telling)
        return;
    const QScopedValueRollback telling(m_telling, true);
    Document()->LocationShown(this, m_toldBranch, m_toldChainage);
}
