// The network's view among other editors: what it answers them, and the locations it gets from the HD documents.
#include "editors/network/location_source.h"
#include "editors/network/view.h"
#include "ks/fc/branch_name.h"
#include "ks/fc/file_name.h"
#include "ks/fc/shown_text.h"

#include <QElapsedTimer>
#include <QHash>
#include <QMenu>
#include <algorithm>
#include <cmath>
#include <functional>

namespace {
constexpr int PauseFactor = 4; // of the time that the last refresh took
} // namespace

// ---- requests ----------------------------------------------------------------------------------

CTablesView::Answer CNetworkView::AnswerTo(WPARAM request)
{
    switch (request) {
    case KsRequest::FetchLocation:
        return std::bind_front(&CNetworkView::FetchLocation, this);
    case KsRequest::LoadLocationsAndChannel:
        return std::bind_front(&CNetworkView::FillChannel, this);
    case KsRequest::Branches:
        return std::bind_front(&CNetworkView::TellBranches, this);
    case KsRequest::LoadLocations: // a network has branches, but no list of locations
        return [](CObList&) { return 0; };
    default:
        return nullptr;
    }
}

LRESULT CNetworkView::FetchLocation(CObList& objects)
{
    const auto picked = m_map->Marks().Picked();
    if (!picked)
        return 0;
    auto item = std::make_unique<CKvrCBELocation>();
    item->branch = picked->branch;
    item->chainage = picked->chainage;
    objects.push_back(std::move(item));
    return 1;
}

LRESULT CNetworkView::TellBranches(CObList& objects) const
{
    for (const CNetworkBranch& branch : Document()->Network().branches) {
        auto item = std::make_unique<CKvrCBEBranch>();
        item->name = branch.Name();
        item->start = branch.start;
        item->end = branch.end;
        item->downstream = branch.downstream;
        objects.push_back(std::move(item));
    }
    return !objects.empty();
}

QStringList CNetworkView::KnownBranches() const
{
    QStringList branches;
    for (const CNetworkBranch& branch : Document()->Network().branches)
        branches << branch.Name();
    return branches;
}

/// Radius and width where the list lacks them and the tables have them.
LRESULT CNetworkView::FillChannel(CObList& objects)
{
    QHash<QString, const CNetworkBranch*> branches;
    for (const CNetworkBranch& branch : Document()->Network().branches)
        branches.insert(KsBranchKey(branch.Name()), &branch);
    bool filled = false;
    for (const auto& object : objects) {
        auto* item = dynamic_cast<CKvrCBELocation*>(object.get());
        const CNetworkBranch* branch = item ? branches.value(KsBranchKey(item->branch)) : nullptr;
        if (!branch)
            continue;
        const auto& channel = branch->channel;
        for (const auto& [to, from] : {std::pair(&CKvrCBELocation::radius, &CChannelRow::radius),
                                       std::pair(&CKvrCBELocation::width, &CChannelRow::width)}) {
            if (!std::isnan(item->*to))
                continue;
            item->*to = ChannelValue(channel, from, item->chainage);
            filled = filled || !std::isnan(item->*to);
        }
    }
    return filled;
}

void CNetworkView::ShowLocation(const CKvrCBELocation& location)
{
    m_map->ShowPlace({location.branch, location.chainage});
}

void CNetworkView::OnProjectsChanged()
{
    CTablesView::OnProjectsChanged();
    if (m_map)
        LocationsChanged();
}

// ---- locations ---------------------------------------------------------------------------------

/// They are fetched soon, but not within the message that tells of the change: its sender is busy.
void CNetworkView::LocationsChanged()
{
    m_stale = true;
    if (isVisible())
        m_refresh.start();
}

void CNetworkView::showEvent(QShowEvent* event)
{
    CKsProjectView::showEvent(event);
    if (m_stale && m_map)
        m_refresh.start();
}

void CNetworkView::RefreshLocations()
{
    // A document that is being saved does not answer: its locations stay until it does.
    const auto views = Document()->ProjectViews(this);
    if (std::any_of(views.begin(), views.end(), [](CView* view) { return view->GetDocument()->IsExecuting(); })) {
        m_refresh.start();
        return;
    }
    m_stale = false;
    QElapsedTimer time;
    time.start();
    auto locations = LocationSource::Fetch(*this);
    // Of what the user edits most are values, of which the map shows nothing.
    if (locations != m_map->Marks().Locations())
        m_map->Marks().SetLocations(std::move(locations));
    // Where that takes long, it waits until there is a pause in the changes.
    m_refresh.setInterval(int(std::max<qint64>(RefreshDelay, PauseFactor * time.elapsed())));
}

/// A copy, for the map's own list may change meanwhile.
void CNetworkView::Send(WPARAM request, CMapLocation location)
{
    LocationSource::Send(*this, request, location);
    LocationsChanged();
}

void CNetworkView::DeleteLocation()
{
    if (const CMapLocation* selected = m_map->Marks().Selected())
        Send(KsRequest::DeleteData, *selected);
}

/// The table follows the map.
void CNetworkView::PickedChanged()
{
    const auto picked = m_map->Marks().Picked();
    const int branch = picked ? Document()->Network().FindBranch(picked->branch) : -1;
    if (branch >= 0 && branch != CurrentLine() && !IsEditing()) // what is refused stays in its cell
        Branches()->ShowLine(branch + 1, BranchName + 1);
}

std::unique_ptr<QMenu> CNetworkView::MapMenu()
{
    auto menu = std::make_unique<QMenu>(this);
    if (const CMapLocation* selected = m_map->Marks().Selected()) {
        menu->addAction(tr("&Show in HD Parameters"), this,
                        [this, location = *selected] { LocationSource::Show(*this, location); });
        menu->addAction(tr("&Delete Location"), Qt::Key_Delete, this, &CNetworkView::DeleteLocation);
        menu->addSeparator();
    }
    const auto picked = m_map->Marks().Picked();
    const QStringList files = picked ? LocationSource::Files(*this) : QStringList();
    if (files.isEmpty())
        return menu;
    QMenu* insert = menu->addMenu(tr("&Insert Here as"));
    for (int kind = 0; kind < HDDataTypeCount; ++kind) {
        // With one HD document there is nothing to choose.
        QMenu* among = files.size() > 1 ? insert->addMenu(LocationKindName(kind)) : insert;
        for (const QString& file : files) {
            among->addAction(
                files.size() > 1 ? KsWithoutMnemonics(KsShownFileName(file)) : LocationKindName(kind), this,
                [this, location = CMapLocation{*picked, kind, file}] { Send(KsRequest::InsertData, location); });
        }
    }
    return menu;
}
