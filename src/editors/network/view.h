// The view of a network document: the map, the tables beside it, and what other editors ask.
#pragma once

#include "editors/common/lines_view.h"
#include "editors/common/project_view.h"
#include "editors/network/location_source.h"
#include "editors/network/network_map.h"
#include "editors/network/table_models.h"

#include <QTimer>

class QAction;
class QLabel;
class QMenu;
class QSplitter;

/// Commands of the "Lines" menu and of the tool bar.
namespace NetworkCommand {
inline constexpr int Import = 43000, InsertLine = 43001, DeleteLine = 43002, FitAll = 43003, ZoomIn = 43004,
                     ZoomOut = 43005;
} // namespace NetworkCommand

class CNetworkView : public CProjectView
{
    Q_OBJECT
public:
    explicit CNetworkView(QWidget* parent = nullptr);
    ~CNetworkView() override;

    CNetworkDoc* Document() const { return static_cast<CNetworkDoc*>(GetDocument()); }
    CNetworkMap* Map() const { return m_map; }
    CLinesView* Branches() const { return m_branches; }
    CLinesView* Channel() const { return m_channel; }
    /// The menu for what is picked or selected on the map.
    std::unique_ptr<QMenu> MapMenu();
    /// Reads a GIS file, asks what to take of it and how, appends its lines as branches and tells what it did.
    void Import(const QString& path);

    void OnInitialUpdate() override;
    void OnUpdate(CView* sender, int hint, CHint* object) override;
    bool MayLeave(KsLeave what) override;
    bool OnCommand(int id) override;
    bool IsCommandEnabled(int id) const override;
    std::vector<CKsMenuCommand> LinesMenu() const override;

protected:
    LRESULT OnRequest(WPARAM request, CKSComm_Package& package) override;
    void OnProjectsChanged() override;
    void showEvent(QShowEvent* event) override;
    void changeEvent(QEvent* event) override;

private:
    void MakeTables(QSplitter* splitter);
    CLinesView* MakeTable(CNetworkTable* model, const char* name);
    CLinesView* FocusTable() const;
    void Retranslate();
    void UnitsChanged();
    void NetworkChanged();
    void CurrentBranchChanged();
    void PickedChanged();
    void LocationsChanged();
    void RefreshLocations();
    void DeleteLocation();
    void InsertLine();
    void DeleteLines();
    void AskForImport();

    // What other editors ask; each answers whether there was something.
    LRESULT FetchLocation(CObList& objects) const;
    LRESULT BranchNames(CObList& objects) const;
    LRESULT FillChannel(const CObList& objects) const;
    LRESULT ShowLocation(const CObList& objects);

    CNetworkMap* m_map = nullptr;
    CBranchTable* m_branchTable = nullptr;
    CChannelTable* m_channelTable = nullptr;
    CLinesView *m_branches = nullptr, *m_channel = nullptr;
    QLabel *m_branchTitle = nullptr, *m_channelTitle = nullptr;
    std::unique_ptr<CLocationSource> m_source;
    static constexpr int RefreshDelay = 60; // milliseconds: shorter than a blink, longer than a burst of changes
    QTimer m_refresh;                       // one fetch for changes that follow one another
    bool m_stale = true;
};
