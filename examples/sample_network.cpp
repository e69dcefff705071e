#include "sample_network.h"

#include "data/hd_file.h"

#include <algorithm>
#include <array>
#include <cmath>
#include <numbers>
#include <vector>

namespace {

struct Point
{
    double x, y;
};

struct Course
{
    const char* name;
    double length;             // chainage of the lower end, metres
    std::vector<Point> valley; // from the upper end: the river meanders about the line through these
    double wave;               // length of a meander along the valley, metres
    double up, down;           // width of the meander belt to either side at the two ends, metres
    double widthUp, widthDown; // of the channel, metres
};

const Point confluence{517300, 5683600};

const std::vector<Course>& Courses()
{
    static const std::vector<Course> courses{
        {"AELDER UPPER",
         24600,
         {{502200, 5691900}, {506400, 5691200}, {509800, 5687600}, {513900, 5686900}, confluence},
         2300,
         160,
         480,
         34,
         52},
        {"AELDER LOWER",
         31250,
         {confluence, {520900, 5681300}, {524200, 5681900}, {528600, 5678400}, {531700, 5673900}},
         3100,
         480,
         820,
         58,
         84},
        {"MOORBECK",
         9850,
         {{516900, 5691600}, {518300, 5688900}, {517200, 5686300}, confluence},
         1150,
         90,
         190,
         9,
         16}};
    return courses;
}

double Distance(Point a, Point b)
{
    return std::hypot(b.x - a.x, b.y - a.y);
}

/// A smooth curve through the points, from segment `i` on (Catmull-Rom, as in E. Catmull, R. Rom, 1974).
Point OnCurve(const std::vector<Point>& points, std::size_t i, double t)
{
    const std::size_t last = points.size() - 1;
    const Point p0 = points[i > 0 ? i - 1 : 0], p1 = points[i], p2 = points[i + 1], p3 = points[std::min(i + 2, last)];
    const auto blend = [t](double a, double b, double c, double d) {
        return 0.5 * (2 * b + (c - a) * t + (2 * a - 5 * b + 4 * c - d) * t * t + (3 * b - a - 3 * c + d) * t * t * t);
    };
    return {blend(p0.x, p1.x, p2.x, p3.x), blend(p0.y, p1.y, p2.y, p3.y)};
}

std::vector<Point> Valley(const Course& course)
{
    std::vector<Point> line;
    constexpr int steps = 200;
    for (std::size_t i = 0; i + 1 < course.valley.size(); ++i) {
        for (int step = 0; step < steps; ++step)
            line.push_back(OnCurve(course.valley, i, double(step) / steps));
    }
    line.push_back(course.valley.back());
    return line;
}

std::vector<double> Along(const std::vector<Point>& line)
{
    std::vector<double> along{0};
    for (std::size_t i = 1; i < line.size(); ++i)
        along.push_back(along.back() + Distance(line[i - 1], line[i]));
    return along;
}

/// Meanders about the valley: a sine whose waves differ in length and height, level at both ends. `belt` widens the
/// belt.
std::vector<Point> Meanders(const Course& course, double belt)
{
    const std::vector<Point> valley = Valley(course);
    const std::vector<double> along = Along(valley);
    std::vector<Point> river{valley.front()};
    for (std::size_t i = 1; i + 1 < valley.size(); ++i) {
        const double part = along[i] / along.back();
        const double phase = 2 * std::numbers::pi * along[i] / course.wave;
        const double height =
            belt * std::lerp(course.up, course.down, part) * std::min({1.0, 12 * part, 12 * (1 - part)});
        const double side =
            height * (0.75 * std::sin(phase + 0.9 * std::sin(0.37 * phase)) + 0.25 * std::sin(2.3 * phase));
        const Point before = valley[i - 1], after = valley[i + 1];
        const double step = Distance(before, after);
        river.push_back(
            {valley[i].x - side * (after.y - before.y) / step, valley[i].y + side * (after.x - before.x) / step});
    }
    river.push_back(valley.back());
    return river;
}

/// As long as the branch: chainages are metres along the river.
std::vector<Point> River(const Course& course)
{
    double low = 0, high = 3;
    for (int i = 0; i < 40; ++i) {
        const double belt = (low + high) / 2;
        (Along(Meanders(course, belt)).back() < course.length ? low : high) = belt;
    }
    return Meanders(course, low);
}

/// The circle through three points; 1 / (4 x area) x product of the sides.
double Radius(Point a, Point b, Point c)
{
    const double area2 = std::abs((b.x - a.x) * (c.y - a.y) - (c.x - a.x) * (b.y - a.y));
    return area2 > 0 ? Distance(a, b) * Distance(b, c) * Distance(c, a) / (2 * area2) : 1e6;
}

double Rounded(double value, double step)
{
    return std::round(value / step) * step;
}

void Numbers(tqlHandle file, const char* name, std::initializer_list<double> values)
{
    tqlAddKeyword(file, name);
    for (const double value : values)
        tqlAddDouble(file, value);
}

void AddChannel(tqlHandle file, const Course& course, const std::vector<Point>& river)
{
    const std::vector<double> along = Along(river);
    const auto at = [&](double chainage) {
        const double distance = chainage / course.length * along.back();
        const auto after = std::lower_bound(along.begin(), along.end(), distance);
        return river[std::min(std::size_t(after - along.begin()), river.size() - 1)];
    };
    constexpr double spacing = 1250, chord = 250;
    for (double chainage = 0;; chainage = std::min(chainage + spacing, course.length)) {
        const double middle = std::clamp(chainage, chord, course.length - chord);
        const double radius = Radius(at(middle - chord), at(middle), at(middle + chord));
        const double width = std::lerp(course.widthUp, course.widthDown, chainage / course.length);
        Numbers(file, "DATA", {chainage, Rounded(std::min(radius, 5000.0), 5), Rounded(width, 0.5)});
        if (chainage == course.length)
            break;
    }
}

} // namespace

std::string SampleNetworkText()
{
    const TqlStructure network(tqlCreate());
    const tqlHandle file = network.Get();
    tqlAddTarget(file, "KVR_NETWORK");
    for (const Course& course : Courses()) {
        const std::vector<Point> river = River(course);
        tqlAddSection(file, "Branch");
        tqlPutParam(file, "Name", course.name);
        Numbers(file, "Chainage", {0, course.length});
        tqlPutParam(file, "FlowsDownstream", true);
        tqlAddSection(file, "Line");
        for (std::size_t i = 0; i < river.size(); ++i) {
            if (i % 2 == 0 || i + 1 == river.size())
                Numbers(file, "Vertex", {Rounded(river[i].x, 0.5), Rounded(river[i].y, 0.5)});
        }
        tqlEndSection(file);
        tqlAddSection(file, "Channel");
        AddChannel(file, course, river);
        tqlEndSection(file);
        tqlEndSection(file);
    }
    tqlEndSection(file);
    return std::string(tqlGetText(file));
}
