// Operations on a column of a million cells, from the command to the page that shows them, against storing the same
// numbers as one command; undoing them; and what a step to undo holds, against the numbers that it changes.
#include "bench/page_view.h"
#include "bench/report.h"
#include "data/hd_file.h"
#include "grid/cell_operations.h"
#include "grid/gen_grid.h"
#include "grid/grid_clipboard.h"
#include "ks/units/formula.h"
#include "pages/page_table.h"

#include <QClipboard>
#include <QUndoStack>
#include <cmath>
#include <filesystem>
#ifdef __GLIBC__
#include <malloc.h>
#endif

namespace {

constexpr int Lines = 1'000'000, Rounds = 7, Level = 2;
constexpr CellBlock Column{0, Level, Lines - 1, Level};

struct Page
{
    Page()
    {
        auto& list = document.Parameters().InitList;
        list.Reserve(Lines);
        for (int i = 0; i < Lines; ++i) {
            HD_Initial record;
            record.RiverName = "RIVER" + std::to_string(i / 1000);
            record.Chainage = i % 1000 * 12.5;
            record.InitialH = std::sin(i) * 10;
            record.InitialQ = 100;
            list.Add(record);
        }
        page = MakeInitPage(&document);
        view = std::make_unique<PageView>(document, *page);
        page->OnSetActive();
        Show(*page);
    }
    CGridModel& Model() const { return *page->GetGrid()->Model(); }
    double Make(const std::function<CCellResults()>& compute)
    {
        return Milliseconds([&] {
            CCellResults results = compute();
            Model().ChangeCells("step", results.FirstRow(), results.TakeChanges());
            QApplication::processEvents();
        });
    }
    double Undo()
    {
        return Milliseconds([&] {
            document.UndoStack().undo();
            QApplication::processEvents();
        });
    }
    std::vector<double> Numbers() const
    {
        std::vector<double> numbers;
        const auto& list = document.Parameters().InitList;
        for (std::size_t i = 0; i < list.GetCount(); ++i)
            numbers.push_back(list.GetAt(i).InitialH);
        return numbers;
    }
    /// The yardstick.
    double Store(const std::vector<double>& numbers)
    {
        return Milliseconds([&] {
            CCellChanges changes;
            const auto& access = Model().Column(Level).access;
            for (int row = 0; row < Lines; ++row)
                changes.Add(Model().NameOf(row), Level + 1, access, Model().Value(row, Level),
                            numbers[std::size_t(row)]);
            Model().ChangeCells("step", 0, std::move(changes));
            QApplication::processEvents();
        });
    }

