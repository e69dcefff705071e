// The record grid: rows are locations or other lines, the row number stands in the vertical header. Rows and columns
// count from 1 in everything that its host calls.
#pragma once

#include "grid/grid_model.h"
#include "grid/grid_selection.h"

#include <QTableView>

class CFrozenColumns;
class CGridDelegate;
class CGridHeader;
class CGridInput;
class CGridWidths;
class CSelectionSummary;
class IGridHost;

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
    CGridInput& Input() const { return *m_input; }
    CGridWidths& Widths() const { return *m_widths; }
    QSize sizeHint() const override;
    QSize minimumSizeHint() const override;
    CGridSelection& Selection() const { return *m_selection; }
    CGridHeader& Header() const { return *m_header; }
    const CFrozenColumns& Frozen() const { return *m_frozen; }

    int RowCount() const { return m_model->rowCount(); }
    int ColumnCount() const { return m_model->columnCount(); }
    /// 0 when there is no current cell.
    int CurrentRow() const { return currentIndex().row() + 1; }
    int CurrentColumn() const { return currentIndex().column() + 1; }
    int FirstColumnInSight() const;
    /// Makes a cell current and shows it. A row past the end is the last row.
    void SetCurrentCell(int row, int column);
    void GotoLine(int row) { SetCurrentCell(row, FirstColumnInSight()); }
    /// The same for a line by its number in the file. One that the filter hides is shown, and the user is told.
    void ShowLine(int number, int column);
    /// Shows where a line was that is gone: no other one comes into sight for it.
    void ShowPlace(int number, int column);
    void ShowLine(int number) { ShowLine(number, FirstColumnInSight()); }
    /// The number of the current line in the file; 0 without one.
    int CurrentLine() const { return CurrentRow() > 0 ? m_model->LineNumber(CurrentRow() - 1) : 0; }
    /// Sorts or filters; the current cell goes with its line, and what was selected is no longer.
    void ChangeView(const std::function<void(CGridModel& model)>& change);
    /// The line that was current is gone, and nobody has chosen another one yet.
    bool HasLostItsLine() const { return m_goneFrom > 0; }
    QString TextAt(int row, int column) const { return m_model->index(row - 1, column - 1).data().toString(); }
    /// "Line 3 of 120", with the whole number of the current cell where the cell leaves digits out, and how many lines
    /// are shown when others are hidden.
    QString LineText() const;
    /// Names a cell in a message: "Chainage, line 3".
    QString PlaceText(const QModelIndex& cell) const;
    /// What the selected numbers come to.
    QString SelectionText() const;

    /// Column whose cells offer the branch names of the network; 0 for none.
    void SetBranchNameColumn(int column) { m_branchNameColumn = column; }
    int BranchNameColumn() const { return m_branchNameColumn; }

    /// Shows the rows as they are now; keeps the current cell.
    void Refresh();
    /// Likewise; without a current cell the first one becomes it.
    void Reload();

    /// False for a document that takes no change: the user has been told why.
    bool MayChange() const;
    /// Whether lines can be added.
    bool MayGrow() const { return m_model->Rows() && m_model->Rows()->MayGrow(); }
    /// Inserts a line where the choice of lines says; returns its row.
    int InsertLine();
    /// Selects whole lines, as clicks on their numbers do.
    void SelectLines(int first, int last) { m_selection->SelectLines(first - 1, last - 1); }
    void selectAll() override { SelectLines(1, RowCount()); }
    /// More than the current cell, in one range.
    std::optional<QItemSelectionRange> SelectedBlock() const { return m_selection->Block(); }
    void SetLineChoice(LineChoice choice) { m_selection->SetChoice(choice); }
    bool HasLinesToDelete() const { return m_selection->Lines(m_model->FixedRows()).has_value(); }
    /// Deletes the lines that are chosen. A grid left empty gets a new line, unless its rows may be none.
    bool DeleteSelectedLines();

    bool IsEditing() const;
    /// Takes the text being typed into the cell; false when the cell refuses it and stays open.
    bool CommitEditor();
    /// Has the host store the edited line, if one was edited since the last time. A cell left blank by a move in the
    /// table is zero; one left together with the table takes the column's fill value, as it does with the page.
    void StoreEditedLine(BlankRule blanks = BlankRule::Zero);
    /// A click or the space bar on a cell that acts at once.
    void ActOn(int row, int column);
    /// The way out of the grid by keyboard.
    void LeaveBackwards() { focusPreviousChild(); }

    QRect visualRect(const QModelIndex& cell) const override;
    QModelIndex indexAt(const QPoint& point) const override;
    void scrollTo(const QModelIndex& cell, ScrollHint hint = EnsureVisible) override;

protected:
    bool eventFilter(QObject* object, QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    QModelIndex moveCursor(CursorAction action, Qt::KeyboardModifiers held) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;
    void contextMenuEvent(QContextMenuEvent* event) override;
    void focusInEvent(QFocusEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void changeEvent(QEvent* event) override;
    void currentChanged(const QModelIndex& current, const QModelIndex& previous) override;
    void keyboardSearch(const QString& typed) override;
    QRegion visualRegionForSelection(const QItemSelection& selection) const override;
    void setSelection(const QRect& dragged, QItemSelectionModel::SelectionFlags command) override;
    void scrollContentsBy(int dx, int dy) override;
    void updateGeometries() override;
    bool edit(const QModelIndex& index, EditTrigger trigger, QEvent* event) override;
    using QTableView::edit;

private:
    bool LeaveField();
    bool Scatters(const QMouseEvent& click) const;
    void ShowLineMenu(const QContextMenuEvent& event);
    void FilterAfresh();
    void FollowLine(int row, int column);
    void KeepInWindow();
    void NoteLine(int row);
    int RowLikeCurrent(int row) const;
    QRect FrozenPart() const;
    void PaintCells(const QRegion& dirty);

    std::unique_ptr<CFrozenColumns> m_frozen; // the base asks for it while the others are made
    CGridModel* m_model;                      // these are children
    CGridDelegate* m_delegate;
    CGridWidths* m_widths;
    CGridSelection* m_selection;
    CGridInput* m_input;
    CGridHeader* m_header;
    CSelectionSummary* m_summary;
    IGridHost* m_host = nullptr;
    int m_lastRow = 0;                     // current at the last cell move
    std::optional<RowKey> m_currentLine;   // its name; nothing where the line is gone
    std::vector<CellValue> m_currentPlace; // what stands in its first cells
    int m_contents = 0;                    // of the document, when the rows were last shown
    int m_goneFrom = 0;                    // the row in which the line stood that was current and is gone
    bool m_modified = false;               // since the last cell move
    QPersistentModelIndex m_pressed;       // where what the mouse selects begins
    bool m_isPressRefused = false;         // what follows the press of a button is none of the table's
    int m_branchNameColumn = 0;
};
