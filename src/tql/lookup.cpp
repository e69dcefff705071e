// Finding, counting, naming and placing what a loaded structure holds.
#include "tql/node.h"
#include "tql/scan.h"
#include "tql/utf8.h"

#include <algorithm>
#include <cstring>

using namespace tql;

namespace {

constexpr std::size_t NotFound = std::size_t(-1);

// Made at the first look-up by name.
template <typename Children, typename NameOf>
const std::vector<std::uint32_t>& Named(std::unique_ptr<NameIndex>& index, const Children& children,
                                        std::string_view name, NameOf nameOf)
{
    static const std::vector<std::uint32_t> none;
    if (!index) {
        index = std::make_unique<NameIndex>();
        for (std::size_t i = 0; i < children.size(); ++i)
            (*index)[nameOf(children[i])].push_back(std::uint32_t(i));
    }
    const auto found = index->find(name);
    return found == index->end() ? none : found->second;
}

const std::vector<std::uint32_t>& KeywordsNamed(Section& section, std::string_view name)
{
    return Named(section.keywordIndex, section.keywords, name, [](const Keyword& keyword) { return keyword.Name(); });
}

// Position from 0 of a number from 1.
std::size_t PositionOf(int number, std::size_t count)
{
    return number >= 1 && std::size_t(number) <= count ? std::size_t(number) - 1 : NotFound;
}

bool HasOneName(const Section& section)
{
    return section.sameKeywordNames && !section.keywords.empty();
}

// Where a handle's text stands; null for a structure and for what was not loaded.
const char* TextOf(tqlHandle node)
{
    if (const Keyword* const keyword = AsKeyword(node))
        return keyword->Name().data();
    if (const char* const param = AsParam(node))
        return param;
    const Section* const section = AsParent(node);
    return section && !section->name.empty() ? section->name.data() - 1 : nullptr; // at its bracket
}

const std::vector<std::size_t>& LineStarts(Structure& structure)
{
    auto& starts = structure.lineStarts;
    const char* const begin = structure.text.begin();
    const char* const end = structure.text.end();
    if (starts.empty())
        for (const char* p = begin; p && p <= end;) {
            starts.push_back(std::size_t(p - begin));
            p = static_cast<const char*>(std::memchr(p, '\n', std::size_t(end - p)));
            p += p != nullptr;
        }
    return starts;
}

} // namespace

tqlHandle tqlTargetByNameNum(tqlHandle structure, std::string_view name, int number)
{
    return AsStructure(structure) ? tqlSectionByNameNum(structure, name, number) : nullptr;
}

tqlHandle tqlSectionByNameNum(tqlHandle handle, std::string_view name, int number)
{
    Section* const parent = AsParent(handle);
    if (!parent || parent->sections.empty())
        return nullptr;
    const auto& positions =
        Named(parent->sectionIndex, parent->sections, name, [](const Section* section) { return section->name; });
    const std::size_t place = PositionOf(number, positions.size());
    return place == NotFound ? nullptr : HandleOf(parent->sections[positions[place]]);
}

tqlHandle tqlKeywordByNameNum(tqlHandle handle, std::string_view name, int number)
{
    Section* const section = AsParent(handle);
    if (!section)
        return nullptr;
    if (HasOneName(*section))
        return section->keywords.front().Name() == name ? tqlKeywordByNum(handle, number) : nullptr;
    const auto& positions = KeywordsNamed(*section, name);
    const std::size_t place = PositionOf(number, positions.size());
    return place == NotFound ? nullptr : HandleOf(&section->keywords[positions[place]]);
}

tqlHandle tqlParamByNum(tqlHandle handle, int number)
{
    const Keyword* const keyword = AsKeyword(handle);
    if (!keyword)
        return nullptr;
    const std::size_t position = PositionOf(number, keyword->ParamCount());
    if (position == NotFound)
        return nullptr;
    const char* param = keyword->Params();
    if (keyword->IsLong())
        return HandleOf(param + keyword->more->starts[position]);
    for (std::size_t i = 0; i < position; ++i)
        param = NextParam(param);
    return HandleOf(param);
}

tqlHandle tqlNextParam(tqlHandle param)
{
    const char* const p = AsParam(param);
    return p ? HandleOf(NextParam(p)) : nullptr;
}

int tqlGetNoSections(tqlHandle parent)
{
    const Section* const section = AsParent(parent);
    return section ? int(section->sections.size()) : 0;
}

int tqlGetNoKeywords(tqlHandle section)
{
    const Section* const node = AsParent(section);
    return node ? int(node->keywords.size()) : 0;
}

int tqlGetNoKeywords(tqlHandle handle, std::string_view name)
{
    Section* const section = AsParent(handle);
    if (!section)
        return 0;
    if (HasOneName(*section))
        return section->keywords.front().Name() == name ? tqlGetNoKeywords(handle) : 0;
    return int(KeywordsNamed(*section, name).size());
}

int tqlGetNoParams(tqlHandle keyword)
{
    const Keyword* const node = AsKeyword(keyword);
    return node ? int(node->ParamCount()) : 0;
}

tqlHandle tqlSectionByNum(tqlHandle parent, int number)
{
    const Section* const section = AsParent(parent);
    const std::size_t position = section ? PositionOf(number, section->sections.size()) : NotFound;
    return position == NotFound ? nullptr : HandleOf(section->sections[position]);
}

tqlHandle tqlKeywordByNum(tqlHandle handle, int number)
{
    const Section* const section = AsParent(handle);
    const std::size_t position = section ? PositionOf(number, section->keywords.size()) : NotFound;
    return position == NotFound ? nullptr : HandleOf(&section->keywords[position]);
}

std::string_view tqlName(tqlHandle node)
{
    if (const Keyword* const keyword = AsKeyword(node))
        return keyword->Name();
    const Section* const section = AsParent(node);
    return section ? section->name : std::string_view();
}

TqlPosition tqlGetPosition(tqlHandle structure, tqlHandle node)
{
    Structure* const whole = AsStructure(structure);
    const char* const at = TextOf(node);
    if (!whole || !at)
        return {};
    const auto& starts = LineStarts(*whole);
    const auto offset = std::size_t(at - whole->text.begin());
    const auto next = std::upper_bound(starts.begin(), starts.end(), offset);
    return {std::size_t(next - starts.begin()),
            CountCharacters({whole->text.begin() + next[-1], offset - next[-1]}) + 1};
}

namespace {

std::string_view RawFrom(const char* begin)
{
    const char* last = begin;
    while (const char* const next = NextParam(last))
        last = next;
    return {begin, std::size_t(SkipParam(last) - begin)};
}

} // namespace

std::string_view tqlGetRawParams(tqlHandle handle)
{
    const Keyword* const keyword = AsKeyword(handle);
    return keyword && keyword->ParamCount() > 0 ? RawFrom(keyword->Params()) : std::string_view();
}

std::string_view tqlGetRawParamsFrom(tqlHandle handle)
{
    const char* const param = AsParam(handle);
    return param ? RawFrom(param) : std::string_view();
}

std::string_view tqlGetRawParam(tqlHandle handle)
{
    const char* const param = AsParam(handle);
    return param ? std::string_view(param, std::size_t(SkipParam(param) - param)) : std::string_view();
}
