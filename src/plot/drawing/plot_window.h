// The plot as a window: tracks one below the other over one axis, mouse and keys.
//
// | Mouse or key | Does |
// |---|---|
// | drag | moves along the axis |
// | wheel; with Ctrl | zooms the axis about the pointer; the values of the track |
// | right drag, Shift+drag | zooms into a box |
// | drag of a point; with Ctrl; with Shift | changes its value; its place; in whole steps |
// | click on a point, Left, Right | makes it current |
// | double click | adds a point |
// | Delete | removes the current point |
// | Home, +, - | shows all, zooms |
// | Escape | gives a drag up |
#pragma once

#include "plot/drawing/track_view.h"

#include <memory>

class CPlotWindow : public QCustomPlot
{
    Q_OBJECT
public:
    CPlotWindow(QWidget* parent, PlotHandlers handlers);
    ~CPlotWindow() override;

    // See IPlot.
    void Show(PlotContent content, bool fits);
    void Mark(std::optional<double> x, const std::vector<PlotPoint>& points);
    void Fit();
    void Zoom(double factor);
    void SetSight(double from, double to);
    std::pair<double, double> Sight() const { return {m_from, m_to}; }
    /// Draws it on white paper: `width` and `height` count pixels of a screen, which are `scale` of the device each.
    void PaintOn(QPaintDevice& device, int width, int height, double scale);
    void Redraw();

    QSize minimumSizeHint() const override { return {240, 120}; }
    QSize sizeHint() const override { return {640, 260}; }

protected:
    void resizeEvent(QResizeEvent* event) override;
    void changeEvent(QEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void leaveEvent(QEvent* event) override;
    bool event(QEvent* event) override;

private:
    enum class Gesture
    {
        None,
        Pan,
        Box,
        Point
    };
    CTrackView& TrackOf(const PlotPoint& point) const { return *m_tracks[std::size_t(point.track)]; }
    const PlotCurve& CurveOf(const PlotPoint& point) const;
    bool IsPoint(const PlotPoint& point) const;
    int TrackAt(const QPointF& place) const;
    std::optional<PlotPoint> PointNear(const QPointF& place) const;
    std::pair<double, double> Extent() const;
    void SetColors(const QPalette& palette);
    /// Curves for the size and the part of the axis of now.
    void DrawCurves(int pixels);
    void ZoomAbout(double x, double factor);
    void ZoomToBox(const QRect& box);
    QPointF DraggedTo(const QMouseEvent& event) const;
    void Drag(const QMouseEvent& event);
    void EndGesture();
    void ShowCross(std::optional<double> x);
    void Step(int by);
    void RedrawOverlay() { layer(QStringLiteral("overlay"))->replot(); }

    PlotHandlers m_handlers;
    PlotContent m_content;
    std::vector<std::unique_ptr<CTrackView>> m_tracks; // of m_content
    double m_from = 0, m_to = 1;                       // of the axis, in sight
    bool m_hasSight = false;                           // that is of some content
    PlotPoint m_current{};
    std::optional<double> m_marked{};
    Gesture m_gesture = Gesture::None;
    QPointF m_pressed{};                     // where it began
    std::pair<double, double> m_sightThen{}; // likewise, what was in sight
    QCPRange m_valuesThen{};                 // of the track it began in
    bool m_isMoved = false;                  // so far that no click was meant
    QCPMarginGroup* m_margins;               // of the tracks, whose curves stand one below the other; child
    QRubberBand m_box;
};
