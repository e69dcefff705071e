#include "problems/problems_filter.h"

#include "problems/problems_model.h"

#include <algorithm>

CProblemsFilter::CProblemsFilter(QObject* parent) : QSortFilterProxyModel(parent)
{
    setSortRole(CProblemsModel::SortRole);
}

void CProblemsFilter::Show(Severity severity, bool shown)
{
    m_shown[std::size_t(severity)] = shown;
    invalidateFilter();
}

void CProblemsFilter::ShowOnly(const QString& words)
{
    m_words = words.split(u' ', Qt::SkipEmptyParts);
    invalidateFilter();
}

bool CProblemsFilter::filterAcceptsRow(int row, const QModelIndex& parent) const
{
    const auto data = [&](int column, int role) { return sourceModel()->index(row, column, parent).data(role); };
    if (!m_shown[data(CProblemsModel::What, CProblemsModel::SeverityRole).toInt()])
        return false;
    return std::ranges::all_of(m_words, [&](const QString& word) {
        for (int column = 0; column < CProblemsModel::Columns; ++column)
            if (data(column, Qt::DisplayRole).toString().contains(word, Qt::CaseInsensitive))
                return true;
        return false;
    });
}
