// The page of user-defined marks with 100,000 locations and 40 titles, against 3 titles: scrolling, and editing and
// storing a cell.
#include "bench/page_view.h"
#include "bench/report.h"
#include "grid/gen_grid.h"
#include "pages/page_table.h"

#include <QScrollBar>
#include <string>

namespace {

constexpr int Locations = 100'000, Rounds = 41;

/// The page on a document of its own.
struct Marks
{
    explicit Marks(int titles)
    {
        HD_Parameters& parameters = document.Parameters();
        for (int title = 0; title < titles; ++title)
            parameters.Global.MarkTitles.push_back("MARK " + std::to_string(title));
        parameters.Global.MarkInterpolate.resize(std::size_t(titles));
        parameters.WaterLevelMarkList.Reserve(Locations);
        for (int i = 0; i < Locations; ++i) {
            HDWLMark mark;
            mark.RiverName = "RIVER" + std::to_string(i / 1000);
            mark.Chainage = i % 1000 * 12.5;
            mark.MarkLevels.assign(std::size_t(titles), 10 + i * 1e-4);
            parameters.WaterLevelMarkList.Add(std::move(mark));
        }
        page = MakeWLMarkPage(&document);
        view = std::make_unique<PageView>(document, *page);
        page->OnSetActive();
        Show(*page);
        grid = page->GetGrid();
    }
    double Scroll()
    {
        QScrollBar& bar = *grid->verticalScrollBar();
        return Milliseconds([&] {
            bar.setValue((bar.value() + bar.pageStep()) % bar.maximum());
            grid->viewport()->repaint();
            QApplication::processEvents();
        });
    }
    double EditAndStore()
    {
        row = row % 900 + 1;
        grid->SetCurrentCell(row, 3);
        QApplication::processEvents();
        value += 0.25;
        return Milliseconds([&] {
            grid->Model()->setData(grid->currentIndex(), QString::number(value), Qt::EditRole);
            grid->SetCurrentCell(row + 1, 3);
            grid->viewport()->repaint();
            QApplication::processEvents();
        });
    }

    CKavo0_hdDoc document;
    std::unique_ptr<CGenPropertyPage> page;
    std::unique_ptr<PageView> view;
    CGenGrid* grid = nullptr;
    int row = 0;
    double value = 1000;
};

bool Compare(const char* what, Marks& many, Marks& few, double (Marks::*step)())
{
    std::vector<double> first, second;
    for (int i = -3; i < Rounds; ++i) { // the first ones warm up
        const double inMany = (many.*step)(), inFew = (few.*step)();
        if (i < 0)
            continue;
        first.push_back(inMany);
        second.push_back(inFew);
    }
    return Report(what, Median(first), Median(second), 2.0);
}

} // namespace

int main(int argc, char** argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);

    Marks many(40), few(3);
    const bool scrolls = Compare("Scrolling by a page: 40 titles / 3", many, few, &Marks::Scroll);
    const bool edits = Compare("Editing and storing a level: 40 titles / 3", many, few, &Marks::EditAndStore);
    return scrolls && edits ? 0 : 1;
}
