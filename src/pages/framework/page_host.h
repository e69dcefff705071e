// What a page and its grid ask of the view that hosts them.
#pragma once

#include "grid/grid_host.h"
#include "grid/grid_search.h"

#include <QStringList>

class CView;

namespace Command {
inline constexpr int FetchLocation = 42605; // beside those of grid/grid_search.h
} // namespace Command

class IPageHost
{
public:
    virtual ~IPageHost() = default;
    virtual CView* HostView() = 0;
    /// The line just left was edited: the active page is stored, and all views reload.
    virtual void EditedLineChanged() = 0;
    /// Another cell, or another grid, of the active page became the current one.
    virtual void CurrentCellChanged() {}
    /// Another row of the active page's list became current.
    virtual void CurrentLocationChanged() = 0;
    /// Carries out one of the view's commands.
    virtual void Execute(int command) = 0;
    /// Shows the help on the active page.
    virtual void ShowHelp() {}
    /// The tables of all pages, each list once.
    virtual std::vector<HostTable> TablesOfDocument() { return {}; }
    /// Branch names of the project's network; empty outside a project.
    virtual QStringList BranchNames() = 0;
    /// Enables or greys the "Lines" menu (third menu of the main frame).
    virtual void EnableLinesMenu(bool enable) = 0;
};
