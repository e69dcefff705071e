// The table that the boxes of the additional output stand in: a header row, then rows shaded in turn.
#pragma once

#include <QWidget>

class QCheckBox;

class COutputMatrix : public QWidget
{
    Q_OBJECT
public:
    explicit COutputMatrix(QWidget* parent = nullptr);

    /// A box has no text of its own: its row is called so, and it by its row and column.
    void SetTitle(QCheckBox& box, const QString& title, const QString& toolTip);

protected:
    void paintEvent(QPaintEvent* event) override;
};
