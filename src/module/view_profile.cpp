// The view and the long profile of its document: what the profile asks, and what it is told.
#include "module/view.h"

#include "files/declare_field.h"
#include "grid/gen_grid.h"
#include "ks/fc/branch_name.h"
#include "ks/fc/exchange.h"
#include "module/sheet.h"
#include "pages/framework/page.h"
#include "profile/profile_dock.h"
#include "profile/profile_panel.h"
#include "res/strings.h"

#include <QUndoStack>
#include <algorithm>

/// Made when it is first shown. It belongs to the dock's window, and goes with this view.
CProfilePanel& CKavo0_hdView::Profile()
{
    if (!m_profile)
        m_profile = new CProfilePanel(*this, GetDocument()->UndoStack());
    return *m_profile;
}

/// In the dock, if the user has that in sight.
void CKavo0_hdView::ShowProfile()
{
    CKsMDIFrameWnd* const frame = MainFrame();
    if (!frame || !m_sheet || !CKsDock::IsWanted(CProfileDock::Name))
        return;
    auto& dock = KsDockIn<CProfileDock>(*frame);
    Profile().setWindowTitle(GetDocument()->GetTitle());
    dock.ShowPanel(Profile());
    dock.show();
    TellProfile();
}

void CKavo0_hdView::ToggleProfile()
{
    CKsMDIFrameWnd* const frame = MainFrame();
    if (!frame)
        return;
    auto& dock = KsDockIn<CProfileDock>(*frame);
    dock.Toggle();
    ShowProfile();
    if (CKsDock::IsWanted(CProfileDock::Name))
        dock.raise();
}

/// The line that is current now.
void CKavo0_hdView::TellProfile()
{
    const auto* page = ActivePage();
    const auto* grid = m_profile && page ? page->GetGrid() : nullptr;
    if (!m_profile)
        return;
    const auto [branch, chainage] = CurrentLocation();
    const int line = grid ? grid->CurrentLine() : 0;
    m_profile->SetCurrent(FrontTab(), std::size_t(std::max(line - 1, 0)), line > 0 ? branch : QString(), chainage);
}

std::vector<ProfileTable> CKavo0_hdView::ProfileTables()
{
    std::vector<ProfileTable> tables;
    for (int tab = 0; tab < m_sheet->PageCount(); ++tab) {
        const CGenPropertyPage* page = m_sheet->PageAt(tab);
        CGenGrid* const grid = page->GetGrid();
        if (grid && page->GetList() && grid->Model()->Rows())
            tables.push_back({tab, LoadString(m_sheet->CaptionOf(tab)), grid});
    }
    return tables;
}

int CKavo0_hdView::FrontTab() const
{
    return m_sheet->currentIndex();
}

std::vector<BedLevel> CKavo0_hdView::BedLevels(const QString& branch)
{
    CObList items;
    GetDocument()->AskProject(KsRequest::BedLevels, this, &items);
    std::vector<BedLevel> levels;
    for (const auto& item : items) {
        const auto* level = dynamic_cast<const CKvrCBEBedLevel*>(item.get());
        if (level && KsSameBranch(level->branch, branch))
            levels.push_back({level->chainage, level->bed, level->leftBank, level->rightBank});
    }
    std::ranges::stable_sort(levels, {}, &BedLevel::chainage);
    return levels;
}

bool CKavo0_hdView::AreDepths(std::string_view field) const
{
    return field == FieldOf(&HD_Initial::InitialH).name && GetDocument()->Parameters().Global.iLevelDepth == 1;
}

bool CKavo0_hdView::ShowCell(const ProfileTable& table, std::size_t row, int column)
{
    if (!m_sheet->SetActivePage(table.tab))
        return false;
    const auto& rows = *table.grid->Model()->Rows();
    m_sheet->PageAt(table.tab)->Reveal(
        {.data = rows.Data(), .row = int(row) + 1, .column = column + 1, .list = rows.List()}, false);
    return true;
}
