// Cells of the tables in dialogs.
#pragma once

#include "ks/fc/shown_text.h"

#include <QTableWidgetItem>

/// A cell that is read and selected only, with whatever names it shows as text. Its tool tip tells it whole, or another
/// text.
inline QTableWidgetItem* PlainCell(const QString& text, const QString& toolTip = {})
{
    auto* cell = new QTableWidgetItem(KsVisibleText(text, true));
    cell->setFlags(Qt::ItemIsEnabled | Qt::ItemIsSelectable);
    cell->setToolTip(toolTip.isEmpty() ? cell->text() : KsVisibleText(toolTip, true));
    return cell;
}
