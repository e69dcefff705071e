#include "profile/profile_dock.h"

#include "ks/fc/frames.h"
#include "ks/fc/shown_text.h"
#include "profile/profile_texts.h"

#include <QCloseEvent>
#include <QSettings>
#include <QStackedWidget>

namespace {

const QString Name = QStringLiteral("longProfileDock");
constexpr int FirstHeight = 330;
const QString WantedKey = QStringLiteral("LongProfile/shown");

} // namespace

CProfileDock::CProfileDock(CKsMDIFrameWnd& frame) : QDockWidget(&frame), m_panels(new QStackedWidget(this))
{
    setObjectName(Name);
    setWidget(m_panels);
    if (!frame.restoreDockWidget(this)) // where the user had it
        frame.addDockWidget(Qt::BottomDockWidgetArea, this);
    if (!isFloating() && height() < FirstHeight)
        frame.resizeDocks({this}, {FirstHeight}, Qt::Vertical);
    connect(m_panels, &QStackedWidget::currentChanged, this, [this](int index) {
        Retranslate();
        if (index < 0)
            hide();
    });
    Retranslate();
}

CProfileDock* CProfileDock::Of(const CKsMDIFrameWnd* frame)
{
    return frame ? frame->findChild<CProfileDock*>(Name, Qt::FindDirectChildrenOnly) : nullptr;
}

CProfileDock& CProfileDock::In(CKsMDIFrameWnd& frame)
{
    CProfileDock* dock = Of(&frame);
    return *(dock ? dock : new CProfileDock(frame));
}

bool CProfileDock::IsWanted()
{
    return QSettings().value(WantedKey, false).toBool();
}

void CProfileDock::Want(bool shown)
{
    QSettings().setValue(WantedKey, shown);
    setVisible(shown);
}

void CProfileDock::ShowPanel(QWidget& panel)
{
    if (m_panels->indexOf(&panel) < 0)
        m_panels->addWidget(&panel);
    m_panels->setCurrentWidget(&panel);
    Retranslate();
}

void CProfileDock::Retranslate()
{
    const QString title = ProfileTexts::tr("Long Profile");
    const QString document = m_panels->currentWidget() ? m_panels->currentWidget()->windowTitle() : QString();
    setWindowTitle(document.isEmpty() ? title : QStringLiteral("%1 - %2").arg(title, KsTitleText(document)));
}

void CProfileDock::changeEvent(QEvent* event)
{
    QDockWidget::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        Retranslate();
}

/// By the user: a program that ends closes nothing but its main frame.
void CProfileDock::closeEvent(QCloseEvent* event)
{
    QDockWidget::closeEvent(event);
    if (event->isAccepted())
        QSettings().setValue(WantedKey, false);
}
