// The words of messages.
#include "tql/error_text.h"

namespace tql {

std::string TermText(const TqlTerm& term)
{
    std::string text = tqlPhraseText(term.phrase);
    if (const auto place = text.find("%1"); place != std::string::npos)
        text.replace(place, 2, term.text);
    return text;
}

void MakeMessage(TqlSyntaxError& report)
{
    report.message = report.file + ", line " + std::to_string(report.line) + ", column " +
                     std::to_string(report.column) + ": expected " + TermText(report.expected) + ", found " +
                     TermText(report.found);
}

std::string ReasonText(std::error_code reason)
{
    if (reason == std::errc::no_such_file_or_directory)
        return "there is no such file";
    if (reason == std::errc::is_a_directory)
        return "it is a folder";
    if (reason == std::errc::operation_not_supported)
        return "it is no ordinary file";
    if (reason == std::errc::io_error)
        return "reading failed";
    if (reason == std::errc::not_enough_memory)
        return "there is not enough memory";
    return reason.message();
}

} // namespace tql

const char* tqlPhraseText(TqlPhrase phrase)
{
    static constexpr const char* texts[] = {
        "",
#define TQL_TEXT(context, english) english
#define TQL_PHRASE(name, english) english,
#include "tql/phrases.inc"
#undef TQL_PHRASE
#undef TQL_TEXT
    };
    return texts[std::size_t(phrase)];
}
