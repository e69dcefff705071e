#include "pages/framework/page.h"

#include "document/document.h"
#include "grid/gen_grid.h"
#include "grid/grid_keys.h"
#include "grid/grid_widths.h"
#include "ks/fc/exchange.h"
#include "ks/fc/keep_in_sight.h"
#include "pages/framework/ctrl_edit.h"

#include <QAbstractButton>
#include <QApplication>
#include <QComboBox>
#include <QGroupBox>
#include <QHBoxLayout>
#include <QKeyEvent>
#include <QTimer>
#include <QUndoStack>
#include <algorithm>
#include <cmath>

CGenPropertyPage::CGenPropertyPage(CKavo0_hdDoc* document, QWidget* parent)
    : QWidget(parent), m_document(document), m_bindings(document), m_shownUnits(KsUnits::Instance().System())
{
    connect(&KsUnits::Instance(), &KsUnits::Changed, this, &CGenPropertyPage::UnitsChanged);
}

CGenPropertyPage::~CGenPropertyPage()
{
    // The controls go after the page, and a cell or field that is being edited must not report to it then.
    for (auto* grid : findChildren<CGenGrid*>())
        grid->SetHost(nullptr);
    for (auto* field : findChildren<CCtrlEdit*>())
        field->Unbind();
}

HD_Global_Var& CGenPropertyPage::Globals() const
{
    return m_document->Parameters().Global;
}

void CGenPropertyPage::SetGrid(CGenGrid* grid)
{
    m_grid = grid;
    AddPartGrid(grid);
}

void CGenPropertyPage::AddPartGrid(CGenGrid* grid)
{
    m_grids.push_back(grid);
    grid->SetHost(this);
    // Unless the dialog calls it otherwise, a grid is called as the group that it fills.
    if (const auto* group = qobject_cast<QGroupBox*>(grid->parentWidget()); group && grid->accessibleName().isEmpty())
        m_bindings.Always([grid, group] { SetAccessibleName(*grid, group->title()); });
}

void CGenPropertyPage::InsertLocation(const QString&, const QString&) {}

void CGenPropertyPage::AppendLine() {}

void CGenPropertyPage::DeleteLines()
{
    if (auto* grid = LinesGrid())
        grid->DeleteSelectedLines();
}

bool CGenPropertyPage::CommitGrids()
{
    bool taken = true;
    for (CGenGrid* grid : m_grids)
        taken = grid->CommitEditor() && taken;
    return taken;
}

bool CGenPropertyPage::LeaveField()
{
    return m_bindings.TakeField() && CommitGrids();
}

CGenGrid* CGenPropertyPage::LinesGrid() const
{
    const QWidget* focus = window()->focusWidget(); // also while a dialog has the keys
    for (CGenGrid* grid : m_grids)
        if (grid == focus || grid->isAncestorOf(focus))
            return grid;
    return m_grid;
}

void CGenPropertyPage::GotoLine(int row)
{
    if (m_grid)
        m_grid->ShowLine(row);
}

/// The grid over that list or table; null for none.
CGenGrid* CGenPropertyPage::GridOf(const void* table) const
{
    const auto isOver = [table](const CGenGrid* grid) {
        return table && grid->Model()->Rows() && grid->Model()->Rows()->Data() == table;
    };
    const auto found = std::ranges::find_if(m_grids, isOver);
    return found == m_grids.end() ? nullptr : *found;
}

bool CGenPropertyPage::Shows(const ChangePlace& place) const
{
    return GridOf(place.data) || m_bindings.ControlFor(place.data) || (place.list && place.list == GetList());
}

void CGenPropertyPage::Reveal(const ChangePlace& place, bool focus)
{
    QWidget* shown = m_bindings.ControlFor(place.data);
    // A table of a line is shown once the line is current.
    if (m_grid && place.list && place.list == GetList() && place.data != place.list && place.listRow > 0)
        m_grid->ShowLine(place.listRow + m_grid->Model()->FixedRows());
    if (CGenGrid* grid = GridOf(place.data)) {
        const int column = std::min(std::max(place.column, 1), grid->ColumnCount());
        if (place.row > 0)
            place.isGone ? grid->ShowPlace(place.row, column) : grid->ShowLine(place.row, column);
        shown = grid;
    }
    if (shown)
        ShowControl(*shown, focus);
}

void CGenPropertyPage::ShowControl(QWidget& control, bool focus)
{
    const auto scroll = [&control] { KsKeepInSight(control, control.rect()); };
    scroll();
    // Of a page that has just come to the front nobody knows yet how far it can be scrolled.
    QTimer::singleShot(0, &control, scroll);
    if (focus && control.isEnabled() && control.isVisible())
        control.setFocus(Qt::OtherFocusReason);
}

