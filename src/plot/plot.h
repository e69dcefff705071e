// A plot of curves along one horizontal axis, in tracks one below the other. What draws it is a library of its own,
// loaded when the first plot is shown: a program without it works, and says what is missing (plot_library.h).
#pragma once

#include <QString>
#include <QStringList>
#include <functional>
#include <memory>
#include <optional>
#include <vector>

class QImage;
class QWidget;

/// What a curve stands for; its color follows from that and from the palette of the window.
enum class PlotInk
{
    Ground,
    LeftBank,
    RightBank,
    Water,
    Other // one of several, told apart by their number
};

struct PlotCurve
{
    QString name;
    PlotInk ink = PlotInk::Other;
    int number = 0;         // of PlotInk::Other
    bool isDashed = false;  // a level among others that are more important
    bool hasPoints = false; // they are shown where there is room for them
    bool isMovable = false; // its points can be dragged, added and removed
    // In the units that the axes name. `x` does not decrease; a y that is not a number leaves a gap.
    std::vector<double> x{}, y{};
    std::vector<double> end{}; // of reaches: where each ends that starts at x; drawn as a bar at y
};

struct PlotTrack
{
    QString label; // of the vertical axis
    std::vector<PlotCurve> curves{};
    QStringList lanes{}; // what the whole numbers from 0 on the axis are called instead
    double weight = 1;   // of its height among the others
};

struct PlotContent
{
    QString axis; // label of the horizontal axis
    std::vector<PlotTrack> tracks;
};

/// A point of a curve, all counted from 0.
struct PlotPoint
{
    int track = -1, curve = -1;
    std::size_t point = 0;

    bool operator==(const PlotPoint&) const = default;
};

/// What the user does; what is not given is not offered.
struct PlotHandlers
{
    std::function<void(const PlotPoint&)> picked = {};
    /// A point is being dragged to a place: what is to be said of it.
    std::function<QString(const PlotPoint&, double x, double y)> dragging = {};
    std::function<void(const PlotPoint&, double x, double y)> moved = {};
    std::function<void(int track, double x, double y)> added = {};
    std::function<void(const PlotPoint&)> removed = {};
    /// A number of a track as the user reads it, -1 for one of the axis below: with its unit.
    std::function<QString(int track, double value)> text = {};
};

class IPlot
{
public:
    virtual ~IPlot() = default;
    /// A child of what the plot was made for, which deletes it. It is gone with this.
    virtual QWidget& Widget() = 0;
    /// `fits`: all of it is shown; otherwise what was in sight stays in sight.
    virtual void Show(PlotContent content, bool fits) = 0;
    /// Marks a place of the axis and the points of a line there; nothing marks none. One out of sight comes into sight.
    virtual void Mark(std::optional<double> x, const std::vector<PlotPoint>& points) = 0;
    virtual void Fit() = 0;
    /// `factor` above 1 shows more detail about the middle.
    virtual void Zoom(double factor) = 0;
    /// What of the axis is in sight.
    virtual void SetRange(double from, double to) = 0;
    virtual std::pair<double, double> Range() const = 0;
    // On white paper, as large as so many pixels of a screen.
    virtual QImage Picture(int width, int height) = 0;
    /// To a file as its extension says: one of PlotFileTypes. The reason why it was not written, and the file is as it
    /// was before; empty when it was.
    virtual QString Write(const QString& file, int width, int height) = 0;
    /// Asks for a printer, and fills a page.
    virtual void Print(QWidget* parent) = 0;
};

inline const QStringList PlotFileTypes{QStringLiteral("png"), QStringLiteral("svg"), QStringLiteral("pdf")};

/// What the library has.
struct PlotLibrary
{
    std::unique_ptr<IPlot> (*make)(QWidget* parent, PlotHandlers handlers);
};
extern "C" using PlotLibraryGetter = const PlotLibrary * ();
inline constexpr const char *PlotLibraryName = "KVR_PLOT", *PlotLibraryFunction = "KvrPlotLibrary";
