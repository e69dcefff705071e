#include "tql/parser.h"

#include "tql/bytes.h"
#include "tql/char_class.h"
#include "tql/error_text.h"
#include "tql/number.h"
#include "tql/scan.h"
#include "tql/utf8.h"

#include <algorithm>
#include <cstdio>
#include <cstring>
#include <limits>

namespace tql {

namespace {

TqlTerm Closing(std::string_view name)
{
    return {TqlPhrase::Text, "[/" + std::string(name) + "]"};
}

std::string HexOf(unsigned value, int digits)
{
    char text[16];
    std::snprintf(text, sizeof text, "%0*X", digits, value);
    return text;
}

class Parser
{
public:
    Parser(Structure& structure, const std::string& file) : m_structure(structure), m_file(file) {}

    bool Run();

private:
    bool CheckLine();
    bool ParseLine();
    bool ParseBracket(const char* p);
    bool Open(std::string_view name, const char* at);
    bool Close(std::string_view name, const char* at);
    const char* SkipKeywordName(const char* p);
    bool ParseKeyword(const char* p);
    /// Counts the parameters from `p` to the end of the line.
    bool ParseParams(const char* p, std::size_t& count);
    void ReserveKeywords(Section& section);
    void AddKeyword(std::string_view name, const char* params, std::size_t count);
    /// Nothing but blanks and a comment is left.
    bool AtEnd(const char* p) const { return p == m_lineEnd || (*p == '/' && p[1] == '/'); }
    bool ExpectEnd(const char* p, TqlPhrase expected = TqlPhrase::EndOfLine);

    bool Fail(TqlError code, const char* at, TqlTerm expected, TqlTerm found);
    bool Fail(const char* at, TqlPhrase expected) { return Fail(TqlError::Syntax, at, {expected}, Found(at)); }
    TqlTerm Found(const char* at) const;
    bool FailEncoding(const char* at);

