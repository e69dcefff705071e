#include "grid/cell_dialogs.h"

#include "grid/cell_operations.h"
#include "grid/grid_model.h"
#include "grid/grid_texts.h"
#include "grid/typing.h"
#include "ks/fc/plain_cell.h"
#include "ks/units/formula.h"
#include "ks/units/typed_number.h"

#include <QCheckBox>
#include <QDialog>
#include <QDialogButtonBox>
#include <QElapsedTimer>
#include <QFormLayout>
#include <QHeaderView>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <QTableWidget>
#include <QTimer>
#include <QVBoxLayout>

namespace {

/// The results, or why there are none.
using Computed = std::pair<std::optional<CCellResults>, QString>;

QTableWidget* MakeTable(const QString& name, const QString& lastColumn)
{
    return MakeResultList(name, {GridTexts::tr("Line"), GridTexts::tr("Column"), GridTexts::tr("Now"), lastColumn});
}

class CCellsDlg : public QDialog
{
public:
    CCellsDlg(const QString& title, const CGridModel& model, QWidget& parent) : QDialog(&parent), m_model(model)
    {
        setWindowTitle(title);
        m_form = new QFormLayout;
        m_timer.setSingleShot(true);
        connect(&m_timer, &QTimer::timeout, this, [this] { Show(); });
        resize(560, 420);
    }

    std::optional<CCellResults> Ask()
    {
        AddResults();
        Show();
        return exec() == Accepted ? std::move(m_results) : std::nullopt;
    }

