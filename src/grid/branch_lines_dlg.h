// "Insert lines along a branch": asks for branch, reach and distance.
#pragma once

#include "grid/branch_lines.h"

#include <QDialog>

class CGenGrid;
class QComboBox;
class QDialogButtonBox;
class QLabel;
class QLineEdit;
class QRadioButton;

class CBranchLinesDlg : public QDialog
{
    Q_OBJECT
public:
    explicit CBranchLinesDlg(CGenGrid& grid);

    /// After OK: the places without line, and how many have one already.
    const PlacesOfBranch& Places() const { return m_places; }
    std::size_t KnownCount() const { return m_known; }
    void accept() override;

private:
    void AddFields();
    void BranchChanged();
    void Show();
    /// The places that are asked for; why there are none.
    QString Read(PlacesOfBranch& asked) const;
    std::optional<double> Number(const QLineEdit& field) const;
    QString TextOf(double chainage) const;

    CGenGrid& m_grid;
    const CTableRows& m_rows;
    std::vector<std::pair<QString, double>> m_sections; // of the project
    std::vector<double> m_ofBranch;                     // those of the branch that is named
    BranchInTable m_inTable;                            // likewise
    PlacesOfBranch m_places;
    std::size_t m_known = 0;
    QComboBox* m_branch;
    QLineEdit *m_from, *m_to, *m_step;
    QRadioButton *m_every, *m_atSections;
    QLabel *m_noSections, *m_summary;
    QDialogButtonBox* m_buttons;
};

/// Asks, and puts the lines behind those of the branch: one step to undo.
void InsertLinesAlong(CGenGrid& grid);
