#include "editors/network/map_scene.h"

#include "ks/fc/branch_name.h"

#include <QFontMetricsF>
#include <QHash>
#include <algorithm>
#include <cmath>
#include <numbers>
#include <numeric>

namespace {

constexpr double ArrowSpacing = 130, LabelSpacing = 700, LabelGap = 5; // pixels of the user
constexpr double MaxArrows = 400, MaxLabels = 200;                     // a branch, however large the scale
constexpr double CasingDensity = 0.02; // pixels of lines a square pixel: where they stand closer, casings hide too much
constexpr double MaxLineBoxes = 10'000;
constexpr double LeaderSpacing = 9; // leaders are drawn while symbols of a kind are on average that far apart

/// Counts what a rectangle would cover, by cells.
class CBoxes
{
public:
    explicit CBoxes(double cell) : m_cell(cell) {}
    void Add(const QRectF& box)
    {
        ForCells(box, [&](const Cell& cell) { m_boxes[cell].push_back(box); });
    }
    /// A box that reaches over several cells may count more than once.
    int Count(const QRectF& box) const
    {
        int count = 0;
        ForCells(box, [&](const Cell& cell) {
            const auto found = m_boxes.constFind(cell);
            if (found != m_boxes.constEnd())
                count += int(std::ranges::count_if(*found, [&](const QRectF& each) { return each.intersects(box); }));
        });
        return count;
    }

private:
    using Cell = std::pair<int, int>;
    template <typename Action>
    void ForCells(const QRectF& box, Action action) const
    {
        const auto cell = [this](double value) { return int(std::floor(value / m_cell)); };
        for (int x = cell(box.left()); x <= cell(box.right()); ++x) {
            for (int y = cell(box.top()); y <= cell(box.bottom()); ++y)
                action(Cell(x, y));
        }
    }
    double m_cell;
    QHash<Cell, std::vector<QRectF>> m_boxes;
};

class CSceneBuilder
{
public:
    CSceneBuilder(CMapScene& scene, double length)
        : m_scene(scene), m_ratio(scene.ratio), m_length(length), m_labels(120 * m_ratio), m_obstacles(60 * m_ratio)
    {
    }

    /// Every kind that is there has a lane of its own beside the branch, so that kinds do not hide each other.
    void AddSymbols(const std::vector<CPlacedLocation>& placed, const CMapProjection& projection)
    {
        std::array<int, HDDataTypeCount> counts{};
        for (const CPlacedLocation& each : placed)
            ++counts.at(std::size_t(each.kind));
        std::array<double, HDDataTypeCount> offsets{};
        const auto kinds = int(std::ranges::count_if(counts, [](int count) { return count > 0; }));
        int lane = 0;
        for (std::size_t kind = 0; kind < counts.size(); ++kind) {
            if (counts[kind] > 0)
                offsets[kind] = (lane++ - (kinds - 1) / 2.0) * CMapScene::LaneWidth * m_ratio;
        }
        m_lanes =
            kinds > 0 ? (kinds - 1) / 2.0 * CMapScene::LaneWidth * m_ratio + CMapScene::SymbolSize / 2 * m_ratio : 0;
        m_scene.leaders = kinds > 1 && m_length * kinds > LeaderSpacing * m_ratio * double(placed.size());

        m_scene.symbols.reserve(placed.size());
        for (const CPlacedLocation& each : placed) {
            const CPlaneLine& line = m_scene.lines[std::size_t(each.branch)];
            const double distance = each.part * line.Length();
            const QPointF direction = line.Direction(distance, 2 * m_lanes + m_ratio);
            const QPointF normal(-direction.y(), direction.x());
            const QPointF foot = projection.ToPlane(each.map);
            m_scene.symbols.push_back(
                {foot, foot + offsets[std::size_t(each.kind)] * normal, each.kind, each.location});
        }
    }

