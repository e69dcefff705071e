// Cells of the tables in dialogs.
#pragma once

#include <QTableWidgetItem>

/// A cell that is read and selected only. Its tool tip tells the text whole, or another one.
inline QTableWidgetItem* PlainCell(const QString& text, const QString& toolTip = {})
{
    auto* cell = new QTableWidgetItem(text);
    cell->setFlags(Qt::ItemIsEnabled | Qt::ItemIsSelectable);
    cell->setToolTip(toolTip.isEmpty() ? text : toolTip);
    return cell;
}
