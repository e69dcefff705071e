#include "shell/plugin_loader.h"

#include "ks/fc/exports.h"
#include "shell/library_file.h"
#include "shell/library_trial.h"
#include "shell/settings_keys.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QDir>
#include <QFileInfo>
#include <QLibrary>
#include <QSettings>
#include <QStringList>
#include <QVariantMap>
#include <exception>
#include <optional>

namespace {

struct PluginLoader
{
    Q_DECLARE_TR_FUNCTIONS(PluginLoader)
};

/// Finds every function of the boundary; names those that are missing.
QStringList Resolve(QLibrary& library, CPlugin& plugin)
{
    QStringList missing;
#define KS_PLUGIN_RESOLVE(result, function, arguments)                                                                 \
    plugin.function = reinterpret_cast<decltype(plugin.function)>(library.resolve(#function));                         \
    if (!plugin.function)                                                                                              \
        missing << QStringLiteral(#function);
    KS_PLUGIN_FUNCTIONS(KS_PLUGIN_RESOLVE)
#undef KS_PLUGIN_RESOLVE
    return missing;
}

/// Calls an editor. Its functions must not throw; where one does all the same, the program goes on without what it was
/// asked for. What was thrown, for the user; empty when nothing was.
template <typename Call>
QString WhatIsThrown(Call call)
{
    try {
        call();
        return {};
    } catch (const std::exception& thrown) {
        return ThrownText(thrown.what());
    } catch (...) {
        return ThrownText(nullptr);
    }
}

/// The same for an editor at work, of which a log is told.
template <typename Call>
void AskAtWork(const CPlugin& plugin, Call call)
{
    if (const QString thrown = WhatIsThrown(call); !thrown.isEmpty())
        qWarning("%s: %s", qPrintable(plugin.file), qPrintable(thrown));
}

// A trial takes time at the start, so it is made once of each version of a library, and what came of it is remembered:
// by the path of the library its version and why it failed; no reason for one that has been in use.

/// A program that is another may find the library another, too.
QString VersionOf(const QFileInfo& file)
{
    const QStringList parts{QString::number(file.size()), QString::number(file.lastModified().toMSecsSinceEpoch()),
                            QCoreApplication::applicationVersion()};
    return parts.join(u' ');
}

/// Nothing when this version of the library has not been tried.
std::optional<QString> WhatCameOf(const QFileInfo& file)
{
    const QVariantMap tried = QSettings().value(Settings::TriedLibraries).toMap();
    const QStringList known = tried.value(file.absoluteFilePath()).toStringList();
    return known.value(0) == VersionOf(file) ? std::optional(known.value(1)) : std::nullopt;
}

void Remember(const QFileInfo& file, const QString& whyNot)
{
    if (WhatCameOf(file) == whyNot)
        return;
    QVariantMap tried = QSettings().value(Settings::TriedLibraries).toMap();
    tried.removeIf([](const auto& library) { return !QFileInfo::exists(library.key()); });
    tried[file.absoluteFilePath()] = QStringList{VersionOf(file), whyNot};
    QSettings().setValue(Settings::TriedLibraries, tried);
}

/// Why a library cannot be used; empty when nothing speaks against it.
QString WhyNotTried(const QFileInfo& file)
{
    const std::optional<QString> known = WhatCameOf(file);
    const QString why = known ? *known : TryLibrary(file.absoluteFilePath());
    if (why.isEmpty())
        return {};
    Remember(file, why);
    return PluginLoader::tr("%1. It is tried again when its file has changed").arg(why);
}

/// Loads a library, whose own initialisation runs within. Why that failed, for the user; empty when it did not.
QString LoadLibrary(QLibrary& library)
{
    const QFileInfo file(library.fileName());
    QString why = WhyNoLibrary(file.absoluteFilePath());
    if (why.isEmpty())
        why = WhyNotTried(file);
    if (!why.isEmpty())
        return why;
    bool loaded = false;
    why = WhatIsThrown([&] { loaded = library.load(); });
    if (loaded)
        Remember(file, {});
    return loaded || !why.isEmpty() ? why : library.errorString();
}

void TakeName(CPlugin& plugin)
{
    const bool given = plugin.KsGetEditorString && plugin.KsGetEditorString(&plugin.name);
    if (!given || plugin.name.isEmpty())
        plugin.name = QFileInfo(plugin.file).completeBaseName();
}

QStringList ToolBarNames(const CPlugin& plugin)
{
    QStringList names;
    for (int i = 0, count = plugin.KsGetNumToolbars(); i < count; ++i) {
        CString text;
        plugin.KsGetToolbarString(&text, i);
        names << text.trimmed();
    }
    return names;
}

QString TakeTemplates(CPlugin& plugin)
{
    const int count = plugin.KsGetNumDocTemplates();
    for (int i = 0; i < count; ++i) {
        std::unique_ptr<CMultiDocTemplate> documents(plugin.KsGetDocTemplatePtr(i));
        if (!documents || documents->GetDocString(CMultiDocTemplate::filterExt).isEmpty())
            return PluginLoader::tr("Its document template %1 is missing or names no file extension.").arg(i);
        plugin.templates.push_back(std::move(documents));
    }
    return {};
}

} // namespace

QIcon CPlugin::Icon() const
{
    QString path;
    if (IsUsable())
        AskAtWork(*this, [&] { path = KsBitmapPath(KsGetBitmapId()); });
    return QFileInfo::exists(path) ? QIcon(path) : QIcon();
}

void CPlugin::UpdateName()
{
    AskAtWork(*this, [this] { TakeName(*this); });
}

QStringList CPlugin::ToolBarNames() const
{
    QStringList names;
    AskAtWork(*this, [&] { names = ::ToolBarNames(*this); });
    return names;
}

CKsToolBarEx* CPlugin::CreateToolBar(CKsMDIFrameWnd& frame, unsigned controlId, int index) const
{
    CKsToolBarEx* bar = nullptr;
    AskAtWork(*this, [&] { bar = KsCreateToolbar(&frame, 0, controlId, index); });
    return bar;
}

std::unique_ptr<CPlugin> LoadPlugin(const QString& file)
{
    auto plugin = std::make_unique<CPlugin>();
    plugin->file = file;
    plugin->name = QFileInfo(file).completeBaseName();
    QLibrary library(file); // stays loaded when this object goes
    // Whatever the library lacks itself is found missing now, not when the user works in it.
    library.setLoadHints(QLibrary::ResolveAllSymbolsHint);
    if (const QString why = LoadLibrary(library); !why.isEmpty()) {
        plugin->error = PluginLoader::tr("It could not be loaded: %1").arg(why);
        return plugin;
    }
    const QStringList missing = Resolve(library, *plugin);
    if (!missing.isEmpty()) {
        plugin->error =
            PluginLoader::tr("It is no editor: it does not export %1.").arg(missing.join(QStringLiteral(", ")));
        return plugin;
    }
    const QString thrown = WhatIsThrown([&] {
        TakeName(*plugin);
        plugin->error = TakeTemplates(*plugin);
        ToolBarNames(*plugin);
        plugin->KsGetBitmapId();
    });
    if (!thrown.isEmpty())
        plugin->error = PluginLoader::tr("It could not be loaded: %1").arg(thrown);
    if (!plugin->IsUsable())
        plugin->templates.clear();
    else
        KsAddExports([file](const char* name) { return QLibrary::resolve(file, name); });
    return plugin;
}

std::vector<CMultiDocTemplate*> CPlugins::Load(const QString& folder)
{
    std::vector<CMultiDocTemplate*> loaded;
    const auto files = QDir(folder).entryInfoList(QDir::Files, QDir::Name);
    for (const QFileInfo& file : files) {
        if (!QLibrary::isLibrary(file.fileName()))
            continue;
        m_plugins.push_back(LoadPlugin(file.absoluteFilePath()));
        for (const auto& documents : m_plugins.back()->templates)
            loaded.push_back(documents.get());
    }
    return loaded;
}

void CPlugins::Clear()
{
    for (const auto& plugin : m_plugins)
        plugin->templates.clear();
}

CMultiDocTemplate* CPlugins::TemplateFor(const QString& path) const
{
    for (CMultiDocTemplate* documents : CMultiDocTemplate::All()) {
        if (documents->MatchesExtension(path))
            return documents;
    }
    return nullptr;
}

CKsDoc* CPlugins::FindDocument(const QString& path) const
{
    const CMultiDocTemplate* documents = TemplateFor(path);
    return documents ? documents->FindDocument(path) : nullptr;
}

const CPlugin* CPlugins::Of(const CMultiDocTemplate* documents) const
{
    for (const auto& plugin : m_plugins) {
        for (const auto& each : plugin->templates) {
            if (each.get() == documents)
                return plugin.get();
        }
    }
    return nullptr;
}
