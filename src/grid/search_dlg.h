// "Search": what lines to look for.
#pragma once

#include "grid/grid_search.h"
#include "ks/units/edit_style.h"

#include <QDialog>
#include <memory>

namespace Ui {
class CSearchDlg;
}

class CSearchDlg : public QDialog
{
    Q_OBJECT
public:
    explicit CSearchDlg(const LineQuery& query, QWidget* parent = nullptr);
    ~CSearchDlg() override;

    /// What was asked for, after OK.
    const LineQuery& Query() const { return m_query; }
    void accept() override;

private:
    std::unique_ptr<Ui::CSearchDlg> m_ui;
    CKsEditStyle m_style{UnitGroup::Chainage, "%.10lg"};
    LineQuery m_query;
    double m_shownChainage; // in the user's unit
    QString m_shownText;
};
