// What a grid asks of the page or view that it stands on.
#pragma once

#include <QStringList>
#include <functional>
#include <utility>
#include <vector>

class CGenGrid;
enum class GridAction;

/// A table among those that a user works on.
struct HostTable
{
    QString page; // as the user calls it; empty for the page in front
    CGenGrid* grid;
    std::function<bool()> show = {}; // brings the page to the front; false when another one may not be left
};

class IGridHost
{
public:
    virtual ~IGridHost() = default;
    /// Takes what is being typed around the grid, in whatever cell or field; false when it is refused (the user has
    /// been told).
    virtual bool LeaveField() = 0;
    /// Cells of the line just left were edited: they are to be stored, and shown as they are then.
    virtual void LineEdited(CGenGrid& grid) = 0;
    /// Another cell became the current one, or the grid got the focus.
    virtual void CellCurrent(CGenGrid&) {}
    /// Another line became current.
    virtual void LineCurrent(CGenGrid&) {}
    /// What the grid does not do by itself: lines come and go, search, undo and redo.
    virtual void Run(CGenGrid& grid, GridAction action) = 0;
    /// Whether search looks through this grid.
    virtual bool CanSearch(const CGenGrid&) const { return false; }
    /// The tables that a command for all of the page is about, the grid among them.
    virtual std::vector<HostTable> TablesOfPage(CGenGrid& grid) { return {{{}, &grid}}; }
    /// Likewise for all of the document; empty where there are no other pages.
    virtual std::vector<HostTable> TablesOfDocument() { return {}; }
    /// What the cells of branch names offer.
    virtual QStringList BranchNames() { return {}; }
    /// The project's cross sections: branches, and chainages in metres.
    virtual std::vector<std::pair<QString, double>> CrossSections() { return {}; }
    /// A push button of the grid; row and column count from 1.
    virtual void ButtonClicked(CGenGrid&, int /*row*/, int /*column*/) {}
};
