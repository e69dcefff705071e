// KvrMSGGetData over seven lists of 100,000 records each, against copying the same names and numbers into a vector of
// structs. Once with branch names as rivers have them, once with a name of its own for every record.
#include "bench/report.h"
#include "data/hd_parameters.h"
#include "ks/fc/hd_messages.h"
#include "module/data_tables.h"
#include "module/document.h"

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

bool Measure(const char* what, int linesOfBranch)
{
    CKavo0_hdDoc document;
    Fill(document.Parameters(), linesOfBranch);
    std::vector<double> got, copied, gotAndGone, copiedAndGone;
    for (int i = -3; i < Rounds; ++i) { // the first ones warm up
        std::unique_ptr<CObList> items;
        std::vector<Copied> copies;
        const double get = Milliseconds([&] { items.reset(KvrMSGGetData({}, &document)); });
        const double freeItems = Milliseconds([&] { items.reset(); });
        const double copy = Milliseconds([&] { copies = Copy(document.Parameters()); });
        const double freeCopies = Milliseconds([&] { copies = {}; });
        if (i < 0)
            continue;
        got.push_back(get);
        copied.push_back(copy);
        gotAndGone.push_back(get + freeItems);
        copiedAndGone.push_back(copy + freeCopies);
    }
    const std::string name(what);
    const bool fast = Report((name + ": asked for / copied").c_str(), Median(got), Median(copied), 2.0);
    return Report((name + ": and given back").c_str(), Median(gotAndGone), Median(copiedAndGone), 2.0) && fast;
}

} // namespace

int main(int argc, char** argv)
{
    const QCoreApplication app(argc, argv);
    const bool rivers = Measure("700,000 records, 1,000 of a branch", 1000);
    const bool single = Measure("700,000 records, each of its own branch", 1);
    return rivers && single ? 0 : 1;
}
