#include "editors/network/join_lines.h"

#include <algorithm>
#include <cmath>
#include <map>
#include <optional>

namespace {

struct End
{
    std::size_t part;
    bool last; // vertex of it, otherwise the first
    bool operator==(const End&) const = default;
};

/// Ends by where they are, to a millimetre.
class CEnds
{
public:
    explicit CEnds(const std::vector<CGisLine>& parts)
    {
        for (std::size_t i = 0; i < parts.size(); ++i) {
            if (parts[i].empty())
                continue;
            m_ends[Key(parts[i].front())].push_back({i, false});
            m_ends[Key(parts[i].back())].push_back({i, true});
        }
        for (const auto& [key, ends] : m_ends) {
            if (ends.size() == 2 && ends[0].part != ends[1].part) { // neither a fork nor a ring
                m_next.emplace(std::pair(ends[0].part, ends[0].last), ends[1]);
                m_next.emplace(std::pair(ends[1].part, ends[1].last), ends[0]);
            }
        }
    }
    /// The end that meets this one.
    std::optional<End> Meets(const End& end) const
    {
        const auto found = m_next.find({end.part, end.last});
        return found == m_next.end() ? std::nullopt : std::optional(found->second);
    }

private:
    using Place = std::pair<double, double>;
    static Place Key(const QPointF& at) { return {std::round(at.x() * 1000), std::round(at.y() * 1000)}; }
    std::map<Place, std::vector<End>> m_ends;
    std::map<std::pair<std::size_t, bool>, End> m_next;
};

/// The parts that follow an end one after the other, each by the end where it is entered.
std::vector<End> Follow(const CEnds& ends, End end, std::vector<bool>& used)
{
    std::vector<End> chain;
    for (auto next = ends.Meets(end); next && !used[next->part]; next = ends.Meets(end)) {
        used[next->part] = true;
        chain.push_back(*next);
        end = {next->part, !next->last};
    }
    return chain;
}

void Append(const CGisLine& part, bool turned, CJoinedLine& to)
{
    CGisLine line = part;
    if (turned)
        std::reverse(line.begin(), line.end());
    to.line.insert(to.line.end(), line.begin() + (to.line.empty() ? 0 : 1), line.end());
    to.turned += turned;
}

} // namespace

std::vector<CJoinedLine> JoinLines(const std::vector<CGisLine>& parts)
{
    const CEnds ends(parts);
    std::vector<bool> used(parts.size());
    std::vector<CJoinedLine> lines;
    for (std::size_t i = 0; i < parts.size(); ++i) {
        if (used[i] || parts[i].empty())
            continue;
        used[i] = true;
        const std::vector<End> after = Follow(ends, {i, true}, used), before = Follow(ends, {i, false}, used);
        CJoinedLine& joined = lines.emplace_back();
        const auto add = [&](std::size_t part, bool turned) {
            joined.parts.push_back(part);
            Append(parts[part], turned, joined);
        };
        for (auto each = before.rbegin(); each != before.rend(); ++each)
            add(each->part, !each->last); // entered at its last vertex it runs towards this one
        add(i, false);
        for (const End& each : after)
            add(each.part, each.last);
    }
    return lines;
}
