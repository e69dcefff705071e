// The view of a cross-section document: the plot, the tables beside it, and what other editors ask.
#pragma once

#include "editors/common/tables_view.h"
#include "editors/cross_sections/document.h"
#include "editors/cross_sections/section_plot.h"
#include "editors/cross_sections/section_tables.h"

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
    CGenGrid* Sections() const { return MainTable(); }
    CGenGrid* Points() const { return PartTable(); }
    /// Index of the section that is shown; -1 for none.
    int CurrentSection() const { return CurrentLine(); }

    void OnInitialUpdate() override;
    bool OnCommand(int id) override;
    bool IsCommandEnabled(int id) const override;
    std::vector<CKsMenuCommand> LinesMenu() const override;
    void CellCurrent(CGenGrid& grid) override;
    void LineEdited(CGenGrid& grid) override;
    void LineCurrent(CGenGrid& grid) override;

protected:
    void Retranslate() override;
    std::shared_ptr<IRowSource> MakePartRows(int section) override { return MakePointRows(*Document(), section); }
    void ShowInPicture(int section) override { m_plot->Show(Document()->Section(section)); }
    QString PartTitle() const override;
    void ShowParts() override;
    Answer AnswerTo(WPARAM request) override;
    QStringList KnownBranches() const override { return Document()->Sections().Branches(); }
    void ShowLocation(const CKvrCBELocation& location) override;

private:
    void GoToSection(int section);
    void TellLocation();

    // What other editors ask; each answers whether there was something.
    LRESULT LoadLocations(CObList& objects) const;
    LRESULT LoadBedLevels(CObList& objects) const;
    LRESULT FillChannel(const CObList& objects) const;

    CSectionPlot* m_plot = nullptr;
    QString m_toldBranch; // the place that the project was told of last, or was shown
    double m_toldChainage = KsUnset;
    bool m_showing = false, m_telling = false; // a place that another editor shows, or that is shown to the others
};
