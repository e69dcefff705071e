#include "problems/problems_dock.h"

#include "ks/fc/frames.h"
#include "problems/problem_texts.h"
#include "problems/problems_model.h"
#include "problems/problems_panel.h"

namespace {
constexpr int FirstHeight = 220;
} // namespace

CProblemsDock::CProblemsDock(CKsMDIFrameWnd& frame)
    : CKsDock(frame, Name, new CProblemsPanel(CProblemsModel::In(frame), nullptr), FirstHeight),
      m_panel(static_cast<CProblemsPanel*>(widget()))
{
    connect(m_panel, &CProblemsPanel::SummaryChanged, this, &CProblemsDock::Retranslate);
    Retranslate();
}

void CProblemsDock::Retranslate()
{
    const QString title = ProblemTexts::tr("Problems"), summary = m_panel->Summary();
    setWindowTitle(summary.isEmpty() ? title : QStringLiteral("%1 - %2").arg(title, summary));
}
