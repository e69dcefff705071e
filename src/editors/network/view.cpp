#include "editors/network/view.h"

#include "ks/fc/shown_text.h"

#include <QLabel>
#include <QSplitter>
#include <algorithm>
#include <utility>

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
    auto* splitter = new QSplitter(Qt::Horizontal, this);
    splitter->addWidget(m_map);
    MakeTables(splitter);
    splitter->setStretchFactor(0, 2);
    splitter->setStretchFactor(1, 1);
    splitter->setCollapsible(0, false);
    splitter->setSizes({860, 420}); // in proportion
    SetContent(splitter);
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

// ---- tables ------------------------------------------------------------------------------------

void CNetworkView::MakeTables(QSplitter* splitter)
{
    auto* side = new QSplitter(Qt::Vertical);
    m_branches = AddTable(*side, m_branchTitle, "branchTable");
    m_channel = AddTable(*side, m_channelTitle, "channelTable");
    AddBranchColumns(*m_branches->Model());
    AddChannelColumns(*m_channel->Model());
    m_branches->Model()->SetSource(*Document(), MakeBranchRows(*Document()));
    splitter->addWidget(side);
}

int CNetworkView::CurrentBranch() const
{
    return std::min(m_branches->CurrentRow(), int(Document()->Network().branches.size())) - 1;
}

void CNetworkView::LineCurrent(CGenGrid& grid)
{
    if (&grid == m_branches)
        ShowChannel();
}

void CNetworkView::ShowDocument()
{
    m_branches->Reload();
    ShowChannel();
}

void CNetworkView::ShowChannel()
{
    const int branch = CurrentBranch();
    if (std::exchange(m_channelOf, branch) != branch)
        m_channel->Model()->SetSource(*Document(), MakeChannelRows(*Document(), branch));
    m_channel->setEnabled(branch >= 0);
    m_channel->Refresh();
    m_map->SetCurrentBranch(branch);
    const QString name = branch >= 0 ? Document()->Network().branches[std::size_t(branch)].Name() : QString();
    m_channelTitle->setText(branch >= 0 ? tr("Cha&nnel of %1").arg(KsWithoutMnemonics(name)) : tr("Cha&nnel"));
}

/// A line of a channel is shown once its branch is current.
void CNetworkView::RevealChange(const ChangePlace& place)
{
    const bool isChannel = place.list == &Document()->Network().branches;
    if (IsEditing() || (!isChannel && place.data != &Document()->Network().branches))
        return;
    const int column = std::max(place.column, 1);
    m_branches->SetCurrentCell(isChannel ? place.listRow : place.row, isChannel ? m_branches->CurrentColumn() : column);
    if (isChannel)
        m_channel->SetCurrentCell(place.row, column);
    if (IsActive())
        (isChannel ? m_channel : m_branches)->setFocus(Qt::OtherFocusReason);
}

void CNetworkView::InsertLine()
{
    m_channel->InsertLine();
    m_channel->setFocus();
}

void CNetworkView::Retranslate()
{
    m_branchTitle->setText(tr("&Branches"));
    m_branches->setAccessibleName(tr("Branches of the river network"));
    m_channel->setAccessibleName(tr("Radius and width along the current branch"));
}
