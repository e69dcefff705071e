#include "editors/cross_sections/section_plot.h"

#include "editors/common/quantity.h"
#include "ks/fc/shown_text.h"

#include <QEvent>
#include <QHelpEvent>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QToolTip>
#include <algorithm>

namespace {

/// A key moves to another section or to another point.
struct PlotKey
{
    int key, section, point;
};
constexpr PlotKey Keys[] = {{Qt::Key_PageUp, -1, 0}, {Qt::Key_PageDown, 1, 0}, {Qt::Key_Up, -1, 0},
                            {Qt::Key_Down, 1, 0},    {Qt::Key_Left, 0, -1},    {Qt::Key_Right, 0, 1}};

constexpr double Reach = 12; // pixels from a point that still hit it

} // namespace

CSectionPlot::CSectionPlot(QWidget* parent) : QWidget(parent)
{
    setObjectName(QStringLiteral("sectionPlot"));
    setFocusPolicy(Qt::StrongFocus);
    setAttribute(Qt::WA_OpaquePaintEvent);
    connect(&KsUnits::Instance(), &KsUnits::Changed, this, &CSectionPlot::Layout);
    Describe();
}

void CSectionPlot::Show(const CCrossSection* section)
{
    m_section = section ? std::optional(*section) : std::nullopt;
    m_water = section ? WaterSurface(*section) : std::nullopt;
    Layout();
}

void CSectionPlot::SetCurrentPoint(int point)
{
    m_point = point;
    update();
}

QString CSectionPlot::Title() const
{
    return m_section ? QStringLiteral("%1  %2").arg(KsVisibleText(m_section->Branch()),
                                                    WithSymbol(UnitGroup::Chainage, m_section->chainage))
                     : QString();
}

QString CSectionPlot::Caption() const
{
    QStringList parts;
    if (!m_section->topoId.empty())
        parts << tr("Topo ID %1").arg(KsVisibleText(m_section->TopoId()));
    if (!std::isnan(m_section->radius))
        parts << tr("Radius %1").arg(WithSymbol(UnitGroup::Radius, m_section->radius));
    if (!std::isnan(m_section->width) && !m_water) { // otherwise it stands at the marker
        const QString width = WithSymbol(UnitGroup::Width, m_section->width);
        parts << (HasPoints() ? tr("Width %1 (not within the profile)").arg(width) : tr("Width %1").arg(width));
    }
    return parts.join(QStringLiteral("  \u00b7  "));
}

void CSectionPlot::Describe()
{
    setAccessibleName(tr("Plot of the cross section"));
    setAccessibleDescription(m_section ? tr("%1, points: %2").arg(Title(), QString::number(m_section->points.size()))
                                       : QString());
}

/// Axes and their room, for the section, the units, the font and the size.
void CSectionPlot::Layout()
{
    Describe();
    update();
    if (!HasPoints())
        return;
    const QFontMetrics text(font());
    const auto& points = m_section->points;
    const auto [lowest, highest] = std::minmax_element(points.begin(), points.end(),
                                                       [](const auto& a, const auto& b) { return a.level < b.level; });
    const double line = text.height();
    const double top = 2.6 * line, bottom = 2.9 * line, right = 1.5 * line;
    // Below the lowest point there is ground to be seen.
    const double depth = 0.12 * (highest->level - lowest->level);
    const double room = std::max(height() - top - bottom, 1.0);
    m_up = CPlotAxis::Around(UnitGroup::WaterLevel, lowest->level - depth, highest->level, int(room / (2.6 * line)));
    double widest = 0;
    for (const QString& label : m_up.labels)
        widest = std::max(widest, double(text.horizontalAdvance(label)));
    const double left = widest + 2.2 * line;
    m_area = QRectF(left, top, std::max(width() - left - right, 1.0), room);
    m_across = CPlotAxis::Around(UnitGroup::Width, points.front().offset, points.back().offset,
                                 int(m_area.width() / (6 * line)));
}

QPointF CSectionPlot::WindowPoint(const CSectionPoint& point) const
{
    return {m_area.left() + m_across.Part(point.offset) * m_area.width(),
            m_area.bottom() - m_up.Part(point.level) * m_area.height()};
}

int CSectionPlot::PointNear(const QPointF& at) const
{
    int nearest = -1;
    double least = Reach;
    for (std::size_t i = 0; HasPoints() && i < m_section->points.size(); ++i) {
        const double distance = QLineF(at, WindowPoint(m_section->points[i])).length();
        if (distance < least) {
            least = distance;
            nearest = int(i);
        }
    }
    return nearest;
}

// ---- events ------------------------------------------------------------------------------------

void CSectionPlot::resizeEvent(QResizeEvent* event)
{
    QWidget::resizeEvent(event);
    Layout();
}

void CSectionPlot::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::FontChange || event->type() == QEvent::LanguageChange)
        Layout();
    QWidget::changeEvent(event);
}

void CSectionPlot::mousePressEvent(QMouseEvent* event)
{
    const int point = event->button() == Qt::LeftButton ? PointNear(event->position()) : -1;
    if (point >= 0)
        emit PointPicked(point);
}

void CSectionPlot::keyPressEvent(QKeyEvent* event)
{
    const auto* key =
        std::find_if(std::begin(Keys), std::end(Keys), [&](const PlotKey& k) { return k.key == event->key(); });
    if (key == std::end(Keys) || event->modifiers() & ~Qt::KeypadModifier) {
        QWidget::keyPressEvent(event);
    } else if (key->section) {
        emit SectionStep(key->section);
    } else if (HasPoints()) {
        const int last = int(m_section->points.size()) - 1;
        emit PointPicked(std::clamp(m_point + key->point, 0, last));
    }
}

bool CSectionPlot::event(QEvent* event)
{
    if (event->type() != QEvent::ToolTip)
        return QWidget::event(event);
    const auto* help = static_cast<QHelpEvent*>(event);
    const int at = PointNear(help->pos());
    const QString text = at < 0 ? QString()
                                : tr("Offset %1\nBed level %2")
                                      .arg(WithSymbol(UnitGroup::Width, m_section->points[std::size_t(at)].offset),
                                           WithSymbol(UnitGroup::WaterLevel, m_section->points[std::size_t(at)].level));
    QToolTip::showText(help->globalPos(), text, this);
    return true;
}
