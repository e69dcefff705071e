// What a paste would do, shown before it does: how the texts are understood, where they go, and what does not fit.
#pragma once

#include "grid/paste_plan.h"

class QWidget;

/// What the user decided: the cells, and how they came to be.
struct PasteDecision
{
    PastedCells cells;
    PasteChoice choice;
    std::size_t cellCount = 0;
    QString leftOut{};      // what does not fit, and blank lines: "2 lines, 1 cell"; empty for nothing
    std::size_t hidden = 0; // lines that a filter hides
    bool hasShorterLines = false;
};
/// With the cells of the plan, which has none afterwards.
PasteDecision DecisionOf(CPastePlan& plan);

/// Nothing when the user thinks better of it. `hasPlaces`: the first two columns are branch and chainage.
std::optional<PasteDecision> AskForPaste(const CTableRows& rows, const ReadCopied& read, int row, int column,
                                         bool hasPlaces, QWidget& parent);
