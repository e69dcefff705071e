#include "module/findings_dialog.h"

#include "ks/fc/file_name.h"
#include "res/strings.h"

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
    const auto text = [](int index) { return LoadString(Str::FindingExpected).split(u'\n').value(index); };
    enum
    {
        ANumber,
        AnInteger,
        TrueOrFalse,
        AText,
        AFileName,
        SixIntegers,
        FittingCount,
        FewerFlags,
        Target,
        MoreParameters,
        OnlyOne
    };
    switch (finding.kind) {
    case Finding::CountDoesNotFit:
        return text(FittingCount).arg(finding.behind);
    case Finding::SurplusFlags:
        return text(FewerFlags).arg(finding.behind);
    case Finding::NoTarget:
        return text(Target).arg(QString::fromStdString(finding.section));
    case Finding::Missing:
        return text(MoreParameters);
    case Finding::Repeated:
        return text(OnlyOne);
    default:
        break;
    }
    switch (finding.expected) {
    case FieldKind::Number:
        return text(ANumber);
    case FieldKind::Boolean:
        return text(TrueOrFalse);
    case FieldKind::Text:
        return text(AText);
    case FieldKind::FileName:
        return text(AFileName);
    case FieldKind::DateTime:
        return text(SixIntegers);
    case FieldKind::Integer:
    case FieldKind::Choice:
    case FieldKind::Group:
        break;
    }
    return text(AnInteger);
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
        return QString::fromStdString(finding.used);
    default:
        return {};
    }
}

} // namespace

CFindingsModel::CFindingsModel(std::vector<Finding> findings, QObject* parent)
    : QAbstractTableModel(parent), m_findings(std::move(findings))
{
}

int CFindingsModel::rowCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : int(m_findings.size());
}

int CFindingsModel::columnCount(const QModelIndex& parent) const
{
    return parent.isValid() ? 0 : Columns;
}

QVariant CFindingsModel::data(const QModelIndex& index, int role) const
{
    if (!index.isValid() || (role != Qt::DisplayRole && role != Qt::ToolTipRole))
        return {};
    return CellText(m_findings[std::size_t(index.row())], index.column());
}

QVariant CFindingsModel::headerData(int section, Qt::Orientation orientation, int role) const
{
    if (orientation == Qt::Horizontal && role == Qt::DisplayRole)
        return LoadString(Str::FindingColumns).split(u'\n').value(section);
    return QAbstractTableModel::headerData(section, orientation, role);
}

QString CFindingsModel::Text(const QModelIndexList& rows) const
{
    QString text = LoadString(Str::FindingColumns).replace(u'\n', u'\t') + u'\n';
    for (const QModelIndex& row : rows) {
        QStringList cells;
        for (int column = 0; column < Columns; ++column)
            cells << CellText(m_findings[std::size_t(row.row())], column);
        text += cells.join(u'\t') + u'\n';
    }
    return text;
}

void CFindingsModel::Retranslate()
{
    emit headerDataChanged(Qt::Horizontal, 0, Columns - 1);
    if (!m_findings.empty())
        emit dataChanged(index(0, 0), index(rowCount() - 1, Columns - 1));
}

CFindingsDialog::CFindingsDialog(const CDocumentFile& file, QWidget* parent)
    : QDialog(parent),
      m_name(KsShownFileName(file.Path())),
      m_model(new CFindingsModel(file.Findings(), this)),
      m_text(new QLabel(this)),
      m_table(new QTableView(this))
{
    setObjectName("findings");
    m_text->setWordWrap(true);
    m_text->setTextFormat(Qt::PlainText);
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
    connect(m_copy, &QPushButton::clicked, this, &CFindingsDialog::Copy);
    connect(m_close, &QPushButton::clicked, this, &QDialog::close);
    m_close->setDefault(true);
    Retranslate();
    m_table->resizeColumnsToContents(); // by the rows in sight
    m_table->horizontalHeader()->setStretchLastSection(true);
    resize(900, 360);
}

void CFindingsDialog::Retranslate()
{
    setWindowTitle(LoadString(Str::FindingsTitle).arg(m_name));
    m_text->setText(LoadString(Str::FindingsText).arg(m_name));
    m_table->setAccessibleName(LoadString(Str::FindingsTitle).arg(m_name));
    m_copy->setText(LoadString(Str::CopyFindings));
    m_close->setText(LoadString(Str::CloseFindings));
    m_model->Retranslate();
}

/// The selected rows, or all.
void CFindingsDialog::Copy()
{
    if (!m_table->selectionModel()->hasSelection())
        m_table->selectAll();
    QModelIndexList rows = m_table->selectionModel()->selectedRows();
    std::sort(rows.begin(), rows.end());
    QGuiApplication::clipboard()->setText(m_model->Text(rows));
}

void CFindingsDialog::keyPressEvent(QKeyEvent* event)
{
    if (event->matches(QKeySequence::Copy))
        Copy();
    else
        QDialog::keyPressEvent(event);
}

void CFindingsDialog::changeEvent(QEvent* event)
{
    QDialog::changeEvent(event);
    if (event->type() == QEvent::LanguageChange)
        Retranslate();
}
