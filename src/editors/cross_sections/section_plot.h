// The plot of one cross section: ground, water and its width, axes in the user's units.
#pragma once

#include "editors/cross_sections/plot_axis.h"
#include "editors/cross_sections/plot_style.h"
#include "editors/cross_sections/section.h"

#include <QPolygonF>
#include <QWidget>

class CSectionPlot : public QWidget
{
    Q_OBJECT
public:
    explicit CSectionPlot(QWidget* parent = nullptr);

    /// Shows a copy of the section; null shows none.
    void Show(const CCrossSection* section);
    /// Marks a point; -1 marks none.
    void SetCurrentPoint(int point);
    /// "MAIN  1250 m"; empty without a section.
    QString Title() const;
    /// Where a place of the section stands in the window. Only with points to show.
    QPointF WindowPoint(const CSectionPoint& point) const;
    const std::optional<CWaterSurface>& Water() const { return m_water; }
    QSize sizeHint() const override { return {640, 420}; }
    QSize minimumSizeHint() const override { return {220, 150}; }

signals:
    /// By mouse or keys.
    void PointPicked(int point);
    /// The user wants the next section (1) or the previous one (-1).
    void SectionStep(int step);

protected:
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void changeEvent(QEvent* event) override;
    bool event(QEvent* event) override;

private:
    bool HasPoints() const { return m_section && !m_section->points.empty(); }
    void Layout();
    void Describe();
    int PointNear(const QPointF& at) const;
    QPolygonF GroundLine() const;
    QString Caption() const;

    void PaintTitle(QPainter& painter, const CPlotStyle& style) const;
    void PaintAxes(QPainter& painter, const CPlotStyle& style) const;
    void PaintWater(QPainter& painter, const CPlotStyle& style) const;
    void PaintWidth(QPainter& painter, const CPlotStyle& style) const;
    void PaintGround(QPainter& painter, const CPlotStyle& style) const;
    void PaintPoints(QPainter& painter, const CPlotStyle& style) const;
    void PaintHint(QPainter& painter, const CPlotStyle& style) const;

    std::optional<CCrossSection> m_section;
    std::optional<CWaterSurface> m_water;
    int m_point = -1;
    QRectF m_area; // of the plot, inside the axes
    CPlotAxis m_across, m_up;
};
