// The colors of a plot: on a window they follow its palette, on paper they are the light ones.
#pragma once

#include "plot/plot.h"

#include <QColor>
#include <QPalette>
#include <array>

struct CPlotColors
{
    explicit CPlotColors(const QPalette& palette)
        : isDark(palette.color(QPalette::Base).lightness() < 128),
          paper(palette.color(QPalette::Base)),
          text(palette.color(QPalette::Text)),
          muted(Either(0x5f6a74, 0x9aa4ae)),
          grid(Either(0xe2e5e8, 0x3a4046)),
          mark(Either(0xc8103c, 0xff6b81))
    {
    }

    QColor Ink(PlotInk ink, int number) const
    {
        // Apart from each other for eyes that do not tell red from green, too: the qualitative set of M. Okabe and
        // K. Ito, Color Universal Design, 2008, without its black and its yellow.
        static constexpr std::array<QRgb, 6> others{0xd55e00, 0x0072b2, 0x009e73, 0xcc79a7, 0xe69f00, 0x56b4e9};
        switch (ink) {
        case PlotInk::Ground:
            return Either(0x6f5028, 0xd9ba8c);
        case PlotInk::LeftBank:
            return Either(0x4f7f2f, 0x9ccc6c);
        case PlotInk::RightBank:
            return Either(0x8a8f2a, 0xc9cf70);
        case PlotInk::Water:
            return Either(0x2a6fad, 0x7fbcec);
        case PlotInk::Other:
            break;
        }
        const QColor color = QColor::fromRgb(others[std::size_t(number) % others.size()]);
        return isDark ? color.lighter(130) : color;
    }

    bool isDark;
    QColor paper, text;
    QColor muted, grid; // axes, and lines across the tracks
    QColor mark;        // the current place

private:
    QColor Either(QRgb light, QRgb dark) const { return QColor::fromRgb(isDark ? dark : light); }
};
