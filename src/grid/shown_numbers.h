// The numbers of a column in the unit that the user sees, for whoever goes through many rows.
#pragma once

#include "grid/table_rows.h"

#include <limits>

/// For as long as nothing of the table changes.
class CShownNumbers
{
public:
    CShownNumbers(const CTableRows& rows, int column);

    const ColumnSpec& Spec() const { return *m_spec; }
    const KsUnitConversion& Conversion() const { return m_conversion; }
    /// Where the object keeps the number, in the base unit; null where the value of the cell has to be asked for.
    const double* Kept(const void* object) const
    {
        return object && m_access->number ? m_access->number(object) : nullptr;
    }
    /// NaN for an empty cell and for what is no number: an optional would go through memory, a million times.
    /// `object` is the row's UntouchedObject.
    double At(int row, const void* object) const
    {
        const double* const kept = Kept(object);
        return kept ? Of(*kept) : Of(m_rows->Value(row, m_column));
    }
    double At(int row) const { return At(row, m_rows->UntouchedObject(row)); }
    /// The same of an object of the source, whatever was typed.
    double In(const void* object) const
    {
        const double* const kept = Kept(object);
        return kept ? Of(*kept) : Of(m_access->get(object));
    }

private:
    static constexpr double None = std::numeric_limits<double>::quiet_NaN();

    double Of(double number) const
    {
        return m_spec->emptyIsNotGiven && number == NotGiven ? None : m_conversion.ToShown(number);
    }
    double Of(const CellValue& value) const;

    const CTableRows* m_rows;
    int m_column;
    const ColumnSpec* m_spec;
    const CellAccess* m_access;
    KsUnitConversion m_conversion;
};
