#include "problems/problem_texts.h"

#include "ks/fc/shown_text.h"
#include "ks/language/date_time.h"
#include "ks/units/edit_style.h"

#include <QApplication>
#include <QDateTime>
#include <QStyle>

namespace {

QString Translated(const char* english)
{
    return *english ? QCoreApplication::translate("HDRules", english) : QString();
}

QString TextOf(const Amount& amount)
{
    CKsEditStyle style;
    style.SetEumUnitBaseGroup(amount.unit);
    const QString number = KsFormatNumber(QStringLiteral("%.7lg"), style.UnitConvertFromBase(amount.value, 1));
    const QString unit = style.UnitSymbol();
    return unit.isEmpty() ? number : number + QChar(QChar::Nbsp) + unit;
}

QString TextOf(const HDDateTime& date)
{
    return KsDateTimeText({{date.Year, date.Month, date.Day}, {date.Hour, date.Minute, date.Second}});
}

} // namespace

QString ProblemTexts::TitleOf(RuleId rule)
{
    return Translated(RuleOf(rule).title);
}

QString ProblemTexts::ExplanationOf(RuleId rule)
{
    return Translated(RuleOf(rule).explanation);
}

QString ProblemTexts::NameOf(Severity severity)
{
    switch (severity) {
    case Severity::Error:
        return tr("Error");
    case Severity::Warning:
        return tr("Warning");
    case Severity::Note:
        break;
    }
    return tr("Note");
}

QString ProblemTexts::CountOf(Severity severity, std::size_t count)
{
    const auto counted = [count](const QString& one, const QString& many) {
        return count == 1 ? one : many.arg(count);
    };
    switch (severity) {
    case Severity::Error:
        return counted(tr("1 error"), tr("%1 errors"));
    case Severity::Warning:
        return counted(tr("1 warning"), tr("%1 warnings"));
    case Severity::Note:
        break;
    }
    return counted(tr("1 note"), tr("%1 notes"));
}

QString ProblemTexts::NameOf(Remedy remedy)
{
    const QString name = Translated(RemedyName(remedy));
    return name.left(1).toUpper() + name.mid(1);
}

QString ProblemTexts::TextOf(const Problem& problem)
{
    QString text = Translated(RuleOf(problem.rule).text);
    // From the last, so that a value that looks like a place for another stays as it is.
    for (std::size_t i = problem.values.size(); i-- > 0;) {
        const QString value =
            std::visit(Overloads{[](const std::string& name) { return KsVisibleText(QString::fromStdString(name)); },
                                 [](const Amount& amount) { return ::TextOf(amount); },
                                 [](const HDDateTime& date) { return ::TextOf(date); },
                                 [](const Reason& reason) { return Translated(reason.english); }},
                       problem.values[i]);
        text.replace(u'%' + QString::number(i + 1), value);
    }
    return text.left(1).toUpper() + text.mid(1);
}

QIcon ProblemTexts::IconOf(Severity severity)
{
    constexpr QStyle::StandardPixmap icons[] = {QStyle::SP_MessageBoxCritical, QStyle::SP_MessageBoxWarning,
                                                QStyle::SP_MessageBoxInformation};
    return QApplication::style()->standardIcon(icons[std::size_t(severity)]);
}
