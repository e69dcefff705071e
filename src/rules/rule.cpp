#include "rules/rule.h"

namespace {

#define TQL_TEXT(context, english) english
constexpr Rule rules[] = {
#define KVR_RULE(id, code, severity, title, text, explanation)                                                         \
    {RuleId::id, code, Severity::severity, title, text, explanation},
#include "rules/rule_table.inc"
#undef KVR_RULE
};
#undef TQL_TEXT

} // namespace

std::span<const Rule> HDRules()
{
    return rules;
}

const Rule& RuleOf(RuleId id)
{
    return rules[std::size_t(id)];
}

const Rule& RuleOf(Finding::Kind kind)
{
    const auto id = [kind] {
        switch (kind) {
        case Finding::WrongType:
            return RuleId::WrongType;
        case Finding::CountDoesNotFit:
            return RuleId::CountDoesNotFit;
        case Finding::ShortDate:
            return RuleId::ShortDate;
        case Finding::SurplusFlags:
            return RuleId::SurplusFlags;
        case Finding::SurplusParams:
            return RuleId::SurplusParams;
        case Finding::Rule:
            return RuleId::OwnRule;
        case Finding::NoTarget:
            return RuleId::NoTarget;
        case Finding::OtherType:
            return RuleId::OtherType;
        case Finding::Missing:
            return RuleId::MissingParameter;
        case Finding::NoKeyword:
            return RuleId::NoKeyword;
        case Finding::NoSection:
            return RuleId::NoSection;
        case Finding::Repeated:
            return RuleId::Repeated;
        case Finding::NoDate:
            return RuleId::NoDate;
        case Finding::NotRead:
            return RuleId::NotRead;
        case Finding::Unknown:
            return RuleId::Unknown;
        case Finding::UnknownParams:
            break;
        }
        return RuleId::UnknownParams;
    };
    return RuleOf(id());
}

const char* SeverityName(Severity severity)
{
    constexpr const char* names[] = {"error", "warning", "note"};
    return names[std::size_t(severity)];
}
