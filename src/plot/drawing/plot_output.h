// A plot as a picture, a file, a printed page.
#pragma once

#include <QImage>

class CPlotWindow;

QImage PlotPicture(CPlotWindow& plot, int width, int height);
/// See IPlot::Write.
QString WritePlot(CPlotWindow& plot, const QString& file, int width, int height);
void PrintPlot(CPlotWindow& plot, QWidget* parent);
