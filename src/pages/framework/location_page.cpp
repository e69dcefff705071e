#include "pages/framework/location_page.h"

#include "document/list_rows.h"
#include "grid/grid_widths.h"
#include "ks/fc/message_box.h"
#include "ks/fc/wnd_resizer.h"
#include "ks/language/language.h"

#include <QLabel>
#include <QUndoStack>

std::function<QString()> LineOf(Str text, int line)
{
    return [text, line] { return LoadLine(text, line); };
}

QStringList InAllLanguages(const TextLine& line)
{
    const char* const source = SourceText(line.text);
    QStringList texts;
    for (const QString& text : source ? KsLangInAll(TextsOfModule, TextsOfModule, source) : QStringList())
        texts << (line.line < 0 ? text : text.section(u'\n', line.line, line.line));
    return texts;
}

static constexpr TableStyle OnPages{[](const TextLine& line) { return LoadLine(line.text, line.line); },
                                    [](const TextLine& line) { return InAllLanguages(line); }, Str::GlobalRow};

GridColumns::GridColumns(CGenGrid& grid, const void* globals) : FieldColumns(*grid.Model(), OnPages, globals) {}

GridColumns& GridColumns::BranchName(ColumnSpec column)
{
    column.namesLine = true;
    column.upperCase = true;
    Value(LocationFields()[0], std::move(column));
    return *this;
}

GridColumns& GridColumns::Chainage(ColumnSpec column)
{
    column.namesLine = true;
    column.emptyIsNotGiven = true;
    Value(LocationFields()[1], std::move(column));
    return *this;
}

CLocationPage::CLocationPage(CKavo0_hdDoc* document, CGenList& list, QWidget* parent)
    : CLocationPage(document, &list, parent)
{
}

CLocationPage::CLocationPage(CKavo0_hdDoc* document, CGenList* list, QWidget* parent)
    : CGenPropertyPage(document, parent), m_list(list)
{
}

GridColumns CLocationPage::GridWithGlobals(CGenGrid* grid, void* globals)
{
    m_globals = globals;
    return Grid(grid);
}

GridColumns CLocationPage::Grid(CGenGrid* grid)
{
    SetGrid(grid);
    CWndResizer(this).SetAnchor(grid, CWndResizer::All);
    ShowList(m_list);
    connect(grid->selectionModel(), &QItemSelectionModel::currentRowChanged, this, &CLocationPage::ShowParts);
    return GridColumns(*grid, m_globals);
}

void CLocationPage::ShowList(CGenList* list)
{
    m_list = list;
    GetGrid()->Model()->SetSource(*GetDocument(), !list       ? nullptr
                                                  : m_globals ? MakeGlobalAndListRows(*list, m_globals)
                                                              : MakeListRows(*list));
    GetGrid()->setEnabled(list != nullptr);
}

GridColumns CLocationPage::AddPart(CGenGrid* grid, std::shared_ptr<IRowSource> rows, RowsOfLine rowsOfLine)
{
    AddPartGrid(grid);
    grid->Model()->SetSource(*GetDocument(), std::move(rows));
    m_parts.push_back({grid, std::move(rowsOfLine)});
    return GridColumns(*grid);
}

/// Pairs stand beside what they belong to.
GridColumns CLocationPage::AddPairs(CGenGrid* grid, std::shared_ptr<IRowSource> rows, RowsOfLine rowsOfLine)
{
    GridColumns columns = AddPart(grid, std::move(rows), std::move(rowsOfLine));
    grid->Widths().KeepGridAsWide();
    return columns;
}

std::size_t CLocationPage::RowOf(const CGenList& list, const HD_RiverPos& record)
{
    std::size_t row = 0;
    while (row < list.GetCount() && &list.GetAt(row) != &record)
        ++row;
    return row;
}

HD_RiverPos* CLocationPage::CurrentRecord() const
{
    if (!GetGrid() || !m_list)
        return nullptr;
    const int row = GetGrid()->CurrentRow() - 1;
    const CGridModel& model = *GetGrid()->Model();
    return row >= model.FixedRows() ? static_cast<HD_RiverPos*>(model.StoredObject(row)) : nullptr;
}

