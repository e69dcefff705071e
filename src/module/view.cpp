#include "module/view.h"

#include "grid/gen_grid.h"
#include "grid/grid_commands.h"
#include "grid/grid_state.h"
#include "grid/lines_view.h"
#include "ks/fc/after_paint.h"
#include "module/find_field.h"
#include "module/help_chapters.h"
#include "module/sheet.h"
#include "pages/framework/ctrl_edit.h"
#include "pages/framework/page.h"
#include "pages/page_table.h"
#include "problems/problem_check.h"
#include "profile/profile_dock.h"
#include "profile/profile_panel.h"
#include "res/strings.h"

#include <QApplication>
#include <QLineEdit>
#include <QTimer>
#include <QUndoStack>
#include <algorithm>
#include <iterator>

namespace {

const QString FrontState = QStringLiteral("front"); // of the tabs
constexpr int LinesMenuPosition = 2;                // the third menu of the main frame

} // namespace

CKavo0_hdView::CKavo0_hdView(QWidget* parent) : CKsProjectView(parent)
{
    setObjectName("hdView");
    setWindowTitle(LoadString(Str::SheetCaption));
    connect(qApp, &QApplication::focusChanged, this, [this](QWidget*, QWidget* now) {
        if (isAncestorOf(now))
            ShowStatus();
    });
}

CKavo0_hdView::~CKavo0_hdView()
{
    KeepArrangement();
    delete m_profile; // which asks this
    m_problems.reset();
    disconnect(qApp, nullptr, this, nullptr); // the focus leaves the pages as they go
    delete m_sheet;                           // while this is still a host
}

CKavo0_hdDoc* CKavo0_hdView::GetDocument() const
{
    return static_cast<CKavo0_hdDoc*>(CView::GetDocument());
}

CGenPropertyPage* CKavo0_hdView::ActivePage() const
{
    return m_sheet ? m_sheet->ActivePage() : nullptr;
}

void CKavo0_hdView::OnInitialUpdate()
{
    m_sheet = new CDlgPropertySheet(this);
    SetContent(m_sheet);
    setFocusProxy(m_sheet);
    // What a file that could not be read would hold is no model to look at.
    const auto allowEditing = [this] { m_sheet->setEnabled(!GetDocument()->ShowsDefaults()); };
    connect(GetDocument(), &CKavo0_hdDoc::FileStateChanged, m_sheet, allowEditing);
    allowEditing();

    CKsProjectView::OnInitialUpdate();
    AddTabs();
    connect(m_sheet, &CDlgPropertySheet::PageChanged, this, [this] {
        RestorePage(m_sheet->currentIndex());
        MovedOn();
        TellLocationIfOther();
        TellProfile();
    });
    m_arranged = KeptArrangement();
    if (auto* page = ActivePage())
        page->OnSetActive();
    RestorePage(m_sheet->currentIndex());
    m_sheet->SetActivePage(m_arranged[FrontState].toInt());
    KsAfterPaint(this, this, [this] {
        MakeOtherPages();
        if (IsActive()) {
            ShowProfile();
            ShowProblems();
        }
    });
}

/// The list of a page, once, when the page is first in front: whoever looks at one page waits for no other.
void CKavo0_hdView::RestorePage(int tab)
{
    const QString key = QString::number(tab);
    const auto* page = m_restored.contains(tab) ? nullptr : ActivePage();
    if (!page)
        return;
    m_restored.insert(tab);
    if (page->GetGrid() && page->GetList())
        GridState::Restore(*page->GetGrid(), m_arranged[key].toMap());
}

/// By the tabs of the pages. Of those that were not looked at stays what was known.
QVariantMap CKavo0_hdView::Arrangement() const
{
    QVariantMap state = m_arranged;
    if (!m_sheet)
        return state;
    for (const int tab : m_restored) {
        const auto* page = m_sheet->PageAt(tab);
        const QVariantMap list = page->GetGrid() && page->GetList() ? GridState::Of(*page->GetGrid()) : QVariantMap();
        list.isEmpty() ? void(state.remove(QString::number(tab))) : void(state[QString::number(tab)] = list);
    }
    state.remove(FrontState);
    if (const int front = m_sheet->currentIndex(); front > 0)
        state[FrontState] = front;
    return state;
}

void CKavo0_hdView::AddTabs()
{
    std::vector<const PageEntry*> tabs;
    for (const PageEntry& entry : PageTable())
        if (entry.tab != NotOnSheet)
            tabs.push_back(&entry);
    std::ranges::sort(tabs, {}, &PageEntry::tab);
    for (const PageEntry* entry : tabs)
        m_sheet->AddPage(entry->caption, [this, entry] { return MakePage(*entry); });
}

std::unique_ptr<CGenPropertyPage> CKavo0_hdView::MakePage(const PageEntry& entry)
{
    auto page = entry.make(GetDocument());
    page->SetHost(this);
    if (entry.offersBranchNames && GetDocument()->ProjectHandle() && page->GetGrid())
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
    for (const PageEntry& entry : PageTable())
        if (entry.tab == NotOnSheet)
            m_offSheet.push_back(MakePage(entry));
    WatchProblems();
}

