#include "plot/drawing/plot_window.h"

#include <QApplication>
#include <algorithm>
#include <cmath>
#include <limits>

namespace {

constexpr double LeastDetail = 1e-9; // of the extent: numbers on the axis are to differ
constexpr double MostOfExtent = 4;   // in sight: who sees less of a branch has lost it
constexpr double WheelStep = 1.25;

/// A number to the digits that a step as large as a pixel has: with more nobody could point at it.
double ToPixel(double number, double pixel)
{
    const double step = std::pow(10, std::floor(std::log10(pixel)));
    // Where a power of ten is a fraction, a division gives its digits exactly; a product does not.
    return step < 1 ? std::round(number * std::round(1 / step)) / std::round(1 / step)
                    : std::round(number / step) * step;
}

} // namespace

CPlotWindow::CPlotWindow(QWidget* parent, PlotHandlers handlers)
    : QCustomPlot(parent),
      m_handlers(std::move(handlers)),
      m_margins(new QCPMarginGroup(this)),
      m_box(QRubberBand::Rectangle, this)
{
    setNotAntialiasedElements(QCP::aeGrid | QCP::aeAxes);
    setPlottingHints(QCP::phFastPolylines | QCP::phCacheLabels);
    setFocusPolicy(Qt::StrongFocus);
    setMouseTracking(true);
    setContextMenuPolicy(Qt::PreventContextMenu);
    plotLayout()->clear();
    plotLayout()->setRowSpacing(0);
}

CPlotWindow::~CPlotWindow()
{
    m_tracks.clear();
}

const PlotCurve& CPlotWindow::CurveOf(const PlotPoint& point) const
{
    return m_content.tracks[std::size_t(point.track)].curves[std::size_t(point.curve)];
}

bool CPlotWindow::IsPoint(const PlotPoint& point) const
{
    return point.track >= 0 && std::size_t(point.track) < m_content.tracks.size() && point.curve >= 0 &&
           std::size_t(point.curve) < m_content.tracks[std::size_t(point.track)].curves.size() &&
           point.point < CurveOf(point).x.size();
}

void CPlotWindow::Show(PlotContent content, bool fits)
{
    EndGesture();
    std::vector<std::optional<QCPRange>> values; // of tracks that stay what they are
    for (const auto& track : m_tracks)
        values.push_back(track->ChosenValues());
    const auto labels = [](const PlotContent& each) {
        QStringList all;
        for (const PlotTrack& track : each.tracks)
            all << track.label;
        return all;
    };
    const bool isSame = labels(m_content) == labels(content);
    m_tracks.clear();
    plotLayout()->simplify();
    m_content = std::move(content);
    m_current = {};
    for (std::size_t i = 0; i < m_content.tracks.size(); ++i) {
        m_tracks.push_back(std::make_unique<CTrackView>(*this, int(2 * i), m_content.tracks[i]));
        QCPAxisRect& axes = m_tracks.back()->Axes();
        axes.setMarginGroup(QCP::msLeft | QCP::msRight, m_margins);
        axes.setMinimumMargins(QMargins(6, 7, 10, 2));
        const bool isLast = i + 1 == m_content.tracks.size();
        QCPAxis& across = m_tracks.back()->Across();
        across.setTickLabels(isLast);
        across.setNumberFormat(QStringLiteral("f"));
        across.setLabel(isLast ? m_content.axis : QString());
        across.setLabelPadding(0);
        if (isSame && !fits && values[i])
            m_tracks.back()->SetValues(*values[i]);
    }
    SetColors(palette());
    if (fits || !m_hasSight)
        Fit();
    else
        Mark(m_marked, {});
    m_hasSight = true;
    Redraw();
}

void CPlotWindow::SetColors(const QPalette& of)
{
    const CPlotColors colors(of);
    setBackground(QBrush(colors.paper));
    for (const auto& track : m_tracks)
        track->SetColors(colors);
}

std::pair<double, double> CPlotWindow::Extent() const
{
    double from = std::numeric_limits<double>::infinity(), to = -from;
    for (const PlotTrack& track : m_content.tracks)
        for (const PlotCurve& curve : track.curves) {
            if (curve.x.empty())
                continue;
            from = std::min(from, curve.x.front());
            to = std::max(to, curve.x.back());
            for (const double end : curve.end) {
                from = std::min(from, end);
                to = std::max(to, end);
            }
        }
    if (from > to)
        return {0, 1};
    const double margin = to > from ? (to - from) * 0.02 : 1;
    return {from - margin, to + margin};
}

