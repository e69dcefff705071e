// Somebody at the keyboard of an HD document's window, who does whatever comes to mind.
#pragma once

#include "ks/fc/hd_messages.h"
#include "module/view.h"

#include <QStringList>
#include <random>

class CGenGrid;
class QLineEdit;

class RandomUser
{
public:
    /// `other` is a view of another editor, which sends requests.
    RandomUser(CKavo0_hdView& view, CView& other, unsigned seed);

    /// One thing. What was typed into one cell or field, if that was all, is Typed() afterwards.
    void DoSomething();
    void VisitEveryPage();
    void UndoRedo(bool undo);
    /// What was done last, for the log of a failure.
    const QString& Done() const { return m_done; }
    const QString& Typed() const { return m_typed; }
    int Pick(int count) { return int(m_random() % unsigned(count)); }

private:
    CGenPropertyPage& Page() const;
    void Press(int key, Qt::KeyboardModifiers modifiers = {});
    void PressKeys(const QString& keys);
    void GoToPage(int tab);
    CGenGrid* SomeGrid();
    bool GoToSomeCell(CGenGrid& grid);
    void SelectLines(CGenGrid& grid);
    QString SomeText();

    void TypeIntoCell();
    void TypeIntoField();
    void ActOnControl();
    void Paste();
    void InsertLine();
    void DeleteLines();
    void CommandInGrid();
    void Request();
    void ChangePage();
    void Leave(bool isCell);

    CKavo0_hdView& m_view;
    CView& m_other;
    std::mt19937 m_random;
    QString m_done, m_typed;
};
