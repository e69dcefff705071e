// The view of an HD parameter document: hosts the sheet of pages and relays between them, the document and the shell.
#pragma once

#include "ks/fc/frames.h"
#include "document/document.h"
#include "pages/framework/page_host.h"

#include <QString>

class CDlgPropertySheet;
class CGenPropertyPage;
struct PageEntry;

class CKavo0_hdView : public CView, public CCommandTarget, public IPageHost
{
    Q_OBJECT
public:
    explicit CKavo0_hdView(QWidget* parent = nullptr);
    ~CKavo0_hdView() override;

    CKavo0_hdDoc* GetDocument() const;
    /// The sheet; null before the first update.
    CDlgPropertySheet* Sheet() const { return m_sheet; }
    CGenPropertyPage* ActivePage() const;

    // CView
    void OnInitialUpdate() override;
    void OnUpdate(CView* sender, int hint, CHint* object) override;
    void OnActivateView(bool activate, CView* activated, CView* deactivated) override;
    bool MayLeave(KsLeave what) override;
    LRESULT WindowProc(unsigned message, WPARAM wParam, LPARAM lParam) override;

    // CCommandTarget
    bool OnCommand(int id) override;
    bool IsCommandEnabled(int id) const override;
    std::vector<CKsMenuCommand> LinesMenu() const override;

    // IPageHost
    CView* HostView() override { return this; }
    void EditedLineChanged(int column) override;
    void CurrentLocationChanged() override;
    void CurrentCellChanged() override { ShowLine(); }
    void Execute(int command) override { OnCommand(command); }
    QStringList BranchNames() override;
    void EnableLinesMenu(bool enable) override;

private:
    /// What F7 asked for and F3 goes on with.
    struct SearchState
    {
        QString name;
        double chainage = 0; // metres
        int chainageCriterion = 3, nameCriterion = 0;
        int row = 0;                            // the next search starts here; 0 is the first row
        const CGenPropertyPage* page = nullptr; // on which `row` is
        bool asked = false, found = false;
    };

    LRESULT AnswerEditor(WPARAM request, CKSComm_Package* package);
    void FetchLocation();
    QStringList LineTexts() const;
    void ShowLine();
    void Say(const QString& text);
    void TellLocationLater();
    void TellLocation();

    void AddTabs();
    std::unique_ptr<CGenPropertyPage> MakePage(const PageEntry& entry);
    void MakeOtherPages();
    void Search();
    void SearchAgain();
    void GotoLine();
    void RevealChange(const ChangePlace& place);
    void SendToolbarMessage(unsigned message);
    CKsMDIFrameWnd* MainFrame() const;

    CDlgPropertySheet* m_sheet = nullptr;                      // child
    std::vector<std::unique_ptr<CGenPropertyPage>> m_offSheet; // constructed, without a tab
    bool m_inProject = false;
    bool m_tellLocation = false; // once the present event is over
    QString m_said;              // in the status bar, behind the line; until the user goes on
    QStringList m_saidAt;        // what stood there when it was said
    SearchState m_search;
    bool m_linesEnabled = true;
};
