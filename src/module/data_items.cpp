#include "module/data_items.h"

#include "module/data_tables.h"

#include <algorithm>
#include <string_view>

namespace {

void AppendTable(const HDDataTable& table, int type, HD_Parameters& parameters, CObList& items)
{
    const CGenList& list = table.list(parameters);
    // Neighbours mostly share their branch, and then share one text.
    std::string_view name;
    CString branch = QStringLiteral("");
    for (std::size_t i = 0; i < list.GetCount(); ++i) {
        const HD_RiverPos& record = list.GetAt(i);
        if (record.RiverName != name) {
            name = record.RiverName;
            branch = CString::fromStdString(record.RiverName);
        }
        auto item = std::make_unique<CKvr_CBE_ModelDataItem>();
        item->branch = branch;
        item->chainage = record.Chainage;
        if (table.second)
            item->second = table.second(record);
        item->type = type;
        items.push_back(std::move(item));
    }
}

} // namespace

std::unique_ptr<CObList> DataItems(HD_Parameters& parameters)
{
    auto items = std::make_unique<CObList>();
    std::size_t count = 0;
    for (const HDDataTable& table : HDDataTables())
        count += table.list(parameters).GetCount();
    items->reserve(count);
    int type = 0;
    for (const HDDataTable& table : HDDataTables())
        AppendTable(table, type++, parameters, *items);
    return items;
}

std::unique_ptr<CObList> MarkItems(HD_Parameters& parameters)
{
    const HD_Global_Var& globals = parameters.Global;
    const std::size_t titles = globals.MarkTitles.size();
    auto items = std::make_unique<CObList>();

    auto head = std::make_unique<CKvrCBEUserDefMark>();
    for (std::size_t title = 0; title < titles; ++title)
        head->titles.push_back(CString::fromStdString(globals.MarkTitles[title]));
    head->flags.assign(globals.MarkInterpolate.begin(), globals.MarkInterpolate.end());
    head->flags.resize(titles, 0);
    items->push_back(std::move(head));

    const auto& list = parameters.WaterLevelMarkList;
    for (std::size_t i = 0; i < list.GetCount(); ++i) {
        const HDWLMark& mark = list.GetAt(i);
        auto item = std::make_unique<CKvrCBEUserDefMark>();
        item->branch = CString::fromStdString(mark.RiverName);
        item->values.push_back(mark.Chainage);
        item->values.insert(item->values.end(), mark.MarkLevels.begin(), mark.MarkLevels.end());
        item->values.resize(std::max(item->values.size(), titles + 1), NotGiven);
        items->push_back(std::move(item));
    }
    return items;
}

std::unique_ptr<CObList> MapItems(HD_Parameters& parameters)
{
    auto items = std::make_unique<CObList>();
    const auto& maps = parameters.Global.MapOutput.MapOutputFiles;
    for (const CMapsOutput& map : maps) {
        auto item = std::make_unique<CKvr_CBE_HDMaps>();
        item->xOrigin = map.XOrigin;
        item->yOrigin = map.YOrigin;
        item->rotation = map.Rotation;
        item->cellSize = map.GridSize;
        item->jCells = map.JCells;
        item->kCells = map.KCells;
        item->fileName = CString::fromStdString(map.FileName);
        items->push_back(std::move(item));
    }
    return items;
}
