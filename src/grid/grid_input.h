// The keys of a grid: they do nothing that the grid does not offer.
#pragma once

#include <QObject>

class CGenGrid;
class QKeyEvent;
enum class GridAction;

class CGridInput : public QObject
{
public:
    /// A child of the grid.
    explicit CGridInput(CGenGrid& grid);

    void Run(GridAction action);

protected:
    bool eventFilter(QObject* object, QEvent* event) override;

private:
    void Ask(GridAction action);
    void NextCell();
    void PreviousCell();

    CGenGrid& m_grid;
};
