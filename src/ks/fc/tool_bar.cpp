#include "ks/fc/frames.h"

#include <QAction>
#include <QIcon>

CKsToolBarEx::CKsToolBarEx(QWidget* parent) : QToolBar(parent) {}

bool CKsToolBarEx::Create(CKsMDIFrameWnd* frame, unsigned style, unsigned)
{
    if (!frame)
        return false;
    m_frame = frame;
    m_style = style;
    setIconSize(QSize(16, 16));
    connect(frame, &CKsMDIFrameWnd::CommandStateChanged, this, &CKsToolBarEx::UpdateButtons);
    return true;
}

bool CKsToolBarEx::LoadToolBar(const std::vector<CKsToolBarButton>& buttons)
{
    if (buttons.empty() || !m_frame)
        return false;
    clear();
    for (const CKsToolBarButton& button : buttons) {
        if (button.command == 0) {
            addSeparator();
            continue;
        }
        QAction* action = addAction(QIcon(QString::fromUtf8(button.icon)), button.text.section(u'\n', 1));
        action->setObjectName(QStringLiteral("command%1").arg(button.command));
        action->setData(button.command);
        action->setStatusTip(button.text.section(u'\n', 0, 0));
        connect(action, &QAction::triggered, this, [this, command = button.command] {
            if (m_frame)
                m_frame->SendCommand(command);
        });
    }
    UpdateButtons();
    return true;
}

void CKsToolBarEx::EnableDocking(unsigned sides)
{
    setAllowedAreas((sides & CBRS_ALIGN_LEFT ? Qt::LeftToolBarArea : Qt::NoToolBarArea) |
                    (sides & CBRS_ALIGN_TOP ? Qt::TopToolBarArea : Qt::NoToolBarArea) |
                    (sides & CBRS_ALIGN_RIGHT ? Qt::RightToolBarArea : Qt::NoToolBarArea) |
                    (sides & CBRS_ALIGN_BOTTOM ? Qt::BottomToolBarArea : Qt::NoToolBarArea));
    if (m_frame)
        m_frame->addToolBar(Qt::TopToolBarArea, this);
}

void CKsToolBarEx::UpdateButtons()
{
    const auto* target = m_frame ? dynamic_cast<CCommandTarget*>(m_frame->GetActiveView()) : nullptr;
    for (QAction* action : actions()) {
        if (!action->isSeparator())
            action->setEnabled(target && target->IsCommandEnabled(action->data().toInt()));
    }
}
