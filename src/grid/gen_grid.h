// The record grid: rows are locations or other lines, the row number stands in the vertical header. Rows and columns
// count from 1 in everything that its host calls.
#pragma once

#include "grid/grid_model.h"

#include <QTableView>
#include <optional>

class CGridDelegate;
class CGridWidths;
class IGridHost;
enum class GridAction;

/// Which lines Delete means.
enum class LineChoice
{
    WholeLines,  // selected by their numbers, not cell by cell, in one range
    CurrentLine, // likewise; without such a selection the current line
    LinesOfCells // those of the selected cells
};

class CGenGrid : public QTableView
{
    Q_OBJECT
public:
    explicit CGenGrid(QWidget* parent = nullptr);
    ~CGenGrid() override;

    /// Null when the host goes: nothing is reported or stored any more.
    void SetHost(IGridHost* host) { m_host = host; }
    IGridHost* Host() const { return m_host; }
    CGridModel* Model() const { return m_model; }
    CGridDelegate* Delegate() const { return m_delegate; }
    CGridWidths& Widths() const { return *m_widths; }

    int RowCount() const { return m_model->rowCount(); }
    int ColumnCount() const { return m_model->columnCount(); }
    /// 0 when there is no current cell.
    int CurrentRow() const { return currentIndex().row() + 1; }
    int CurrentColumn() const { return currentIndex().column() + 1; }
    /// Makes a cell current and shows it. A row past the end is the last row.
    void SetCurrentCell(int row, int column);
    QString TextAt(int row, int column) const;
    /// "Line 3 of 120", with the whole number of the current cell where the cell leaves digits out; empty without a
    /// current line.
    QString LineText() const;

    /// Column whose cells offer the branch names of the network; 0 for none.
    void SetBranchNameColumn(int column) { m_branchNameColumn = column; }
    int BranchNameColumn() const { return m_branchNameColumn; }

    /// Shows the rows as they are now; keeps the current cell.
    void Refresh();
    /// Likewise; without a current cell the first one becomes it.
    void Reload();
    /// Shows other rows; none is current.
    void ShowRows(CKsDoc& document, std::shared_ptr<IRowSource> rows);
    /// Inserts a line above the first selected range, or behind the last line; returns its row.
    int InsertLine();
    /// Below the current line instead, or behind the last one when there is none.
    void SetInsertsBelow(bool below) { m_insertsBelow = below; }
    /// Selects whole lines, as clicks on their numbers do.
    void SelectLines(int first, int last);
    void selectAll() override;
    /// Deletes the lines that are chosen. A grid left empty gets a new line, unless its rows may be none.
    bool DeleteSelectedLines();
    bool HasLinesToDelete() const { return LinesToDelete().has_value(); }
    void SetLineChoice(LineChoice choice) { m_lineChoice = choice; }
    /// A click or the space bar on a cell that acts at once.
    void ActOn(int row, int column);
    void GotoLine(int row);

    /// More than the current cell, in one range.
    std::optional<QItemSelectionRange> SelectedBlock() const;
    bool CanCopy() const;
    bool CanPaste() const;
    /// Pastes at the selection. False, after a message, when a cell refuses its text; then nothing changed.
    bool Paste();

    bool IsEditing() const;
    /// Takes the text being typed into the cell; false when the cell refuses it and stays open.
    bool CommitEditor();
    /// Has the host store the edited line, if one was edited since the last time. A cell left blank by a move in the
    /// table is zero; one left together with the table takes the column's fill value, as it does with the page.
    void StoreEditedLine(BlankRule blanks = BlankRule::Zero);
    void Run(GridAction action);

protected:
    bool event(QEvent* event) override;
    bool eventFilter(QObject* object, QEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void focusInEvent(QFocusEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;
    void contextMenuEvent(QContextMenuEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void changeEvent(QEvent* event) override;
    void currentChanged(const QModelIndex& current, const QModelIndex& previous) override;
    void keyboardSearch(const QString&) override {} // typing edits the cell

private:
    std::optional<QItemSelectionRange> LinesToDelete() const;
    bool LeaveField();
    bool MayGrow() const { return m_model->Rows() && m_model->Rows()->MayGrow(); }
    void FollowLine(int row, int column);
    void NextCell();
    void PreviousCell();
    void Ask(GridAction action);

    CGridModel* m_model;       // child
    CGridDelegate* m_delegate; // child
    CGridWidths* m_widths;     // child
    IGridHost* m_host = nullptr;
    int m_lastRow = 0;                   // current at the last cell move
    std::optional<RowKey> m_currentLine; // its name; nothing where the line is gone
    bool m_lineGone = false;             // and nobody has chosen another one yet
    bool m_modified = false;             // since the last cell move
    int m_branchNameColumn = 0;
    bool m_insertsBelow = false;
    LineChoice m_lineChoice = LineChoice::WholeLines;
    bool m_choosingLines = false; // the selection is being made by line numbers
    bool m_linesChosen = false;   // the selection was made so
};
