// The elements of a vector as the rows of a grid: the pairs of a table, the entries of a list without locations.
#pragma once

#include "grid/row_source.h"

#include <algorithm>
#include <functional>
#include <iterator>
#include <vector>

/// The line of a list that a vector is part of; none for a vector that stands for itself.
struct VectorOwner
{
    const void* list = nullptr;
    std::function<std::size_t()> row = {}; // where the line is
};

/// What a grid shows of a source without rows.
enum class WhenEmpty
{
    Nothing,
    OneRow // to type into
};

/// A vector of the document, which exists as long as the document, or as long as the line that owns it.
/// A row's key is its place. Elements move in memory, so no address could name one; and a command that holds keys is
/// only run with the vector as it was when the command was made, undo being strictly backwards.
template <typename T>
class VectorRows : public IRowSource
{
public:
    explicit VectorRows(std::vector<T>& rows, VectorOwner owner = {}, WhenEmpty whenEmpty = WhenEmpty::Nothing)
        : m_rows([&rows]() -> std::vector<T>& { return rows; }), m_owner(std::move(owner)), m_whenEmpty(whenEmpty)
    {
    }
    /// A vector that moves in memory: `rows` knows where it is.
    explicit VectorRows(std::function<std::vector<T>&()> rows, VectorOwner owner = {},
                        WhenEmpty whenEmpty = WhenEmpty::Nothing)
        : m_rows(std::move(rows)), m_owner(std::move(owner)), m_whenEmpty(whenEmpty), m_moves(m_owner.list)
    {
    }

    std::size_t Count() const override { return m_rows().size(); }
    void* At(std::size_t row) override { return &m_rows()[row]; }
    RowKey KeyAt(std::size_t row) override { return row; }
    void* Object(RowKey key) override { return At(key); }
    std::size_t RowOf(RowKey key, std::size_t) override { return std::min(std::size_t(key), Count()); }

    std::unique_ptr<IRowBlock> NewRows(std::size_t count) const override
    {
        return std::make_unique<Block>(std::vector<T>(count));
    }
    std::unique_ptr<IRowBlock> Copies(const std::vector<std::size_t>& rows) override
    {
        std::vector<T> copies;
        copies.reserve(rows.size());
        std::ranges::transform(rows, std::back_inserter(copies), [this](std::size_t row) { return m_rows()[row]; });
        return std::make_unique<Block>(std::move(copies));
    }
    std::size_t Put(std::size_t row, std::unique_ptr<IRowBlock> block) override
    {
        row = std::min(row, Count());
        auto& rows = static_cast<Block&>(*block).rows;
        m_rows().insert(m_rows().begin() + std::ptrdiff_t(row), std::make_move_iterator(rows.begin()),
                        std::make_move_iterator(rows.end()));
        return row;
    }
    std::unique_ptr<IRowBlock> Take(std::size_t row, std::size_t count) override
    {
        const auto first = m_rows().begin() + std::ptrdiff_t(row), last = first + std::ptrdiff_t(count);
        auto taken = std::make_unique<Block>(std::vector<T>(count)); // asks for memory before anything is moved
        std::move(first, last, taken->rows.begin());
        m_rows().erase(first, last);
        return taken;
    }
    void Drop(std::size_t row, std::size_t count) override
    {
        const auto first = m_rows().begin() + std::ptrdiff_t(row);
        m_rows().erase(first, first + std::ptrdiff_t(count));
    }

    void Move(std::size_t from, std::size_t to) override
    {
        const auto at = [this](std::size_t row) { return m_rows().begin() + std::ptrdiff_t(row); };
        if (from < to)
            std::rotate(at(from), at(from + 1), at(to + 1));
        else
            std::rotate(at(to), at(from), at(from + 1));
        ++m_rearranged;
    }
    void Rearrange(const std::vector<std::size_t>& order) override
    {
        std::vector<T> arranged;
        arranged.reserve(order.size());
        for (const std::size_t row : order)
            arranged.push_back(std::move(m_rows()[row]));
        m_rows() = std::move(arranged);
        ++m_rearranged;
    }
    std::size_t Rearranged() const override { return m_rearranged; }

    const void* Data() const override { return &m_rows(); }
    bool MayBeEmpty() const override { return m_whenEmpty == WhenEmpty::Nothing; }
    const void* List() const override { return m_owner.list; }
    std::size_t ListRow(std::size_t row) const override { return m_owner.list ? m_owner.row() : row; }
    bool StaysInMemory() const override { return !m_moves; }

protected:
    std::vector<T>& Rows() const { return m_rows(); }

private:
    struct Block : IRowBlock
    {
        explicit Block(std::vector<T> taken) : rows(std::move(taken)) {}
        std::size_t Count() const override { return rows.size(); }
        void* At(std::size_t index) override { return &rows[index]; }
        std::vector<T> rows;
    };

    std::function<std::vector<T>&()> m_rows;
    VectorOwner m_owner;
    WhenEmpty m_whenEmpty;
    bool m_moves = false; // in memory, with the line that owns it
    std::size_t m_rearranged = 0;
};
