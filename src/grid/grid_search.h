// Finding lines: by number, and by branch name and chainage. For the grids whose first two columns are these.
#pragma once

#include "ks/fc/frames.h"

#include <QString>

class CGenGrid;

enum class ChainageMatch
{
    Less,
    Equal,
    Greater,
    Any
};
enum class NameMatch
{
    Beginning,
    Whole
};

/// What lines to look for.
struct LineQuery
{
    QString name{};
    double chainage = 0; // metres; compared as shown in the chainage column
    ChainageMatch chainageMatch = ChainageMatch::Any;
    NameMatch nameMatch = NameMatch::Beginning;
};

/// Looks for a line from `row` on (0 is taken as 1). On success the line becomes current, and `row` is the one behind
/// it; otherwise `row` is 0.
bool SearchRows(CGenGrid& grid, int& row, const LineQuery& query);

/// The commands on lines, numbered as in the menu and tool bar resources.
namespace Command {
inline constexpr int Search = 42600;
inline constexpr int SearchAgain = 42601;
inline constexpr int InsertLine = 42602;
inline constexpr int DeleteLine = 42603;
inline constexpr int GotoLine = 42604;
} // namespace Command

/// The search of a view: what F7 asked for and F3 goes on with.
class CGridSearch
{
public:
    /// The menu entries of these commands.
    static std::vector<CKsMenuCommand> MenuCommands();
    static bool Knows(int command);
    /// `grid` is the one that the user means; null for none.
    bool CanRun(int command, const CGenGrid* grid) const;
    void Run(int command, CGenGrid& grid);

private:
    static void Goto(CGenGrid& grid);
    void Ask(CGenGrid& grid);
    void Next(CGenGrid& grid);

    LineQuery m_query;
    int m_row = 0;                    // the next search starts here; 0 is the first row
    const CGenGrid* m_grid = nullptr; // in which `m_row` is
    bool m_asked = false, m_found = false;
};
