// The view and the other editors of the project: what it answers, what it asks and what it tells.
#include "module/view.h"

#include "grid/gen_grid.h"
#include "ks/fc/branch_name.h"
#include "ks/fc/exchange.h"
#include "ks/fc/message_box.h"
#include "module/kavo0_hd.h"
#include "pages/framework/page.h"
#include "problems/problem_check.h"
#include "profile/profile_panel.h"
#include "res/strings.h"

#include <QTimer>
#include <cmath>
#include <iterator>

LRESULT CKavo0_hdView::OnRequest(WPARAM request, CKSComm_Package& package)
{
    if (request == KsRequest::DataChanged && m_profile)
        m_profile->Refresh(); // cross sections may be other ones
    if (request == KsRequest::DataChanged && m_problems)
        m_problems->RiverChanged();
    if (request == KsRequest::LocationShown && m_profile && package.objects)
        for (const auto& object : *package.objects)
            if (const auto* place = dynamic_cast<const CKvrCBELocation*>(object.get()))
                m_profile->SetPlace(place->branch, place->chainage);
    if (request != KsRequest::GetData && request != KsRequest::InsertData && request != KsRequest::DeleteData)
        return 0;
    // One of these documents never meets the requests of another.
    if (!package.view || !package.objects || qobject_cast<CKavo0_hdView*>(package.view)) {
        qDebug("HD data exchange: a request without sender or list, or of this editor; nothing is done");
        return 0;
    }
    if (request == KsRequest::InsertData) {
        CKavo0_hd::InsertData({}, this, package.objects);
    } else if (request == KsRequest::DeleteData) {
        CKavo0_hd::DeleteData({}, this, package.objects);
    } else if (const std::unique_ptr<CObList> items{CKavo0_hd::GetData({}, this)}) {
        package.objects->insert(package.objects->end(), std::make_move_iterator(items->begin()),
                                std::make_move_iterator(items->end()));
    }
    return 0;
}

void CKavo0_hdView::OnProjectsChanged()
{
    CKsProjectView::OnProjectsChanged();
    if (m_problems)
        m_problems->RiverChanged();
}

/// The news waits until the present event is over: a row becomes current in the middle of changes, and who hears of it
/// asks at once. Many moves in one event are told once.
void CKavo0_hdView::TellLocationLater()
{
    if (GetDocument()->ProjectHandle() && !std::exchange(m_tellLocation, true))
        QTimer::singleShot(0, this, &CKavo0_hdView::TellLocation);
}

/// The current line may be at another place now, or another page has come to the front.
void CKavo0_hdView::TellLocationIfOther()
{
    if (CurrentLocation() != m_toldLocation)
        TellLocationLater();
}

void CKavo0_hdView::TellLocation()
{
    m_tellLocation = false;
    if (!GetDocument())
        return;
    m_toldLocation = CurrentLocation();
    if (!m_toldLocation.first.isEmpty())
        GetDocument()->LocationShown(this, m_toldLocation.first, m_toldLocation.second);
}

/// Of the current line; without a branch where there is none, or a blank one.
std::pair<CString, double> CKavo0_hdView::CurrentLocation() const
{
    const auto* page = ActivePage();
    const auto record = page && page->GetGrid() ? page->GetRecordAt(page->GetGrid()->CurrentRow()) : nullptr;
    if (!record || record->IsBlank())
        return {};
    return {QString::fromStdString(record->RiverName), record->Chainage};
}

QStringList CKavo0_hdView::BranchNames()
{
    QStringList branches = GetDocument()->BranchNames(this);
    for (QString& branch : branches)
        branch = KsBranchKey(branch); // as the column stores them
    branches.removeDuplicates();
    return branches;
}

void CKavo0_hdView::FetchLocation()
{
    CObList objects;
    GetDocument()->AskProject(KsRequest::FetchLocation, this, &objects);
    const auto* place = objects.empty() ? nullptr : dynamic_cast<const CKvrCBELocation*>(objects.front().get());
    if (!place || place->branch.isEmpty() || !std::isfinite(place->chainage)) {
        KsMessageBox(LoadString(Str::FetchNoAnswer), QMessageBox::Ok, this);
        return;
    }
    const double shown = CKsEditStyle(UnitGroup::Chainage).UnitConvertFromBase(place->chainage, 1);
    ActivePage()->InsertLocation(place->branch, KsShortestNumber(shown));
}
