#include "editors/network/location_kinds.h"

#include <QCoreApplication>
#include <QPainter>
#include <QPainterPath>
#include <cmath>
#include <numbers>

namespace {

struct LocationKinds
{
    Q_DECLARE_TR_FUNCTIONS(LocationKinds)
};

QPainterPath Polygon(int corners, double turn, double inner = 1)
{
    QPolygonF points;
    const int count = inner < 1 ? 2 * corners : corners;
    for (int i = 0; i < count; ++i) {
        const double angle = turn + 2 * std::numbers::pi * i / count, radius = inner < 1 && i % 2 ? inner : 1.0;
        points << QPointF(radius * std::sin(angle), -radius * std::cos(angle));
    }
    QPainterPath path;
    path.addPolygon(points);
    path.closeSubpath();
    return path;
}

QPainterPath Circle()
{
    QPainterPath path;
    path.addEllipse(QPointF(0, 0), 0.88, 0.88);
    return path;
}

QPainterPath Plus()
{
    constexpr double arm = 0.94, half = 0.38;
    QPainterPath upright, level;
    upright.addRect(-half, -arm, 2 * half, 2 * arm);
    level.addRect(-arm, -half, 2 * arm, 2 * half);
    return upright.united(level);
}

struct KindRow
{
    const char* name;
    QRgb colour;
    QPainterPath (*shape)(); // within the unit circle
};

// Seven colours that people with any colour vision tell apart: M. Okabe, K. Ito, Color Universal Design, 2008. Shapes
// differ as well.
constexpr KindRow Kinds[HDDataTypeCount] = {
    {QT_TRANSLATE_NOOP("LocationKinds", "Initial"), 0xff0072b2, [] { return Circle(); }},
    {QT_TRANSLATE_NOOP("LocationKinds", "Wind"), 0xff56b4e9, [] { return Polygon(3, 0); }},
    {QT_TRANSLATE_NOOP("LocationKinds", "Bed resistance"), 0xffd55e00, [] { return Polygon(4, std::numbers::pi / 4); }},
    {QT_TRANSLATE_NOOP("LocationKinds", "Wave"), 0xffcc79a7, [] { return Polygon(4, 0); }},
    {QT_TRANSLATE_NOOP("LocationKinds", "Water loss"), 0xff009e73, [] { return Polygon(3, std::numbers::pi); }},
    {QT_TRANSLATE_NOOP("LocationKinds", "Flood plain"), 0xfff0e442, [] { return Plus(); }},
    {QT_TRANSLATE_NOOP("LocationKinds", "Mixing"), 0xffe69f00, [] { return Polygon(5, 0, 0.5); }},
};

} // namespace

QString LocationKindName(int kind)
{
    return LocationKinds::tr(Kinds[kind].name);
}

QPixmap LocationKindSymbol(int kind, double size, const QColor& outline)
{
    const double line = size / 9;
    QPixmap symbol(int(std::ceil(size)), int(std::ceil(size)));
    symbol.fill(Qt::transparent);
    QPainter painter(&symbol);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.translate(symbol.width() / 2.0, symbol.height() / 2.0);
    const double radius = size / 2 - line;
    painter.scale(radius, radius);
    painter.setPen(QPen(outline, line / radius, Qt::SolidLine, Qt::RoundCap, Qt::RoundJoin));
    painter.setBrush(QColor(Kinds[kind].colour));
    painter.drawPath(Kinds[kind].shape());
    return symbol;
}
