#include "problems/problems_panel.h"

#include "ks/units/edit_fields.h"
#include "problems/problem_check.h"
#include "problems/problem_texts.h"
#include "problems/problems_filter.h"
#include "problems/problems_model.h"

#include <QClipboard>
#include <QEvent>
#include <QGuiApplication>
#include <QHBoxLayout>
#include <QHeaderView>
#include <QKeyEvent>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QPushButton>
#include <QTableView>
#include <QToolButton>
#include <QVBoxLayout>
#include <algorithm>
#include <set>

namespace {
constexpr Severity Severities[] = {Severity::Error, Severity::Warning, Severity::Note};
} // namespace

CProblemsPanel::CProblemsPanel(CProblemsModel& model, QWidget* parent)
    : QWidget(parent),
      m_model(model),
      m_filter(new CProblemsFilter(this)),
      m_words(new QLineEdit(this)),
      m_table(new QTableView(this)),
      m_text(new QLabel(this)),
      m_mend(new QPushButton(this))
{
    m_filter->setSourceModel(&model);
    MakeTable();
    m_text->setWordWrap(true);
    m_text->setTextInteractionFlags(Qt::TextSelectableByMouse);
    m_words->setClearButtonEnabled(true);
    connect(m_words, &QLineEdit::textChanged, m_filter, &CProblemsFilter::ShowOnly);
    connect(m_mend, &QPushButton::clicked, this, &CProblemsPanel::MendChosen);

    auto* top = new QHBoxLayout;
    for (const Severity severity : Severities)
        top->addWidget(m_switches[std::size_t(severity)] = MakeSwitch(severity));
    top->addWidget(m_words, 1);
    auto* bottom = new QHBoxLayout;
    bottom->addWidget(m_text, 1);
    bottom->addWidget(m_mend, 0, Qt::AlignTop);
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(4, 2, 4, 4);
    layout->addLayout(top);
    layout->addWidget(m_table, 1);
    layout->addLayout(bottom);

    connect(&model, &CProblemsModel::Counted, this, &CProblemsPanel::Update);
    Retranslate();
}

QToolButton* CProblemsPanel::MakeSwitch(Severity severity)
{
    auto* button = new QToolButton(this);
    button->setCheckable(true);
    button->setChecked(true);
    button->setAutoRaise(true);
    button->setToolButtonStyle(Qt::ToolButtonTextBesideIcon);
    connect(button, &QToolButton::toggled, this, [this, severity](bool on) { m_filter->Show(severity, on); });
    return button;
}

void CProblemsPanel::MakeTable()
{
    m_table->setModel(m_filter);
    m_table->setSelectionBehavior(QAbstractItemView::SelectRows);
    m_table->setShowGrid(false);
    m_table->setWordWrap(false);
    m_table->setTabKeyNavigation(false);
    m_table->setSortingEnabled(true);
    m_table->sortByColumn(CProblemsModel::What, Qt::AscendingOrder);
    m_table->verticalHeader()->hide();
    m_table->verticalHeader()->setDefaultSectionSize(m_table->fontMetrics().height() + 6);
    m_table->setContextMenuPolicy(Qt::CustomContextMenu);
    m_table->installEventFilter(this);
    auto& header = *m_table->horizontalHeader();
    header.setSectionResizeMode(CProblemsModel::What, QHeaderView::Stretch);
    header.setHighlightSections(false);
    const int letter = m_table->fontMetrics().horizontalAdvance(u'n');
    for (const auto& [column, letters] : {std::pair(CProblemsModel::Page, 16), std::pair(CProblemsModel::Line, 7),
                                          std::pair(CProblemsModel::FieldName, 18),
                                          std::pair(CProblemsModel::Document, 14), std::pair(CProblemsModel::Code, 7)})
        header.resizeSection(column, letters * letter);
    connect(m_table, &QTableView::clicked, this, &CProblemsPanel::GoTo);
    connect(m_table, &QWidget::customContextMenuRequested, this, &CProblemsPanel::OpenMenu);
    connect(m_table->selectionModel(), &QItemSelectionModel::selectionChanged, this, &CProblemsPanel::ShowChosen);
}

void CProblemsPanel::Retranslate()
{
    KsShowHint(*m_words, ProblemTexts::tr("Show only what has these words"));
    m_table->setAccessibleName(ProblemTexts::tr("Problems"));
    m_model.Retranslate();
    for (const Severity severity : Severities)
        m_switches[std::size_t(severity)]->setIcon(ProblemTexts::IconOf(severity));
    Update();
}

void CProblemsPanel::Update()
{
    for (const Severity severity : Severities)
        m_switches[std::size_t(severity)]->setText(ProblemTexts::CountOf(severity, m_model.Count(severity)));
    ShowChosen();
    emit SummaryChanged();
}

