// What a page and its grid ask of the view that hosts them.
#pragma once

#include <QStringList>

class CView;

/// Commands of the view, numbered as in the menu and tool bar resources.
namespace Command {
inline constexpr int Search = 42600;
inline constexpr int SearchAgain = 42601;
inline constexpr int InsertLine = 42602;
inline constexpr int DeleteLine = 42603;
inline constexpr int GotoLine = 42604;
inline constexpr int FetchLocation = 42605;
} // namespace Command

class IPageHost
{
public:
    virtual ~IPageHost() = default;
    virtual CView* HostView() = 0;
    /// The line just left was edited. `column` is the cell's column, or 1 for a page whose every column is a location.
    /// The active page is stored, a change of location is told to the project, and all views reload.
    virtual void EditedLineChanged(int column) = 0;
    /// Another cell, or another grid, of the active page became the current one.
    virtual void CurrentCellChanged() {}
    /// Another row of the active page's list became current.
    virtual void CurrentLocationChanged() = 0;
    /// Carries out one of the view's commands.
    virtual void Execute(int command) = 0;
    /// Branch names of the project's network; empty outside a project.
    virtual QStringList BranchNames() = 0;
    /// Enables or greys the "Lines" menu (third menu of the main frame).
    virtual void EnableLinesMenu(bool enable) = 0;
};
