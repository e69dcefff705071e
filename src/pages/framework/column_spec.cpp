#include "pages/framework/column_spec.h"

#include "data/river_pos.h"

#include <algorithm>
#include <iterator>

namespace {

constexpr GridControl Controls[] = {
    {Control::Integer, CellKind::Integer, 0, "edit"},
    {Control::Number, CellKind::Number, 3, "doubleEdit_1110"},
    {Control::Text, CellKind::Text, 0, "stringEdit_1111"},
    {Control::Chainage, CellKind::Number, 0, "doubleEdit_1112"},
};

template <typename T>
CellAccess AccessAs(const Field& field)
{
    return {[field](const void* row) -> CellValue { return field.In<T>(row); },
            [field](void* row, const CellValue& value) { field.In<T>(row) = std::get<T>(value); }};
}

} // namespace

const GridControl& FindControl(int id)
{
    return *std::find_if(std::begin(Controls), std::end(Controls) - 1,
                         [id](const GridControl& control) { return control.id == id; });
}

CellAccess FieldAccess(const Field& field)
{
    switch (field.kind) {
    case FieldKind::Integer:
    case FieldKind::Choice:
        return AccessAs<std::int32_t>(field);
    case FieldKind::Text:
    case FieldKind::FileName:
        return AccessAs<std::string>(field);
    default:
        return AccessAs<double>(field);
    }
}

CellValue ColumnSpec::FillValue() const
{
    return style.UnitConvertFromBase(*fill, 0);
}

CellValue ColumnSpec::EmptyValue() const
{
    switch (Kind()) {
    case CellKind::Text:
        return std::string();
    case CellKind::Integer:
        return std::int32_t(0);
    case CellKind::Number:
        break;
    }
    return emptyIsNotGiven ? NotGiven : style.UnitConvertFromBase(0, 0);
}
