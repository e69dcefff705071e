// The Edit menu: undo and redo of the active document; cut, copy and paste where the focus is.
#include "shell/main_frame.h"

#include <QAction>
#include <QApplication>
#include <QKeyEvent>
#include <QLineEdit>
#include <QUndoStack>

namespace {

/// The nearest one around the focus that knows commands.
CCommandTarget* FocusTarget(int command)
{
    for (QWidget* widget = QApplication::focusWidget(); widget; widget = widget->parentWidget()) {
        auto* target = dynamic_cast<CCommandTarget*>(widget);
        if (target && target->IsCommandEnabled(command))
            return target;
    }
    return nullptr;
}

} // namespace

void CMainFrame::OnUndo()
{
    m_undo.undo();
}

void CMainFrame::OnRedo()
{
    m_undo.redo();
}

void CMainFrame::OnCut()
{
    RouteEdit(KsCommand::Cut, QKeySequence::Cut);
}

void CMainFrame::OnCopy()
{
    RouteEdit(KsCommand::Copy, QKeySequence::Copy);
}

void CMainFrame::OnPaste()
{
    RouteEdit(KsCommand::Paste, QKeySequence::Paste);
}

/// What has the focus knows what these keys mean to it: the menu names them and, when chosen, presses them.
void CMainFrame::RouteEdit(int command, QKeySequence::StandardKey key)
{
    if (auto* target = FocusTarget(command); target && target->OnCommand(command))
        return;
    const QPointer<QWidget> focus = QApplication::focusWidget();
    const QKeySequence sequence(key);
    if (!focus || sequence.isEmpty())
        return;
    const QKeyCombination combination = sequence[0];
    QKeyEvent press(QEvent::KeyPress, combination.key(), combination.keyboardModifiers());
    QApplication::sendEvent(focus, &press);
    if (!focus)
        return;
    QKeyEvent release(QEvent::KeyRelease, combination.key(), combination.keyboardModifiers());
    QApplication::sendEvent(focus, &release);
}

bool CMainFrame::CanEdit(int command) const
{
    if (FocusTarget(command))
        return true;
    const QWidget* focus = QApplication::focusWidget();
    if (const auto* line = qobject_cast<const QLineEdit*>(focus)) {
        if (command == KsCommand::Paste)
            return !line->isReadOnly();
        return line->hasSelectedText() && (command == KsCommand::Copy || !line->isReadOnly());
    }
    // A grid copies and pastes; nothing else in a document window does.
    return focus && command != KsCommand::Cut && focus->inherits("QAbstractItemView");
}

void CMainFrame::UpdateEditMenu()
{
    Action("actionCut")->setEnabled(CanEdit(KsCommand::Cut));
    Action("actionCopy")->setEnabled(CanEdit(KsCommand::Copy));
    Action("actionPaste")->setEnabled(CanEdit(KsCommand::Paste));
}

void CMainFrame::UpdateUndoTexts()
{
    const QUndoStack* stack = m_undo.activeStack();
    QAction *undo = Action("actionUndo"), *redo = Action("actionRedo");
    undo->setEnabled(m_undo.canUndo());
    redo->setEnabled(m_undo.canRedo());
    undo->setText(tr("&Undo %1").arg(stack ? stack->undoText() : QString()).trimmed());
    redo->setText(tr("&Redo %1").arg(stack ? stack->redoText() : QString()).trimmed());
}
