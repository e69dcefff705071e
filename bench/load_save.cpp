// Loading and saving one million locations, against a hand-coded reader and writer of the same lines.
//
//   bench_load_save [--check] [--records N] [--rounds N]
//
// Times are medians of rounds in which all candidates take turns; peak memory is that of child processes that do
// nothing but load. --check ends with 1 when a limit is exceeded.
#include "data/hd_file.h"
#include "hand_coded.h"
#include "peak_memory.h"
#ifdef KVR_BENCH_RAPIDJSON
#include "rapid_json.h"
#endif

#include <algorithm>
#include <chrono>
#include <cstdio>
#include <filesystem>
#include <functional>
#include <string_view>

namespace {

namespace fs = std::filesystem;

struct Options
{
    bool check = false;
    int records = 1'000'000, rounds = 9;
};

struct Files
{
    fs::path folder = fs::temp_directory_path() /
                      ("kvr_bench_" + std::to_string(std::chrono::steady_clock::now().time_since_epoch().count()));
    std::string hdkv = (folder / "million.HDKV").string(), json = (folder / "million.json").string(),
                saved = (folder / "saved.HDKV").string(), scratch = (folder / "peak.txt").string();

    Files() { fs::create_directories(folder); }
    ~Files() { fs::remove_all(folder); }
};

HD_Parameters MakeParameters(int count)
{
    HD_Parameters parameters;
    parameters.InitList.Reserve(std::size_t(count));
    for (int i = 0; i < count; ++i) {
        HD_Initial record;
        record.RiverName = "BRANCH_" + std::to_string(i / 5000 + 1);
        record.Chainage = i % 5000 * 12.5;
        record.InitialH = (125 + i % 1000) / 100.0;
        record.InitialQ = (105 + i % 777) / 10.0;
        parameters.InitList.Add(std::move(record));
    }
    return parameters;
}

HD_Parameters Load(const std::string& path)
{
    auto result = LoadHDFile(path);
    if (!result) {
        std::fprintf(stderr, "%s\n", result.error().message.c_str());
        std::exit(2);
    }
    return std::move(result.value());
}

std::vector<PlainRecord> Plain(const HD_Parameters& parameters)
{
    std::vector<PlainRecord> records;
    for (std::size_t i = 0; i < parameters.InitList.GetCount(); ++i) {
        const HD_Initial& record = parameters.InitList.GetAt(i);
        records.push_back({record.RiverName, record.Chainage, record.InitialH, record.InitialQ});
    }
    return records;
}

// One way of doing the work, timed around `run` alone; what it made is let go outside the time.
struct Candidate
{
    const char* name;
    std::function<double()> run;
    std::vector<double> times{};

    double Median()
    {
        std::nth_element(times.begin(), times.begin() + static_cast<std::ptrdiff_t>(times.size() / 2), times.end());
        return times[times.size() / 2];
    }
};

template <typename Work>
std::function<double()> Timed(Work work)
{
    return [work] {
        const auto start = std::chrono::steady_clock::now();
        [[maybe_unused]] const auto result = work();
        return std::chrono::duration<double, std::milli>(std::chrono::steady_clock::now() - start).count();
    };
}

void RunInterleaved(std::vector<Candidate>& candidates, int rounds)
{
    for (int round = -1; round < rounds; ++round) // the first only warms the caches
        for (Candidate& candidate : candidates) {
            const double time = candidate.run();
            if (round >= 0)
                candidate.times.push_back(time);
        }
}

// Prints rows of value, ratio to the first row's and, where there is one, limit; counts what is over.
class Table
{
public:
    Table(const char* title, const char* unit) : m_unit(unit) { std::printf("\n%s\n", title); }

    void Row(const char* name, double value, double limit = 0)
    {
        if (m_base == 0)
            m_base = value;
        const double ratio = value / m_base;
        std::printf("  %-38s %8.1f %s  %5.2f x", name, value, m_unit, ratio);
        if (limit > 0)
            std::printf("  (limit %.1f) %s", limit, ratio <= limit ? "ok" : "OVER");
        std::printf("\n");
        over += limit > 0 && ratio > limit;
    }

