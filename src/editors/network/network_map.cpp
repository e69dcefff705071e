#include "editors/network/network_map.h"

#include "editors/network/map_overlay.h"
#include "ks/units/edit_style.h"

#include <cmath>

namespace {
constexpr double FitMargin = 56; // pixels of the user
constexpr double MaxScale = 40;  // pixels a metre
constexpr double SightMargin = 24;
} // namespace

CNetworkMap::CNetworkMap(const CNetworkDoc& document, QWidget* parent) : QWidget(parent), m_document(document)
{
    setObjectName(QStringLiteral("networkMap"));
    setFocusPolicy(Qt::StrongFocus);
    setAttribute(Qt::WA_OpaquePaintEvent);
    setMinimumSize(200, 160);
    setAccessibleName(tr("Map of the river network"));
    connect(&document, &CNetworkDoc::NetworkChanged, this, &CNetworkMap::NetworkChanged);
    connect(&KsUnits::Instance(), &KsUnits::Changed, this, qOverload<>(&QWidget::update));
    NetworkChanged();
    m_fitted = true;
}

CNetworkMap::~CNetworkMap() = default;

void CNetworkMap::NetworkChanged()
{
    m_names.clear();
    PlaceAll();
    if (m_fitted)
        FitAll();
}

void CNetworkMap::SetLocations(std::vector<CMapLocation> locations)
{
    // A selection goes on with the same location, wherever it stands now.
    const std::optional<CMapLocation> selected = Selected() ? std::optional(*Selected()) : std::nullopt;
    m_locations = std::move(locations);
    m_selected = -1;
    for (std::size_t i = 0; selected && m_selected < 0 && i < m_locations.size(); ++i) {
        const CMapLocation& each = m_locations[i];
        if (each.kind == selected->kind && each.chainage == selected->chainage && each.branch == selected->branch &&
            each.file == selected->file)
            m_selected = static_cast<int>(i);
    }
    PlaceAll();
    if (selected && m_selected < 0)
        emit SelectionChanged();
}

void CNetworkMap::PlaceAll()
{
    m_placed = PlaceLocations(m_document, m_locations);
    SceneChanged();
}

void CNetworkMap::SceneChanged()
{
    m_scene.reset();
    m_labelPictures.clear();
    m_bufferValid = false;
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
        m_scene =
            std::make_unique<CMapScene>(m_document.Network(), m_placed, m_projection, m_names, devicePixelRatioF());
    }
    return *m_scene;
}

// ---- moving ------------------------------------------------------------------------------------

QRectF CNetworkMap::FullExtent() const
{
    return m_document.Network().Extent();
}

/// In the whole window, or, when the legend would cover branches, in the larger part beside it; but the legend rather
/// covers something than that the network becomes small.
void CNetworkMap::FitAll()
{
    constexpr double small = 0.6; // of the scale that the whole window allows
    const QRectF window(rect()), legend(LegendBox(fontMetrics(), rect(), Legend()));
    m_projection.origin = FullExtent().center();
    FitInto(window);
    if (IsUnder(legend.adjusted(-FitMargin, 0, 0, FitMargin))) { // symbols stand beside their branch
        const double whole = m_projection.scale;
        QRectF left = window, below = window;
        left.setRight(legend.left());
        below.setTop(legend.bottom());
        FitInto(left);
        const double beside = m_projection.scale;
        FitInto(below);
        if (beside > m_projection.scale)
            FitInto(left);
        if (m_projection.scale < small * whole)
            FitInto(window);
    }
    m_fitted = true;
    SceneChanged();
}

/// By pixels of the user.
void CNetworkMap::FitInto(const QRectF& part)
{
    const double ratio = devicePixelRatioF();
    m_projection.Fit(FullExtent(), QRectF(part.topLeft() * ratio, part.size() * ratio), FitMargin * ratio,
                     MaxScale * ratio);
}

/// Whether a branch goes through a part of the window.
bool CNetworkMap::IsUnder(const QRectF& box) const
{
    const QRectF map = QRectF(m_projection.ToMap(box.topLeft() * devicePixelRatioF()),
                              m_projection.ToMap(box.bottomRight() * devicePixelRatioF()))
                           .normalized();
    const auto& branches = m_document.Network().branches;
    return std::any_of(branches.begin(), branches.end(), [&map](const CNetworkBranch& branch) {
        return std::any_of(branch.line.begin(), branch.line.end(),
                           [&map](const QPointF& point) { return map.contains(point); });
    });
}

void CNetworkMap::ZoomAt(const QPointF& window, double factor)
{
    const double ratio = devicePixelRatioF();
    CMapProjection all = m_projection; // half of what shows everything is small enough
    const double high = MaxScale * ratio;
    all.Fit(FullExtent(), QRectF(QPointF(), QSizeF(size()) * ratio), FitMargin * ratio, high);
    const double low = std::min(all.scale / 2, m_projection.scale);
    m_projection.ZoomAt(window * ratio, std::clamp(m_projection.scale * factor, low, std::max(low, high)));
    m_fitted = false;
    SceneChanged();
}

void CNetworkMap::Zoom(double factor)
{
    ZoomAt(QRectF(rect()).center(), factor);
}

void CNetworkMap::Pan(const QPoint& distance)
{
    m_projection.offset += (QPointF(distance) * devicePixelRatioF()).toPoint();
    m_fitted = false;
    update();
}

std::optional<QPointF> CNetworkMap::WindowPoint(const Place& place) const
{
    const auto point = m_document.Reference().PointAt(m_document.Network().FindBranch(place.branch), place.chainage);
    return point ? std::optional(m_projection.ToWindow(*point) / devicePixelRatioF()) : std::nullopt;
}

