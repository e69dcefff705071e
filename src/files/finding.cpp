#include "files/finding.h"

#include <algorithm>

namespace {

std::string Quoted(std::string_view text)
{
    return '"' + std::string(text) + '"';
}

const char* KindText(FieldKind kind)
{
    switch (kind) {
    case FieldKind::Number:
        return "a number";
    case FieldKind::Boolean:
        return "true or false";
    case FieldKind::Text:
        return "a text in quotes";
    case FieldKind::FileName:
        return "a file name in < >";
    case FieldKind::Integer:
    case FieldKind::Choice:
    case FieldKind::DateTime:
    case FieldKind::Group:
        break;
    }
    return "an integer";
}

const char* TypeText(TqlType type)
{
    switch (type) {
    case TqlType::Int:
        return "an integer";
    case TqlType::Double:
        return "a number";
    case TqlType::Bool:
        return "true or false";
    case TqlType::String:
        return "a text";
    case TqlType::FileName:
        return "a file name";
    case TqlType::None:
        break;
    }
    return "nothing";
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
        return Parameter(finding) + " should be " + KindText(finding.expected) + ", found " + TypeText(finding.type) +
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
    case Finding::NoDate:
        return "the six integers of " + finding.field + " are no date and time";
    case Finding::UnknownParams:
        return "unknown parameters from number " + std::to_string(finding.parameter) + " on";
    case Finding::IncompleteLine:
        return finding.parameter == 1 ? "incomplete line, the branch name is empty"
                                      : "incomplete line, the chainage is not given";
    case Finding::NoTarget:
    case Finding::NotRead:
    case Finding::Unknown:
    case Finding::Repeated:
        break;
    }
    return {};
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

std::string FindingText(const Finding& finding)
{
    switch (finding.kind) {
    case Finding::NoTarget:
        return "there is no target [" + finding.section + "]";
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
    finding.keyword = tqlName(keyword);
    if (finding.section.empty())
        finding.section = m_section;
    finding.found = Shortened(std::move(finding.found));
    finding.used = Shortened(std::move(finding.used));
    m_findings.push_back(std::move(finding));
}

std::vector<Finding> LoadReport::Take()
{
    std::ranges::stable_sort(m_findings, {}, [](const Finding& f) { return std::pair(f.line, f.column); });
    return std::move(m_findings);
}
