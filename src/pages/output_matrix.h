// The table that the boxes of the additional output stand in: a header row, then rows shaded in turn.
#pragma once

#include <QWidget>

class COutputMatrix : public QWidget
{
    Q_OBJECT
public:
    explicit COutputMatrix(QWidget* parent = nullptr);

protected:
    void paintEvent(QPaintEvent* event) override;
};