QString CProblemsPanel::Summary() const
{
    QStringList parts;
    for (const Severity severity : Severities)
        if (m_model.Count(severity) > 0)
            parts << m_switches[std::size_t(severity)]->text();
    return parts.join(QStringLiteral(", "));
}

/// The current one may only be where the keyboard begins.
QModelIndex CProblemsPanel::Chosen() const
{
    return m_table->selectionModel()->selectedRows().value(0);
}

/// Why the one that is chosen is a problem, and what mends it.
void CProblemsPanel::ShowChosen()
{
    const QModelIndex chosen = m_filter->mapToSource(Chosen());
    if (!chosen.isValid()) {
        m_text->setText(m_model.rowCount() == 0 ? ProblemTexts::tr("Nothing was found in the open documents.")
                                                : ProblemTexts::tr("A click leads to the place."));
        m_mend->hide();
        return;
    }
    const RuleId rule = m_model.At(chosen.row()).rule;
    m_text->setText(ProblemTexts::tr("%1: %2. %3")
                        .arg(QString::fromLatin1(RuleOf(rule).code), ProblemTexts::TitleOf(rule),
                             ProblemTexts::ExplanationOf(rule)));
    const QString remedy = ProblemTexts::NameOf(RemedyOf(rule));
    m_mend->setText(remedy);
    m_mend->setVisible(!remedy.isEmpty());
}

void CProblemsPanel::GoTo(const QModelIndex& row)
{
    const QModelIndex source = m_filter->mapToSource(row);
    if (!source.isValid())
        return;
    const CProblemsModel::Row& shown = m_model.At(source.row());
    if (shown.problem)
        shown.check->Host().ShowProblem(shown.problem->place);
    else
        shown.check->Host().ShowFileProblems();
}

void CProblemsPanel::MendChosen()
{
    const QModelIndex chosen = m_filter->mapToSource(Chosen());
    if (!chosen.isValid())
        return;
    const CProblemsModel::Row shown = m_model.At(chosen.row()); // rows may go meanwhile
    if (shown.problem && RemedyOf(shown.rule) != Remedy::None)
        shown.check->Host().Mend(*shown.problem);
}

void CProblemsPanel::TakeFocus()
{
    m_table->setFocus();
}

void CProblemsPanel::Step(bool forward)
{
    const int count = m_filter->rowCount();
    if (count == 0)
        return;
    const int now = Chosen().row();
    const int next = now < 0 ? (forward ? 0 : count - 1) : (now + (forward ? 1 : count - 1)) % count;
    // Whatever keys are held, which the view would look at.
    m_table->selectionModel()->setCurrentIndex(m_filter->index(next, 0),
                                               QItemSelectionModel::ClearAndSelect | QItemSelectionModel::Rows);
    GoTo(m_filter->index(next, 0));
}

void CProblemsPanel::Copy() const
{
    QStringList lines;
    std::set<int> rows;
    for (const QModelIndex& index : m_table->selectionModel()->selectedRows())
        rows.insert(index.row());
    const auto line = [](const auto& cell) {
        QStringList cells;
        for (int column = 0; column < CProblemsModel::Columns; ++column)
            cells << cell(column);
        return cells.join(u'\t');
    };
    lines << line(
        [this](int column) { return m_filter->headerData(column, Qt::Horizontal, Qt::DisplayRole).toString(); });
    for (const int row : rows)
        lines << line([this, row](int column) { return m_filter->index(row, column).data().toString(); });
    QGuiApplication::clipboard()->setText(lines.join(u'\n') + u'\n');
}

void CProblemsPanel::OpenMenu(const QPoint& place)
{
    const QModelIndex row = m_table->indexAt(place);
    const QModelIndex source = m_filter->mapToSource(row);
    if (!source.isValid())
        return;
    QMenu menu;
    menu.addAction(ProblemTexts::tr("&Go There"), this, [this, row] { GoTo(row); });
    const QString remedy = ProblemTexts::NameOf(RemedyOf(m_model.At(source.row()).rule));
    if (!remedy.isEmpty())
        menu.addAction(remedy, this, &CProblemsPanel::MendChosen);
    menu.addSeparator();
    menu.addAction(ProblemTexts::tr("&Copy"), QKeySequence::Copy, this, &CProblemsPanel::Copy);
    menu.exec(m_table->viewport()->mapToGlobal(place));
}

bool CProblemsPanel::eventFilter(QObject* object, QEvent* event)
{
    if (event->type() != QEvent::KeyPress)
        return QWidget::eventFilter(object, event);
    auto* key = static_cast<QKeyEvent*>(event);
    if (key->key() == Qt::Key_Return || key->key() == Qt::Key_Enter)
        GoTo(m_table->currentIndex());
    else if (key->matches(QKeySequence::Copy))
        Copy();
    else
        return QWidget::eventFilter(object, event);
    return true;
}

void CProblemsPanel::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() == QEvent::LanguageChange || event->type() == QEvent::StyleChange)
        Retranslate();
}
