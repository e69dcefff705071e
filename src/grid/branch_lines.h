// Lines at many places of one branch at once.
#pragma once

#include "grid/table_rows.h"

#include <QString>
#include <map>
#include <unordered_map>

/// Chainages in metres.
struct PlacesOfBranch
{
    QString branch; // as its cells store it
    std::vector<double> chainages{};
};

/// More lines than this are not put in at once.
inline constexpr std::size_t MostLinesAtOnce = 1'000'000;

/// From one chainage to another, in metres as `step` is: even numbers in the unit that the column shows. Nothing when
/// there would be more than MostLinesAtOnce.
std::optional<std::vector<double>> ChainagesEvery(const ColumnSpec& column, double from, double to, double step);

/// What is known of the branch's lines in the table, hidden ones included. The first two columns are branch name and
/// chainage.
struct BranchInTable
{
    std::vector<double> chainages{}; // in their order
    std::size_t behind = 0;          // the row of the source behind its last line; that behind all lines without one
};
BranchInTable FindBranch(const CTableRows& rows, const QString& branch);
/// In their order, each once, without those where a line is known.
std::vector<double> WithoutKnown(std::vector<double> chainages, const BranchInTable& known);
/// Every branch that a line names, in capitals, in the order of the file.
QStringList BranchesIn(const CTableRows& rows);

/// The lines of a table by their places, hidden ones included; the first two columns are branch name and chainage.
class CPlacesInTable
{
public:
    explicit CPlacesInTable(const CTableRows& rows);
    /// The row of the source that is at this place, in metres; of several each once, in their order.
    std::optional<std::size_t> Take(const QString& branch, double chainage);

private:
    std::unordered_map<QString, std::multimap<double, std::size_t>> m_rows; // by branch key
};

/// Lines that are to go to their places, each to one line there.
class CPlacedLines
{
public:
    void Add(std::size_t line, const QString& branch, double chainage, bool hasFound);
    /// Those of one place, of which some have found no line there; place by place.
    std::vector<std::vector<std::size_t>> Crowds();

private:
    struct Line
    {
        int branch;
        double chainage;
        std::size_t line;
        bool hasFound;
    };
    std::unordered_map<QString, int> m_branches; // numbers, by branch key
    std::vector<Line> m_lines;
};

/// New lines at these places, with what new lines hold besides; not in the source.
std::unique_ptr<IRowBlock> LinesAt(const CTableRows& rows, const PlacesOfBranch& places);
