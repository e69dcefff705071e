// The user's language and font, and the translations of modules.
#pragma once

#include "ks/fc/types.h"
#include "ks/ks_export.h"

#include <QFont>
#include <QLocale>
#include <QObject>
#include <QStringList>
#include <QTranslator>
#include <memory>

struct KsResourceModule; // the translations of one module in the user's language
using KsResourceHandle = KsResourceModule*;

/// Finds the resource module `name` for the user's language and installs it. Stores and returns its handle; null
/// (and the module's own English texts stay in use) when there is none. `flags` is 0.
KS_API KsResourceHandle KsLangLoadResDll(const char* name, KsResourceHandle* handle, int flags);
/// Removes a resource module. Null is allowed.
KS_API void KsLangFreeResDll(KsResourceHandle handle);
/// A text of a module, as its source has it, in every language of the program, each spelling once.
KS_API QStringList KsLangInAll(const char* module, const char* context, const char* source);
/// The user's interface font.
KS_API QFont KsLangGetUserFont();

/// How dates and times are written: the system's forms as long as they are in the program's language, or in one that
/// the program has not; else those of the program's language.
KS_API QLocale KsLangGetUserLocale();

/// The language of the program: "en_US" (the texts in the sources), "en_GB" or "ja".
class KS_API KsLanguage : public QObject
{
    Q_OBJECT
public:
    static KsLanguage& Instance();
    static QStringList Available();
    const QString& Current() const { return m_current; }
    /// Reloads every loaded resource module; windows get QEvent::LanguageChange.
    void SetCurrent(const QString& code);
    /// Folder of the *.qm files; beside the program by default.
    void SetTranslationFolder(const QString& folder) { m_folder = folder; }
    const QString& TranslationFolder() const { return m_folder; }
signals:
    void Changed();

private:
    KsLanguage();
    QString m_current, m_folder;
};
