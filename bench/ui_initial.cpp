// The page of initial conditions with a million lines: how long it takes to show, against a bare table view of the same
// size; and what storing one edited cell, moving on and repainting costs, against a thousand lines.
#include "bench/page_view.h"
#include "bench/report.h"
#include "grid/gen_grid.h"
#include "pages/page_table.h"

#include <QApplication>
#include <QTableView>
#include <string>

namespace {

constexpr int Large = 1'000'000, Small = 1'000;

/// The yardstick: rows and columns of numbers, nothing else.
class TrivialModel : public QAbstractTableModel
{
public:
    int rowCount(const QModelIndex& parent = {}) const override { return parent.isValid() ? 0 : Large; }
    int columnCount(const QModelIndex& parent = {}) const override { return parent.isValid() ? 0 : 4; }
    QVariant data(const QModelIndex& index, int role) const override
    {
        return role == Qt::DisplayRole ? QVariant(index.row() * 0.5) : QVariant();
    }
};

void Fill(CKavo0_hdDoc& document, int lines)
{
    auto& list = document.Parameters().InitList;
    list.Reserve(std::size_t(lines));
    for (int i = 0; i < lines; ++i) {
        HD_Initial record;
        record.RiverName = "RIVER" + std::to_string(i / 1000);
        record.Chainage = i % 1000 * 12.5;
        record.InitialH = 10 + i * 1e-5;
        record.InitialQ = 100;
        list.Add(record);
    }
}

double ShowPage(CKavo0_hdDoc& document)
{
    std::unique_ptr<CGenPropertyPage> page;
    return Milliseconds([&] {
        page = MakeInitPage(&document);
        page->OnSetActive();
        Show(*page);
    });
}

double ShowBareTable()
{
    TrivialModel model;
    QTableView view;
    return Milliseconds([&] {
        view.setModel(&model);
        Show(view);
    });
}

/// A page on its own document, and the step that is measured.
struct Edited
{
    explicit Edited(int lines)
    {
        Fill(document, lines);
        page = MakeInitPage(&document);
        view = std::make_unique<PageView>(document, *page);
        page->OnSetActive();
        Show(*page);
        grid = page->GetGrid();
    }
    double Step()
    {
        row = row % 900 + 1;
        grid->SetCurrentCell(row, 3);
        QApplication::processEvents();
        value += 0.25;
        return Milliseconds([&] {
            grid->Model()->setData(grid->currentIndex(), QString::number(value), Qt::EditRole);
            grid->SetCurrentCell(row + 1, 1);
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

} // namespace

int main(int argc, char** argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);

    std::vector<double> page, bare;
    {
        CKavo0_hdDoc document;
        Fill(document, Large);
        ShowPage(document); // warms up fonts and styles
        ShowBareTable();
        for (int i = 0; i < 9; ++i) {
            page.push_back(ShowPage(document));
            bare.push_back(ShowBareTable());
        }
    }

    Edited large(Large), small(Small);
    std::vector<double> inLarge, inSmall;
    for (int i = 0; i < 220; ++i) {
        const double first = large.Step(), second = small.Step();
        if (i < 20)
            continue; // warming up
        inLarge.push_back(first);
        inSmall.push_back(second);
    }

    const bool shown = Report("Initial page, 1,000,000 lines, shown / bare table", Median(page), Median(bare), 3.0);
    const bool stored =
        Report("One cell stored, next line: 1,000,000 / 1,000 lines", Median(inLarge), Median(inSmall), 1.5);
    return shown && stored ? 0 : 1;
}
