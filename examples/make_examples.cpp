// Writes the sample project, or a sample file of any size:
//   make_examples FOLDER
//   make_examples --locations N FILE
#include "data/hd_file.h"
#include "base/utf8_path.h"
#include "sample_network.h"
#include "sample_river.h"
#include "sample_sections.h"

#include <charconv>
#include <iostream>

namespace {

std::string ProjectText(std::initializer_list<std::string_view> members)
{
    const TqlStructure project(tqlCreate());
    tqlAddTarget(project.Get(), "KVR_PROJECT");
    tqlAddSection(project.Get(), "Members");
    for (const std::string_view member : members)
        tqlPutParamFilename(project.Get(), "File", member);
    tqlEndSection(project.Get());
    tqlEndSection(project.Get());
    return std::string(tqlGetText(project.Get()));
}

int Outcome(const Result<WriteReport>& written)
{
    if (written)
        return 0;
    std::cerr << written.error().message << '\n';
    return 1;
}

int WriteProject(const std::string& folder)
{
    std::error_code error;
    std::filesystem::create_directories(PathFromUtf8(folder), error);
    int failed = Outcome(SaveHDFile(SampleRiver(), folder + "/river.HDKV"));
    failed = failed ? failed : Outcome(WriteFileSafely(folder + "/river.kvnw", SampleNetworkText()));
    failed = failed ? failed : Outcome(WriteFileSafely(folder + "/river.kvxs", SampleSectionsText()));
    return failed ? failed
                  : Outcome(WriteFileSafely(folder + "/river.kvrp",
                                            ProjectText({"river.HDKV", "river.kvnw", "river.kvxs"})));
}

int WriteLongRiver(std::string_view locations, const std::string& file)
{
    std::size_t count = 0;
    const auto [end, error] = std::from_chars(locations.data(), locations.data() + locations.size(), count);
    if (error != std::errc() || end != locations.data() + locations.size()) {
        std::cerr << "The number of locations should be an integer, found \"" << locations << "\".\n";
        return 2;
    }
    return Outcome(SaveHDFile(LongRiver(count), file));
}

} // namespace

int main(int argc, char** argv)
{
    if (argc == 2 && argv[1][0] != '-')
        return WriteProject(argv[1]);
    if (argc == 4 && std::string_view(argv[1]) == "--locations")
        return WriteLongRiver(argv[2], argv[3]);
    std::cerr << "Usage: make_examples FOLDER | make_examples --locations N FILE\n";
    return 2;
}
