#include "shell/edit_router.h"

#include "ks/fc/frames.h"

#include <QApplication>
#include <QKeyEvent>
#include <QLineEdit>

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

QKeySequence KeyOf(int command)
{
    return command == KsCommand::Cut    ? QKeySequence::Cut
           : command == KsCommand::Copy ? QKeySequence::Copy
                                        : QKeySequence::Paste;
}

} // namespace

/// What has the focus knows what these keys mean to it: the menu names them and, when chosen, presses them.
void CEditRouter::Run(int command) const
{
    if (auto* target = FocusTarget(command); target && target->OnCommand(command))
        return;
    const QKeySequence sequence = KeyOf(command);
    if (sequence.isEmpty())
        return;
    const QPointer<QWidget> focus = QApplication::focusWidget();
    for (const QEvent::Type type : {QEvent::KeyPress, QEvent::KeyRelease}) {
        if (!focus)
            return;
        QKeyEvent event(type, sequence[0].key(), sequence[0].keyboardModifiers());
        QApplication::sendEvent(focus, &event);
    }
}

bool CEditRouter::Can(int command) const
{
    if (FocusTarget(command))
        return true;
    const QWidget* focus = QApplication::focusWidget();
    if (const auto* line = qobject_cast<const QLineEdit*>(focus)) {
        if (command == KsCommand::Paste)
            return !line->isReadOnly();
        return line->hasSelectedText() && (command == KsCommand::Copy || !line->isReadOnly());
    }
    // A grid cuts, copies and pastes; nothing else in a document window does.
    return focus && focus->inherits(command == KsCommand::Cut ? "QTableView" : "QAbstractItemView");
}
