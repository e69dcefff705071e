// The problems of all open documents as a table.
#pragma once

#include "problems/problem_host.h"

#include <QAbstractTableModel>
#include <optional>
#include <vector>

class CKsMDIFrameWnd;
class CProblemCheck;

class CProblemsModel : public QAbstractTableModel
{
    Q_OBJECT
public:
    enum Column
    {
        What,
        Page,
        Line,
        FieldName,
        Document,
        Code,
        Columns
    };
    /// Of the first column: the severity as a number, and what rows are sorted by, the order of the file within it.
    static constexpr int SeverityRole = Qt::UserRole, SortRole = Qt::UserRole + 1;

    using QAbstractTableModel::QAbstractTableModel;

    /// The one of the frame; makes it if need be.
    static CProblemsModel& In(CKsMDIFrameWnd& frame);
    /// Until it goes.
    void Add(CProblemCheck& check);
    struct Row
    {
        CProblemCheck* check;
        RuleId rule;
        std::optional<Problem> problem; // none for one of the file
        ProblemWhere where;
        QString text; // of one of the file
    };
    const Row& At(int row) const { return m_rows[std::size_t(row)]; }
    /// How many problems of a severity there are, with those that are not listed.
    std::size_t Count(Severity severity) const;
    /// Places and words anew, as after a change of language or units.
    void Retranslate();

    int rowCount(const QModelIndex& parent = {}) const override { return parent.isValid() ? 0 : int(m_rows.size()); }
    int columnCount(const QModelIndex& parent = {}) const override { return parent.isValid() ? 0 : Columns; }
    QVariant data(const QModelIndex& index, int role) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;

signals:
    /// There may be other problems, or another number of them.
    void Counted();

private:
    void Take(CProblemCheck& check);
    static std::vector<Row> RowsOf(CProblemCheck& check);
    void Drop(const CProblemCheck* check);
    QString Text(const Row& row, int column) const;

    std::vector<CProblemCheck*> m_checks;
    std::vector<Row> m_rows; // document after document
};
