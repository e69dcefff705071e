// What a user may enter as a number.
#pragma once

#include "ks/units/edit_style.h"

#include <optional>

struct Bounds
{
    std::optional<double> minimum{}, maximum{}; // base units

    bool Allow(double value) const { return !(minimum && value < *minimum) && !(maximum && value > *maximum); }
    /// "0.5 to 1", "at least 0" and so on, in the user's unit; empty without bounds.
    QString Text(const CKsEditStyle& style) const;
};
