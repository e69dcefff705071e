// The rows of a grid, whatever they are kept in: the records of a list, the elements of a vector. Sources refer to data
// of the document only, so that undo commands may hold them for as long as the document lives.
#pragma once

#include <QString>
#include <cstddef>
#include <cstdint>
#include <memory>
#include <optional>
#include <string_view>
#include <vector>

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

    virtual RowKey KeyAt(std::size_t row) = 0;
    virtual void* Object(RowKey key) = 0;
    /// Whether a key names its row also when others come and go. Otherwise it is the row's place.
    virtual bool KeysLast() const { return false; }
    /// Row of the key, looked for at `hint` first; Count() when it is not in the source.
    virtual std::size_t RowOf(RowKey key, std::size_t hint) = 0;

    /// Rows with their defaults, not in the source.
    virtual std::unique_ptr<IRowBlock> NewRows(std::size_t count) const = 0;
    /// Rows that hold what these do, shown by columns or not; not in the source.
    virtual std::unique_ptr<IRowBlock> Copies(const std::vector<std::size_t>& rows) = 0;
    /// What is to be said when rows are cut of which the clipboard, which has their cells, does not have all.
    virtual QString LostWhenCut() const { return {}; }
    /// Puts the rows in at `row` (at the end when there are fewer) and returns the row where they went.
    virtual std::size_t Put(std::size_t row, std::unique_ptr<IRowBlock> block) = 0;
    virtual std::unique_ptr<IRowBlock> Take(std::size_t row, std::size_t count) = 0;
    /// Takes rows out that nobody wants; a vector asks for no memory.
    virtual void Drop(std::size_t row, std::size_t count) { Take(row, count); }
    /// Takes rows out that Put has put in: all is as it was before.
    virtual std::unique_ptr<IRowBlock> TakeBack(std::size_t row, std::size_t count) { return Take(row, count); }

    /// A row goes to another place; those between make room. Asks for no memory.
    virtual void Move(std::size_t from, std::size_t to) { Put(to, Take(from, 1)); }

    /// The first rows that belong to the source itself: none of them comes, goes or moves.
    virtual std::size_t FixedRows() const { return 0; }
    bool IsEmpty() const { return Count() == FixedRows(); }
    /// Whether a grid may show the source without rows; otherwise it offers one to type into.
    virtual bool MayBeEmpty() const { return false; }
    /// Whether a grid may add lines.
    virtual bool MayGrow() const { return true; }
    /// Whether the user says where a row stands.
    virtual bool MayMove() const { return true; }

    // Rows that depend on each other.
    /// Makes new rows fit between those at `at` - 1 and `at`, where they will be put.
    virtual void Fit(IRowBlock& /*rows*/, std::size_t /*at*/) const {}
    /// A row that does not fit with the others.
    struct Fault
    {
        std::size_t row = 0;               // among those that were asked about
        QString text{};                    // for the user
        std::string_view field{};          // what would have to be another
        std::optional<std::size_t> with{}; // the one of them before it that it does not fit with
    };
    /// Why the rows from `first` on may not hold what `rows` hold; those behind the last one would be new. In their
    /// order, each one that does not fit with those that do, `most` of them.
    virtual std::vector<Fault> FindFaults(std::size_t /*first*/, IRowBlock& /*rows*/, std::size_t /*most*/) const
    {
        return {};
    }
    std::optional<Fault> FindFault(std::size_t first, IRowBlock& rows) const
    {
        auto faults = FindFaults(first, rows, 1);
        return faults.empty() ? std::nullopt : std::optional(std::move(faults.front()));
    }
    /// Whether that has to be asked before cells change.
    virtual bool HasRules() const { return false; }
    /// Where rows stand in an order of their own: for each place the row that belongs there; empty when all do.
    virtual std::vector<std::size_t> Order() const { return {}; }
    virtual void Rearrange(const std::vector<std::size_t>& /*order*/) {}
    /// How often that was done, where keys do not tell it.
    virtual std::size_t Rearranged() const { return 0; }
    /// Where a row stands is part of what it says: the rows are always shown as they stand, and all of them.
    virtual bool IsSequence() const { return false; }

    /// The list or table of the document that the rows are kept in.
    virtual const void* Data() const = 0;
    /// That list, or the list that the table belongs to; null for neither.
    virtual const void* List() const { return nullptr; }
    /// Where the list shows the row: a row kept inside a record is shown at the record.
    virtual std::size_t ListRow(std::size_t row) const { return row; }
    /// Whether Data() names the table for as long as it exists. Otherwise the row of List() that it belongs to does.
    virtual bool StaysInMemory() const { return true; }
    /// Rows that come or go here move what the lines of that list hold.
    virtual bool MovesContentOf(const void* /*list*/) const { return false; }
};
