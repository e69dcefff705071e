#include "editors/network/location_source.h"

#include "base/not_given.h"
#include "files/extensions.h"
#include "ks/fc/exports.h"
#include "ks/fc/file_name.h"
#include "ks/fc/hd_messages.h"

#include <cmath>

namespace {

bool IsHDView(const CView* view)
{
    return view->GetDocument()->GetPathName().endsWith(QLatin1String(HDExtension), Qt::CaseInsensitive);
}

/// A line that the user has not completed is no location.
bool IsComplete(const CKvr_CBE_ModelDataItem& item)
{
    return !item.branch.trimmed().isEmpty() && std::isfinite(item.chainage) && item.chainage != NotGiven;
}

std::unique_ptr<CKvr_CBE_ModelDataItem> ItemOf(const CMapLocation& location)
{
    auto item = std::make_unique<CKvr_CBE_ModelDataItem>();
    item->branch = location.branch;
    item->chainage = location.chainage;
    item->second = location.second;
    item->type = location.kind;
    return item;
}

} // namespace

std::vector<CView*> CLocationSource::HDViews() const
{
    std::vector<CView*> views = m_document.ProjectViews(&m_view);
    std::erase_if(views, [](const CView* view) { return !IsHDView(view); });
    return views;
}

CView* CLocationSource::FindView(const QString& file) const
{
    for (CView* view : HDViews()) {
        if (KsSameFile(view->GetDocument()->GetPathName(), file)) // it may have been saved in another case
            return view;
    }
    qDebug("network: no open document %s", qPrintable(file));
    return nullptr;
}

QStringList CLocationSource::Files() const
{
    QStringList files;
    for (const CView* view : HDViews())
        files << view->GetDocument()->GetPathName();
    files.removeDuplicates();
    return files;
}

std::vector<CMapLocation> CLocationSource::Fetch() const
{
    std::vector<CMapLocation> locations;
    auto* getData = KsFindExportAs<decltype(KvrMSGGetData)>("KvrMSGGetData");
    if (!getData)
        return locations;
    QStringList done; // two windows may show one document
    for (CView* view : HDViews()) {
        const QString file = view->GetDocument()->GetPathName();
        if (done.contains(file))
            continue;
        done << file;
        const std::unique_ptr<CObList> items(getData(file, view->GetDocument()));
        if (!items)
            continue;
        for (const auto& each : *items) {
            const auto* item = dynamic_cast<const CKvr_CBE_ModelDataItem*>(each.get());
            if (item && item->type >= 0 && item->type < HDDataTypeCount && IsComplete(*item))
                locations.push_back({item->branch, item->chainage, item->type, file, item->second});
        }
    }
    return locations;
}

void CLocationSource::Send(WPARAM request, const CMapLocation& location) const
{
    CView* receiver = FindView(location.file);
    if (!receiver)
        return;
    CObList objects;
    objects.push_back(ItemOf(location));
    m_document.AskView(receiver, request, &m_view, &objects);
}

void CLocationSource::Delete(const CMapLocation& location) const
{
    Send(KsRequest::DeleteData, location);
}

void CLocationSource::Insert(const CMapLocation& location) const
{
    Send(KsRequest::InsertData, location);
}

void CLocationSource::Show(const CMapLocation& location) const
{
    auto* select = KsFindExportAs<decltype(KvrMSGSelectData)>("KvrMSGSelectData");
    CView* receiver = select ? FindView(location.file) : nullptr;
    if (!receiver)
        return;
    CObList objects;
    objects.push_back(ItemOf(location));
    select(location.file, receiver, &objects);
}
