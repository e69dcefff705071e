#include "ks/units/formula.h"

#include <QCoreApplication>
#include <QRegularExpression>
#include <algorithm>
#include <muParser.h>
#include <numbers>
#include <vector>

struct CKsFormula::Parser
{
    mu::Parser parser;
    std::vector<double> numbers; // what the names stand for
};

namespace {

constexpr qsizetype LongestText = 1000; // nobody types more, and a pasted book is refused at once

CString Text(const char* text)
{
    return QCoreApplication::translate("CKsFormula", text);
}

CString FaultOf(const mu::ParserError& error, const CString& text)
{
    const CString part = CString::fromStdString(error.GetToken());
    switch (error.GetCode()) {
    case mu::ecUNASSIGNABLE_TOKEN:
        return Text(QT_TRANSLATE_NOOP("CKsFormula", "\"%1\" is no name or function known here.")).arg(part);
    case mu::ecMISSING_PARENS:
    case mu::ecUNEXPECTED_PARENS:
        return Text(QT_TRANSLATE_NOOP("CKsFormula", "The brackets of \"%1\" do not match.")).arg(text);
    case mu::ecTOO_MANY_PARAMS:
    case mu::ecTOO_FEW_PARAMS:
        return Text(QT_TRANSLATE_NOOP("CKsFormula", "\"%1\" has too many or too few values in its brackets."))
            .arg(part);
    case mu::ecUNEXPECTED_EOF:
    case mu::ecEMPTY_EXPRESSION:
        return Text(QT_TRANSLATE_NOOP("CKsFormula", "The formula ends where a number is expected."));
    default:
        return Text(QT_TRANSLATE_NOOP("CKsFormula", "The formula cannot be read at character %1."))
            .arg(std::clamp<qsizetype>(error.GetPos(), 0, text.size()) + 1);
    }
}

} // namespace

CKsFormula::CKsFormula(const CString& text, const QStringList& names) : m_parser(std::make_unique<Parser>())
{
    static const QRegularExpression assignment(QStringLiteral("(?<![=<>!])=(?!=)"));
    if (assignment.match(text).hasMatch()) {
        m_fault =
            Text(QT_TRANSLATE_NOOP("CKsFormula", "A formula sets nothing: two numbers are compared with \"==\"."));
        return;
    }
    if (text.size() > LongestText) {
        m_fault = Text(QT_TRANSLATE_NOOP("CKsFormula", "The formula is longer than %1 characters.")).arg(LongestText);
        return;
    }
    m_parser->numbers.resize(std::size_t(names.size()));
    try {
        std::string letters = "0123456789_abcdefghijklmnopqrstuvwxyzABCDEFGHIJKLMNOPQRSTUVWXYZ";
        for (int byte = 0x80; byte <= 0xff; ++byte) // of letters in UTF-8
            letters += char(byte);
        m_parser->parser.DefineNameChars(letters.c_str());
        m_parser->parser.DefineConst("_pi", std::numbers::pi); // some releases of the parser know twelve decimals of it
        for (qsizetype name = 0; name < names.size(); ++name)
            m_parser->parser.DefineVar(names[name].toStdString(), &m_parser->numbers[std::size_t(name)]);
        m_parser->parser.SetExpr(text.toStdString());
        int results = 0;
        m_parser->parser.Eval(results);
        if (results != 1) // "1,5" would be two of them
            m_fault = Text(QT_TRANSLATE_NOOP("CKsFormula", "The formula has a comma outside of brackets; the decimal "
                                                           "separator is the point."));
    } catch (const mu::ParserError& error) {
        m_fault = FaultOf(error, text);
    }
}

CKsFormula::~CKsFormula() = default;
CKsFormula::CKsFormula(CKsFormula&&) noexcept = default;

bool CKsFormula::Uses(std::size_t name) const
{
    const auto& used = m_parser->parser.GetUsedVar();
    return std::ranges::any_of(used, [&](const auto& variable) { return variable.second == &m_parser->numbers[name]; });
}

double& CKsFormula::Number(std::size_t name) const
{
    return m_parser->numbers[name];
}

double CKsFormula::Value() const
{
    return m_parser->parser.Eval();
}
