#include "problems/problem_check.h"

#include "ks/language/language.h"
#include "ks/units/edit_style.h"
#include "rules/hd_check.h"

#include <QElapsedTimer>
#include <new>

namespace {
constexpr int Pause = 250;          // ms without a change before a check begins
constexpr int Slice = 4;            // ms at a time: a quarter of a frame, so that no key is held up
constexpr std::size_t Lines = 1000; // between two looks at the clock
} // namespace

CProblemCheck::CProblemCheck(IProblemHost& host, QObject* parent)
    : QObject(parent), m_host(host), m_counts(HDRules().size())
{
    m_pause.setSingleShot(true);
    m_pause.setInterval(Pause);
    connect(&m_pause, &QTimer::timeout, this, &CProblemCheck::Begin);
    // The words of what was found are others.
    connect(&KsUnits::Instance(), &KsUnits::Changed, this, &CProblemCheck::Changed);
    connect(&KsLanguage::Instance(), &KsLanguage::Changed, this, &CProblemCheck::Changed, Qt::QueuedConnection);
    connect(&m_slice, &QTimer::timeout, this, &CProblemCheck::GoOn); // whenever there is nothing else to do
}

CProblemCheck::~CProblemCheck()
{
    emit Ends();
}

std::size_t CProblemCheck::Count(Severity severity) const
{
    std::size_t count = 0;
    for (const Rule& rule : HDRules())
        if (rule.severity == severity)
            count += m_counts[std::size_t(rule.id)];
    return count;
}

void CProblemCheck::Restart()
{
    m_isCurrent = false;
    m_slice.stop();
    m_check.reset();
    m_pause.start();
}

void CProblemCheck::RiverChanged()
{
    m_knowsRiver = false;
    Restart();
}

/// Where there is no memory for a check, the list stays as it is until the next change: nobody asked for it now.
template <typename Work>
void CProblemCheck::Try(const Work& work)
{
    try {
        work();
    } catch (const std::bad_alloc&) {
        m_slice.stop();
        m_check.reset();
    }
}

void CProblemCheck::Begin()
{
    Try([this] {
        if (!m_knowsRiver)
            m_river = m_host.CheckedRiver();
        m_knowsRiver = true;
        m_check =
            std::make_unique<CHDCheck>(m_host.CheckedParameters(), m_river.get(), m_host.CheckedPath().toStdString());
        m_slice.start();
    });
}

void CProblemCheck::GoOn()
{
    Try([this] {
        QElapsedTimer time;
        for (time.start(); time.elapsed() < Slice;)
            if (!m_check->Step(Lines))
                return Finish();
    });
}

void CProblemCheck::Finish()
{
    m_slice.stop();
    for (const Rule& rule : HDRules())
        m_counts[std::size_t(rule.id)] = m_check->Count(rule.id);
    m_found = m_check->Take();
    m_ofFile = m_host.FileProblems();
    for (const FileProblem& problem : m_ofFile)
        ++m_counts[std::size_t(problem.rule)];
    m_check.reset();
    m_isCurrent = true;
    emit Changed();
}
