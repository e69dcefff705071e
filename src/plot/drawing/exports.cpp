// What the library gives the programs that load it.
#include "plot/drawing/plot_output.h"
#include "plot/drawing/plot_window.h"

#include <QPointer>

namespace {

class CPlot final : public IPlot
{
public:
    CPlot(QWidget* parent, PlotHandlers handlers) : m_window(new CPlotWindow(parent, std::move(handlers))) {}
    ~CPlot() override { delete m_window; }

    QWidget& Widget() override { return *m_window; }
    void Show(PlotContent content, bool fits) override { m_window->Show(std::move(content), fits); }
    void Mark(std::optional<double> x, const std::vector<PlotPoint>& points) override { m_window->Mark(x, points); }
    void Fit() override { m_window->Fit(); }
    void Zoom(double factor) override { m_window->Zoom(factor); }
    void SetRange(double from, double to) override { m_window->SetSight(from, to); }
    std::pair<double, double> Range() const override { return m_window->Sight(); }
    QImage Picture(int width, int height) override { return PlotPicture(*m_window, width, height); }
    QString Write(const QString& file, int width, int height) override
    {
        return WritePlot(*m_window, file, width, height);
    }
    void Print(QWidget* parent) override { PrintPlot(*m_window, parent); }

private:
    QPointer<CPlotWindow> m_window; // its parent may delete it
};

std::unique_ptr<IPlot> Make(QWidget* parent, PlotHandlers handlers)
{
    return std::make_unique<CPlot>(parent, std::move(handlers));
}

} // namespace

extern "C" Q_DECL_EXPORT const PlotLibrary* KvrPlotLibrary()
{
    static const PlotLibrary library{&Make};
    return &library;
}
