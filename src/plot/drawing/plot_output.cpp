#include "plot/drawing/plot_output.h"

#include "plot/drawing/plot_window.h"

#include <QBuffer>
#include <QFileInfo>
#include <QPdfWriter>
#include <QPrintDialog>
#include <QPrinter>
#include <QSaveFile>
#include <QSvgGenerator>

namespace {

constexpr int ScreenDpi = 96;

QByteArray SvgOf(CPlotWindow& plot, int width, int height)
{
    QByteArray bytes;
    QBuffer buffer(&bytes);
    QSvgGenerator svg;
    svg.setOutputDevice(&buffer);
    svg.setResolution(ScreenDpi);
    svg.setSize({width, height});
    svg.setViewBox(QRect(0, 0, width, height));
    plot.PaintOn(svg, width, height, 1);
    return bytes;
}

QByteArray PdfOf(CPlotWindow& plot, int width, int height)
{
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    QPdfWriter pdf(&buffer);
    pdf.setPageSize(QPageSize(QSizeF(width, height) / ScreenDpi, QPageSize::Inch));
    pdf.setPageMargins({});
    plot.PaintOn(pdf, width, height, double(pdf.resolution()) / ScreenDpi);
    return bytes;
}

QByteArray PixelsOf(CPlotWindow& plot, int width, int height, const QString& extension)
{
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    PlotPicture(plot, width, height).save(&buffer, extension.toLatin1().constData());
    return bytes;
}

} // namespace

QImage PlotPicture(CPlotWindow& plot, int width, int height)
{
    QImage image(width, height, QImage::Format_RGB32);
    image.fill(Qt::white);
    plot.PaintOn(image, width, height, 1);
    return image;
}

QString WritePlot(CPlotWindow& plot, const QString& file, int width, int height)
{
    const QString extension = QFileInfo(file).suffix().toLower();
    const QByteArray bytes = extension == QStringLiteral("svg")   ? SvgOf(plot, width, height)
                             : extension == QStringLiteral("pdf") ? PdfOf(plot, width, height)
                                                                  : PixelsOf(plot, width, height, extension);
    QSaveFile written(file); // replaces a file when all of it is written
    if (written.open(QIODevice::WriteOnly) && written.write(bytes) == bytes.size() && written.commit())
        return {};
    return QStringLiteral("%1: %2").arg(file, written.errorString());
}

void PrintPlot(CPlotWindow& plot, QWidget* parent)
{
    QPrinter printer(QPrinter::HighResolution);
    printer.setPageOrientation(QPageLayout::Landscape);
    QPrintDialog dialog(&printer, parent);
    if (dialog.exec() != QDialog::Accepted)
        return;
    const QRectF page = printer.pageRect(QPrinter::DevicePixel);
    const double scale = printer.resolution() / double(ScreenDpi);
    plot.PaintOn(printer, int(page.width() / scale), int(page.height() / scale), scale);
}
