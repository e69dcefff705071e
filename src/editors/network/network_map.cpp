#include "editors/network/network_map.h"

#include "editors/network/map_input.h"
#include "editors/network/map_overlay.h"
#include "ks/units/edit_style.h"

#include <QEvent>
#include <cmath>

CNetworkMap::CNetworkMap(const CNetworkDoc& document, QWidget* parent)
    : QWidget(parent), m_document(document), m_marks(document)
{
    setObjectName(QStringLiteral("networkMap"));
    setFocusPolicy(Qt::StrongFocus);
    setAttribute(Qt::WA_OpaquePaintEvent);
    setMinimumSize(200, 160);
    setAccessibleName(tr("Map of the river network"));
    new CMapInput(*this);
    connect(&document, &CNetworkDoc::NetworkChanged, this, &CNetworkMap::NetworkChanged);
    connect(&KsUnits::Instance(), &KsUnits::Changed, this, &CNetworkMap::MarksChanged);
    connect(&m_marks, &CMapSelection::LocationsChanged, this, &CNetworkMap::SceneChanged);
    connect(&m_marks, &CMapSelection::Changed, this, &CNetworkMap::MarksChanged);
    NetworkChanged();
}

void CNetworkMap::NetworkChanged()
{
    m_names.clear();
    m_marks.PlaceAll();
    if (m_fitted)
        FitAll();
}

void CNetworkMap::SceneChanged()
{
    m_scene.reset();
    m_buffer.Clear();
    MarksChanged();
}

/// A screen reader says what is marked.
void CNetworkMap::MarksChanged()
{
    const auto place = m_marks.Marked();
    setAccessibleDescription(place ? PlaceText(*place) : QString());
    update();
}

const CMapScene& CNetworkMap::Scene() const
{
    if (!m_scene) {
        if (m_names.empty())
            m_names = NameOutlines(m_document.Network(), font(), devicePixelRatioF());
        m_scene = std::make_unique<CMapScene>(m_document.Network(), m_marks.Placed(), m_projection, m_names,
                                              devicePixelRatioF());
    }
    return *m_scene;
}

// ---- moving ------------------------------------------------------------------------------------

/// A part of the window in pixels of the device.
QRectF CNetworkMap::Device(const QRectF& window) const
{
    return {window.topLeft() * devicePixelRatioF(), window.size() * devicePixelRatioF()};
}

void CNetworkMap::FitAll()
{
    m_projection.Fit(m_document.Network(), Device(rect()), Device(LegendBox(fontMetrics(), rect(), LegendOf(m_marks))),
                     devicePixelRatioF());
    m_fitted = true;
    SceneChanged();
}

void CNetworkMap::ZoomAt(const QPointF& window, double factor)
{
    const double ratio = devicePixelRatioF();
    m_projection.Zoom(m_document.Network(), Device(rect()), window * ratio, factor, ratio);
    m_fitted = false;
    SceneChanged();
}

void CNetworkMap::Pan(const QPoint& distance)
{
    m_projection.offset += (QPointF(distance) * devicePixelRatioF()).toPoint();
    m_fitted = false;
    update();
}

std::optional<QPointF> CNetworkMap::WindowPoint(const CMapPlace& place) const
{
    const auto point = m_marks.PointOf(place);
    return point ? std::optional(m_projection.ToWindow(*point) / devicePixelRatioF()) : std::nullopt;
}

std::optional<QPointF> CNetworkMap::SymbolPoint(std::optional<std::size_t> location) const
{
    const CMapScene::Symbol* symbol = location ? Scene().SymbolOf(*location) : nullptr;
    return symbol ? std::optional((symbol->at + m_projection.offset) / devicePixelRatioF()) : std::nullopt;
}

void CNetworkMap::KeepInSight(const std::optional<QPointF>& window)
{
    constexpr double margin = 24;
    if (window && !QRectF(rect()).adjusted(margin, margin, -margin, -margin).contains(*window))
        Pan((QRectF(rect()).center() - *window).toPoint());
}

// ---- places and locations ----------------------------------------------------------------------

