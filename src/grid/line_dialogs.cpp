#include "grid/line_dialogs.h"

#include "grid/grid_texts.h"
#include "ks/fc/message_box.h"

#include <QButtonGroup>

CGotoDlg::CGotoDlg(QWidget* parent) : QDialog(parent)
{
    m_ui.setupUi(this);
    m_ui.line_1057->SetValue(m_line);
    m_ui.line_1057->selectAll();
}

void CGotoDlg::accept()
{
    const auto line = m_ui.line_1057->CheckedValue();
    if (!line)
        return;
    if (*line >= 1) {
        m_line = *line;
        return QDialog::accept();
    }
    KsMessageBox(GridTexts::tr("Line number must be greater than 0"), QMessageBox::Ok, this);
    m_ui.line_1057->setFocus();
    m_ui.line_1057->selectAll();
}

namespace {

/// The buttons' group, each button's place being its value.
void Choose(QButtonGroup* group, std::initializer_list<QRadioButton*> buttons, int value)
{
    int id = 0;
    for (QRadioButton* button : buttons)
        group->addButton(button, id++);
    if (auto* button = group->button(value))
        button->setChecked(true);
}

} // namespace

CSearchDlg::CSearchDlg(const LineQuery& query, QWidget* parent)
    : QDialog(parent), m_query(query), m_shownChainage(m_style.UnitConvertFromBase(query.chainage, 1))
{
    m_ui.setupUi(this);
    Choose(m_ui.nameCriterion, {m_ui.partialMatch_1059, m_ui.fullMatch_1060}, int(query.nameMatch));
    Choose(m_ui.chainageCriterion, {m_ui.less_1062, m_ui.equal_1063, m_ui.greater_1064, m_ui.notUse_1067},
           int(query.chainageMatch));
    m_ui.riverName_1058->setText(query.name);
    DDX_KSedit(false, *m_ui.chainage_1061, m_shownChainage, m_style);
    m_shownText = m_ui.chainage_1061->text();
    m_ui.chainageUnit->setText(m_style.UnitSymbol());
    m_ui.riverName_1058->selectAll();
}

void CSearchDlg::accept()
{
    if (!DDX_KSedit(true, *m_ui.chainage_1061, m_shownChainage, m_style))
        return;
    if (m_ui.chainage_1061->text() != m_shownText) // else it stays what it was to the last bit
        m_query.chainage = m_style.UnitConvertFromBase(m_shownChainage, 0);
    m_query.name = m_ui.riverName_1058->text();
    m_query.chainageMatch = ChainageMatch(m_ui.chainageCriterion->checkedId());
    m_query.nameMatch = NameMatch(m_ui.nameCriterion->checkedId());
    QDialog::accept();
}
