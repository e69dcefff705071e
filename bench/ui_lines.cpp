// A million lines sorted by two columns, against std::stable_sort of the same keys; and filtered as somebody types.
#include "bench/page_view.h"
#include "bench/report.h"
#include "grid/gen_grid.h"
#include "grid/lines_view.h"
#include "pages/page_table.h"

#include <QApplication>
#include <random>
#include <string>

namespace {

constexpr int Lines = 1'000'000, Rounds = 5;
constexpr double MostMilliseconds = 100; // of a keystroke in a filter

void Fill(CKavo0_hdDoc& document)
{
    auto& list = document.Parameters().InitList;
    list.Reserve(Lines);
    std::mt19937 random(1);
    for (int i = 0; i < Lines; ++i) {
        HD_Initial record;
        record.RiverName = "RIVER" + std::to_string(random() % 1000);
        record.Chainage = random() % 100'000 * 0.25;
        record.InitialH = 10 + i * 1e-5;
        record.InitialQ = 100;
        list.Add(record);
    }
}

/// The yardstick: branch, chainage and number of each line, sorted by the first two.
double SortPlain(CKavo0_hdDoc& document)
{
    struct Key
    {
        std::string branch;
        double chainage;
        std::uint32_t row;
    };
    auto& list = document.Parameters().InitList;
    std::vector<Key> keys(list.GetCount());
    for (std::uint32_t i = 0; i < keys.size(); ++i)
        keys[i] = {list.GetAt(i).RiverName, list.GetAt(i).Chainage, i};
    return Milliseconds([&] {
        std::stable_sort(keys.begin(), keys.end(), [](const Key& a, const Key& b) {
            const int order = a.branch.compare(b.branch);
            return order < 0 || (order == 0 && a.chainage < b.chainage);
        });
    });
}

} // namespace

int main(int argc, char** argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);

    CKavo0_hdDoc document;
    Fill(document);
    const auto page = MakeInitPage(&document);
    PageView view(document, *page);
    page->OnSetActive();
    Show(*page);
    CGenGrid& grid = *page->GetGrid();
    const auto shown = [&grid](const std::function<void()>& change) {
        return Milliseconds([&] {
            change();
            grid.viewport()->repaint();
            QApplication::processEvents();
        });
    };

    std::vector<double> sorted, plain;
    for (int i = 0; i < Rounds; ++i) {
        sorted.push_back(shown([&grid] { LinesView::Run(Command::SortByPlace, grid); }));
        plain.push_back(SortPlain(document));
        LinesView::Run(Command::FileOrder, grid);
    }
    bool fast = Report("1,000,000 lines sorted by two columns / stable_sort", Median(sorted), Median(plain), 1.5);
    fast = Report("1,000,000 lines sorted by two columns / a second", Median(sorted), 1000, 1.0) && fast;

    const std::pair<int, QString> typed[] = {{0, QStringLiteral("RIVER51")}, {2, QStringLiteral("12.5..14")}};
    for (const bool isSorted : {false, true}) {
        if (isSorted)
            LinesView::Run(Command::SortByPlace, grid);
        for (const auto& [column, text] : typed) {
            std::vector<double> keystrokes;
            for (qsizetype length = 1; length <= text.size(); ++length) {
                QStringList texts(column + 1);
                texts[column] = text.first(length);
                keystrokes.push_back(shown([&] { grid.ChangeView([&](CGridModel& model) { model.Filter(texts); }); }));
            }
            const double longest = *std::max_element(keystrokes.begin(), keystrokes.end());
            const std::string what = std::string(isSorted ? "sorted" : "in the file's order") + ", \"" +
                                     text.toStdString() + "\" typed: the longest keystroke";
            fast = Report(what.c_str(), longest, MostMilliseconds, 1.0) && fast;
            grid.ChangeView([](CGridModel& model) { model.Filter({}); });
        }
    }
    return fast ? 0 : 1;
}
