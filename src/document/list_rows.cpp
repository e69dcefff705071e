#include "document/list_rows.h"

#include "data/gen_list.h"

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
    explicit CListRows(CGenList& list) : m_list(list) {}

    std::size_t Count() const override { return m_list.GetCount(); }
    void* At(std::size_t row) override { return &m_list.GetAt(row); }

    // Records stay where they are in memory, so their address names them.
    RowKey KeyAt(std::size_t row) override { return reinterpret_cast<RowKey>(At(row)); }
    void* Object(RowKey key) override { return Record(key); }
    bool KeysLast() const override { return true; }
    std::size_t RowOf(RowKey key, std::size_t hint) override
    {
        if (hint < Count() && KeyAt(hint) == key)
            return hint;
        for (std::size_t row = 0; row < Count(); ++row)
            if (KeyAt(row) == key)
                return row;
        return Count();
    }

    std::unique_ptr<IRowBlock> NewRows(std::size_t count) const override
    {
        Records records(count);
        std::generate(records.begin(), records.end(), [this] { return m_list.NewRecord(); });
        return std::make_unique<CRecordBlock>(std::move(records));
    }
    std::unique_ptr<IRowBlock> Copies(const std::vector<std::size_t>& rows) override
    {
        Records records(rows.size());
        std::ranges::transform(rows, records.begin(),
                               [this](std::size_t row) { return m_list.CopyOf(m_list.GetAt(row)); });
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
        auto taken = std::make_unique<CRecordBlock>(Records()); // asks for memory before anything is moved
        taken->records = m_list.RemoveAt(row, count);
        return taken;
    }
    void Rearrange(const std::vector<std::size_t>& order) override
    {
        Records arranged(order.size()), records; // asks for memory before anything is moved
        m_list.Swap(records);
        for (std::size_t place = 0; place < order.size(); ++place)
            arranged[place] = std::move(records[order[place]]);
        m_list.Swap(arranged);
    }
    const void* Data() const override { return &m_list; }
    const void* List() const override { return &m_list; }

private:
    static HD_RiverPos* Record(RowKey key) { return reinterpret_cast<HD_RiverPos*>(key); }

    CGenList& m_list;
};

/// Rows are counted with the fixed one; the list counts without it.
class CGlobalAndListRows : public IRowSource
{
public:
    CGlobalAndListRows(std::shared_ptr<IRowSource> lines, void* globals) : m_lines(std::move(lines)), m_globals(globals)
    {
    }

    std::size_t FixedRows() const override { return 1; }
    std::size_t Count() const override { return 1 + m_lines->Count(); }
    void* At(std::size_t row) override { return row == 0 ? m_globals : m_lines->At(row - 1); }

    RowKey KeyAt(std::size_t row) override { return row == 0 ? GlobalKey() : m_lines->KeyAt(row - 1); }
    void* Object(RowKey key) override { return key == GlobalKey() ? m_globals : m_lines->Object(key); }
    bool KeysLast() const override { return true; }
    std::size_t RowOf(RowKey key, std::size_t hint) override
    {
        return key == GlobalKey() ? 0 : 1 + m_lines->RowOf(key, hint > 0 ? hint - 1 : 0);
    }

    std::unique_ptr<IRowBlock> NewRows(std::size_t count) const override { return m_lines->NewRows(count); }
    std::unique_ptr<IRowBlock> Copies(const std::vector<std::size_t>& rows) override
    {
        std::vector<std::size_t> lines = rows;
        for (std::size_t& line : lines)
            --line;
        return m_lines->Copies(lines);
    }
    std::size_t Put(std::size_t row, std::unique_ptr<IRowBlock> block) override
    {
        return 1 + m_lines->Put(row > 0 ? row - 1 : 0, std::move(block));
    }
    std::unique_ptr<IRowBlock> Take(std::size_t row, std::size_t count) override
    {
        return m_lines->Take(row - 1, count);
    }
    void Rearrange(const std::vector<std::size_t>& order) override
    {
        std::vector<std::size_t> lines(order.begin() + 1, order.end());
        for (std::size_t& line : lines)
            --line;
        m_lines->Rearrange(lines);
    }
    const void* Data() const override { return m_lines->Data(); }
    const void* List() const override { return m_lines->List(); }

private:
    RowKey GlobalKey() const { return reinterpret_cast<RowKey>(m_globals); }

    std::shared_ptr<IRowSource> m_lines;
    void* m_globals;
};

} // namespace

std::shared_ptr<IRowSource> MakeGlobalAndListRows(CGenList& list, void* globals)
{
    return std::make_shared<CGlobalAndListRows>(MakeListRows(list), globals);
}

std::shared_ptr<IRowSource> MakeListRows(CGenList& list)
{
    return std::make_shared<CListRows>(list);
}
