#include "plot/drawing/track_view.h"

#include <algorithm>
#include <cmath>
#include <limits>

namespace {

constexpr int NearPixels = 8;              // to a point, for the mouse to mean it
constexpr int PointDistance = 7;           // between points, on the average, for them to be shown
constexpr double BarWidth = 7, BarGap = 2; // pixels
constexpr int PixelsPerTick = 30;
constexpr int TicksAcross = 10;
constexpr double None = std::numeric_limits<double>::quiet_NaN();

} // namespace

CTrackView::CTrackView(QCustomPlot& plot, int row, const PlotTrack& track)
    : m_plot(&plot),
      m_axes(new QCPAxisRect(&plot, true)),
      m_head(new QCPLayoutGrid),
      m_name(new QCPTextElement(&plot, track.label)),
      m_track(&track),
      m_legend(new QCPLegend)
{
    plot.plotLayout()->addElement(row, 0, m_head);
    plot.plotLayout()->addElement(row + 1, 0, m_axes);
    plot.plotLayout()->setRowStretchFactor(row, 0.001); // as high as its texts
    plot.plotLayout()->setRowStretchFactor(row + 1, track.weight);
    for (QCPAxis* axis : m_axes->axes()) {
        axis->setLayer(QStringLiteral("axes"));
        axis->grid()->setLayer(QStringLiteral("grid"));
    }
    m_head->addElement(0, 0, m_name);
    m_head->addElement(0, 1, m_legend);
    m_head->addElement(0, 2, new QCPLayoutElement(&plot)); // takes the rest of the row
    m_head->setColumnStretchFactors({0.001, 0.001, 1});
    m_head->setMargins(QMargins(8, 2, 0, 0));
    m_name->setMargins({});
    m_legend->setLayer(QStringLiteral("legend"));
    m_legend->setFillOrder(QCPLayoutGrid::foColumnsFirst);
    m_legend->setMargins(QMargins(8, 0, 0, 0));
    m_legend->setIconSize(18, 10);
    m_legend->setBorderPen(Qt::NoPen);
    m_legend->setBrush(Qt::NoBrush);
    Up().setNumberFormat(QStringLiteral("gb"));
    Up().setTickLabels(track.lanes.isEmpty());
    Up().setTicks(track.lanes.isEmpty());
    for (const PlotCurve& curve : track.curves)
        AddCurve(curve);
    AddOverlay();
}

CTrackView::~CTrackView()
{
    for (const Curve& curve : m_curves)
        m_plot->removePlottable(curve.line ? static_cast<QCPAbstractPlottable*>(curve.line) : curve.bars);
    for (QCPGraph* graph : {m_marked, m_dragged})
        m_plot->removePlottable(graph);
    for (QCPAbstractItem* item : std::initializer_list<QCPAbstractItem*>{m_cross, m_mark, m_crossText, m_dragText})
        m_plot->removeItem(item);
    m_plot->plotLayout()->remove(m_axes);
    m_plot->plotLayout()->remove(m_head);
}

void CTrackView::AddCurve(const PlotCurve& curve)
{
    Curve view;
    if (curve.end.empty()) {
        view.line = m_plot->addGraph(&Across(), &Up());
        view.line->setAdaptiveSampling(false); // what comes is sampled
        view.reduced = CReducedCurve(curve.x, curve.y);
    } else {
        view.bars = new QCPCurve(&Across(), &Up());
    }
    QCPAbstractPlottable& shown = view.line ? static_cast<QCPAbstractPlottable&>(*view.line) : *view.bars;
    shown.setName(curve.name);
    shown.removeFromLegend();
    shown.addToLegend(m_legend);
    m_curves.push_back(std::move(view));
}

