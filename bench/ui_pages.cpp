// Switching to each page of the sheet with 100,000 records in every list, against 100.
#include "bench/report.h"
#include "ks/fc/doc_template.h"
#include "module/kavo0_hd.h"
#include "module/sheet.h"
#include "module/view.h"
#include "pages/framework/page.h"

#include <QApplication>
#include <string>

namespace {

constexpr int Large = 100'000, Small = 100, Rounds = 15;

void Fill(CGenList& list, int lines)
{
    list.Reserve(std::size_t(lines));
    for (int i = 0; i < lines; ++i) {
        auto record = list.NewRecord();
        record->RiverName = "RIVER" + std::to_string(i / 1000);
        record->Chainage = i % 1000 * 12.5;
        list.AddTail(std::move(record));
    }
}

void Fill(HD_Parameters& parameters, int lines)
{
    parameters.EncroachList.Add();
    for (const ListEntry& entry : HDLists())
        Fill(entry.list(parameters).ListAt(0), lines);
    // Whatever hides a grid is switched on.
    parameters.Global.EnergyEquation = true;
    parameters.Global.Leakage.IncludeLeakage = true;
    parameters.Global.MarkTitles = {"LOW", "HIGH"};
}

/// A document in a window, as the shell shows it.
struct Window
{
    explicit Window(int lines) : documents(CKavo0_hd::CreateMainDlg())
    {
        frame.resize(1000, 760);
        frame.show();
        auto* document = static_cast<CKavo0_hdDoc*>(documents->OpenDocumentFile(&frame, {}));
        Fill(document->Parameters(), lines);
        view = static_cast<CKavo0_hdView*>(document->Views().front());
        view->ActivePage()->LoadFromDocument(document);
        QApplication::processEvents();
    }
    double SwitchTo(int tab)
    {
        view->Sheet()->SetActivePage(tab == 0 ? 1 : 0);
        QApplication::processEvents();
        return Milliseconds([&] {
            view->Sheet()->SetActivePage(tab);
            frame.repaint();
            QApplication::processEvents();
        });
    }

    CKsMDIFrameWnd frame;
    std::unique_ptr<CMultiDocTemplate> documents;
    CKavo0_hdView* view = nullptr;
};

} // namespace

int main(int argc, char** argv)
{
    if (qEnvironmentVariableIsEmpty("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication app(argc, argv);
    const CKsEditorResources resources(HDEditor());

    Window large(Large), small(Small);
    bool fast = true;
    for (int tab = 0; tab < large.view->Sheet()->PageCount(); ++tab) {
        std::vector<double> inLarge, inSmall;
        for (int i = -2; i < Rounds; ++i) { // the first two warm up
            const double first = large.SwitchTo(tab), second = small.SwitchTo(tab);
            if (i >= 0) {
                inLarge.push_back(first);
                inSmall.push_back(second);
            }
        }
        const std::string what =
            "To \"" + large.view->Sheet()->tabText(tab).toStdString() + "\": 100,000 / 100 records";
        fast = Report(what.c_str(), Median(inLarge), Median(inSmall), 2.0) && fast;
    }
    return fast ? 0 : 1;
}
