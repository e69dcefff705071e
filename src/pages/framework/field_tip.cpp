#include "pages/framework/field_tip.h"

#include "data/global_var.h"
#include "grid/column_spec.h"
#include "grid/tool_tip.h"
#include "res/strings.h"

namespace {

/// What a new document has there, in the user's unit; empty where that says nothing, as with a box or a date.
QString DefaultText(const Field& field, const QString& unit)
{
    static const HD_Global_Var defaults;
    const auto number = [&](double value) {
        return NumberText(KsShortestNumber(CKsEditStyle(field.unit).UnitConvertFromBase(value, 1)), unit);
    };
    const auto integer = [&](std::int32_t value) {
        if (!field.choices)
            return QString::number(value);
        return PlainTitle(LoadLine(field.choices.text, value - field.firstChoice));
    };
    return Visit(field, &defaults, Overloads{number, integer, [](const auto&) { return QString(); }});
}

/// A parameter of several has its keyword's name in front.
std::string NameInFile(const DeclaredKeyword& keyword, const Field& field)
{
    std::string name(keyword.name);
    return keyword.name == field.name ? name : name.append(", ").append(field.name);
}

} // namespace

QString FieldToolTip(const DeclaredKeyword& keyword, const Field& field, const QString& shown, const QString& unit)
{
    return ToolTipText({LoadLine(field.meaning.text, field.meaning.line), shown,
                        RangeLine(field.bounds, CKsEditStyle(field.unit), unit), DefaultLine(DefaultText(field, unit)),
                        NameInFileLine(NameInFile(keyword, field))});
}
