// The commands of the cross sections' view.
#include "editors/cross_sections/view.h"

#include <QMenu>
#include <QTableView>

std::vector<CKsMenuCommand> CCrossSectionView::LinesMenu() const
{
    // Their keys belong to the tables: in a cell's editor they mean something else.
    return {
        {CrossSectionCommand::InsertLine,
         tr("&Insert Line"),
         {},
         tr("Adds a cross section or a point below the current one")},
        {CrossSectionCommand::DeleteLine, tr("&Delete Lines"), {}, tr("Deletes the selected cross sections or points")},
        {},
        {CrossSectionCommand::Previous, tr("P&revious Cross Section"), QKeySequence(Qt::ALT | Qt::Key_PageUp),
         tr("Shows the cross section above")},
        {CrossSectionCommand::Next, tr("&Next Cross Section"), QKeySequence(Qt::ALT | Qt::Key_PageDown),
         tr("Shows the cross section below")}};
}

bool CCrossSectionView::IsCommandEnabled(int id) const
{
    if (!m_plot)
        return false;
    switch (id) {
    case CrossSectionCommand::InsertLine:
        return m_lines == m_sections || CurrentSection() >= 0;
    case CrossSectionCommand::DeleteLine:
        return m_lines->selectionModel()->hasSelection();
    case CrossSectionCommand::Previous:
        return CurrentSection() > 0;
    case CrossSectionCommand::Next:
        return CurrentSection() + 1 < m_sectionTable->rowCount();
    default:
        return false;
    }
}

bool CCrossSectionView::OnCommand(int id)
{
    if (!IsCommandEnabled(id))
        return false;
    switch (id) {
    case CrossSectionCommand::InsertLine:
        InsertLine();
        break;
    case CrossSectionCommand::DeleteLine:
        DeleteLines();
        break;
    default:
        StepSection(id == CrossSectionCommand::Next ? 1 : -1);
    }
    return true;
}

void CCrossSectionView::ShowContextMenu(QTableView* table, const QPoint& at)
{
    m_lines = table;
    QMenu menu(this);
    for (const CKsMenuCommand& command : LinesMenu()) {
        if (command.text.isEmpty()) {
            menu.addSeparator();
            continue;
        }
        QAction* action = menu.addAction(command.text);
        action->setShortcut(command.shortcut);
        action->setEnabled(IsCommandEnabled(command.id));
        connect(action, &QAction::triggered, this, [this, id = command.id] { OnCommand(id); });
    }
    menu.exec(table->viewport()->mapToGlobal(at));
}

void CCrossSectionView::StepSection(int step)
{
    const int row = CurrentSection() + step;
    if (row >= 0 && row < m_sectionTable->rowCount())
        GoToRow(m_sections, row);
}

void CCrossSectionView::InsertLine()
{
    if (!IsCommandEnabled(CrossSectionCommand::InsertLine))
        return;
    QTableView* table = m_lines;
    const int row = table->currentIndex().row();
    const int line = table == m_sections ? m_sectionTable->InsertLine(row, NewBranch()) : m_pointTable->InsertLine(row);
    GoToRow(table, line);
    table->setFocus();
}

void CCrossSectionView::DeleteLines()
{
    std::vector<int> rows;
    const auto selected = m_lines->selectionModel()->selectedRows();
    for (const QModelIndex& index : selected)
        rows.push_back(index.row());
    static_cast<CLinesTable*>(m_lines->model())->RemoveLines(rows);
}
