#include "problems/problem_check.h"

#include "rules/hd_check.h"

#include <QElapsedTimer>

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
    m_slice.stop();
    m_check.reset();
    m_pause.start();
}

void CProblemCheck::RiverChanged()
{
    m_knowsRiver = false;
    Restart();
}

void CProblemCheck::Begin()
{
    if (!m_knowsRiver)
        m_river = m_host.CheckedRiver();
    m_knowsRiver = true;
    m_check = std::make_unique<CHDCheck>(m_host.CheckedParameters(), m_river.get(), m_host.CheckedPath().toStdString());
    m_slice.start();
}

void CProblemCheck::GoOn()
{
    QElapsedTimer time;
    for (time.start(); time.elapsed() < Slice;)
        if (!m_check->Step(Lines))
            return Finish();
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
    emit Changed();
}
