#include "file_properties.h"

#include "files/structure.h"
#include "properties.h"
#include "tql_properties.h"

#include <algorithm>

namespace {

struct Read
{
    std::string text; // that is saved
    std::vector<std::uint64_t> words;
    std::vector<Finding> findings;
    std::string fault;
    bool isOther = false; // no file of the kind
};

Read ReadText(const std::string& text, const RoundTrip& trip)
{
    Read read;
    const Result<TqlStructure> structure = ParseText(text, "text");
    if (!structure) {
        read.isOther = true;
        return read;
    }
    LoadReport report(structure.value().Get(), LoadReport::Wanted::Everything);
    Result<std::string> saved = trip(structure.value().Get(), report);
    read.findings = report.Take();
    for (const Finding& finding : read.findings) {
        read.isOther = read.isOther || finding.kind == Finding::NoTarget;
        if (finding.line == 0 || finding.column == 0 || FindingText(finding).empty())
            read.fault = "a finding without a place or a word";
    }
    if (saved)
        read.text = std::move(saved.value());
    else
        read.fault = "what was read cannot be written: " + saved.error().message;
    read.words = WordsOf(structure.value().Get(), false); // what is empty says nothing, and need not be written
    std::ranges::sort(read.words);
    return read;
}

bool LosesContent(const Read& read)
{
    return std::ranges::any_of(read.findings, &Finding::LosesContent);
}

bool Has(const Read& read, Finding::Kind kind)
{
    return std::ranges::any_of(read.findings, [kind](const Finding& each) { return each.kind == kind; });
}

} // namespace

std::string CheckFile(const std::string& text, const RoundTrip& trip)
{
    const Read first = ReadText(text, trip);
    if (first.isOther || !first.fault.empty())
        return first.fault;
    const Read second = ReadText(first.text, trip);
    if (second.isOther || !second.fault.empty())
        return "what was written cannot be read: " + second.fault + '\n' + first.text;
    const bool isTold = LosesContent(first) || Has(first, Finding::OtherType);
    if (!isTold && !std::ranges::includes(second.words, first.words))
        return "something is lost that was not reported:\n" + text + "\nbecame\n" + first.text;
    // What was not read for want of another keyword is read when that has been written: a text like any other.
    if (Has(first, Finding::NotRead) && first.text != text)
        return CheckFile(first.text, trip);
    if (second.text != first.text)
        return "read and written again, it is another text:\n" + first.text + "\nbecame\n" + second.text;
    if (LosesContent(second))
        return "what was written is not taken as it stands:\n" + first.text;
    return "";
}
