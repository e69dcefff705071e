// The bar above the pages that says what the document's file is when it is not simply what the pages show.
#pragma once

#include "document/document.h"

#include <QFrame>
#include <QPointer>

class CFindingsDialog;
class QLabel;
class QPushButton;
class QToolButton;

/// Hidden while there is nothing to say. After an open it also shows the list of what was not taken, once the window
/// has been painted.
class CFileBar : public QFrame
{
    Q_OBJECT
public:
    CFileBar(CKavo0_hdDoc& document, QWidget* parent);

    /// The places of the file that were not taken as they stand; not modal.
    void ShowList();

protected:
    void changeEvent(QEvent* event) override;

private:
    void Refresh();
    CString Text() const;

    CKavo0_hdDoc& m_document;
    QLabel* m_text; // children
    QPushButton* m_list;
    QPushButton* m_edit;
    QToolButton* m_close;
    QPointer<CFindingsDialog> m_dialog;
};
