// The view of a network document: the map, the tables beside it, and what other editors ask.
#pragma once

#include "editors/common/tables_view.h"
#include "editors/network/document.h"
#include "editors/network/network_map.h"
#include "editors/network/network_tables.h"

#include <QTimer>

class QMenu;

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
    CGenGrid* Branches() const { return MainTable(); }
    CGenGrid* Channel() const { return PartTable(); }
    /// The menu for what is picked or selected on the map.
    std::unique_ptr<QMenu> MapMenu();
    /// Reads a GIS file, asks what to take of it and how, appends its lines as branches and tells what it did.
    void Import(const QString& path);

    void OnInitialUpdate() override;
    bool OnCommand(int id) override;
    bool IsCommandEnabled(int id) const override;
    std::vector<CKsMenuCommand> LinesMenu() const override;

protected:
    void Retranslate() override;
    void InsertLine() override;
    std::shared_ptr<IRowSource> MakePartRows(int branch) override { return MakeChannelRows(*Document(), branch); }
    void ShowInPicture(int branch) override { m_map->SetCurrentBranch(branch); }
    QString PartTitle() const override;
    Answer AnswerTo(WPARAM request) override;
    QStringList KnownBranches() const override;
    void ShowLocation(const CKvrCBELocation& location) override;
    void OthersChanged() override { LocationsChanged(); }
    void OnProjectsChanged() override;
    void showEvent(QShowEvent* event) override;

private:
    void PickedChanged();
    void LocationsChanged();
    void RefreshLocations();
    void Send(WPARAM request, CMapLocation location);
    void DeleteLocation();
    void AskForImport();

    // What other editors ask; each answers whether there was something.
    LRESULT FetchLocation(CObList& objects);
    LRESULT TellBranches(CObList& objects) const;
    LRESULT FillChannel(CObList& objects);

    CNetworkMap* m_map = nullptr;
    static constexpr int RefreshDelay = 60; // milliseconds: shorter than a blink, longer than a burst of changes
    QTimer m_refresh;                       // one fetch for changes that follow one another
    bool m_stale = true;
};
