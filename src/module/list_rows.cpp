#include "module/list_rows.h"

#include "module/document.h"

#include <algorithm>

namespace {

using Records = std::vector<std::unique_ptr<HD_RiverPos>>;

class CRecordBlock : public IRowBlock
{
public:
    explicit CRecordBlock(Records rows) : records(std::move(rows)) {}
    std::size_t Count() const override { return records.size(); }
    void* At(std::size_t index) override { return records[index].get(); }

    Records records;
};

Records RecordsOf(std::unique_ptr<IRowBlock> block)
{
    return std::move(static_cast<CRecordBlock&>(*block).records);
}

class CListRows : public IRowSource
{
public:
    CListRows(CKavo0_hdDoc& document, CGenList& list) : m_document(document), m_list(list) {}

    std::size_t Count() const override { return m_list.GetCount(); }
    void* At(std::size_t row) override { return &m_list.GetAt(row); }
    std::uint64_t Revision() const override { return m_list.GetRevision(); }

    // Records stay where they are in memory, so their address names them.
    RowKey KeyAt(std::size_t row) override { return reinterpret_cast<RowKey>(At(row)); }
    void* Object(RowKey key) override { return Record(key); }
    std::size_t RowOf(RowKey key, std::size_t hint) override
    {
        if (hint < Count() && KeyAt(hint) == key)
            return hint;
        for (std::size_t row = 0; row < Count(); ++row)
            if (KeyAt(row) == key)
                return row;
        return Count();
    }
    void Touch(RowKey key) override { m_document.PlaceholderTouched(*Record(key)); }

    std::unique_ptr<IRowBlock> NewRows(std::size_t count) const override
    {
        Records records(count);
        std::generate(records.begin(), records.end(), [this] { return m_list.NewRecord(); });
        return std::make_unique<CRecordBlock>(std::move(records));
    }
    std::size_t Put(std::size_t row, std::unique_ptr<IRowBlock> block) override
    {
        row = std::min(row, Count());
        m_list.InsertAt(row, RecordsOf(std::move(block)));
        return row;
    }
    std::unique_ptr<IRowBlock> Take(std::size_t row, std::size_t count) override
    {
        return std::make_unique<CRecordBlock>(m_list.RemoveAt(row, count));
    }
    void AddFirstRow(std::unique_ptr<IRowBlock> block) override
    {
        for (auto& record : RecordsOf(std::move(block)))
            m_document.AddPlaceholder(m_list, std::move(record));
    }
    CGenList* List() const override { return &m_list; }

private:
    static HD_RiverPos* Record(RowKey key) { return reinterpret_cast<HD_RiverPos*>(key); }

    CKavo0_hdDoc& m_document;
    CGenList& m_list;
};

} // namespace

std::shared_ptr<IRowSource> MakeListRows(CKavo0_hdDoc& document, CGenList& list)
{
    return std::make_shared<CListRows>(document, list);
}
