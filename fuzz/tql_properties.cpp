#include "tql_properties.h"

#include "tql/tql.h"

#include <bit>
#include <functional>

namespace {

using Word = std::uint64_t;
constexpr Word EndOfSection = 3;

Word Tagged(char tag, std::string_view text)
{
    return std::hash<std::string_view>()(text) * 31 + Word(tag);
}

// What two equal values share. A float that happens to be an int32 may be written as an integer, so numbers are
// compared as floats.
Word ValueOf(tqlHandle param)
{
    double number = 0;
    bool flag = false;
    std::string text;
    if (tqlGetDouble(param, &number))
        return std::bit_cast<Word>(number);
    if (tqlGetBool(param, &flag))
        return flag ? 1 : 2;
    if (tqlGetString(param, &text))
        return Tagged(tqlGetType(param) == TqlType::String ? 's' : 'n', text);
    return 0;
}

void Rebuild(tqlHandle param, tqlHandle out)
{
    std::int32_t integer = 0;
    double number = 0;
    bool flag = false;
    std::string text;
    if (tqlGetInt(param, &integer))
        tqlAddInt(out, integer);
    else if (tqlGetDouble(param, &number))
        tqlAddDouble(out, number);
    else if (tqlGetBool(param, &flag))
        tqlAddBool(out, flag);
    else if (tqlGetString(param, &text))
        tqlGetType(param) == TqlType::String ? tqlAddString(out, text) : tqlAddFilename(out, text);
}

// Writes the children of `node` into `out`; with `raw`, parameters as they stand.
void Rebuild(tqlHandle node, tqlHandle out, bool raw, int depth)
{
    for (int k = 1; k <= tqlGetNoKeywords(node); ++k) {
        const tqlHandle keyword = tqlKeywordByNum(node, k);
        if (raw) {
            tqlAddRawKeyword(out, tqlName(keyword), tqlGetRawParams(keyword));
            continue;
        }
        tqlAddKeyword(out, tqlName(keyword));
        for (int p = 1; p <= tqlGetNoParams(keyword); ++p)
            Rebuild(tqlParamByNum(keyword, p), out);
    }
    for (int s = 1; s <= tqlGetNoSections(node); ++s) {
        const tqlHandle section = tqlSectionByNum(node, s);
        depth == 0 ? tqlAddTarget(out, tqlName(section)) : tqlAddSection(out, tqlName(section));
        Rebuild(section, out, raw, depth + 1);
        tqlEndSection(out);
    }
}

std::string Written(tqlHandle structure, bool raw)
{
    tqlHandle out = tqlCreate();
    Rebuild(structure, out, raw, 0);
    std::string text(tqlGetText(out));
    tqlClose(&out);
    return text;
}

/// Whether each keyword's parameters are the same by number and from one to the next.
bool IsWalkedAlike(tqlHandle node)
{
    for (int k = 1; k <= tqlGetNoKeywords(node); ++k) {
        const tqlHandle keyword = tqlKeywordByNum(node, k);
        tqlHandle next = tqlParamByNum(keyword, 1);
        for (int p = 1; p <= tqlGetNoParams(keyword); ++p, next = tqlNextParam(next))
            if (!next || tqlParamByNum(keyword, p) != next)
                return false;
        if (next)
            return false;
    }
    for (int s = 1; s <= tqlGetNoSections(node); ++s)
        if (!IsWalkedAlike(tqlSectionByNum(node, s)))
            return false;
    return true;
}

bool IsEmpty(tqlHandle keyword)
{
    const tqlHandle first = tqlParamByNum(keyword, 1);
    std::string text;
    return !first || (!tqlNextParam(first) && tqlGetString(first, &text) && text.empty());
}

void Collect(tqlHandle node, bool emptyToo, std::vector<Word>& words)
{
    for (int k = 1; k <= tqlGetNoKeywords(node); ++k) {
        const tqlHandle keyword = tqlKeywordByNum(node, k);
        if (!emptyToo && IsEmpty(keyword))
            continue;
        words.push_back(Tagged('=', tqlName(keyword)));
        for (tqlHandle param = tqlParamByNum(keyword, 1); param; param = tqlNextParam(param))
            words.push_back(ValueOf(param));
    }
    for (int s = 1; s <= tqlGetNoSections(node); ++s) {
        const tqlHandle section = tqlSectionByNum(node, s);
        words.push_back(Tagged('[', tqlName(section)));
        Collect(section, emptyToo, words);
        words.push_back(EndOfSection);
    }
}

std::string CheckError(tqlHandle structure, const TqlSyntaxError& error)
{
    if (tqlGetNoSections(structure) != 0 || tqlGetNoKeywords(structure) != 0)
        return "half a document after an error";
    if (error.line == 0 || error.column == 0 || error.expected.phrase == TqlPhrase::None ||
        error.found.phrase == TqlPhrase::None)
        return "incomplete report: " + error.message;
    return "";
}

std::string CheckGood(tqlHandle structure)
{
    const std::vector<Word> original = WordsOf(structure);
    if (!IsWalkedAlike(structure))
        return "parameters by number and by step differ";
    const std::string text = Written(structure, false);
    for (const std::string& rebuilt : {text, Written(structure, true)}) {
        if (rebuilt.empty())
            return "what was read cannot be written";
        tqlHandle copy = tqlLoadText(rebuilt, "copy");
        TqlSyntaxError error;
        std::string fault;
        if (tqlGetSyntaxErr(copy, &error))
            fault = "what was written cannot be read: " + error.message;
        else if (WordsOf(copy) != original)
            fault = "written and read, it has other content";
        else if (Written(copy, false) != text)
            fault = "written twice, it has another text";
        tqlClose(&copy);
        if (!fault.empty())
            return fault;
    }
    return "";
}

} // namespace

std::vector<std::uint64_t> WordsOf(tqlHandle node, bool emptyToo)
{
    std::vector<Word> words;
    Collect(node, emptyToo, words);
    return words;
}

std::string CheckTql(const std::string& text)
{
    tqlHandle structure = tqlLoadText(text, "text");
    TqlSyntaxError error;
    const std::string fault = tqlGetSyntaxErr(structure, &error) ? CheckError(structure, error) : CheckGood(structure);
    tqlClose(&structure);
    return fault;
}
