#include "shell/shell_main.h"

#include "files/platform_process.h"
#include "ks/language/language.h"
#include "shell/appearance.h"
#include "shell/application.h"
#include "shell/handover.h"
#include "shell/main_frame.h"
#include "shell/settings_keys.h"

#include <QCommandLineParser>
#include <QDir>
#include <QLocale>
#include <QSettings>
#include <QTimer>
#include <functional>
#include <optional>

namespace {

/// The language chosen last; at the first start the one of the desktop, as far as there is a translation.
QString StartLanguage()
{
    const QString chosen = QSettings().value(Settings::Language).toString();
    if (KsLanguage::Available().contains(chosen))
        return chosen;
    const QLocale desktop = QLocale::system();
    if (desktop.language() == QLocale::Japanese)
        return QStringLiteral("ja");
    const bool british = desktop.language() == QLocale::English && desktop.territory() == QLocale::UnitedKingdom;
    return british ? QStringLiteral("en_GB") : QStringLiteral("en_US");
}

} // namespace

int ShellMain(int argc, char** argv, std::function<void(CMainFrame&)> onStarted)
{
    IgnoreFileSizeSignal();
    QCoreApplication::setOrganizationName(QStringLiteral("KVR"));
    QCoreApplication::setApplicationName(QStringLiteral("KVR Shell"));
    QCoreApplication::setApplicationVersion(QStringLiteral(KVR_VERSION));
    CApplication app(argc, argv);

    KsLanguage::Instance().SetCurrent(StartLanguage());
    KsLangLoadResDll("ks", nullptr, 0);
    KsLangLoadResDll("kvrshell", nullptr, 0);

    QCommandLineParser parser;
    parser.setApplicationDescription(QCoreApplication::translate("ShellMain", "Shell of the river model editors"));
    const QCommandLineOption plugins(QStringLiteral("plugins"),
                                     QCoreApplication::translate("ShellMain", "Folder of the editors."),
                                     QCoreApplication::translate("ShellMain", "folder"),
                                     QCoreApplication::applicationDirPath() + QStringLiteral("/plugins"));
    parser.addOption(plugins);
    const QCommandLineOption separate(
        QStringLiteral("separate"),
        QCoreApplication::translate("ShellMain", "Start a program of its own, whether one runs already or not."));
    parser.addOption(separate);
    parser.addPositionalArgument(QStringLiteral("files"),
                                 QCoreApplication::translate("ShellMain", "Files and projects to open."),
                                 QStringLiteral("[files...]"));
    parser.addHelpOption();
    parser.addVersionOption();
    parser.process(app);
    QStringList files;
    for (const QString& file : parser.positionalArguments())
        files << QDir::current().absoluteFilePath(file);
    const bool isSeparate = parser.isSet(separate);
    if (!isSeparate && QSettings().value(Settings::OneProgram, true).toBool() && CHandover::Give(files))
        return 0;

    ApplyChosenAppearance();
    CMainFrame frame;
    frame.LoadPlugins(parser.value(plugins));
    frame.show();
    // Before control returns to the event loop: the first thing painted is the first page, not an empty frame.
    frame.OpenFiles(files);
    std::optional<CHandover> others;
    if (!isSeparate)
        others.emplace(std::bind_front(&CMainFrame::TakeFiles, &frame));
    // When what was asked for is there: a message about it comes first.
    QTimer::singleShot(0, &frame, &CMainFrame::OfferRecovery);
    if (onStarted)
        QTimer::singleShot(0, &frame, [&] { onStarted(frame); });
    return CApplication::exec();
}
