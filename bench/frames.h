// How long a window takes to show what was moved in it.
#pragma once

#include "bench/report.h"

#include <QImage>
#include <QWidget>

/// The median time of painting the window after a move, in milliseconds.
inline double MeasureFrames(QWidget& window, const std::function<void(int)>& move)
{
    constexpr int rounds = 60, warmUp = 5;
    QImage image(window.size(), QImage::Format_ARGB32_Premultiplied);
    std::vector<double> times;
    for (int i = -warmUp; i < rounds; ++i) {
        const double time = Milliseconds([&] {
            move(i);
            window.render(&image);
        });
        if (i >= 0)
            times.push_back(time);
    }
    return Median(times);
}
