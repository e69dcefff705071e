#include "grid/branch_lines_dlg.h"

#include "grid/cell_text.h"
#include "grid/gen_grid.h"
#include "grid/grid_host.h"
#include "grid/grid_keys.h"
#include "grid/grid_texts.h"
#include "ks/fc/branch_name.h"
#include "ks/fc/doc.h"
#include "ks/fc/message_box.h"

#include <QComboBox>
#include <QCompleter>
#include <QDialogButtonBox>
#include <QFormLayout>
#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QRadioButton>
#include <algorithm>

namespace {

constexpr int ChainageColumn = 1;
constexpr double UsualStep = 100; // of the unit shown

} // namespace

CBranchLinesDlg::CBranchLinesDlg(CGenGrid& grid)
    : QDialog(&grid), m_grid(grid), m_rows(*grid.Model()), m_sections(grid.Host()->CrossSections())
{
    setWindowTitle(NameOf(GridAction::InsertAlong));
    AddFields();
    QStringList branches = grid.Host()->BranchNames() + BranchesIn(m_rows);
    for (const auto& section : m_sections)
        branches << KsBranchKey(section.first);
    branches.removeDuplicates();
    m_branch->addItems(branches);
    const int row = grid.CurrentRow() - 1;
    const QString current = row >= m_rows.FixedRows() ? EditText(m_rows.Column(0), m_rows.Value(row, 0)) : QString();
    m_branch->setEditText(current.isEmpty() ? branches.value(0) : current);
    m_branch->lineEdit()->selectAll(); // another name that is typed takes its place
    const double step = m_rows.Column(ChainageColumn).style.UnitConvertFromBase(UsualStep, 0);
    m_step->setText(TextOf(step));
    BranchChanged();
    connect(m_branch, &QComboBox::editTextChanged, this, &CBranchLinesDlg::BranchChanged);
    for (const QLineEdit* field : {m_from, m_to, m_step})
        connect(field, &QLineEdit::textChanged, this, &CBranchLinesDlg::Show);
    connect(m_every, &QRadioButton::toggled, this, &CBranchLinesDlg::Show);
}

