// Lines of a paste that go nowhere, and what is left out of those that go somewhere.
#include "grid/paste_plan.h"

#include "grid/grid_texts.h"

#include <algorithm>

/// Nobody knows which line it would be.
void CPastePlan::LeaveUnnamedLines()
{
    for (const Fault& fault : m_faults)
        if (fault.column >= 0 && m_rows->Column(m_choice.columns[std::size_t(fault.column)].target).namesLine)
            m_rowOf[fault.line] = Nowhere;
}

/// Rows that depend on each other. A line that is left out leaves its row as it was, which others may not fit with.
void CPastePlan::FindRuleFaults()
{
    constexpr int most = 20; // times that all lines are looked at for the few that do not fit
    if (!m_complaint.isEmpty() || !m_rows->Rows()->HasRules())
        return;
    for (int time = 0; LeaveMisfits(); ++time)
        if (time == most)
            LeaveOldLines();
}

/// Leaves out the lines that do not fit with the others now; false when all do.
bool CPastePlan::LeaveMisfits()
{
    std::vector<std::size_t> lines;
    for (std::size_t line = 0; line < Lines(); ++line)
        if (!GoesNowhere(line))
            lines.push_back(line);
    const auto faults = m_rows->Faults(Cells(m_values, m_left), std::size_t(-1));
    for (const auto& fault : faults) {
        const std::size_t line = lines[fault.row];
        if (GoesNowhere(line))
            continue; // several rows do not fit with it
        const auto column = std::ranges::find_if(m_choice.columns, [&](const PasteChoice::Column& each) {
            return each.target >= 0 && m_rows->Column(each.target).name == fault.field;
        });
        const bool isThere = column != m_choice.columns.end() && column - m_choice.columns.begin() < WidthOf(line);
        AddFault(line, isThere ? int(column - m_choice.columns.begin()) : -1, fault.text);
        m_rowOf[line] = Nowhere;
    }
    return !faults.empty();
}

/// What is new among the others does not fit because of itself.
void CPastePlan::LeaveOldLines()
{
    for (std::size_t line = 0; line < Lines(); ++line) {
        if (!RowOf(line))
            continue;
        AddFault(line, -1, GridTexts::tr("It may not fit with lines that are left out."));
        m_rowOf[line] = Nowhere;
    }
}

std::size_t CPastePlan::LinesLeftOut() const
{
    return std::size_t(std::ranges::count(m_rowOf, Nowhere));
}

std::size_t CPastePlan::CellsLeftOut() const
{
    return std::size_t(
        std::ranges::count_if(m_faults, [this](const Fault& fault) { return !GoesNowhere(fault.line); }));
}

/// Every text that has a cell, of lines that go somewhere, but for those that do not fit.
void CPastePlan::CountCells()
{
    std::vector<std::size_t> going{0}; // of so many first columns
    for (const auto& column : m_choice.columns)
        going.push_back(going.back() + (column.target >= 0));
    m_cellCount = 0;
    for (std::size_t line = 0; line < Lines(); ++line)
        m_cellCount += GoesNowhere(line) ? 0 : going[std::size_t(WidthOf(line))];
    m_cellCount -= CellsLeftOut();
}
