// The window beside the document windows that shows the long profile of the HD document in front.
#pragma once

#include "ks/fc/dock.h"

class QStackedWidget;

class CProfileDock : public CKsDock
{
    Q_OBJECT
public:
    inline static const QString Name = QStringLiteral("longProfileDock");

    explicit CProfileDock(CKsMDIFrameWnd& frame);
    /// Brings the profile of a document to the front, whose title is that of the panel. A panel that goes leaves;
    /// without any the dock is hidden until the next one comes.
    void ShowPanel(QWidget& panel);

protected:
    void Retranslate() override;

private:
    QStackedWidget* m_panels;
};
