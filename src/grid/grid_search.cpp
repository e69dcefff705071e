#include "grid/grid_search.h"

#include "base/not_given.h"
#include "grid/cell_text.h"
#include "grid/gen_grid.h"
#include "grid/grid_texts.h"
#include "grid/line_dialogs.h"
#include "files/read_number.h"
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

} // namespace

bool SearchRows(CGenGrid& grid, int& row, const LineQuery& query)
{
    constexpr int NameColumn = 0, ChainageColumn = 1;
    const CGridModel& model = *grid.Model();
    const std::string wantedName = query.name.toUpper().toStdString(); // as the column stores them
    const ColumnSpec& chainageColumn = model.Column(ChainageColumn);
    const double wanted = AsShown(chainageColumn, query.chainage);
    for (row = std::max(row, model.FixedRows() + 1); row <= grid.RowCount();) {
        const int line = row++ - 1;
        const std::string name = InCapitals(std::get<std::string>(model.Value(line, NameColumn)));
        if (!NamePasses(name, wantedName, query.nameMatch))
            continue;
        if (query.chainageMatch != ChainageMatch::Any) {
            const CellValue value = model.Value(line, ChainageColumn);
            const auto* number = std::get_if<double>(&value);
            if (!ChainagePasses(AsShown(chainageColumn, number ? *number : NotGiven), wanted, query.chainageMatch))
                continue;
        }
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
        {Command::Search, GridTexts::tr("&Search..."), QKeySequence(Qt::Key_F7)},
        {Command::SearchAgain, GridTexts::tr("Search &Again"), QKeySequence(Qt::Key_F3)},
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
    if (grid.Model()->Shown().IsFiltered())
        text += u'\n' + GridTexts::tr("Lines that the filter hides were not looked at.");
    KsMessageBox(text, QMessageBox::Ok, &grid);
}
