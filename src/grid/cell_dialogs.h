// What the commands on many cells ask for, with the first results and the cells that would stay as they are.
#pragma once

#include "grid/cell_results.h"
#include "grid/grid_keys.h"

#include <QStringList>
#include <optional>

class CGridModel;
class QTableWidget;
class QWidget;

/// For the actions of CellActions that ask; nothing when the user thinks better of it.
std::optional<CCellResults> AskForCells(GridAction action, const CGridModel& model, const CellBlock& block,
                                        QWidget& parent);

/// A list in which a dialog shows cells and what becomes of them.
QTableWidget* MakeResultList(const QString& name, const QStringList& columns);
