// What a menu of the main frame has from the active view.
#pragma once

#include "ks/fc/frames.h"

#include <QObject>

class QAction;
class QMenu;

/// Fills a menu, or the part of one above an entry, with commands of the active view and sends them there.
class CViewMenu : public QObject
{
    Q_OBJECT
public:
    using List = std::vector<CKsMenuCommand> (CCommandTarget::*)() const;
    /// Whose keys the commands have.
    enum class Keys
    {
        OfMenu,
        OfFocus // they are only shown
    };
    CViewMenu(CKsMDIFrameWnd& frame, QMenu& menu, List list, Keys keys, QAction* above, QObject* parent);
    /// For the view that is active now, in the language of now.
    void Fill();

private:
    std::vector<CKsMenuCommand> Commands() const;
    QString TextOf(const CKsMenuCommand& command) const;
    void Update(bool open);

    CKsMDIFrameWnd& m_frame;
    QMenu& m_menu;
    List m_list;
    Keys m_keys;
    QAction* m_above;            // null: at the end
    QList<QAction*> m_entries{}; // of the menu
};
