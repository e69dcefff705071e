#include "editors/network/join_lines.h"

#include <algorithm>
#include <cmath>
#include <map>

namespace {

struct End
{
    std::size_t part;
    bool last; // vertex of it, otherwise the first
    auto operator<=>(const End&) const = default;
};

/// For an end the one that it meets.
using Meetings = std::map<End, End>;

/// Ends meet where they are at the same place, to a millimetre: neither at a fork nor as those of a ring.
Meetings FindMeetings(const std::vector<CGisLine>& parts)
{
    const auto key = [](const QPointF& at) { return std::pair(std::round(at.x() * 1000), std::round(at.y() * 1000)); };
    std::map<std::pair<double, double>, std::vector<End>> places;
    for (std::size_t i = 0; i < parts.size(); ++i) {
        if (parts[i].empty())
            continue;
        places[key(parts[i].front())].push_back({i, false});
        places[key(parts[i].back())].push_back({i, true});
    }
    Meetings meetings;
    for (const auto& [place, ends] : places) {
        if (ends.size() == 2 && ends[0].part != ends[1].part) {
            meetings.emplace(ends[0], ends[1]);
            meetings.emplace(ends[1], ends[0]);
        }
    }
    return meetings;
}

/// The parts that follow an end one after the other, each by the end where it is entered.
std::vector<End> Follow(const Meetings& meetings, End end, std::vector<bool>& used)
{
    std::vector<End> chain;
    for (auto next = meetings.find(end); next != meetings.end() && !used[next->second.part];
         next = meetings.find(end)) {
        end = chain.emplace_back(next->second);
        used[end.part] = true;
        end.last = !end.last;
    }
    return chain;
}

} // namespace

std::vector<CJoinedLine> JoinLines(const std::vector<CGisLine>& parts)
{
    const Meetings meetings = FindMeetings(parts);
    std::vector<bool> used(parts.size());
    std::vector<CJoinedLine> lines;
    for (std::size_t i = 0; i < parts.size(); ++i) {
        if (used[i] || parts[i].empty())
            continue;
        used[i] = true;
        const std::vector<End> after = Follow(meetings, {i, true}, used), before = Follow(meetings, {i, false}, used);
        CJoinedLine& joined = lines.emplace_back();
        const auto add = [&](std::size_t part, bool turned) {
            CGisLine line = parts[part];
            if (turned)
                std::ranges::reverse(line);
            joined.line.insert(joined.line.end(), line.begin() + (joined.line.empty() ? 0 : 1), line.end());
            joined.turned += turned;
            ++joined.parts;
        };
        for (auto each = before.rbegin(); each != before.rend(); ++each)
            add(each->part, !each->last); // entered at its last vertex it runs towards this one
        add(i, false);
        for (const End& each : after)
            add(each.part, each.last);
    }
    return lines;
}
