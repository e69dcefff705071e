// The view of an HD parameter document: hosts the sheet of pages and relays between them, the document and the shell.
#pragma once

#include "document/document.h"
#include "ks/fc/project_view.h"
#include "pages/framework/page_host.h"
#include "problems/problem_host.h"
#include "profile/profile_host.h"

#include <QPointer>
#include <QSet>
#include <QString>

class CCtrlEdit;
class CDlgPropertySheet;
class CGenPropertyPage;
class CProblemCheck;
class CProfilePanel;
struct PageEntry;

class CDlgFrame : public CKsMDIChildWnd
{
};

class CKavo0_hdView : public CKsProjectView, public IPageHost, public IProfileHost, public IProblemHost
{
    Q_OBJECT
public:
    explicit CKavo0_hdView(QWidget* parent = nullptr);
    ~CKavo0_hdView() override;

    CKavo0_hdDoc* GetDocument() const;
    /// The sheet; null before the first update.
    CDlgPropertySheet* Sheet() const { return m_sheet; }
    CGenPropertyPage* ActivePage() const;
    /// What is wrong in the document; null before all pages are made.
    CProblemCheck* Problems() const { return m_problems.get(); }

    // CView
    void OnInitialUpdate() override;
    void OnUpdate(CView* sender, int hint, CHint* object) override;
    void OnActivateView(bool activate, CView* activated, CView* deactivated) override;
    bool MayLeave(KsLeave what) override;

    // CCommandTarget
    bool OnCommand(int id) override;
    bool IsCommandEnabled(int id) const override;
    std::vector<CKsMenuCommand> LinesMenu() const override;
    std::vector<CKsMenuCommand> EditMenu() const override;

    // IPageHost
    CView* HostView() override { return this; }
    void EditedLineChanged() override;
    void CurrentLocationChanged() override;
    void CurrentCellChanged() override { ShowStatus(); }
    void Execute(int command) override { OnCommand(command); }
    std::vector<HostTable> TablesOfDocument() override;
    QStringList BranchNames() override;
    void EnableLinesMenu(bool enable) override;
    void ShowHelp() override;

    // IProfileHost
    std::vector<ProfileTable> ProfileTables() override;
    int FrontTab() const override;
    QStringList ProfileBranches() override { return BranchNames(); }
    std::vector<BedLevel> BedLevels(const QString& branch) override;
    bool AreDepths(std::string_view field) const override;
    bool MayLeaveField() override { return MayLeave(KsLeave::Field); }
    bool ShowCell(const ProfileTable& table, std::size_t row, int column) override;

    // IProblemHost
    const HD_Parameters& CheckedParameters() const override;
    QString CheckedTitle() const override;
    QString CheckedPath() const override;
    std::shared_ptr<const CRiver> CheckedRiver() override;
    std::vector<ProblemWhere> WhereAre(const std::vector<Problem>& problems) const override;
    void ShowProblem(const ProblemPlace& place) override;
    std::vector<FileProblem> FileProblems() const override;
    void ShowFileProblems() override;
    void Mend(const Problem& problem) override;

protected:
    LRESULT OnRequest(WPARAM request, CKSComm_Package& package) override;
    void RevealChange(const ChangePlace& place) override;
    void OnProjectsChanged() override;
    CString PlaceText() const override;
    CString SelectionText() const override;

private:
    void FetchLocation();
    void FindField();
    CProfilePanel& Profile();
    void ShowProfile();
    void ToggleProfile();
    void TellProfile();
    void WatchProblems();
    void ShowProblems();
    void ToggleProblems();
    void NextProblem(bool forward);
    void MarkProblems();
    bool BringToFront();
    void TellLocationLater();
    void TellLocationIfOther();
    void TellLocation();
    std::pair<CString, double> CurrentLocation() const;

    QVariantMap Arrangement() const override;
    CString FieldText(const QWidget& field) const;
    void RestorePage(int tab);
    void AddTabs();
    std::unique_ptr<CGenPropertyPage> MakePage(const PageEntry& entry);
    void MakeOtherPages();

    CDlgPropertySheet* m_sheet = nullptr;                      // child
    std::unique_ptr<CProblemCheck> m_problems;                 // null before all pages are made
    QPointer<CProfilePanel> m_profile;                         // null before it is shown; see Profile
    std::vector<std::unique_ptr<CGenPropertyPage>> m_offSheet; // constructed, without a tab
    bool m_tellLocation = false;                               // once the present event is over
    std::pair<CString, double> m_toldLocation;
    mutable std::pair<const void*, int> m_countedAt; // the field and the step for which lines were counted
    mutable CString m_overrides;
    QVariantMap m_arranged; // what was kept for the file
    QSet<int> m_restored;   // the tabs whose pages have been given theirs
    CGridSearch m_search;
    bool m_linesEnabled = true;
};
