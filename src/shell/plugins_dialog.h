// "Plug-ins": which editors are there, and why one is not used.
#pragma once

#include <QDialog>

class CPlugins;

class CPluginsDialog : public QDialog
{
    Q_OBJECT
public:
    explicit CPluginsDialog(const CPlugins& plugins, QWidget* parent = nullptr);
};
