// The view of a cross-section document: the plot, the tables beside it, and what other editors ask.
#pragma once

#include "editors/common/lines_view.h"
#include "editors/common/project_view.h"
#include "editors/cross_sections/section_plot.h"
#include "editors/cross_sections/table_models.h"

class QLabel;
class QSplitter;

/// Commands of the "Lines" menu, the context menu and the tool bar.
namespace CrossSectionCommand {
inline constexpr int InsertLine = 43100, DeleteLine = 43101, Previous = 43102, Next = 43103;
} // namespace CrossSectionCommand

class CCrossSectionView : public CProjectView
{
    Q_OBJECT
public:
    explicit CCrossSectionView(QWidget* parent = nullptr);
    ~CCrossSectionView() override;

    CCrossSectionDoc* Document() const { return static_cast<CCrossSectionDoc*>(GetDocument()); }
    CSectionPlot* Plot() const { return m_plot; }
    CLinesView* Sections() const { return m_sections; }
    CLinesView* Points() const { return m_points; }
    /// Index of the section that is shown; -1 for none.
    int CurrentSection() const;

    void OnInitialUpdate() override;
    void OnUpdate(CView* sender, int hint, CHint* object) override;
    bool MayLeave(KsLeave what) override;
    bool OnCommand(int id) override;
    bool IsCommandEnabled(int id) const override;
    std::vector<CKsMenuCommand> LinesMenu() const override;

protected:
    LRESULT OnRequest(WPARAM request, CKSComm_Package& package) override;
    void OnProjectsChanged() override;
    void changeEvent(QEvent* event) override;

private:
    void MakeTables(QSplitter* splitter);
    CLinesView* MakeTable(CSectionLines* model, const char* name);
    void ConnectTables();
    void CommandsChanged();
    void Retranslate();
    void UnitsChanged();
    void SectionsChanged(int index);
    void CurrentSectionChanged();
    void ShowSection();
    void TellLocation();
    void ShowContextMenu(CLinesView* table, const QPoint& at);
    void InsertLine();
    void DeleteLines();
    void CopyLines();
    void PasteLines();
    std::vector<int> SelectedRows() const;
    static void GoToRow(CLinesView* table, int row);
    void StepSection(int step);
    bool HasFocusWithin() const;
    QString NewBranch();

    // What other editors ask; each answers whether there was something.
    LRESULT LoadLocations(CObList& objects) const;
    LRESULT FillChannel(const CObList& objects) const;
    LRESULT BranchNames(CObList& objects) const;
    LRESULT ShowLocation(const CObList& objects);

    CSectionPlot* m_plot = nullptr;
    CSectionTable* m_sectionTable = nullptr;
    CPointTable* m_pointTable = nullptr;
    CLinesView *m_sections = nullptr, *m_points = nullptr;
    CLinesView* m_lines = nullptr; // the one of them that had the focus last: commands are about its lines
    QLabel *m_sectionTitle = nullptr, *m_pointTitle = nullptr;
    QString m_toldBranch; // the place that the project was told of last, or was shown
    double m_toldChainage = KsUnset;
    bool m_showing = false, m_telling = false; // a place that another editor shows, or that is shown to the others
};
