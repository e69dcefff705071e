// What a user may type for a number: the number; an amount with its unit ("12 ft"); or, behind "=", a formula.
#pragma once

#include "ks/units/edit_style.h"

#include <QStringList>
#include <cstdint>
#include <optional>

template <typename Value>
struct KsTyped
{
    std::optional<Value> value = {};
    /// Why an amount or a formula is none, for the user. Empty also where the text is no number, unit or formula at
    /// all: whoever asks has words of its own for that.
    CString complaint = {};
};

/// The number in base units, for a text that is one without unit.
KS_API std::optional<double> KsReadNumber(QStringView text, const CKsEditStyle& style);
/// The number in base units. `symbol` is the unit that numbers without one are in, and which may always be typed; the
/// style's own where it is not given.
KS_API KsTyped<double> KsReadTyped(QStringView text, const CKsEditStyle& style);
KS_API KsTyped<double> KsReadTyped(QStringView text, const CKsEditStyle& style, const CString& symbol);
/// The units that may be typed, the one that numbers without one are in first; none for a number without unit.
KS_API QStringList KsTypedUnits(const CKsEditStyle& style, const CString& symbol);
/// An integer or a formula whose result is one.
KS_API KsTyped<std::int32_t> KsReadTypedInteger(const CString& text);
