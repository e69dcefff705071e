// The window beside the document windows that shows the long profile of the HD document in front.
#pragma once

#include <QDockWidget>

class CKsMDIFrameWnd;
class QStackedWidget;

class CProfileDock : public QDockWidget
{
    Q_OBJECT
public:
    /// The one of the frame; null before it was first wanted.
    static CProfileDock* Of(const CKsMDIFrameWnd* frame);
    /// Makes it if need be.
    static CProfileDock& In(CKsMDIFrameWnd& frame);
    /// Whether the user had it in sight last.
    static bool IsWanted();
    /// Shows it, or hides it: as the user wants it from now on.
    void Want(bool shown);
    /// Brings the profile of a document to the front, whose title is that of the panel. A panel that goes leaves;
    /// without any the dock is hidden until the next one comes.
    void ShowPanel(QWidget& panel);

protected:
    void changeEvent(QEvent* event) override;
    void closeEvent(QCloseEvent* event) override;

private:
    explicit CProfileDock(CKsMDIFrameWnd& frame);
    void Retranslate();

    QStackedWidget* m_panels;
};
