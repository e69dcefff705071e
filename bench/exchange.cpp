// KvrMSGGetData over seven lists of 100,000 records each, against copying the same names and numbers into a vector of
// structs. Once with branch names as rivers have them, once with a name of its own for every record.
#include "bench/report.h"
#include "data/hd_parameters.h"
#include "ks/fc/hd_messages.h"
#include "module/data_tables.h"
#include "document/document.h"

#include <QApplication>
#include <string>

namespace {

constexpr int Lines = 100'000, Rounds = 31;

void Fill(HD_Parameters& parameters, int linesOfBranch)
{
    for (const HDDataTable& table : HDDataTables()) {
        CGenList& list = table.list(parameters);
        for (int i = 0; i < Lines; ++i) {
            auto record = list.NewRecord();
            record->RiverName = "RIVER" + std::to_string(i / linesOfBranch);
            record->Chainage = i % 1000 * 12.5;
            list.AddTail(std::move(record));
        }
    }
}

struct Copied
{
    std::string name;
    double chainage, second;
    int type;
};

std::vector<Copied> Copy(HD_Parameters& parameters)
{
    std::vector<Copied> copies;
    copies.reserve(std::size_t(Lines) * HDDataTypeCount);
    int type = 0;
    for (const HDDataTable& table : HDDataTables()) {
        const CGenList& list = table.list(parameters);
        for (std::size_t i = 0; i < list.GetCount(); ++i) {
            const HD_RiverPos& record = list.GetAt(i);
            copies.push_back({record.RiverName, record.Chainage, table.second ? table.second(record) : 0, type});
        }
        ++type;
    }
    return copies;
}

struct Times
{
    double asked, copied, askedAndGone, copiedAndGone; // milliseconds
};

Times Measure(int linesOfBranch)
{
    CKavo0_hdDoc document;
    Fill(document.Parameters(), linesOfBranch);
    std::vector<double> asked, copied, askedAndGone, copiedAndGone;
    for (int i = -3; i < Rounds; ++i) { // the first ones warm up
        std::unique_ptr<CObList> items;
        std::vector<Copied> copies;
        const double ask = Milliseconds([&] { items.reset(KvrMSGGetData({}, &document)); });
        const double freeItems = Milliseconds([&] { items.reset(); });
        const double copy = Milliseconds([&] { copies = Copy(document.Parameters()); });
        const double freeCopies = Milliseconds([&] { copies = {}; });
        if (i < 0)
            continue;
        asked.push_back(ask);
        copied.push_back(copy);
        askedAndGone.push_back(ask + freeItems);
        copiedAndGone.push_back(copy + freeCopies);
    }
    return {Median(asked), Median(copied), Median(askedAndGone), Median(copiedAndGone)};
}

void Print(const char* what, double measured, double yardstick)
{
    std::printf("%-58s %9.3f ms / %9.3f ms = %5.2f\n", what, measured, yardstick, measured / yardstick);
}

} // namespace

int main(int argc, char** argv)
{
    const QCoreApplication app(argc, argv);
    const Times rivers = Measure(1000), single = Measure(1);
    const bool fast =
        Report("700,000 records, 1,000 of a branch: asked for / copied", rivers.asked, rivers.copied, 2.0);
    Print("the same, and given back", rivers.askedAndGone, rivers.copiedAndGone);
    // Which no river network has: each name becomes a text of its own.
    Print("700,000 records, each of its own branch", single.asked, single.copied);
    return fast ? 0 : 1;
}
