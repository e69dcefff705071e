// The bar above a view that says what the document's file is when it is not simply what the view shows.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <QFrame>
#include <QPointer>

class CKsFindingsDialog;
class CKsProjectDoc;
class QLabel;
class QPushButton;
class QToolButton;

/// Hidden while there is nothing to say. After an open it also shows the list of what was not taken, once the window
/// has been painted.
class KS_API CKsFileBar : public QFrame
{
    Q_OBJECT
public:
    CKsFileBar(CKsProjectDoc& document, QWidget* parent);

    /// The places of the file that were not taken as they stand; not modal.
    void ShowList();

protected:
    void changeEvent(QEvent* event) override;

private:
    void Refresh();
    CString Text() const;

    CKsProjectDoc& m_document;
    QLabel* m_text; // children
    QPushButton* m_list;
    QPushButton* m_edit;
    QToolButton* m_close;
    QPointer<CKsFindingsDialog> m_dialog;
};
