// The commands of the Edit menu.
#pragma once

#include <QUndoGroup>

/// Takes the commands of the Edit menu to where they belong: undo and redo to the active document; cut, copy and paste
/// (KsCommand) to what has the focus.
class CEditRouter
{
public:
    /// The undo stacks of all documents.
    QUndoGroup& History() { return m_history; }
    /// Cuts, copies or pastes.
    void Run(int command) const;
    bool Can(int command) const;

private:
    QUndoGroup m_history;
};
