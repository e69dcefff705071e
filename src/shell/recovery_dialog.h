// The dialog that lists what can be recovered.
#pragma once

#include "files/process_copy.h"
#include "shell/recovery.h"

#include <QDialog>
#include <memory>
#include <vector>

class QPushButton;
class QSocketNotifier;
class QTableWidget;

/// A line for each document, and what can be done with the current one. What is left when it is closed is offered at
/// the next start. Deletes itself.
class CRecoveryDialog : public QDialog
{
    Q_OBJECT
public:
    /// `items` are not empty.
    CRecoveryDialog(CRecovery& recovery, std::vector<CRecoverable> items, QWidget* parent);
    ~CRecoveryDialog() override;

private:
    void Fill();
    void DescribeNext();
    void Described();
    ProcessCopy::Answer Look(CRecoverable item) const;
    QString Description(const CRecoverable& item) const;
    int CurrentRow() const;
    void UpdateButtons();
    void Open();
    void Compare();
    void Discard();
    void Remove(int row);

    CRecovery& m_recovery;
    std::vector<CRecoverable> m_items;
    std::size_t m_described = 0; // how many lines say what differs; a copy of the process looks at the next
    std::optional<ProcessCopy> m_look;
    std::unique_ptr<QSocketNotifier> m_lookEnds;
    QTableWidget* m_table; // children
    QPushButton *m_open, *m_compare, *m_discard;
};
