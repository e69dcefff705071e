// What the rules cost over a large file, in the slices in which an editor lets them look, against the reading pass of
// "hdkv check". bench_problems FILE, for example of examples/make_million.
#include "bench/report.h"
#include "rules/file_check.h"
#include "rules/hd_check.h"

#include "data/hd_file.h"

namespace {

constexpr int Rounds = 9;
constexpr std::size_t Lines = 1000; // of a slice

/// Milliseconds of the longest slice.
double CheckInSlices(const HD_Parameters& parameters, const CRiver* river)
{
    double longest = 0;
    CHDCheck check(parameters, river, "");
    for (bool more = true; more;)
        longest = std::max(longest, Milliseconds([&] { more = check.Step(Lines); }));
    check.Take();
    return longest;
}

} // namespace

int main(int argc, char** argv)
{
    const auto structure = argc == 2 ? ParseFile(argv[1]) : Result<TqlStructure>(Error{"usage: bench_problems FILE"});
    if (!structure) {
        std::fprintf(stderr, "%s\n", structure.error().message.c_str());
        return 2;
    }
    HD_Parameters parameters;
    parameters.Load(structure.value().Get());
    const CRiver empty; // with it every line is of a branch that is not there
    std::vector<double> reading, sound, broken, longest;
    for (int i = 0; i < Rounds; ++i) {
        reading.push_back(Milliseconds([&] {
            const auto again = ParseFile(argv[1]);
            LoadReport report(again.value().Get(), LoadReport::Wanted::Everything);
            HD_Parameters read;
            read.Load(again.value().Get(), &report);
        }));
        double slice = 0;
        sound.push_back(Milliseconds([&] { slice = CheckInSlices(parameters, nullptr); }));
        longest.push_back(slice);
        broken.push_back(Milliseconds([&] { slice = CheckInSlices(parameters, &empty); }));
        longest.push_back(slice);
    }
    bool isFine = Report("rules / reading pass of hdkv check", Median(sound), Median(reading), 2);
    isFine = Report("rules, every line broken / reading pass", Median(broken), Median(reading), 2) && isFine;
    isFine = Report("longest slice / a frame", Median(longest), 16.7, 1) && isFine;
    return isFine ? 0 : 1;
}
