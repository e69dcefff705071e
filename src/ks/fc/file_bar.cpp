#include "ks/fc/file_bar.h"

#include "ks/fc/after_paint.h"
#include "ks/fc/dialog_turn.h"
#include "ks/fc/findings_dialog.h"
#include "ks/fc/project_doc.h"

#include <QAbstractItemView>
#include <QApplication>
#include <QEvent>
#include <QGridLayout>
#include <QLabel>
#include <QPushButton>
#include <QScrollArea>
#include <QToolButton>
#include <QVBoxLayout>
#include <algorithm>

/// An open cell goes with its text; its table stays.
static QWidget* Lasting(QWidget* widget)
{
    QWidget* const viewport = widget->parentWidget();
    auto* const table = viewport ? qobject_cast<QAbstractItemView*>(viewport->parentWidget()) : nullptr;
    return table ? table : widget;
}

CKsFileBar::CKsFileBar(CKsProjectDoc& document, QWidget* parent) : QFrame(parent), m_document(document)
{
    setObjectName("fileBar");
    setFrameShape(QFrame::StyledPanel);
    setAutoFillBackground(true);
    QPalette colours = palette(); // those of a note, which a theme has for tool tips
    colours.setColor(QPalette::Window, colours.color(QPalette::ToolTipBase));
    colours.setColor(QPalette::WindowText, colours.color(QPalette::ToolTipText));
    setPalette(colours);
    auto* rows = new QWidget;
    auto* stack = new QVBoxLayout(rows);
    m_area = new QScrollArea(this);
    m_area->setFrameShape(QFrame::NoFrame);
    m_area->setFocusPolicy(Qt::NoFocus);
    m_area->setWidgetResizable(true);
    m_area->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    m_area->setWidget(rows);
    for (QWidget* ground : {m_area->viewport(), rows})
        ground->setAutoFillBackground(false);
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(m_area);
    for (QLayout* each : {static_cast<QLayout*>(layout), static_cast<QLayout*>(stack)}) {
        each->setContentsMargins(0, 0, 0, 0);
        each->setSpacing(0);
    }
    parent->installEventFilter(this);
    connect(qApp, &QApplication::focusChanged, this, [this](QWidget* before, QWidget* now) {
        if (before && isAncestorOf(now) && !isAncestorOf(before))
            m_before = Lasting(before);
    });
    connect(&document, &CKsProjectDoc::FileStateChanged, this, &CKsFileBar::Refresh);
    Refresh();
    if (!document.File().Findings().empty())
        KsAfterPaint(parent, this, [this] { ShowList(); });
}

CKsFileBar::Row CKsFileBar::MakeRow(std::size_t number)
{
    Row row{.widget = new QWidget(m_area->widget())};
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
    auto* buttons = new QBoxLayout(QBoxLayout::LeftToRight, row.actions);
    buttons->setContentsMargins(0, 0, 0, 0);
    buttons->addStretch();
    auto* cells = new QGridLayout(row.widget);
    cells->setColumnStretch(0, 1);
    cells->addWidget(row.text, 0, 0);
    cells->addWidget(row.close, 0, 2, Qt::AlignTop);
    m_area->widget()->layout()->addWidget(row.widget);
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
        auto* buttons = static_cast<QBoxLayout*>(row.actions->layout());
        buttons->insertWidget(buttons->count() - 1, button, 0, Qt::AlignLeft);
        row.buttons.push_back(button);
        QWidget::setTabOrder(button, row.close);
    }
    for (std::size_t i = 0; i < row.buttons.size(); ++i) {
        if (i < notice.actions.size())
            row.buttons[i]->setText(notice.actions[i].label);
        row.buttons[i]->setVisible(i < notice.actions.size());
    }
    // One stands beside the text; several, whose text is long, below it, in a row or below each other.
    auto* cells = static_cast<QGridLayout*>(row.widget->layout());
    const bool areBelow = notice.actions.size() > 1;
    row.actions->setSizePolicy(areBelow ? QSizePolicy::Ignored : QSizePolicy::Fixed, QSizePolicy::Fixed);
    cells->removeWidget(row.actions);
    cells->addWidget(row.actions, areBelow ? 1 : 0, areBelow ? 0 : 1);
    row.actions->setVisible(!notice.actions.empty());
    row.close->setToolTip(tr("Close this bar"));
    row.close->setAccessibleName(tr("Close this bar"));
    row.close->setVisible(notice.close != nullptr);
}

void CKsFileBar::Refresh()
{
    std::vector<KsFileNotice> notices = m_document.Notices();
    if (notices.size() != m_notices.size() && isAncestorOf(window()->focusWidget()))
        ReturnFocus(); // the button that had it goes, or is another one's from now on
    m_notices = std::move(notices);
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
    KsShowInTurn(m_dialog);
}

void CKsFileBar::ReturnFocus()
{
    (m_before ? m_before.data() : parentWidget())->setFocus();
}

/// The view gives way, and no line of a text is cut off, as long as enough of the view is left.
void CKsFileBar::KeepHeight()
{
    const int width = parentWidget()->width() - 2 * frameWidth(), most = parentWidget()->height() * 2 / 5;
    for (const Row& row : m_rows) {
        auto* buttons = static_cast<QBoxLayout*>(row.actions->layout());
        int length = 0;
        for (const QPushButton* button : row.buttons)
            length += button->isHidden() ? 0 : button->sizeHint().width() + buttons->spacing();
        const QMargins around = row.widget->layout()->contentsMargins();
        const bool fits = length <= width - around.left() - around.right();
        buttons->setDirection(fits ? QBoxLayout::LeftToRight : QBoxLayout::TopToBottom);
        for (QWidget* changed : {row.actions, row.widget}) // what is around them would hear of it later
            changed->updateGeometry();
    }
    QLayout* const rows = m_area->widget()->layout();
    rows->activate();
    setFixedHeight(std::clamp(rows->totalHeightForWidth(width), 0, most) + 2 * frameWidth());
}

bool CKsFileBar::eventFilter(QObject* watched, QEvent* event)
{
    if (watched == parentWidget() && event->type() == QEvent::Resize)
        KeepHeight();
    return QFrame::eventFilter(watched, event);
}

void CKsFileBar::changeEvent(QEvent* event)
{
    QFrame::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        Refresh();
}
