#include "editors/network/view.h"

#include "ks/fc/shown_text.h"

#include <QLabel>

CNetworkView::CNetworkView(QWidget* parent) : CTablesView(parent)
{
    setObjectName(QStringLiteral("networkView"));
    m_refresh.setSingleShot(true);
    m_refresh.setInterval(RefreshDelay);
    connect(&m_refresh, &QTimer::timeout, this, &CNetworkView::RefreshLocations);
}

CNetworkView::~CNetworkView()
{
    delete m_map; // while the document is still there
}

void CNetworkView::OnInitialUpdate()
{
    m_map = new CNetworkMap(*Document());
    MakeContent(*m_map, 860, 420, "branchTable", "channelTable");
    AddBranchColumns(*Branches()->Model());
    AddChannelColumns(*Channel()->Model());
    Branches()->Model()->SetSource(*Document(), MakeBranchRows(*Document()));
    setFocusProxy(m_map);

    connect(&m_map->Marks(), &CMapSelection::PickedChanged, this, &CNetworkView::PickedChanged);
    connect(m_map, &CNetworkMap::DeleteRequested, this, &CNetworkView::DeleteLocation);
    connect(m_map, &CNetworkMap::MenuRequested, this, [this](const QPoint& at) {
        if (const auto menu = MapMenu(); !menu->isEmpty())
            menu->exec(at);
    });
    CTablesView::OnInitialUpdate();
    LocationsChanged();
}

QString CNetworkView::PartTitle() const
{
    const int branch = CurrentLine();
    if (branch < 0)
        return tr("Cha&nnel");
    const QString name = Document()->Network().branches[std::size_t(branch)].Name();
    return tr("Cha&nnel of %1").arg(KsWithoutMnemonics(KsVisibleText(name)));
}

void CNetworkView::InsertLine()
{
    Channel()->InsertLine();
    Channel()->setFocus();
}

void CNetworkView::Retranslate()
{
    MainTitle().setText(tr("&Branches"));
    Branches()->setAccessibleName(tr("Branches of the river network"));
    Channel()->setAccessibleName(tr("Radius and width along the current branch"));
}