void CTrackView::AddOverlay()
{
    const QString overlay = QStringLiteral("overlay");
    for (QCPItemStraightLine** line : {&m_mark, &m_cross}) {
        *line = new QCPItemStraightLine(m_plot);
        (*line)->setClipAxisRect(m_axes);
        for (QCPItemPosition* end : {(*line)->point1, (*line)->point2}) {
            end->setAxes(&Across(), &Up());
            end->setAxisRect(m_axes);
            end->setTypeX(QCPItemPosition::ptPlotCoords);
            end->setTypeY(QCPItemPosition::ptAxisRectRatio);
        }
        (*line)->setLayer(overlay);
        (*line)->setVisible(false);
    }
    for (QCPItemText** text : {&m_crossText, &m_dragText}) {
        *text = new QCPItemText(m_plot);
        (*text)->setClipAxisRect(m_axes);
        (*text)->position->setAxes(&Across(), &Up());
        (*text)->position->setAxisRect(m_axes);
        (*text)->position->setTypeX(QCPItemPosition::ptPlotCoords);
        (*text)->setTextAlignment(Qt::AlignLeft);
        (*text)->setPadding(QMargins(4, 1, 4, 1));
        (*text)->setLayer(overlay);
        (*text)->setVisible(false);
    }
    m_crossText->setClipToAxisRect(false);
    m_crossText->setPositionAlignment(Qt::AlignTop | Qt::AlignLeft);
    m_crossText->position->setType(QCPItemPosition::ptAbsolute);
    for (QCPGraph** points : {&m_marked, &m_dragged}) {
        *points = m_plot->addGraph(&Across(), &Up());
        (*points)->removeFromLegend();
        (*points)->setLineStyle(QCPGraph::lsNone);
        (*points)->setLayer(overlay);
    }
}

void CTrackView::SetColors(const CPlotColors& colors)
{
    for (QCPAxis* axis : m_axes->axes()) {
        const QPen pen(colors.muted);
        axis->setBasePen(pen);
        axis->setTickPen(pen);
        axis->setSubTickPen(pen);
        axis->setTickLabelColor(colors.text);
        axis->setLabelColor(colors.text);
        axis->setLabelFont(m_plot->font());
        axis->setTickLabelFont(m_plot->font());
        axis->grid()->setPen(QPen(colors.grid));
        axis->grid()->setZeroLinePen(QPen(colors.muted));
    }
    for (std::size_t i = 0; i < m_curves.size(); ++i) {
        const PlotCurve& curve = m_track->curves[i];
        const QColor ink = colors.Ink(curve.ink, curve.number);
        if (m_curves[i].line) {
            QPen pen(ink, curve.ink == PlotInk::Other ? 1 : 0);
            if (curve.isDashed)
                pen.setStyle(Qt::DashLine);
            m_curves[i].line->setPen(pen);
        } else {
            QPen pen(ink, BarWidth);
            pen.setCapStyle(Qt::FlatCap);
            m_curves[i].bars->setPen(pen);
        }
    }
    for (int item = 0; item < m_legend->itemCount(); ++item) {
        m_legend->item(item)->setFont(m_plot->font());
        m_legend->item(item)->setTextColor(colors.text);
    }
    QFont bold = m_plot->font();
    bold.setBold(true);
    m_name->setFont(bold);
    m_name->setTextColor(colors.text);
    m_mark->setPen(QPen(colors.mark));
    m_cross->setPen(QPen(colors.muted, 0, Qt::DotLine));
    for (QCPItemText* text : {m_crossText, m_dragText}) {
        text->setFont(m_plot->font());
        text->setColor(colors.text);
        text->setBrush(QColor(colors.paper.red(), colors.paper.green(), colors.paper.blue(), 225));
    }
    m_crossText->setBrush(colors.paper);
    m_marked->setScatterStyle({QCPScatterStyle::ssCircle, QPen(colors.mark, 2), QBrush(colors.paper), 9});
    m_dragged->setScatterStyle({QCPScatterStyle::ssCircle, QPen(colors.mark, 2), QBrush(colors.mark), 9});
}

void CTrackView::SetValues(const QCPRange& values)
{
    m_fitsValues = false;
    Up().setRange(values);
}

void CTrackView::FitTo(Span values)
{
    if (values.least > values.most)
        values = {0, 0};
    // A curve that is level stands in the middle, among values as different as its digits may make them.
    const double height = values.most - values.least;
    const double margin = height > 0 ? height * 0.08 : std::max(std::abs(values.most) * 0.1, 0.5);
    Up().setRange(values.least - margin, values.most + margin);
}

