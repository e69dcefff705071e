// The colours of the map, from the palette of the window.
#pragma once

#include <QColor>
#include <QPalette>

inline QColor Faded(QColor colour, int alpha)
{
    colour.setAlpha(alpha);
    return colour;
}

struct CMapStyle
{
    explicit CMapStyle(const QPalette& palette)
        : dark(palette.color(QPalette::Base).lightness() < 128),
          ground(palette.color(QPalette::Base)),
          text(palette.color(QPalette::Text)),
          water(dark ? QColor(0x6f, 0xa8, 0xd6) : QColor(0x4f, 0x86, 0xb5)),
          chosen(dark ? QColor(0xb9, 0xdc, 0xf7) : QColor(0x12, 0x46, 0x78)),
          mark(dark ? QColor(0xff, 0x6b, 0x81) : QColor(0xc8, 0x10, 0x3c)),
          muted(dark ? QColor(0x9a, 0xa4, 0xae) : QColor(0x6b, 0x76, 0x80)),
          outline(dark ? QColor(0xdd, 0xe3, 0xe8) : QColor(0x2a, 0x30, 0x36))
    {
    }

    bool dark;
    QColor ground, text;
    QColor water, chosen; // branches, and the one that is current
    QColor mark;          // places picked, shown or selected
    QColor muted;         // leaders, frames
    QColor outline;       // of symbols
};
