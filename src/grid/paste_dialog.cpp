#include "grid/paste_dialog.h"

#include "grid/grid_keys.h"
#include "grid/grid_texts.h"
#include "grid/paste_models.h"
#include "ks/fc/plain_cell.h"
#include "ks/units/typed_number.h"

#include <QApplication>
#include <QCheckBox>
#include <QComboBox>
#include <QDialog>
#include <QDialogButtonBox>
#include <QFormLayout>
#include <QHeaderView>
#include <QLabel>
#include <QPushButton>
#include <QTableView>
#include <QTableWidget>
#include <QVBoxLayout>
#include <utility>

namespace {

constexpr int TextWidth = 160; // for texts to be mended
constexpr int MostWidth = 280; // of a column, in pixels
const QString NoUnit = QStringLiteral("-");

constexpr const char* SeparatorNames[] = {
    QT_TRANSLATE_NOOP("GridTexts", "Tab"), QT_TRANSLATE_NOOP("GridTexts", "Semicolon"),
    QT_TRANSLATE_NOOP("GridTexts", "Comma"), QT_TRANSLATE_NOOP("GridTexts", "Vertical bar")};
static_assert(std::size(SeparatorNames) == std::size(Separators));

QString ColumnName(const CopiedTable& copied, bool hasHeaders, int column)
{
    const QString header =
        hasHeaders && column < copied.texts.Width(0) ? copied.texts.At(0, column).toString().simplified() : QString();
    return header.isEmpty() ? GridTexts::tr("Column %1").arg(column + 1) : header;
}

/// "2 lines, 1 cell": what does not fit.
QStringList Misfits(const CPastePlan& plan)
{
    QStringList texts;
    if (const std::size_t lines = plan.LinesLeftOut(); lines > 0)
        texts << GridTexts::Counted(lines, GridTexts::tr("1 line"), GridTexts::tr("%1 lines"));
    if (const std::size_t cells = plan.CellsLeftOut(); cells > 0)
        texts << GridTexts::Counted(cells, GridTexts::tr("1 cell"), GridTexts::tr("%1 cells"));
    return texts;
}

class CPasteDlg : public QDialog
{
public:
    CPasteDlg(const CTableRows& rows, const ReadCopied& read, int row, int column, bool hasPlaces, QWidget& parent)
        : QDialog(&parent),
          m_rows(rows),
          m_read(read),
          m_row(row),
          m_column(column),
          m_copied(read(u'\t')),
          m_understood(rows, m_plan),
          m_faults(rows, m_plan, [this](int fault, const QString& text) { Mend(fault, text); })
    {
        setWindowTitle(NameOf(GridAction::Paste));
        const QChar separator = SeparatorOf(read);
        AddChoices(separator, hasPlaces);
        AddTables();
        if (separator != u'\t')
            m_copied = read(separator);
        Guess();
        resize(760, 620);
    }

    std::optional<PasteDecision> Ask()
    {
        if (exec() != Accepted)
            return std::nullopt;
        return DecisionOf(*m_plan);
    }

protected:
    /// With what is still being typed.
    void accept() override
    {
        m_faultView->setCurrentIndex({});
        FinishMending();
        if (m_buttons->button(QDialogButtonBox::Ok)->isEnabled())
            QDialog::accept();
    }

private:
    QComboBox* AddCombo(QFormLayout& form, const QString& label, const char* name, const QStringList& entries)
    {
        auto* combo = new QComboBox;
        combo->setObjectName(QString::fromLatin1(name));
        combo->addItems(entries);
        form.addRow(label, combo);
        return combo;
    }

    void AddChoices(QChar separator, bool hasPlaces)
    {
        auto* layout = new QVBoxLayout(this);
        m_summary = new QLabel;
        m_summary->setObjectName(QStringLiteral("summary"));
        m_summary->setWordWrap(true);
        layout->addWidget(m_summary);
        auto* form = new QFormLayout;
        layout->addLayout(form);
        QStringList separators;
        for (const char* const name : SeparatorNames)
            separators << GridTexts::tr(name);
        m_separator = AddCombo(*form, GridTexts::tr("Cells are separated &by:"), "separator", separators);
        m_separator->setCurrentIndex(int(std::ranges::find(Separators, separator.unicode()) - Separators));
        form->setRowVisible(m_separator, separator != u'\t' || m_copied.texts.Columns() == 1);
        m_decimal =
            AddCombo(*form, GridTexts::tr("&Numbers:"), "decimal",
                     {GridTexts::tr("With a decimal point: 1,234.5"), GridTexts::tr("With a decimal comma: 1.234,5")});
        m_place = AddCombo(*form, GridTexts::tr("Lines &go:"), "place",
                           {GridTexts::tr("Into the table from line %1 on").arg(m_rows.LineNumber(m_row)),
                            GridTexts::tr("Behind the last line")});
        if (hasPlaces)
            m_place->addItem(
                GridTexts::tr("To the lines of the same branch and chainage, others behind the last line"));
        m_headers = new QCheckBox(GridTexts::tr("The first line na&mes the columns"));
        m_headers->setObjectName(QStringLiteral("headers"));
        form->addRow(m_headers);
        m_units = new QCheckBox(GridTexts::tr("The line below has their &units"));
        m_units->setObjectName(QStringLiteral("units"));
        form->addRow(m_units);
        m_form = form;
        connect(m_separator, &QComboBox::activated, this, [this](int index) {
            m_copied = m_read(Separators[index]);
            Guess();
        });
        connect(m_decimal, &QComboBox::activated, this, [this] { Show(); });
        connect(m_place, &QComboBox::activated, this, [this] { Show(); });
        connect(m_headers, &QCheckBox::clicked, this, [this] { ReadHeaders(); });
        connect(m_units, &QCheckBox::clicked, this, [this] { ReadHeaders(); });
    }

