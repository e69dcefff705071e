#include "shell/view_menu.h"

#include <QMenu>
#include <algorithm>

CViewMenu::CViewMenu(CKsMDIFrameWnd& frame, QMenu& menu, List list, Keys keys, QAction* above, QObject* parent)
    : QObject(parent), m_frame(frame), m_menu(menu), m_list(list), m_keys(keys), m_above(above)
{
    connect(&menu, &QMenu::aboutToShow, this, [this] { Update(true); });
    connect(&menu, &QMenu::aboutToHide, this, [this] { Update(false); });
}

std::vector<CKsMenuCommand> CViewMenu::Commands() const
{
    const auto* target = dynamic_cast<CCommandTarget*>(m_frame.GetActiveView());
    return target ? (target->*m_list)() : std::vector<CKsMenuCommand>();
}

QString CViewMenu::TextOf(const CKsMenuCommand& command) const
{
    return m_keys == Keys::OfMenu ? command.text
                                  : command.text + u'\t' + command.shortcut.toString(QKeySequence::NativeText);
}

void CViewMenu::Fill()
{
    qDeleteAll(std::exchange(m_entries, {}));
    for (const CKsMenuCommand& command : Commands()) {
        if (command.text.isEmpty()) {
            m_entries << m_menu.insertSeparator(m_above);
            continue;
        }
        auto* action = new QAction(TextOf(command), &m_menu);
        action->setObjectName(QStringLiteral("command%1").arg(command.id));
        if (m_keys == Keys::OfMenu)
            action->setShortcut(command.shortcut);
        action->setStatusTip(command.statusTip);
        action->setData(command.id);
        connect(action, &QAction::triggered, this, [this, id = command.id] { m_frame.SendCommand(id); });
        m_menu.insertAction(m_above, action);
        m_entries << action;
    }
}

/// A command may be called as what it would do now. Commands are greyed only while the menu is open: a shortcut must
/// not depend on when it was last looked at.
void CViewMenu::Update(bool open)
{
    const auto* target = dynamic_cast<CCommandTarget*>(m_frame.GetActiveView());
    const auto commands = open ? Commands() : std::vector<CKsMenuCommand>();
    for (QAction* action : std::as_const(m_entries)) {
        if (action->isSeparator())
            continue;
        const auto command = std::ranges::find(commands, action->data().toInt(), &CKsMenuCommand::id);
        if (command != commands.end())
            action->setText(TextOf(*command));
        action->setEnabled(!open || (target && target->IsCommandEnabled(action->data().toInt())));
    }
}