void CKavo0_hdView::OnUpdate(CView* sender, int hint, CHint* object)
{
    auto* page = ActivePage();
    if (!page)
        return;
    if (hint == CKsDoc::StoreHint)
        page->StoreToDocument();
    else if (hint == CKsDoc::ReloadHint)
        page->LoadFromDocument(GetDocument());
    CKsProjectView::OnUpdate(sender, hint, object);
    if (m_profile)
        m_profile->Refresh();
    if (m_problems)
        m_problems->Restart();
    TellLocationIfOther();
}

bool CKavo0_hdView::MayLeave(KsLeave what)
{
    auto* page = ActivePage();
    return !page || (what == KsLeave::Field ? page->LeaveField() : page->OnKillActive());
}

void CKavo0_hdView::OnActivateView(bool activate, CView* activated, CView* deactivated)
{
    if (activate) {
        EnableLinesMenu(m_linesEnabled);
        ShowProfile();
        ShowProblems();
    }
    CKsProjectView::OnActivateView(activate, activated, deactivated);
}

// ---- what a page tells -------------------------------------------------------------------------

void CKavo0_hdView::EditedLineChanged()
{
    if (auto* page = ActivePage())
        page->StoreToDocument();
    GetDocument()->UpdateAllViews(nullptr, CKsDoc::ReloadHint);
}

void CKavo0_hdView::CurrentLocationChanged()
{
    ShowStatus();
    TellProfile();
    if (MainFrame())
        TellLocationLater();
}

/// Its whole number where it leaves digits out, and how many lines go their own way. That is counted once a step.
CString CKavo0_hdView::FieldText(const QWidget& field) const
{
    const std::pair<const void*, int> now{&field, GetDocument()->UndoStack().index()};
    if (std::exchange(m_countedAt, now) != now)
        m_overrides = ActivePage() ? ActivePage()->OverridesText(field) : CString();
    const auto* edit = qobject_cast<const CCtrlEdit*>(&field);
    QStringList texts{edit ? edit->FullText() : CString(), m_overrides};
    texts.removeAll(CString());
    return texts.join(QStringLiteral("   "));
}

/// The line of the table that is worked in, or the field; and its number where it leaves digits out.
CString CKavo0_hdView::PlaceText() const
{
    if (const QWidget* field = QApplication::focusWidget(); field && isAncestorOf(field))
        if (const QString text = FieldText(*field); !text.isEmpty())
            return text;
    const auto* page = ActivePage();
    const auto* grid = page ? page->LinesGrid() : nullptr;
    return grid ? grid->LineText() : CString();
}

CString CKavo0_hdView::SelectionText() const
{
    const auto* page = ActivePage();
    const auto* grid = page ? page->LinesGrid() : nullptr;
    return grid ? grid->SelectionText() : CString();
}

void CKavo0_hdView::EnableLinesMenu(bool enable)
{
    m_linesEnabled = enable;
    if (auto* frame = MainFrame(); frame && frame->GetActiveView() == this)
        frame->EnableMenuItem(LinesMenuPosition, enable);
}

void CKavo0_hdView::ShowHelp()
{
    CKsMDIFrameWnd* const frame = MainFrame();
    if (!frame)
        return;
    const auto chapters = [view = QPointer(this), frame = QPointer(frame)] {
        std::vector<KsHelpChapter> all;
        if (view)
            all = HelpChapters(*view->m_sheet, *view->GetDocument());
        if (frame)
            std::ranges::move(frame->HelpChapters(), std::back_inserter(all));
        return all;
    };
    CKsHelpWindow::In(*frame).Show(chapters, ChapterOf(m_sheet->currentIndex()));
}

/// A table of a line is on show for the line that is current, so of the pages behind only their lists are meant.
std::vector<HostTable> CKavo0_hdView::TablesOfDocument()
{
    std::vector<HostTable> tables;
    const auto isKnown = [&tables](const CGenGrid& grid) {
        const void* const list = grid.Model()->Rows()->Data();
        return std::ranges::any_of(tables,
                                   [&](const HostTable& each) { return each.grid->Model()->Rows()->Data() == list; });
    };
    const auto add = [&](int tab, CGenGrid& grid) {
        if (!grid.Model()->Rows() || isKnown(grid))
            return;
        grid.Model()->Sync();
        tables.push_back(
            {LoadString(m_sheet->CaptionOf(tab)), &grid, [this, tab] { return m_sheet->SetActivePage(tab); }});
    };
    for (int tab = 0; tab < m_sheet->PageCount(); ++tab) {
        CGenPropertyPage* const page = m_sheet->PageAt(tab);
        CGenGrid* const list = page->GetGrid();
        if (page == ActivePage() && page->LinesGrid())
            for (const HostTable& table : page->TablesOfPage(*page->LinesGrid()))
                add(tab, *table.grid);
        else if (list && list->isEnabled() && page->GetList())
            add(tab, *list);
    }
    return tables;
}

