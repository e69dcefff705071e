#include "pages/mark_title_rows.h"

#include "module/document.h"

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
    std::uint64_t Revision() const override { return Count(); }
    RowKey KeyAt(std::size_t row) override { return row; }
    void* Object(RowKey key) override { return At(key); }
    std::size_t RowOf(RowKey key, std::size_t) override { return std::min(std::size_t(key), Count()); }
    void Touch(RowKey) override { m_document.PlaceholderRowTouched(&Titles()); }

    std::unique_ptr<IRowBlock> NewRows(std::size_t count) const override
    {
        auto block = std::make_unique<CTitleBlock>();
        block->entries.resize(count);
        return block;
    }
    std::size_t Put(std::size_t row, std::unique_ptr<IRowBlock> block) override
    {
        Touch(row);
        row = std::min(row, Count());
        std::size_t at = row;
        for (auto& entry : static_cast<CTitleBlock&>(*block).entries)
            PutTitle(at++, entry);
        return row;
    }
    std::unique_ptr<IRowBlock> Take(std::size_t row, std::size_t count) override
    {
        Touch(row);
        auto block = std::make_unique<CTitleBlock>();
        for (std::size_t i = 0; i < count; ++i)
            block->entries.push_back(TakeTitle(row));
        return block;
    }
    // The empty title of a document without titles is no column yet: levels that the file may hold stay where they are.
    void AddFirstRow(std::unique_ptr<IRowBlock>) override
    {
        Globals().MarkTitles.emplace_back();
        m_document.AddPlaceholderRow(&Titles());
    }
    void TakeFirstRow() override
    {
        if (!m_document.IsPlaceholderRow(&Titles()))
            return;
        Globals().MarkTitles.clear();
        m_document.PlaceholderRowTouched(&Titles());
    }

    CGenList* List() const override { return &m_document.Parameters().WaterLevelMarkList; }
    std::size_t ListRow(std::size_t) const override { return std::size_t(-1); } // no line of the list

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
    void PutTitle(std::size_t row, const CTitleBlock::Entry& entry)
    {
        HD_Global_Var& globals = Globals();
        globals.MarkTitles.insert(globals.MarkTitles.begin() + std::ptrdiff_t(row), entry.title.title);
        if (entry.hasFlag) {
            globals.MarkInterpolate.resize(std::max(globals.MarkInterpolate.size(), row));
            globals.MarkInterpolate.insert(globals.MarkInterpolate.begin() + std::ptrdiff_t(row),
                                           entry.title.interpolate);
        }
        if (entry.isNew)
            EveryRecord([row](HDWLMark& record) {
                if (record.MarkLevels.size() > row)
                    record.MarkLevels.insert(record.MarkLevels.begin() + std::ptrdiff_t(row), NotGiven);
            });
        for (const Level& level : entry.levels)
            level.record->MarkLevels.insert(level.record->MarkLevels.begin() + std::ptrdiff_t(row), level.value);
    }
    CTitleBlock::Entry TakeTitle(std::size_t row)
    {
        HD_Global_Var& globals = Globals();
        CTitleBlock::Entry entry;
        entry.isNew = false;
        entry.title.title = globals.MarkTitles[row];
        globals.MarkTitles.erase(globals.MarkTitles.begin() + std::ptrdiff_t(row));
        entry.hasFlag = row < globals.MarkInterpolate.size();
        if (entry.hasFlag) {
            entry.title.interpolate = globals.MarkInterpolate[row];
            globals.MarkInterpolate.erase(globals.MarkInterpolate.begin() + std::ptrdiff_t(row));
        }
        EveryRecord([row, &entry](HDWLMark& record) {
            if (record.MarkLevels.size() <= row)
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
