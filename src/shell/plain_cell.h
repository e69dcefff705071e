// Cells of the tables in dialogs.
#pragma once

#include <QTableWidgetItem>

/// A cell that is read and selected only. Its tool tip tells the text whole, or another one; names and contents of files
/// in it are no markup.
inline QTableWidgetItem* PlainCell(const QString& text, const QString& toolTip = {})
{
    auto* cell = new QTableWidgetItem(text);
    cell->setFlags(Qt::ItemIsEnabled | Qt::ItemIsSelectable);
    cell->setToolTip(QStringLiteral("<qt>%1</qt>").arg((toolTip.isEmpty() ? text : toolTip).toHtmlEscaped()));
    return cell;
}
