// Texts for terminals, on which some characters are commands.
#pragma once

#include <iosfwd>
#include <streambuf>
#include <string>
#include <string_view>

/// The text with everything that a terminal does not simply show as \xNN, byte by byte: control characters (line feeds,
/// too), bytes that are no UTF-8, and the marks that turn the direction of writing.
std::string Printable(std::string_view text);

/// While it lives, lines that a stream prints on a terminal are printable. What goes into a file or another program
/// passes as it is.
class TerminalLines : std::streambuf
{
public:
    /// `terminal`: whether the stream is one, as OnTerminal answers for standard output.
    TerminalLines(std::ostream& stream, bool terminal);
    ~TerminalLines() override;
    TerminalLines(const TerminalLines&) = delete;
    TerminalLines& operator=(const TerminalLines&) = delete;

private:
    int overflow(int c) override;
    int sync() override;
    bool Pass();

    std::ostream& m_stream;
    std::streambuf* m_under = nullptr; // null: nothing is changed
    std::string m_line;
};

/// Whether standard output is a terminal.
bool OnTerminal();
