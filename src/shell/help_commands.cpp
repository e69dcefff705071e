#include "shell/help_commands.h"

#include "ks/fc/help_window.h"
#include "shell/frame_actions.h"
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

/// As it stands in the menu bar, without mnemonic.
QString PlainMenuTitle(int menu)
{
    QString title = QCoreApplication::translate("CFrameMenus", MenuTitles[std::size_t(menu)]);
    const qsizetype bracket = title.indexOf(QStringLiteral("(&"));
    return bracket > 0 ? title.left(bracket) : title.remove(u'&');
}

QString AboutText()
{
    const QString used =
        QStringLiteral("Qt %1 (LGPL), UDUNITS-2, muParser, GNU libunistring (LGPL), GDAL, QCustomPlot (GPL)")
            .arg(QString::fromLatin1(qVersion()));
    return QStringLiteral("<p><b>%1</b></p><p>%2</p><p>%3</p><p>%4</p>")
        .arg(HelpCommands::tr("%1, version %2")
                 .arg(QCoreApplication::applicationName(), QCoreApplication::applicationVersion()),
             HelpCommands::tr("Shell of the river model editors."),
             HelpCommands::tr(
                 "Free software under the GNU General Public License, version 3 or later (GPL-3.0-or-later)."),
             HelpCommands::tr("It uses %1.").arg(used));
}

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

void ShowHelp(CMainFrame& frame)
{
    const QString file = HelpFile(frame);
    if (!file.isEmpty())
        QDesktopServices::openUrl(QUrl::fromLocalFile(file));
    else if (!frame.SendCommand(KsCommand::Help))
        CKsHelpWindow::In(frame).Show([&frame] { return frame.HelpChapters(); }, {});
}

std::vector<KsHelpChapter> ShellChapters()
{
    QString html;
    for (int menu = 0; menu < MenuCount; ++menu) {
        QString rows;
        for (const CFrameAction& action : CFrameAction::Table()) {
            QStringList keys;
            for (const QKeySequence& key : action.name ? action.Shortcuts() : QList<QKeySequence>())
                keys << key.toString(QKeySequence::NativeText);
            if (action.menu == menu && !keys.isEmpty())
                rows += QStringLiteral("<tr><td><b>%1</b>&nbsp;&nbsp;</td><td>%2</td></tr>")
                            .arg(keys.join(QStringLiteral(", ")).toHtmlEscaped(),
                                 CFrameAction::tr(action.tip).toHtmlEscaped());
        }
        if (!rows.isEmpty())
            html += QStringLiteral("<p><b>%1</b></p><table>%2</table>").arg(PlainMenuTitle(menu).toHtmlEscaped(), rows);
    }
    return {{QStringLiteral("menus"), HelpCommands::tr("Keys of the menus"), html},
            {QStringLiteral("about"), HelpCommands::tr("About the program"), AboutText()}};
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
    QMessageBox about(QMessageBox::NoIcon, HelpCommands::tr("About %1").arg(program), AboutText(), QMessageBox::Ok,
                      parent);
    about.setTextFormat(Qt::RichText);
    about.exec();
}
