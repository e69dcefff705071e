#include "files/difference.h"

#include "base/not_given.h"
#include "files/structure.h"

#include <algorithm>
#include <functional>
#include <string_view>
#include <unordered_map>

namespace {

/// A keyword or a section among its siblings.
struct Item
{
    tqlHandle node = nullptr;
    std::string_view name{};
    std::size_t content = 0; // hash of everything in it
    std::size_t lines = 1;   // keywords in it
    std::size_t number = 0;  // among those of its name, from 1
    bool isAlone = true;     // nobody else has its name
};
using Items = std::vector<Item>;

/// Items from `first` up to `end` of two sequences.
struct Range
{
    std::size_t before = 0, beforeEnd = 0, after = 0, afterEnd = 0;
};

std::size_t Mixed(std::size_t seed, std::size_t value)
{
    return seed ^ (value + 0x9e3779b97f4a7c15ull + (seed << 6) + (seed >> 2));
}

std::size_t HashOf(std::string_view text)
{
    return std::hash<std::string_view>()(text);
}

void Number(Items& items)
{
    std::unordered_map<std::string_view, std::size_t> counts;
    for (Item& item : items)
        item.number = ++counts[item.name];
    for (Item& item : items)
        item.isAlone = counts[item.name] == 1;
}

Items Keywords(tqlHandle section)
{
    Items items(std::size_t(tqlGetNoKeywords(section)));
    for (std::size_t i = 0; i < items.size(); ++i) {
        const tqlHandle keyword = tqlKeywordByNum(section, int(i) + 1);
        const std::string_view name = tqlName(keyword);
        items[i] = {.node = keyword, .name = name, .content = Mixed(HashOf(name), HashOf(tqlGetRawParams(keyword)))};
    }
    Number(items);
    return items;
}

/// Nesting is no deeper than a loaded file's.
Items Sections(tqlHandle parent)
{
    Items items(std::size_t(tqlGetNoSections(parent)));
    for (std::size_t i = 0; i < items.size(); ++i) {
        const tqlHandle section = tqlSectionByNum(parent, int(i) + 1);
        Item item{.node = section, .name = tqlName(section), .lines = 0};
        item.content = HashOf(item.name);
        for (const Items& inner : {Keywords(section), Sections(section)})
            for (const Item& each : inner) {
                item.content = Mixed(item.content, each.content);
                item.lines += each.lines;
            }
        items[i] = item;
    }
    Number(items);
    return items;
}

/// As tables show it: what is not given is nothing.
std::string_view ShownText(tqlHandle param)
{
    double number = 0;
    return tqlGetDouble(param, &number) && number == NotGiven ? std::string_view() : tqlGetRawParam(param);
}

std::string ShownLine(const Item* item)
{
    std::string text;
    const tqlHandle first = item ? tqlParamByNum(item->node, 1) : nullptr;
    for (tqlHandle param = first; param; param = tqlNextParam(param))
        text.append(param == first ? "" : ", ").append(ShownText(param));
    return text;
}

bool IsSameValue(tqlHandle a, tqlHandle b)
{
    double numbers[2];
    if (tqlGetDouble(a, &numbers[0]) && tqlGetDouble(b, &numbers[1]))
        return numbers[0] == numbers[1];
    std::string texts[2];
    return tqlGetType(a) == tqlGetType(b) && tqlGetString(a, &texts[0]) && tqlGetString(b, &texts[1]) &&
           texts[0] == texts[1];
}

class Comparison
{
public:
    Comparison(tqlHandle before, tqlHandle after, std::size_t most) : m_before(before), m_after(after), m_most(most) {}

    /// The first target is the file; it is not named.
    void CompareTargets()
    {
        const tqlHandle file = tqlSectionByNum(m_after, 1);
        Align(Sections(m_before), Sections(m_after), [&](const Item* old, const Item* now) {
            if (old && now && now->node == file)
                Compare(old->node, now->node, {});
            else
                Part({}, old, now);
        });
    }
    Differences Take() { return std::move(m_found); }

private:
    using Pair = std::function<void(const Item* before, const Item* after)>; // one of them may be null

    void Compare(tqlHandle before, tqlHandle after, const std::string& section)
    {
        const std::size_t found = Count();
        Align(Keywords(before), Keywords(after), [&](const Item* old, const Item* now) { Line(section, old, now); });
        m_found.sections += Count() > found;
        Align(Sections(before), Sections(after), [&](const Item* old, const Item* now) { Part(section, old, now); });
    }

    std::size_t Count() const { return m_found.changed + m_found.added + m_found.removed; }

    /// What is the same and stands only once in both belongs together; what lies between does in its order.
    static void Align(const Items& before, const Items& after, const Pair& differ)
    {
        Range all{0, before.size(), 0, after.size()};
        Trim(before, after, all);
        for (const auto& [b, a] : Anchors(before, after, all)) {
            PairOff(before, after, {all.before, b, all.after, a}, differ);
            all.before = b + 1;
            all.after = a + 1;
        }
        PairOff(before, after, all, differ);
    }

    /// Leaves out what is the same at both ends.
    static void Trim(const Items& before, const Items& after, Range& range)
    {
        const auto isLeft = [&] { return range.before < range.beforeEnd && range.after < range.afterEnd; };
        for (; isLeft() && before[range.before].content == after[range.after].content; ++range.before)
            ++range.after;
        for (; isLeft() && before[range.beforeEnd - 1].content == after[range.afterEnd - 1].content; --range.beforeEnd)
            --range.afterEnd;
    }

