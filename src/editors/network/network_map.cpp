#include "editors/network/network_map.h"

#include "editors/network/map_fit.h"
#include "editors/network/map_input.h"
#include "editors/network/map_overlay.h"
#include "ks/units/edit_style.h"

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
    connect(&m_marks, &CMapSelection::PickedChanged, this, &CNetworkMap::PickedChanged);
    NetworkChanged();
}

CNetworkMap::~CNetworkMap() = default;

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
    setAccessibleDescription(place ? PlaceText(place->branch, place->chainage) : QString());
    update();
}

const CMapScene& CNetworkMap::Scene() const
{
    if (!m_scene) {
        QFont names = font();
        names.setPointSizeF(names.pointSizeF() > 0 ? names.pointSizeF() : 9);
        names.setWeight(QFont::DemiBold);
        if (m_names.empty())
            m_names = NameOutlines(m_document.Network(), names, devicePixelRatioF());
        m_scene = std::make_unique<CMapScene>(m_document.Network(), m_marks.Placed(), m_projection, m_names,
                                              devicePixelRatioF());
    }
    return *m_scene;
}

// ---- moving ------------------------------------------------------------------------------------

CMapWindow CNetworkMap::Window() const
{
    return {QRectF(rect()), devicePixelRatioF()};
}

void CNetworkMap::FitAll()
{
    FitNetwork(m_projection, m_document.Network(), Window(), QRectF(LegendBox(fontMetrics(), rect(), Legend())));
    m_fitted = true;
    SceneChanged();
}

void CNetworkMap::ZoomAt(const QPointF& window, double factor)
{
    ZoomNetwork(m_projection, m_document.Network(), Window(), window, factor);
    m_fitted = false;
    SceneChanged();
}

void CNetworkMap::Pan(const QPoint& distance)
{
    m_projection.offset += (QPointF(distance) * devicePixelRatioF()).toPoint();
    m_fitted = false;
    update();
}

std::optional<QPointF> CNetworkMap::WindowPoint(const Place& place) const
{
    const auto point = m_marks.PointOf(place);
    return point ? std::optional(m_projection.ToWindow(*point) / devicePixelRatioF()) : std::nullopt;
}

std::optional<QPointF> CNetworkMap::SymbolPoint(std::size_t location) const
{
    const CMapScene::Symbol* symbol = Scene().SymbolOf(location);
    return symbol ? std::optional((symbol->at + m_projection.offset) / devicePixelRatioF()) : std::nullopt;
}

void CNetworkMap::KeepInSight(const std::optional<QPointF>& window)
{
    constexpr double margin = 24;
    if (window && !QRectF(rect()).adjusted(margin, margin, -margin, -margin).contains(*window))
        Pan((QRectF(rect()).center() - *window).toPoint());
}

// ---- places and locations ----------------------------------------------------------------------

const CMapLocation* CNetworkMap::Selected() const
{
    const auto selected = m_marks.Selected();
    return selected ? &m_marks.Locations()[*selected] : nullptr;
}

void CNetworkMap::ShowPlace(const Place& place)
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

/// The location whose symbol is drawn at a window position.
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
    return Place{m_document.Network().branches[std::size_t(place->branch)].name, place->chainage};
}

void CNetworkMap::PickAt(const QPointF& window)
{
    constexpr double reach = 12;
    m_marks.Show(std::nullopt);
    if (const auto location = LocationAt(window)) {
        m_marks.Select(*location);
        return;
    }
    m_marks.Unselect();
    m_marks.Pick(Nearest(window, reach));
}

void CNetworkMap::PickMiddle()
{
    const auto place = Nearest(QRectF(rect()).center(), HUGE_VAL);
    if (!place)
        return;
    m_marks.Unselect();
    m_marks.Pick(place);
    KeepInSight(WindowPoint(*place));
}

void CNetworkMap::StepLocation(int step)
{
    const auto location = m_marks.Next(step);
    if (!location)
        return;
    m_marks.Select(*location);
    KeepInSight(SymbolPoint(*location));
}

void CNetworkMap::Unmark()
{
    m_marks.Show(std::nullopt);
    m_marks.Unselect();
    m_marks.Pick(std::nullopt);
}

void CNetworkMap::OpenMenu(const std::optional<QPoint>& at)
{
    if (at)
        PickAt(*at);
    const auto picked = !at && Picked() ? WindowPoint(*Picked()) : std::nullopt;
    emit MenuRequested(mapToGlobal(at ? *at : picked ? picked->toPoint() : rect().center()));
}

// ---- events ------------------------------------------------------------------------------------

void CNetworkMap::resizeEvent(QResizeEvent* event)
{
    QWidget::resizeEvent(event);
    if (m_fitted)
        FitAll();
}

void CNetworkMap::changeEvent(QEvent* event)
{
    switch (event->type()) {
    case QEvent::LanguageChange:
        setAccessibleName(tr("Map of the river network"));
        [[fallthrough]];
    case QEvent::PaletteChange:
    case QEvent::FontChange:
    case QEvent::StyleChange:
        m_names.clear();
        SceneChanged();
        break;
    default:
        break;
    }
    QWidget::changeEvent(event);
}