namespace {

/// By itself or in one of its groups.
bool StandsIn(const QWidget& widget, const QBoxLayout& row)
{
    for (int i = 0; i < row.count(); ++i)
        if (const QWidget* item = row.itemAt(i)->widget(); item && (item == &widget || item->isAncestorOf(&widget)))
            return true;
    return false;
}

} // namespace

void CGenPropertyPage::FitInto(QSize room, int scrollBar)
{
    StackGroups(room.width());
    const int least = layout()->totalMinimumSize().height();
    if (std::max(least, heightForWidth(room.width())) > room.height())
        StackGroups(room.width() - scrollBar);
}

void CGenPropertyPage::StackGroups(int width)
{
    const auto turn = [this](QBoxLayout& row, QBoxLayout::Direction direction) {
        for (CGenGrid* grid : m_grids)
            if (StandsIn(*grid, row))
                grid->Widths().KeepColumns(direction == QBoxLayout::LeftToRight);
        row.setDirection(direction);
        for (QWidget* widget = row.parentWidget(); widget != parentWidget(); widget = widget->parentWidget())
            if (widget->layout())
                widget->layout()->activate();
    };
    std::vector<QBoxLayout*> rows;
    for (auto* row : findChildren<QHBoxLayout*>())
        for (int i = 0; i < row->count(); ++i)
            if (qobject_cast<QGroupBox*>(row->itemAt(i)->widget())) {
                rows.push_back(row);
                break;
            }
    for (QBoxLayout* row : rows)
        turn(*row, QBoxLayout::LeftToRight);
    while (!rows.empty() && layout()->totalMinimumSize().width() > width) {
        const auto widest =
            std::ranges::max_element(rows, {}, [](const QBoxLayout* row) { return row->totalMinimumSize().width(); });
        turn(**widest, QBoxLayout::TopToBottom);
        rows.erase(widest);
    }
}

void CGenPropertyPage::LoadFromDocument(CKavo0_hdDoc*)
{
    m_bindings.Show();
    if (!m_host)
        return;
    // A rule may have shown or hidden a grid.
    const auto isShown = [this](const CGenGrid* grid) { return grid->isVisibleTo(this); };
    m_host->EnableLinesMenu(m_grid ? isShown(m_grid) : std::ranges::any_of(m_grids, isShown));
}

void CGenPropertyPage::StoreToDocument()
{
    m_bindings.Take();
}

std::unique_ptr<HD_RiverPos> CGenPropertyPage::GetRecordAt(int) const
{
    return nullptr;
}

// ---- what a grid asks --------------------------------------------------------------------------

void CGenPropertyPage::LineEdited(CGenGrid&)
{
    if (m_host)
        return m_host->EditedLineChanged();
    StoreToDocument();
    LoadFromDocument(m_document);
}

void CGenPropertyPage::CellCurrent(CGenGrid&)
{
    if (m_host)
        m_host->CurrentCellChanged();
}

void CGenPropertyPage::LineCurrent(CGenGrid& grid)
{
    if (m_host && &grid == m_grid)
        m_host->CurrentLocationChanged();
}

void CGenPropertyPage::Run(CGenGrid&, GridAction action)
{
    switch (action) {
    case GridAction::AppendLine:
        return AppendLine();
    case GridAction::DeleteLine:
        return m_host ? m_host->Execute(Command::DeleteLine) : DeleteLines();
    case GridAction::Undo:
    case GridAction::Redo:
        return UndoRedo(action == GridAction::Undo);
    default:
        if (m_host)
            m_host->Execute(action == GridAction::Search ? Command::Search : Command::SearchAgain);
    }
}

std::vector<HostTable> CGenPropertyPage::TablesOfPage(CGenGrid&)
{
    std::vector<HostTable> tables;
    for (CGenGrid* grid : m_grids)
        if (grid->isVisibleTo(this) && grid->isEnabled() && grid->Model()->Rows())
            tables.push_back({{}, grid});
    return tables;
}

std::vector<HostTable> CGenPropertyPage::TablesOfDocument()
{
    return m_host ? m_host->TablesOfDocument() : std::vector<HostTable>();
}

QStringList CGenPropertyPage::BranchNames()
{
    return m_host ? m_host->BranchNames() : QStringList();
}