    int over = 0;

private:
    const char* m_unit;
    double m_base = 0;
};

int MeasureLoad(const Files& files, int rounds)
{
    std::vector<Candidate> candidates{{"hand-coded reader", Timed([&] { return HandCodedRead(files.hdkv); })},
                                      {"file to HD_Parameters through tql", Timed([&] { return Load(files.hdkv); })}};
#ifdef KVR_BENCH_RAPIDJSON
    candidates.push_back({"RapidJSON, SAX", Timed([&] { return ReadJsonSax(files.json); })});
    candidates.push_back({"RapidJSON, DOM", Timed([&] { return ReadJsonDom(files.json); })});
#endif
    RunInterleaved(candidates, rounds);
    Table table("Load", "ms");
    for (Candidate& candidate : candidates)
        table.Row(candidate.name, candidate.Median(), &candidate == &candidates[1] ? 2.0 : 0);
    return table.over;
}

int MeasurePeak(const Files& files, const std::string& program)
{
    const auto peakMiB = [&](const char* what, const std::string& file) {
        const std::string command = "\"" + program + "\" --peak " + what + " \"" + file + "\"";
        return double(PeakMemoryOf(command, files.scratch)) / (1024 * 1024);
    };
    Table table("Peak memory of that load", "MiB");
    table.Row("hand-coded reader", peakMiB("hand", files.hdkv));
    table.Row("file to HD_Parameters through tql", peakMiB("tql", files.hdkv), 2.5);
#ifdef KVR_BENCH_RAPIDJSON
    table.Row("RapidJSON, SAX", peakMiB("sax", files.json));
    table.Row("RapidJSON, DOM", peakMiB("dom", files.json));
#endif
    return table.over;
}

int MeasureSave(const Files& files, int rounds)
{
    const PlainFile plain = HandCodedRead(files.hdkv);
    const HD_Parameters parameters = Load(files.hdkv);
    const auto fresh = [&](auto write) { // both make a new file
        return [&files, write] {
            fs::remove(files.saved);
            return Timed([&] {
                write();
                return 0;
            })();
        };
    };
    std::vector<Candidate> candidates{
        {"hand-coded writer", fresh([&] { HandCodedWrite(plain, files.saved); })},
        {"HD_Parameters to file, without sync", fresh([&] {
             if (const auto saved = SaveHDFile(parameters, files.saved, {.file = {.sync = false}}); !saved)
                 std::fprintf(stderr, "%s\n", saved.error().message.c_str());
         })}};
    RunInterleaved(candidates, rounds);
    Table table("Save", "ms");
    table.Row(candidates[0].name, candidates[0].Median());
    table.Row(candidates[1].name, candidates[1].Median(), 1.3);
    return table.over;
}

// The part of a child process: load, tell the peak.
int TellPeak(std::string_view what, const std::string& file)
{
    if (what == "hand")
        HandCodedRead(file);
    else if (what == "tql")
        Load(file);
#ifdef KVR_BENCH_RAPIDJSON
    else if (what == "sax")
        ReadJsonSax(file);
    else if (what == "dom")
        ReadJsonDom(file);
#endif
    std::printf("%zu\n", PeakMemory());
    return 0;
}

// All candidates must have read the same, or their times mean nothing.
bool AllAgree(const Files& files)
{
    const auto records = HandCodedRead(files.hdkv).records;
    bool agree = records == Plain(Load(files.hdkv));
#ifdef KVR_BENCH_RAPIDJSON
    WriteJson(records, files.json);
    agree = agree && records == ReadJsonDom(files.json) && records == ReadJsonSax(files.json);
#endif
    return agree;
}

int Run(const Options& options, const std::string& program)
{
    const Files files;
    {
        const HD_Parameters parameters = MakeParameters(options.records);
        if (const auto saved = SaveHDFile(parameters, files.hdkv); !saved) {
            std::fprintf(stderr, "%s\n", saved.error().message.c_str());
            return 2;
        }
    }
    std::printf("%d locations and all global values, %.1f MiB, medians of %d rounds\n", options.records,
                double(fs::file_size(files.hdkv)) / (1024 * 1024), options.rounds);
    if (!AllAgree(files)) {
        std::fprintf(stderr, "the candidates read different records\n");
        return 2;
    }
    const int over =
        MeasureLoad(files, options.rounds) + MeasurePeak(files, program) + MeasureSave(files, options.rounds);
    return options.check && over > 0 ? 1 : 0;
}

} // namespace

int main(int argc, char** argv)
{
    Options options;
    for (int i = 1; i < argc; ++i) {
        const std::string_view argument = argv[i];
        const int left = argc - i - 1;
        if (argument == "--peak" && left == 2)
            return TellPeak(argv[i + 1], argv[i + 2]);
        if (argument == "--check") {
            options.check = true;
        } else if ((argument == "--records" || argument == "--rounds") && left > 0) {
            (argument == "--records" ? options.records : options.rounds) = std::max(1, std::atoi(argv[++i]));
        } else {
            std::fprintf(stderr, "usage: bench_load_save [--check] [--records N] [--rounds N]\n");
            return 2;
        }
    }
    return Run(options, argv[0]);
}