    Structure& m_structure;
    const std::string& m_file;
    std::vector<Section*> m_open; // from the target inwards
    const char* m_line = nullptr;
    const char* m_lineEnd = nullptr; // without the line end
    std::size_t m_lineNumber = 0;
    bool m_anything = false;          // a comment counts
    std::string_view m_lastName = ""; // of a keyword
};

bool Parser::Run()
{
    const char* const end = m_structure.text.end();
    for (const char* p = m_structure.text.begin(); p < end;) {
        const char* const feed = static_cast<const char*>(std::memchr(p, '\n', std::size_t(end - p) + 1));
        m_line = p;
        m_lineEnd = feed > p && feed[-1] == '\r' ? feed - 1 : feed;
        ++m_lineNumber;
        if (!CheckLine() || !ParseLine())
            return false;
        p = feed + 1;
    }
    if (m_lineNumber == 0)
        m_lineNumber = 1, m_line = m_lineEnd = end;
    if (!m_open.empty())
        return Fail(TqlError::Syntax, m_lineEnd, Closing(m_open.back()->name), {TqlPhrase::EndOfFile});
    if (!m_anything)
        return Fail(TqlError::Syntax, m_lineEnd, {TqlPhrase::ParameterFile}, {TqlPhrase::EmptyFile});
    // A comment alone makes a file, but not a piece of the one that every written file begins with: the rest was lost.
    const std::string_view all(m_structure.text.begin(), m_structure.text.end());
    if (FirstLine.starts_with(all))
        return Fail(TqlError::Syntax, m_lineEnd, {TqlPhrase::Target}, {TqlPhrase::EndOfFile});
    return true;
}

bool Parser::CheckLine()
{
    if (std::size_t(m_lineEnd - m_line) > MaxLineLength)
        return Fail(TqlError::TooLarge, m_line, {TqlPhrase::LineOfLimit}, {TqlPhrase::LongerLine});
    const char* const bad = FindBadByte(m_line, m_lineEnd);
    return bad == m_lineEnd || FailEncoding(bad);
}

bool Parser::FailEncoding(const char* at)
{
    const auto byte = static_cast<unsigned char>(*at);
    TqlTerm found = byte == 0 ? TqlTerm{TqlPhrase::NulCharacter} : TqlTerm{TqlPhrase::Byte, HexOf(byte, 2)};
    const std::string_view start(m_structure.text.begin(), m_structure.text.Size());
    if (start.starts_with("\xFF\xFE") || start.starts_with("\xFE\xFF"))
        found = {TqlPhrase::Text, "UTF-16"};
    return Fail(TqlError::Encoding, at, {TqlPhrase::Utf8}, std::move(found));
}

bool Parser::ParseLine()
{
    const char* const p = SkipBlanks(m_line);
    if (p == m_lineEnd)
        return true;
    m_anything = true;
    if (*p == '[')
        return ParseBracket(p);
    if (Is(*p, NameChar))
        return ParseKeyword(p);
    return ExpectEnd(p, TqlPhrase::Line);
}

bool Parser::ExpectEnd(const char* p, TqlPhrase expected)
{
    p = SkipBlanks(p);
    if (!AtEnd(p))
        return Fail(p, expected);
    const auto* const cr = static_cast<const char*>(std::memchr(p, '\r', std::size_t(m_lineEnd - p)));
    return !cr || Fail(cr, TqlPhrase::LineFeed);
}

bool Parser::ParseBracket(const char* p)
{
    const char* const bracket = p++;
    const bool closes = *p == '/';
    p += closes;
    const char* const begin = p;
    while (Is(*p, NameChar))
        ++p;
    if (p == begin)
        return Fail(p, TqlPhrase::Name);
    if (*p != ']')
        return Fail(p, TqlPhrase::BracketBehindName);
    const std::string_view name(begin, std::size_t(p - begin));
    return ExpectEnd(p + 1) && (closes ? Close(name, bracket) : Open(name, bracket));
}

bool Parser::Open(std::string_view name, const char* at)
{
    if (m_open.size() == MaxDepth)
        return Fail(TqlError::TooLarge, at, {TqlPhrase::DepthOfLimit}, {TqlPhrase::OneMore});
    Section* const section = &m_structure.nodes.emplace_back(Kind::Section, name);
    Section* const parent = m_open.empty() ? &m_structure : m_open.back();
    parent->sections.push_back(section);
    m_open.push_back(section);
    return true;
}

bool Parser::Close(std::string_view name, const char* at)
{
    if (m_open.empty())
        return Fail(TqlError::Syntax, at, {TqlPhrase::Target}, Closing(name));
    if (m_open.back()->name != name)
        return Fail(TqlError::Syntax, at, Closing(m_open.back()->name), Closing(name));
    m_open.pop_back();
    return true;
}

// Most keywords have the name of the one before.
const char* Parser::SkipKeywordName(const char* p)
{
    const std::size_t length = m_lastName.size();
    if (length <= std::size_t(m_lineEnd - p) && std::memcmp(p, m_lastName.data(), length) == 0 &&
        !Is(p[length], NameChar))
        return p + length;
    const char* const begin = p;
    while (Is(*p, NameChar))
        ++p;
    m_lastName = {begin, std::size_t(p - begin)};
    return p;
}

bool Parser::ParseKeyword(const char* p)
{
    const char* const begin = p;
    p = SkipKeywordName(p);
    const std::string_view name(begin, std::size_t(p - begin));
    if (m_open.empty())
        return Fail(TqlError::Syntax, begin, {TqlPhrase::TargetFirst}, Found(begin));
    p = SkipBlanks(p);
    if (*p != '=')
        return Fail(p, TqlPhrase::EqualSign);
    p = SkipBlanks(p + 1);
    std::size_t count = 0;
    if (!ParseParams(p, count))
        return false;
    AddKeyword(name, p, count);
    return true;
}

bool Parser::ParseParams(const char* p, std::size_t& count)
{
    if (AtEnd(p))
        return ExpectEnd(p);
    for (;;) {
        const char* end = SkipPlainNumber(p);
        if (!end) {
            const ParamScan param = ScanParam(p);
            if (param.expected != TqlPhrase::None)
                return Fail(param.end, param.expected);
            end = param.end;
        }
        ++count;
        p = SkipBlanks(end);
        if (*p != ',')
            return p == m_lineEnd || ExpectEnd(p, TqlPhrase::CommaOrEnd);
        p = SkipBlanks(p + 1);
    }
}

// A long list grows in few steps, towards what the rest of the text holds if its lines go on like this.
void Parser::ReserveKeywords(Section& section)
{
    constexpr std::size_t longList = 1024;
    const std::size_t count = section.keywords.size();
    if (count < longList || count < section.keywords.capacity())
        return;
    const auto soFar = std::size_t(m_line - section.name.data());
    const auto left = std::size_t(m_structure.text.end() - m_line);
    const std::size_t likely = count + left / (soFar / count + 1) + 1;
    section.keywords.reserve(std::clamp(likely, 2 * count, 8 * count));
}

void Parser::AddKeyword(std::string_view name, const char* params, std::size_t count)
{
    Section& section = *m_open.back();
    if (!section.keywords.empty() && section.sameKeywordNames)
        section.sameKeywordNames = section.keywords.front().Name() == name;
    ReserveKeywords(section);
    Keyword& keyword = section.keywords.emplace_back();
    if (count <= Keyword::MaxParams && name.size() <= std::numeric_limits<std::uint16_t>::max()) {
        keyword.paramCount = std::uint8_t(count);
        keyword.nameLength = std::uint16_t(name.size());
        keyword.paramsOffset = std::uint32_t(params - name.data());
        keyword.name = name.data();
        return;
    }
    LongKeyword& more = m_structure.longKeywords.emplace_back(LongKeyword{name, params, {}});
    more.starts.reserve(count);
    for (const char* p = params; more.starts.size() < count; p = NextParam(p))
        more.starts.push_back(std::uint32_t(p - params));
    keyword.kind = Kind::LongKeyword;
    keyword.more = &more;
}

// What stands at `at`, as far as a blank or a comma, for a message.
TqlTerm Parser::Found(const char* at) const
{
    if (at >= m_lineEnd)
        return {TqlPhrase::EndOfLine};
    if (*at == ' ')
        return {TqlPhrase::Blank};
    if (*at == '\t')
        return {TqlPhrase::Tab};
    if (*at == '\r')
        return {TqlPhrase::CarriageReturn};
    if (const auto code = static_cast<unsigned char>(*at); code < 0x20 || code == 0x7F)
        return {TqlPhrase::ControlCharacter, HexOf(code, 4)};
    constexpr std::size_t longest = 40;
    const char* p = at;
    for (std::size_t characters = 0; p < m_lineEnd && characters < longest; ++characters) {
        if (p != at && (Is(*p, Blank) || *p == ',' || *p == '='))
            break;
        p += SequenceLength({p, std::size_t(m_lineEnd - p)});
    }
    return {TqlPhrase::Text, std::string(at, p)};
}

bool Parser::Fail(TqlError code, const char* at, TqlTerm expected, TqlTerm found)
{
    TqlSyntaxError& error = m_structure.error;
    error.code = code;
    error.file = m_file;
    error.line = m_lineNumber;
    error.column = CountCharacters({m_line, std::size_t(at - m_line)}) + 1;
    error.expected = std::move(expected);
    error.found = std::move(found);
    MakeMessage(error);
    return false;
}

} // namespace

bool Parse(Structure& structure, const std::string& file)
{
    return Parser(structure, file).Run();
}

bool IsParamList(std::string_view params)
{
    std::string line(params);
    line += '\n';
    line.append(ReadAhead, '\0');
    const char* p = line.c_str();
    const char* const end = p + params.size();
    if (FindBadByte(p, end) != end)
        return false;
    while (p < end) {
        const ParamScan param = ScanParam(p);
        if (param.expected != TqlPhrase::None)
            return false;
        if (param.end == end)
            return true;
        p = SkipBlanks(param.end);
        if (*p != ',')
            return false;
        p = SkipBlanks(p + 1);
    }
    return params.empty();
}

} // namespace tql
