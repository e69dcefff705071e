// What the menus of the main frame offer, in one table.
#pragma once

#include <QCoreApplication>
#include <QKeySequence>
#include <array>
#include <span>

class CMainFrame;

/// The menus of the menu bar, from the left.
enum MenuPosition
{
    FileMenu,
    EditMenu,
    LinesMenu,
    ViewMenu,
    WindowMenu,
    HelpMenu,
    MenuCount
};

inline constexpr std::array<const char*, MenuCount> MenuTitles{
    QT_TRANSLATE_NOOP("CFrameMenus", "&File"),   QT_TRANSLATE_NOOP("CFrameMenus", "&Edit"),
    QT_TRANSLATE_NOOP("CFrameMenus", "&Lines"),  QT_TRANSLATE_NOOP("CFrameMenus", "&View"),
    QT_TRANSLATE_NOOP("CFrameMenus", "&Window"), QT_TRANSLATE_NOOP("CFrameMenus", "&Help"),
};

/// One entry of a menu. A row without a name is a separator.
struct CFrameAction
{
    Q_DECLARE_TR_FUNCTIONS(CFrameAction)
public:
    MenuPosition menu;
    const char* name = nullptr; // object name
    const char* text = nullptr;
    const char* tip = nullptr; // shown in the status bar
    void (*run)(CMainFrame& frame) = nullptr;
    QKeySequence::StandardKey key = QKeySequence::UnknownKey;
    const char* icon = nullptr; // also puts it onto the standard tool bar
    bool shownOnly = false;     // the key belongs to what has the focus, and the command is part of the typing
    const char* ownKey = nullptr; // in place of a standard one

    static std::span<const CFrameAction> Table();
    /// The desktop's keys for the command, Tab spelled as on the keyboard; none for a key that is only shown.
    QList<QKeySequence> Shortcuts() const;
};
