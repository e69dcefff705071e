#include "editors/network/map_overlay.h"

#include "ks/fc/shown_text.h"
#include "ks/units/edit_style.h"

#include <QCoreApplication>
#include <QFontMetrics>
#include <algorithm>
#include <cmath>

namespace {

struct MapOverlay
{
    Q_DECLARE_TR_FUNCTIONS(MapOverlay)
};

constexpr int Margin = 12, Padding = 9, LegendSymbol = 20;

int LegendRow(const QFontMetrics& metrics)
{
    return metrics.height() + 3;
}

QString Elsewhere(const CLegend& legend)
{
    return legend.elsewhere > 0 ? MapOverlay::tr("%1 not in this network").arg(legend.elsewhere) : QString();
}

void PaintPanel(QPainter& painter, const CMapStyle& style, const QRectF& box)
{
    painter.setPen(QPen(Faded(style.muted, 90), 1));
    painter.setBrush(Faded(style.ground, 225));
    painter.drawRoundedRect(box.adjusted(0.5, 0.5, -0.5, -0.5), 5, 5);
}

/// 1, 2 or 5 times a power of ten, at most `value`.
double Round125(double value)
{
    const double power = std::pow(10, std::floor(std::log10(value)));
    const double digits = value / power;
    return (digits >= 5 ? 5 : digits >= 2 ? 2 : 1) * power;
}

void PaintLegend(QPainter& painter, const CMapStyle& style, const QRect& window, const CLegend& legend)
{
    const QRect box = LegendBox(painter.fontMetrics(), window, legend);
    if (box.isEmpty())
        return;
    PaintPanel(painter, style, box);
    const double ratio = painter.device()->devicePixelRatioF();
    const int row = LegendRow(painter.fontMetrics());
    QRect line(box.left() + Padding, box.top() + Padding, box.width() - 2 * Padding, row);
    for (int kind = 0; kind < HDDataTypeCount; ++kind, line.translate(0, row)) {
        QPixmap picture = LocationKindSymbol(kind, CMapScene::SymbolSize * ratio, style.outline);
        picture.setDevicePixelRatio(ratio);
        const QSizeF size = QSizeF(picture.size()) / ratio;
        painter.setOpacity(legend.counts[std::size_t(kind)] ? 1 : 0.5);
        painter.drawPixmap(QPointF(line.left(), line.center().y() - size.height() / 2), picture);
        painter.setPen(style.text);
        painter.drawText(line.adjusted(LegendSymbol, 0, 0, 0), Qt::AlignVCenter | Qt::AlignLeft,
                         LocationKindName(kind));
        painter.drawText(line, Qt::AlignVCenter | Qt::AlignRight, QString::number(legend.counts[std::size_t(kind)]));
    }
    painter.setOpacity(1);
    painter.setPen(style.mark);
    painter.drawText(line, Qt::AlignVCenter | Qt::AlignLeft, Elsewhere(legend));
}

void PaintScaleBar(QPainter& painter, const CMapStyle& style, const QRect& window, double scale)
{
    constexpr double longest = 160; // pixels
    const CKsEditStyle unit(UnitGroup::Chainage);
    const double shown = Round125(unit.UnitConvertFromBase(longest / scale, 1));
    const double width = unit.UnitConvertFromBase(shown, 0) * scale;
    const bool kilometres = unit.UnitSymbol() == QLatin1String("m") && shown >= 1000;
    const QString text = kilometres ? KsShortestNumber(shown / 1000) + QStringLiteral(" km")
                                    : KsShortestNumber(shown) + u' ' + unit.UnitSymbol();
    const int height = painter.fontMetrics().height();
    const double box = std::max(width, double(painter.fontMetrics().horizontalAdvance(text))) + 2 * Padding;
    const QRectF panel(window.left() + Margin, window.bottom() - Margin - height - 20, box, height + 20);
    PaintPanel(painter, style, panel);
    const double left = std::round(panel.center().x() - width / 2) + 0.5, right = left + std::round(width);
    const double base = panel.bottom() - 8.5;
    painter.setPen(style.text);
    painter.drawText(panel.adjusted(0, 3, 0, 0), Qt::AlignHCenter | Qt::AlignTop, text);
    painter.setPen(QPen(style.text, 1.5, Qt::SolidLine, Qt::FlatCap));
    painter.drawPolyline(QPolygonF{{left, base - 5}, {left, base}, {right, base}, {right, base - 5}});
}

void PaintLabel(QPainter& painter, const CMapStyle& style, const QRect& window, const QPointF& at, const QString& label)
{
    QFont bold = painter.font();
    bold.setBold(true);
    painter.save();
    painter.setFont(bold);
    const QSizeF size(painter.fontMetrics().horizontalAdvance(label) + 12, painter.fontMetrics().height() + 6);
    QRectF box(at + QPointF(14, -14 - size.height()), size);
    if (box.right() > window.right() - 4)
        box.moveRight(at.x() - 14);
    if (box.top() < window.top() + 4)
        box.moveTop(at.y() + 14);
    box.moveLeft(std::max(box.left(), window.left() + 4.0)); // in a narrow window both sides are too small
    painter.setPen(QPen(style.mark, 1.2));
    painter.setBrush(Faded(style.ground, 240));
    painter.drawRoundedRect(box, 4, 4);
    painter.setPen(style.text);
    painter.drawText(box, Qt::AlignCenter, label);
    painter.restore();
}

void PaintPicked(QPainter& painter, const CMapStyle& style, const QPointF& at)
{
    constexpr double arm = 11, hole = 3;
    for (const auto& [colour, width] : {std::pair(style.ground, 4.5), std::pair(style.mark, 2.0)}) {
        painter.setPen(QPen(colour, width, Qt::SolidLine, Qt::FlatCap));
        for (const QPointF& way : {QPointF(1, 0), QPointF(-1, 0), QPointF(0, 1), QPointF(0, -1)})
            painter.drawLine(at + hole * way, at + arm * way);
    }
}

void PaintSelected(QPainter& painter, const CMapStyle& style, const QPointF& at)
{
    painter.setBrush(Qt::NoBrush);
    for (const auto& [colour, width] : {std::pair(style.ground, 5.0), std::pair(style.mark, 2.4)}) {
        painter.setPen(QPen(colour, width));
        painter.drawEllipse(at, 9.5, 9.5);
    }
}

void PaintShown(QPainter& painter, const CMapStyle& style, const QPointF& at)
{
    painter.setPen(QPen(style.mark, 2));
    painter.setBrush(Faded(style.mark, 60));
    painter.drawEllipse(at, 15, 15);
    painter.setBrush(style.mark);
    painter.drawEllipse(at, 3, 3);
}

} // namespace

