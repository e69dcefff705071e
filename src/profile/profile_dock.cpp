#include "profile/profile_dock.h"

#include "ks/fc/frames.h"
#include "ks/fc/shown_text.h"
#include "profile/profile_texts.h"

#include <QStackedWidget>

namespace {
constexpr int FirstHeight = 330;
} // namespace

CProfileDock::CProfileDock(CKsMDIFrameWnd& frame)
    : CKsDock(frame, Name, new QStackedWidget, FirstHeight), m_panels(static_cast<QStackedWidget*>(widget()))
{
    connect(m_panels, &QStackedWidget::currentChanged, this, [this](int index) {
        Retranslate();
        if (index < 0)
            hide();
    });
    Retranslate();
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