    /// What stands once in each of both, as far as it is in the same order.
    static std::vector<std::pair<std::size_t, std::size_t>> Anchors(const Items& before, const Items& after,
                                                                    const Range& range)
    {
        struct Place
        {
            std::size_t before = 0, after = 0;
            int inBefore = 0, inAfter = 0;
        };
        std::unordered_map<std::size_t, Place> places;
        for (std::size_t b = range.before; b < range.beforeEnd; ++b) {
            Place& place = places[before[b].content];
            place.before = b;
            ++place.inBefore;
        }
        for (std::size_t a = range.after; a < range.afterEnd; ++a) {
            const auto found = places.find(after[a].content);
            if (found == places.end())
                continue;
            found->second.after = a;
            ++found->second.inAfter;
        }
        std::vector<std::pair<std::size_t, std::size_t>> both;
        for (const auto& [content, place] : places)
            if (place.inBefore == 1 && place.inAfter == 1)
                both.emplace_back(place.before, place.after);
        std::ranges::sort(both);
        return LongestRise(both);
    }

    /// The longest part of the pairs in which the second numbers rise, too.
    static std::vector<std::pair<std::size_t, std::size_t>>
    LongestRise(const std::vector<std::pair<std::size_t, std::size_t>>& pairs)
    {
        constexpr std::size_t none = std::size_t(-1);
        std::vector<std::size_t> ends, previous(pairs.size(), none); // ends: of the rises of each length
        for (std::size_t i = 0; i < pairs.size(); ++i) {
            const auto place =
                std::ranges::lower_bound(ends, pairs[i].second, {}, [&](std::size_t end) { return pairs[end].second; });
            if (place != ends.begin())
                previous[i] = *(place - 1);
            if (place == ends.end())
                ends.push_back(i);
            else
                *place = i;
        }
        std::vector<std::pair<std::size_t, std::size_t>> rise;
        for (std::size_t i = ends.empty() ? none : ends.back(); i != none; i = previous[i])
            rise.push_back(pairs[i]);
        std::ranges::reverse(rise);
        return rise;
    }

    static void PairOff(const Items& before, const Items& after, Range range, const Pair& differ)
    {
        Trim(before, after, range);
        std::unordered_map<std::string_view, std::size_t> left; // in `after`, by name
        for (std::size_t a = range.after; a < range.afterEnd; ++a)
            ++left[after[a].name];
        const auto next = [&] {
            --left[after[range.after].name];
            return &after[range.after++];
        };
        for (; range.before < range.beforeEnd; ++range.before) {
            const Item& old = before[range.before];
            if (left[old.name] == 0) {
                differ(&old, nullptr);
                continue;
            }
            while (after[range.after].name != old.name)
                differ(nullptr, next());
            differ(&old, next());
        }
        while (range.after < range.afterEnd)
            differ(nullptr, next());
    }

    static std::string PathOf(const std::string& parent, const Item& section)
    {
        std::string path = parent.empty() ? parent : parent + " / ";
        path += section.name;
        return section.isAlone && section.number == 1 ? path : path + ' ' + std::to_string(section.number);
    }

    void Part(const std::string& parent, const Item* before, const Item* after)
    {
        const Item& item = after ? *after : *before;
        const std::string path = PathOf(parent, item);
        if (before && after) {
            Compare(before->node, after->node, path);
            return;
        }
        ++m_found.sections;
        Difference found{.kind = after ? Difference::Added : Difference::Removed, .section = path};
        (after ? found.after : found.before) = std::to_string(item.lines);
        Add(std::move(found), after ? m_after : m_before, item.node, item.lines);
    }

    void Line(const std::string& section, const Item* before, const Item* after)
    {
        const Item& item = after ? *after : *before;
        Difference found{.kind = !before  ? Difference::Added
                                 : !after ? Difference::Removed
                                          : Difference::Changed,
                         .section = section,
                         .keyword = std::string(item.name),
                         .number = item.number};
        if (before && after && tqlGetNoParams(before->node) == tqlGetNoParams(after->node)) {
            Values(found, before->node, after->node);
            return;
        }
        found.before = ShownLine(before);
        found.after = ShownLine(after);
        Add(std::move(found), after ? m_after : m_before, item.node, 1);
    }

    void Values(const Difference& place, tqlHandle before, tqlHandle after)
    {
        tqlHandle old = tqlParamByNum(before, 1), now = tqlParamByNum(after, 1);
        for (int number = 1; old && now; ++number, old = tqlNextParam(old), now = tqlNextParam(now)) {
            if (tqlGetRawParam(old) == tqlGetRawParam(now) || IsSameValue(old, now))
                continue;
            Difference found = place;
            found.parameter = number;
            found.before = ShownText(old);
            found.after = ShownText(now);
            Add(std::move(found), m_after, now, 1);
        }
    }

    /// `lines`: how many count.
    void Add(Difference found, tqlHandle structure, tqlHandle node, std::size_t lines)
    {
        (found.kind == Difference::Changed ? m_found.changed
         : found.kind == Difference::Added ? m_found.added
                                           : m_found.removed) += lines;
        m_found.areMore = m_found.list.size() >= m_most;
        if (m_found.areMore)
            return;
        found.line = tqlGetPosition(structure, node).line;
        m_found.list.push_back(std::move(found));
    }

    tqlHandle m_before, m_after;
    std::size_t m_most;
    Differences m_found;
};

} // namespace

Differences FindDifferences(tqlHandle before, tqlHandle after, std::size_t most)
{
    Comparison comparison(before, after, most);
    comparison.CompareTargets();
    return comparison.Take();
}

std::optional<Differences> FindDifferences(std::string before, std::string after)
{
    const Result<TqlStructure> structures[] = {ParseText(std::move(before), {}), ParseText(std::move(after), {})};
    if (!structures[0] || !structures[1])
        return {};
    return FindDifferences(structures[0].value().Get(), structures[1].value().Get());
}