void CTrackView::Draw(double from, double to, int pixels, bool isHeld)
{
    Across().setRange(from, to);
    Across().setNumberPrecision(int(std::max(0.0, std::ceil(-std::log10((to - from) / TicksAcross)))));
    Up().ticker()->setTickCount(std::max(m_axes->height() / PixelsPerTick, 2));
    Span values;
    for (std::size_t i = 0; i < m_curves.size(); ++i) {
        if (!m_curves[i].line) {
            DrawBars(m_curves[i], m_track->curves[i], from, to, pixels);
            continue;
        }
        const Span its = DrawLine(m_curves[i], m_track->curves[i], from, to, pixels);
        values = {std::min(values.least, its.least), std::max(values.most, its.most)};
    }
    if (!m_track->lanes.isEmpty())
        Up().setRange(-0.6, double(m_track->lanes.size()) - 0.4);
    else if (m_fitsValues && !isHeld)
        FitTo(values);
}

/// Returns between which values it runs.
CTrackView::Span CTrackView::DrawLine(const Curve& view, const PlotCurve& curve, double from, double to, int pixels)
{
    const std::vector<std::size_t> points = view.reduced.Visible(from, to, pixels);
    Span values;
    QVector<QCPGraphData> data;
    data.reserve(qsizetype(points.size()));
    for (const std::size_t point : points) {
        data.push_back({curve.x[point], curve.y[point]});
        if (curve.x[point] >= from && curve.x[point] <= to)
            values.Add(curve.y[point]);
    }
    for (const double edge : {from, to}) // where a line enters and leaves
        values.Add(ValueAt(curve, edge));
    view.line->data()->set(data, true);
    const auto [first, last] = view.reduced.Between(from, to);
    const bool hasRoom = last - first <= std::size_t(std::max(pixels / PointDistance, 1));
    const QColor ink = view.line->pen().color();
    const bool shows = hasRoom && (curve.hasPoints || last - first < 2);
    view.line->setScatterStyle(shows ? QCPScatterStyle(QCPScatterStyle::ssDisc, ink, 5) : QCPScatterStyle());
    view.line->setAntialiased(hasRoom); // of a line that changes with every pixel nobody sees it
    return values;
}

/// Reaches that look the same are drawn once.
void CTrackView::DrawBars(const Curve& view, const PlotCurve& curve, double from, double to, int pixels)
{
    QVector<QCPCurveData> data;
    const double perPixel = (to - from) / pixels;
    std::array<double, 3> before{None, None, None};
    for (std::size_t i = 0; i < curve.x.size(); ++i) {
        const double first = std::min(curve.x[i], curve.end[i]), last = std::max(curve.x[i], curve.end[i]);
        if (!(last >= from && first <= to))
            continue;
        const std::array looks{std::floor(first / perPixel), std::floor(last / perPixel), curve.y[i]};
        if (looks == before)
            continue;
        before = looks;
        const double t = double(data.size());
        data.push_back({t, first, curve.y[i]});
        data.push_back({t + 1, std::max(last - BarGap * perPixel, first + perPixel), curve.y[i]});
        data.push_back({t + 2, None, None});
    }
    view.bars->data()->set(data, true);
}

QPointF CTrackView::PlaceOf(const PlotPoint& point) const
{
    const PlotCurve& curve = m_track->curves[std::size_t(point.curve)];
    return {Across().coordToPixel(curve.x[point.point]), Up().coordToPixel(curve.y[point.point])};
}

