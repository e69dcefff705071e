#include "ks/fc/file_bar.h"

#include "ks/fc/after_paint.h"
#include "ks/fc/findings_dialog.h"
#include "ks/fc/project_doc.h"

#include <QEvent>
#include <QGridLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QResizeEvent>
#include <QToolButton>
#include <QVBoxLayout>
#include <algorithm>

CKsFileBar::CKsFileBar(CKsProjectDoc& document, QWidget* parent) : QFrame(parent), m_document(document)
{
    setObjectName("fileBar");
    setFrameShape(QFrame::StyledPanel);
    setAutoFillBackground(true);
    QPalette colours = palette(); // those of a note, which a theme has for tool tips
    colours.setColor(QPalette::Window, colours.color(QPalette::ToolTipBase));
    colours.setColor(QPalette::WindowText, colours.color(QPalette::ToolTipText));
    setPalette(colours);
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    connect(&document, &CKsProjectDoc::FileStateChanged, this, &CKsFileBar::Refresh);
    Refresh();
    if (!document.File().Findings().empty())
        KsAfterPaint(parent, this, [this] { ShowList(); });
}

CKsFileBar::Row CKsFileBar::MakeRow(std::size_t number)
{
    Row row{.widget = new QWidget(this)};
    row.text = new QLabel(row.widget);
    row.text->setObjectName("fileBarText");
    row.text->setWordWrap(true);
    row.text->setTextInteractionFlags(Qt::TextSelectableByMouse);
    row.close = new QToolButton(row.widget);
    row.close->setAutoRaise(true);
    row.close->setText(QStringLiteral("\u00D7"));
    connect(row.close, &QToolButton::clicked, this, [this, number] {
        if (const auto close = m_notices.at(number).close) // a copy: it ends the notice
            close();
    });
    row.actions = new QWidget(row.widget);
    auto* buttons = new QHBoxLayout(row.actions);
    buttons->setContentsMargins(0, 0, 0, 0);
    auto* cells = new QGridLayout(row.widget);
    cells->setColumnStretch(0, 1);
    cells->addWidget(row.text, 0, 0);
    cells->addWidget(row.close, 0, 2, Qt::AlignTop);
    layout()->addWidget(row.widget);
    return row;
}

void CKsFileBar::Run(std::size_t number, std::size_t action)
{
    const auto run = m_notices.at(number).actions.at(action).run; // a copy, likewise
    run(*this);
}

void CKsFileBar::Show(Row& row, std::size_t number)
{
    const KsFileNotice& notice = m_notices[number];
    row.text->setText(notice.text);
    row.text->setAccessibleName(notice.text);
    while (row.buttons.size() < notice.actions.size()) {
        auto* button = new QPushButton(row.actions);
        connect(button, &QPushButton::clicked, this, [this, number, i = row.buttons.size()] { Run(number, i); });
        row.actions->layout()->addWidget(button);
        row.buttons.push_back(button);
        QWidget::setTabOrder(button, row.close);
    }
    for (std::size_t i = 0; i < row.buttons.size(); ++i) {
        if (i < notice.actions.size())
            row.buttons[i]->setText(notice.actions[i].label);
        row.buttons[i]->setVisible(i < notice.actions.size());
    }
    // One stands beside the text; several, whose text is long, below it.
    auto* cells = static_cast<QGridLayout*>(row.widget->layout());
    cells->removeWidget(row.actions);
    if (notice.actions.size() > 1)
        cells->addWidget(row.actions, 1, 0, Qt::AlignLeft);
    else
        cells->addWidget(row.actions, 0, 1);
    row.actions->setVisible(!notice.actions.empty());
    row.close->setToolTip(tr("Close this bar"));
    row.close->setAccessibleName(tr("Close this bar"));
    row.close->setVisible(notice.close != nullptr);
}

void CKsFileBar::Refresh()
{
    m_notices = m_document.Notices();
    while (m_rows.size() < m_notices.size())
        m_rows.push_back(MakeRow(m_rows.size()));
    for (std::size_t i = 0; i < m_rows.size(); ++i) {
        if (i < m_notices.size())
            Show(m_rows[i], i);
        m_rows[i].widget->setVisible(i < m_notices.size());
    }
    setVisible(!m_notices.empty());
    KeepHeight();
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

/// The view gives way, and no line of a text is cut off.
void CKsFileBar::KeepHeight()
{
    layout()->activate();
    setMinimumHeight(std::max(layout()->totalHeightForWidth(width()), 0));
}

void CKsFileBar::resizeEvent(QResizeEvent* event)
{
    QFrame::resizeEvent(event);
    if (event->size().width() != event->oldSize().width())
        KeepHeight();
}

void CKsFileBar::changeEvent(QEvent* event)
{
    QFrame::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        Refresh();
}
