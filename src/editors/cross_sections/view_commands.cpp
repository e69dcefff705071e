// The commands of the cross sections' view.
#include "editors/cross_sections/view.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QMenu>
#include <algorithm>

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
    case KsCommand::Copy: // a cell's editor has a text of its own
        return m_lines->hasFocus() && m_lines->selectionModel()->hasSelection();
    case KsCommand::Paste:
        return m_points->hasFocus() && CurrentSection() >= 0;
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
    if (id != KsCommand::Copy && !MayLeave(KsLeave::Field))
        return true; // the user has been told
    switch (id) {
    case CrossSectionCommand::InsertLine:
        InsertLine();
        break;
    case CrossSectionCommand::DeleteLine:
        DeleteLines();
        break;
    case KsCommand::Copy:
        CopyLines();
        break;
    case KsCommand::Paste:
        PasteLines();
        break;
    default:
        StepSection(id == CrossSectionCommand::Next ? 1 : -1);
    }
    return true;
}

void CCrossSectionView::ShowContextMenu(CLinesView* table, const QPoint& at)
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
    CLinesView* table = m_lines;
    const int row = table->currentIndex().row();
    const int line = table == m_sections ? m_sectionTable->InsertLine(row, NewBranch()) : m_pointTable->InsertLine(row);
    GoToRow(table, line);
    table->setFocus();
}

/// Increasing.
std::vector<int> CCrossSectionView::SelectedRows() const
{
    std::vector<int> rows;
    const auto selected = m_lines->selectionModel()->selectedRows();
    for (const QModelIndex& index : selected)
        rows.push_back(index.row());
    std::sort(rows.begin(), rows.end());
    return rows;
}

void CCrossSectionView::DeleteLines()
{
    static_cast<CSectionLines*>(m_lines->model())->RemoveLines(SelectedRows());
}

void CCrossSectionView::CopyLines()
{
    if (const QString text = static_cast<CSectionLines*>(m_lines->model())->TextOf(SelectedRows()); !text.isEmpty())
        QGuiApplication::clipboard()->setText(text);
}

void CCrossSectionView::PasteLines()
{
    if (!IsCommandEnabled(KsCommand::Paste))
        return;
    const int row = m_pointTable->InsertText(m_points->currentIndex().row(), QGuiApplication::clipboard()->text());
    if (row >= 0)
        GoToRow(m_points, row);
}
