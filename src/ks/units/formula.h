// Arithmetic that a user types: "10+5", "max(value, 2)". Numbers with a decimal point, + - * / ^, comparisons and
// functions (min, max, sqrt, abs, ln, log10, exp, sin, ...), and the names that the place gives.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <QStringList>
#include <memory>

class KS_API CKsFormula
{
public:
    /// `names` stand for numbers: letters, digits and _, no digit first, each once.
    explicit CKsFormula(const CString& text, const QStringList& names = {});
    ~CKsFormula();
    CKsFormula(CKsFormula&&) noexcept;

    /// Why the text is no formula, for the user; empty when it is one.
    const CString& Fault() const { return m_fault; }
    /// Whether the number of this name matters.
    bool Uses(std::size_t name) const;
    /// What the name stands for, to be set before Value; 0 at first. Only without a fault.
    double& Number(std::size_t name) const;
    /// May be infinite or no number. Only without a fault.
    double Value() const;

private:
    struct Parser;
    std::unique_ptr<Parser> m_parser;
    CString m_fault;
};
