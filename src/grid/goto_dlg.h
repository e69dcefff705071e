// "Go to grid line".
#pragma once

#include <QDialog>
#include <memory>

namespace Ui {
class CGotoDlg;
}

class CGotoDlg : public QDialog
{
    Q_OBJECT
public:
    explicit CGotoDlg(QWidget* parent = nullptr);
    ~CGotoDlg() override;

    /// The line asked for, 1 or more after OK.
    int Line() const { return m_line; }
    void accept() override;

private:
    std::unique_ptr<Ui::CGotoDlg> m_ui;
    int m_line = 0;
};