/// Whoever answers with locations has cross sections: a network has branches.
std::vector<std::pair<QString, double>> CGenPropertyPage::CrossSections()
{
    CObList objects;
    m_document->AskProject(KsRequest::LoadLocations, m_host ? m_host->HostView() : nullptr, &objects);
    std::vector<std::pair<QString, double>> sections;
    for (const auto& object : objects)
        if (const auto* place = dynamic_cast<const CKvrCBELocation*>(object.get());
            place && !place->branch.isEmpty() && std::isfinite(place->chainage))
            sections.emplace_back(place->branch, place->chainage);
    return sections;
}

QString CGenPropertyPage::OverridesText(const QWidget& field) const
{
    for (const CGenGrid* grid : m_grids) {
        const CGridModel& model = *grid->Model();
        for (int column = 0; model.Rows() && column < model.columnCount(); ++column) {
            const GlobalPlace global = model.Column(column).Global();
            if (!global || m_bindings.ControlFor(global.Address()) != &field || model.LineCount() == 0)
                continue;
            return tr("Lines with another value: %1 of %2").arg(model.OverrideCount(column)).arg(model.LineCount());
        }
    }
    return {};
}

void CGenPropertyPage::OnHelp()
{
    if (m_host)
        m_host->ShowHelp();
}

void CGenPropertyPage::UndoRedo(bool undo)
{
    if (!LeaveField())
        return;
    StoreToDocument();
    if (undo)
        m_document->UndoStack().undo();
    else
        m_document->UndoStack().redo();
}

void CGenPropertyPage::OnSetActive()
{
    LoadFromDocument(m_document);
}

bool CGenPropertyPage::OnKillActive()
{
    if (!m_bindings.Take() || !CommitGrids())
        return false;
    StoreToDocument();
    return true;
}

void CGenPropertyPage::UnitsChanged()
{
    // What is being typed is meant in the unit that stood there, so it is taken in that unit.
    auto& units = KsUnits::Instance();
    const KsUnitSystem now = units.System();
    {
        const QSignalBlocker quiet(units);
        units.SetSystem(m_shownUnits);
        StoreToDocument();
        units.SetSystem(now);
    }
    m_shownUnits = now;
    if (isVisible())
        LoadFromDocument(m_document);
}

bool CGenPropertyPage::event(QEvent* event)
{
    if (event->type() == QEvent::Polish) { // the dialog is complete
        for (auto* button : findChildren<QAbstractButton*>())
            button->installEventFilter(this);
        for (auto* list : findChildren<QComboBox*>())
            list->installEventFilter(this);
        constexpr int air = 5, beside = 6; // around what a group holds: groups stand within groups
        for (const auto* group : findChildren<QGroupBox*>())
            if (QLayout* inside = group->layout()) {
                const QMargins margins = inside->contentsMargins();
                inside->setContentsMargins(std::min(margins.left(), beside), air, std::min(margins.right(), beside),
                                           air);
            }
    }
    return QWidget::event(event);
}

/// Of buttons, boxes and lists. All that is typed on the page is asked for before one of them does anything: by the
/// mouse, by its letter or by a key. By the time that the field has lost the focus the click may have done its work. A
/// box that takes the field away takes what was typed there along.
bool CGenPropertyPage::eventFilter(QObject* object, QEvent* event)
{
    const auto isAct = [event] {
        if (event->type() != QEvent::KeyPress)
            return event->type() == QEvent::MouseButtonPress || event->type() == QEvent::MouseButtonDblClick ||
                   event->type() == QEvent::Shortcut;
        const auto* pressed = static_cast<QKeyEvent*>(event);
        const int key = pressed->key();
        return !(pressed->modifiers() & Qt::ControlModifier) && key != Qt::Key_Tab && key != Qt::Key_Backtab &&
               key != Qt::Key_Escape;
    };
    const bool mayAct = !isAct() || ((m_bindings.TakesFieldAway(object) || m_bindings.Take()) && CommitGrids());
    return !mayAct || QWidget::eventFilter(object, event);
}

void CGenPropertyPage::changeEvent(QEvent* event)
{
    QWidget::changeEvent(event);
    if (event->type() != QEvent::LanguageChange)
        return;
    Retranslate();
    m_bindings.ApplyRules();
    if (isVisible())
        LoadFromDocument(m_document);
}

void CGenPropertyPage::keyPressEvent(QKeyEvent* event)
{
    if (event->matches(QKeySequence::Undo))
        UndoRedo(true);
    else if (event->matches(QKeySequence::Redo))
        UndoRedo(false);
    else if (event->text().isEmpty() || !event->text().front().isPrint() || m_document->MayChange()) // typed in vain?
        QWidget::keyPressEvent(event);
}
