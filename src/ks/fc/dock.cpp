#include "ks/fc/dock.h"

#include "ks/fc/frames.h"

#include <QCloseEvent>
#include <QSettings>
#include <QTimer>
#include <algorithm>

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
    if (!frame.restoreDockWidget(this)) { // where the user had it
        frame.addDockWidget(Qt::BottomDockWidgetArea, this);
        for (auto* other : frame.findChildren<CKsDock*>(Qt::FindDirectChildrenOnly))
            if (other != this && frame.dockWidgetArea(other) == Qt::BottomDockWidgetArea)
                frame.tabifyDockWidget(other, this);
    }
    // Once it has its place: before, the frame does not know how high it is.
    QTimer::singleShot(0, this, [this, &frame, firstHeight] {
        const int wanted = std::min(firstHeight, frame.height() * 3 / 10); // the documents keep most of the room
        if (!isFloating() && height() < wanted)
            frame.resizeDocks({this}, {wanted}, Qt::Vertical);
    });
}

bool CKsDock::IsWanted(const QString& name)
{
    return QSettings().value(WantedKey(name), false).toBool();
}

void CKsDock::Want(bool shown)
{
    QSettings().setValue(WantedKey(objectName()), shown);
    setVisible(shown);
    if (shown)
        raise();
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