    void AddArrows(const CNetwork& network)
    {
        for (std::size_t i = 0; i < m_scene.lines.size(); ++i) {
            const CPlaneLine& line = m_scene.lines[i];
            const double count = std::min(std::floor(line.Length() / (ArrowSpacing * m_ratio)), MaxArrows);
            for (double arrow = 0; arrow < count; ++arrow) {
                const double distance = (arrow + 0.5) * line.Length() / count;
                const QPointF along = line.Direction(distance, 5 * m_ratio);
                m_scene.arrows.push_back({line.At(distance), network.branches[i].FlowsAlongLine() ? along : -along});
            }
        }
    }

    void AddLabels()
    {
        AddObstacles();
        std::vector<std::size_t> order(m_scene.lines.size()); // long branches first: they matter most
        std::iota(order.begin(), order.end(), 0);
        std::ranges::stable_sort(order, std::greater(),
                                 [this](std::size_t branch) { return m_scene.lines[branch].Length(); });
        for (const std::size_t branch : order) {
            const double length = m_scene.lines[branch].Length();
            const QRectF text = m_scene.names[branch].boundingRect();
            if (m_scene.lines[branch].IsEmpty() || length < 0.8 * text.width())
                continue;
            const double count = std::clamp(std::floor(length / (LabelSpacing * m_ratio)), 1.0, MaxLabels);
            for (double label = 0; label < count; ++label)
                AddLabel(branch, (label + 0.5) * length / count, 0.3 * length / count, text);
        }
    }

private:
    using Label = CMapScene::Label;

    /// What names should not cover: symbols, and the lines themselves.
    void AddObstacles()
    {
        const auto add = [this](const QPointF& at, double size) {
            m_obstacles.Add(QRectF(at.x() - size / 2, at.y() - size / 2, size, size));
        };
        for (const CMapScene::Symbol& symbol : m_scene.symbols)
            add(symbol.at, CMapScene::SymbolSize * m_ratio);
        const double step = std::max(10 * m_ratio, m_length / MaxLineBoxes);
        for (const CPlaneLine& line : m_scene.lines) {
            for (double distance = 0; distance < line.Length(); distance += step)
                add(line.At(distance), 4 * m_ratio);
        }
    }

    /// Beside the line near a distance, where the line is straightest and the least is covered; nowhere when
    /// other names leave no room.
    void AddLabel(std::size_t branch, double distance, double shift, const QRectF& text)
    {
        constexpr double obstaclePrice = 12; // pixels that the name may be farther from the line to cover a thing less
        std::optional<Label> best;
        double lowest = HUGE_VAL;
        for (const double part : {0.0, -0.25, 0.25, -0.5, 0.5, -0.75, 0.75, -1.0, 1.0}) {
            for (const double side : {1.0, -1.0}) {
                double bulge = 0;
                const Label label = LabelAt(branch, distance + part * shift, side, text, bulge);
                const double price = bulge + obstaclePrice * m_ratio * m_obstacles.Count(label.box);
                if (price < lowest && m_labels.Count(label.box) == 0) {
                    best = label;
                    lowest = price;
                }
            }
        }
        if (!best)
            return;
        m_labels.Add(best->box);
        m_scene.labels.push_back(*best);
    }

    /// `side` 1 is above the line, -1 below. `bulge`: how far the line comes towards the text.
    Label LabelAt(std::size_t branch, double distance, double side, const QRectF& text, double& bulge) const
    {
        const CPlaneLine& line = m_scene.lines[branch];
        const double half = text.width() / 2;
        QPointF along = line.Direction(distance, half);
        if (along.x() < 0 || (along.x() == 0 && along.y() > 0))
            along = -along; // not upside down
        const QPointF away = side * QPointF(along.y(), -along.x());
        const QPointF foot = line.At(distance);
        for (int step = -10; step <= 10; ++step) { // a winding line is longer than the text beside it
            const QPointF way = line.At(distance + step * half / 4) - foot;
            if (std::abs(QPointF::dotProduct(way, along)) <= half)
                bulge = std::max(bulge, QPointF::dotProduct(way, away));
        }
        const QPointF center = foot + (bulge + m_lanes + text.height() / 2 + LabelGap * m_ratio) * away;
        const double width = std::abs(along.x()) * text.width() + std::abs(along.y()) * text.height();
        const double height = std::abs(along.y()) * text.width() + std::abs(along.x()) * text.height();
        return {branch, center, std::atan2(along.y(), along.x()) * 180 / std::numbers::pi,
                QRectF(center.x() - width / 2, center.y() - height / 2, width, height)};
    }