    /// Columns go where the lines say that the user takes for headers and units.
    void ReadHeaders()
    {
        PasteChoice choice = AsItStands(m_rows, m_copied, m_row, m_column);
        if (m_headers->isChecked()) {
            choice.columns = ColumnsByHeaders(m_rows, m_copied.texts, m_column);
            if (m_units->isChecked() && HasUnitLine())
                TakeUnitLine(m_copied.texts, m_rows, choice.columns);
            TakeUnits(m_rows, m_copied, choice);
        }
        ShowColumns(choice.columns);
        Show();
    }

    bool HasUnitLine() const { return m_copied.texts.Lines() > 2; }

    void AddTables()
    {
        auto* all = static_cast<QVBoxLayout*>(layout());
        m_columns = new QTableWidget(0, 4);
        m_columns->setAccessibleName(GridTexts::tr("Columns"));
        m_columns->setHorizontalHeaderLabels(
            {GridTexts::tr("Copied"), GridTexts::tr("Goes to"), GridTexts::tr("Unit"), GridTexts::tr("First text")});
        m_columns->verticalHeader()->hide();
        m_columns->horizontalHeader()->setStretchLastSection(true);
        m_columns->setSelectionMode(QAbstractItemView::NoSelection);
        m_columns->setTabKeyNavigation(false);
        all->addWidget(m_columns, 2);
        all->addWidget(MakeView(m_understood, GridTexts::tr("As it is understood")), 3);
        m_faultTitle = new QLabel(GridTexts::tr("What does not fit can be mended here:"));
        all->addWidget(m_faultTitle);
        m_faultView = MakeView(m_faults, GridTexts::tr("What does not fit"));
        m_faultView->verticalHeader()->hide();
        m_faultView->horizontalHeader()->setStretchLastSection(true);
        m_faultView->setEditTriggers(QAbstractItemView::DoubleClicked | QAbstractItemView::SelectedClicked |
                                     QAbstractItemView::EditKeyPressed | QAbstractItemView::AnyKeyPressed);
        all->addWidget(m_faultView, 2);
        m_leaveOut = new QCheckBox;
        m_leaveOut->setObjectName(QStringLiteral("leaveOut"));
        connect(m_leaveOut, &QCheckBox::clicked, this, [this] { ShowSummary(); });
        all->addWidget(m_leaveOut);
        m_buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
        m_buttons->button(QDialogButtonBox::Ok)->setText(NameOf(GridAction::Paste));
        connect(m_buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
        connect(m_buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
        all->addWidget(m_buttons);
    }

    static QTableView* MakeView(QAbstractItemModel& model, const QString& name)
    {
        auto* view = new QTableView;
        view->setModel(&model);
        view->setAccessibleName(name);
        view->setWordWrap(false);
        view->setTabKeyNavigation(false);
        view->verticalHeader()->setMinimumWidth(view->fontMetrics().horizontalAdvance(QStringLiteral("0000000")));
        return view;
    }

    void Guess()
    {
        const PasteChoice choice = AsItSeems(m_rows, m_copied, m_row, m_column);
        m_headers->setChecked(choice.hasHeaders);
        m_units->setChecked(choice.hasUnits);
        m_form->setRowVisible(m_units, choice.hasUnits);
        m_decimal->setCurrentIndex(choice.decimal == DecimalSign::Comma);
        ShowColumns(choice.columns);
        Show();
    }

    void ShowColumns(const std::vector<PasteChoice::Column>& columns)
    {
        m_columns->setRowCount(int(columns.size()));
        QStringList targets{GridTexts::tr("(left out)")};
        for (const ColumnSpec& column : m_rows.Columns())
            targets << column.header();
        for (int row = 0; row < int(columns.size()); ++row) {
            const auto& [target, unit] = columns[std::size_t(row)];
            m_columns->setItem(row, 0, PlainCell(ColumnName(m_copied, m_headers->isChecked(), row)));
            const std::size_t line = m_headers->isChecked() ? 1 + m_units->isChecked() : 0;
            const bool isThere = line < m_copied.texts.Lines() && row < m_copied.texts.Width(line);
            m_columns->setItem(row, 3, PlainCell(isThere ? m_copied.texts.At(line, row).toString() : QString()));
            auto* goesTo = new QComboBox;
            goesTo->addItems(targets);
            goesTo->setCurrentIndex(target + 1);
            goesTo->setAccessibleName(GridTexts::tr("Column %1").arg(row + 1));
            auto* units = new QComboBox;
            units->setAccessibleName(GridTexts::tr("Unit of column %1").arg(row + 1));
            m_columns->setCellWidget(row, 1, goesTo);
            m_columns->setCellWidget(row, 2, units);
            ShowUnits(row, unit);
            connect(goesTo, &QComboBox::activated, this, [this, row] {
                ShowUnits(row, {});
                Show();
            });
            connect(units, &QComboBox::activated, this, [this] { Show(); });
        }
        FitColumns(*m_columns);
        const int shown = std::min(int(columns.size()), 6), line = m_columns->rowCount() ? m_columns->rowHeight(0) : 0;
        m_columns->setMinimumHeight(m_columns->horizontalHeader()->sizeHint().height() + shown * line + 4);
    }

    QComboBox& ComboAt(int row, int column) const
    {
        return *static_cast<QComboBox*>(m_columns->cellWidget(row, column));
    }

    void ShowUnits(int row, const QString& unit)
    {
        QComboBox& units = ComboAt(row, 2);
        const int target = ComboAt(row, 1).currentIndex() - 1;
        units.clear();
        const ColumnSpec* const spec = target >= 0 ? &m_rows.Column(target) : nullptr;
        const QString symbol = spec ? spec->UnitSymbol() : QString();
        const QStringList possible = spec && spec->IsNumeric() ? KsTypedUnits(spec->style, symbol) : QStringList();
        // The first one is that of the column: a factor is one, and percents are chosen.
        if (symbol.isEmpty() && !(possible.isEmpty() && unit.isEmpty()))
            units.addItem(NoUnit);
        units.addItems(possible);
        if (!unit.isEmpty() && units.findText(unit) < 0)
            units.addItem(unit);
        units.setCurrentIndex(unit.isEmpty() ? 0 : units.findText(unit));
        units.setEnabled(units.count() > 1);
    }

    PasteChoice Chosen() const
    {
        const bool hasHeaders = m_headers->isChecked() && m_copied.texts.Lines() > 1;
        PasteChoice choice{.hasHeaders = hasHeaders,
                           .hasUnits = hasHeaders && m_units->isChecked() && HasUnitLine(),
                           .decimal = m_decimal->currentIndex() == 1 ? DecimalSign::Comma : DecimalSign::Point,
                           .place = PastePlace(m_place->currentIndex()),
                           .row = m_row};
        for (int row = 0; row < m_columns->rowCount(); ++row) {
            const int target = ComboAt(row, 1).currentIndex() - 1;
            const QString unit = ComboAt(row, 2).currentText();
            const bool isOther = target >= 0 && unit != NoUnit && unit != m_rows.Column(target).UnitSymbol();
            choice.columns.push_back({target, isOther ? unit : QString()});
        }
        return choice;
    }

    void Show()
    {
        QApplication::setOverrideCursor(Qt::WaitCursor);
        m_plan = std::make_unique<CPastePlan>(m_rows, m_copied, Chosen());
        m_understood.Renew();
        m_faults.Renew();
        FitColumns(*m_faultView);
        m_faultView->setColumnWidth(CFaultModel::Text,
                                    std::max(m_faultView->columnWidth(CFaultModel::Text), TextWidth));
        QApplication::restoreOverrideCursor();
        m_leaveOut->setChecked(false);
        ShowSummary();
    }

    void Mend(int number, const QString& text)
    {
        const CPastePlan::Fault& fault = m_plan->Faults()[std::size_t(number)];
        const std::size_t line = m_plan->CopiedLine(fault.line);
        m_copied.texts.Set(line, fault.column, text);
        if (m_copied.numbers)
            m_copied.numbers->Set(line, fault.column, {});
        m_mended = number;
        QMetaObject::invokeMethod(this, &CPasteDlg::FinishMending, Qt::QueuedConnection); // it is still being edited
    }

    /// Goes on with the next one that does not fit. What was to be left out still is.
    void FinishMending()
    {
        if (!m_mended)
            return;
        const int mended = *std::exchange(m_mended, std::nullopt);
        const bool leavesOut = m_leaveOut->isChecked();
        Show();
        const int left = m_faults.rowCount({});
        m_leaveOut->setChecked(leavesOut && left > 0);
        ShowSummary();
        if (left == 0)
            m_buttons->button(QDialogButtonBox::Ok)->setFocus();
        else
            m_faultView->setCurrentIndex(m_faults.index(std::min(mended, left - 1), CFaultModel::Text));
    }

    /// Long texts do not push the other columns out of sight.
    static void FitColumns(QTableView& view)
    {
        view.resizeColumnsToContents();
        for (int column = 0; column < view.model()->columnCount(); ++column)
            view.setColumnWidth(column, std::min(view.columnWidth(column), MostWidth));
    }

    void ShowSummary()
    {
        const std::size_t faults = m_plan->Faults().size(), fresh = m_plan->NewLines();
        QStringList texts{
            GridTexts::Counted(m_plan->Lines(), GridTexts::tr("1 line was copied."),
                               GridTexts::tr("%1 lines were copied.")),
            GridTexts::Counted(fresh, GridTexts::tr("1 line is new."), GridTexts::tr("%1 lines are new."))};
        if (const std::size_t hidden = m_plan->HiddenLines(); hidden > 0)
            texts << GridTexts::Counted(hidden, GridTexts::tr("1 line is hidden by the filter."),
                                        GridTexts::tr("%1 lines are hidden by the filter."));
        if (const std::size_t blank = m_plan->BlankLines(); blank > 0)
            texts << GridTexts::Counted(blank, GridTexts::tr("1 blank line is left out."),
                                        GridTexts::tr("%1 blank lines are left out."));
        if (!m_plan->Complaint().isEmpty())
            texts << m_plan->Complaint();
        m_summary->setText(texts.join(u' '));
        ShowComplaint();
        m_leaveOut->setText(
            GridTexts::tr("&Leave out what does not fit: %1").arg(Misfits(*m_plan).join(QStringLiteral(", "))));
        for (QWidget* part : {static_cast<QWidget*>(m_faultTitle), static_cast<QWidget*>(m_faultView),
                              static_cast<QWidget*>(m_leaveOut)})
            part->setVisible(faults > 0);
        m_buttons->button(QDialogButtonBox::Ok)
            ->setEnabled(m_plan->Complaint().isEmpty() && m_plan->CellCount() > 0 &&
                         (faults == 0 || m_leaveOut->isChecked()));
    }

    /// Marks the column that the complaint is about.
    void ShowComplaint()
    {
        for (int row = 0; row < m_columns->rowCount(); ++row) {
            const bool isIt = row == m_plan->ComplaintColumn();
            QTableWidgetItem& item = *m_columns->item(row, 0);
            item.setIcon(isIt ? style()->standardIcon(QStyle::SP_MessageBoxWarning) : QIcon());
            item.setToolTip(isIt ? m_plan->Complaint() : QString());
        }
    }

    const CTableRows& m_rows;
    ReadCopied m_read;
    int m_row, m_column;
    CopiedTable m_copied;
    std::unique_ptr<CPastePlan> m_plan;
    CUnderstoodModel m_understood;
    CFaultModel m_faults;
    QLabel *m_summary = nullptr, *m_faultTitle = nullptr;
    QComboBox *m_separator = nullptr, *m_decimal = nullptr, *m_place = nullptr;
    QFormLayout* m_form = nullptr;
    QCheckBox *m_headers = nullptr, *m_units = nullptr, *m_leaveOut = nullptr;
    QTableWidget* m_columns = nullptr;
    QTableView* m_faultView = nullptr;
    QDialogButtonBox* m_buttons = nullptr;
    std::optional<int> m_mended; // number of the fault
};

} // namespace

PasteDecision DecisionOf(CPastePlan& plan)
{
    PasteDecision decision{.cells = {},
                           .choice = plan.Choice(),
                           .cellCount = plan.CellCount(),
                           .hidden = plan.HiddenLines(),
                           .hasShorterLines = plan.HasShorterLines()};
    QStringList leftOut = Misfits(plan);
    if (const std::size_t blank = plan.BlankLines(); blank > 0)
        leftOut << GridTexts::Counted(blank, GridTexts::tr("1 blank line"), GridTexts::tr("%1 blank lines"));
    decision.leftOut = leftOut.join(QStringLiteral(", "));
    decision.cells = plan.TakeCells();
    return decision;
}

std::optional<PasteDecision> AskForPaste(const CTableRows& rows, const ReadCopied& read, int row, int column,
                                         bool hasPlaces, QWidget& parent)
{
    return CPasteDlg(rows, read, row, column, hasPlaces, parent).Ask();
}
