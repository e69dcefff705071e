// The bar above a view that says what the document's file is when it is not simply what the view shows.
#pragma once

#include "ks/fc/file_notice.h"
#include "ks/ks_export.h"

#include <QFrame>
#include <QPointer>
#include <vector>

class CKsFindingsDialog;
class CKsProjectDoc;
class QLabel;
class QPushButton;
class QScrollArea;
class QToolButton;

/// One row for each notice of the document; hidden while there is none. It takes no more than its share of the view,
/// and scrolls when that is not enough. After an open it also shows the list of what was not taken, once the window has
/// been painted.
class KS_API CKsFileBar : public QFrame
{
    Q_OBJECT
public:
    CKsFileBar(CKsProjectDoc& document, QWidget* parent);

    /// The places of the file that were not taken as they stand; not modal.
    void ShowList();

protected:
    void changeEvent(QEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override; // of the view

private:
    /// The widgets that show one notice, children of the bar; they stay for what is shown there next.
    struct Row
    {
        QWidget* widget = nullptr;
        QLabel* text = nullptr;
        QWidget* actions = nullptr; // holds the buttons
        std::vector<QPushButton*> buttons{};
        QToolButton* close = nullptr;
    };

    void Refresh();
    void KeepHeight();
    void ReturnFocus();
    Row MakeRow(std::size_t number);
    void Show(Row& row, std::size_t number);
    void Run(std::size_t number, std::size_t action);

    CKsProjectDoc& m_document;
    std::vector<KsFileNotice> m_notices; // as they are shown
    std::vector<Row> m_rows;             // at least as many; the others are hidden
    QScrollArea* m_area;                 // child, holds the rows
    QPointer<QWidget> m_before;          // had the focus before it came into the bar
    QPointer<CKsFindingsDialog> m_dialog;
};
