#include "shell/application.h"

#include "ks/fc/message_box.h"

#include <new>
#include <utility>

bool CApplication::notify(QObject* receiver, QEvent* event)
{
    try {
        return QApplication::notify(receiver, event);
    } catch (const std::bad_alloc&) {
        TellLater();
        return true;
    }
}

/// When what had taken the memory has been given up, and once at a time: to tell it needs memory, too.
void CApplication::TellLater()
{
    if (std::exchange(m_tells, true))
        return;
    try {
        QMetaObject::invokeMethod(this, &CApplication::Tell, Qt::QueuedConnection);
    } catch (const std::bad_alloc&) {
        m_tells = false;
    }
}

void CApplication::Tell()
{
    try {
        KsMessageBox(tr("There is not enough memory for what was asked for last: it was not done, or not wholly. Save "
                        "your work, and close other documents or programs."));
    } catch (const std::bad_alloc&) { // whoever needs memory next is told
    }
    m_tells = false;
}