void CKavo0_hdView::FindField()
{
    const std::vector<FoundField> fields = FieldsOf(*m_sheet, *GetDocument());
    const auto found = AskForField(fields, *this);
    if (!found || !m_sheet->SetActivePage(found->tab))
        return;
    if (found->place.data)
        m_sheet->PageAt(found->tab)->Reveal(found->place, true);
    else if (found->control)
        m_sheet->PageAt(found->tab)->ShowControl(*found->control, true);
    if (auto* field = qobject_cast<QLineEdit*>(window()->focusWidget()))
        field->selectAll(); // as when one comes with Tab: what is typed next takes its place
}

void CKavo0_hdView::RevealChange(const ChangePlace& place)
{
    const bool isInFront = ActivePage() && ActivePage()->Shows(place);
    const int tab = isInFront ? m_sheet->currentIndex() : m_sheet->TabWith(place);
    if (tab < 0 || !m_sheet->SetActivePage(tab))
        return;
    m_sheet->PageAt(tab)->Reveal(place, IsActive()); // a window in the background stays there
}

// ---- commands ----------------------------------------------------------------------------------

std::vector<CKsMenuCommand> CKavo0_hdView::LinesMenu() const
{
    std::vector<CKsMenuCommand> menu{{Command::InsertLine, LoadString(Str::MenuInsertLine)}};
    if (GetDocument()->ProjectHandle())
        menu.push_back(
            {Command::FetchLocation, LoadString(Str::MenuFetchLocation), QKeySequence(Qt::CTRL | Qt::Key_L)});
    std::ranges::move(CGridCommands::LineMenu(), std::back_inserter(menu));
    const auto* page = ActivePage();
    const auto* grid = page ? page->LinesGrid() : nullptr;
    menu.push_back({Command::DeleteLine, CGridCommands::DeleteText(grid, LoadString(Str::MenuDeleteLine))});
    menu.push_back(CGridCommands::ClearEntry(grid));
    menu.emplace_back();
    std::ranges::move(CGridCommands::CellMenu(), std::back_inserter(menu));
    menu.emplace_back();
    std::ranges::move(CGridSearch::MenuCommands(), std::back_inserter(menu));
    menu.emplace_back();
    std::ranges::move(LinesView::MenuCommands(), std::back_inserter(menu));
    return menu;
}

std::vector<CKsMenuCommand> CKavo0_hdView::EditMenu() const
{
    return CGridCommands::ClipboardMenu();
}

bool CKavo0_hdView::IsCommandEnabled(int id) const
{
    if (id == KsCommand::Help)
        return true;
    if (id == KsCommand::FindField || id == KsCommand::LongProfile || id == KsCommand::Problems ||
        id == KsCommand::NextProblem || id == KsCommand::PreviousProblem)
        return m_sheet && m_sheet->isEnabled();
    const auto* page = ActivePage();
    const bool isForLines = id == Command::InsertLine || id == Command::DeleteLine || CGridCommands::Knows(id);
    const CGenGrid* grid = !page ? nullptr : isForLines || LinesView::Knows(id) ? page->LinesGrid() : page->GetGrid();
    if (!m_linesEnabled || !grid || !grid->isEnabled())
        return false;
    const bool changes = id == Command::InsertLine || id == Command::DeleteLine || id == Command::FetchLocation;
    if (GetDocument()->IsReadOnly() && changes)
        return false;
    return id == Command::InsertLine      ? true
           : id == Command::DeleteLine    ? grid->HasLinesToDelete()
           : id == Command::FetchLocation ? GetDocument()->ProjectHandle() != 0
           : CGridCommands::Knows(id)     ? CGridCommands::CanRun(id, grid)
           : LinesView::Knows(id)         ? LinesView::CanRun(id, grid)
                                          : m_search.CanRun(id, grid);
}

bool CKavo0_hdView::OnCommand(int id)
{
    auto* page = ActivePage();
    if (!page || !IsCommandEnabled(id) || !MayLeave(KsLeave::Field))
        return false;
    if (id == Command::InsertLine)
        page->AppendLine();
    else if (id == Command::DeleteLine)
        page->DeleteLines();
    else if (id == Command::FetchLocation)
        FetchLocation();
    else if (id == KsCommand::Help)
        page->OnHelp();
    else if (id == KsCommand::FindField)
        FindField();
    else if (id == KsCommand::LongProfile)
        ToggleProfile();
    else if (id == KsCommand::Problems)
        ToggleProblems();
    else if (id == KsCommand::NextProblem || id == KsCommand::PreviousProblem)
        NextProblem(id == KsCommand::NextProblem);
    else if (CGridCommands::Knows(id))
        CGridCommands::Run(id, *page->LinesGrid());
    else if (LinesView::Knows(id))
        LinesView::Run(id, *page->LinesGrid());
    else
        m_search.Run(id, *page->GetGrid());
    return true;
}
