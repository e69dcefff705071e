// One track of a plot on the window: its axes, its curves as far as they are in sight, what is marked on it.
#pragma once

#include "plot/drawing/plot_colors.h"
#include "plot/reduced_curve.h"

#include <algorithm>
#include <limits>
#include <qcustomplot.h>

class CTrackView
{
public:
    /// In two rows of the plot from `row` on: name and legend, then the curves. `track` outlives it.
    CTrackView(QCustomPlot& plot, int row, const PlotTrack& track);
    CTrackView(const CTrackView&) = delete;
    CTrackView& operator=(const CTrackView&) = delete;
    /// What it has added to the plot goes with it.
    ~CTrackView();

    const PlotTrack& Track() const { return *m_track; }
    QCPAxisRect& Axes() const { return *m_axes; }
    QCPAxis& Across() const { return *m_axes->axis(QCPAxis::atBottom); }
    QCPAxis& Up() const { return *m_axes->axis(QCPAxis::atLeft); }

    void SetColors(const CPlotColors& colors);
    /// The values follow what is in sight, until the user chooses others.
    void FitValues() { m_fitsValues = true; }
    void SetValues(const QCPRange& values);
    /// Nothing while they follow.
    std::optional<QCPRange> ChosenValues() const { return m_fitsValues ? std::nullopt : std::optional(Up().range()); }
    /// The curves on so many columns; their values stay where they are while `isHeld`.
    void Draw(double from, double to, int pixels, bool isHeld);
    /// The point of a curve that may be changed, or of any, nearest to a place of the window, if one is near.
    std::optional<PlotPoint> PointNear(const QPointF& place, int number) const;
    QPointF PlaceOf(const PlotPoint& point) const;
    /// The value of a curve there, between its points; not a number where it has none.
    static double ValueAt(const PlotCurve& curve, double x);

    void Mark(std::optional<double> x, const std::vector<PlotPoint>& points);
    /// The line under the pointer, and what the curves are there below `head`, if that says anything; nothing shows
    /// none.
    void ShowCross(std::optional<double> x, const QString& head, const std::function<QString(double)>& textOf);
    /// A point that is being dragged, with what is said of it; nothing shows none.
    void ShowDragged(std::optional<QPointF> point, const QString& text);

private:
    struct Curve
    {
        QCPGraph* line = nullptr; // or
        QCPCurve* bars = nullptr;
        CReducedCurve reduced{};
    };
    void AddCurve(const PlotCurve& curve);
    /// From the least to the largest one of values.
    struct Span
    {
        double least = std::numeric_limits<double>::infinity(), most = -least;
        void Add(double value)
        {
            least = std::min(least, value); // of what is no number nothing becomes
            most = std::max(most, value);
        }
    };
    void FitTo(Span values);
    Span DrawLine(const Curve& view, const PlotCurve& curve, double from, double to, int pixels);
    void DrawBars(const Curve& view, const PlotCurve& curve, double from, double to, int pixels);
    void AddOverlay();

    QCustomPlot* m_plot;
    QCPAxisRect* m_axes;
    QCPLayoutGrid* m_head;
    QCPTextElement* m_name;
    const PlotTrack* m_track;
    std::vector<Curve> m_curves;
    QCPLegend* m_legend;
    bool m_fitsValues = true;
    // On a layer of its own, which alone is painted anew when they move.
    QCPItemStraightLine *m_cross, *m_mark;
    QCPItemText *m_crossText, *m_dragText;
    QCPGraph *m_marked, *m_dragged;
};
