#include "editors/common/tables_view.h"

#include "grid/grid_keys.h"
#include "grid/grid_widths.h"

#include <QApplication>
#include <QHeaderView>
#include <QLabel>
#include <QSplitter>
#include <QUndoStack>
#include <QVBoxLayout>
#include <algorithm>

CTablesView::~CTablesView()
{
    for (CGenGrid* table : m_tables) { // it goes later, and must not report to what is left of this
        table->SetHost(nullptr);
        table->selectionModel()->disconnect(this);
    }
}

CGenGrid* CTablesView::AddTable(QSplitter& side, QLabel*& title, const char* name)
{
    auto* table = new CGenGrid;
    table->setObjectName(QString::fromLatin1(name));
    table->SetHost(this);
    table->horizontalHeader()->setStretchLastSection(true);
    constexpr int least = 36; // letters, row numbers included: two columns are in sight beside the smallest picture
    table->setMinimumWidth(least * table->fontMetrics().averageCharWidth());
    table->SetLineChoice(LineChoice::LinesOfCells);
    title = new QLabel;
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
    if (!m_lines)
        m_lines = table;
    return table;
}

void CTablesView::OnInitialUpdate()
{
    CKsProjectView::OnInitialUpdate();
    Retranslate();
    ShowDocument();
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
    if (!m_lines)
        return false;
    switch (id) {
    case Command::InsertLine:
        return m_lines->Model()->Rows() != nullptr;
    case Command::DeleteLine:
        return m_lines->HasLinesToDelete();
    default:
        return m_search.CanRun(id, SearchedTable());
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
    else
        m_search.Run(id, *const_cast<CGenGrid*>(SearchedTable()));
    return true;
}

void CTablesView::InsertLine()
{
    m_lines->InsertLine();
    m_lines->setFocus();
}
