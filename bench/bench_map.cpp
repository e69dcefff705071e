// Redrawing the map of 500 branches with 10,000 locations, at 1600 x 1000: after a pan within one frame of 60 Hz; and
// for comparison after a zoom, which computes and paints everything anew.
#include "bench/frames.h"
#include "editors/network/network_map.h"

#include <QApplication>
#include <QPainter>
#include <cmath>
#include <numbers>
#include <random>

namespace {

constexpr int Branches = 500, Vertices = 120, Locations = 10'000;
constexpr double Frame = 1000.0 / 60; // milliseconds

/// Rivers that wind across a square of 100 km, each about 12 km long.
std::vector<CNetworkBranch> MakeBranches()
{
    std::mt19937 random(11);
    const auto between = [&](double low, double high) { return low + (high - low) * random() / 4294967295.0; };
    std::vector<CNetworkBranch> branches;
    for (int i = 0; i < Branches; ++i) {
        CNetworkBranch branch;
        branch.name = QStringLiteral("RIVER %1").arg(i + 1).toStdString();
        QPointF at(between(0, 100'000), between(0, 62'000));
        double direction = between(0, 2 * std::numbers::pi);
        for (int vertex = 0; vertex < Vertices; ++vertex) {
            branch.line.push_back(at);
            direction += between(-0.35, 0.35);
            at += 100 * QPointF(std::cos(direction), std::sin(direction));
        }
        branch.end = branch.Length();
        branches.push_back(std::move(branch));
    }
    return branches;
}

std::vector<CMapLocation> MakeLocations(const CNetwork& network)
{
    std::vector<CMapLocation> locations;
    for (int i = 0; i < Locations; ++i) {
        const CNetworkBranch& branch = network.branches[std::size_t(i % Branches)];
        const double part = double(i / Branches) / (double(Locations) / Branches);
        locations.push_back({branch.Name(), part * branch.end, i % HDDataTypeCount, QStringLiteral("a.hdkv")});
    }
    return locations;
}

} // namespace

int main(int argc, char** argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);
    CNetworkDoc document;
    document.AppendBranches(MakeBranches(), {}, {});
    CNetworkMap map(document);
    map.resize(1600, 1000);
    map.Marks().SetLocations(MakeLocations(document.Network()));
    map.FitAll();
    map.Marks().Pick(CMapPlace{QStringLiteral("RIVER 1"), 5000});

    bool fast = true;
    for (const double zoom : {1.0, 6.0}) {
        map.FitAll();
        map.Zoom(zoom);
        const auto name = [zoom](const char* what) {
            return std::string(what) + (zoom == 1 ? ", all in sight" : ", zoomed in");
        };
        const double drag = MeasureFrames(map, [&](int i) { map.Pan(QPoint(i % 2 ? 9 : -9, 4 - i % 3 * 4)); });
        const double key = MeasureFrames(map, [&](int i) { map.Pan(QPoint(i % 2 ? 60 : -60, 0)); });
        const double page = MeasureFrames(map, [&](int i) { map.Pan(QPoint(0, i % 2 ? 400 : -400)); });
        const double anew = MeasureFrames(map, [&](int i) { map.Zoom(i % 2 ? 1.01 : 1 / 1.01); });
        fast = Report(name("Map: redraw after a drag / frame").c_str(), drag, Frame, 1) && fast;
        fast = Report(name("Map: redraw after an arrow key / frame").c_str(), key, Frame, 1) && fast;
        std::printf("%-58s %9.3f ms\n", name("Map: redraw after Page Down, 400 rows").c_str(), page);
        std::printf("%-58s %9.3f ms\n", name("Map: everything anew after a zoom").c_str(), anew);
    }
    return fast ? 0 : 1;
}
