#include "module/file_bar.h"

#include "ks/fc/after_paint.h"
#include "ks/fc/file_name.h"
#include "module/findings_dialog.h"
#include "res/strings.h"

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

CFileBar::CFileBar(CKavo0_hdDoc& document, QWidget* parent)
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
    m_text->setTextFormat(Qt::PlainText);
    m_text->setWordWrap(true);
    m_text->setTextInteractionFlags(Qt::TextSelectableByMouse);
    m_close->setAutoRaise(true);
    m_close->setText(QStringLiteral("\u00D7"));
    auto* layout = new QHBoxLayout(this);
    layout->addWidget(m_text, 1);
    for (QWidget* button :
         {static_cast<QWidget*>(m_list), static_cast<QWidget*>(m_edit), static_cast<QWidget*>(m_close)})
        layout->addWidget(button);
    connect(m_list, &QPushButton::clicked, this, &CFileBar::ShowList);
    connect(m_edit, &QPushButton::clicked, this, [this] { m_document.EditUnreadable(); });
    connect(m_close, &QToolButton::clicked, this, &QWidget::hide);
    connect(&document, &CKavo0_hdDoc::FileStateChanged, this, &CFileBar::Refresh);
    Refresh();
    if (!document.File().Findings().empty())
        KsAfterPaint(parent, this, [this] { ShowList(); });
}

CString CFileBar::Text() const
{
    const CDocumentFile& file = m_document.File();
    if (file.IsUnreadable())
        return LoadString(Str::UnreadableBar).arg(NameOf(file.Path()), file.Error());
    if (!file.Findings().empty())
        return LoadString(Str::NotTakenBar).arg(NameOf(file.Path())).arg(file.Findings().size());
    if (!file.KeptCopy().isEmpty())
        return LoadString(Str::CopyKeptBar).arg(NameOf(file.KeptCopy()));
    return {};
}

void CFileBar::Refresh()
{
    const CString text = Text();
    m_text->setText(text);
    m_text->setAccessibleName(text);
    m_list->setText(LoadString(Str::ShowFindings));
    m_edit->setText(LoadString(Str::EditDefaults));
    m_close->setToolTip(LoadString(Str::CloseBar));
    m_close->setAccessibleName(LoadString(Str::CloseBar));
    m_list->setVisible(!m_document.File().Findings().empty());
    m_edit->setVisible(m_document.IsReadOnly());
    m_close->setVisible(!m_document.File().IsUnreadable());
    setVisible(!text.isEmpty());
    if (m_document.File().Findings().empty() && m_dialog)
        m_dialog->close();
}

void CFileBar::ShowList()
{
    if (m_document.File().Findings().empty())
        return;
    if (!m_dialog) {
        m_dialog = new CFindingsDialog(m_document.File(), this);
        m_dialog->setAttribute(Qt::WA_DeleteOnClose);
    }
    m_dialog->show();
    m_dialog->raise();
}

void CFileBar::changeEvent(QEvent* event)
{
    QFrame::changeEvent(event);
    if (event->type() == QEvent::LanguageChange && !isHidden())
        Refresh();
}
