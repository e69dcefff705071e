#include "grid/grid_keys.h"

#include "grid/grid_texts.h"

#include <QKeyEvent>
#include <QRegularExpression>
#include <algorithm>
#include <iterator>

namespace {

constexpr Qt::KeyboardModifiers None = Qt::NoModifier, Ctrl = Qt::ControlModifier, Shift = Qt::ShiftModifier;
constexpr Qt::KeyboardModifiers CtrlShift = Ctrl | Shift;
constexpr Qt::KeyboardModifiers All = CtrlShift | Qt::AltModifier | Qt::MetaModifier;

// Insert, Delete, F3 and F7 never reach the table widget, whatever is held with them.
constexpr GridKey Keys[] = {
    {Qt::Key_Tab, None, All, GridAction::NextCell, true},
    {Qt::Key_Return, None, All, GridAction::NextCell, true},
    {Qt::Key_Enter, None, All, GridAction::NextCell, true},
    {Qt::Key_Backtab, None, Ctrl, GridAction::PreviousCell, true},
    {Qt::Key_Tab, Shift, All, GridAction::PreviousCell, true},
    {Qt::Key_Return, Shift, All, GridAction::PreviousCell, true},
    {Qt::Key_Enter, Shift, All, GridAction::PreviousCell, true},
    {Qt::Key_Insert, None, CtrlShift, GridAction::AppendLine, true},
    {Qt::Key_Insert, Ctrl, Ctrl, GridAction::CopyAndAppend, false},
    {Qt::Key_Insert, Shift, CtrlShift, GridAction::PasteAndAppend, false},
    {Qt::Key_Return, CtrlShift, All, GridAction::InsertAbove, true},
    {Qt::Key_Enter, CtrlShift, All, GridAction::InsertAbove, true},
    {Qt::Key_Return, Ctrl, All, GridAction::InsertBelow, true},
    {Qt::Key_Enter, Ctrl, All, GridAction::InsertBelow, true},
    {Qt::Key_U, Ctrl, All, GridAction::Duplicate, true},
    {Qt::Key_Up, CtrlShift, All, GridAction::MoveUp, true},
    {Qt::Key_Down, CtrlShift, All, GridAction::MoveDown, true},
    {Qt::Key_L, CtrlShift, All, GridAction::InsertAlong, true},
    {Qt::Key_Delete, None, None, GridAction::DeleteLine, false},
    {Qt::Key_C, Ctrl, All, GridAction::Copy, false},
    {Qt::Key_C, CtrlShift, All, GridAction::CopyWithHeaders, false},
    {Qt::Key_V, Ctrl, All, GridAction::Paste, false},
    {Qt::Key_V, CtrlShift, All, GridAction::PasteWithPreview, false},
    {Qt::Key_X, Ctrl, All, GridAction::Cut, false},
    {Qt::Key_Backspace, Ctrl, All, GridAction::Clear, false},
    {Qt::Key_Space, Shift, All, GridAction::SelectLine, false},
    {Qt::Key_F10, Shift, All, GridAction::OpenMenu, false}, // the menu key asks by itself
    {Qt::Key_F3, None, None, GridAction::SearchAgain, true},
    {Qt::Key_F7, None, None, GridAction::Search, true},
    {Qt::Key_D, Ctrl, All, GridAction::FillDown, true},
    {Qt::Key_R, CtrlShift, All, GridAction::FillSeries, true},
    {Qt::Key_E, CtrlShift, All, GridAction::Interpolate, true},
    {Qt::Key_E, Ctrl, All, GridAction::Calculate, true},
    {Qt::Key_G, CtrlShift, All, GridAction::ResetToGlobal, true},
    {Qt::Key_Backspace, CtrlShift, All, GridAction::RevertToSaved, true},
    {Qt::Key_H, Ctrl, All, GridAction::Replace, true},
    {Qt::Key_Z, Ctrl, All, GridAction::Undo, false},
    {Qt::Key_Y, Ctrl, All, GridAction::Redo, false},
    {Qt::Key_Z, CtrlShift, All, GridAction::Redo, false},
    {Qt::Key_A, CtrlShift, All, GridAction::SortAscending, true},
    {Qt::Key_D, CtrlShift, All, GridAction::SortDescending, true},
    {Qt::Key_B, CtrlShift, All, GridAction::SortByPlace, true},
    {Qt::Key_O, CtrlShift, All, GridAction::FileOrder, true},
    {Qt::Key_F, CtrlShift, All, GridAction::Filter, true},
    {Qt::Key_F5, None, All, GridAction::ShowAfresh, true},
};

struct ActionTexts
{
    const char* name;                  // of the command, as menus have it
    const char* description = nullptr; // where there is more to say
};

// In the order of the actions.
constexpr ActionTexts Texts[] = {
    {QT_TRANSLATE_NOOP("GridTexts", "Next cell; behind the last one a new line")},
    {QT_TRANSLATE_NOOP("GridTexts", "Previous cell")},
    {QT_TRANSLATE_NOOP("GridTexts", "Insert Line")},
    {QT_TRANSLATE_NOOP("GridTexts", "Copy, Then Insert Line")},
    {QT_TRANSLATE_NOOP("GridTexts", "Paste, Then Insert Line")},
    {QT_TRANSLATE_NOOP("GridTexts", "Insert Line Above")},
    {QT_TRANSLATE_NOOP("GridTexts", "Insert Line Below")},
    {QT_TRANSLATE_NOOP("GridTexts", "Duplicate Lines"),
     QT_TRANSLATE_NOOP("GridTexts", "Duplicate the selected lines, or the current one")},
    {QT_TRANSLATE_NOOP("GridTexts", "Move Lines Up"),
     QT_TRANSLATE_NOOP("GridTexts", "Move the selected lines, or the current one, up in the file")},
    {QT_TRANSLATE_NOOP("GridTexts", "Move Lines Down"),
     QT_TRANSLATE_NOOP("GridTexts", "Move the selected lines, or the current one, down in the file")},
    {QT_TRANSLATE_NOOP("GridTexts", "Insert Lines Along a Branch...")},
    {QT_TRANSLATE_NOOP("GridTexts", "Delete Selected Lines")},
    {QT_TRANSLATE_NOOP("GridTexts", "Select the line")},
    {QT_TRANSLATE_NOOP("GridTexts", "Copy")},
    {QT_TRANSLATE_NOOP("GridTexts", "Copy with Headers"),
     QT_TRANSLATE_NOOP("GridTexts", "Copy the selected cells below the headers and units of their columns")},
    {QT_TRANSLATE_NOOP("GridTexts", "Paste")},
    {QT_TRANSLATE_NOOP("GridTexts", "Paste with Preview..."),
     QT_TRANSLATE_NOOP("GridTexts",
                       "Show how the copied texts are understood, and where they would go, before they do")},
    {QT_TRANSLATE_NOOP("GridTexts", "Cut"),
     QT_TRANSLATE_NOOP("GridTexts",
                       "Copy, then delete the lines that are selected by their numbers, or clear the cells")},
    {QT_TRANSLATE_NOOP("GridTexts", "Clear Cells"), QT_TRANSLATE_NOOP("GridTexts", "Clear the selected cells")},
    {QT_TRANSLATE_NOOP("GridTexts", "Search &Again")},
    {QT_TRANSLATE_NOOP("GridTexts", "&Search...")},
    {QT_TRANSLATE_NOOP("GridTexts", "Fill Dow&n")},
    {QT_TRANSLATE_NOOP("GridTexts", "Fill with a Se&ries...")},
    {QT_TRANSLATE_NOOP("GridTexts", "Inter&polate..."),
     QT_TRANSLATE_NOOP("GridTexts", "Interpolate along the chainage")},
    {QT_TRANSLATE_NOOP("GridTexts", "Calc&ulate...")},
    {QT_TRANSLATE_NOOP("GridTexts", "Reset to Global Value"),
     QT_TRANSLATE_NOOP("GridTexts", "Give the selected cells the global value of their column")},
    {QT_TRANSLATE_NOOP("GridTexts", "Revert to Saved Values"),
     QT_TRANSLATE_NOOP("GridTexts", "Give the selected cells the values that they had at the last save")},
    {QT_TRANSLATE_NOOP("GridTexts", "Find and Replace..."),
     QT_TRANSLATE_NOOP("GridTexts", "Find texts, numbers or ranges of numbers, and replace them")},
    {QT_TRANSLATE_NOOP("GridTexts", "Undo")},
    {QT_TRANSLATE_NOOP("GridTexts", "Redo")},
    {QT_TRANSLATE_NOOP("GridTexts", "Sort As&cending"),
     QT_TRANSLATE_NOOP("GridTexts", "Sort by the current column, smallest first")},
    {QT_TRANSLATE_NOOP("GridTexts", "Sort D&escending"),
     QT_TRANSLATE_NOOP("GridTexts", "Sort by the current column, largest first")},
    {QT_TRANSLATE_NOOP("GridTexts", "Sort by &Branch and Chainage")},
    {QT_TRANSLATE_NOOP("GridTexts", "Order of the &File")},
    {QT_TRANSLATE_NOOP("GridTexts", "Ma&ke This the Order of the File")},
    {QT_TRANSLATE_NOOP("GridTexts", "Fil&ter"), QT_TRANSLATE_NOOP("GridTexts", "Filter the lines")},
    {QT_TRANSLATE_NOOP("GridTexts", "Show Ever&y Line")},
    {QT_TRANSLATE_NOOP("GridTexts", "Sort and Filter Afres&h")},
    {QT_TRANSLATE_NOOP("GridTexts", "Fit the Width")},
    {QT_TRANSLATE_NOOP("GridTexts", "Menu of the cell")},
};
static_assert(std::size(Texts) == std::size_t(GridAction::None));

} // namespace

QString MenuText(GridAction action)
{
    return GridTexts::tr(Texts[std::size_t(action)].name);
}

/// Letters stand in brackets, "(&N)", where they are no part of words.
QString NameOf(GridAction action)
{
    static const QRegularExpression signs(QStringLiteral("\\(&.\\)|&|\\.\\.\\.$"));
    return MenuText(action).remove(signs);
}

QString TextOf(GridAction action)
{
    const char* const description = Texts[std::size_t(action)].description;
    return description ? GridTexts::tr(description) : NameOf(action);
}

std::span<const GridKey> GridKeys()
{
    return Keys;
}

QKeySequence KeyOf(GridAction action)
{
    const auto* row = std::ranges::find(Keys, action, &GridKey::action);
    return row == std::end(Keys) ? QKeySequence() : QKeySequence(QKeyCombination(row->held, row->key));
}

const GridKey* FindGridKey(const QKeyEvent& event)
{
    const auto* row = std::find_if(std::begin(Keys), std::end(Keys), [&](const GridKey& key) {
        return key.key == event.key() && (event.modifiers() & key.lookedAt) == key.held;
    });
    return row == std::end(Keys) ? nullptr : row;
}