    CKavo0_hdDoc document;
    std::unique_ptr<CGenPropertyPage> page;
    std::unique_ptr<PageView> view;
};

QString wanted; // a part of what is measured; empty for everything

bool Measure(Page& page, const char* what, const std::function<CCellResults()>& compute)
{
    if (!QString(what).contains(wanted))
        return true;
    std::vector<double> made, stored, undone;
    page.Make(compute);
    const std::vector<double> numbers = page.Numbers();
    page.Undo();
    for (int round = 0; round < Rounds; ++round) {
        made.push_back(page.Make(compute));
        undone.push_back(page.Undo());
        stored.push_back(page.Store(numbers));
        page.Undo();
    }
    const bool isFast = Report(what, Median(made), Median(stored), 1.5);
    return Report("  undo of it, against 200 ms", Median(undone), 200, 1) && isFast;
}

bool MeasureMemory(Page& page)
{
    if (!QString("a step").contains(wanted))
        return true;
#ifdef __GLIBC__
    const auto used = [] {
        const auto info = mallinfo2();
        return double(info.uordblks + info.hblkhd);
    };
    page.document.UndoStack().clear();
    const double before = used();
    page.Make([&] { return FillSeries(page.Model(), Column, 0.5); });
    const double step = (used() - before) / (1 << 20), numbers = double(Lines) * sizeof(double) / (1 << 20);
    std::printf("%-58s %9.1f MB / %9.1f MB = %5.2f (limit 3.0) %s\n", "a step of 1M cells, against the numbers changed",
                step, numbers, step / numbers, step / numbers <= 3.01 ? "ok" : "TOO LARGE");
    return step / numbers <= 3.01; // and the step itself
#else
    return bool(&page);
#endif
}

/// A million lines of text into an empty table, against reading the same lines from a file.
bool MeasurePaste()
{
    if (!QString("paste").contains(wanted))
        return true;
    CKavo0_hdDoc document;
    const auto page = MakeInitPage(&document);
    PageView view(document, *page);
    page->OnSetActive();
    Show(*page);
    QString text;
    HD_Parameters parameters;
    for (int i = 0; i < Lines; ++i) {
        HD_Initial record;
        record.RiverName = "RIVER" + std::to_string(i / 1000);
        record.Chainage = i % 1000 * 12.5;
        record.InitialH = (125 + i % 1000) / 100.0;
        record.InitialQ = (105 + i % 777) / 10.0;
        text += QStringLiteral("%1\t%2\t%3\t%4\n")
                    .arg(QString::fromStdString(record.RiverName))
                    .arg(record.Chainage)
                    .arg(record.InitialH)
                    .arg(record.InitialQ);
        parameters.InitList.Add(std::move(record));
    }
    QApplication::clipboard()->setText(text);
    const std::string file = (std::filesystem::temp_directory_path() / "kvr_bench_paste.hdkv").string();
    static_cast<void>(SaveHDFile(parameters, file));
    std::vector<double> pasted, read, undone;
    for (int round = 0; round < Rounds; ++round) {
        pasted.push_back(Milliseconds([&] {
            PasteCells(*page->GetGrid());
            QApplication::processEvents();
        }));
        undone.push_back(Milliseconds([&] {
            document.UndoStack().undo();
            QApplication::processEvents();
        }));
        read.push_back(Milliseconds([&] { static_cast<void>(LoadHDFile(file)); }));
    }
    std::filesystem::remove(file);
    const bool isFast =
        Report("paste 1M lines of 4 cells, against reading them from a file", Median(pasted), Median(read), 2.5);
    return Report("  undo of it, against 200 ms", Median(undone), 200, 1) && isFast;
}

/// Nobody waits for the marks of what differs from the last save.
bool MeasureMarks(Page& page)
{
    if (!QString("marks").contains(wanted))
        return true;
    constexpr int linesOnScreen = 60, typed = 1000;
    CGridModel& model = page.Model();
    for (const double step : {0.5, 0.25})
        page.Make([&] { return FillSeries(model, Column, step); });
    const auto type = [&](int row) {
        model.setData(model.index(row, Level), QString::number(row), Qt::EditRole);
        model.Store();
    };
    for (int row = 0; row < typed; ++row)
        type(row * (Lines / typed));
    const auto look = [&] {
        int found = 0;
        for (int row = Lines / 2; row < Lines / 2 + linesOnScreen; ++row)
            found += model.Saved().MarkOf(row) == SavedMark::Changed;
        return found;
    };
    std::vector<double> times;
    for (int round = 0; round < Rounds; ++round) {
        type(round);
        times.push_back(Milliseconds(look));
    }
    return Report("marks of a screen after each step, against 60 Hz", Median(times), 1000.0 / 60, 0.2);
}

} // namespace

int main(int argc, char** argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);
    wanted = argc > 1 ? argv[1] : "";
    Page page;
    const CTableRows& rows = page.Model();
    const FormulaNames names = NamesForFormula(rows);
    const CKsFormula formula("value*1.1 + 2", names.names), ofColumns("max(value, 2) + chainage/1000", names.names);
    const bool isFilled =
        Measure(page, "fill down 1M cells, against storing the numbers", [&] { return FillDown(rows, Column); });
    const bool isSeries = Measure(page, "a series in 1M cells", [&] { return FillSeries(rows, Column, 0.5); });
    const bool isInterpolated = Measure(page, "interpolate 1M cells of 1,000 branches",
                                        [&] { return Interpolate(rows, Column, KnownValues::Ends, false); });
    const bool isCalculated =
        Measure(page, "value*1.1 + 2 in 1M cells", [&] { return Calculate(rows, Column, formula, names); });
    const bool isOfColumns = Measure(page, "max(value, 2) + chainage/1000 in 1M cells",
                                     [&] { return Calculate(rows, Column, ofColumns, names); });
    const bool isSmall = MeasureMemory(page);
    const bool isPasted = MeasurePaste();
    const bool isMarked = MeasureMarks(page);
    const bool isFast = isFilled && isSeries && isInterpolated && isCalculated && isOfColumns;
    return isFast && isSmall && isPasted && isMarked ? 0 : 1;
}
