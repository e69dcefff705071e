// The view and the problems of its document: where they are, what mends them, and where they are marked.
#include "module/view.h"

#include "grid/cell_commands.h"
#include "grid/gen_grid.h"
#include "ks/fc/exchange.h"
#include "ks/fc/file_bar.h"
#include "ks/fc/findings_dialog.h"
#include "module/problem_places.h"
#include "module/sheet.h"
#include "pages/framework/page.h"
#include "problems/problem_check.h"
#include "problems/problem_texts.h"
#include "problems/problems_dock.h"
#include "problems/problems_model.h"
#include "problems/problems_panel.h"

#include <QUndoStack>
#include <algorithm>
#include <array>
#include <map>

namespace {

void SwapEnds(CGenGrid& grid, int row, const Field* endField)
{
    const int start = ColumnOf(grid, {.field = &LocationFields()[1]}) - 1,
              end = ColumnOf(grid, {.field = endField}) - 1;
    if (start < 0 || end < 0)
        return;
    const CGridModel& model = *grid.Model();
    CCellResults results(model, {row, std::min(start, end), row, std::max(start, end)});
    const CellValue first = model.Value(row, start), last = model.Value(row, end);
    results.Add(row, start, first, last);
    results.Add(row, end, last, first);
    const QString step = ProblemTexts::tr("Exchange of start and end");
    MakeResults(grid, std::move(results), step, step, ProblemTexts::tr("Start and end exchanged: %1 cells"));
}

} // namespace

/// Once all pages are there, which say where a problem is.
void CKavo0_hdView::WatchProblems()
{
    m_problems = std::make_unique<CProblemCheck>(*this);
    connect(m_problems.get(), &CProblemCheck::Changed, this, &CKavo0_hdView::MarkProblems);
    connect(&GetDocument()->UndoStack(), &QUndoStack::indexChanged, m_problems.get(), &CProblemCheck::Restart);
    connect(GetDocument(), &CKavo0_hdDoc::FileStateChanged, m_problems.get(), &CProblemCheck::Restart);
    connect(GetDocument(), &CKsDoc::PathNameChanged, m_problems.get(), &CProblemCheck::Restart);
    if (CKsMDIFrameWnd* const frame = MainFrame())
        CProblemsModel::In(*frame).Add(*m_problems);
    m_problems->Restart();
}

void CKavo0_hdView::ShowProblems()
{
    CKsMDIFrameWnd* const frame = MainFrame();
    if (frame && CKsDock::IsWanted(CProblemsDock::Name))
        KsDockIn<CProblemsDock>(*frame).show();
}

void CKavo0_hdView::ToggleProblems()
{
    CKsMDIFrameWnd* const frame = MainFrame();
    if (!frame)
        return;
    auto& dock = KsDockIn<CProblemsDock>(*frame);
    dock.Toggle();
    if (dock.isVisible())
        dock.Panel().TakeFocus();
}

void CKavo0_hdView::NextProblem(bool forward)
{
    CKsMDIFrameWnd* const frame = MainFrame();
    if (!frame)
        return;
    auto& dock = KsDockIn<CProblemsDock>(*frame);
    if (!dock.IsInSight())
        dock.Want(true);
    dock.Panel().Step(forward);
}

/// At the lines and on the tabs.
void CKavo0_hdView::MarkProblems()
{
    CProblemPlaces places(*m_sheet, *GetDocument());
    std::map<CGenGrid*, LineNotes> lines;
    std::map<int, std::array<int, 3>> tabs; // how many there are by severity
    for (const Problem& problem : m_problems->Found()) {
        const int tab = places.TabOf(problem.place);
        const Severity severity = RuleOf(problem.rule).severity;
        if (tab >= 0)
            ++tabs[tab][std::size_t(severity)];
        CGenGrid* const grid = problem.place.line == ProblemPlace::None ? nullptr : places.TableOf(problem.place);
        if (!grid)
            continue;
        const std::size_t row = problem.place.line + grid->Model()->Rows()->FixedRows();
        lines[grid][row].Add(int(severity), ProblemTexts::IconOf(severity), ProblemTexts::TextOf(problem));
    }
    for (int tab = 0; tab < m_sheet->PageCount(); ++tab) {
        if (CGenGrid* grid = m_sheet->PageAt(tab)->GetGrid())
            grid->Model()->SetNotes(std::move(lines[grid]));
        QStringList counts;
        QIcon icon;
        for (const Severity severity : {Severity::Note, Severity::Warning, Severity::Error})
            if (const int count = tabs.contains(tab) ? tabs[tab][std::size_t(severity)] : 0) {
                icon = ProblemTexts::IconOf(severity);
                counts.prepend(ProblemTexts::CountOf(severity, std::size_t(count)));
            }
        m_sheet->SetNote(tab, icon, counts.join(QStringLiteral(", ")));
    }
}

