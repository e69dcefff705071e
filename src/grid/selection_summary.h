// What the numbers that are selected in a grid come to.
#pragma once

#include <QObject>
#include <QString>
#include <QTimer>

class CGenGrid;

/// Found a moment after the selection was made or its numbers changed, so that nobody who moves through a table waits
/// for it.
class CSelectionSummary : public QObject
{
public:
    /// A child of the grid, which has its selection already.
    explicit CSelectionSummary(CGenGrid& grid);

    /// "12 cells: sum 30, mean 2.5, min 1, max 4 m"; without numbers, or with such of several units, the number of
    /// cells only. Empty for a single cell, and until it is known.
    const QString& Text() const { return m_text; }

private:
    void FindAgain();
    QString Found() const;

    CGenGrid& m_grid;
    QTimer m_pause;
    QString m_text;
};
