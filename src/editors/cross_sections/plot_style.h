// The colours of the plot, from the palette of the window.
#pragma once

#include <QColor>
#include <QPalette>

struct CPlotStyle
{
    explicit CPlotStyle(const QPalette& palette)
        : dark(palette.color(QPalette::Base).lightness() < 128),
          paper(palette.color(QPalette::Base)),
          text(palette.color(QPalette::Text)),
          muted(dark ? QColor(0x9a, 0xa4, 0xae) : QColor(0x5f, 0x6a, 0x74)),
          grid(dark ? QColor(0xff, 0xff, 0xff, 28) : QColor(0x00, 0x00, 0x00, 24)),
          soil(dark ? QColor(0x4f, 0x43, 0x34) : QColor(0xe2, 0xd3, 0xb8)),
          ground(dark ? QColor(0xd9, 0xba, 0x8c) : QColor(0x6f, 0x50, 0x28)),
          water(dark ? QColor(0x2c, 0x57, 0x7c) : QColor(0xc4, 0xde, 0xf2)),
          surface(dark ? QColor(0x7f, 0xbc, 0xec) : QColor(0x2a, 0x6f, 0xad)),
          mark(dark ? QColor(0xff, 0x6b, 0x81) : QColor(0xc8, 0x10, 0x3c))
    {
    }

    bool dark;
    QColor paper, text;
    QColor muted, grid;    // frame and smaller texts; grid lines
    QColor soil, ground;   // below the ground, and its line
    QColor water, surface; // the water, its surface and the width marker
    QColor mark;           // the current point
};