/// The document's window; false when whoever is being edited in another keeps that in front.
bool CKavo0_hdView::BringToFront()
{
    if (auto* window = CKsMDIChildWnd::Of(this))
        window->BringToFront();
    return IsActive();
}

const HD_Parameters& CKavo0_hdView::CheckedParameters() const
{
    return GetDocument()->Parameters();
}

QString CKavo0_hdView::CheckedTitle() const
{
    return GetDocument()->GetTitle();
}

QString CKavo0_hdView::CheckedPath() const
{
    return GetDocument()->GetPathName();
}

std::shared_ptr<const CRiver> CKavo0_hdView::CheckedRiver()
{
    CObList items;
    GetDocument()->AskProject(KsRequest::Branches, this, &items);
    if (items.empty())
        return nullptr;
    auto river = std::make_shared<CRiver>();
    for (const auto& item : items)
        if (const auto* branch = dynamic_cast<const CKvrCBEBranch*>(item.get()))
            river->Add({branch->name.toStdString(), std::min(branch->start, branch->end),
                        std::max(branch->start, branch->end), branch->downstream});
    return river;
}

std::vector<ProblemWhere> CKavo0_hdView::WhereAre(const std::vector<Problem>& problems) const
{
    CProblemPlaces places(*m_sheet, *GetDocument());
    std::vector<ProblemWhere> all;
    for (const Problem& problem : problems)
        all.push_back(places.WhereIs(problem.place));
    return all;
}

void CKavo0_hdView::ShowProblem(const ProblemPlace& place)
{
    const ChangePlace shown = CProblemPlaces(*m_sheet, *GetDocument()).On(place);
    if (!shown.data || !BringToFront() || !MayLeave(KsLeave::Field))
        return;
    RevealChange(shown);
}

std::vector<FileProblem> CKavo0_hdView::FileProblems() const
{
    std::vector<FileProblem> problems;
    for (const Finding& finding : GetDocument()->File().Findings())
        problems.push_back(
            {RuleOf(finding.kind).id,
             KsFindingSentence(finding),
             {.page = QString::fromStdString(finding.section),
              .line = ProblemTexts::tr("%1 of the file").arg(finding.line),
              .field = QString::fromStdString(finding.field.empty() ? finding.keyword : finding.field)}});
    return problems;
}

void CKavo0_hdView::ShowFileProblems()
{
    if (BringToFront())
        if (auto* bar = findChild<CKsFileBar*>())
            bar->ShowList();
}

void CKavo0_hdView::Mend(const Problem& problem)
{
    if (!m_problems->IsCurrent()) // the line may be another one by now
        return;
    CGenGrid* const grid = CProblemPlaces(*m_sheet, *GetDocument()).TableOf(problem.place);
    ShowProblem(problem.place);
    if (!grid || !MayLeave(KsLeave::Field) || !grid->MayChange())
        return;
    CGridModel& model = *grid->Model();
    const std::size_t line = problem.place.line + model.Rows()->FixedRows();
    if (model.ShownRow(line) < 0)
        model.Unhide(line);
    const int row = model.ShownRow(line);
    if (row < 0)
        return;
    if (RemedyOf(problem.rule) == Remedy::SwapEnds)
        return SwapEnds(*grid, row, problem.place.field);
    model.RemoveRows(row, 1);
    if (grid->Host())
        grid->Host()->LineEdited(*grid);
    grid->Reload();
}
