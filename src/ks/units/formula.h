// Arithmetic that a user types: "10+5", "max(value, 2)". Numbers with a decimal point, + - * / ^, comparisons and
// functions (min, max, sqrt, abs, ln, log10, exp, sin, ...), and the names that the place gives.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <QStringList>
#include <memory>
#include <span>

class KS_API CKsFormula
{
public:
    /// `names` stand for the numbers that Value is given: letters, digits and _, no digit first, each once.
    explicit CKsFormula(const CString& text, const QStringList& names = {});
    ~CKsFormula();
    CKsFormula(CKsFormula&&) noexcept;

    /// Why the text is no formula, for the user; empty when it is one.
    const CString& Fault() const { return m_fault; }
    /// Whether the number of this name matters.
    bool Uses(std::size_t name) const;
    /// With a number for each name, in their order. May be infinite or no number. Only without a fault.
    double Value(std::span<const double> numbers = {}) const;

private:
    struct Parser;
    std::unique_ptr<Parser> m_parser;
    CString m_fault;
};
