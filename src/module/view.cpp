#include "module/view.h"

#include "ks/fc/after_paint.h"
#include "ks/fc/message_box.h"
#include "ks/fc/status.h"
#include "ks/language/language.h"
#include "module/file_bar.h"
#include "module/page_table.h"
#include "module/sheet.h"
#include "grid/gen_grid.h"
#include "grid/goto_dlg.h"
#include "pages/framework/page.h"
#include "grid/search_dlg.h"
#include "res/strings.h"

#include <QTimer>
#include <QUndoStack>
#include <QVBoxLayout>
#include <algorithm>

namespace {

constexpr int LinesMenuPosition = 2; // the third menu of the main frame

} // namespace

CKavo0_hdView::CKavo0_hdView(QWidget* parent) : CView(parent)
{
    setObjectName("hdView");
    setWindowTitle(LoadString(Str::SheetCaption));
}

CKavo0_hdView::~CKavo0_hdView()
{
    if (auto* document = GetDocument()) {
        document->LeaveProject(this, document->GetPathName());
        document->DataChange(document->GetPathName());
    }
    delete m_sheet; // while this is still a host
}

CKavo0_hdDoc* CKavo0_hdView::GetDocument() const
{
    return static_cast<CKavo0_hdDoc*>(CView::GetDocument());
}

CGenPropertyPage* CKavo0_hdView::ActivePage() const
{
    return m_sheet ? m_sheet->ActivePage() : nullptr;
}

CKsMDIFrameWnd* CKavo0_hdView::MainFrame() const
{
    return qobject_cast<CKsMDIFrameWnd*>(window());
}

void CKavo0_hdView::OnInitialUpdate()
{
    CView::OnInitialUpdate();
    m_sheet = new CDlgPropertySheet(this);
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setSpacing(0);
    layout->addWidget(new CFileBar(*GetDocument(), this));
    layout->addWidget(m_sheet, 1);
    setFocusProxy(m_sheet);
    const auto allowEditing = [this] { m_sheet->setEnabled(!GetDocument()->IsReadOnly()); };
    connect(GetDocument(), &CKavo0_hdDoc::FileStateChanged, m_sheet, allowEditing);
    allowEditing();

    AddTabs();
    m_inProject = GetDocument()->GetProjectInfo(this, GetDocument()->GetPathName());
    connect(m_sheet, &CDlgPropertySheet::PageChanged, this, [this] {
        m_said.clear();
        ShowLine();
    });
    connect(GetDocument(), &CKavo0_hdDoc::Said, this, &CKavo0_hdView::Say);
    for (auto switched : {&KsUnits::Changed, &KsUnits::DigitsChanged})
        connect(&KsUnits::Instance(), switched, this, [this] { OnUpdate(nullptr, Hint::Reload, nullptr); });
    connect(&KsLanguage::Instance(), &KsLanguage::Changed, this, &CKavo0_hdView::ShowLine);
    connect(GetDocument(), &CKavo0_hdDoc::Reveal, this, &CKavo0_hdView::RevealChange);
    if (auto* page = ActivePage())
        page->OnSetActive();
    KsAfterPaint(this, this, [this] { MakeOtherPages(); });
}

void CKavo0_hdView::AddTabs()
{
    std::vector<const PageEntry*> tabs;
    for (const PageEntry& entry : PageTable()) {
        if (entry.tab != NotOnSheet)
            tabs.push_back(&entry);
    }
    std::sort(tabs.begin(), tabs.end(), [](const PageEntry* a, const PageEntry* b) { return a->tab < b->tab; });
    for (const PageEntry* entry : tabs)
        m_sheet->AddPage(entry->caption, [this, entry] { return MakePage(*entry); });
}

std::unique_ptr<CGenPropertyPage> CKavo0_hdView::MakePage(const PageEntry& entry)
{
    auto page = entry.make(GetDocument());
    page->SetHost(this);
    if (entry.offersBranchNames && m_inProject && page->GetGrid())
        page->GetGrid()->SetBranchNameColumn(1);
    return page;
}

