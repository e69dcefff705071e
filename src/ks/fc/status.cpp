#include "ks/fc/status.h"

#include <QCoreApplication>
#include <QStatusTipEvent>
#include <QWidget>

void KsTellStatus(const QWidget& inside, const CString& text)
{
    QStatusTipEvent tip(text);
    QCoreApplication::sendEvent(inside.window(), &tip);
}
