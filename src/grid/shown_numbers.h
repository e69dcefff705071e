// The numbers of a column in the unit that the user sees, for whoever goes through many rows.
#pragma once

#include "grid/table_rows.h"

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
    /// Nothing for an empty cell and for what is no number. `object` is the row's UntouchedObject.
    std::optional<double> At(int row, const void* object) const
    {
        const double* const kept = Kept(object);
        return kept ? Of(*kept) : Of(m_rows->Value(row, m_column));
    }
    std::optional<double> At(int row) const { return At(row, m_rows->UntouchedObject(row)); }
    /// The same of an object of the source, whatever was typed.
    std::optional<double> In(const void* object) const
    {
        const double* const kept = Kept(object);
        return kept ? Of(*kept) : Of(m_access->get(object));
    }

private:
    std::optional<double> Of(double number) const
    {
        const bool isEmpty = std::isnan(number) || (m_spec->emptyIsNotGiven && number == NotGiven);
        return isEmpty ? std::nullopt : std::optional(m_conversion.ToShown(number));
    }
    std::optional<double> Of(const CellValue& value) const;

    const CTableRows* m_rows;
    int m_column;
    const ColumnSpec* m_spec;
    const CellAccess* m_access;
    KsUnitConversion m_conversion;
};
