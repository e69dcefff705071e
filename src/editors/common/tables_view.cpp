#include "editors/common/tables_view.h"

#include "editors/common/branch_names.h"
#include "grid/grid_keys.h"
#include "grid/grid_state.h"
#include "grid/grid_widths.h"
#include "grid/lines_view.h"

#include <QApplication>
#include <QHeaderView>
#include <QLabel>
#include <QScrollArea>
#include <QSplitter>
#include <QStyle>
#include <QUndoStack>
#include <QVBoxLayout>
#include <algorithm>
#include <utility>

static const QString MainState = QStringLiteral("main");
constexpr int LeastPicture = 150; // pixels of height
static const QList<int> TablesSizes = {600, 400}; // as shares: the first table has more columns

CTablesView::~CTablesView()
{
    KeepArrangement();
    for (CGenGrid* table : m_tables) { // it goes later, and must not report to what is left of this
        table->SetHost(nullptr);
        table->selectionModel()->disconnect(this);
    }
}

void CTablesView::MakeContent(QWidget& picture, int pictureWidth, int tablesWidth, const char* mainName,
                              const char* partsName)
{
    m_splitter = new QSplitter(Qt::Horizontal, this);
    m_side = new QSplitter(Qt::Vertical);
    m_sizes = {pictureWidth, tablesWidth};
    m_main = AddTable(*m_side, mainName);
    m_parts = AddTable(*m_side, partsName);
    m_side->setSizes(TablesSizes);
    m_lines = m_main.grid;
    m_splitter->addWidget(&picture);
    m_splitter->addWidget(m_side);
    m_splitter->setStretchFactor(0, pictureWidth); // whatever the window's size
    m_splitter->setStretchFactor(1, tablesWidth);
    m_splitter->setCollapsible(0, false);
    m_splitter->setSizes(m_sizes);
    picture.setMinimumHeight(LeastPicture);
    auto* area = new QScrollArea; // a window that is too small for all of it scrolls
    area->setWidgetResizable(true);
    area->setFrameShape(QFrame::NoFrame);
    area->setFocusPolicy(Qt::NoFocus);
    area->setWidget(m_splitter);
    SetContent(area);
}

/// In a narrow window the tables stand below the picture, which would have no width left: beside each other, or where
/// that shows half of their columns one below the other.
void CTablesView::resizeEvent(QResizeEvent* event)
{
    CKsProjectView::resizeEvent(event);
    if (!m_splitter)
        return;
    constexpr int leastBeside = 150, leastForTwo = 90; // digits: a picture and two columns of a table; two tables
    const int digits = width() / fontMetrics().horizontalAdvance(u'0');
    const auto whole = digits < leastBeside ? Qt::Vertical : Qt::Horizontal;
    const auto side = digits < leastBeside && digits >= leastForTwo ? Qt::Horizontal : Qt::Vertical;
    for (CGenGrid* table : m_tables)
        KeepInSight(*table, whole == Qt::Horizontal);
    if (whole == m_splitter->orientation() && side == m_side->orientation())
        return;
    m_splitter->setOrientation(whole);
    m_side->setOrientation(side);
    m_splitter->setSizes(whole == side ? QList<int>{500, 500} : m_sizes);
    m_side->setSizes(TablesSizes);
}

/// Of each table the header and two lines, and beside the smallest picture two columns.
void CTablesView::KeepInSight(CGenGrid& table, bool isBeside)
{
    constexpr int letters = 31; // row numbers included
    constexpr int least = 120;  // pixels, below the picture: the columns scroll
    table.setMinimumWidth(isBeside ? letters * table.fontMetrics().averageCharWidth() : least);
    const int bar = table.style()->pixelMetric(QStyle::PM_ScrollBarExtent);
    table.setMinimumHeight(table.horizontalHeader()->sizeHint().height() + bar + 2 * table.frameWidth() +
                           2 * table.verticalHeader()->defaultSectionSize());
}

