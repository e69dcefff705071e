// The list of problems with what narrows it down, and what is known about the one that is chosen.
#pragma once

#include "rules/rule.h"

#include <QWidget>

class CProblemsFilter;
class CProblemsModel;
class QModelIndex;
class QLabel;
class QLineEdit;
class QPushButton;
class QTableView;
class QToolButton;

class CProblemsPanel : public QWidget
{
    Q_OBJECT
public:
    CProblemsPanel(CProblemsModel& model, QWidget* parent);

    /// Leads to the problem behind the one that is chosen, or before it; around the ends of the list.
    void Step(bool forward);
    /// The list has the keyboard.
    void TakeFocus();
    /// "2 errors, 1 warning": of all there are, in sight or not. Empty without any.
    QString Summary() const;

signals:
    void SummaryChanged();

protected:
    void changeEvent(QEvent* event) override;
    bool eventFilter(QObject* object, QEvent* event) override;

private:
    QToolButton* MakeSwitch(Severity severity);
    void MakeTable();
    void Retranslate();
    void Update();
    void ShowChosen();
    void GoTo(const QModelIndex& row);
    void MendChosen();
    void Copy() const;
    QModelIndex Chosen() const;
    void OpenMenu(const QPoint& place);

    CProblemsModel& m_model;
    CProblemsFilter* m_filter; // children
    QToolButton* m_switches[3];
    QLineEdit* m_words;
    QTableView* m_table;
    QLabel* m_text;
    QPushButton* m_mend;
};
