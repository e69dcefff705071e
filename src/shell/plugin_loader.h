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
};

/// Loads one library and asks it for its templates. What goes wrong is told in `error`.
std::unique_ptr<CPlugin> LoadPlugin(const QString& file);
/// Loads every library of a folder, in the order of their names. A folder that is not there holds none.
std::vector<std::unique_ptr<CPlugin>> LoadPlugins(const QString& folder);
