// What pasting a table would do, before anything changes: which cell each text goes to, how it is understood, and which
// of them do not fit.
#pragma once

#include "grid/cell_text.h"
#include "grid/copied_table.h"
#include "grid/foreign_number.h"
#include "grid/table_rows.h"

#include <functional>

/// Where the lines of a copied table go.
enum class PastePlace
{
    AtCell, // into the rows shown from one on; behind the last one into new lines
    AtEnd,  // into new lines
    ByPlace // into the lines of the same branch and chainage, hidden ones included; others become new lines
};

/// How a copied table is to be understood. What the user may choose.
struct PasteChoice
{
    struct Column
    {
        int target = -1; // column of the table; -1 for one that is left out
        QString unit{};  // of numbers without one; empty for the unit that the target shows
        bool operator==(const Column&) const = default;
    };
    bool hasHeaders = false;
    bool hasUnits = false;                // in a line of their own below the headers
    std::optional<DecimalSign> decimal{}; // nothing: texts are no others than a cell takes that is typed into
    std::vector<Column> columns{};        // of the copied table
    PastePlace place = PastePlace::AtCell;
    int row = 0; // for AtCell
};

/// So many columns one after another from a column of the table on.
std::vector<PasteChoice::Column> ColumnsInOrder(const CTableRows& rows, int count, int column);
/// The copied columns so, with the units that they were copied with.
PasteChoice AsItStands(const CTableRows& rows, const CopiedTable& copied, int row, int column);
/// Whether numbers with the unit may stand in the column.
bool IsUnitOf(const ColumnSpec& column, const QString& unit);
/// Numbers have the units that they were copied with, as far as the clipboard knows them, be they units of the target
/// or not.
void TakeUnits(const CTableRows& rows, const CopiedTable& copied, PasteChoice& choice);
/// Whether the first line names the columns of the table from `column` on, in their order and with their units.
bool HasHeadersInOrder(const CTableRows& rows, const CTextTable& texts, int column);
/// Whether the first line seems to say what stands below it, in whatever order and words.
bool SeemsToHaveHeaders(const CTableRows& rows, const CTextTable& texts, int column);
/// The same, with what the texts themselves say: columns go where their headers say, numbers have the decimal sign that
/// more of them can be read with.
PasteChoice AsItSeems(const CTableRows& rows, const CopiedTable& copied, int row, int column);
/// Whether the line below the headers says nothing but units, `columns` being where its texts go.
bool SeemsToHaveUnits(const CTextTable& texts, const CTableRows& rows, const std::vector<PasteChoice::Column>& columns);
/// Numbers whose headers tell no unit have the one that stands there.
void TakeUnitLine(const CTextTable& texts, const CTableRows& rows, std::vector<PasteChoice::Column>& columns);
/// Where the columns go whose headers say so, and in which units they are; without any such one after another from
/// `column` on.
std::vector<PasteChoice::Column> ColumnsByHeaders(const CTableRows& rows, const CTextTable& texts, int column);

/// What may stand between the cells of a copied table.
inline constexpr char16_t Separators[] = {u'\t', u';', u',', u'|'};
/// Reads what was copied, with a separator between its cells.
using ReadCopied = std::function<CopiedTable(QChar separator)>;
/// That with which every line, but for blank ones, has as many cells, more than one; a tab when there is none. A comma
/// within numbers is none.
QChar SeparatorOf(const ReadCopied& read);
/// Whether lines of one cell seem to be lines of several, which something else than a tab separates. A comma in a
/// single line may be part of a name.
bool SeemsDivided(const ReadCopied& read);

class CPastePlan
{
public:
    /// Both outlive it.
    CPastePlan(const CTableRows& rows, const CopiedTable& copied, PasteChoice choice);