// One page a turn of the event loop: the first page is painted, and answers, before the others are made.
void CKavo0_hdView::MakeOtherPages()
{
    if (m_sheet->MakeNextPage()) {
        QTimer::singleShot(0, this, &CKavo0_hdView::MakeOtherPages);
        return;
    }
    for (const PageEntry& entry : PageTable()) {
        if (entry.tab == NotOnSheet)
            m_offSheet.push_back(MakePage(entry));
    }
}

void CKavo0_hdView::OnUpdate(CView*, int hint, CHint*)
{
    auto* page = ActivePage();
    if (!page)
        return;
    if (hint == Hint::Store)
        page->StoreToDocument();
    else if (hint == Hint::Reload)
        page->LoadFromDocument(GetDocument());
    m_said.clear(); // of what was before
    ShowLine();     // a paste or an undone step may have changed the list and the current cell
}

bool CKavo0_hdView::MayLeave(KsLeave what)
{
    auto* page = ActivePage();
    return !page || (what == KsLeave::Field ? page->LeaveField() : page->OnKillActive());
}

void CKavo0_hdView::OnActivateView(bool activate, CView* activated, CView* deactivated)
{
    if (activate) {
        SendToolbarMessage(KsMessage::ShowToolbar());
        EnableLinesMenu(m_linesEnabled);
        ShowLine();
    } else if (activated) {
        if (activated == deactivated)
            SendToolbarMessage(KsMessage::HideToolbar());
        if (!qobject_cast<CKavo0_hdView*>(activated))
            SendToolbarMessage(KsMessage::HideToolbar());
    }
    CView::OnActivateView(activate, activated, deactivated);
}

LRESULT CKavo0_hdView::WindowProc(unsigned message, WPARAM wParam, LPARAM lParam)
{
    if (message == KsMessage::BetweenEditors())
        return AnswerEditor(wParam, reinterpret_cast<CKSComm_Package*>(lParam));
    if (message == KsMessage::ProjectManagement() && wParam != 2)
        return 0;
    return CView::WindowProc(message, wParam, lParam);
}

// ---- what a page tells -------------------------------------------------------------------------

void CKavo0_hdView::EditedLineChanged(int /*column*/)
{
    if (auto* page = ActivePage())
        page->StoreToDocument();
    GetDocument()->UpdateAllViews(nullptr, Hint::Reload);
}

void CKavo0_hdView::CurrentLocationChanged()
{
    ShowLine();
    if (MainFrame())
        TellLocationLater();
}

QStringList CKavo0_hdView::LineTexts() const
{
    const auto* page = ActivePage();
    const auto* grid = page ? page->LinesGrid() : nullptr;
    const QString line = grid ? grid->LineText() : QString();
    return line.isEmpty() ? QStringList() : QStringList(line);
}

/// In the status bar: the line of the table that is worked in, the number of its current cell where the cell leaves
/// digits out, and what has just been done.
void CKavo0_hdView::ShowLine()
{
    if (!MainFrame() || MainFrame()->GetActiveView() != this)
        return;
    QStringList parts = LineTexts();
    if (m_saidAt != parts)
        m_said.clear(); // the user has gone on
    if (!m_said.isEmpty())
        parts << m_said;
    KsTellStatus(*this, parts.join(QStringLiteral("   ")));
}

/// When the present event is over: lines that become current in it are shown first, and would hide what is said.
void CKavo0_hdView::Say(const QString& text)
{
    QTimer::singleShot(0, this, [this, text] {
        m_said = text;
        m_saidAt = LineTexts();
        ShowLine();
    });
}

void CKavo0_hdView::EnableLinesMenu(bool enable)
{
    m_linesEnabled = enable;
    if (auto* frame = MainFrame(); frame && frame->GetActiveView() == this)
        frame->EnableMenuItem(LinesMenuPosition, enable);
}

void CKavo0_hdView::RevealChange(const ChangePlace& place)
{
    int tab = m_sheet->currentIndex();
    if (!ActivePage() || !ActivePage()->Shows(place))
        for (tab = 0; tab < m_sheet->PageCount() && !m_sheet->PageAt(tab)->Shows(place);)
            ++tab;
    if (tab == m_sheet->PageCount() || !m_sheet->SetActivePage(tab))
        return;
    // A window in the background stays there.
    const bool isActive = !MainFrame() || MainFrame()->GetActiveView() == this;
    m_sheet->PageAt(tab)->Reveal(place, isActive);
}