CTablesView::Table CTablesView::AddTable(QSplitter& side, const char* name)
{
    auto* table = new CGenGrid;
    table->setObjectName(QString::fromLatin1(name));
    table->SetHost(this);
    KeepInSight(*table, true);
    table->SetLineChoice(LineChoice::LinesOfCells);
    auto* title = new QLabel;
    title->setWordWrap(true);
    title->setBuddy(table);
    auto* pane = new QWidget;
    auto* layout = new QVBoxLayout(pane);
    layout->setContentsMargins(6, 6, 6, 6);
    layout->addWidget(title);
    layout->addWidget(table);
    side.addWidget(pane);
    connect(table->selectionModel(), &QItemSelectionModel::selectionChanged, this, &CTablesView::CommandsChanged);
    m_tables.push_back(table);
    return {table, title};
}

void CTablesView::OnInitialUpdate()
{
    CKsProjectView::OnInitialUpdate();
    Retranslate();
    ShowDocument();
    GridState::Restore(*m_main.grid, KeptArrangement()[MainState].toMap());
    connect(
        &KsUnits::Instance(), &KsUnits::Changed, this,
        [this] {
            for (const CGenGrid* table : m_tables)
                table->Widths().MakeRoom();
        },
        Qt::QueuedConnection); // when the tables show the new unit
}

/// Tool bars show what can be done with what is selected.
void CTablesView::CommandsChanged()
{
    if (auto* frame = MainFrame())
        emit frame->CommandStateChanged();
}

void CTablesView::OnUpdate(CView* sender, int hint, CHint* object)
{
    if (hint == CKsDoc::StoreHint)
        MayLeave(KsLeave::Field);
    else if (hint == CKsDoc::ReloadHint && !m_tables.empty()) // not before the first update
        ShowDocument();
    CKsProjectView::OnUpdate(sender, hint, object);
}

void CTablesView::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange && !m_tables.empty()) {
        Retranslate();
        ShowDocument();
    }
    CKsProjectView::changeEvent(event);
}

int CTablesView::CurrentLine() const
{
    const auto rows = m_main.grid ? m_main.grid->Model()->Rows() : nullptr;
    return rows ? std::min(m_main.grid->CurrentLine(), int(rows->Count())) - 1 : -1;
}

void CTablesView::LineCurrent(CGenGrid& grid)
{
    if (&grid == m_main.grid)
        ShowParts();
}

QVariantMap CTablesView::Arrangement() const
{
    const QVariantMap main = m_main.grid ? GridState::Of(*m_main.grid) : QVariantMap();
    return main.isEmpty() ? QVariantMap() : QVariantMap{{MainState, main}};
}

void CTablesView::ShowDocument()
{
    m_main.grid->Reload();
    ShowParts();
}

void CTablesView::ShowParts()
{
    const int line = CurrentLine();
    if (std::exchange(m_partsOf, line) != line)
        m_parts.grid->Model()->SetSource(*ProjectDoc(), MakePartRows(line));
    m_parts.grid->setEnabled(line >= 0);
    ShowInPicture(line);
    m_parts.grid->Refresh();
    m_parts.title->setText(PartTitle());
}

/// A part is shown once its line is current. The view that the user does not work in stays where it is.
void CTablesView::RevealChange(const ChangePlace& place)
{
    const void* const lines = m_main.grid->Model()->Rows()->Data();
    const bool isPart = place.list == lines;
    if ((!isPart && place.data != lines) || IsEditing() || (!IsActive() && ProjectDoc()->Views().size() > 1))
        return;
    const int column = std::max(place.column, 1);
    const auto show = [](CGenGrid& grid, int row, int itsColumn, bool isGone) {
        isGone ? grid.ShowPlace(row, itsColumn) : grid.ShowLine(row, itsColumn);
    };
    if (isPart)
        show(*m_main.grid, place.listRow, m_main.grid->CurrentColumn(), false);
    show(isPart ? *m_parts.grid : *m_main.grid, place.row, column, place.isGone);
    if (IsActive())
        (isPart ? m_parts : m_main).grid->setFocus(Qt::OtherFocusReason);
}

// ---- other editors -----------------------------------------------------------------------------

