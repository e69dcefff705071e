// What a grid asks of the page or view that it stands on.
#pragma once

#include <QStringList>
#include <utility>
#include <vector>

class CGenGrid;
enum class GridAction;

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
    /// What the cells of branch names offer.
    virtual QStringList BranchNames() { return {}; }
    /// The project's cross sections: branches, and chainages in metres.
    virtual std::vector<std::pair<QString, double>> CrossSections() { return {}; }
    /// A push button of the grid; row and column count from 1.
    virtual void ButtonClicked(CGenGrid&, int /*row*/, int /*column*/) {}
};