QString PlaceText(const CMapPlace& place)
{
    const CKsEditStyle style(UnitGroup::Chainage, "%.1lf");
    return QStringLiteral("%1 %2 %3")
        .arg(KsVisibleText(place.branch), style.UnitConvertFromBase_T(place.chainage, 1), style.UnitSymbol());
}

CLegend LegendOf(const CMapSelection& marks)
{
    CLegend legend{.elsewhere = int(marks.Locations().size() - marks.Placed().size())};
    for (const CPlacedLocation& each : marks.Placed())
        ++legend.counts.at(std::size_t(each.kind));
    return legend;
}

QRect LegendBox(const QFontMetrics& metrics, const QRect& window, const CLegend& legend)
{
    constexpr int gap = 16;
    int names = 0, numbers = 0;
    for (int kind = 0; kind < HDDataTypeCount; ++kind) {
        names = std::max(names, metrics.horizontalAdvance(LocationKindName(kind)));
        numbers = std::max(numbers, metrics.horizontalAdvance(QString::number(legend.counts[std::size_t(kind)])));
    }
    const int inner = std::max(LegendSymbol + names + gap + numbers, metrics.horizontalAdvance(Elsewhere(legend)));
    const int rows = HDDataTypeCount + (legend.elsewhere > 0 ? 1 : 0);
    const QSize size(inner + 2 * Padding, rows * LegendRow(metrics) + 2 * Padding - 3);
    const bool isLarge = 5 * size.width() > 2 * window.width() && 5 * size.height() > 3 * window.height();
    if (isLarge || size.height() + 2 * Margin > window.height()) // half a legend says less than none
        return {};
    return {{window.right() - Margin - size.width(), window.top() + Margin}, size};
}

void PaintOverlay(QPainter& painter, const CMapStyle& style, const QRect& window, const CMapOverlay& overlay)
{
    const auto& [legend, scale, shown, selected, picked, label, hint, focus] = overlay;
    if (shown)
        PaintShown(painter, style, *shown);
    if (selected)
        PaintSelected(painter, style, *selected);
    else if (picked)
        PaintPicked(painter, style, *picked);
    if (const auto& at = selected ? selected : picked ? picked : shown)
        PaintLabel(painter, style, window, *at, label);
    PaintScaleBar(painter, style, window, scale);
    PaintLegend(painter, style, window, legend);
    if (!hint.isEmpty()) {
        painter.setPen(style.muted);
        painter.drawText(window, Qt::AlignCenter | Qt::TextWordWrap, hint);
    }
    if (focus) {
        painter.setPen(QPen(Faded(style.chosen, 150), 1));
        painter.setBrush(Qt::NoBrush);
        painter.drawRect(QRectF(window).adjusted(0.5, 0.5, -0.5, -0.5));
    }
}
