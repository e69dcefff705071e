#include "grid/shown_numbers.h"

CShownNumbers::CShownNumbers(const CTableRows& rows, int column)
    : m_rows(&rows),
      m_column(column),
      m_spec(&rows.Column(column)),
      m_access(m_spec->access.get()),
      m_conversion(m_spec->style.Conversion())
{
}

double CShownNumbers::Of(const CellValue& value) const
{
    if (const auto* integer = std::get_if<std::int32_t>(&value))
        return *integer;
    const auto* number = std::get_if<double>(&value);
    return number ? Of(*number) : None;
}
