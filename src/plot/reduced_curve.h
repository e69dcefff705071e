// What a screen can show of a curve of any number of points.
#pragma once

#include <cstddef>
#include <utility>
#include <vector>

class CReducedCurve
{
public:
    CReducedCurve() = default;
    /// `x` does not decrease; a y that is not a number leaves a gap. Both are as long as each other and outlive it.
    CReducedCurve(const std::vector<double>& x, const std::vector<double>& y);

    /// The indexes of the points that look, on `pixels` columns from `from` to `to`, as all of them do: in each column
    /// the first and the last one, the lowest and the highest one, and a gap where nothing else stands. The neighbors
    /// outside are among them, so that lines leave the window as they should. Where there are few points it is all.
    std::vector<std::size_t> Visible(double from, double to, int pixels) const;
    /// The points from `from` up to `to`: the first one and the one behind the last.
    std::pair<std::size_t, std::size_t> Between(double from, double to) const;

private:
    static constexpr std::size_t BlockSize = 64;
    struct Extremes
    {
        std::size_t lowest, highest; // indexes; None for a block of gaps
    };
    static constexpr std::size_t None = std::size_t(-1);

    void Take(Extremes& extremes, std::size_t point) const;
    Extremes Of(std::size_t first, std::size_t last) const;

    const std::vector<double>*m_x = nullptr, *m_y = nullptr;
    std::vector<Extremes> m_blocks; // of so many points each, so that a column of thousands costs little
};
