// The dialog that lists what can be recovered.
#pragma once

#include "shell/recovery.h"

#include <QDialog>
#include <vector>

class QPushButton;
class QTableWidget;

/// A line for each document, and what can be done with the current one. What is left when it is closed is offered at
/// the next start. Deletes itself.
class CRecoveryDialog : public QDialog
{
    Q_OBJECT
public:
    /// `items` are not empty.
    CRecoveryDialog(CRecovery& recovery, std::vector<CRecoverable> items, QWidget* parent);

private:
    void Fill();
    void DescribeNext();
    QString Description(const CRecoverable& item, const std::optional<Differences>& differences) const;
    int CurrentRow() const;
    void UpdateButtons();
    void Open();
    void Compare();
    void Discard();
    void Remove(int row);

    CRecovery& m_recovery;
    std::vector<CRecoverable> m_items;
    std::size_t m_described = 0; // how many lines say what differs
    QTableWidget* m_table;       // children
    QPushButton *m_open, *m_compare, *m_discard;
};
