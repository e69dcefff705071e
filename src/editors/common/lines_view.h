// The view of a table of lines: what is typed is stored or refused, never dropped.
#pragma once

#include <QPointer>
#include <QTableView>

class CLinesTable;

class CLinesView : public QTableView
{
    Q_OBJECT
public:
    /// The model outlives the view.
    CLinesView(CLinesTable* model, const QString& name);

    /// Makes a cell current and its line the only one selected, whatever keys are held: it is not the user of this
    /// table who moves. Without such a cell nothing is current or selected.
    void GoTo(int row, int column);
    bool IsEditing() const { return m_editor != nullptr; }
    /// Stores what is being typed. False when it cannot be: the user has been told why, and the cell's editor stays
    /// open with the focus.
    bool Store();
    /// Makes the columns as wide as what is in them.
    void FitColumns();

protected:
    void commitData(QWidget* editor) override;
    void closeEditor(QWidget* editor, QAbstractItemDelegate::EndEditHint hint) override;
    void mousePressEvent(QMouseEvent* event) override;

private:
    friend class CLinesDelegate;
    void Refused(const QString& message);
    void Tell();
    void WidenColumns();

    QPointer<QWidget> m_editor; // of the cell that is being edited
    QString m_refusal;          // what the user has not been told yet
    bool m_committing = false, m_kept = false, m_telling = false;
};
