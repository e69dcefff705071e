#include "shell/recovery_dialog.h"

#include "ks/fc/after_paint.h"
#include "ks/fc/difference_dialog.h"
#include "ks/fc/file_name.h"
#include "ks/fc/message_box.h"
#include "ks/fc/plain_cell.h"
#include "ks/language/date_time.h"

#include <QApplication>
#include <QDialogButtonBox>
#include <QDir>
#include <QFileInfo>
#include <QHeaderView>
#include <QLabel>
#include <QPushButton>
#include <QSocketNotifier>
#include <QTableWidget>
#include <QTimer>
#include <QVBoxLayout>
#include <algorithm>

namespace {

enum Column
{
    Document,
    Time,
    What,
    Columns
};

/// Files of one name in several folders are told with their folders.
QString NameAmong(const std::vector<CRecoverable>& items, const CRecoverable& item)
{
    const bool isAlone = std::ranges::none_of(items, [&item](const CRecoverable& each) {
        return each.Name() == item.Name() && each.header.path != item.header.path;
    });
    if (isAlone || item.header.path.isEmpty())
        return item.Name();
    return CRecoveryDialog::tr("%1 in %2")
        .arg(item.Name(), QDir::toNativeSeparators(QFileInfo(item.header.path).path()));
}

} // namespace

CRecoveryDialog::CRecoveryDialog(CRecovery& recovery, std::vector<CRecoverable> items, QWidget* parent)
    : QDialog(parent), m_recovery(recovery), m_items(std::move(items)), m_table(new QTableWidget(this))
{
    setObjectName("recovery");
    setAttribute(Qt::WA_DeleteOnClose);
    setWindowTitle(tr("Recover Changes"));
    auto* text = new QLabel(tr("The program ended before these changes were saved. A document that you open has them, "
                               "not yet saved; undo leads back to its file."),
                            this);
    text->setWordWrap(true);
    m_table->setColumnCount(Columns);
    m_table->setHorizontalHeaderLabels({tr("Document"), tr("Last change kept"), tr("What differs")});
    m_table->setAccessibleName(windowTitle());
    m_table->setSelectionBehavior(QAbstractItemView::SelectRows);
    m_table->setSelectionMode(QAbstractItemView::SingleSelection);
    m_table->setTabKeyNavigation(false);
    m_table->setTextElideMode(Qt::ElideMiddle); // a folder differs at its end, most of the time
    m_table->verticalHeader()->hide();
    m_table->horizontalHeader()->setStretchLastSection(true);
    auto* buttons = new QDialogButtonBox(this);
    m_open = buttons->addButton(tr("&Open"), QDialogButtonBox::ActionRole);
    m_compare = buttons->addButton(tr("&Compare"), QDialogButtonBox::ActionRole);
    m_discard = buttons->addButton(tr("&Discard"), QDialogButtonBox::ActionRole);
    buttons->addButton(tr("&Later"), QDialogButtonBox::RejectRole);
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(text);
    layout->addWidget(m_table, 1);
    layout->addWidget(buttons);
    connect(m_open, &QPushButton::clicked, this, &CRecoveryDialog::Open);
    connect(m_compare, &QPushButton::clicked, this, &CRecoveryDialog::Compare);
    connect(m_discard, &QPushButton::clicked, this, &CRecoveryDialog::Discard);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    connect(m_table, &QTableWidget::itemSelectionChanged, this, &CRecoveryDialog::UpdateButtons);
    m_open->setDefault(true);
    resize(860, 320);
    Fill();
}

CRecoveryDialog::~CRecoveryDialog() = default;

void CRecoveryDialog::Fill()
{
    m_table->setRowCount(int(m_items.size()));
    for (int row = 0; row < m_table->rowCount(); ++row) {
        const CRecoverable& item = m_items[std::size_t(row)];
        const bool isDamaged = item.state == CRecoverable::Damaged;
        const QString path = QDir::toNativeSeparators(isDamaged ? item.file : item.header.path);
        m_table->setItem(row, Document,
                         PlainCell(isDamaged ? tr("A damaged recovery file") : NameAmong(m_items, item), path));
        m_table->setItem(row, Time, PlainCell(isDamaged ? QString() : KsDateTimeText(item.header.time.toLocalTime())));
        m_table->setItem(row, What, PlainCell(tr("Comparing...")));
    }
    m_table->resizeColumnsToContents();
    constexpr int most = 320; // pixels; a tool tip has the name whole
    m_table->setColumnWidth(Document, std::min(m_table->columnWidth(Document), most));
    m_table->setCurrentCell(0, Document);
    KsAfterPaint(m_table->viewport(), this, [this] { DescribeNext(); });
}

/// One line after the other, each in a copy of the process: a large file takes a moment, and nobody waits for it.
void CRecoveryDialog::DescribeNext()
{
    if (m_described >= m_items.size())
        return;
    Result<ProcessCopy> look = ProcessCopy::Start([this] { return Look(m_items[m_described]); });
    if (look)
        m_look = std::move(look.value());
    if (!m_look || m_look->Ended() == -1) {
        Described();
        return;
    }
    m_lookEnds = std::make_unique<QSocketNotifier>(m_look->Ended(), QSocketNotifier::Read);
    connect(m_lookEnds.get(), &QSocketNotifier::activated, this, &CRecoveryDialog::Described);
}

