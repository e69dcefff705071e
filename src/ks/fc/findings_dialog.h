// The places of a file that were not taken as they stand, as a table.
#pragma once

#include "files/finding.h"
#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <QAbstractTableModel>
#include <QDialog>

class QLabel;
class QPushButton;
class QTableView;

/// A row a place: where it is, what stands there, what was expected, what is used instead.
class KS_API CKsFindingsModel : public QAbstractTableModel
{
    Q_OBJECT
public:
    CKsFindingsModel(std::vector<Finding> findings, QObject* parent);

    int rowCount(const QModelIndex& parent = {}) const override;
    int columnCount(const QModelIndex& parent = {}) const override;
    QVariant data(const QModelIndex& index, int role) const override;
    QVariant headerData(int section, Qt::Orientation orientation, int role) const override;
    /// Captions and rows, parted by tabs.
    QString Text(const QModelIndexList& rows) const;
    void Retranslate();

private:
    std::vector<Finding> m_findings;
};

/// What stands at a place, what was expected there and what is used instead: a sentence in the user's language.
KS_API CString KsFindingSentence(const Finding& finding);

/// Not modal; deletes itself when it is closed.
class KS_API CKsFindingsDialog : public QDialog
{
    Q_OBJECT
public:
    CKsFindingsDialog(const CString& path, std::vector<Finding> findings, QWidget* parent);

protected:
    void changeEvent(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    void Retranslate();
    void ShareWidth();
    void Copy();

    CString m_name;
    CKsFindingsModel* m_model; // children
    QLabel* m_text;
    QTableView* m_table;
    QPushButton* m_copy;
    QPushButton* m_close;
};
