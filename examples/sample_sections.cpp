#include "sample_sections.h"

#include "data/hd_file.h"
#include "sample_network.h"
#include "sample_river.h"

#include <cmath>
#include <map>
#include <random>
#include <vector>

namespace {

struct Channel
{
    double chainage, radius, width; // metres
};

double Rounded(double value, double step)
{
    const double whole = std::round(value / step);
    return step < 1 ? whole / std::round(1 / step) : whole * step; // 0.01 * 3 is not 0.03
}

/// The tables of the sample network, by branch.
std::map<std::string, std::vector<Channel>> Channels()
{
    const TqlStructure network(tqlLoadText(SampleNetworkText(), "sample network"));
    const tqlHandle target = tqlTargetByNameNum(network.Get(), "KVR_NETWORK", 1);
    std::map<std::string, std::vector<Channel>> channels;
    for (int i = 1, branches = tqlGetNoSections(target); i <= branches; ++i) {
        const tqlHandle branch = tqlSectionByNum(target, i), table = tqlSectionByNameNum(branch, "Channel", 1);
        std::string name;
        tqlGetParam(branch, "Name", &name);
        for (int row = 1, rows = tqlGetNoKeywords(table, "DATA"); row <= rows; ++row) {
            Channel at{};
            tqlGetListParam(table, "DATA", row, "ddd", {&at.chainage, &at.radius, &at.width});
            channels[name].push_back(at);
        }
    }
    return channels;
}

Channel At(const std::vector<Channel>& table, double chainage)
{
    for (std::size_t i = 1; i < table.size(); ++i) {
        const Channel &before = table[i - 1], &after = table[i];
        if (chainage > after.chainage)
            continue;
        const double part = (chainage - before.chainage) / (after.chainage - before.chainage);
        return {chainage, Rounded(std::lerp(before.radius, after.radius, part), 5),
                Rounded(std::lerp(before.width, after.width, part), 0.5)};
    }
    return table.back();
}

/// Half a section: distance from the middle as a part of the width, and height above the water as a part of the depth.
struct Shape
{
    double out, up;
};
constexpr Shape outerBank[] = {{0.16, -1}, {0.36, -0.86}, {0.5, 0}, {0.58, 0.62}, {0.95, 0.7}, {1.3, 1.5}};
constexpr Shape innerBank[] = {{0.02, -0.95}, {0.24, -0.62}, {0.5, 0}, {0.66, 0.48}, {1.2, 0.58}, {1.6, 1.3}};

void Point(tqlHandle file, double offset, double level)
{
    tqlAddKeyword(file, "Point");
    tqlAddDouble(file, Rounded(offset, 0.1));
    tqlAddDouble(file, Rounded(level, 0.01));
}

/// Deepest towards the outer bank of the bend, with a flood plain on either side.
class Surveyor
{
public:
    void AddProfile(tqlHandle file, const Channel& channel, double waterLevel)
    {
        const double depth = 0.36 * std::sqrt(channel.width);
        const bool outerIsLeft = Between(0, 1) < 0.5;
        const auto& left = outerIsLeft ? outerBank : innerBank;
        const auto& right = outerIsLeft ? innerBank : outerBank;
        const double middle = std::ceil(1.7 * channel.width);
        const auto add = [&](const Shape& shape, double side) {
            const bool shore = shape.up == 0;
            const double out = shape.out * channel.width * (shore ? 1 : Between(0.96, 1.04));
            const double rough = shore ? 0 : 0.06 * depth * Between(-1, 1);
            Point(file, middle + side * out, waterLevel + shape.up * depth + rough);
        };
        for (auto shape = std::rbegin(left); shape != std::rend(left); ++shape)
            add(*shape, -1);
        for (const Shape& shape : right)
            add(shape, 1);
    }

private:
    double Between(double low, double high) { return low + (high - low) * (m_engine() / 4294967296.0); }
    std::mt19937 m_engine{7}; // its numbers are fixed by the standard
};

} // namespace

std::string SampleSectionsText()
{
    constexpr std::size_t every = 3;
    const auto channels = Channels();
    const HD_Parameters river = SampleRiver();
    const auto& locations = river.InitList;
    const TqlStructure sections(tqlCreate());
    const tqlHandle file = sections.Get();
    Surveyor surveyor;
    tqlAddTarget(file, "KVR_CROSS_SECTIONS");
    std::size_t onBranch = 0;
    for (std::size_t i = 0; i < locations.GetCount(); ++i) {
        const HD_Initial& at = locations.GetAt(i);
        const bool first = i == 0 || locations.GetAt(i - 1).RiverName != at.RiverName;
        const bool last = i + 1 == locations.GetCount() || locations.GetAt(i + 1).RiverName != at.RiverName;
        onBranch = first ? 0 : onBranch + 1;
        if (onBranch % every != 0 && !last)
            continue;
        const Channel channel = At(channels.at(at.RiverName), at.Chainage);
        tqlAddSection(file, "CrossSection");
        tqlPutParam(file, "Branch", std::string_view(at.RiverName));
        tqlPutParam(file, "TopoID", "SURVEY 2019");
        tqlPutParam(file, "Chainage", at.Chainage);
        tqlPutParam(file, "Radius", channel.radius);
        tqlPutParam(file, "Width", channel.width);
        tqlAddSection(file, "Profile");
        surveyor.AddProfile(file, channel, at.InitialH);
        tqlEndSection(file);
        tqlEndSection(file);
    }
    tqlEndSection(file);
    return std::string(tqlGetText(file));
}
