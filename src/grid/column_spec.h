// A column of a grid, declared: what it edits, how it shows it, what it accepts.
#pragma once

#include "files/field.h"
#include "ks/units/edit_style.h"

#include <QStringList>
#include <functional>
#include <memory>
#include <optional>
#include <string_view>
#include <variant>

/// What a cell holds, in base units. Nothing stands for an empty cell.
using CellValue = std::variant<std::monostate, double, std::int32_t, std::string, HDDateTime>;

/// How a column reaches its value in the object of a row.
struct CellAccess
{
    std::function<CellValue(const void* row)> get;
    std::function<void(void* row, const CellValue& value)> set;
    /// Where setting a cell changes more of the row than the cell: what puts the row back as it is now.
    std::function<std::function<void(void* row)>(const void* row)> restore = {};
    /// Where a row keeps the number or text that `get` would copy, for whoever goes through many rows; null where the
    /// cell is something else. Columns whose cells are no such thing have none of these.
    std::function<const double*(const void* row)> number = {};
    std::function<const std::string*(const void* row)> text = {};

    /// The number, or the text, of a cell; null where it holds none. `copy` has it where the row does not.
    const double* NumberIn(const void* row, CellValue& copy) const;
    const std::string* TextIn(const void* row, CellValue& copy) const;
};

/// Access to a declared field. A number that is not known is the mark for "not given" in its cell.
CellAccess FieldAccess(const Field& field);

enum class CellKind
{
    Text,
    Number,
    Integer,
    Choice,     // an index, shown as the text of its entry
    TextChoice, // one of the entries, kept as text
    Flag,       // 0 or 1, a check box
    DateTime,
    Button // no value: the page does something for the row
};

/// A number that is not being edited stands as the column's format has it.
inline constexpr int AsFormatted = -1;
/// Likewise with the decimals that it has, up to thousandths.
inline constexpr int UpToThousandths = -2;

/// The editor of cells.
struct GridControl
{
    CellKind kind;
    const char* editorName; // object name of the editor
    int decimals = 0;       // of a number that is not being edited; AsFormatted, UpToThousandths
    bool upperCase = false; // of a text
    bool trimmed = false;   // blanks around a text are no part of it
};
namespace Control {
inline constexpr GridControl Integer{CellKind::Integer, "edit"};
inline constexpr GridControl Formatted{CellKind::Number, "doubleEdit", AsFormatted}; // of any magnitude
inline constexpr GridControl Number{CellKind::Number, "doubleEdit_1110", 3};
inline constexpr GridControl Chainage{CellKind::Number, "doubleEdit_1112"}; // whole numbers shown
inline constexpr GridControl Measured{CellKind::Number, "doubleEdit", UpToThousandths};
inline constexpr GridControl Text{.kind = CellKind::Text, .editorName = "stringEdit_1111", .upperCase = true};
inline constexpr GridControl FreeText{CellKind::Text, "textEdit"}; // as it is typed
inline constexpr GridControl TrimmedText{.kind = CellKind::Text, .editorName = "textEdit", .trimmed = true};
inline constexpr GridControl DropDown{CellKind::Choice, "dropDown"};
inline constexpr GridControl DropDownList{CellKind::TextChoice, "dropDownList"};
inline constexpr GridControl CheckBox{CellKind::Flag, "checkBox"};
inline constexpr GridControl PushButton{CellKind::Button, "pushButton"};
inline constexpr GridControl DateTime{CellKind::DateTime, "dateTimeEdit"};
} // namespace Control

/// What the cells of a drop-down column can be. A stored index without entry is kept, and shown as its number.
struct Choices
{
    std::function<QStringList()> entries = {}; // in the user's language
    std::int32_t first = 0;                    // stored for the first entry; the others follow
    std::optional<std::int32_t> inNewLines = {};
    std::int32_t whenEmptied = 0;

    /// The entry that a text means, as it is spelt in the list; nothing when it means none.
    std::optional<QString> EntryOf(const QString& text) const;
    /// Text of a stored index.
    QString TextOf(std::int32_t index) const;
    /// The index that a text means, be it an entry (case does not matter) or the number of one; nothing otherwise.
    std::optional<std::int32_t> IndexOf(const QString& text) const;
};

