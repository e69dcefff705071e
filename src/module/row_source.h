// The rows of a grid, whatever they are kept in: the records of a list, the elements of a vector. Sources refer to data
// of the document only, so that undo commands may hold them for as long as the document lives.
#pragma once

#include <cstddef>
#include <cstdint>
#include <memory>

class CGenList;

/// Rows that are out of their source: new ones, or removed ones that a command keeps. Owns them.
class IRowBlock
{
public:
    virtual ~IRowBlock() = default;
    virtual std::size_t Count() const = 0;
    virtual void* At(std::size_t index) = 0;
};

/// Names a row for as long as it exists, in its source or in a block taken from it.
using RowKey = std::uintptr_t;

class IRowSource
{
public:
    virtual ~IRowSource() = default;
    virtual std::size_t Count() const = 0;
    /// The object that the columns of the grid read and write.
    virtual void* At(std::size_t row) = 0;
    /// Changes whenever rows come, go or move.
    virtual std::uint64_t Revision() const = 0;

    virtual RowKey KeyAt(std::size_t row) = 0;
    virtual void* Object(RowKey key) = 0;
    /// Row of the key, looked for at `hint` first; Count() when it is not in the source.
    virtual std::size_t RowOf(RowKey key, std::size_t hint) = 0;
    /// The row is about to be changed or removed by the user.
    virtual void Touch(RowKey /*key*/) {}

    /// Rows with their defaults, not in the source.
    virtual std::unique_ptr<IRowBlock> NewRows(std::size_t count) const = 0;
    /// Puts the rows in at `row` (at the end when there are fewer) and returns the row where they went.
    virtual std::size_t Put(std::size_t row, std::unique_ptr<IRowBlock> block) = 0;
    virtual std::unique_ptr<IRowBlock> Take(std::size_t row, std::size_t count) = 0;
    /// The one row that an empty source shows: no change of the document, if the source has a way to say so.
    virtual void AddFirstRow(std::unique_ptr<IRowBlock> block) { Put(0, std::move(block)); }

    /// Whether the source may be left without rows; otherwise it always shows one.
    virtual bool MayBeEmpty() const { return false; }

    /// The list behind the rows; null when they are kept otherwise.
    virtual CGenList* List() const { return nullptr; }
    /// Where the list shows the row: a row kept inside a record is shown at the record.
    virtual std::size_t ListRow(std::size_t row) const { return row; }
};
