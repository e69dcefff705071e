#include "shell/help_commands.h"

#include "shell/main_frame.h"

#include <QCoreApplication>
#include <QDesktopServices>
#include <QDialogButtonBox>
#include <QFileInfo>
#include <QMessageBox>
#include <QTreeWidget>
#include <QUrl>
#include <QVBoxLayout>

namespace {

struct HelpCommands
{
    Q_DECLARE_TR_FUNCTIONS(HelpCommands)
};

/// Empty when it is not installed.
QString HelpFile(const CMainFrame& frame)
{
    const CKsDoc* document = frame.ActiveDocument();
    const auto& templates = CMultiDocTemplate::All();
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

void ShowPlugins(CMainFrame& frame)
{
    QDialog dialog(&frame);
    dialog.setObjectName(QStringLiteral("pluginsDialog"));
    dialog.setWindowTitle(HelpCommands::tr("Plug-ins"));
    auto* list = new QTreeWidget(&dialog);
    list->setRootIsDecorated(false);
    list->setWordWrap(true);
    list->setHeaderLabels({HelpCommands::tr("Editor"), HelpCommands::tr("File"), HelpCommands::tr("State")});
    for (const auto& plugin : frame.Plugins().All()) {
        auto* item = new QTreeWidgetItem(list, {plugin->name, QFileInfo(plugin->file).fileName(),
                                                plugin->IsUsable() ? HelpCommands::tr("In use") : plugin->error});
        item->setToolTip(1, plugin->file);
        item->setToolTip(2, item->text(2));
        item->setIcon(0, plugin->Icon());
    }
    list->resizeColumnToContents(0);
    list->resizeColumnToContents(1);
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Close, &dialog);
    QObject::connect(buttons, &QDialogButtonBox::rejected, &dialog, &QDialog::reject);
    auto* layout = new QVBoxLayout(&dialog);
    layout->addWidget(list);
    layout->addWidget(buttons);
    dialog.resize(640, 240);
    dialog.exec();
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