void CPlotWindow::Fit()
{
    for (const auto& track : m_tracks)
        track->FitValues();
    std::tie(m_from, m_to) = Extent();
    Redraw();
}

void CPlotWindow::SetSight(double from, double to)
{
    const auto [first, last] = Extent();
    const double least = std::max((last - first) * LeastDetail, std::abs(from) * 1e-12);
    if (!std::isfinite(from) || !std::isfinite(to) || to - from < least || to - from > (last - first) * MostOfExtent)
        return;
    m_from = from;
    m_to = to;
    Redraw();
}

void CPlotWindow::ZoomAbout(double x, double factor)
{
    SetSight(x - (x - m_from) / factor, x + (m_to - x) / factor);
}

void CPlotWindow::Zoom(double factor)
{
    ZoomAbout((m_from + m_to) / 2, factor);
}

void CPlotWindow::DrawCurves(int pixels)
{
    for (const auto& track : m_tracks)
        track->Draw(m_from, m_to, pixels > 0 ? pixels : std::max(track->Axes().width(), 100),
                    m_gesture == Gesture::Point);
}

void CPlotWindow::Redraw()
{
    DrawCurves(0);
    replot(QCustomPlot::rpImmediateRefresh);
}

void CPlotWindow::PaintOn(QPaintDevice& device, int width, int height, double scale)
{
    QPalette onPaper;
    onPaper.setColor(QPalette::Base, Qt::white);
    onPaper.setColor(QPalette::Text, Qt::black);
    SetColors(onPaper);
    ShowCross({});
    DrawCurves(width * 4); // finer than a screen
    {
        QCPPainter painter(&device);
        painter.setMode(QCPPainter::pmVectorized);
        painter.scale(scale, scale);
        toPainter(&painter, width, height);
    }
    SetColors(palette());
    Redraw();
}

void CPlotWindow::Mark(std::optional<double> x, const std::vector<PlotPoint>& points)
{
    m_marked = x;
    for (std::size_t i = 0; i < m_tracks.size(); ++i) {
        std::vector<PlotPoint> its;
        std::ranges::copy_if(points, std::back_inserter(its),
                             [&](const PlotPoint& point) { return point.track == int(i) && IsPoint(point); });
        m_tracks[i]->Mark(x, its);
    }
    if (!points.empty() && (!IsPoint(m_current) || std::ranges::find(points, m_current) == points.end()))
        m_current = points.front();
    if (points.empty())
        m_current = {};
    if (x && m_gesture == Gesture::None && (*x < m_from || *x > m_to))
        SetSight(*x - (m_to - m_from) / 2, *x + (m_to - m_from) / 2);
    else
        RedrawOverlay();
}

int CPlotWindow::TrackAt(const QPointF& place) const
{
    for (std::size_t i = 0; i < m_tracks.size(); ++i)
        if (m_tracks[i]->Axes().rect().contains(place.toPoint()))
            return int(i);
    return -1;
}

std::optional<PlotPoint> CPlotWindow::PointNear(const QPointF& place) const
{
    const int track = TrackAt(place);
    return track < 0 ? std::nullopt : m_tracks[std::size_t(track)]->PointNear(place, track);
}

void CPlotWindow::ShowCross(std::optional<double> x)
{
    const auto text = [this](int track, double value) {
        return m_handlers.text ? m_handlers.text(track, value) : QString::number(value, 'g', 7);
    };
    for (std::size_t i = 0; i < m_tracks.size(); ++i) {
        CTrackView& track = *m_tracks[i];
        const QCPAxis& across = track.Across();
        const QString head =
            x && i == 0 ? text(-1, ToPixel(*x, across.range().size() / track.Axes().width())) : QString();
        track.ShowCross(x, head, [&text, i](double value) { return text(int(i), value); });
    }
}

// ---- mouse -------------------------------------------------------------------------------------

void CPlotWindow::mousePressEvent(QMouseEvent* event)
{
    EndGesture();
    const int track = TrackAt(event->position());
    if (track < 0)
        return;
    m_pressed = event->position();
    m_isMoved = false;
    m_sightThen = Sight();
    m_valuesThen = m_tracks[std::size_t(track)]->Up().range();
    const bool isLeft = event->button() == Qt::LeftButton;
    const auto point = PointNear(m_pressed);
    if (isLeft && point) {
        m_current = *point;
        m_gesture = Gesture::Point;
    } else if (event->button() == Qt::RightButton || (isLeft && event->modifiers() & Qt::ShiftModifier)) {
        m_gesture = Gesture::Box;
    } else if (isLeft || event->button() == Qt::MiddleButton) {
        m_gesture = Gesture::Pan;
    }
}