std::optional<QPointF> CNetworkMap::SymbolPoint(std::size_t location) const
{
    for (const CMapScene::Symbol& symbol : Scene().Symbols()) {
        if (symbol.location == location)
            return (symbol.at + m_projection.offset) / devicePixelRatioF();
    }
    return std::nullopt;
}

void CNetworkMap::KeepInSight(const QPointF& window)
{
    if (!QRectF(rect()).adjusted(SightMargin, SightMargin, -SightMargin, -SightMargin).contains(window))
        Pan((QRectF(rect()).center() - window).toPoint());
}

// ---- places and locations ----------------------------------------------------------------------

std::optional<CNetworkMap::Place> CNetworkMap::Picked() const
{
    return m_picked && WindowPoint(*m_picked) ? m_picked : std::nullopt;
}

QString CNetworkMap::MarkedText() const
{
    const auto text = [](const QString& branch, double chainage) {
        return branch + u' ' + QString::number(chainage, 'f', 1);
    };
    if (const CMapLocation* location = Selected())
        return text(location->branch, location->chainage);
    const auto place = m_picked ? m_picked : m_shown;
    return place ? text(place->branch, place->chainage) : QString();
}

void CNetworkMap::SetPicked(std::optional<Place> place)
{
    if (place == m_picked)
        return;
    m_picked = std::move(place);
    update();
    emit PickedChanged();
}

const CMapLocation* CNetworkMap::Selected() const
{
    return m_selected >= 0 ? &m_locations[static_cast<std::size_t>(m_selected)] : nullptr;
}

void CNetworkMap::SelectLocation(int location)
{
    if (std::exchange(m_selected, location) == location)
        return;
    update();
    emit SelectionChanged();
}

void CNetworkMap::ShowPlace(const Place& place)
{
    m_shown = place;
    update();
    if (const auto at = WindowPoint(place))
        KeepInSight(*at);
}

void CNetworkMap::SetCurrentBranch(int branch)
{
    if (std::exchange(m_currentBranch, branch) == branch)
        return;
    m_bufferValid = false;
    update();
}

/// The location whose symbol is drawn at a window position; -1 for none.
int CNetworkMap::LocationAt(const QPointF& window) const
{
    const double ratio = devicePixelRatioF(), reach = (CMapScene::SymbolSize / 2 + 1) * ratio;
    const QPointF plane = window * ratio - m_projection.offset;
    const auto& symbols = Scene().Symbols();
    const CMapScene::Symbol* best = nullptr;
    double nearest = reach;
    for (const CMapScene::Symbol& symbol : symbols) {
        const double distance = std::hypot(symbol.at.x() - plane.x(), symbol.at.y() - plane.y());
        if (distance <= nearest) { // of equals the one drawn last
            nearest = distance;
            best = &symbol;
        }
    }
    return best ? static_cast<int>(best->location) : -1;
}

void CNetworkMap::PickAt(const QPointF& window)
{
    constexpr double tolerance = 12; // pixels of the user
    m_shown.reset();
    if (const int location = LocationAt(window); location >= 0) {
        SelectLocation(location);
        const CMapLocation& at = m_locations[static_cast<std::size_t>(location)];
        SetPicked(Place{at.branch, at.chainage});
        return;
    }
    SelectLocation(-1);
    const double ratio = devicePixelRatioF();
    const auto place =
        m_document.Reference().Nearest(m_projection.ToMap(window * ratio), tolerance * ratio / m_projection.scale);
    if (place)
        SetPicked(Place{m_document.Network().branches[std::size_t(place->branch)].name, place->chainage});
    else
        SetPicked(std::nullopt);
    update();
}

/// Without a mouse: the place that is nearest to the middle of the window.
void CNetworkMap::PickMiddle()
{
    const QPointF middle = QRectF(rect()).center() * devicePixelRatioF();
    const auto place = m_document.Reference().Nearest(m_projection.ToMap(middle));
    if (!place)
        return;
    SelectLocation(-1);
    SetPicked(Place{m_document.Network().branches[std::size_t(place->branch)].name, place->chainage});
    KeepInSight(m_projection.ToWindow(place->point) / devicePixelRatioF());
}

/// To the next location along the branches, or back.
void CNetworkMap::StepLocation(int step)
{
    if (m_placed.empty())
        return;
    std::vector<const CPlacedLocation*> order;
    for (const CPlacedLocation& each : m_placed)
        order.push_back(&each);
    std::stable_sort(order.begin(), order.end(), [this](const auto* a, const auto* b) {
        return std::pair(a->branch, m_locations[a->location].chainage) <
               std::pair(b->branch, m_locations[b->location].chainage);
    });
    const auto present = std::find_if(order.begin(), order.end(), [this](const auto* each) {
        return static_cast<int>(each->location) == m_selected;
    });
    const auto count = static_cast<std::ptrdiff_t>(order.size());
    const std::ptrdiff_t from = present == order.end() ? (step > 0 ? -1 : count) : present - order.begin();
    const std::size_t location = order[std::size_t((from + step + count) % count)]->location;
    SelectLocation(static_cast<int>(location));
    SetPicked(Place{m_locations[location].branch, m_locations[location].chainage});
    if (const auto at = SymbolPoint(location))
        KeepInSight(*at);
}

void CNetworkMap::Unmark()
{
    m_shown.reset();
    SelectLocation(-1);
    SetPicked(std::nullopt);
    update();
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
