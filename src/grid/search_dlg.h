// "Search": what lines to look for.
#pragma once

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
    /// `chainage` in metres. Chainage criterion: 0 less, 1 equal, 2 greater, 3 not used. Name criterion: 0 partial
    /// match (the name begins with the text), 1 full match.
    CSearchDlg(const QString& riverName, double chainage, int chainageCriterion, int nameCriterion,
               QWidget* parent = nullptr);
    ~CSearchDlg() override;

    // After OK.
    const QString& RiverName() const { return m_riverName; }
    double Chainage() const { return m_chainage; }
    int ChainageCriterion() const { return m_chainageCriterion; }
    int NameCriterion() const { return m_nameCriterion; }
    void accept() override;

private:
    std::unique_ptr<Ui::CSearchDlg> m_ui;
    CKsEditStyle m_style{UnitGroup::Chainage, "%.10lg"};
    QString m_riverName;
    int m_chainageCriterion, m_nameCriterion;
    double m_chainage;      // metres
    double m_shownChainage; // in the user's unit
    QString m_shownText;
};