    void accept() override
    {
        m_timer.stop();
        Show();
        if (m_results && m_results->ChangedCount() > 0)
            QDialog::accept();
    }

protected:
    QFormLayout& Form() { return *m_form; }
    const CGridModel& Model() const { return m_model; }
    virtual Computed Compute() const = 0;
    /// While somebody types nothing of a million cells is computed.
    void Later()
    {
        if (m_buttons) // what it would do is looked at when it is pressed
            m_buttons->button(QDialogButtonBox::Ok)->setEnabled(true);
        m_timer.start(m_takesLong ? 400 : 50);
    }

private:
    /// Below what is asked for, which has the focus first.
    void AddResults()
    {
        auto* layout = new QVBoxLayout(this);
        layout->addLayout(m_form);
        m_summary = new QLabel;
        m_summary->setWordWrap(true);
        layout->addWidget(m_summary);
        m_changed = MakeTable(GridTexts::tr("First results"), GridTexts::tr("Then"));
        m_keptTitle = new QLabel(GridTexts::tr("These stay as they are:"));
        m_kept = MakeTable(m_keptTitle->text(), GridTexts::tr("Reason"));
        layout->addWidget(m_changed, 3);
        layout->addWidget(m_keptTitle);
        layout->addWidget(m_kept, 2);
        m_buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
        layout->addWidget(m_buttons);
        connect(m_buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
        connect(m_buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    }

    void Show()
    {
        QElapsedTimer time;
        time.start();
        auto [results, fault] = Compute();
        m_results = std::move(results);
        m_takesLong = time.elapsed() > 50;
        const std::size_t changed = m_results ? m_results->ChangedCount() : 0,
                          kept = m_results ? m_results->KeptCount() : 0;
        m_summary->setText(!fault.isEmpty() ? fault
                           : changed == 0   ? GridTexts::tr("No cell would change.")
                                            : GridTexts::Counted(changed, GridTexts::tr("1 cell changes:"),
                                                                 GridTexts::tr("%1 cells change; the first of them:")));
        Fill(*m_changed, changed ? m_results->Changed() : std::vector<CCellResults::Cell>());
        Fill(*m_kept, kept ? m_results->Kept() : std::vector<CCellResults::Cell>());
        m_keptTitle->setText(GridTexts::Counted(kept, GridTexts::tr("1 cell stays as it is:"),
                                                GridTexts::tr("%1 cells stay as they are; the first of them:")));
        m_keptTitle->setVisible(kept > 0);
        m_kept->setVisible(kept > 0);
        m_buttons->button(QDialogButtonBox::Ok)->setEnabled(changed > 0);
    }

    void Fill(QTableWidget& table, const std::vector<CCellResults::Cell>& cells) const
    {
        table.setRowCount(int(cells.size()));
        for (int row = 0; row < int(cells.size()); ++row) {
            const CCellResults::Cell& cell = cells[std::size_t(row)];
            const QString texts[] = {m_model.headerData(cell.row, Qt::Vertical, Qt::DisplayRole).toString(),
                                     m_model.Column(cell.column).header(), cell.before, cell.after};
            for (int column = 0; column < 4; ++column)
                table.setItem(row, column, PlainCell(texts[column]));
        }
        table.resizeColumnsToContents();
    }

    const CGridModel& m_model;
    std::optional<CCellResults> m_results;
    QFormLayout* m_form;
    QLabel *m_summary = nullptr, *m_keptTitle = nullptr;
    QTableWidget *m_changed = nullptr, *m_kept = nullptr;
    QDialogButtonBox* m_buttons = nullptr;
    QTimer m_timer;
    bool m_takesLong = false;
};

class CCalculateDlg : public CCellsDlg
{
public:
    CCalculateDlg(const CGridModel& model, const CellBlock& block, QWidget& parent)
        : CCellsDlg(NameOf(GridAction::Calculate), model, parent), m_block(block), m_names(NamesForFormula(model))
    {
        m_formula = new QLineEdit(QStringLiteral("=value"));
        m_formula->setAccessibleName(GridTexts::tr("Formula"));
        Form().addRow(GridTexts::tr("&Formula:"), m_formula);
        QStringList names, keywords;
        for (qsizetype name = 1; name < m_names.names.size(); ++name) {
            const int column = m_names.columns[std::size_t(name)];
            if (column != m_names.columns[std::size_t(name) - 1])
                names << m_names.names[name]; // of a name in capitals and small letters the first is enough
            if (m_names.names[name] == QString::fromUtf8(model.Column(column).name))
                keywords << m_names.names[name];
        }
        auto* hint =
            new QLabel(GridTexts::tr("\"value\" is the number of the cell itself. Numbers are in the units shown. "
                                     "Other columns of the line: %1; in every language: %2. Functions: min, "
                                     "max, abs, sqrt, rint, ln, log10, exp, sin, ...")
                           .arg(names.join(QStringLiteral(", ")), keywords.join(QStringLiteral(", "))));
        hint->setWordWrap(true);
        Form().addRow(hint);
        connect(m_formula, &QLineEdit::textChanged, this, [this] { Later(); });
        m_formula->setFocus();
        m_formula->setSelection(1, 5);
    }

protected:
    Computed Compute() const override
    {
        QString text = m_formula->text().trimmed();
        while (text.startsWith(u'=')) // the one that stood there, and one that was typed as in cells
            text.remove(0, 1);
        const CKsFormula formula(text, m_names.names);
        if (!formula.Fault().isEmpty())
            return {std::nullopt, formula.Fault()};
        return {Calculate(Model(), m_block, formula, m_names), {}};
    }

private:
    CellBlock m_block;
    FormulaNames m_names;
    QLineEdit* m_formula;
};

class CSeriesDlg : public CCellsDlg
{
public:
    CSeriesDlg(const CGridModel& model, const CellBlock& block, QWidget& parent)
        : CCellsDlg(NameOf(GridAction::FillSeries), model, parent), m_block(block)
    {
        m_step = new QLineEdit(KsShortestNumber(StepOf(model, block)));
        m_step->setAccessibleName(GridTexts::tr("Step"));
        Form().addRow(GridTexts::tr("&Step from line to line:"), m_step);
        connect(m_step, &QLineEdit::textChanged, this, [this] { Later(); });
        m_step->setFocus();
        m_step->selectAll();
    }

protected:
    Computed Compute() const override
    {
        const auto step = KsReadTyped(m_step->text(), CKsEditStyle());
        if (!step.value)
            return {std::nullopt,
                    step.complaint.isEmpty() ? GridTexts::tr("Floating point number required") : step.complaint};
        return {FillSeries(Model(), m_block, *step.value), {}};
    }

private:
    CellBlock m_block;
    QLineEdit* m_step;
};

class CInterpolateDlg : public CCellsDlg
{
public:
    CInterpolateDlg(const CGridModel& model, const CellBlock& block, QWidget& parent)
        : CCellsDlg(NameOf(GridAction::Interpolate), model, parent), m_block(block)
    {
        m_ends = new QRadioButton(GridTexts::tr("Between the &first and the last selected line of each branch"));
        m_neighbours = new QRadioButton(GridTexts::tr("Between the lines of the branch that are &not selected"));
        m_beyond = new QCheckBox(GridTexts::tr("&Also beyond the last known values (extrapolate)"));
        m_ends->setChecked(true);
        m_beyond->setEnabled(false);
        Form().addRow(m_ends);
        Form().addRow(m_neighbours);
        Form().addRow(m_beyond);
        connect(m_neighbours, &QRadioButton::toggled, this, [this](bool on) {
            m_beyond->setEnabled(on);
            Later();
        });
        connect(m_beyond, &QCheckBox::toggled, this, [this] { Later(); });
    }

protected:
    Computed Compute() const override
    {
        const bool neighbours = m_neighbours->isChecked();
        return {Interpolate(Model(), m_block, neighbours ? KnownValues::Neighbours : KnownValues::Ends,
                            neighbours && m_beyond->isChecked()),
                {}};
    }

private:
    CellBlock m_block;
    QRadioButton *m_ends, *m_neighbours;
    QCheckBox* m_beyond;
};

} // namespace

std::optional<CCellResults> AskForCells(GridAction action, const CGridModel& model, const CellBlock& block,
                                        QWidget& parent)
{
    if (action == GridAction::FillSeries)
        return CSeriesDlg(model, block, parent).Ask();
    if (action == GridAction::Interpolate)
        return CInterpolateDlg(model, block, parent).Ask();
    return CCalculateDlg(model, block, parent).Ask();
}

QTableWidget* MakeResultList(const QString& name, const QStringList& columns)
{
    constexpr int least = 8; // letters: an empty list has columns, too
    auto* list = new QTableWidget(0, int(columns.size()));
    list->setAccessibleName(name);
    list->setHorizontalHeaderLabels(columns);
    list->verticalHeader()->hide();
    list->horizontalHeader()->setMinimumSectionSize(least * list->fontMetrics().averageCharWidth());
    list->horizontalHeader()->setStretchLastSection(true);
    list->setEditTriggers(QAbstractItemView::NoEditTriggers);
    list->setSelectionBehavior(QAbstractItemView::SelectRows);
    list->setTabKeyNavigation(false);
    return list;
}
