// The keys of the grid: one row a key.
#pragma once

#include <QKeySequence>
#include <QString>
#include <span>

class QKeyEvent;

enum class GridAction
{
    NextCell,
    PreviousCell,
    AppendLine,
    CopyAndAppend,
    PasteAndAppend,
    InsertAbove,
    InsertBelow,
    Duplicate,
    MoveUp,
    MoveDown,
    InsertAlong,
    DeleteLine,
    SelectLine,
    Copy,
    CopyWithHeaders,
    Paste,
    PasteWithPreview,
    Cut,
    Clear,
    SearchAgain,
    Search,
    FillDown,
    FillSeries,
    Interpolate,
    Calculate,
    ResetToGlobal,
    RevertToSaved,
    Replace,
    Undo,
    Redo,
    SortAscending,
    SortDescending,
    SortByPlace,
    FileOrder,
    KeepOrder,
    Filter,
    ShowAllLines,
    ShowAfresh,
    FitColumn,
    OpenMenu,
    None
};

/// What menus call it, with the letter of its key, in the user's language.
QString MenuText(GridAction action);
/// The same as plain text.
QString NameOf(GridAction action);
/// What it does: its name, unless there is more to say.
QString TextOf(GridAction action);

struct GridKey
{
    Qt::Key key;
    Qt::KeyboardModifiers held; // which of `looked at` must be held
    Qt::KeyboardModifiers lookedAt;
    GridAction action;
    bool whileEditing; // also in the open editor of a cell, which has the others first

    QString Text() const { return TextOf(action); }
};

std::span<const GridKey> GridKeys();
/// The first key of an action; none for one without.
QKeySequence KeyOf(GridAction action);
/// The row of the key; null when the grid leaves it to the table widget.
const GridKey* FindGridKey(const QKeyEvent& event);