std::optional<PlotPoint> CTrackView::PointNear(const QPointF& place, int number) const
{
    std::optional<PlotPoint> nearest;
    double distance = NearPixels * NearPixels;
    const double from = Across().pixelToCoord(place.x() - NearPixels),
                 to = Across().pixelToCoord(place.x() + NearPixels);
    for (std::size_t i = 0; i < m_curves.size(); ++i) {
        const PlotCurve& curve = m_track->curves[i];
        std::size_t first = 0, last = curve.x.size();
        if (m_curves[i].line)
            std::tie(first, last) = m_curves[i].reduced.Between(from, to);
        for (std::size_t point = first; point < last && curve.isMovable; ++point) {
            const PlotPoint candidate{number, int(i), point};
            const QPointF away = PlaceOf(candidate) - place;
            const double its = QPointF::dotProduct(away, away);
            if (its < distance) { // not a number is no less
                distance = its;
                nearest = candidate;
            }
        }
    }
    return nearest;
}

double CTrackView::ValueAt(const PlotCurve& curve, double x)
{
    if (!curve.end.empty()) {
        for (std::size_t i = 0; i < curve.x.size(); ++i)
            if (x >= std::min(curve.x[i], curve.end[i]) && x <= std::max(curve.x[i], curve.end[i]))
                return curve.y[i];
        return None;
    }
    const auto behind = std::ranges::upper_bound(curve.x, x);
    const std::size_t next = std::size_t(behind - curve.x.begin());
    if (next == 0 || (next == curve.x.size() && curve.x.back() != x))
        return None;
    if (next == curve.x.size() || curve.x[next - 1] == x)
        return curve.y[next - 1];
    const double share = (x - curve.x[next - 1]) / (curve.x[next] - curve.x[next - 1]);
    return curve.y[next - 1] + share * (curve.y[next] - curve.y[next - 1]);
}

void CTrackView::Mark(std::optional<double> x, const std::vector<PlotPoint>& points)
{
    m_mark->setVisible(x.has_value());
    if (x) {
        m_mark->point1->setCoords(*x, 0);
        m_mark->point2->setCoords(*x, 1);
    }
    QVector<QCPGraphData> data;
    for (const PlotPoint& point : points) {
        const PlotCurve& curve = m_track->curves[std::size_t(point.curve)];
        data.push_back({curve.x[point.point], curve.y[point.point]});
    }
    m_marked->data()->set(data, true);
}

void CTrackView::ShowCross(std::optional<double> x, const QString& head, const std::function<QString(double)>& textOf)
{
    m_cross->setVisible(x.has_value());
    QStringList lines;
    if (x && !head.isEmpty())
        lines << head;
    for (const PlotCurve& curve : m_track->curves) {
        const double value = x ? ValueAt(curve, *x) : None;
        if (!std::isfinite(value))
            continue;
        lines << (curve.end.empty() ? curve.name + QStringLiteral(": ") + textOf(value) : curve.name);
    }
    m_crossText->setVisible(!lines.isEmpty());
    if (!x)
        return;
    m_cross->point1->setCoords(*x, 0);
    m_cross->point2->setCoords(*x, 1);
    const QString text = lines.join(QStringLiteral("    "));
    const int uncovered = m_legend->outerRect().width() - QFontMetrics(m_crossText->font()).horizontalAdvance(text);
    m_crossText->setPadding(QMargins(8, 1, std::max(uncovered, 8), 1));
    m_crossText->setText(text);
    // In place of the legend, whose names it repeats: beside the pointer it would hide what is looked at.
    m_crossText->position->setPixelPosition({double(m_legend->outerRect().left()), double(m_head->rect().top())});
}

void CTrackView::ShowDragged(std::optional<QPointF> point, const QString& text)
{
    QVector<QCPGraphData> data;
    if (point)
        data.push_back({point->x(), point->y()});
    m_dragged->data()->set(data, true);
    m_dragText->setVisible(point && !text.isEmpty());
    if (!point)
        return;
    const bool isRight = Across().coordToPixel(point->x()) > m_axes->center().x();
    const bool isLow = Up().coordToPixel(point->y()) > m_axes->center().y();
    m_dragText->setText(text);
    m_dragText->setPositionAlignment((isLow ? Qt::AlignBottom : Qt::AlignTop) |
                                     (isRight ? Qt::AlignRight : Qt::AlignLeft));
    m_dragText->position->setCoords(point->x(), point->y());
}
