// The view of a cross-section document: the plot, the tables beside it, and what other editors ask.
#pragma once

#include "editors/common/tables_view.h"
#include "editors/cross_sections/document.h"
#include "editors/cross_sections/section_plot.h"
#include "editors/cross_sections/section_tables.h"

class QLabel;
class QSplitter;

/// Commands of the "Lines" menu, the context menu and the tool bar.
namespace CrossSectionCommand {
inline constexpr int Previous = 43102, Next = 43103;
} // namespace CrossSectionCommand

class CCrossSectionView : public CTablesView
{
    Q_OBJECT
public:
    explicit CCrossSectionView(QWidget* parent = nullptr);

    CCrossSectionDoc* Document() const { return static_cast<CCrossSectionDoc*>(GetDocument()); }
    CSectionPlot* Plot() const { return m_plot; }
    CGenGrid* Sections() const { return m_sections; }
    CGenGrid* Points() const { return m_points; }
    /// Index of the section that is shown; -1 for none.
    int CurrentSection() const;

    void OnInitialUpdate() override;
    bool OnCommand(int id) override;
    bool IsCommandEnabled(int id) const override;
    std::vector<CKsMenuCommand> LinesMenu() const override;
    void CellCurrent(CGenGrid& grid) override;
    void LineCurrent(CGenGrid& grid) override;

protected:
    LRESULT OnRequest(WPARAM request, CKSComm_Package& package) override;
    void OnProjectsChanged() override;
    void ShowDocument() override;
    void Retranslate() override;
    const CGenGrid* SearchedTable() const override { return m_sections; }
    void RevealChange(const ChangePlace& place) override;

private:
    void MakeTables(QSplitter* splitter);
    void ShowSection();
    void GoToSection(int section);
    void TellLocation();

    // What other editors ask; each answers whether there was something.
    LRESULT LoadLocations(CObList& objects) const;
    LRESULT FillChannel(const CObList& objects) const;
    LRESULT ListBranches(CObList& objects) const;
    LRESULT ShowLocation(const CObList& objects);

    CSectionPlot* m_plot = nullptr;
    CGenGrid *m_sections = nullptr, *m_points = nullptr;
    int m_pointsOf = -1; // the section whose points are shown
    QLabel *m_sectionTitle = nullptr, *m_pointTitle = nullptr;
    QString m_toldBranch; // the place that the project was told of last, or was shown
    double m_toldChainage = KsUnset;
    bool m_showing = false, m_telling = false; // a place that another editor shows, or that is shown to the others
};