void CBranchLinesDlg::AddFields()
{
    const QString unit = m_rows.Column(ChainageColumn).UnitSymbol();
    auto* form = new QFormLayout(this);
    const auto addNumber = [&](const QString& label, const QString& name) {
        auto* field = new QLineEdit;
        field->setAccessibleName(name);
        auto* row = new QHBoxLayout;
        row->addWidget(field);
        row->addWidget(new QLabel(unit));
        form->addRow(label, row);
        static_cast<QLabel*>(form->labelForField(row))->setBuddy(field);
        return field;
    };
    m_branch = new QComboBox;
    m_branch->setEditable(true);
    m_branch->completer()->setCaseSensitivity(Qt::CaseInsensitive);
    m_branch->setAccessibleName(GridTexts::tr("Branch"));
    form->addRow(GridTexts::tr("&Branch:"), m_branch);
    m_from = addNumber(GridTexts::tr("&From chainage:"), GridTexts::tr("From chainage"));
    m_to = addNumber(GridTexts::tr("&To chainage:"), GridTexts::tr("To chainage"));
    m_every = new QRadioButton(GridTexts::tr("At &even distances"));
    m_every->setChecked(true);
    form->addRow(m_every);
    m_step = addNumber(GridTexts::tr("&Distance:"), GridTexts::tr("Distance"));
    m_atSections = new QRadioButton(GridTexts::tr("At each &cross section between them"));
    form->addRow(m_atSections);
    m_noSections = new QLabel;
    m_noSections->setWordWrap(true);
    form->addRow(m_noSections);
    m_summary = new QLabel;
    m_summary->setWordWrap(true);
    m_summary->setMinimumHeight(3 * fontMetrics().lineSpacing());
    m_summary->setAlignment(Qt::AlignTop | Qt::AlignLeft);
    form->addRow(m_summary);
    m_buttons = new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    connect(m_buttons, &QDialogButtonBox::accepted, this, &QDialog::accept);
    connect(m_buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    form->addRow(m_buttons);
    resize(420, sizeHint().height());
}

/// The reach of the branch, as far as somebody knows it: its cross sections, or else the lines that it has.
void CBranchLinesDlg::BranchChanged()
{
    const QString branch = KsBranchKey(m_branch->currentText());
    m_ofBranch.clear();
    for (const auto& [name, chainage] : m_sections)
        if (KsSameBranch(name, branch))
            m_ofBranch.push_back(chainage);
    std::ranges::sort(m_ofBranch);
    m_inTable = branch.isEmpty() ? BranchInTable() : FindBranch(m_rows, branch);
    const auto& reach = m_ofBranch.empty() ? m_inTable.chainages : m_ofBranch;
    m_from->setText(reach.empty() ? QString() : TextOf(reach.front()));
    m_to->setText(reach.empty() ? QString() : TextOf(reach.back()));
    m_atSections->setEnabled(!m_ofBranch.empty());
    m_noSections->setVisible(m_ofBranch.empty());
    m_noSections->setText(m_sections.empty()
                              ? GridTexts::tr("No cross sections are known: none are open in the project.")
                              : GridTexts::tr("No cross sections of this branch are known."));
    if (m_ofBranch.empty())
        m_every->setChecked(true);
    Show();
}

QString CBranchLinesDlg::TextOf(double chainage) const
{
    return EditText(m_rows.Column(ChainageColumn), chainage);
}

std::optional<double> CBranchLinesDlg::Number(const QLineEdit& field) const
{
    const CellReading read = ReadCell(m_rows.Column(ChainageColumn), field.text().trimmed());
    const auto* number = std::get_if<double>(&read.value);
    return read.refusal.isEmpty() && number ? std::optional(*number) : std::nullopt;
}

QString CBranchLinesDlg::Read(PlacesOfBranch& asked) const
{
    const CellReading branch = ReadCell(m_rows.Column(0), m_branch->currentText());
    if (!branch.refusal.isEmpty())
        return branch.refusal;
    asked.branch = QString::fromStdString(std::get<std::string>(branch.value));
    if (asked.branch.isEmpty())
        return GridTexts::tr("Which branch?");
    const auto from = Number(*m_from), to = Number(*m_to);
    if (!from || !to)
        return GridTexts::tr("%1 takes a number.").arg((from ? m_to : m_from)->accessibleName());
    if (*to < *from)
        return GridTexts::tr("The reach ends before it begins.");
    if (m_atSections->isChecked()) {
        std::ranges::copy_if(m_ofBranch, std::back_inserter(asked.chainages),
                             [&](double chainage) { return chainage >= *from && chainage <= *to; });
        return asked.chainages.empty() ? GridTexts::tr("No cross section is between them.") : QString();
    }
    const auto step = Number(*m_step);
    if (!step || !(*step > 0))
        return GridTexts::tr("%1 takes a number greater than 0.").arg(m_step->accessibleName());
    auto chainages = ChainagesEvery(m_rows.Column(ChainageColumn), *from, *to, *step);
    if (!chainages)
        return GridTexts::tr("These would be more than %1 lines.").arg(MostLinesAtOnce);
    asked.chainages = std::move(*chainages);
    return {};
}

void CBranchLinesDlg::Show()
{
    m_step->setEnabled(m_every->isChecked());
    PlacesOfBranch asked;
    QString text = Read(asked);
    const std::size_t count = asked.chainages.size();
    m_places = {asked.branch,
                text.isEmpty() ? WithoutKnown(std::move(asked.chainages), m_inTable) : std::vector<double>()};
    const auto& chainages = m_places.chainages;
    m_known = text.isEmpty() ? count - chainages.size() : 0;
    if (!chainages.empty()) {
        QStringList first;
        for (std::size_t i = 0; i < std::min<std::size_t>(chainages.size(), 3); ++i)
            first << TextOf(chainages[i]);
        if (chainages.size() > 4)
            first << QStringLiteral("...");
        if (chainages.size() > 3)
            first << TextOf(chainages.back());
        text = GridTexts::Counted(chainages.size(), GridTexts::tr("1 line:"), GridTexts::tr("%1 lines:")) + u' ' +
               first.join(QStringLiteral(", "));
    }
    if (m_known > 0) {
        if (!text.isEmpty())
            text += u'\n';
        text += GridTexts::Counted(m_known, GridTexts::tr("1 is there already and stays as it is."),
                                   GridTexts::tr("%1 are there already and stay as they are."));
    }
    m_summary->setText(text);
    m_buttons->button(QDialogButtonBox::Ok)->setEnabled(!chainages.empty());
}

void CBranchLinesDlg::accept()
{
    if (!m_places.chainages.empty())
        QDialog::accept();
}

void InsertLinesAlong(CGenGrid& grid)
{
    CBranchLinesDlg dialog(grid);
    if (dialog.exec() != QDialog::Accepted)
        return;
    CGridModel& model = *grid.Model();
    const PlacesOfBranch& places = dialog.Places();
    const std::size_t at = FindBranch(model, places.branch).behind, count = places.chainages.size();
    auto lines = LinesAt(model, places);
    if (const QString fault = model.WhyNotBetween(at, *lines); !fault.isEmpty()) {
        KsMessageBox(GridTexts::tr("Nothing was inserted. %1").arg(fault), QMessageBox::Ok, &grid);
        return;
    }
    const int row = model.ShownRow(model.PutLines(GridTexts::tr("Insertion of lines"), at, std::move(lines)));
    QString said = GridTexts::Counted(count, GridTexts::tr("Line inserted"), GridTexts::tr("%1 lines inserted"));
    if (dialog.KnownCount() > 0)
        said += QStringLiteral(", ") +
                GridTexts::Counted(dialog.KnownCount(), GridTexts::tr("1 was there"), GridTexts::tr("%1 were there"));
    model.Document()->Say(said);
    grid.SetCurrentCell(row + 1, 1);
    grid.SelectLines(row + 1, row + int(count));
}