void CPlotWindow::mouseMoveEvent(QMouseEvent* event)
{
    const QPointF away = event->position() - m_pressed;
    m_isMoved = m_isMoved || away.manhattanLength() >= QApplication::startDragDistance() / 2.0;
    if (m_gesture == Gesture::Box) {
        m_box.setGeometry(QRect(m_pressed.toPoint(), event->position().toPoint()).normalized());
        m_box.setVisible(m_isMoved);
    } else if (m_gesture == Gesture::Pan && m_isMoved && !m_tracks.empty()) {
        setCursor(Qt::ClosedHandCursor);
        const auto [from, to] = m_sightThen;
        const double by = away.x() * (to - from) / std::max(m_tracks.front()->Axes().width(), 1);
        SetSight(from - by, to - by);
    } else if (m_gesture == Gesture::Point && m_isMoved) {
        Drag(*event);
    } else if (m_gesture == Gesture::None) {
        const int track = TrackAt(event->position());
        ShowCross(track < 0
                      ? std::nullopt
                      : std::optional(m_tracks[std::size_t(track)]->Across().pixelToCoord(event->position().x())));
        setCursor(PointNear(event->position()) ? Qt::PointingHandCursor : Qt::ArrowCursor);
        RedrawOverlay();
    }
}

/// Where the point goes that is being dragged: up and down, with Ctrl along the axis; with Shift to the tenths of what
/// stands between two numbers of the axis.
QPointF CPlotWindow::DraggedTo(const QMouseEvent& event) const
{
    const CTrackView& track = TrackOf(m_current);
    const PlotCurve& curve = CurveOf(m_current);
    QPointF to{curve.x[m_current.point], curve.y[m_current.point]};
    const bool isAlong = event.modifiers() & Qt::ControlModifier;
    QCPAxis& axis = isAlong ? track.Across() : track.Up();
    double value = axis.pixelToCoord(isAlong ? event.position().x() : event.position().y());
    const double pixel = axis.range().size() / std::max(isAlong ? track.Axes().width() : track.Axes().height(), 1);
    value = ToPixel(value, event.modifiers() & Qt::ShiftModifier ? axis.range().size() / 10 : pixel);
    (isAlong ? to.rx() : to.ry()) = value;
    return to;
}

void CPlotWindow::Drag(const QMouseEvent& event)
{
    ShowCross({});
    setCursor(event.modifiers() & Qt::ControlModifier ? Qt::SizeHorCursor : Qt::SizeVerCursor);
    const QPointF to = DraggedTo(event);
    TrackOf(m_current).ShowDragged(to,
                                   m_handlers.dragging ? m_handlers.dragging(m_current, to.x(), to.y()) : QString());
    RedrawOverlay();
}

void CPlotWindow::mouseReleaseEvent(QMouseEvent* event)
{
    const Gesture gesture = m_gesture;
    const bool isMoved = m_isMoved;
    const QRect box = m_box.geometry();
    const PlotPoint point = m_current;
    const QPointF to = gesture == Gesture::Point && IsPoint(point) ? DraggedTo(*event) : QPointF();
    EndGesture();
    if (gesture == Gesture::Box && isMoved)
        ZoomToBox(box);
    else if (gesture == Gesture::Point && IsPoint(point) && !isMoved && m_handlers.picked)
        m_handlers.picked(point);
    else if (gesture == Gesture::Point && IsPoint(point) && isMoved && m_handlers.moved)
        m_handlers.moved(point, to.x(), to.y());
}

void CPlotWindow::ZoomToBox(const QRect& box)
{
    const int at = TrackAt(m_pressed);
    if (at < 0 || box.width() < 4)
        return;
    CTrackView& track = *m_tracks[std::size_t(at)];
    const double from = track.Across().pixelToCoord(box.left()), to = track.Across().pixelToCoord(box.right());
    if (box.height() >= 4 && track.Track().lanes.isEmpty())
        track.SetValues({track.Up().pixelToCoord(box.bottom()), track.Up().pixelToCoord(box.top())});
    SetSight(from, to);
}

void CPlotWindow::EndGesture()
{
    if (IsPoint(m_current) && std::size_t(m_current.track) < m_tracks.size())
        TrackOf(m_current).ShowDragged({}, {});
    m_gesture = Gesture::None;
    m_isMoved = false;
    m_box.hide();
    unsetCursor();
}

