#include "editors/network/view.h"

#include "editors/common/quantity.h"

#include <QLabel>
#include <QSplitter>
#include <QVBoxLayout>
#include <algorithm>

CNetworkView::CNetworkView(QWidget* parent) : CProjectView(parent)
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
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(splitter);
    setFocusProxy(m_map);
    Retranslate();

    connect(m_map, &CNetworkMap::PickedChanged, this, &CNetworkView::PickedChanged);
    connect(m_map, &CNetworkMap::DeleteRequested, this, &CNetworkView::DeleteLocation);
    connect(m_map, &CNetworkMap::MenuRequested, this, [this](const QPoint& at) {
        if (const auto menu = MapMenu(); !menu->isEmpty())
            menu->exec(at);
    });
    connect(&KsUnits::Instance(), &KsUnits::Changed, this, &CNetworkView::UnitsChanged);
    CProjectView::OnInitialUpdate();
    m_source = std::make_unique<CLocationSource>(*Document(), *this);
    LocationsChanged();
}

// ---- tables ------------------------------------------------------------------------------------

void CNetworkView::MakeTables(QSplitter* splitter)
{
    auto* side = new QSplitter(Qt::Vertical);
    m_branchTable = new CBranchTable(*Document(), this);
    m_channelTable = new CChannelTable(*Document(), this);
    m_branches = MakeTable(m_branchTable, "branchTable");
    m_channel = MakeTable(m_channelTable, "channelTable");
    m_branchTitle = new QLabel;
    m_channelTitle = new QLabel;
    m_channelTitle->setWordWrap(true);
    for (const auto& [title, table] : {std::pair(m_branchTitle, m_branches), std::pair(m_channelTitle, m_channel)}) {
        auto* pane = new QWidget;
        auto* layout = new QVBoxLayout(pane);
        layout->setContentsMargins(6, 6, 6, 6);
        layout->addWidget(title);
        layout->addWidget(table);
        title->setBuddy(table);
        side->addWidget(pane);
    }
    splitter->addWidget(side);
    connect(m_branches->selectionModel(), &QItemSelectionModel::currentRowChanged, this,
            &CNetworkView::CurrentBranchChanged);
    connect(Document(), &CNetworkDoc::NetworkChanged, this, &CNetworkView::NetworkChanged);
    if (m_branchTable->rowCount() > 0)
        m_branches->GoTo(0, CBranchTable::Name);
    CurrentBranchChanged();
}

CLinesView* CNetworkView::MakeTable(CNetworkTable* model, const char* name)
{
    auto* table = new CLinesView(model, QString::fromLatin1(name));
    for (const auto& [key, run] : {std::pair(Qt::Key_Delete, &CNetworkView::DeleteLines),
                                   std::pair(Qt::Key_Insert, &CNetworkView::InsertLine)}) {
        auto* action = new QAction(table);
        action->setShortcut(key);
        action->setShortcutContext(Qt::WidgetShortcut);
        connect(action, &QAction::triggered, this, run);
        table->addAction(action);
    }
    // It waits until the cell's editor has closed: that would commit once more to where its line stood before.
    connect(model, &CNetworkTable::LineMoved, table, &CLinesView::GoTo, Qt::QueuedConnection);
    return table;
}

/// A table that was filled anew has no current line: it goes on with the one that stands there now.
void CNetworkView::NetworkChanged()
{
    const int lines = m_branchTable->rowCount();
    if (!m_branches->currentIndex().isValid() && lines > 0)
        m_branches->GoTo(std::clamp(m_channelTable->Branch(), 0, lines - 1), CBranchTable::Name);
    CurrentBranchChanged();
}

void CNetworkView::CurrentBranchChanged()
{
    const int branch = m_branches->currentIndex().row();
    m_channelTable->SetBranch(branch);
    m_map->SetCurrentBranch(branch);
    const auto& branches = Document()->Network().branches;
    const bool some = branch >= 0 && std::size_t(branch) < branches.size();
    m_channelTitle->setText(
        some ? tr("Cha&nnel of %1").arg(QString(branches[std::size_t(branch)].name).replace(u'&', QStringLiteral("&&")))
             : tr("Cha&nnel"));
}

CLinesView* CNetworkView::FocusTable() const
{
    for (CLinesView* table : {m_branches, m_channel}) {
        const QWidget* focus = QApplication::focusWidget();
        if (table && (table == focus || table->isAncestorOf(focus)))
            return table;
    }
    return nullptr;
}

void CNetworkView::InsertLine()
{
    const int row = m_channelTable->InsertLine(m_channel->currentIndex().row());
    if (row < 0)
        return;
    m_channel->GoTo(row, CChannelTable::Chainage);
    m_channel->setFocus();
}

void CNetworkView::DeleteLines()
{
    const CLinesView* table = FocusTable();
    if (!table)
        return;
    std::vector<int> rows;
    const auto selected = table->selectionModel()->selectedRows();
    for (const QModelIndex& index : selected)
        rows.push_back(index.row());
    static_cast<CNetworkTable*>(table->model())->RemoveLines(rows);
}

void CNetworkView::UnitsChanged()
{
    m_branchTable->Reload();
    m_channelTable->Reload();
    m_branches->FitColumns();
    m_channel->FitColumns();
}

void CNetworkView::Retranslate()
{
    m_branchTitle->setText(tr("&Branches"));
    m_branches->setAccessibleName(tr("Branches of the river network"));
    m_channel->setAccessibleName(tr("Radius and width along the current branch"));
    CurrentBranchChanged();
    m_branchTable->Reload();
    m_channelTable->Reload();
    m_branches->FitColumns();
    m_channel->FitColumns();
}

void CNetworkView::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange && m_map)
        Retranslate();
    CProjectView::changeEvent(event);
}

/// Hint 1 of the shell: what is being typed moves into the document.
void CNetworkView::OnUpdate(CView*, int hint, CHint*)
{
    if (hint == CKsDoc::StoreHint)
        MayLeave(KsLeave::Field);
}

bool CNetworkView::MayLeave(KsLeave)
{
    return !m_map || (m_branches->Store() && m_channel->Store());
}
