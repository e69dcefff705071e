// The commands of the cross sections' view.
#include "editors/cross_sections/view.h"

#include "grid/lines_view.h"

#include <algorithm>
#include <iterator>

std::vector<CKsMenuCommand> CCrossSectionView::LinesMenu() const
{
    // Their keys belong to the tables: in a cell's editor they mean something else.
    std::vector<CKsMenuCommand> menu{
        {Command::InsertLine, tr("&Insert Line"), {}, tr("Adds a cross section or a point below the current one")}};
    std::ranges::move(CGridCommands::LineMenu(), std::back_inserter(menu));
    menu.push_back({Command::DeleteLine,
                    CGridCommands::DeleteText(LinesOrNull(), tr("&Delete Lines")),
                    {},
                    tr("Deletes the selected cross sections or points")});
    menu.push_back(CGridCommands::ClearEntry(LinesOrNull()));
    menu.emplace_back();
    std::ranges::move(CGridCommands::CellMenu(), std::back_inserter(menu));
    menu.emplace_back();
    std::ranges::move(CGridSearch::MenuCommands(), std::back_inserter(menu));
    menu.emplace_back();
    std::ranges::move(LinesView::MenuCommands(), std::back_inserter(menu));
    menu.emplace_back();
    menu.push_back({CrossSectionCommand::Previous, tr("Pre&vious Cross Section"),
                    QKeySequence(Qt::ALT | Qt::Key_PageUp), tr("Shows the cross section above")});
    menu.push_back({CrossSectionCommand::Next, tr("Ne&xt Cross Section"), QKeySequence(Qt::ALT | Qt::Key_PageDown),
                    tr("Shows the cross section below")});
    return menu;
}

bool CCrossSectionView::IsCommandEnabled(int id) const
{
    if (!m_plot)
        return false;
    switch (id) {
    case CrossSectionCommand::Previous:
        return CurrentSection() > 0;
    case CrossSectionCommand::Next:
        return Document()->Section(CurrentSection() + 1);
    default:
        return CTablesView::IsCommandEnabled(id);
    }
}

bool CCrossSectionView::OnCommand(int id)
{
    if (id != CrossSectionCommand::Previous && id != CrossSectionCommand::Next)
        return CTablesView::OnCommand(id);
    if (!IsCommandEnabled(id))
        return false;
    if (MayLeave(KsLeave::Field)) // otherwise the user has been told
        GoToSection(CurrentSection() + (id == CrossSectionCommand::Next ? 1 : -1));
    return true;
}
