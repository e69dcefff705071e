// The tool bars of the editors in the main frame.
#pragma once

#include <QAction>
#include <QObject>
#include <QPointer>
#include <map>
#include <memory>
#include <vector>

class CKsMDIFrameWnd;
class CKsToolBarEx;
class CPlugins;
class CView;
struct CPlugin;

/// Shows the tool bars of the editor whose view asks for it, and makes them when they are first shown. Which editor
/// that is follows from the view's document template: the shell has it from one plug-in. A bar that the user has
/// switched off stays hidden.
class CEditorBars : public QObject
{
    Q_OBJECT
public:
    /// Both outlive the bars.
    CEditorBars(CKsMDIFrameWnd& frame, const CPlugins& plugins);
    /// Begins anew with the bars of all usable plug-ins; those made before are removed.
    void Create();
    /// Shows or hides the bars of the editor that the view belongs to.
    void Show(const CView* view, bool show);
    /// One checkable action a bar: whether the user wants to see it.
    std::vector<QAction*> Toggles() const;

private:
    struct Bar
    {
        const CPlugin* plugin;
        int index;
        QPointer<CKsToolBarEx> bar;
        std::unique_ptr<QAction> toggle;
    };

    void AddBars(const CPlugin& plugin);
    void Update();
    void SaveHidden() const;

    CKsMDIFrameWnd& m_frame;
    const CPlugins& m_plugins;
    std::vector<Bar> m_bars;
    std::map<const CPlugin*, bool> m_shown; // asked for by a view
};
