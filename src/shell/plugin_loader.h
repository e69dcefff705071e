// Finds the editors in the plug-in folder and talks to them through their exported functions alone.
#pragma once

#include "ks/fc/doc_template.h"
#include "ks/fc/plugin.h"

#include <QIcon>
#include <QString>
#include <memory>
#include <vector>

/// One library of the plug-in folder.
struct CPlugin
{
    QString file;  // path
    QString error; // why it is not used; empty for an editor that is
    QString name;  // the editor's name in the user's language
    std::vector<std::unique_ptr<CMultiDocTemplate>> templates;

#define KS_PLUGIN_MEMBER(result, function, arguments) decltype(&::function) function = nullptr;
    KS_PLUGIN_FUNCTIONS(KS_PLUGIN_MEMBER)
#undef KS_PLUGIN_MEMBER

    bool IsUsable() const
    {
        return error.isEmpty();
    }
    /// The editor's picture; none when it has none.
    QIcon Icon() const;
    /// Asks the editor for its name again, after the language changed.
    void UpdateName();
    QStringList ToolBarNames() const;
    /// A new tool bar of the editor, which the frame owns; null when it made none.
    CKsToolBarEx* CreateToolBar(CKsMDIFrameWnd& frame, unsigned controlId, int index) const;
};

/// Loads one library and asks it for its templates. What goes wrong is told in `error`.
std::unique_ptr<CPlugin> LoadPlugin(const QString& file);

/// The editors.
class CPlugins
{
public:
    /// Loads every library of a folder, in the order of their names; a folder that is not there holds none. Answers the
    /// templates that came in.
    std::vector<CMultiDocTemplate*> Load(const QString& folder);
    /// Closes what their templates hold; the libraries stay.
    void Clear();
    /// Those that cannot be used, too.
    const std::vector<std::unique_ptr<CPlugin>>& All() const { return m_plugins; }
    /// The one that reads files of this name; null for none.
    CMultiDocTemplate* TemplateFor(const QString& path) const;
    /// The open document of a file; null for none.
    CKsDoc* FindDocument(const QString& path) const;
    /// The editor that a template came from; null for none.
    const CPlugin* Of(const CMultiDocTemplate* documents) const;

private:
    std::vector<std::unique_ptr<CPlugin>> m_plugins;
};
