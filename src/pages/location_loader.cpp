#include "pages/location_loader.h"

#include "ks/fc/branch_name.h"
#include "document/document.h"
#include "grid/gen_grid.h"
#include "grid/row_commands.h"
#include "pages/framework/page.h"
#include "res/strings.h"

#include <QUndoStack>
#include <cmath>
#include <map>
#include <set>

namespace {

using Place = std::pair<QString, double>; // branch in capitals, as the grid stores it, and chainage

class LocationLoader
{
public:
    LocationLoader(CGenPropertyPage& page, LocationValues values)
        : m_page(page), m_values(values), m_rows(page.GetGrid()->Model()->Rows())
    {
        const CGenList& list = *page.GetList();
        const std::size_t head = m_rows->Count() - list.GetCount(); // rows that are no records
        for (std::size_t row = head; row < m_rows->Count(); ++row) {
            const HD_RiverPos& record = list.GetAt(row - head);
            if (!record.IsBlank() && std::isfinite(record.Chainage))
                m_known.emplace(Place(KsBranchKey(QString::fromStdString(record.RiverName)), record.Chainage), row);
        }
    }

    LoadedLocations Load(const CObList& places)
    {
        for (const auto& item : places) {
            const auto* place = dynamic_cast<const CKvrCBELocation*>(item.get());
            if (place && !place->branch.isEmpty() && std::isfinite(place->chainage))
                Take(*place);
        }
        Push();
        return m_result;
    }

private:
    void Take(const CKvrCBELocation& place)
    {
        const Place key(KsBranchKey(place.branch), place.chainage);
        if (!m_taken.insert(key).second)
            return; // it came already
        const auto line = m_known.find(key);
        if (line == m_known.end()) {
            m_new.push_back(&place);
        } else {
            ++m_result.known;
            Change(line->second, place);
        }
    }

    /// The value of the place that goes into a column; NaN for none.
    double ValueFor(const ColumnSpec& column, const CKvrCBELocation& place) const
    {
        if (column.locationValue == LocationValue::Radius && m_values.radius)
            return place.radius;
        if (column.locationValue == LocationValue::Width && m_values.width)
            return place.width;
        return KsUnset;
    }

    void Change(std::size_t row, const CKvrCBELocation& place)
    {
        const auto& columns = m_page.GetGrid()->Model()->Columns();
        bool isChanged = false;
        for (std::size_t c = 0; c < columns.size(); ++c) {
            const double value = ValueFor(columns[c], place);
            if (!std::isfinite(value) || columns[c].IsLocked(m_rows->At(row)))
                continue;
            CellValue old = columns[c].access->get(m_rows->At(row));
            if (old == CellValue(value))
                continue;
            if (m_changes.IsEmpty())
                m_firstChanged = row;
            m_changes.Add(m_rows->KeyAt(row), int(c) + 1, columns[c].access, std::move(old), value);
            isChanged = true;
        }
        m_result.changed += isChanged;
    }

    std::unique_ptr<IRowBlock> NewLines() const
    {
        const CGridModel& model = *m_page.GetGrid()->Model();
        auto lines = model.NewLines(int(m_new.size()));
        for (std::size_t i = 0; i < m_new.size(); ++i) {
            auto& record = *static_cast<HD_RiverPos*>(lines->At(i));
            record.RiverName = KsBranchKey(m_new[i]->branch).toStdString();
            record.Chainage = m_new[i]->chainage;
            for (const ColumnSpec& column : model.Columns()) {
                const double value = ValueFor(column, *m_new[i]);
                if (std::isfinite(value) && !column.IsLocked(&record))
                    column.access->set(&record, value);
            }
        }
        return lines;
    }

    void Push()
    {
        m_result.added = int(m_new.size());
        if (m_new.empty() && m_changes.IsEmpty())
            return;
        CKavo0_hdDoc& document = *m_page.GetDocument();
        document.UndoStack().beginMacro(LoadString(Str::UndoLoad));
        if (!m_changes.IsEmpty())
            SetCells(document, m_rows, std::move(m_changes), m_firstChanged);
        if (!m_new.empty())
            InsertLines(document, m_rows, m_rows->Count(), NewLines());
        document.UndoStack().endMacro();
    }

    CGenPropertyPage& m_page;
    LocationValues m_values;
    std::shared_ptr<IRowSource> m_rows;
    std::map<Place, std::size_t> m_known; // the row of each place
    std::set<Place> m_taken;
    std::vector<const CKvrCBELocation*> m_new;
    CCellChanges m_changes;
    std::size_t m_firstChanged = 0;
    LoadedLocations m_result;
};

} // namespace

LoadedLocations LoadLocations(CGenPropertyPage& page, const CObList& places, LocationValues values)
{
    if (!page.GetGrid() || !page.GetList() || !page.GetGrid()->Model()->Rows())
        return {};
    page.StoreToDocument();
    return LocationLoader(page, values).Load(places);
}
