#include "shell/plugin_loader.h"

#include "ks/fc/exports.h"

#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>
#include <QLibrary>
#include <QStringList>

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
    const QString path = IsUsable() ? KsBitmapPath(KsGetBitmapId()) : QString();
    return QFileInfo::exists(path) ? QIcon(path) : QIcon();
}

void CPlugin::UpdateName()
{
    if (!KsGetEditorString || !KsGetEditorString(&name) || name.isEmpty())
        name = QFileInfo(file).completeBaseName();
}

std::unique_ptr<CPlugin> LoadPlugin(const QString& file)
{
    auto plugin = std::make_unique<CPlugin>();
    plugin->file = file;
    plugin->name = QFileInfo(file).completeBaseName();
    QLibrary library(file); // stays loaded when this object goes
    // Whatever the library lacks itself is found missing now, not when the user works in it.
    library.setLoadHints(QLibrary::ResolveAllSymbolsHint);
    if (!library.load()) {
        plugin->error = PluginLoader::tr("It could not be loaded: %1").arg(library.errorString());
        return plugin;
    }
    const QStringList missing = Resolve(library, *plugin);
    if (!missing.isEmpty()) {
        plugin->error =
            PluginLoader::tr("It is no editor: it does not export %1.").arg(missing.join(QStringLiteral(", ")));
        return plugin;
    }
    plugin->UpdateName();
    plugin->error = TakeTemplates(*plugin);
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
