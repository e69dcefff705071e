#include "ks/fc/difference_dialog.h"

#include "ks/fc/plain_cell.h"

#include <QDialogButtonBox>
#include <QHeaderView>
#include <QLabel>
#include <QPushButton>
#include <QTableWidget>
#include <QVBoxLayout>

namespace {

QString Text(const std::string& text)
{
    return QString::fromStdString(text);
}

QString Number(std::size_t number)
{
    return number == 0 ? QString() : QString::number(number);
}

/// What stands on one side; a section says how many lines it has.
QString Side(const Difference& difference, const std::string& text)
{
    return difference.keyword.empty() && !text.empty() ? CKsDifferenceDialog::tr("lines: %1").arg(Text(text))
                                                       : Text(text);
}

void Fill(QTableWidget& table, const Differences& differences)
{
    table.setRowCount(int(differences.list.size()));
    for (int row = 0; row < table.rowCount(); ++row) {
        const Difference& difference = differences.list[std::size_t(row)];
        const QStringList cells{Text(difference.section),
                                Text(difference.keyword),
                                Number(difference.number),
                                Number(std::size_t(difference.parameter)),
                                Side(difference, difference.before),
                                Side(difference, difference.after)};
        for (int column = 0; column < int(cells.size()); ++column)
            table.setItem(row, column, PlainCell(cells[column]));
    }
    table.resizeColumnsToContents();
}

} // namespace

CKsDifferenceDialog::CKsDifferenceDialog(const Captions& captions, const Differences& differences, QWidget* parent)
    : QDialog(parent)
{
    setObjectName("differences");
    setAttribute(Qt::WA_DeleteOnClose);
    setWindowTitle(KsVisibleText(captions.title));
    QString summary = Summary(differences);
    if (differences.areMore)
        summary += u' ' + tr("The first %1 places are listed.").arg(differences.list.size());
    auto* text = new QLabel(summary, this);
    text->setWordWrap(true);
    const QStringList columns = tr("Section\nKeyword\nNumber\nParameter").split(u'\n')
                                << KsVisibleText(captions.before) << KsVisibleText(captions.after);
    auto* table = new QTableWidget(0, int(columns.size()), this);
    table->setHorizontalHeaderLabels(columns);
    table->setAccessibleName(windowTitle());
    table->setTabKeyNavigation(false);
    table->setWordWrap(false);
    table->setSelectionBehavior(QAbstractItemView::SelectRows);
    table->verticalHeader()->hide();
    table->horizontalHeader()->setStretchLastSection(true);
    Fill(*table, differences);
    auto* buttons = new QDialogButtonBox(this);
    buttons->addButton(tr("&Close"), QDialogButtonBox::RejectRole)->setDefault(true);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::close);
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(text);
    layout->addWidget(table, 1);
    layout->addWidget(buttons);
    resize(900, 400);
}

QString CKsDifferenceDialog::Summary(const Differences& differences)
{
    if (differences.IsEmpty())
        return tr("Nothing differs.");
    QStringList parts;
    if (differences.changed > 0)
        parts << tr("values changed: %1").arg(differences.changed);
    if (differences.added > 0)
        parts << tr("lines added: %1").arg(differences.added);
    if (differences.removed > 0)
        parts << tr("lines removed: %1").arg(differences.removed);
    const QString text = parts.join(QStringLiteral(", "));
    return tr("Sections: %1; %2.").arg(differences.sections).arg(text);
}
