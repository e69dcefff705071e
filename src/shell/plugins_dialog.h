// "Plug-ins": which editors are there, and why one is not used.
#pragma once

#include <QDialog>
#include <memory>
#include <vector>

struct CPlugin;

class CPluginsDialog : public QDialog
{
    Q_OBJECT
public:
    explicit CPluginsDialog(const std::vector<std::unique_ptr<CPlugin>>& plugins, QWidget* parent = nullptr);
};
