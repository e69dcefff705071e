#include "ks/fc/syntax_error.h"

#include "ks/fc/system_reason.h"
#include "tql/tql.h"

#include <QCoreApplication>

namespace {

struct SyntaxError
{
    Q_DECLARE_TR_FUNCTIONS(SyntaxError)
};

/// The words of the parser's phrases are the sources of the translations.
CString TermText(const TqlTerm& term)
{
    const CString text = QCoreApplication::translate("SyntaxError", tqlPhraseText(term.phrase));
    return text.contains(QLatin1String("%1")) ? text.arg(CString::fromStdString(term.text)) : text;
}

} // namespace

CString KsSyntaxErrorText(const TqlSyntaxError& error)
{
    if (error.code == TqlError::None)
        return {};
    const CString file = CString::fromStdString(error.file);
    if (error.reason)
        return SyntaxError::tr("%1 cannot be read: %2").arg(file, KsSystemReason(error.reason));
    return SyntaxError::tr("%1, line %2, column %3: expected %4, found %5")
        .arg(file, CString::number(error.line), CString::number(error.column), TermText(error.expected),
             TermText(error.found));
}
