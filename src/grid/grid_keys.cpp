#include "grid/grid_keys.h"

#include <QKeyEvent>
#include <algorithm>

namespace {

constexpr Qt::KeyboardModifiers None = Qt::NoModifier, Ctrl = Qt::ControlModifier, Shift = Qt::ShiftModifier;
constexpr Qt::KeyboardModifiers CtrlShift = Ctrl | Shift;
constexpr Qt::KeyboardModifiers All = CtrlShift | Qt::AltModifier | Qt::MetaModifier;

// Insert, Delete, F3 and F7 never reach the table widget, whatever is held with them.
constexpr GridKey Keys[] = {
    {Qt::Key_Tab, None, All, GridAction::NextCell, true, Str::KeyNextCell},
    {Qt::Key_Return, None, All, GridAction::NextCell, true, Str::KeyNextCell},
    {Qt::Key_Enter, None, All, GridAction::NextCell, true, Str::KeyNextCell},
    {Qt::Key_Backtab, None, Ctrl, GridAction::PreviousCell, true, Str::KeyPreviousCell},
    {Qt::Key_Tab, Shift, All, GridAction::PreviousCell, true, Str::KeyPreviousCell},
    {Qt::Key_Return, Shift, All, GridAction::PreviousCell, true, Str::KeyPreviousCell},
    {Qt::Key_Enter, Shift, All, GridAction::PreviousCell, true, Str::KeyPreviousCell},
    {Qt::Key_Insert, None, CtrlShift, GridAction::AppendLine, true, Str::KeyAppendLine},
    {Qt::Key_Insert, Ctrl, Ctrl, GridAction::CopyAndAppend, false, Str::KeyCopyAppend},
    {Qt::Key_Insert, Shift, CtrlShift, GridAction::PasteAndAppend, false, Str::KeyPasteAppend},
    {Qt::Key_Delete, None, None, GridAction::DeleteLine, false, Str::KeyDeleteLine},
    {Qt::Key_C, Ctrl, All, GridAction::Copy, false, Str::KeyCopy},
    {Qt::Key_V, Ctrl, All, GridAction::Paste, false, Str::KeyPaste},
    {Qt::Key_Space, Shift, All, GridAction::SelectLine, false, Str::KeySelectLine},
    {Qt::Key_F3, None, None, GridAction::SearchAgain, true, Str::KeySearchAgain},
    {Qt::Key_F7, None, None, GridAction::Search, true, Str::KeySearch},
    {Qt::Key_Z, Ctrl, All, GridAction::Undo, false, Str::KeyUndo},
    {Qt::Key_Y, Ctrl, All, GridAction::Redo, false, Str::KeyRedo},
    {Qt::Key_Z, CtrlShift, All, GridAction::Redo, false, Str::KeyRedo},
};

} // namespace

std::span<const GridKey> GridKeys()
{
    return Keys;
}

const GridKey* FindGridKey(const QKeyEvent& event)
{
    const auto* row = std::find_if(std::begin(Keys), std::end(Keys), [&](const GridKey& key) {
        return key.key == event.key() && (event.modifiers() & key.lookedAt) == key.held;
    });
    return row == std::end(Keys) ? nullptr : row;
}
