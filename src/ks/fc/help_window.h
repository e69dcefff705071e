// The window that shows the help: chapters that the frame and the editor in front make from what they declare.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <QWidget>
#include <functional>
#include <vector>

class CKsMDIFrameWnd;
class QLineEdit;
class QListWidget;
class QTextBrowser;

struct KsHelpChapter
{
    CString id; // links lead to "#id"
    CString title;
    CString html; // of the body, without the title
};
/// Called again when the language changes, so the texts are in the user's.
using KsHelpChapters = std::function<std::vector<KsHelpChapter>()>;

class KS_API CKsHelpWindow : public QWidget
{
    Q_OBJECT
public:
    /// The one of the frame; makes it if need be.
    static CKsHelpWindow& In(CKsMDIFrameWnd& frame);
    /// Shows these chapters with the one of that id in front, or, without such a one, the first.
    void Show(KsHelpChapters chapters, const CString& id);

protected:
    void changeEvent(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    explicit CKsHelpWindow(CKsMDIFrameWnd& frame);
    void Refresh();
    void FillList();
    void ShowChapter(const CString& id);
    void FindNext();

    KsHelpChapters m_make;
    std::vector<KsHelpChapter> m_chapters;
    CString m_shown;
    QLineEdit* m_words; // children
    QListWidget* m_list;
    QTextBrowser* m_text;
};