/// "1500.6 m".
QString NumberText(const QString& number, const QString& unit);
/// "Width [m]".
QString WithUnit(const QString& name, UnitGroup group);
/// The unit of a number and, where some of its digits are not shown, the whole number.
QString NumberToolTip(const CKsEditStyle& style, double value, bool hidesDigits, const QString& unit);

/// What a column holds of a place that another editor sends, beside its branch and chainage.
enum class LocationValue
{
    None,
    Radius, // of curvature
    Width   // of the channel
};

/// A global value of the document, in whose place a cell stands: a number, or the index of a choice.
struct GlobalPlace
{
    const double* number = nullptr;
    const std::int32_t* index = nullptr;

    explicit operator bool() const { return number || index; }
    const void* Address() const { return number ? static_cast<const void*>(number) : index; }
    CellValue Value() const { return number ? CellValue(*number) : CellValue(*index); }
};

struct ColumnSpec
{
    // What a table says about its column, where that is not what the field says; see field_columns.h.
    std::function<QString()> header = {};
    int width = 72;               // pixels at the original font size; the grid scales it
    bool asFormatted = false;     // a number stands with six decimals, not with the control's
    const double* fill = nullptr; // enters new lines, and blank cells when the page is left; as it is, not converted
    GlobalPlace global = {};      // what the cells of lines stand in for, where nothing fills them
    bool emptyIsNotGiven = false; // an empty cell is stored as the mark for "not given", and the mark shows as empty
    std::function<bool(const void* row)> locked = {}; // the cell of this row cannot be edited
    Choices choices = {};                             // of a drop-down column
    std::function<QString()> unitText = {}; // symbol instead of the style's, where the unit depends on a setting
    std::function<QString()> hint = {};     // what the column means, for the tool tip of its header
    bool namesLine = false;                 // says which line it is: stays in sight when the table scrolls sideways
    bool upperCase = false;                 // of a text
    LocationValue locationValue = LocationValue::None;
    double* globalNumber = nullptr; // what a first row for global values shows; without, its cell is locked
    std::int32_t* globalIndex = nullptr;

    // What follows from the field.
    std::string_view name = {};              // of the field in the file
    std::function<QStringList()> names = {}; // that, and what the header says in any language, without its unit
    GridControl control = Control::Number;
    CKsEditStyle style = {}; // unit group and format
    Bounds bounds = {};      // of a number
    Along along = Along::Value;
    bool isRequired = false; // an empty cell is refused
    bool unitBelow = false;  // the unit stands below the header, which does not name it
    std::shared_ptr<const CellAccess> access = {};

    CellKind Kind() const { return control.kind; }
    bool NamesBranch() const { return namesLine && Kind() == CellKind::Text; }
    bool IsNumeric() const { return Kind() == CellKind::Number || Kind() == CellKind::Integer; }
    /// The cells have no editor: a click or the space bar acts at once.
    bool ActsAtOnce() const { return Kind() == CellKind::Flag || Kind() == CellKind::Button; }
    bool IsLocked(const void* row) const { return locked && locked(row); }
    /// The global value that a cell of a line stands in for; what fills new lines is one.
    GlobalPlace Global() const { return fill ? GlobalPlace{.number = fill} : global; }
    /// `fill` as the stored value that a cell with that text has.
    CellValue FillValue() const { return style.UnitConvertFromBase(*fill, 0); }
    /// What an emptied cell is stored as when nothing fills it.
    CellValue EmptyValue() const;
    /// What a new line holds; nothing where the record's own default stands.
    CellValue NewLineValue() const;
    QString UnitSymbol() const { return unitText ? unitText() : style.UnitSymbol(); }
    /// What stands in the header, line by line: a long text in two, and the unit below.
    QStringList HeaderLines() const;
    /// What stands below the header: "[m³/s]"; empty for nothing.
    QString UnitLine() const;
    /// Unit of the cells.
    QString ToolTip() const { return KsUnitToolTip(UnitSymbol()); }
};