CTablesView::Answer CTablesView::CommonAnswerTo(WPARAM request)
{
    switch (request) {
    case KsRequest::BranchNames:
        return [branches = KnownBranches()](CObList& objects) {
            AppendBranchNames(branches, objects);
            return !branches.isEmpty();
        };
    case KsRequest::LocationShown:
        return [this](CObList& objects) {
            if (const auto* item = objects.empty() ? nullptr : dynamic_cast<CKvrCBELocation*>(objects.front().get()))
                ShowLocation(*item);
            return 0;
        };
    default:
        return AnswerTo(request);
    }
}

LRESULT CTablesView::OnRequest(WPARAM request, CKSComm_Package& package)
{
    if (!m_main.grid) // before the first update
        return 0;
    if (request == KsRequest::DataChanged) {
        OthersChanged();
        return 0;
    }
    const Answer answer = CommonAnswerTo(request);
    if (!answer)
        return CKsProjectView::OnRequest(request, package);
    if (package.objects)
        return answer(*package.objects);
    qDebug("%s: request %llu without a list", metaObject()->className(), static_cast<unsigned long long>(request));
    return 0;
}

void CTablesView::OnProjectsChanged()
{
    if (m_main.grid && !ProjectDoc()->ProjectHandle())
        ProjectDoc()->JoinProject(this);
}

// ---- editing -----------------------------------------------------------------------------------

bool CTablesView::IsEditing() const
{
    return std::any_of(m_tables.begin(), m_tables.end(), [](const CGenGrid* table) { return table->IsEditing(); });
}

bool CTablesView::HasFocus(const CGenGrid& table) const
{
    return table.hasFocus() || table.isAncestorOf(QApplication::focusWidget());
}

bool CTablesView::MayLeave(KsLeave)
{
    for (CGenGrid* table : m_tables) {
        if (!table->CommitEditor())
            return false;
        table->StoreEditedLine();
    }
    return true;
}

void CTablesView::LineEdited(CGenGrid& grid)
{
    grid.Model()->Store();
    grid.Reload();
}

void CTablesView::CellCurrent(CGenGrid& grid)
{
    if (grid.hasFocus())
        m_lines = &grid;
    ShowStatus();
}

// ---- commands ----------------------------------------------------------------------------------

void CTablesView::Run(CGenGrid& grid, GridAction action)
{
    m_lines = &grid;
    switch (action) {
    case GridAction::AppendLine:
        OnCommand(Command::InsertLine);
        return;
    case GridAction::DeleteLine:
        OnCommand(Command::DeleteLine);
        return;
    case GridAction::Search:
    case GridAction::SearchAgain:
        OnCommand(action == GridAction::Search ? Command::Search : Command::SearchAgain);
        return;
    default:
        break;
    }
    if (!MayLeave(KsLeave::Field))
        return;
    if (action == GridAction::Undo)
        ProjectDoc()->UndoStack().undo();
    else if (action == GridAction::Redo)
        ProjectDoc()->UndoStack().redo();
}

bool CTablesView::IsCommandEnabled(int id) const
{
    if (!m_lines || (ProjectDoc()->IsReadOnly() && (id == Command::InsertLine || id == Command::DeleteLine)))
        return false;
    switch (id) {
    case Command::InsertLine:
        return m_lines->Model()->Rows() != nullptr;
    case Command::DeleteLine:
        return m_lines->HasLinesToDelete();
    default:
        return CGridCommands::CanRun(id, m_lines) || LinesView::CanRun(id, m_lines) || m_search.CanRun(id, m_main.grid);
    }
}

bool CTablesView::OnCommand(int id)
{
    if (!IsCommandEnabled(id))
        return false;
    if (!MayLeave(KsLeave::Field))
        return true; // the user has been told
    if (id == Command::InsertLine)
        InsertLine();
    else if (id == Command::DeleteLine)
        m_lines->DeleteSelectedLines();
    else if (CGridCommands::Knows(id))
        CGridCommands::Run(id, *m_lines);
    else if (LinesView::Knows(id))
        LinesView::Run(id, *m_lines);
    else
        m_search.Run(id, *m_main.grid);
    return true;
}

void CTablesView::InsertLine()
{
    m_lines->InsertLine();
    m_lines->setFocus();
}
