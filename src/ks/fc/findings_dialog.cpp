#include "ks/fc/findings_dialog.h"

#include "ks/fc/file_name.h"
#include "ks/fc/shown_text.h"

#include <QClipboard>
#include <QDialogButtonBox>
#include <QEvent>
#include <QGuiApplication>
#include <QHeaderView>
#include <QKeyEvent>
#include <QLabel>
#include <QPushButton>
#include <QTableView>
#include <QVBoxLayout>

namespace {

enum Column
{
    Line,
    Character,
    Section,
    Keyword,
    Parameter,
    Found,
    Expected,
    Used,
    Columns
};

QString ExpectedText(const Finding& finding)
{
    switch (finding.kind) {
    case Finding::CountDoesNotFit:
        return CKsFindingsModel::tr("a count that fits the %1 parameters behind it").arg(finding.behind);
    case Finding::SurplusFlags:
        return CKsFindingsModel::tr("a flag for each of %1 titles").arg(finding.behind);
    case Finding::SurplusParams:
        return CKsFindingsModel::tr("no more parameters");
    case Finding::NoTarget:
        return CKsFindingsModel::tr("a target [%1]").arg(QString::fromStdString(finding.section));
    case Finding::Missing:
        return CKsFindingsModel::tr("more parameters, or a smaller count");
    case Finding::NoKeyword:
        return CKsFindingsModel::tr("a keyword %1").arg(QString::fromStdString(finding.keyword));
    case Finding::NoSection:
        return CKsFindingsModel::tr("a section [%1]").arg(QString::fromStdString(finding.section));
    case Finding::Repeated:
        return CKsFindingsModel::tr("only one of this name; the first counts");
    case Finding::Rule:
        return QString::fromStdString(finding.rule());
    default:
        return CKsFindingsModel::tr(KindText(finding.expected));
    }
}

QString UsedText(const Finding& finding)
{
    if (finding.leftOut)
        return CKsFindingsModel::tr("nothing: the line is left out");
    if (finding.kind == Finding::Repeated)
        return CKsFindingsModel::tr("the first; this one is kept, but not shown");
    return finding.used == "nan" ? CKsFindingsModel::tr("not known") : QString::fromStdString(finding.used);
}

QString CellText(const Finding& finding, int column)
{
    switch (column) {
    case Line:
        return QString::number(finding.line);
    case Character:
        return QString::number(finding.column);
    case Section:
        return QString::fromStdString(finding.section);
    case Keyword:
        return QString::fromStdString(finding.keyword);
    case Parameter:
        return finding.parameter == 0
                   ? QString()
                   : QStringLiteral("%1 %2").arg(finding.parameter).arg(QString::fromStdString(finding.field));
    case Found:
        return QString::fromStdString(finding.found);
    case Expected:
        return ExpectedText(finding);
    case Used:
        return UsedText(finding);
    default:
        return {};
    }
}

QStringList Captions()
{
    return CKsFindingsModel::tr("Line\nColumn\nSection\nKeyword\nParameter\nIn the file\nExpected\nUsed instead")
        .split(u'\n');
}

} // namespace

CString KsFindingSentence(const Finding& finding)
{
    QString text = CKsFindingsModel::tr("Expected: %1").arg(ExpectedText(finding));
    if (!finding.found.empty())
        text = CKsFindingsModel::tr("%1; in the file: %2").arg(text, QString::fromStdString(finding.found));
    if (const QString used = UsedText(finding); !used.isEmpty())
        text = CKsFindingsModel::tr("%1; used instead: %2").arg(text, used);
    return text;
}

CKsFindingsModel::CKsFindingsModel(std::vector<Finding> findings, QObject* parent)
    : QAbstractTableModel(parent), m_findings(std::move(findings))
{
}

int CKsFindingsModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_findings.size());
}

int CKsFindingsModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : Columns;
}

QVariant CKsFindingsModel::data(const QModelIndex& index, int role) const
{
    if (!index.isValid() || (role != Qt::DisplayRole && role != Qt::ToolTipRole))
        return {};
    return KsVisibleText(CellText(m_findings[std::size_t(index.row())], index.column()));
}