void CLocationPage::ShowParts()
{
    HD_RiverPos* current = CurrentRecord();
    for (Part& part : m_parts) {
        if (part.rows && part.shown != current) {
            part.grid->CommitEditor();
            part.grid->Model()->Store(); // what was typed belongs to the line that is left
            part.shown = current;
            part.grid->Model()->SetSource(*GetDocument(), current ? part.rows(*current) : nullptr);
        }
        if (part.rows)
            part.grid->setEnabled(part.grid->Model()->Rows() != nullptr);
        part.grid->Reload();
    }
}

void CLocationPage::LoadFromDocument(CKavo0_hdDoc* document)
{
    for (const auto& shown : m_atSave)
        document->AtSave(shown);
    CGenPropertyPage::LoadFromDocument(document);
    if (auto* grid = GetGrid())
        grid->Reload();
    ShowParts();
}

void CLocationPage::StoreToDocument()
{
    CGenPropertyPage::StoreToDocument();
    Store(BlankRule::Zero);
}

void CLocationPage::Store(BlankRule rule)
{
    CommitGrids();
    if (GetGrid())
        GetGrid()->Model()->Store(rule);
    for (const Part& part : m_parts)
        part.grid->Model()->Store(rule);
}

bool CLocationPage::OnKillActive()
{
    if (!Bindings().Take() || !CommitGrids())
        return false;
    // Only what is still blank: a cell that was left blank by a move is a stored number by now.
    Store(BlankRule::Fill);
    StoreToDocument();
    return true;
}

void CLocationPage::LeaveOut(const std::vector<Incomplete>& tables, QLabel* status, Str warning, Str oneDropped,
                             Str manyDropped)
{
    for (const auto& [table, isIncomplete] : tables)
        AtSave({table->Model()->Rows(), isIncomplete, oneDropped, manyDropped});
    Bindings().Always([tables, status, warning] {
        std::size_t count = 0;
        for (const auto& [table, isIncomplete] : tables)
            for (std::size_t row = 0; row < table->Model()->Rows()->Count(); ++row)
                count += isIncomplete(table->Model()->Rows()->At(row));
        status->setText(count > 0 ? LoadString(warning).arg(count) : QString());
    });
}

void CLocationPage::BrowseInto(CGenGrid& grid, int row, int column, const FileKind& kind)
{
    const auto chosen = BrowseForFile(*GetDocument(), grid.TextAt(row, column), kind, this);
    if (!chosen)
        return;
    CGridModel& model = *grid.Model();
    if (const QString refusal = model.Refusal(row - 1, column - 1, *chosen); !refusal.isEmpty()) {
        KsMessageBox(refusal, QMessageBox::Ok, this);
        return;
    }
    model.setData(model.index(row - 1, column - 1), *chosen, Qt::EditRole);
    grid.StoreEditedLine();
}

void CLocationPage::AppendLine()
{
    CGenGrid* grid = LinesGrid();
    if (grid && LeaveField())
        grid->InsertLine();
}

void CLocationPage::InsertLocation(const QString& riverName, const QString& chainageText)
{
    if (!m_list || !GetDocument()->MayChange())
        return;
    CGridModel& model = *GetGrid()->Model();
    const QString refusal = model.Refusal(model.rowCount(), 1, chainageText);
    if (!refusal.isEmpty()) {
        KsMessageBox(refusal, QMessageBox::Ok, this);
        return;
    }
    StoreToDocument();
    const int row = model.StoredRows();
    model.AppendRow({riverName, chainageText});
    GetGrid()->SetCurrentCell(row + 1, 1);
}

std::unique_ptr<HD_RiverPos> CLocationPage::GetRecordAt(int row) const
{
    if (!GetGrid() || row <= GetGrid()->Model()->FixedRows() || row > GetGrid()->RowCount())
        return nullptr;
    auto record = m_list->NewRecord();
    GetGrid()->Model()->CopyRow(row - 1, record.get());
    return record;
}
