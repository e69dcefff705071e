#include "shell/lines_menu.h"

#include "ks/fc/frames.h"

#include <QMenu>
#include <algorithm>

CLinesMenu::CLinesMenu(CKsMDIFrameWnd& frame, QMenu& menu, QObject* parent)
    : QObject(parent), m_frame(frame), m_menu(menu)
{
    connect(&menu, &QMenu::aboutToShow, this, [this] { Update(true); });
    connect(&menu, &QMenu::aboutToHide, this, [this] { Update(false); });
}

void CLinesMenu::Fill()
{
    m_menu.clear();
    const auto* target = dynamic_cast<CCommandTarget*>(m_frame.GetActiveView());
    for (const CKsMenuCommand& command : target ? target->LinesMenu() : std::vector<CKsMenuCommand>()) {
        if (command.text.isEmpty()) {
            m_menu.addSeparator();
            continue;
        }
        QAction* action = m_menu.addAction(command.text);
        action->setObjectName(QStringLiteral("command%1").arg(command.id));
        action->setShortcut(command.shortcut);
        action->setStatusTip(command.statusTip);
        action->setData(command.id);
        connect(action, &QAction::triggered, this, [this, id = command.id] { m_frame.SendCommand(id); });
    }
}

/// A command may be called as what it would do now. Commands are greyed only while the menu is open: a shortcut must
/// not depend on when it was last looked at.
void CLinesMenu::Update(bool open)
{
    const auto* target = dynamic_cast<CCommandTarget*>(m_frame.GetActiveView());
    const auto commands = open && target ? target->LinesMenu() : std::vector<CKsMenuCommand>();
    const auto actions = m_menu.actions();
    for (QAction* action : actions) {
        const auto command = std::ranges::find(commands, action->data().toInt(), &CKsMenuCommand::id);
        if (!action->isSeparator() && command != commands.end())
            action->setText(command->text);
        if (!action->isSeparator())
            action->setEnabled(!open || (target && target->IsCommandEnabled(action->data().toInt())));
    }
}
