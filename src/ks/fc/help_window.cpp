#include "ks/fc/help_window.h"

#include "ks/fc/frames.h"
#include "ks/units/edit_fields.h"

#include <QEvent>
#include <QKeyEvent>
#include <QLineEdit>
#include <QListWidget>
#include <QShortcut>
#include <QSplitter>
#include <QTextBrowser>
#include <QTextDocumentFragment>
#include <QUrl>
#include <QVBoxLayout>
#include <algorithm>

namespace {
constexpr int IdRole = Qt::UserRole;
} // namespace

CKsHelpWindow::CKsHelpWindow(CKsMDIFrameWnd& frame)
    : QWidget(&frame, Qt::Window),
      m_words(new QLineEdit(this)),
      m_list(new QListWidget(this)),
      m_text(new QTextBrowser(this))
{
    setObjectName(QStringLiteral("helpWindow"));
    m_words->setClearButtonEnabled(true);
    m_text->setOpenLinks(false);
    auto* left = new QWidget(this);
    auto* column = new QVBoxLayout(left);
    column->setContentsMargins(0, 0, 0, 0);
    column->addWidget(m_words);
    column->addWidget(m_list);
    auto* splitter = new QSplitter(this);
    splitter->addWidget(left);
    splitter->addWidget(m_text);
    splitter->setStretchFactor(1, 1);
    splitter->setSizes({230, 700});
    (new QVBoxLayout(this))->addWidget(splitter);
    resize(940, 640);
    setTabOrder(m_words, m_list);
    setTabOrder(m_list, m_text);

    connect(m_words, &QLineEdit::textChanged, this, &CKsHelpWindow::FillList);
    connect(m_words, &QLineEdit::returnPressed, this, &CKsHelpWindow::FindNext);
    connect(m_list, &QListWidget::currentItemChanged, this, [this](const QListWidgetItem* item) {
        if (item)
            ShowChapter(item->data(IdRole).toString());
    });
    connect(m_text, &QTextBrowser::anchorClicked, this, [this](const QUrl& link) {
        m_words->clear(); // every chapter is there
        ShowChapter(link.fragment());
    });
    connect(new QShortcut(QKeySequence::Find, this), &QShortcut::activated, this, [this] {
        m_words->setFocus();
        m_words->selectAll();
    });
}

CKsHelpWindow& CKsHelpWindow::In(CKsMDIFrameWnd& frame)
{
    auto* window = frame.findChild<CKsHelpWindow*>(QString(), Qt::FindDirectChildrenOnly);
    return *(window ? window : new CKsHelpWindow(frame));
}

void CKsHelpWindow::Show(KsHelpChapters chapters, const CString& id)
{
    m_make = std::move(chapters);
    m_shown = id;
    m_words->clear();
    Refresh();
    show();
    raise();
    activateWindow();
    m_text->setFocus();
}

void CKsHelpWindow::Refresh()
{
    setWindowTitle(tr("Help"));
    KsShowHint(*m_words, tr("Words to look for"));
    m_list->setAccessibleName(tr("Chapters"));
    m_text->setAccessibleName(tr("Text of the chapter"));
    m_chapters = m_make ? m_make() : std::vector<KsHelpChapter>();
    FillList();
    ShowChapter(m_shown);
}

/// The chapters that have every word that is looked for.
void CKsHelpWindow::FillList()
{
    const QSignalBlocker quiet(m_list);
    m_list->clear();
    const QStringList words = m_words->text().split(u' ', Qt::SkipEmptyParts);
    for (const KsHelpChapter& chapter : m_chapters) {
        const QString text = words.isEmpty()
                                 ? QString()
                                 : chapter.title + u'\n' + QTextDocumentFragment::fromHtml(chapter.html).toPlainText();
        const auto isThere = [&text](const QString& word) { return text.contains(word, Qt::CaseInsensitive); };
        if (!std::ranges::all_of(words, isThere))
            continue;
        auto* item = new QListWidgetItem(chapter.title, m_list);
        item->setData(IdRole, chapter.id);
        if (chapter.id == m_shown)
            m_list->setCurrentItem(item);
    }
}

void CKsHelpWindow::ShowChapter(const CString& id)
{
    auto chapter = std::ranges::find(m_chapters, id, &KsHelpChapter::id);
    if (chapter == m_chapters.end())
        chapter = m_chapters.begin();
    if (chapter == m_chapters.end())
        return m_text->clear();
    m_shown = chapter->id;
    m_text->setHtml(QStringLiteral("<h2>%1</h2>%2").arg(chapter->title.toHtmlEscaped(), chapter->html));
    const QSignalBlocker quiet(m_list);
    for (int row = 0; row < m_list->count(); ++row)
        if (m_list->item(row)->data(IdRole).toString() == m_shown)
            m_list->setCurrentRow(row);
}

/// In the chapter that is shown; behind its last place, in the next one that has the words.
void CKsHelpWindow::FindNext()
{
    const QString word = m_words->text().split(u' ', Qt::SkipEmptyParts).value(0);
    if (word.isEmpty() || m_list->count() == 0)
        return;
    if (m_list->currentRow() < 0)
        m_list->setCurrentRow(0);
    if (m_text->find(word))
        return;
    m_list->setCurrentRow((m_list->currentRow() + 1) % m_list->count());
    m_text->moveCursor(QTextCursor::Start);
    m_text->find(word);
}

void CKsHelpWindow::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        Refresh();
}

void CKsHelpWindow::keyPressEvent(QKeyEvent* event)
{
    if (event->key() == Qt::Key_Escape)
        close();
    else
        QWidget::keyPressEvent(event);
}
