#include "editors/cross_sections/view.h"

#include "ks/fc/shown_text.h"

#include <QHeaderView>
#include <QLabel>

CCrossSectionView::CCrossSectionView(QWidget* parent) : CTablesView(parent)
{
    setObjectName(QStringLiteral("crossSectionView"));
}

void CCrossSectionView::OnInitialUpdate()
{
    m_plot = new CSectionPlot;
    MakeContent(*m_plot, 700, 500, "sectionTable", "pointTable");
    AddSectionColumns(*Sections()->Model());
    AddPointColumns(*Points()->Model());
    Sections()->Model()->SetSource(*Document(), MakeSectionRows(*Document()));
    setFocusProxy(Sections());
    connect(m_plot, &CSectionPlot::PointPicked, this, [this](int point) { Points()->GotoLine(point + 1); });
    connect(m_plot, &CSectionPlot::SectionStep, this, [this](int step) { GoToSection(CurrentSection() + step); });
    m_showing = true; // the user has not asked for the first one
    CTablesView::OnInitialUpdate();
    m_showing = false;
}

void CCrossSectionView::CellCurrent(CGenGrid& grid)
{
    if (&grid == Points())
        m_plot->SetCurrentPoint(Points()->CurrentRow() - 1);
    CTablesView::CellCurrent(grid);
}

void CCrossSectionView::LineEdited(CGenGrid& grid)
{
    CTablesView::LineEdited(grid);
    if (&grid == Sections())
        TellLocation(); // it may be at another place now
}

void CCrossSectionView::LineCurrent(CGenGrid& grid)
{
    CTablesView::LineCurrent(grid);
    if (&grid == Sections())
        TellLocation();
}

void CCrossSectionView::ShowParts()
{
    CTablesView::ShowParts();
    m_plot->SetCurrentPoint(Points()->CurrentRow() - 1);
}

QString CCrossSectionView::PartTitle() const
{
    const QString title = KsWithoutMnemonics(m_plot->Title());
    return title.isEmpty() ? tr("&Points") : tr("&Points of %1").arg(title);
}

void CCrossSectionView::GoToSection(int section)
{
    if (Document()->Section(section))
        Sections()->ShowLine(section + 1, Sections()->CurrentColumn());
}

void CCrossSectionView::Retranslate()
{
    MainTitle().setText(tr("&Cross sections"));
    Sections()->setAccessibleName(tr("Cross sections by branch and chainage"));
    Points()->setAccessibleName(tr("Points of the current cross section"));
}