void CNetworkMap::ShowPlace(const CMapPlace& place)
{
    m_marks.Show(place);
    KeepInSight(WindowPoint(place));
}

void CNetworkMap::SetCurrentBranch(int branch)
{
    if (std::exchange(m_currentBranch, branch) == branch)
        return;
    m_buffer.Invalidate();
    update();
}

std::optional<std::size_t> CNetworkMap::LocationAt(const QPointF& window) const
{
    const CMapScene::Symbol* symbol = Scene().SymbolAt(window * devicePixelRatioF() - m_projection.offset);
    return symbol ? std::optional(symbol->location) : std::nullopt;
}

/// The place on a branch that is nearest to a window position, at most so many pixels of the user away.
std::optional<CMapPlace> CNetworkMap::Nearest(const QPointF& window, double reach) const
{
    const double ratio = devicePixelRatioF();
    const auto place =
        m_document.Reference().Nearest(m_projection.ToMap(window * ratio), reach * ratio / m_projection.scale);
    if (!place)
        return std::nullopt;
    return CMapPlace{m_document.Network().branches[std::size_t(place->branch)].Name(), place->chainage};
}

void CNetworkMap::PickAt(const QPointF& window)
{
    constexpr double reach = 12;
    m_marks.Show(std::nullopt);
    const auto location = LocationAt(window);
    m_marks.Select(location);
    if (!location)
        m_marks.Pick(Nearest(window, reach));
}

void CNetworkMap::PickMiddle()
{
    const auto place = Nearest(QRectF(rect()).center(), HUGE_VAL);
    if (!place)
        return;
    m_marks.Select(std::nullopt);
    m_marks.Pick(place);
    KeepInSight(WindowPoint(*place));
}

void CNetworkMap::StepLocation(int step)
{
    const auto location = m_marks.Next(step);
    if (!location)
        return;
    m_marks.Select(location);
    KeepInSight(SymbolPoint(location));
}

void CNetworkMap::Unmark()
{
    m_marks.Show(std::nullopt);
    m_marks.Select(std::nullopt);
    m_marks.Pick(std::nullopt);
}

// ---- events ------------------------------------------------------------------------------------

/// The pixels of another screen are others.
void CNetworkMap::ScreenChanged()
{
    const double change = devicePixelRatioF() / m_scene->ratio;
    m_projection.scale *= change;
    m_projection.offset = (QPointF(m_projection.offset) * change).toPoint();
    m_names.clear();
    SceneChanged();
}

void CNetworkMap::paintEvent(QPaintEvent*)
{
    if (m_scene && m_scene->ratio != devicePixelRatioF())
        ScreenChanged();
    const CMapStyle style(palette());
    QPainter painter(this);
    painter.drawPixmap(
        0, 0, m_buffer.Paint(Scene(), style, m_currentBranch, Device(rect()).size().toSize(), m_projection.offset));
    painter.setRenderHint(QPainter::Antialiasing);
    const auto point = [this](const auto& place) { return place ? WindowPoint(*place) : std::nullopt; };
    const bool empty = m_document.Network().branches.empty();
    PaintOverlay(painter, style, rect(),
                 {LegendOf(m_marks), m_projection.scale / devicePixelRatioF(), point(m_marks.Shown()),
                  SymbolPoint(m_marks.SelectedIndex()), point(m_marks.Picked()), accessibleDescription(),
                  empty ? tr("This network has no branches yet.") : QString(), hasFocus()});
}

void CNetworkMap::resizeEvent(QResizeEvent* event)
{
    QWidget::resizeEvent(event);
    if (m_fitted)
        FitAll();
}

void CNetworkMap::changeEvent(QEvent* event)
{
    const auto type = event->type();
    if (type == QEvent::LanguageChange)
        setAccessibleName(tr("Map of the river network"));
    if (type == QEvent::LanguageChange || type == QEvent::PaletteChange || type == QEvent::FontChange ||
        type == QEvent::StyleChange) {
        m_names.clear();
        SceneChanged();
    }
    QWidget::changeEvent(event);
}
