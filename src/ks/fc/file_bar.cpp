#include "ks/fc/file_bar.h"

#include "ks/fc/after_paint.h"
#include "ks/fc/file_name.h"
#include "ks/fc/findings_dialog.h"
#include "ks/fc/project_doc.h"

#include <QEvent>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QToolButton>

namespace {

CString NameOf(const CString& path)
{
    return KsShownFileName(path);
}

} // namespace

CKsFileBar::CKsFileBar(CKsProjectDoc& document, QWidget* parent)
    : QFrame(parent),
      m_document(document),
      m_text(new QLabel(this)),
      m_list(new QPushButton(this)),
      m_edit(new QPushButton(this)),
      m_close(new QToolButton(this))
{
    setObjectName("fileBar");
    setFrameShape(QFrame::StyledPanel);
    setAutoFillBackground(true);
    QPalette colours = palette(); // those of a note, which a theme has for tool tips
    colours.setColor(QPalette::Window, colours.color(QPalette::ToolTipBase));
    colours.setColor(QPalette::WindowText, colours.color(QPalette::ToolTipText));
    setPalette(colours);
    m_text->setObjectName("fileBarText");
    m_text->setWordWrap(true);
    m_text->setTextInteractionFlags(Qt::TextSelectableByMouse);
    m_close->setAutoRaise(true);
    m_close->setText(QStringLiteral("\u00D7"));
    auto* layout = new QHBoxLayout(this);
    layout->addWidget(m_text, 1);
    for (QWidget* button :
         {static_cast<QWidget*>(m_list), static_cast<QWidget*>(m_edit), static_cast<QWidget*>(m_close)})
        layout->addWidget(button);
    connect(m_list, &QPushButton::clicked, this, &CKsFileBar::ShowList);
    connect(m_edit, &QPushButton::clicked, this, [this] { m_document.EditUnreadable(); });
    connect(m_close, &QToolButton::clicked, this, &QWidget::hide);
    connect(&document, &CKsProjectDoc::FileStateChanged, this, &CKsFileBar::Refresh);
    Refresh();
    if (!document.File().Findings().empty())
        KsAfterPaint(parent, this, [this] { ShowList(); });
}

CString CKsFileBar::Text() const
{
    const CKsDocumentFile& file = m_document.File();
    if (file.IsUnreadable())
        return tr("%1 could not be read. What is shown here are default values, not its content.\n%2")
            .arg(NameOf(file.Path()), file.Error());
    if (!file.Findings().empty())
        return tr("Values of %1 that were not taken as they stand: %2. A save keeps the file as it is in a copy.")
            .arg(NameOf(file.Path()))
            .arg(file.Findings().size());
    QStringList notes{file.SaveNotes()};
    if (!file.KeptCopy().isEmpty())
        notes << tr("The file as it was before this save is kept in %1.").arg(NameOf(file.KeptCopy()));
    notes.removeAll(QString());
    return notes.join(u'\n');
}

void CKsFileBar::Refresh()
{
    const CString text = Text();
    m_text->setText(text);
    m_text->setAccessibleName(text);
    m_list->setText(tr("Show List..."));
    m_edit->setText(tr("Edit Default Values"));
    m_close->setToolTip(tr("Close this bar"));
    m_close->setAccessibleName(tr("Close this bar"));
    m_list->setVisible(!m_document.File().Findings().empty());
    m_edit->setVisible(m_document.IsReadOnly());
    m_close->setVisible(!m_document.File().IsUnreadable());
    setVisible(!text.isEmpty());
    if (m_document.File().Findings().empty() && m_dialog)
        m_dialog->close();
}

void CKsFileBar::ShowList()
{
    if (m_document.File().Findings().empty())
        return;
    if (!m_dialog)
        m_dialog = new CKsFindingsDialog(m_document.File().Path(), m_document.File().Findings(), this);
    m_dialog->show();
    m_dialog->raise();
}

void CKsFileBar::changeEvent(QEvent* event)
{
    QFrame::changeEvent(event);
    if (event->type() == QEvent::LanguageChange && !isHidden())
        Refresh();
}
