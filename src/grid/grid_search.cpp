#include "grid/grid_search.h"

#include "base/not_given.h"
#include "files/read_number.h"
#include "grid/cell_text.h"
#include "grid/gen_grid.h"
#include "grid/grid_keys.h"
#include "grid/grid_texts.h"
#include "grid/line_dialogs.h"
#include "ks/fc/message_box.h"

#include <algorithm>
#include <utility>

namespace {

/// A chainage as the column's text says it; an empty cell reads as 0.
double AsShown(const ColumnSpec& column, double chainage)
{
    if (chainage == NotGiven)
        return 0;
    return ReadNumber(column.style.UnitConvertFromBase_T(chainage, 1).toStdString()).value_or(chainage);
}

/// A name of a file that was not written by this editor may have small letters.
std::string InCapitals(const std::string& name)
{
    const bool plain =
        std::none_of(name.begin(), name.end(), [](char c) { return (c >= 'a' && c <= 'z') || (c & 0x80); });
    return plain ? name : QString::fromStdString(name).toUpper().toStdString();
}

bool NamePasses(const std::string& name, const std::string& wanted, NameMatch match)
{
    return match == NameMatch::Beginning || wanted.empty() ? name.starts_with(wanted) : name == wanted;
}

bool ChainagePasses(double shown, double wanted, ChainageMatch match)
{
    return match == ChainageMatch::Any || (match == ChainageMatch::Less && shown < wanted) ||
           (match == ChainageMatch::Equal && shown == wanted) || (match == ChainageMatch::Greater && shown > wanted);
}

/// Whether a line is looked for.
class CLineMatch
{
public:
    CLineMatch(const CGridModel& model, const LineQuery& query)
        : m_query(query),
          m_name(query.name.toUpper().toStdString()), // as the column stores them
          m_chainageColumn(model.Column(1)),
          m_chainage(AsShown(m_chainageColumn, query.chainage))
    {
    }
    bool operator()(const CellValue& name, const CellValue& chainage) const
    {
        if (!NamePasses(InCapitals(std::get<std::string>(name)), m_name, m_query.nameMatch))
            return false;
        if (m_query.chainageMatch == ChainageMatch::Any)
            return true;
        const auto* number = std::get_if<double>(&chainage);
        return ChainagePasses(AsShown(m_chainageColumn, number ? *number : NotGiven), m_chainage,
                              m_query.chainageMatch);
    }

private:
    const LineQuery& m_query;
    std::string m_name;
    const ColumnSpec& m_chainageColumn;
    double m_chainage;
};

/// The number of the first line that the filter hides and that is looked for; 0 without one.
int FindHidden(const CGridModel& model, const LineQuery& query)
{
    const CLineMatch passes(model, query);
    IRowSource& rows = *model.Rows();
    const CellAccess &names = *model.Column(0).access, &chainages = *model.Column(1).access;
    for (std::size_t row = rows.FixedRows(); model.Shown().IsFiltered() && row < rows.Count(); ++row)
        if (model.ShownRow(row) < 0 && passes(names.get(rows.At(row)), chainages.get(rows.At(row))))
            return int(row) + 1;
    return 0;
}

} // namespace

bool SearchRows(CGenGrid& grid, int& row, const LineQuery& query)
{
    const CGridModel& model = *grid.Model();
    const CLineMatch passes(model, query);
    for (row = std::max(row, model.FixedRows() + 1); row <= grid.RowCount();) {
        const int line = row++ - 1;
        if (!passes(model.Value(line, 0), model.Value(line, 1)))
            continue;
        grid.clearSelection();
        grid.GotoLine(line + 1);
        return true;
    }
    row = 0;
    return false;
}

std::vector<CKsMenuCommand> CGridSearch::MenuCommands()
{
    return {
        {Command::GotoLine, GridTexts::tr("&Go to Line..."), QKeySequence(Qt::CTRL | Qt::Key_G)},
        {},
        {Command::Search, MenuText(GridAction::Search), KeyOf(GridAction::Search), TextOf(GridAction::Search)},
        {Command::SearchAgain, MenuText(GridAction::SearchAgain), KeyOf(GridAction::SearchAgain),
         TextOf(GridAction::SearchAgain)},
    };
}

bool CGridSearch::Knows(int command)
{
    return command == Command::GotoLine || command == Command::Search || command == Command::SearchAgain;
}

bool CGridSearch::CanRun(int command, const CGenGrid* grid) const
{
    return Knows(command) && grid && grid->isEnabled() && (command != Command::SearchAgain || m_asked);
}

void CGridSearch::Run(int command, CGenGrid& grid)
{
    if (command == Command::GotoLine)
        Goto(grid);
    else if (command == Command::Search)
        Ask(grid);
    else
        Next(grid);
}

void CGridSearch::Goto(CGenGrid& grid)
{
    CGotoDlg dialog(&grid);
    if (dialog.exec() != QDialog::Accepted)
        return;
    grid.ShowLine(dialog.Line());
    grid.setFocus(Qt::OtherFocusReason);
}

void CGridSearch::Ask(CGenGrid& grid)
{
    CSearchDlg dialog(m_query, &grid);
    if (dialog.exec() != QDialog::Accepted)
        return;
    m_query = dialog.Query();
    m_asked = true;
    m_grid = nullptr; // from the top
    Next(grid);
}

void CGridSearch::Next(CGenGrid& grid)
{
    if (std::exchange(m_grid, &grid) != &grid) {
        m_row = 0;
        m_found = false;
    }
    if (SearchRows(grid, m_row, m_query)) {
        m_found = true;
        grid.setFocus(Qt::OtherFocusReason); // the next key is meant for the line found
        return;
    }
    const bool hadFound = std::exchange(m_found, false);
    QString text = hadFound ? GridTexts::tr("The last occurence of searched item already found")
                            : GridTexts::tr("Searched item not found");
    const int hidden = FindHidden(*grid.Model(), m_query);
    if (hidden == 0) {
        KsMessageBox(text, QMessageBox::Ok, &grid);
        return;
    }
    text += u'\n' + GridTexts::tr("Line %1 is what is searched, but hidden by the filter. Show it?").arg(hidden);
    if (KsMessageBox(text, QMessageBox::Yes | QMessageBox::No, &grid) != QMessageBox::Yes)
        return;
    grid.ShowLine(hidden);
    grid.setFocus(Qt::OtherFocusReason);
}