    const PasteChoice& Choice() const { return m_choice; }
    /// Those that are pasted, without headers, units and blank lines: what the others below speak of.
    std::size_t Lines() const { return m_lines.size(); }
    /// Where a line stands in what was copied.
    std::size_t CopiedLine(std::size_t line) const { return m_lines[line]; }
    /// How many blank lines are none: those among lines that name their branches.
    std::size_t BlankLines() const { return m_blankLines; }
    int Columns() const { return int(m_choice.columns.size()); }
    /// What was copied.
    QString Text(std::size_t line, int column) const;
    /// The text of the cell that it becomes, or is where that names the line; as copied where it does not fit.
    QString Understood(std::size_t line, int column) const;
    /// The row of the source that a line goes to, unless it becomes a new one or goes nowhere.
    std::optional<std::size_t> RowOf(std::size_t line) const;
    bool IsNew(std::size_t line) const;
    bool GoesNowhere(std::size_t line) const;
    std::size_t NewLines() const;
    /// Lines that go to rows which a filter hides.
    std::size_t HiddenLines() const;
    /// Some lines have fewer cells than others, and leave those of the table as they are.
    bool HasShorterLines() const;

    struct Fault
    {
        std::size_t line;
        int column; // of the copied table; -1 where it is no cell's
        QString reason;
    };
    /// Line by line. A line goes nowhere when it does not fit with the others, or when it is not known which it is.
    const std::vector<Fault>& Faults() const { return m_faults; }
    std::size_t LinesLeftOut() const;
    /// Of the lines that are pasted.
    std::size_t CellsLeftOut() const;
    /// What nothing can be done about cell by cell; empty for nothing.
    const QString& Complaint() const { return m_complaint; }
    /// The column of the copied table that it is about; -1 for none.
    int ComplaintColumn() const { return m_complaintColumn; }
    /// Every text has a cell that takes it.
    bool IsClean() const;
    /// Texts that have one.
    std::size_t CellCount() const { return m_cellCount; }
    /// The cells without those that do not fit; the plan has none afterwards.
    PastedCells TakeCells();

private:
    void FindComplaint();
    void FindLines();
    int ColumnFor(int target) const;
    void FindRows();
    void FindRowsByPlace();
    bool NamesLine(int column) const;
    QStringView TextAt(std::size_t line, int column) const { return m_copied->texts.At(m_lines[line], column); }
    int WidthOf(std::size_t line) const;
    QStringView WholeNumber(std::size_t line, int column) const;
    QString NumberText(std::size_t line, int column, const QString& text) const;
    bool IsAsTyped(int column) const;
    CellReading Read(std::size_t line, int column) const;
    QString WhyNoName(int target, const CellValue& value) const;
    void ReadColumn(int column);
    bool IsLockedThen(std::size_t line, int column) const;
    void Leave(std::size_t line, int column);
    void AddFault(std::size_t line, int column, const QString& reason);
    void LeaveUnnamedLines();
    void FindRuleFaults();
    bool LeaveMisfits();
    void LeaveOldLines();
    void CountCells();
    PastedCells Cells(std::vector<CCellValues> values, std::vector<std::vector<bool>> left) const;
    PastedCells::Column WithoutLinesThatGoNowhere(PastedCells::Column column) const;

    static constexpr std::size_t Nowhere = std::size_t(-1), New = Nowhere - 1; // instead of rows

    const CTableRows* m_rows;
    const CopiedTable* m_copied;
    PasteChoice m_choice;
    std::vector<std::size_t> m_lines{}; // of the texts
    std::size_t m_blankLines = 0;
    std::vector<std::size_t> m_rowOf{};
    std::vector<CCellValues> m_values{};     // by column of the texts
    std::vector<bool> m_isRead{};            // likewise: whether they are known
    std::vector<std::vector<bool>> m_left{}; // those that stay as they are; empty where none does
    std::vector<Fault> m_faults{};
    QString m_complaint{};
    int m_complaintColumn = -1;
    std::size_t m_cellCount = 0;
};
