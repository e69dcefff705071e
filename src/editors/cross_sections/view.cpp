#include "editors/cross_sections/view.h"

#include <QAction>
#include <QApplication>
#include <QHeaderView>
#include <QLabel>
#include <QSplitter>
#include <QVBoxLayout>

CCrossSectionView::CCrossSectionView(QWidget* parent) : CProjectView(parent)
{
    setObjectName(QStringLiteral("crossSectionView"));
}

CCrossSectionView::~CCrossSectionView()
{
    disconnect(qApp, nullptr, this, nullptr); // the tables lose the focus when this is no such view any more
}

void CCrossSectionView::OnInitialUpdate()
{
    m_plot = new CSectionPlot;
    auto* splitter = new QSplitter(Qt::Horizontal, this);
    splitter->addWidget(m_plot);
    MakeTables(splitter);
    splitter->setStretchFactor(0, 7); // in proportion, whatever the window's size
    splitter->setStretchFactor(1, 5);
    splitter->setCollapsible(0, false);
    splitter->setSizes({700, 500});
    auto* layout = new QVBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(splitter);
    setFocusProxy(m_sections);
    ConnectTables();
    CProjectView::OnInitialUpdate();

    m_showing = true; // the user has not asked for the first one
    if (m_sectionTable->rowCount() > 0)
        m_sections->GoTo(0, CSectionTable::Branch);
    m_showing = false;
    Retranslate();
}

// ---- tables ------------------------------------------------------------------------------------

void CCrossSectionView::MakeTables(QSplitter* splitter)
{
    auto* side = new QSplitter(Qt::Vertical);
    m_sectionTable = new CSectionTable(*Document(), this);
    m_pointTable = new CPointTable(*Document(), this);
    m_sections = MakeTable(m_sectionTable, "sectionTable");
    m_points = MakeTable(m_pointTable, "pointTable");
    m_points->horizontalHeader()->setSectionResizeMode(QHeaderView::Stretch);
    m_lines = m_sections;
    m_sectionTitle = new QLabel;
    m_pointTitle = new QLabel;
    m_pointTitle->setWordWrap(true);
    for (const auto& [title, table] : {std::pair(m_sectionTitle, m_sections), std::pair(m_pointTitle, m_points)}) {
        auto* pane = new QWidget;
        auto* layout = new QVBoxLayout(pane);
        layout->setContentsMargins(6, 6, 6, 6);
        layout->addWidget(title);
        layout->addWidget(table);
        title->setBuddy(table);
        side->addWidget(pane);
    }
    splitter->addWidget(side);
}

CLinesView* CCrossSectionView::MakeTable(CSectionLines* model, const char* name)
{
    auto* table = new CLinesView(model, QString::fromLatin1(name));
    table->setContextMenuPolicy(Qt::CustomContextMenu);
    for (const auto& [key, run] : {std::pair(QKeySequence(Qt::Key_Delete), &CCrossSectionView::DeleteLines),
                                   std::pair(QKeySequence(Qt::Key_Insert), &CCrossSectionView::InsertLine),
                                   std::pair(QKeySequence(QKeySequence::Copy), &CCrossSectionView::CopyLines),
                                   std::pair(QKeySequence(QKeySequence::Paste), &CCrossSectionView::PasteLines)}) {
        auto* action = new QAction(table);
        action->setShortcut(key);
        action->setShortcutContext(Qt::WidgetShortcut);
        connect(action, &QAction::triggered, this, run);
        table->addAction(action);
    }
    connect(table, &QWidget::customContextMenuRequested, this,
            [this, table](const QPoint& at) { ShowContextMenu(table, at); });
    return table;
}

