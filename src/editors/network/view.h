// The view of a network document: the map, the tables beside it, and what other editors ask.
#pragma once

#include "editors/common/tables_view.h"
#include "editors/network/document.h"
#include "editors/network/network_map.h"
#include "editors/network/network_tables.h"

#include <QTimer>

class QLabel;
class QMenu;
class QSplitter;

/// Commands of the "Lines" menu and of the tool bar.
namespace NetworkCommand {
inline constexpr int Import = 43000, FitAll = 43003, ZoomIn = 43004, ZoomOut = 43005;
} // namespace NetworkCommand

class CNetworkView : public CTablesView
{
    Q_OBJECT
public:
    explicit CNetworkView(QWidget* parent = nullptr);
    ~CNetworkView() override;

    CNetworkDoc* Document() const { return static_cast<CNetworkDoc*>(GetDocument()); }
    CNetworkMap* Map() const { return m_map; }
    CGenGrid* Branches() const { return m_branches; }
    CGenGrid* Channel() const { return m_channel; }
    /// The menu for what is picked or selected on the map.
    std::unique_ptr<QMenu> MapMenu();
    /// Reads a GIS file, asks what to take of it and how, appends its lines as branches and tells what it did.
    void Import(const QString& path);

    void OnInitialUpdate() override;
    bool OnCommand(int id) override;
    bool IsCommandEnabled(int id) const override;
    std::vector<CKsMenuCommand> LinesMenu() const override;
    void LineCurrent(CGenGrid& grid) override;

protected:
    void ShowDocument() override;
    void Retranslate() override;
    void InsertLine() override;
    const CGenGrid* SearchedTable() const override { return m_branches; }
    void RevealChange(const ChangePlace& place) override;
    LRESULT OnRequest(WPARAM request, CKSComm_Package& package) override;
    void OnProjectsChanged() override;
    void showEvent(QShowEvent* event) override;

private:
    void MakeTables(QSplitter* splitter);
    int CurrentBranch() const; // -1 for none
    void ShowChannel();
    void PickedChanged();
    void LocationsChanged();
    void RefreshLocations();
    void Send(WPARAM request, CMapLocation location);
    void DeleteLocation();
    void AskForImport();

    // What other editors ask; each answers whether there was something.
    LRESULT FetchLocation(CObList& objects);
    LRESULT ListBranches(CObList& objects);
    LRESULT FillChannel(CObList& objects);
    LRESULT ShowLocation(CObList& objects);

    CNetworkMap* m_map = nullptr;
    CGenGrid *m_branches = nullptr, *m_channel = nullptr;
    int m_channelOf = -1; // the branch whose channel is shown
    QLabel *m_branchTitle = nullptr, *m_channelTitle = nullptr;
    static constexpr int RefreshDelay = 60; // milliseconds: shorter than a blink, longer than a burst of changes
    QTimer m_refresh;                       // one fetch for changes that follow one another
    bool m_stale = true;
};
