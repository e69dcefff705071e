#include "ks/fc/unsaved_changes.h"

#include <utility>

KsLineChange::~KsLineChange() = default;

void KsEveryLineReplaced::TakeBack(KsTracedLine& line, bool) const
{
    line.origin = KsLineOrigin::Unknown;
}

void CKsUnsavedChanges::MakeRoom()
{
    if (m_steps.size() == m_steps.capacity())
        m_steps.reserve(2 * m_steps.size() + 8);
}

void CKsUnsavedChanges::Add(std::shared_ptr<const KsLineChange> change, bool forward)
{
    if (!change)
        return;
    ++m_version;
    if (!m_steps.empty() && m_steps.back().change == change && m_steps.back().forward != forward)
        m_steps.pop_back();
    else
        m_steps.push_back({std::move(change), forward});
}

void CKsUnsavedChanges::Clear()
{
    m_steps.clear();
    ++m_version;
}

void CKsUnsavedChanges::TakeBack(KsTracedLine& line) const
{
    for (auto step = m_steps.rbegin(); step != m_steps.rend() && line.origin == KsLineOrigin::Saved; ++step)
        step->change->TakeBack(line, step->forward);
}
