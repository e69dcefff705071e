#include "shell/help_commands.h"

#include "shell/main_frame.h"

#include <QCoreApplication>
#include <QDesktopServices>
#include <QFileInfo>
#include <QMessageBox>
#include <QUrl>

namespace {

struct HelpCommands
{
    Q_DECLARE_TR_FUNCTIONS(HelpCommands)
};

/// Empty when it is not installed.
QString HelpFile(const CMainFrame& frame)
{
    const CKsDoc* document = frame.ActiveDocument();
    const auto templates = frame.Plugins().Templates();
    const CMultiDocTemplate* documents = document            ? document->GetDocTemplate()
                                         : templates.empty() ? nullptr
                                                             : templates.front();
    const QString name = documents ? documents->GetDocString(CMultiDocTemplate::windowTitle) : QString();
    const QFileInfo file(QCoreApplication::applicationDirPath(), name);
    return !name.isEmpty() && file.isFile() ? file.absoluteFilePath() : QString();
}

} // namespace

bool HasHelp(const CMainFrame& frame)
{
    const auto* target = dynamic_cast<CCommandTarget*>(frame.GetActiveView());
    return !HelpFile(frame).isEmpty() || (target && target->IsCommandEnabled(KsCommand::Help));
}

void ShowHelp(CMainFrame& frame)
{
    const QString file = HelpFile(frame);
    if (file.isEmpty())
        frame.SendCommand(KsCommand::Help);
    else
        QDesktopServices::openUrl(QUrl::fromLocalFile(file));
}

void ShowAbout(QWidget* parent)
{
    const QString program = QCoreApplication::applicationName();
    QMessageBox about(QMessageBox::NoIcon, HelpCommands::tr("About %1").arg(program),
                      HelpCommands::tr("%1, version %2\n\nShell of the river model editors.")
                          .arg(program, QCoreApplication::applicationVersion()),
                      QMessageBox::Ok, parent);
    about.exec();
}