void CPlotWindow::mouseDoubleClickEvent(QMouseEvent* event)
{
    const int track = TrackAt(event->position());
    if (track < 0 || event->button() != Qt::LeftButton || PointNear(event->position()) || !m_handlers.added)
        return;
    const CTrackView& view = *m_tracks[std::size_t(track)];
    m_handlers.added(track, view.Across().pixelToCoord(event->position().x()),
                     view.Up().pixelToCoord(event->position().y()));
}

void CPlotWindow::wheelEvent(QWheelEvent* event)
{
    const int at = TrackAt(event->position());
    const double factor = std::pow(WheelStep, event->angleDelta().y() / 120.0);
    event->accept();
    if (at < 0 || m_gesture != Gesture::None)
        return;
    CTrackView& track = *m_tracks[std::size_t(at)];
    if (!(event->modifiers() & Qt::ControlModifier))
        return ZoomAbout(track.Across().pixelToCoord(event->position().x()), factor);
    if (!track.Track().lanes.isEmpty())
        return;
    const double middle = track.Up().pixelToCoord(event->position().y());
    const QCPRange values = track.Up().range();
    track.SetValues({middle - (middle - values.lower) / factor, middle + (values.upper - middle) / factor});
    Redraw();
}

void CPlotWindow::leaveEvent(QEvent* event)
{
    ShowCross({});
    RedrawOverlay();
    QCustomPlot::leaveEvent(event);
}

// ---- keys --------------------------------------------------------------------------------------

/// The next point of the current curve, or the previous one; the first movable curve has one before any is current.
void CPlotWindow::Step(int by)
{
    PlotPoint next = m_current;
    if (IsPoint(next)) {
        const auto count = std::ptrdiff_t(CurveOf(next).x.size());
        auto point = std::ptrdiff_t(next.point) + by;
        if (point < 0 || point >= count)
            return;
        next.point = std::size_t(point);
    } else {
        next = {};
        for (std::size_t track = 0; track < m_content.tracks.size() && next.track < 0; ++track)
            for (std::size_t curve = 0; curve < m_content.tracks[track].curves.size() && next.track < 0; ++curve)
                if (const PlotCurve& each = m_content.tracks[track].curves[curve]; each.isMovable && !each.x.empty())
                    next = {int(track), int(curve), by > 0 ? 0 : each.x.size() - 1};
        if (next.track < 0)
            return;
    }
    m_current = next;
    if (m_handlers.picked)
        m_handlers.picked(next);
}

void CPlotWindow::keyPressEvent(QKeyEvent* event)
{
    const double width = m_to - m_from;
    switch (event->key()) {
    case Qt::Key_Escape:
        if (m_gesture == Gesture::None)
            return QCustomPlot::keyPressEvent(event);
        if (m_gesture == Gesture::Pan)
            SetSight(m_sightThen.first, m_sightThen.second);
        EndGesture();
        return RedrawOverlay();
    case Qt::Key_Left:
    case Qt::Key_Right:
        return Step(event->key() == Qt::Key_Right ? 1 : -1);
    case Qt::Key_PageUp:
        return SetSight(m_from - width / 2, m_to - width / 2);
    case Qt::Key_PageDown:
        return SetSight(m_from + width / 2, m_to + width / 2);
    case Qt::Key_Home:
        return Fit();
    case Qt::Key_Plus:
    case Qt::Key_Equal:
        return Zoom(WheelStep);
    case Qt::Key_Minus:
        return Zoom(1 / WheelStep);
    case Qt::Key_Delete:
        if (IsPoint(m_current) && CurveOf(m_current).isMovable && m_handlers.removed)
            m_handlers.removed(m_current);
        return;
    default:
        QCustomPlot::keyPressEvent(event);
    }
}

/// Keys that are the plot's while it has the focus are nobody's shortcuts.
bool CPlotWindow::event(QEvent* event)
{
    if (event->type() == QEvent::ShortcutOverride) {
        auto* key = static_cast<QKeyEvent*>(event);
        if (key->key() == Qt::Key_Delete || (key->key() == Qt::Key_Escape && m_gesture != Gesture::None))
            key->accept();
    }
    return QCustomPlot::event(event);
}

void CPlotWindow::resizeEvent(QResizeEvent* event)
{
    QCustomPlot::resizeEvent(event);
    Redraw();
}

void CPlotWindow::changeEvent(QEvent* event)
{
    QCustomPlot::changeEvent(event);
    if (event->type() == QEvent::PaletteChange || event->type() == QEvent::FontChange) {
        SetColors(palette());
        Redraw();
    }
}