    CMapScene& m_scene;
    double m_ratio;
    double m_length;    // of all lines
    double m_lanes = 0; // half the width of the symbols' band
    CBoxes m_labels, m_obstacles;
};

} // namespace

std::vector<CPlacedLocation> PlaceLocations(const CNetworkDoc& document, const std::vector<CMapLocation>& locations)
{
    const CNetwork& network = document.Network();
    QHash<QString, int> branches;
    for (std::size_t i = 0; i < network.branches.size(); ++i)
        branches.insert(KsBranchKey(network.branches[i].Name()), int(i));
    std::vector<CPlacedLocation> placed;
    placed.reserve(locations.size());
    QString name; // of the location before: most follow one of the same branch
    int branch = -1;
    for (std::size_t i = 0; i < locations.size(); ++i) {
        const CMapLocation& location = locations[i];
        if (name != location.branch || i == 0) {
            name = location.branch;
            branch = branches.value(KsBranchKey(name), -1);
        }
        const auto point = document.Reference().PointAt(branch, location.chainage);
        if (!point)
            continue;
        const CNetworkBranch& on = network.branches[std::size_t(branch)];
        placed.push_back({i, location.kind, branch, (location.chainage - on.start) / (on.end - on.start), *point});
    }
    std::ranges::stable_sort(placed, {}, &CPlacedLocation::kind);
    return placed;
}

std::vector<QPainterPath> NameOutlines(const CNetwork& network, QFont font, double ratio)
{
    font.setPointSizeF(font.pointSizeF() > 0 ? font.pointSizeF() : 9);
    font.setWeight(QFont::DemiBold);
    std::vector<QPainterPath> outlines;
    outlines.reserve(network.branches.size());
    for (const CNetworkBranch& branch : network.branches) {
        QPainterPath text;
        text.addText(0, 0, font, branch.Name());
        outlines.push_back(QTransform::fromScale(ratio, ratio).map(text));
        outlines.back().translate(-outlines.back().boundingRect().center());
    }
    return outlines;
}

CMapScene::CMapScene(const CNetwork& network, const std::vector<CPlacedLocation>& placed,
                     const CMapProjection& projection, const std::vector<QPainterPath>& outlines, double pixels)
    : ratio(pixels), names(outlines)
{
    lines.reserve(network.branches.size());
    for (const CNetworkBranch& branch : network.branches)
        lines.emplace_back(branch.line, projection);
    double length = 0;
    for (const CPlaneLine& line : lines)
        length += line.Length();
    const QSizeF extent = network.Extent().size() * projection.scale / ratio;
    casings = lines.size() < 20 || length / ratio < CasingDensity * extent.width() * extent.height();
    CSceneBuilder builder(*this, length);
    builder.AddSymbols(placed, projection);
    builder.AddArrows(network);
    builder.AddLabels();
}

const CMapScene::Symbol* CMapScene::SymbolAt(const QPointF& plane) const
{
    const Symbol* best = nullptr;
    double nearest = (SymbolSize / 2 + 1) * ratio;
    for (const Symbol& symbol : symbols) {
        const double distance = Distance(symbol.at, plane);
        if (distance <= nearest) {
            nearest = distance;
            best = &symbol;
        }
    }
    return best;
}

const CMapScene::Symbol* CMapScene::SymbolOf(std::size_t location) const
{
    const auto found = std::ranges::find(symbols, location, &Symbol::location);
    return found == symbols.end() ? nullptr : &*found;
}
