#include "editors/cross_sections/view.h"

#include "ks/fc/shown_text.h"

#include <QHeaderView>
#include <QLabel>
#include <QSplitter>
#include <algorithm>
#include <utility>

CCrossSectionView::CCrossSectionView(QWidget* parent) : CTablesView(parent)
{
    setObjectName(QStringLiteral("crossSectionView"));
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
    SetContent(splitter);
    setFocusProxy(m_sections);
    connect(m_plot, &CSectionPlot::PointPicked, this, [this](int point) { m_points->GotoLine(point + 1); });
    connect(m_plot, &CSectionPlot::SectionStep, this, [this](int step) { GoToSection(CurrentSection() + step); });
    m_showing = true; // the user has not asked for the first one
    CTablesView::OnInitialUpdate();
    m_showing = false;
}

void CCrossSectionView::MakeTables(QSplitter* splitter)
{
    auto* side = new QSplitter(Qt::Vertical);
    m_sections = AddTable(*side, m_sectionTitle, "sectionTable");
    m_points = AddTable(*side, m_pointTitle, "pointTable");
    AddSectionColumns(*m_sections->Model());
    AddPointColumns(*m_points->Model());
    m_points->horizontalHeader()->setSectionResizeMode(QHeaderView::Stretch);
    m_sections->Model()->SetSource(*Document(), MakeSectionRows(*Document()));
    splitter->addWidget(side);
}

int CCrossSectionView::CurrentSection() const
{
    return m_sections ? std::min(m_sections->CurrentRow(), int(Document()->Sections().sections.size())) - 1 : -1;
}

void CCrossSectionView::CellCurrent(CGenGrid& grid)
{
    if (&grid == m_points)
        m_plot->SetCurrentPoint(m_points->CurrentRow() - 1);
    CTablesView::CellCurrent(grid);
}

void CCrossSectionView::LineCurrent(CGenGrid& grid)
{
    if (&grid != m_sections)
        return;
    ShowSection();
    TellLocation();
}

void CCrossSectionView::ShowDocument()
{
    m_sections->Reload();
    ShowSection();
}

void CCrossSectionView::ShowSection()
{
    const int section = CurrentSection();
    if (std::exchange(m_pointsOf, section) != section)
        m_points->Model()->SetSource(*Document(), MakePointRows(*Document(), section));
    m_points->setEnabled(section >= 0);
    m_plot->Show(Document()->Section(section));
    m_points->Refresh();
    m_plot->SetCurrentPoint(m_points->CurrentRow() - 1);
    const QString title = KsWithoutMnemonics(m_plot->Title());
    m_pointTitle->setText(title.isEmpty() ? tr("&Points") : tr("&Points of %1").arg(title));
}

void CCrossSectionView::GoToSection(int section)
{
    if (Document()->Section(section))
        m_sections->SetCurrentCell(section + 1, m_sections->CurrentColumn());
}

/// A point is shown once its section is current. The view that the user does not work in stays where it is.
void CCrossSectionView::RevealChange(const ChangePlace& place)
{
    const void* sections = &Document()->Sections().sections;
    const bool isPoint = place.list == sections;
    if ((!isPoint && place.data != sections) || IsEditing() ||
        (!IsActive() && Document()->Views().size() > 1))
        return;
    const int column = std::max(place.column, 1);
    m_sections->SetCurrentCell(isPoint ? place.listRow : place.row, isPoint ? m_sections->CurrentColumn() : column);
    if (isPoint)
        m_points->SetCurrentCell(place.row, column);
    if (IsActive())
        (isPoint ? m_points : m_sections)->setFocus(Qt::OtherFocusReason);
}

void CCrossSectionView::Retranslate()
{
    m_sectionTitle->setText(tr("&Cross sections"));
    m_sections->setAccessibleName(tr("Cross sections by branch and chainage"));
    m_points->setAccessibleName(tr("Points of the current cross section"));
}
