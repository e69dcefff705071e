// The column headers of a grid: units, marks of the sorting, and room for the fields that filter the lines.
#pragma once

#include <QHeaderView>

class CFilterFields;
class CGenGrid;
class QLabel;

class CGridHeader : public QHeaderView
{
    Q_OBJECT
public:
    /// A child of the grid.
    explicit CGridHeader(CGenGrid& grid);

    CFilterFields& Fields() const { return *m_fields; }
    QSize sizeHint() const override;
    void setSelectionModel(QItemSelectionModel* selection) override;
    /// The column that a press at `x` makes wider or narrower; -1 for none. The base's own rule, which it does not
    /// tell.
    int BorderAt(int x) const;

protected:
    bool viewportEvent(QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void initStyleOptionForIndex(QStyleOptionHeader* option, int column) const override;
    QSize sectionSizeFromContents(int column) const override;
    void paintSection(QPainter* painter, const QRect& rect, int column) const override;
    void contextMenuEvent(QContextMenuEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    QPoint LaidOut(const QPoint& place) const;
    bool ResizeFrozen(const QEvent& event, int x);
    void ShowCount();

    CGenGrid& m_grid;
    CFilterFields* m_fields; // a child
    QLabel* m_count;         // how many lines are shown, beside the scroll bar
    int m_resized = -1;      // the frozen column whose border is being dragged
    int m_widthAtZero = 0;   // that it would have with the mouse at the left
};