// ---- commands ----------------------------------------------------------------------------------

std::vector<CKsMenuCommand> CKavo0_hdView::LinesMenu() const
{
    std::vector<CKsMenuCommand> menu{
        {Command::InsertLine, LoadString(Str::MenuInsertLine), QKeySequence()},
        {Command::DeleteLine, LoadString(Str::MenuDeleteLine), QKeySequence()},
        {},
        {Command::GotoLine, LoadString(Str::MenuGotoLine), QKeySequence(Qt::CTRL | Qt::Key_G)},
        {},
        {Command::Search, LoadString(Str::MenuSearch), QKeySequence(Qt::Key_F7)},
        {Command::SearchAgain, LoadString(Str::MenuSearchAgain), QKeySequence(Qt::Key_F3)},
    };
    if (m_inProject)
        menu.insert(menu.begin() + 1,
                    {Command::FetchLocation, LoadString(Str::MenuFetchLocation), QKeySequence(Qt::CTRL | Qt::Key_L)});
    return menu;
}

bool CKavo0_hdView::IsCommandEnabled(int id) const
{
    const auto* page = ActivePage();
    const auto isUsable = [](const CGenGrid* grid) { return grid && grid->isEnabled(); };
    const bool lines = m_linesEnabled && page && isUsable(page->GetGrid());
    switch (id) {
    case Command::InsertLine:
        return m_linesEnabled && page && isUsable(page->LinesGrid());
    case Command::DeleteLine:
        return m_linesEnabled && page && isUsable(page->LinesGrid()) && page->LinesGrid()->HasLinesToDelete();
    case Command::GotoLine:
    case Command::Search:
        return lines;
    case Command::FetchLocation:
        return lines && m_inProject;
    case Command::SearchAgain:
        return lines && m_search.asked;
    case KsCommand::Help:
        return true;
    default:
        return false;
    }
}

bool CKavo0_hdView::OnCommand(int id)
{
    auto* page = ActivePage();
    if (!page || !IsCommandEnabled(id) || !MayLeave(KsLeave::Field))
        return false;
    switch (id) {
    case Command::InsertLine:
        page->AppendLine();
        return true;
    case Command::DeleteLine:
        page->DeleteLines();
        return true;
    case Command::FetchLocation:
        FetchLocation();
        return true;
    case Command::GotoLine:
        GotoLine();
        return true;
    case Command::Search:
        Search();
        return true;
    case Command::SearchAgain:
        SearchAgain();
        return true;
    case KsCommand::Help:
        page->OnHelp();
        return true;
    default:
        return false;
    }
}

void CKavo0_hdView::GotoLine()
{
    CGotoDlg dialog(this);
    if (dialog.exec() != QDialog::Accepted)
        return;
    ActivePage()->GotoLine(dialog.Line());
    ActivePage()->GetGrid()->setFocus(Qt::OtherFocusReason);
}

void CKavo0_hdView::Search()
{
    CSearchDlg dialog(m_search.name, m_search.chainage, m_search.chainageCriterion, m_search.nameCriterion, this);
    if (dialog.exec() != QDialog::Accepted)
        return;
    m_search = {dialog.RiverName(), dialog.Chainage(), dialog.ChainageCriterion(), dialog.NameCriterion()};
    m_search.asked = true;
    m_search.page = ActivePage();
    SearchAgain();
}

void CKavo0_hdView::SearchAgain()
{
    auto* grid = ActivePage() ? ActivePage()->GetGrid() : nullptr;
    if (!grid)
        return;
    if (std::exchange(m_search.page, ActivePage()) != ActivePage()) {
        m_search.row = 0;
        m_search.found = false;
    }
    if (grid->SearchRows(m_search.row, m_search.name, m_search.chainage, m_search.chainageCriterion,
                         m_search.nameCriterion)) {
        m_search.found = true;
        grid->setFocus(Qt::OtherFocusReason); // the next key is meant for the line found
        return;
    }
    const bool hadFound = std::exchange(m_search.found, false);
    KsMessageBox(LoadString(hadFound ? Str::LastOccurrence : Str::NotFound), QMessageBox::Ok, this);
}
