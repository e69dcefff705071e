#include "cli/terminal.h"

#include "tql/utf8.h"

#include <algorithm>
#include <cstdint>
#include <ostream>

#ifdef _WIN32
#include <io.h>
#else
#include <unistd.h>
#endif

namespace {

/// The code point of a well-formed sequence.
std::uint32_t CodePoint(std::string_view sequence)
{
    const auto byte = [&](std::size_t i) { return std::uint32_t(static_cast<unsigned char>(sequence[i])); };
    std::uint32_t code = sequence.size() == 1 ? byte(0) : byte(0) & (0x7Fu >> sequence.size());
    for (std::size_t i = 1; i < sequence.size(); ++i)
        code = code << 6 | (byte(i) & 0x3F);
    return code;
}

bool IsShown(std::uint32_t code)
{
    const auto in = [code](std::uint32_t first, std::uint32_t last) { return code >= first && code <= last; };
    const bool control = code < 0x20 || in(0x7F, 0x9F) || in(0x2028, 0x2029);
    const bool direction = code == 0x61C || in(0x200E, 0x200F) || in(0x202A, 0x202E) || in(0x2066, 0x2069);
    return !control && !direction;
}

void AppendEscaped(std::string& out, std::string_view bytes)
{
    constexpr char digits[] = "0123456789ABCDEF";
    for (const char c : bytes) {
        const auto byte = static_cast<unsigned char>(c);
        out += {'\\', 'x', digits[byte >> 4], digits[byte & 15]};
    }
}

} // namespace

std::string Printable(std::string_view text)
{
    std::string shown;
    if (std::ranges::all_of(text, [](char c) { return c >= ' ' && c <= '~'; })) // as almost all are
        return shown.assign(text);
    shown.reserve(text.size());
    while (!text.empty()) {
        const std::size_t length = tql::SequenceLength(text);
        const std::string_view piece = text.substr(0, length ? length : 1);
        if (length && IsShown(CodePoint(piece)))
            shown += piece;
        else
            AppendEscaped(shown, piece);
        text.remove_prefix(piece.size());
    }
    return shown;
}

TerminalLines::TerminalLines(std::ostream& stream, bool terminal) : m_stream(stream)
{
    if (terminal)
        m_under = stream.rdbuf(this);
}

TerminalLines::~TerminalLines()
{
    if (m_under)
        m_stream.rdbuf(m_under);
}

int TerminalLines::overflow(int c)
{
    if (c == traits_type::eof())
        return traits_type::not_eof(c);
    if (c != '\n') {
        m_line += char(c);
        return c;
    }
    return Pass() && m_under->sputc('\n') == '\n' ? c : traits_type::eof();
}

int TerminalLines::sync()
{
    return Pass() && m_under->pubsync() == 0 ? 0 : -1;
}

bool TerminalLines::Pass()
{
    const std::string shown = Printable(m_line);
    m_line.clear();
    return m_under->sputn(shown.data(), std::streamsize(shown.size())) == std::streamsize(shown.size());
}

bool OnTerminal()
{
#ifdef _WIN32
    return _isatty(_fileno(stdout)) != 0;
#else
    return isatty(STDOUT_FILENO) != 0;
#endif
}
