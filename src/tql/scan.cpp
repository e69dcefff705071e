#include "tql/scan.h"

#include "tql/number.h"
#include "tql/utf8.h"

#include <charconv>
#include <cstring>
#include <iterator>

namespace tql {

namespace {

// Letter after the backslash and what it stands for.
struct Escape
{
    char letter, value;
};
constexpr Escape Escapes[] = {{'n', '\n'}, {'r', '\r'}, {'t', '\t'}};

// `p` behind "\u"; on success the end, and the character. Null when it is no \u{...} of a character.
const char* ScanCodePoint(const char* p, std::uint32_t& value)
{
    const char* const close =
        FindByte(p, [](std::uint64_t block) { return EqualMask(block, '}') | EqualMask(block, '\n'); });
    if (*p != '{' || *close != '}')
        return nullptr;
    value = 0;
    const auto [end, error] = std::from_chars(p + 1, close, value, 16);
    return end == close && error == std::errc() && IsScalarValue(value) ? close + 1 : nullptr;
}

struct Quoting
{
    char close;
    CharClass stop;
    TqlPhrase unclosed, badEscape;
};
constexpr Quoting StringQuoting{'"', StringStop, TqlPhrase::StringEnd, TqlPhrase::StringEscape};
constexpr Quoting FileQuoting{'>', FileStop, TqlPhrase::FileNameEnd, TqlPhrase::FileNameEscape};

const Quoting& QuotingOf(char open)
{
    return open == '"' ? StringQuoting : FileQuoting;
}

const Escape* FindEscape(const Quoting& quoting, char letter)
{
    if (&quoting == &StringQuoting)
        for (const Escape& escape : Escapes)
            if (escape.letter == letter)
                return &escape;
    return nullptr;
}

ParamScan ScanQuoted(const char* p)
{
    const Quoting& quoting = QuotingOf(*p);
    for (++p;;) {
        p = FindByte(p, [&](std::uint64_t block) {
            return EqualMask(block, quoting.close) | EqualMask(block, '\\') | BelowMask(block, 0x20) |
                   EqualMask(block, 0x7F);
        });
        if (*p == quoting.close)
            return {p + 1};
        if (*p == '\t') {
            ++p;
            continue;
        }
        if (*p != '\\')
            return {p, *p == '\n' || *p == '\r' ? quoting.unclosed : TqlPhrase::NoControl};
        const char letter = p[1];
        if (letter == quoting.close || letter == '\\' || FindEscape(quoting, letter)) {
            p += 2;
            continue;
        }
        std::uint32_t value;
        if (letter != 'u')
            return {p, quoting.badEscape};
        const char* const end = ScanCodePoint(p + 2, value);
        if (!end)
            return {p, TqlPhrase::CodePoint};
        p = end;
    }
}

ParamScan ScanWord(const char* p)
{
    for (const std::string_view word : {std::string_view("true"), std::string_view("false")})
        if (std::strncmp(p, word.data(), word.size()) == 0 && Is(p[word.size()], WordEnd))
            return {p + word.size()};
    return {p, TqlPhrase::TrueOrFalse};
}

// Length of the run that a string or file name copies unchanged.
std::size_t PlainRun(std::string_view text, CharClass stop)
{
    std::size_t i = 0;
    while (i < text.size() && !Is(text[i], stop) && static_cast<unsigned char>(text[i]) < 0x80)
        ++i;
    return i;
}

void AppendCodeEscape(std::string& out, char control)
{
    char digits[2];
    const char* const end = std::to_chars(digits, std::end(digits), int(control), 16).ptr;
    out.append("\\u{").append(digits, std::size_t(end - digits)) += '}';
}

// One character that is not plain; returns its length in bytes.
std::size_t AppendSpecial(std::string& out, std::string_view text, const Quoting& quoting)
{
    const char c = text[0];
    if (c == quoting.close || c == '\\') {
        out += '\\';
        out += c;
        return 1;
    }
    if (static_cast<unsigned char>(c) >= 0x80) {
        const std::size_t length = SequenceLength(text);
        if (length == 0) {
            out += "\xEF\xBF\xBD"; // U+FFFD stands for what is no character; a raw byte would make the file unreadable
            return 1;
        }
        out += text.substr(0, length);
        return length;
    }
    if (&quoting == &StringQuoting)
        for (const Escape& escape : Escapes)
            if (escape.value == c) {
                out += '\\';
                out += escape.letter;
                return 1;
            }
    AppendCodeEscape(out, c);
    return 1;
}

void AppendQuoted(std::string& out, std::string_view value, const Quoting& quoting)
{
    for (;;) {
        const std::size_t plain = PlainRun(value, quoting.stop);
        out += value.substr(0, plain);
        value.remove_prefix(plain);
        if (value.empty())
            break;
        value.remove_prefix(AppendSpecial(out, value, quoting));
    }
    out += quoting.close;
}

} // namespace

ParamScan ScanParam(const char* p)
{
    switch (*p) {
    case '"':
    case '<':
        return ScanQuoted(p);
    case 't':
    case 'f':
        return ScanWord(p);
    default:
        break;
    }
    if (!StartsNumber(*p))
        return {p, TqlPhrase::Parameter};
    const NumberScan number = ScanNumber(p);
    return number.type == TqlType::None ? ParamScan{p, number.expected} : ParamScan{number.end};
}

namespace {

// Closing quote or next backslash of a string or file name that was checked.
const char* FindQuoteEnd(const char* p, char close)
{
    return FindByte(p, [=](std::uint64_t block) { return EqualMask(block, close) | EqualMask(block, '\\'); });
}

} // namespace

const char* SkipParam(const char* p)
{
    if (*p == '"' || *p == '<') {
        const char close = QuotingOf(*p).close;
        for (p = FindQuoteEnd(p + 1, close); *p != close; p = FindQuoteEnd(p, close))
            p += 2; // the letter behind a backslash is not looked at
        return p + 1;
    }
    while (!Is(*p, WordEnd))
        ++p;
    return p;
}

TqlType ParamType(const char* p)
{
    switch (*p) {
    case '"':
        return TqlType::String;
    case '<':
        return TqlType::FileName;
    case 't':
    case 'f':
        return TqlType::Bool;
    default:
        break;
    }
    return Is(*SkipDigits(p + (*p == '-')), WordEnd) ? TqlType::Int : TqlType::Double;
}

const char* UnescapeParam(const char* p, std::string& out)
{
    const Quoting& quoting = QuotingOf(*p);
    const char* run = p + 1;
    p = FindQuoteEnd(run, quoting.close);
    out.assign(run, std::size_t(p - run));
    while (*p != quoting.close) {
        ++p;
        if (*p == quoting.close || *p == '\\') {
            out += *p++;
        } else if (const Escape* escape = FindEscape(quoting, *p)) {
            out += escape->value;
            ++p;
        } else {
            std::uint32_t value = 0;
            p = ScanCodePoint(p + 1, value);
            AppendCodePoint(out, value);
        }
        run = p;
        p = FindQuoteEnd(run, quoting.close);
        out.append(run, std::size_t(p - run));
    }
    return p + 1;
}

void AppendString(std::string& out, std::string_view value)
{
    out += '"';
    AppendQuoted(out, value, StringQuoting);
}

void AppendFilename(std::string& out, std::string_view value)
{
    out += '<';
    AppendQuoted(out, value, FileQuoting);
}

} // namespace tql
