#include "plot/reduced_curve.h"

#include <algorithm>
#include <array>
#include <cmath>

CReducedCurve::CReducedCurve(const std::vector<double>& x, const std::vector<double>& y) : m_x(&x), m_y(&y)
{
    m_blocks.reserve(y.size() / BlockSize + 1);
    for (std::size_t first = 0; first < y.size(); first += BlockSize) {
        Extremes& block = m_blocks.emplace_back(None, None);
        for (std::size_t point = first; point < std::min(first + BlockSize, y.size()); ++point)
            Take(block, point);
    }
}

void CReducedCurve::Take(Extremes& extremes, std::size_t point) const
{
    const double value = (*m_y)[point];
    if (std::isnan(value))
        return;
    if (extremes.lowest == None || value < (*m_y)[extremes.lowest])
        extremes.lowest = point;
    if (extremes.highest == None || value > (*m_y)[extremes.highest])
        extremes.highest = point;
}

/// Of the points from `first` up to `last`.
CReducedCurve::Extremes CReducedCurve::Of(std::size_t first, std::size_t last) const
{
    Extremes extremes{None, None};
    std::size_t point = first;
    while (point < last) {
        if (point % BlockSize == 0 && point + BlockSize <= last) {
            const Extremes& block = m_blocks[point / BlockSize];
            if (block.lowest != None) {
                Take(extremes, block.lowest);
                Take(extremes, block.highest);
            }
            point += BlockSize;
        } else {
            Take(extremes, point++);
        }
    }
    return extremes;
}

std::pair<std::size_t, std::size_t> CReducedCurve::Between(double from, double to) const
{
    if (!m_x)
        return {};
    const auto first = std::ranges::lower_bound(*m_x, from), last = std::upper_bound(first, m_x->end(), to);
    return {std::size_t(first - m_x->begin()), std::size_t(last - m_x->begin())};
}

std::vector<std::size_t> CReducedCurve::Visible(double from, double to, int pixels) const
{
    std::vector<std::size_t> points;
    if (!m_x || m_x->empty() || pixels <= 0 || !(from < to))
        return points;
    auto [first, last] = Between(from, to);
    first -= first > 0;
    last += last < m_x->size();
    constexpr std::size_t PerColumn = 4;
    if (last - first <= PerColumn * std::size_t(pixels)) {
        for (std::size_t point = first; point < last; ++point)
            points.push_back(point);
        return points;
    }
    points.reserve(PerColumn * std::size_t(pixels) + 2);
    const double width = (to - from) / pixels;
    std::size_t column = first;
    // The first column also has what stands before the window, the last one what stands behind it.
    for (int pixel = 0; pixel < pixels && column < last; ++pixel) {
        const auto begin = m_x->begin() + std::ptrdiff_t(column), end = m_x->begin() + std::ptrdiff_t(last);
        const std::size_t next =
            pixel + 1 == pixels ? last
                                : std::size_t(std::lower_bound(begin, end, from + (pixel + 1) * width) - m_x->begin());
        if (next == column)
            continue;
        const Extremes extremes = Of(column, next);
        std::array<std::size_t, PerColumn> chosen{column, extremes.lowest, extremes.highest, next - 1};
        std::ranges::sort(chosen); // None comes last
        for (std::size_t i = 0; i < chosen.size() && chosen[i] != None; ++i)
            if (i == 0 || chosen[i] != chosen[i - 1])
                points.push_back(chosen[i]);
        column = next;
    }
    return points;
}