void CRecoveryDialog::Described()
{
    if (m_lookEnds) {
        m_lookEnds->setEnabled(false);       // before what it looks at is closed
        m_lookEnds.release()->deleteLater(); // it is what calls
    }
    const ProcessCopy::Answer answer =
        m_look ? m_look->Wait() : ProcessCopy::Answer(std::make_error_code(std::errc::interrupted));
    m_look.reset();
    CRecoverable& item = m_items[m_described];
    if (!answer.error)
        item.state = CRecoverable::State(std::clamp(answer.text.front() - '0', 0, int(CRecoverable::Missing)));
    const QString text = answer.error ? tr("What differs is not known: it could not be looked at.")
                                      : QString::fromStdString(answer.text.substr(1));
    m_table->setItem(int(m_described), What, PlainCell(text));
    m_table->resizeRowToContents(int(m_described));
    UpdateButtons();
    ++m_described;
    QTimer::singleShot(0, this, &CRecoveryDialog::DescribeNext);
}

/// In the copy: the state, and behind it the description.
ProcessCopy::Answer CRecoveryDialog::Look(CRecoverable item) const
{
    m_recovery.Examine(item);
    return {{}, char('0' + item.state) + Description(item).toStdString()};
}

QString CRecoveryDialog::Description(const CRecoverable& item) const
{
    const auto differences = m_recovery.Compare(item);
    QString what = differences ? CKsDifferenceDialog::Summary(*differences)
                               : tr("What differs is not known: the file cannot be read.");
    for (const QString& typed : item.header.typed)
        what += u'\n' + tr("Typed but not entered, as it is no value: %1").arg(typed);
    switch (item.state) {
    case CRecoverable::Damaged:
        return tr("It cannot be read, and can only be discarded.");
    case CRecoverable::NoEditor:
        return tr("No editor reads files of this kind (%1).").arg(item.header.extension);
    case CRecoverable::New:
        return tr("New document. %1").arg(what);
    case CRecoverable::Changed:
        return tr("The file has been changed since; the changes open as a new document beside it. %1").arg(what);
    case CRecoverable::Missing:
        return tr("The file is not there any more; the changes open as a new document. %1").arg(what);
    default:
        return what;
    }
}

int CRecoveryDialog::CurrentRow() const
{
    const int row = m_table->currentRow();
    return row >= 0 && std::size_t(row) < m_items.size() ? row : -1;
}

void CRecoveryDialog::UpdateButtons()
{
    const int row = CurrentRow();
    const bool canOpen = row >= 0 && m_items[std::size_t(row)].CanOpen();
    m_open->setEnabled(canOpen);
    m_compare->setEnabled(canOpen);
    m_discard->setEnabled(row >= 0);
}

void CRecoveryDialog::Open()
{
    const int row = CurrentRow();
    if (row < 0)
        return;
    if (m_recovery.Open(m_items[std::size_t(row)]))
        Remove(row);
    activateWindow(); // the window of the document has come to the front, and gets no keys while this is open
}

void CRecoveryDialog::Compare()
{
    const int row = CurrentRow();
    if (row < 0)
        return;
    QApplication::setOverrideCursor(Qt::WaitCursor);
    const auto differences = m_recovery.Compare(m_items[std::size_t(row)]);
    QApplication::restoreOverrideCursor();
    const QString title = tr("Recovered Changes of %1").arg(NameAmong(m_items, m_items[std::size_t(row)]));
    if (differences)
        (new CKsDifferenceDialog({title, tr("Now"), tr("Recovered")}, *differences, this))->open();
    else
        KsMessageBox(tr("What differs is not known: the file cannot be read."));
}

void CRecoveryDialog::Discard()
{
    const int row = CurrentRow();
    if (row < 0)
        return;
    const CRecoverable& item = m_items[std::size_t(row)];
    if (item.state != CRecoverable::Damaged &&
        KsMessageBox(tr("Discard the changes to %1? They cannot be brought back.").arg(NameAmong(m_items, item)),
                     QMessageBox::Discard | QMessageBox::Cancel, this) != QMessageBox::Discard)
        return;
    m_recovery.Discard(item);
    Remove(row);
}

/// The last one closes the dialog.
void CRecoveryDialog::Remove(int row)
{
    if (std::size_t(row) == m_described && m_look) { // nobody wants to know any more
        m_lookEnds.reset();
        m_look.reset();
        QTimer::singleShot(0, this, &CRecoveryDialog::DescribeNext);
    }
    m_items.erase(m_items.begin() + row);
    m_described -= std::size_t(row) < m_described;
    m_table->removeRow(row);
    if (m_items.empty())
        accept();
    else
        UpdateButtons();
}
