// A column of a grid, declared: what it edits, how it shows it, what it accepts.
#pragma once

#include "files/field.h"
#include "ks/units/edit_style.h"

#include <QStringList>
#include <functional>
#include <memory>
#include <optional>
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
};

/// Access to a declared field.
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

/// The cell editors by number, in one table.
struct GridControl
{
    int id;
    CellKind kind;
    int decimals;           // of a number that is not being edited; AsFormatted, UpToThousandths
    const char* editorName; // object name of the editor
    bool upperCase = false; // of a text
};
namespace Control {
inline constexpr int Integer = 0;     // the plain edit control
inline constexpr int Formatted = 1;   // a number of any magnitude
inline constexpr int Number = 5042;   // three decimals
inline constexpr int Text = 5043;     // upper case
inline constexpr int Chainage = 5044; // whole numbers shown
inline constexpr int DropDown = 52517;
inline constexpr int DropDownList = 52518; // texts to choose from
inline constexpr int FreeText = 52519;     // as it is typed
inline constexpr int CheckBox = 52520;
inline constexpr int PushButton = 52521;
inline constexpr int DateTime = 52522;
inline constexpr int Measured = 52523; // a number without zeros behind its last digit
} // namespace Control
const GridControl& FindControl(int id);

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

/// "Unit: m"; empty for a quantity without unit.
QString UnitToolTip(const QString& unit);
/// "1500.6 m".
QString NumberText(const QString& number, const QString& unit);
/// The unit of a number and, where `shown` leaves some of its digits out, the whole number.
QString NumberToolTip(const CKsEditStyle& style, double value, const QString& shown, const QString& unit);

/// What a column holds of a place that another editor sends, beside its branch and chainage.
enum class LocationValue
{
    None,
    Radius, // of curvature
    Width   // of the channel
};

struct ColumnSpec
{
    int control = Control::Number;
    std::function<QString()> header;
    int width = 72;               // pixels at the original font size; the grid scales it
    CKsEditStyle style;           // unit group and format
    std::optional<double> minimum = {}, maximum = {}; // of a number, base units
    bool isRequired = false;                          // an empty cell is refused
    bool emptyIsNotGiven = false; // an empty cell is stored as the mark for "not given", and the mark shows as empty
    Choices choices;              // of a drop-down column
    std::function<QString()> unitText; // symbol instead of the style's, where the unit depends on a setting
    std::function<QString()> hint;     // what the column is, for the tool tip of its header
    const double* fill = nullptr; // enters new lines, and blank cells when the page is left; as it is, not converted
    std::function<bool(const void* row)> locked; // the cell of this row cannot be edited
    LocationValue locationValue = LocationValue::None;
    std::shared_ptr<const CellAccess> access;

    CellKind Kind() const { return FindControl(control).kind; }
    bool IsRightAligned() const { return Kind() == CellKind::Number || Kind() == CellKind::Integer; }
    /// The cells have no editor: a click or the space bar acts at once.
    bool ActsAtOnce() const { return Kind() == CellKind::Flag || Kind() == CellKind::Button; }
    bool IsLocked(const void* row) const { return locked && locked(row); }
    /// `fill` as the stored value that a cell with that text has.
    CellValue FillValue() const;
    /// What an emptied cell is stored as when nothing fills it.
    CellValue EmptyValue() const;
    /// What a new line holds; nothing where the record's own default stands.
    CellValue NewLineValue() const;
    QString UnitSymbol() const;
    /// "at least 0", in the user's unit; empty without bounds.
    QString Allowed() const;
    bool IsAllowed(double value) const;
    /// Unit of the cells, and on a header also what the column is.
    QString ToolTip(bool header) const;
};
