#include "pages/framework/location_page.h"

#include "ks/fc/message_box.h"
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
                        : integer                     ? Control::Integer
                        : options.emptyIsNotGiven     ? Control::Chainage
                                                      : Control::Number;
    return Add(control, field, std::move(options));
}

CLocationPage::CLocationPage(CKavo0_hdDoc* document, CGenList& list, QWidget* parent)
    : CGenPropertyPage(document, parent), m_list(list)
{
}

GridColumns CLocationPage::Grid(CGenGrid* grid)
{
    grid->SetOwnerPage(this);
    grid->Model()->SetSource(*GetDocument(), MakeListRows(*GetDocument(), m_list));
    return GridColumns(*grid);
}

void CLocationPage::LoadFromDocument(CKavo0_hdDoc* document)
{
    CGenPropertyPage::LoadFromDocument(document);
    GetGrid()->Model()->EnsureFirstRow();
    GetGrid()->Reload();
}

void CLocationPage::StoreToDocument()
{
    CGenPropertyPage::StoreToDocument();
    GetGrid()->CommitEditor();
    GetGrid()->Model()->Store();
}

bool CLocationPage::OnKillActive()
{
    // Only what is still blank: a cell that was left blank by a move is a stored number by now.
    GetGrid()->CommitEditor();
    GetGrid()->Model()->Store(BlankRule::Fill);
    return CGenPropertyPage::OnKillActive();
}

void CLocationPage::AppendLine()
{
    if (GetGrid()->CommitEditor())
        GetGrid()->InsertLine();
}

void CLocationPage::InsertLocation(const QString& riverName, const QString& chainageText)
{
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
    auto record = m_list.NewRecord();
    GetGrid()->Model()->CopyRow(row - 1, record.get());
    return record;
}
