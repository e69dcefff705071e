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
    return KsHasExtension(view->GetDocument()->GetPathName(), QString::fromLatin1(HDExtension));
}

/// A line that the user has not completed is no location.
bool IsComplete(const CKvr_CBE_ModelDataItem& item)
{
    return !item.branch.trimmed().isEmpty() && std::isfinite(item.chainage) && item.chainage != NotGiven;
}

CObList ItemOf(const CMapLocation& location)
{
    auto item = std::make_unique<CKvr_CBE_ModelDataItem>();
    item->branch = location.branch;
    item->chainage = location.chainage;
    item->type = location.kind;
    CObList objects;
    objects.push_back(std::move(item));
    return objects;
}

std::vector<CView*> HDViews(CKsProjectView& asking)
{
    std::vector<CView*> views = asking.ProjectDoc()->ProjectViews(&asking);
    std::erase_if(views, [](const CView* view) { return !IsHDView(view); });
    return views;
}

CView* FindView(CKsProjectView& asking, const QString& file)
{
    for (CView* view : HDViews(asking)) {
        if (KsSameFile(view->GetDocument()->GetPathName(), file)) // it may have been saved in another case
            return view;
    }
    qDebug("network: no open document %s", qPrintable(file));
    return nullptr;
}

} // namespace

QStringList LocationSource::Files(CKsProjectView& asking)
{
    QStringList files;
    for (const CView* view : HDViews(asking))
        files << view->GetDocument()->GetPathName();
    files.removeDuplicates();
    return files;
}

std::vector<CMapLocation> LocationSource::Fetch(CKsProjectView& asking)
{
    std::vector<CMapLocation> locations;
    auto* getData = KsFindExportAs<decltype(KvrMSGGetData)>("KvrMSGGetData");
    if (!getData)
        return locations;
    QStringList done; // two windows may show one document
    for (CView* view : HDViews(asking)) {
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
                locations.push_back({item->branch, item->chainage, item->type, file});
        }
    }
    return locations;
}

void LocationSource::Send(CKsProjectView& asking, WPARAM request, const CMapLocation& location)
{
    CObList objects = ItemOf(location);
    if (CView* receiver = FindView(asking, location.file))
        asking.ProjectDoc()->AskView(receiver, request, &asking, &objects);
}

void LocationSource::Show(CKsProjectView& asking, const CMapLocation& location)
{
    CObList objects = ItemOf(location);
    auto* select = KsFindExportAs<decltype(KvrMSGSelectData)>("KvrMSGSelectData");
    if (CView* receiver = select ? FindView(asking, location.file) : nullptr)
        select(location.file, receiver, &objects);
}
