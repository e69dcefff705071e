#include "files/finding.h"

#include <algorithm>

namespace {

std::string Quoted(std::string_view text)
{
    return '"' + std::string(text) + '"';
}

/// Of one parameter.
FieldKind OfOne(FieldKind kind)
{
    return kind == FieldKind::DateTime ? FieldKind::Integer : kind;
}

const char* TypeText(TqlType type)
{
    constexpr const char* texts[] = {"nothing", "an integer", "a number", "true or false", "a text", "a file name"};
    return texts[std::size_t(type)];
}

/// Lists and item sections hold keywords of one name only: there the section's name says more.
const std::string& Owner(const Finding& finding)
{
    return finding.keyword.empty() || finding.keyword == "DATA" || finding.keyword == "data" ? finding.section
                                                                                             : finding.keyword;
}

std::string Parameter(const Finding& finding)
{
    return "parameter " + std::to_string(finding.parameter) + " (" + finding.field + ")";
}

std::string UnknownText(const Finding& finding)
{
    const std::string what =
        finding.keyword.empty() ? "section [" + finding.section + "]" : "keyword " + Quoted(finding.keyword);
    return finding.kind == Finding::Unknown ? "unknown " + what
                                            : what + " is there more than once; only the first counts";
}

/// What is said behind the name of the keyword or list.
std::string OwnText(const Finding& finding)
{
    switch (finding.kind) {
    case Finding::WrongType:
    case Finding::OtherType:
        return Parameter(finding) + " should be " + KindText(OfOne(finding.expected)) + ", found " +
               TypeText(finding.type) +
               (finding.kind == Finding::OtherType ? "; taken as " + finding.used : std::string());
    case Finding::CountDoesNotFit:
        return "the count " + finding.found.substr(0, finding.found.find_first_of(", ")) + " of " + finding.field +
               " does not fit the " + std::to_string(finding.behind) + " parameters behind it";
    case Finding::ShortDate:
        return finding.field + " needs six integers";
    case Finding::SurplusFlags:
        return "there are more flags than the " + std::to_string(finding.behind) + " titles";
    case Finding::Missing:
        return Parameter(finding) + (finding.more ? " and those behind it are missing" : " is missing");
    case Finding::NoKeyword:
        return "the keyword is missing";
    case Finding::NoDate:
        return "the six integers of " + finding.field + " are no date and time";
    case Finding::SurplusParams:
    case Finding::UnknownParams:
        return "unknown parameters from number " + std::to_string(finding.parameter) + " on";
    case Finding::Rule:
        return finding.rule();
    default:
        return {};
    }
}

/// Enough to recognise what stands there, cut between characters.
std::string Shortened(std::string text)
{
    constexpr std::size_t most = 400;
    if (text.size() <= most)
        return text;
    std::size_t end = most;
    while (end > 0 && (static_cast<unsigned char>(text[end]) & 0xC0) == 0x80)
        --end;
    return text.substr(0, end) + "...";
}

} // namespace

const char* KindText(FieldKind kind)
{
#define TQL_TEXT(context, english) english
    switch (kind) {
    case FieldKind::Number:
        return TQL_TEXT("CKsFindingsModel", "a number");
    case FieldKind::Boolean:
        return TQL_TEXT("CKsFindingsModel", "true or false");
    case FieldKind::Text:
        return TQL_TEXT("CKsFindingsModel", "a text in quotes");
    case FieldKind::FileName:
        return TQL_TEXT("CKsFindingsModel", "a file name in < >");
    case FieldKind::DateTime:
        return TQL_TEXT("CKsFindingsModel", "six integers");
    default:
        return TQL_TEXT("CKsFindingsModel", "an integer");
    }
#undef TQL_TEXT
}

std::string FindingText(const Finding& finding)
{
    switch (finding.kind) {
    case Finding::NoTarget:
        return "there is no target [" + finding.section + "]";
    case Finding::NoSection:
        return "there is no section [" + finding.section + "]";
    case Finding::NotRead:
        return finding.keyword + " is not read, because " + finding.field + " is missing";
    case Finding::Unknown:
    case Finding::Repeated:
        return UnknownText(finding);
    default:
        return Owner(finding) + ": " + OwnText(finding);
    }
}

void LoadReport::Add(tqlHandle place, tqlHandle keyword, Finding finding)
{
    if (!WantsEverything() && !finding.NeedsAttention())
        return;
    const TqlPosition position = tqlGetPosition(m_structure, place);
    finding.line = position.line ? position.line : 1;
    finding.column = position.column ? position.column : 1;
    if (keyword)
        finding.keyword = tqlName(keyword);
    if (finding.section.empty())
        finding.section = m_section;
    finding.found = Shortened(std::move(finding.found));
    finding.used = Shortened(std::move(finding.used));
    m_of.emplace(keyword ? keyword : place, m_findings.size());
    m_findings.push_back(std::move(finding));
}

void LoadReport::LeaveOut(tqlHandle keyword)
{
    m_leftOut.insert(keyword);
    const auto [first, last] = m_of.equal_range(keyword);
    for (auto each = first; each != last; ++each) {
        m_findings[each->second].leftOut = true;
        m_findings[each->second].used.clear();
    }
}

bool LoadReport::Use(tqlHandle node, std::string_view keyword, const std::string& used)
{
    bool was = false;
    const auto [first, last] = m_of.equal_range(node);
    for (auto each = first; each != last; ++each) {
        Finding& finding = m_findings[each->second];
        if (finding.keyword != keyword || finding.kind == Finding::Rule)
            continue;
        finding.used = Shortened(used);
        was = true;
    }
    return was;
}

std::vector<Finding> LoadReport::Take()
{
    std::ranges::stable_sort(m_findings, {}, [](const Finding& f) { return std::pair(f.line, f.column); });
    return std::move(m_findings);
}
