#include "plot/plot_library.h"

#include <QCoreApplication>
#include <QLibrary>

namespace {

struct Plots
{
    Q_DECLARE_TR_FUNCTIONS(Plots)
};

} // namespace

const PlotLibrary* LoadPlotLibrary(QString& reason)
{
    QLibrary library(QCoreApplication::applicationDirPath() + u'/' + QLatin1String(PlotLibraryName)); // stays loaded
    const auto get = reinterpret_cast<PlotLibraryGetter*>(library.resolve(PlotLibraryFunction));
    if (get)
        return get();
    reason = Plots::tr("Plots cannot be shown: the library %1 that draws them could not be loaded. %2")
                 .arg(QLatin1String(PlotLibraryName), library.errorString());
    return nullptr;
}
