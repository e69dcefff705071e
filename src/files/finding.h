// What reading a file meets that is not in order: values that are not taken as they stand, and whatever else departs
// from the tables. The readers of fields, lists and sections report it while they read.
#pragma once

#include "files/field.h"
#include "tql/tql.h"

#include <cstddef>
#include <functional>
#include <string>
#include <string_view>
#include <unordered_map>
#include <unordered_set>
#include <vector>

struct Finding
{
    enum Kind
    {
        // Reading does not keep what stands there, so rewriting the file would lose it.
        WrongType,
        CountDoesNotFit, // a repeated group, and what follows it in its keyword
        ShortDate,
        SurplusFlags,  // more flags than mark titles
        SurplusParams, // of a keyword that keeps no others than its own
        Rule,          // what the editor of the file asks for beyond types
        NoTarget,
        // Taken, though it is written otherwise than it should be.
        OtherType,
        // Nothing that stands there is lost, but something is used or shown that does not stand there, or the reverse.
        Missing, // a parameter
        NoKeyword,
        NoSection,
        Repeated,
        // Nothing that stands there is lost.
        NoDate,
        NotRead, // because another keyword is missing
        Unknown,
        UnknownParams
    };

    Kind kind = WrongType;
    std::size_t line = 0, column = 0; // from 1
    std::string section{};            // in which it stands
    std::string keyword{};            // empty for a section
    int parameter = 0;                // from 1; 0 for a whole keyword or section
    std::string field{};              // name of the parameter; of the missing keyword for NotRead
    FieldKind expected = FieldKind::Integer;
    TqlType type = TqlType::None;        // of what stands there
    int behind = 0;                      // parameters behind a count; mark titles
    bool more = false;                   // others behind it are missing, too
    std::string found{};                 // as it stands in the file
    std::string used{};                  // what is used instead, in the same notation
    bool leftOut = false;                // nothing is used: what it stands in, a line of a table, is not taken
    std::function<std::string()> rule{}; // of Rule: what was expected, in the user's language

    /// Whether rewriting the file would lose what stands there.
    bool LosesContent() const { return kind <= NoTarget || leftOut; }
    /// Whether the user must know before relying on what is shown: a value was lost or taken for another, defaults
    /// stand where parameters are missing, or something stands in the file that is never shown because it was there
    /// before.
    bool NeedsAttention() const { return kind <= Repeated; }
};

/// What is expected of a value: English, and the source of its translations.
const char* KindText(FieldKind kind);
/// One sentence in English, without the place.
std::string FindingText(const Finding& finding);

class LoadReport
{
public:
    enum class Wanted
    {
        Attention, // what the user must know
        Everything
    };
    explicit LoadReport(tqlHandle structure, Wanted wanted = Wanted::Attention)
        : m_structure(structure), m_wanted(wanted)
    {
    }

    bool WantsEverything() const { return m_wanted == Wanted::Everything; }
    /// Where the keywords that are read from now on stand.
    void InSection(std::string_view section) { m_section = section; }
    /// Completes the place, which is that of a section, keyword or parameter, unless nobody wants the finding.
    void Add(tqlHandle place, tqlHandle keyword, Finding finding);
    /// How many values were not taken for which nothing sensible stands in: it is no value that may be unknown.
    std::size_t Lost() const { return m_lost; }
    void CountLost() { ++m_lost; }
    /// The keyword is not taken at all, whatever else was found in it.
    void LeaveOut(tqlHandle keyword);
    bool IsLeftOut(tqlHandle keyword) const { return m_leftOut.contains(keyword); }
    bool HasLeftOut() const { return !m_leftOut.empty(); }
    /// What is used instead of a value that was reported before, of the keyword, or, where it is missing, of the
    /// section that should hold it; false when none was.
    bool Use(tqlHandle node, std::string_view keyword, const std::string& used);
    /// What was found, in file order.
    std::vector<Finding> Take();

private:
    tqlHandle m_structure;
    Wanted m_wanted;
    std::string m_section;
    std::vector<Finding> m_findings;
    std::size_t m_lost = 0;
    std::unordered_set<tqlHandle> m_leftOut;
    std::unordered_multimap<tqlHandle, std::size_t> m_of; // which of the findings are about a node
};
