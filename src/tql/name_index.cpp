#include "tql/name_index.h"

namespace tql {

NameIndex::NameIndex(const std::vector<std::string_view>& names) : m_order(names.size())
{
    for (const std::string_view name : names)
        ++m_runs[name].count;
    std::size_t first = 0;
    for (auto& [name, run] : m_runs) {
        run.first = first;
        first += run.count;
        run.count = 0;
    }
    for (std::size_t i = 0; i < names.size(); ++i) {
        Run& run = m_runs[names[i]];
        m_order[run.first + run.count++] = std::uint32_t(i);
    }
}

std::size_t NameIndex::Find(std::string_view name, int number) const
{
    const auto run = m_runs.find(name);
    if (run == m_runs.end() || number < 1 || std::size_t(number) > run->second.count)
        return NotFound;
    return m_order[run->second.first + std::size_t(number) - 1];
}

int NameIndex::Count(std::string_view name) const
{
    const auto run = m_runs.find(name);
    return run == m_runs.end() ? 0 : int(run->second.count);
}

} // namespace tql
