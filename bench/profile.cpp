// Moving along a long profile of 1,000,000 points, at 1600 x 1000: a pan and a zoom within one frame of 60 Hz.
#include "bench/frames.h"
#include "plot/plot_library.h"

#include <QApplication>
#include <QWidget>
#include <cmath>
#include <random>

namespace {

constexpr std::size_t Points = 1'000'000;
constexpr double Frame = 1000.0 / 60; // milliseconds

/// A million points in two curves of levels, as many in a track of discharges, and the ground.
PlotContent MakeContent()
{
    std::mt19937 random(13);
    const auto curve = [&random](const QString& name, PlotInk ink, double start, double slope, double noise) {
        PlotCurve made{.name = name, .ink = ink, .hasPoints = true, .isMovable = true};
        for (std::size_t i = 0; i < Points; ++i) {
            made.x.push_back(double(i) * 0.1);
            made.y.push_back(start - slope * double(i) + noise * (random() / 4294967295.0 - 0.5));
        }
        return made;
    };
    PlotContent content{QStringLiteral("Chainage [m]"), {}};
    content.tracks.push_back({QStringLiteral("Level [m]"),
                              {curve(QStringLiteral("Bed"), PlotInk::Ground, 60, 5e-5, 2),
                               curve(QStringLiteral("Water"), PlotInk::Water, 64, 5e-5, 0.5)},
                              {},
                              2});
    content.tracks.push_back(
        {QStringLiteral("Discharge [m3/s]"), {curve(QStringLiteral("Q"), PlotInk::Other, 40, 0, 9)}, {}, 1});
    return content;
}

} // namespace

int main(int argc, char** argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);
    QString reason;
    const PlotLibrary* library = LoadPlotLibrary(reason);
    if (!library) {
        std::fprintf(stderr, "%s\n", qPrintable(reason));
        return 2;
    }
    QWidget window;
    window.resize(1600, 1000);
    const auto plot = library->make(&window, {});
    plot->Widget().resize(1600, 1000);
    window.show();
    std::printf("%-58s %9.3f ms\n", "Profile: shown for the first time",
                Milliseconds([&] { plot->Show(MakeContent(), true); }));

    bool fast = true;
    for (const double part : {1.0, 0.1, 0.001}) { // of the branch in sight
        const double width = double(Points) * 0.1 * part, from = (double(Points) * 0.1 - width) / 2;
        const auto name = [part](const char* what) {
            return std::string("Profile: ") + what + ", " + std::to_string(int(part * Points)) + " points in sight";
        };
        const double pan = MeasureFrames(
            plot->Widget(), [&](int i) { plot->SetRange(from + i * width / 500, from + width + i * width / 500); });
        const double zoom = MeasureFrames(
            plot->Widget(), [&](int i) { plot->SetRange(from + i * width / 900, from + width - i * width / 900); });
        fast = Report(name("pan / frame").c_str(), pan, Frame, 1) && fast;
        fast = Report(name("zoom / frame").c_str(), zoom, Frame, 1) && fast;
    }
    return fast ? 0 : 1;
}
