// A column of a grid, declared: what it edits, how it shows it, what it accepts.
#pragma once

#include "data/field.h"
#include "ks/units/edit_style.h"

#include <QString>
#include <functional>
#include <memory>
#include <variant>

/// What a cell holds, in base units. Nothing stands for an empty cell.
using CellValue = std::variant<std::monostate, double, std::int32_t, std::string>;

/// How a column reaches its value in the object of a row.
struct CellAccess
{
    std::function<CellValue(const void* row)> get;
    std::function<void(void* row, const CellValue& value)> set;
};

/// Access to a declared field.
CellAccess FieldAccess(const Field& field);

enum class CellKind
{
    Text,
    Number,
    Integer
};

/// The cell editors by number, in one table.
struct GridControl
{
    int id;
    CellKind kind;
    int decimals;           // of a number that is not being edited
    const char* editorName; // object name of the editor
};
namespace Control {
inline constexpr int Integer = 0;     // the plain edit control
inline constexpr int Number = 5042;   // three decimals
inline constexpr int Text = 5043;     // upper case
inline constexpr int Chainage = 5044; // whole numbers shown
} // namespace Control
const GridControl& FindControl(int id);

struct ColumnSpec
{
    int control = Control::Number;
    std::function<QString()> header;
    int width = 72;               // pixels at the original font size; the grid scales it
    CKsEditStyle style;           // unit group and format
    bool emptyIsNotGiven = false; // an empty cell is stored as the mark for "not given", and the mark shows as empty
    const double* fill = nullptr; // enters new lines, and blank cells when the page is left; as it is, not converted
    std::function<bool(const void* row)> locked; // the cell of this row cannot be edited
    std::shared_ptr<const CellAccess> access;

    CellKind Kind() const { return FindControl(control).kind; }
    bool IsLocked(const void* row) const { return locked && locked(row); }
    /// `fill` as the stored value that a cell with that text has.
    CellValue FillValue() const;
    /// What an emptied cell is stored as when nothing fills it.
    CellValue EmptyValue() const;
};
