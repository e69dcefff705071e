#include "tql_properties.h"

#include "tql/tql.h"

#include <bit>
#include <vector>

namespace {

std::string Tagged(char tag, std::string_view value)
{
    std::string text(1, tag);
    text += value;
    return text;
}

// The value of a parameter in words that two equal values share.
std::string ValueOf(tqlHandle param)
{
    std::int32_t integer = 0;
    double number = 0;
    bool flag = false;
    std::string text;
    switch (tqlGetType(param)) {
    case TqlType::Int:
        return tqlGetInt(param, &integer) ? Tagged('i', std::to_string(integer)) : "?";
    case TqlType::Double:
        return tqlGetDouble(param, &number) ? Tagged('d', std::to_string(std::bit_cast<std::uint64_t>(number))) : "?";
    case TqlType::Bool:
        return tqlGetBool(param, &flag) ? (flag ? "b1" : "b0") : "?";
    case TqlType::String:
        return tqlGetString(param, &text) ? Tagged('s', text) : "?";
    case TqlType::FileName:
        return tqlGetString(param, &text) ? Tagged('n', text) : "?";
    case TqlType::None:
        break;
    }
    return "?";
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

// Names and values of everything, in order. A float that happens to be an int32 may be written as an integer, so
// numbers are compared as floats.
void List(tqlHandle node, std::vector<std::string>& out)
{
    for (int k = 1; k <= tqlGetNoKeywords(node); ++k) {
        const tqlHandle keyword = tqlKeywordByNum(node, k);
        out.push_back(Tagged('=', tqlName(keyword)));
        tqlHandle next = tqlParamByNum(keyword, 1);
        for (int p = 1; p <= tqlGetNoParams(keyword); ++p, next = tqlNextParam(next)) {
            double number = 0;
            const tqlHandle param = tqlParamByNum(keyword, p);
            const std::string value = ValueOf(param);
            out.push_back(param != next                  ? "by number and by step differ"
                          : tqlGetDouble(param, &number) ? std::to_string(std::bit_cast<std::uint64_t>(number))
                                                         : value);
        }
        if (next)
            out.push_back("a parameter too many");
    }
    for (int s = 1; s <= tqlGetNoSections(node); ++s) {
        out.push_back(Tagged('[', tqlName(tqlSectionByNum(node, s))));
        List(tqlSectionByNum(node, s), out);
        out.push_back("]");
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
    std::vector<std::string> original, again;
    List(structure, original);
    const std::string text = Written(structure, false);
    for (const std::string& rebuilt : {text, Written(structure, true)}) {
        if (rebuilt.empty())
            return "what was read cannot be written";
        tqlHandle copy = tqlLoadText(rebuilt, "copy");
        TqlSyntaxError error;
        std::string fault;
        again.clear();
        List(copy, again);
        if (tqlGetSyntaxErr(copy, &error))
            fault = "what was written cannot be read: " + error.message;
        else if (again != original)
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

std::string CheckTextProperties(const std::string& text)
{
    tqlHandle structure = tqlLoadText(text, "text");
    TqlSyntaxError error;
    const std::string fault = tqlGetSyntaxErr(structure, &error) ? CheckError(structure, error) : CheckGood(structure);
    tqlClose(&structure);
    return fault;
}
