#include "ks/language/language.h"

#include <QApplication>
#include <QLibraryInfo>
#include <QTranslator>
#include <algorithm>
#include <map>
#include <memory>

struct KsResourceModule
{
    QString name;
    std::unique_ptr<QTranslator> translator; // null: the texts in the sources
};

namespace {

// By name, so that a module that had nothing for one language is found again for the next. Never destroyed: editors may
// free their modules while the program ends.
std::map<QString, KsResourceModule>& Modules()
{
    static auto* modules = new std::map<QString, KsResourceModule>;
    return *modules;
}

void Uninstall(KsResourceModule& module)
{
    if (module.translator && QCoreApplication::instance())
        QCoreApplication::removeTranslator(module.translator.get());
    module.translator.reset();
}

bool Install(KsResourceModule& module)
{
    Uninstall(module);
    const auto& language = KsLanguage::Instance();
    auto translator = std::make_unique<QTranslator>();
    for (const QString& folder : {language.TranslationFolder(), QLibraryInfo::path(QLibraryInfo::TranslationsPath)}) {
        if (!translator->load(module.name + u'_' + language.Current(), folder))
            continue;
        QCoreApplication::installTranslator(translator.get());
        module.translator = std::move(translator);
        return true;
    }
    return false;
}

/// Of the toolkit, whose Japanese misspells it.
[[maybe_unused]] constexpr const char* Misspelt = QT_TRANSLATE_NOOP("QShortcut", "Backspace");

KsResourceModule& ModuleOf(const QString& name)
{
    return Modules().try_emplace(name, KsResourceModule{name, nullptr}).first->second;
}

} // namespace

KsResourceHandle KsLangLoadResDll(const char* name, KsResourceHandle* handle, int)
{
    KsResourceModule& module = ModuleOf(QString::fromUtf8(name));
    KsResourceHandle result = Install(module) ? &module : nullptr;
    if (handle)
        *handle = result;
    return result;
}

void KsLangFreeResDll(KsResourceHandle handle)
{
    if (!handle)
        return;
    Uninstall(*handle);
    Modules().erase(QString(handle->name));
}

QStringList KsLangInAll(const char* module, const char* context, const char* source)
{
    static std::map<CString, std::unique_ptr<QTranslator>> translators; // by file
    QStringList texts{CString::fromUtf8(source)};
    for (const CString& language : KsLanguage::Available()) {
        const CString name = CString::fromUtf8(module);
        auto& translator = translators[KsLanguage::Instance().TranslationFolder() + u'/' + name + u'_' + language];
        if (!translator) {
            translator = std::make_unique<QTranslator>();
            static_cast<void>(translator->load(name + u'_' + language, KsLanguage::Instance().TranslationFolder()));
        }
        if (const CString text = translator->translate(context, source); !text.isEmpty() && !texts.contains(text))
            texts << text;
    }
    return texts;
}

QFont KsLangGetUserFont()
{
    return QApplication::font();
}

QLocale KsLangGetUserLocale()
{
    const QLocale system;
    const QLocale program(KsLanguage::Instance().Current());
    const auto languages = KsLanguage::Available();
    // Who has German forms and reads the program in English wants the German forms; Japanese was chosen.
    const bool isChosen = program.language() != QLocale::English ||
                          std::any_of(languages.begin(), languages.end(), [&system](const QString& code) {
                              return QLocale(code).language() == system.language();
                          });
    const bool isForeign = system.language() != program.language() && (isChosen || system.language() == QLocale::C);
    return isForeign ? program : system;
}

KsLanguage::KsLanguage()
    : m_current(QStringLiteral("en_US")),
      m_folder(QCoreApplication::applicationDirPath() + QStringLiteral("/translations"))
{
}

KsLanguage& KsLanguage::Instance()
{
    static auto* language = new KsLanguage;
    return *language;
}

QStringList KsLanguage::Available()
{
    return {QStringLiteral("en_US"), QStringLiteral("en_GB"), QStringLiteral("ja")};
}

void KsLanguage::SetCurrent(const QString& code)
{
    if (code == m_current || !Available().contains(code))
        return;
    m_current = code;
    KsResourceModule& toolkit = ModuleOf(QStringLiteral("qtbase")); // the buttons of message boxes
    Install(toolkit);                                               // first: what comes later goes before it
    for (auto& [name, module] : Modules())
        if (&module != &toolkit)
            Install(module);
    emit Changed();
}
