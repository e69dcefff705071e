#include "pages/framework/location_page.h"

#include "ks/fc/message_box.h"
#include "ks/fc/wnd_resizer.h"
#include "module/list_rows.h"

#include <QUndoStack>

namespace {

constexpr Field NameField = Text<&HD_RiverPos::RiverName>("RiverName");
constexpr Field ChainageField = Number<&HD_RiverPos::Chainage>("Chainage", UnitGroup::Chainage);

} // namespace

GridColumns& GridColumns::Add(int control, const Field& field, ColumnOptions options)
{
    ColumnSpec column;
    column.control = control;
    column.header = std::move(options.header);
    if (!column.header)
        column.header = [caption = options.caption] { return LoadString(caption); };
    column.width = options.width;
    column.style = CKsEditStyle(field.unit, options.format);
    column.emptyIsNotGiven = options.emptyIsNotGiven;
    column.fill = options.fill;
    if (options.locked)
        column.locked = [locked = std::move(options.locked)](const void* row) {
            return locked(*static_cast<const HD_RiverPos*>(row));
        };
    column.choices = std::move(options.choice);
    if (options.choices)
        column.choices.entries = [entries = *options.choices] { return LoadString(entries).split(u'\n'); };
    column.unitText = std::move(options.unitText);
    column.hint = std::move(options.hint);
    column.locationValue = options.locationValue;
    column.access = std::make_shared<CellAccess>(FieldAccess(field));
    m_grid.Model()->AddColumn(std::move(column));
    return *this;
}

GridColumns& GridColumns::BranchName(ColumnOptions options)
{
    if (!options.header)
        options.caption = Str::RiverName;
    return Add(Control::Text, NameField, std::move(options));
}

GridColumns& GridColumns::Chainage(ColumnOptions options)
{
    if (!options.header && options.caption == Str::RiverName)
        options.caption = Str::Chainage;
    options.emptyIsNotGiven = true;
    return Add(Control::Chainage, ChainageField, std::move(options));
}

GridColumns& GridColumns::Value(const Field& field, ColumnOptions options)
{
    const bool integer = field.kind == FieldKind::Integer || field.kind == FieldKind::Choice;
    const int control = field.kind == FieldKind::Text ? Control::Text
                        : options.choices             ? Control::DropDown
                        : integer                     ? Control::Integer
                        : options.emptyIsNotGiven     ? Control::Chainage
                        : options.asFormatted         ? Control::Formatted
                                                      : Control::Number;
    return Add(control, field, std::move(options));
}

CLocationPage::CLocationPage(CKavo0_hdDoc* document, CGenList& list, QWidget* parent)
    : CLocationPage(document, &list, parent)
{
}

CLocationPage::CLocationPage(CKavo0_hdDoc* document, CGenList* list, QWidget* parent)
    : CGenPropertyPage(document, parent), m_list(list)
{
}

GridColumns CLocationPage::Grid(CGenGrid* grid)
{
    grid->SetOwnerPage(this);
    CWndResizer(this).SetAnchor(grid, CWndResizer::All);
    ShowList(m_list);
    connect(grid->selectionModel(), &QItemSelectionModel::currentRowChanged, this, &CLocationPage::ShowParts);
    return GridColumns(*grid);
}

void CLocationPage::ShowList(CGenList* list)
{
    m_list = list;
    GetGrid()->Model()->SetSource(*GetDocument(), list ? MakeListRows(*GetDocument(), *list) : nullptr);
    GetGrid()->setEnabled(list != nullptr);
}

GridColumns CLocationPage::AddPart(CGenGrid* grid, std::shared_ptr<IRowSource> rows, RowsOfLine rowsOfLine)
{
    grid->SetPartOfPage(this);
    grid->Model()->SetSource(*GetDocument(), std::move(rows));
    m_parts.push_back({grid, std::move(rowsOfLine)});
    return GridColumns(*grid);
}

HD_RiverPos* CLocationPage::CurrentRecord() const
{
    const int row = GetGrid()->CurrentRow();
    return m_list && row >= 1 && std::size_t(row) <= m_list->GetCount() ? &m_list->GetAt(std::size_t(row) - 1)
                                                                        : nullptr;
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
        part.grid->setEnabled(part.grid->Model()->Rows() != nullptr);
        part.grid->Reload();
    }
}

void CLocationPage::LoadFromDocument(CKavo0_hdDoc* document)
{
    CGenPropertyPage::LoadFromDocument(document);
    GetGrid()->Model()->EnsureFirstRow();
    GetGrid()->Reload();
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
    GetGrid()->Model()->Store(rule);
    for (const Part& part : m_parts)
        part.grid->Model()->Store(rule);
}

bool CLocationPage::OnKillActive()
{
    // Only what is still blank: a cell that was left blank by a move is a stored number by now.
    Store(BlankRule::Fill);
    StoreToDocument();
    return true; // leaving a table is never refused
}

void CLocationPage::AppendLine()
{
    if (LinesGrid()->CommitEditor())
        LinesGrid()->InsertLine();
}

void CLocationPage::InsertLocation(const QString& riverName, const QString& chainageText)
{
    if (!m_list)
        return;
    CGridModel& model = *GetGrid()->Model();
    const QString refusal = model.Refusal(model.rowCount(), 1, chainageText);
    if (!refusal.isEmpty()) {
        KsMessageBox(refusal, QMessageBox::Ok, this);
        return;
    }
    StoreToDocument();
    GetDocument()->UndoStack().beginMacro(LoadString(Str::UndoInsert));
    const int row = model.rowCount();
    model.InsertRows(row);
    model.setData(model.index(row, 0), riverName, Qt::EditRole);
    model.setData(model.index(row, 1), chainageText, Qt::EditRole);
    model.Store();
    GetDocument()->UndoStack().endMacro();
    GetGrid()->SetCurrentCell(row + 1, 1);
}

std::unique_ptr<HD_RiverPos> CLocationPage::GetRecordAt(int row) const
{
    if (row < 1 || row > GetGrid()->RowCount())
        return nullptr;
    auto record = m_list->NewRecord();
    GetGrid()->Model()->CopyRow(row - 1, record.get());
    return record;
}
