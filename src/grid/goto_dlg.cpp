#include "grid/goto_dlg.h"

#include "grid/grid_texts.h"
#include "ks/fc/message_box.h"
#include "ui_goto_dlg.h"

CGotoDlg::CGotoDlg(QWidget* parent) : QDialog(parent), m_ui(std::make_unique<Ui::CGotoDlg>())
{
    m_ui->setupUi(this);
    m_ui->line_1057->SetValue(m_line);
    m_ui->line_1057->selectAll();
}

CGotoDlg::~CGotoDlg() = default;

void CGotoDlg::accept()
{
    const auto line = m_ui->line_1057->CheckedValue();
    if (!line)
        return;
    if (*line >= 1) {
        m_line = *line;
        return QDialog::accept();
    }
    KsMessageBox(GridTexts::tr("Line number must be greater than 0"), QMessageBox::Ok, this);
    m_ui->line_1057->setFocus();
    m_ui->line_1057->selectAll();
}
