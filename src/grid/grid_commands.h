// The commands that a grid carries out by itself, on its lines and on its cells, as commands of a view.
#pragma once

#include "grid/grid_keys.h"
#include "ks/fc/frames.h"

class CGenGrid;

class CGridCommands
{
public:
    /// For the menu of a view.
    static std::vector<CKsMenuCommand> LineMenu();
    static std::vector<CKsMenuCommand> CellMenu();
    /// For the Edit menu, which has Cut, Copy and Paste.
    static std::vector<CKsMenuCommand> ClipboardMenu();
    static CKsMenuCommand ClearEntry(const CGenGrid* grid);
    /// What a menu calls the action, with what it would be about now: "Clear 12 Cells". Null is for no grid.
    static QString TextFor(GridAction action, const CGenGrid* grid);
    /// "Delete 3 Lines"; the text given where none is chosen.
    static QString DeleteText(const CGenGrid* grid, const QString& otherwise);
    static bool Knows(int command);
    static bool Knows(GridAction action);
    /// `grid` is the one that the user means; null for none.
    static bool CanRun(int command, const CGenGrid* grid);
    static bool CanRun(GridAction action, const CGenGrid& grid);
    static void Run(int command, CGenGrid& grid);
    /// One that cannot be run says why, in the status bar.
    static void Run(GridAction action, CGenGrid& grid);

private:
    static QString WhyNot(GridAction action, const CGenGrid& grid);
};
