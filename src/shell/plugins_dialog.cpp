#include "shell/plugins_dialog.h"

#include "shell/plugin_loader.h"

#include <QDialogButtonBox>
#include <QFileInfo>
#include <QHeaderView>
#include <QTreeWidget>
#include <QVBoxLayout>

CPluginsDialog::CPluginsDialog(const CPlugins& plugins, QWidget* parent) : QDialog(parent)
{
    setObjectName(QStringLiteral("pluginsDialog"));
    setWindowTitle(tr("Plug-ins"));
    auto* list = new QTreeWidget(this);
    list->setRootIsDecorated(false);
    list->setWordWrap(true);
    list->setHeaderLabels({tr("Editor"), tr("File"), tr("State")});
    for (const auto& plugin : plugins.All()) {
        auto* item = new QTreeWidgetItem(list, {plugin->name, QFileInfo(plugin->file).fileName(),
                                                plugin->IsUsable() ? tr("In use") : plugin->error});
        item->setToolTip(1, plugin->file);
        item->setToolTip(2, item->text(2));
        item->setIcon(0, plugin->Icon());
    }
    list->resizeColumnToContents(0);
    list->resizeColumnToContents(1);
    auto* buttons = new QDialogButtonBox(QDialogButtonBox::Close, this);
    connect(buttons, &QDialogButtonBox::rejected, this, &QDialog::reject);
    auto* layout = new QVBoxLayout(this);
    layout->addWidget(list);
    layout->addWidget(buttons);
    resize(640, 240);
}
