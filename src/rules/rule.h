// The table of rules: what a file of HD parameters should keep to. Each has a code that stays, whatever becomes of its
// words, so that scripts and settings may name it.
#pragma once

#include "files/finding.h"

#include <span>

enum class Severity
{
    Error,   // the simulation cannot mean it so
    Warning, // it may be meant so; hardly ever is
    Note     // nothing is wrong, but somebody may want to know
};

enum class RuleId
{
#define KVR_RULE(id, code, severity, title, text, explanation) id,
#include "rules/rule_table.inc"
#undef KVR_RULE
};

/// English, and the source of its translations (context "HDRules").
struct Rule
{
    RuleId id;
    const char* code;
    Severity severity;
    const char* title;       // what is wrong, in a few words
    const char* text;        // of one place; %1 and so on stand for its values. Empty where a finding has a text
    const char* explanation; // why it is, and what to do
};

/// By their numbers.
std::span<const Rule> HDRules();
const Rule& RuleOf(RuleId id);
/// Of what the reader of files finds.
const Rule& RuleOf(Finding::Kind kind);
/// "error", "warning", "note".
const char* SeverityName(Severity severity);
