// The line numbers of a grid, with the marks of lines that differ from the last save.
#pragma once

#include <QHeaderView>
#include <utility>

class CGridModel;

/// The numbers are as wide as the grid says: measuring texts of many rows, as the base does whenever the table is laid
/// out, would cost more than all the rest of showing it.
class CLineHeader : public QHeaderView
{
    Q_OBJECT
public:
    /// A child of `grid`, which shows the model.
    CLineHeader(const CGridModel& model, QWidget* grid);
    QSize sizeHint() const override { return {minimumWidth(), QHeaderView::minimumSizeHint().height()}; }

protected:
    void mousePressEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void paintSection(QPainter* painter, const QRect& rect, int row) const override;

private:
    void ShowMarks();

    const CGridModel& m_model;
    std::pair<int, bool> m_shown; // the changes whose marks are painted, and whether something was being typed
};
