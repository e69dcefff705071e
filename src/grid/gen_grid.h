// The record grid of the pages: rows are locations, the row number stands in the vertical header. Rows and columns
// count from 1 in everything that pages and the view call.
#pragma once

#include "grid/grid_model.h"

#include <QTableView>
#include <optional>

class CGenPropertyPage;
class CGridDelegate;
class IPageHost;
enum class GridAction;

class CGenGrid : public QTableView
{
    Q_OBJECT
public:
    explicit CGenGrid(QWidget* parent = nullptr);
    ~CGenGrid() override;

    /// Binds grid and page to each other: this is the page's grid of locations.
    void SetOwnerPage(CGenPropertyPage* page);
    /// A further grid of the page, of something else than locations.
    void SetPartOfPage(CGenPropertyPage* page);
    /// The page goes; nothing is reported or stored any more.
    void LeavePage() { m_page = nullptr; }
    bool HasPage() const { return m_page; }
    CGridModel* Model() const { return m_model; }
    CGridDelegate* Delegate() const { return m_delegate; }

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
    QStringList BranchNames() const;
    /// Every edited cell counts as a change of the line's location.
    void SetLocationOnAnyColumn(bool any) { m_locationOnAnyColumn = any; }
    /// Appending asks the page (the default) or, when false, the view's command.
    void SetAppendThroughPage(bool through) { m_appendThroughPage = through; }

    /// Shows the rows as they are now; keeps the current cell, or makes the first one current.
    void Reload();
    /// Inserts a line above the first selected range, or behind the last line; returns its row.
    int InsertLine();
    /// Selects whole lines, as clicks on their numbers do.
    void SelectLines(int first, int last);
    void selectAll() override;
    /// Deletes the selected lines when whole lines are selected - by their numbers, not cell by cell - in one range;
    /// the current line without a selection in a grid that says so. A grid left empty gets a new line, unless its rows
    /// may be none.
    bool DeleteSelectedLines();
    bool HasLinesToDelete() const { return LinesToDelete().has_value(); }
    void SetDeletesCurrentLine(bool deletes) { m_deletesCurrentLine = deletes; }
    /// A click or the space bar on a cell that acts at once.
    void ActOn(int row, int column);
    void GotoLine(int row);
    /// Looks for a line from `row` on (0 is taken as 1). On success the line becomes current, and `row` is the one
    /// behind it; otherwise `row` is 0. `chainage` is in metres, and compared as shown in the chainage column.
    bool SearchRows(int& row, const QString& name, double chainage, int chainageCriterion, int nameCriterion);

    bool CanCopy() const;
    void Copy() const;
    bool CanPaste() const;
    /// Pastes at the selection. False, after a message, when a cell refuses its text; then nothing changed.
    bool Paste();

    /// Takes the text being typed into the cell; false when the cell refuses it and stays open.
    bool CommitEditor();
    /// Has the view store the edited line, if one was edited since the last time. A cell left blank by a move in the
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
    IPageHost* Host() const;
    bool IsLocationGrid() const;
    std::optional<QItemSelectionRange> SelectedBlock() const; // more than the current cell, in one range
    std::optional<QItemSelectionRange> LinesToDelete() const;
    void NextCell();
    void PreviousCell();
    void AppendLine();
    void Execute(int command);
    void CellModified(int row, int column);
    void UpdateRowHeader();
    void SetColumnWidths(int first);
    int WidthOfTexts(int column, int firstRow) const;
    void MakeRoomForDigits();

    CGridModel* m_model;       // child
    CGridDelegate* m_delegate; // child
    CGenPropertyPage* m_page = nullptr;
    int m_lastRow = 0, m_lastColumn = 0; // current at the last cell move
    bool m_modified = false;             // since the last cell move
    int m_modifiedColumn = 0;            // the leftmost one
    bool m_appendThroughPage = true;
    int m_branchNameColumn = 0;
    bool m_locationOnAnyColumn = false;
    bool m_deletesCurrentLine = false;
    bool m_choosingLines = false; // the selection is being made by line numbers
    bool m_linesChosen = false;   // the selection was made so
    int m_widthsSet = 0;          // of so many columns; from then on they are the user's
};
