// The tool tips of a window as they come up below the mouse.
#pragma once

#include <QLabel>
#include <QString>
#include <QStringList>

/// The label of the tool tip that stands on the screen; null for none.
const QLabel* ToolTipLabel();

class ShownTips
{
public:
    /// Rests with the mouse on everything in a window that is seen: widgets, cells, headers, items of trees, and places
    /// of what is painted by hand.
    void RestOn(QWidget& window);

    QStringList rich;   // a text in them could be markup
    QStringList turned; // have marks that turn the direction of writing
    QStringList all;

private:
    void Sweep(QWidget& widget);
    void At(QWidget& widget, QPoint position);
};
