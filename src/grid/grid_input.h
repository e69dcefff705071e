// The keys of a grid and its menu: both do nothing that the grid does not offer.
#pragma once

#include <QObject>

class CGenGrid;
class QKeyEvent;
class QPoint;
enum class GridAction;

class CGridInput : public QObject
{
public:
    /// A child of the grid.
    explicit CGridInput(CGenGrid& grid);

    void Run(GridAction action);
    void ShowMenu(const QPoint& at);

protected:
    bool eventFilter(QObject* object, QEvent* event) override;

private:
    void Ask(GridAction action);
    void NextCell();
    void PreviousCell();

    CGenGrid& m_grid;
};