QVariant CKsFindingsModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation == Qt::Horizontal && role == Qt::DisplayRole)
        return Captions().value(section);
    return QAbstractTableModel::headerData(section, orientation, role);
}

QString CKsFindingsModel::Text(const QModelIndexList& rows) const
{
    QString text = Captions().join(u'\t') + u'\n';
    for (const QModelIndex& row : rows) {
        QStringList cells;
        for (int column = 0; column < Columns; ++column)
            cells << CellText(m_findings[std::size_t(row.row())], column);
        text += cells.join(u'\t') + u'\n';
    }
    return text;
}

void CKsFindingsModel::Retranslate()
{
    emit headerDataChanged(Qt::Horizontal, 0, Columns - 1);
    if (!m_findings.empty())
        emit dataChanged(index(0, 0), index(rowCount() - 1, Columns - 1));
}

CKsFindingsDialog::CKsFindingsDialog(const CString& path, std::vector<Finding> findings, QWidget* parent)
    : QDialog(parent),
      m_name(KsShownFileName(path)),
      m_model(new CKsFindingsModel(std::move(findings), this)),
      m_text(new QLabel(this)),
      m_table(new QTableView(this))
{
    setObjectName("findings");
    setAttribute(Qt::WA_DeleteOnClose);
    m_text->setWordWrap(true);
    m_table->setModel(m_model);
    m_table->setSelectionBehavior(QAbstractItemView::SelectRows);
    m_table->verticalHeader()->hide();
    m_table->setTabKeyNavigation(false);
    m_table->setWordWrap(false);
    auto* buttons = new QDialogButtonBox(this);
    m_copy = buttons->addButton(QString(), QDialogButtonBox::ActionRole);
    m_close = buttons->addButton(QString(), QDialogButtonBox::RejectRole);
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(m_text);
    layout->addWidget(m_table, 1);
    layout->addWidget(buttons);
    connect(m_copy, &QPushButton::clicked, this, &CKsFindingsDialog::Copy);
    connect(m_close, &QPushButton::clicked, this, &QDialog::close);
    m_close->setDefault(true);
    Retranslate();
    resize(1000, 360);
    ShareWidth();
}

/// What is used instead is in sight, whatever the length of the texts before it; a tool tip has them whole.
void CKsFindingsDialog::ShareWidth()
{
    m_table->resizeColumnsToContents(); // by the rows in sight
    QHeaderView& columns = *m_table->horizontalHeader();
    constexpr int most = 220, least = 160; // pixels
    columns.resizeSection(Found, std::min(columns.sectionSize(Found), most));
    const int expected = columns.sectionSize(Expected), used = std::min(columns.sectionSize(Used), most);
    const int others = columns.length() - expected - columns.sectionSize(Used);
    constexpr int around = 80; // margins and scroll bar
    columns.resizeSection(Expected, std::clamp(width() - others - used - around, std::min(least, expected), expected));
    columns.setStretchLastSection(true);
}

void CKsFindingsDialog::Retranslate()
{
    setWindowTitle(tr("%1: Values Not Taken as They Stand").arg(m_name));
    m_text->setText(tr("These places of %1 are not written as they should be. Each row says what stands there, what "
                       "was expected, and what is used instead. Nothing is changed in the file unless you save; a save "
                       "keeps the file as it is in a copy.")
                        .arg(m_name));
    m_table->setAccessibleName(tr("%1: Values Not Taken as They Stand").arg(m_name));
    m_copy->setText(tr("&Copy"));
    m_close->setText(tr("C&lose"));
    m_model->Retranslate();
}

/// The selected rows, or all.
void CKsFindingsDialog::Copy()
{
    if (!m_table->selectionModel()->hasSelection())
        m_table->selectAll();
    QModelIndexList rows = m_table->selectionModel()->selectedRows();
    std::sort(rows.begin(), rows.end());
    QGuiApplication::clipboard()->setText(m_model->Text(rows));
}

void CKsFindingsDialog::keyPressEvent(QKeyEvent* event)
{
    if (event->matches(QKeySequence::Copy))
        Copy();
    else
        QDialog::keyPressEvent(event);
}

void CKsFindingsDialog::changeEvent(QEvent* event)
{
    QDialog::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        Retranslate();
}