void CCrossSectionView::ConnectTables()
{
    connect(m_sections->selectionModel(), &QItemSelectionModel::currentRowChanged, this,
            &CCrossSectionView::CurrentSectionChanged);
    connect(m_points->selectionModel(), &QItemSelectionModel::currentRowChanged, this,
            [this](const QModelIndex& now) { m_plot->SetCurrentPoint(now.row()); });
    for (const CLinesView* table : {m_sections, m_points})
        connect(table->selectionModel(), &QItemSelectionModel::selectionChanged, this,
                &CCrossSectionView::CommandsChanged);
    connect(Document(), &CCrossSectionDoc::SectionsChanged, this, &CCrossSectionView::SectionsChanged);
    connect(m_plot, &CSectionPlot::PointPicked, this, [this](int point) { GoToRow(m_points, point); });
    connect(m_plot, &CSectionPlot::SectionStep, this, &CCrossSectionView::StepSection);
    connect(&KsUnits::Instance(), &KsUnits::Changed, this, &CCrossSectionView::UnitsChanged);
    connect(qApp, &QApplication::focusChanged, this, [this](QWidget*, QWidget* now) {
        for (CLinesView* table : {m_sections, m_points}) {
            if (now && (table == now || table->isAncestorOf(now)))
                m_lines = table;
        }
    });
}

/// Tool bars show what can be done with what is selected.
void CCrossSectionView::CommandsChanged()
{
    if (auto* frame = qobject_cast<CKsMDIFrameWnd*>(window()))
        emit frame->CommandStateChanged();
}

int CCrossSectionView::CurrentSection() const
{
    return m_sections ? m_sections->currentIndex().row() : -1;
}

bool CCrossSectionView::HasFocusWithin() const
{
    const QWidget* focus = QApplication::focusWidget();
    return focus && isAncestorOf(focus);
}

void CCrossSectionView::GoToRow(CLinesView* table, int row)
{
    table->GoTo(row, std::max(table->currentIndex().column(), 0));
}

/// The tables follow the document. The view that the user works in goes to what changed, so that undo shows its work.
void CCrossSectionView::SectionsChanged(int index)
{
    const int row = CurrentSection(), point = m_points->currentIndex().row();
    m_sectionTable->Reload();
    const bool here = HasFocusWithin() || Document()->Views().size() == 1;
    const int go = std::min(here ? index : row, m_sectionTable->rowCount() - 1);
    if (go >= 0 && go != CurrentSection())
        GoToRow(m_sections, go);
    ShowSection();
    if (go == row && point >= 0 && m_pointTable->rowCount() > 0)
        GoToRow(m_points, std::min(point, m_pointTable->rowCount() - 1));
    CommandsChanged(); // a table that was filled anew has no selection, and does not say so
}

void CCrossSectionView::CurrentSectionChanged()
{
    m_points->GoTo(-1, -1);
    ShowSection();
    TellLocation();
}

void CCrossSectionView::ShowSection()
{
    m_pointTable->SetSection(CurrentSection());
    m_plot->Show(Document()->Section(CurrentSection()));
    m_plot->SetCurrentPoint(m_points->currentIndex().row());
    const QString title = m_plot->Title().replace(u'&', QStringLiteral("&&"));
    m_pointTitle->setText(title.isEmpty() ? tr("&Points") : tr("&Points of %1").arg(title));
}

void CCrossSectionView::UnitsChanged()
{
    m_sectionTable->Reload();
    ShowSection();
    m_sections->FitColumns();
}

void CCrossSectionView::Retranslate()
{
    m_sectionTitle->setText(tr("&Cross sections"));
    m_sections->setAccessibleName(tr("Cross sections by branch and chainage"));
    m_points->setAccessibleName(tr("Points of the current cross section"));
    UnitsChanged();
}

void CCrossSectionView::changeEvent(QEvent* event)
{
    if (event->type() == QEvent::LanguageChange && m_plot)
        Retranslate();
    CProjectView::changeEvent(event);
}

/// Hint 1 of the shell: what is being typed moves into the document.
void CCrossSectionView::OnUpdate(CView*, int hint, CHint*)
{
    if (hint == CKsDoc::StoreHint)
        MayLeave(KsLeave::Field);
}

bool CCrossSectionView::MayLeave(KsLeave)
{
    return !m_plot || (m_sections->Store() && m_points->Store());
}
