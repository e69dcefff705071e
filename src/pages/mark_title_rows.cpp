#include "pages/mark_title_rows.h"

#include "document/document.h"

#include <algorithm>
#include <vector>

std::string MarkTitle::Title() const
{
    return globals ? globals->MarkTitles[index] : title;
}

void MarkTitle::SetTitle(const std::string& text)
{
    (globals ? globals->MarkTitles[index] : title) = text;
}

bool MarkTitle::Interpolate() const
{
    if (!globals)
        return interpolate;
    return index < globals->MarkInterpolate.size() && globals->MarkInterpolate[index];
}

void MarkTitle::SetInterpolate(bool on)
{
    if (globals && index >= globals->MarkInterpolate.size())
        globals->MarkInterpolate.resize(index + 1);
    (globals ? globals->MarkInterpolate[index] : interpolate) = on;
}

namespace {

struct Level
{
    HDWLMark* record;
    double value;
};

class CTitleBlock : public IRowBlock
{
public:
    struct Entry
    {
        MarkTitle title;
        bool hasFlag = true;
        bool isNew = true;
        std::vector<Level> levels; // of the records that were long enough
    };
    std::size_t Count() const override { return entries.size(); }
    void* At(std::size_t index) override { return &entries[index].title; }

    std::vector<Entry> entries;
};

class CMarkTitleRows : public IRowSource
{
public:
    explicit CMarkTitleRows(CKavo0_hdDoc& document) : m_document(document) {}

    std::size_t Count() const override { return Titles().size(); }
    void* At(std::size_t row) override
    {
        while (m_rows.size() <= row)
            m_rows.push_back(std::make_unique<MarkTitle>(MarkTitle{&Globals(), m_rows.size(), {}, false}));
        return m_rows[row].get();
    }
    // With places as keys, only rows behind the end are stale.
    RowKey KeyAt(std::size_t row) override { return row; }
    void* Object(RowKey key) override { return At(key); }
    bool IsSequence() const override { return true; } // of the levels
    bool MayMove() const override { return false; }   // records need not have a level for each of them
    std::size_t RowOf(RowKey key, std::size_t) override { return std::min(std::size_t(key), Count()); }

    std::unique_ptr<IRowBlock> NewRows(std::size_t count) const override
    {
        auto block = std::make_unique<CTitleBlock>();
        block->entries.resize(count);
        return block;
    }
    /// Without levels: those of a mark are its own.
    std::unique_ptr<IRowBlock> Copies(const std::vector<std::size_t>& rows) override
    {
        auto copies = NewRows(rows.size());
        for (std::size_t i = 0; i < rows.size(); ++i) {
            const auto& title = *static_cast<const MarkTitle*>(At(rows[i]));
            auto& copy = *static_cast<MarkTitle*>(copies->At(i));
            copy.SetTitle(title.Title());
            copy.SetInterpolate(title.Interpolate());
        }
        return copies;
    }
    std::size_t Put(std::size_t row, std::unique_ptr<IRowBlock> block) override
    {
        row = std::min(row, Count());
        std::size_t at = row;
        for (auto& entry : static_cast<CTitleBlock&>(*block).entries)
            PutTitle(at++, entry);
        return row;
    }
    std::unique_ptr<IRowBlock> Take(std::size_t row, std::size_t count) override
    {
        return Block(row, count, Count() + 1);
    }
    std::unique_ptr<IRowBlock> TakeBack(std::size_t row, std::size_t count) override
    {
        return Block(row, count, count == Count() ? 0 : Count() + 1);
    }

    const void* Data() const override { return &Titles(); }
    const void* List() const override { return static_cast<CGenList*>(&m_document.Parameters().WaterLevelMarkList); }
    std::size_t ListRow(std::size_t) const override { return std::size_t(-1); }     // no line of the list
    bool MovesContentOf(const void* list) const override { return list == List(); } // the levels

private:
    HD_Global_Var& Globals() const { return m_document.Parameters().Global; }
    const std::vector<std::string>& Titles() const { return Globals().MarkTitles; }

    template <typename Visit>
    void EveryRecord(Visit visit)
    {
        auto& records = m_document.Parameters().WaterLevelMarkList;
        for (std::size_t i = 0; i < records.GetCount(); ++i)
            visit(records.GetAt(i));
    }
    /// Takes titles out; the levels below the title `adopted` stay where they are.
    std::unique_ptr<IRowBlock> Block(std::size_t row, std::size_t count, std::size_t adopted)
    {
        auto block = std::make_unique<CTitleBlock>();
        block->entries.resize(count);
        for (std::size_t i = count; i-- > 0;)
            block->entries[i] = TakeTitle(row + i, row + i != adopted);
        return block;
    }
    /// The first of all titles becomes the one of the levels that stand there without: those of a document without
    /// titles, which the page shows below the row it offers.
    void PutTitle(std::size_t row, const CTitleBlock::Entry& entry)
    {
        HD_Global_Var& globals = Globals();
        const bool adopts = entry.isNew && globals.MarkTitles.empty();
        globals.MarkTitles.insert(globals.MarkTitles.begin() + std::ptrdiff_t(row), entry.title.title);
        // Missing flags are off: a list of flags that ends before the title is lengthened only for one that is on.
        if (entry.hasFlag && (entry.title.interpolate || row <= globals.MarkInterpolate.size())) {
            globals.MarkInterpolate.resize(std::max(globals.MarkInterpolate.size(), row));
            globals.MarkInterpolate.insert(globals.MarkInterpolate.begin() + std::ptrdiff_t(row),
                                           entry.title.interpolate);
        }
        if (entry.isNew && !adopts)
            EveryRecord([row](HDWLMark& record) {
                if (record.MarkLevels.size() > row)
                    record.MarkLevels.insert(record.MarkLevels.begin() + std::ptrdiff_t(row), NotGiven);
            });
        for (const Level& level : entry.levels)
            level.record->MarkLevels.insert(level.record->MarkLevels.begin() + std::ptrdiff_t(row), level.value);
    }
    CTitleBlock::Entry TakeTitle(std::size_t row, bool withLevels)
    {
        HD_Global_Var& globals = Globals();
        CTitleBlock::Entry entry;
        entry.isNew = !withLevels;
        entry.title.title = globals.MarkTitles[row];
        globals.MarkTitles.erase(globals.MarkTitles.begin() + std::ptrdiff_t(row));
        entry.hasFlag = row < globals.MarkInterpolate.size();
        if (entry.hasFlag) {
            entry.title.interpolate = globals.MarkInterpolate[row];
            globals.MarkInterpolate.erase(globals.MarkInterpolate.begin() + std::ptrdiff_t(row));
        }
        EveryRecord([row, withLevels, &entry](HDWLMark& record) {
            if (!withLevels || record.MarkLevels.size() <= row)
                return;
            const auto level = record.MarkLevels.begin() + std::ptrdiff_t(row);
            entry.levels.push_back({&record, *level});
            record.MarkLevels.erase(level);
        });
        return entry;
    }

    CKavo0_hdDoc& m_document;
    std::vector<std::unique_ptr<MarkTitle>> m_rows;
};

} // namespace

std::shared_ptr<IRowSource> MakeMarkTitleRows(CKavo0_hdDoc& document)
{
    return std::make_shared<CMarkTitleRows>(document);
}
