// The dialogs that ask for lines: "Go to grid line" for a number, "Search" for a branch and a chainage.
#pragma once

#include "grid/grid_search.h"
#include "ks/units/edit_style.h"
#include "ui_goto_dlg.h"
#include "ui_search_dlg.h"

#include <QDialog>

class CGotoDlg : public QDialog
{
public:
    explicit CGotoDlg(QWidget* parent = nullptr);

    /// The line asked for, 1 or more after OK.
    int Line() const { return m_line; }
    void accept() override;

private:
    Ui::CGotoDlg m_ui;
    int m_line = 0;
};

class CSearchDlg : public QDialog
{
public:
    explicit CSearchDlg(const LineQuery& query, QWidget* parent = nullptr);

    /// What was asked for, after OK.
    const LineQuery& Query() const { return m_query; }
    void accept() override;

private:
    Ui::CSearchDlg m_ui;
    CKsEditStyle m_style{UnitGroup::Chainage, "%.10lg"};
    LineQuery m_query;
    double m_shownChainage; // in the user's unit
    QString m_shownText;
};
