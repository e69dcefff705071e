#include "ks/fc/dock.h"

#include "ks/fc/frames.h"

#include <QCloseEvent>
#include <QSettings>

namespace {

QString WantedKey(const QString& name)
{
    return name + QStringLiteral("/shown");
}

} // namespace

CKsDock::CKsDock(CKsMDIFrameWnd& frame, const QString& name, QWidget* content, int firstHeight) : QDockWidget(&frame)
{
    setObjectName(name);
    content->setParent(this);
    setWidget(content);
    if (!frame.restoreDockWidget(this)) // where the user had it
        frame.addDockWidget(Qt::BottomDockWidgetArea, this);
    if (!isFloating() && height() < firstHeight)
        frame.resizeDocks({this}, {firstHeight}, Qt::Vertical);
}

bool CKsDock::IsWanted(const QString& name)
{
    return QSettings().value(WantedKey(name), false).toBool();
}

void CKsDock::Want(bool shown)
{
    QSettings().setValue(WantedKey(objectName()), shown);
    setVisible(shown);
}

void CKsDock::changeEvent(QEvent* event)
{
    QDockWidget::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        Retranslate();
}

/// By the user: a program that ends closes nothing but its main frame.
void CKsDock::closeEvent(QCloseEvent* event)
{
    QDockWidget::closeEvent(event);
    if (event->isAccepted())
        QSettings().setValue(WantedKey(objectName()), false);
}
