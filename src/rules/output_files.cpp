#include "rules/output_files.h"

#include "base/utf8_path.h"
#include "files/declare_field.h"
#include "rules/global_place.h"

#include <algorithm>
#include <filesystem>
#include <map>
#include <set>

namespace {

/// What is the same for names of one file as far as their letters tell: a check does not wait for disks.
class FileKeys
{
public:
    explicit FileKeys(const std::string& path) : m_folder(PathFromUtf8(path).parent_path()) {}

    std::string KeyOf(std::string name) const
    {
        std::ranges::replace(name, '\\', '/'); // as files from elsewhere write it
        return Utf8FromPath((m_folder / PathFromUtf8(name)).lexically_normal());
    }

private:
    std::filesystem::path m_folder;
};

std::set<std::string> Inputs(const HD_Global_Var& global, const std::string& path, const FileKeys& keys)
{
    std::set<std::string> inputs;
    const auto add = [&](const std::string& name) {
        if (!name.empty())
            inputs.insert(keys.KeyOf(name));
    };
    if (!path.empty())
        inputs.insert(keys.KeyOf(Utf8FromPath(PathFromUtf8(path).filename())));
    for (const CMapsInput& dem : global.MapOutput.DemInputFiles)
        add(dem.FileName);
    if (global.MapOutput.MapAreaGeoDb)
        add(global.MapOutput.GeoDb);
    return inputs;
}

/// Outputs one after the other, as their tables show them.
class Outputs
{
public:
    Outputs(const HD_Global_Var& global, const std::string& path, CProblems& problems)
        : m_keys(path), m_inputs(Inputs(global, path, m_keys)), m_problems(problems)
    {
    }

    void Check(const std::string& name, const ProblemPlace& place)
    {
        if (name.empty()) {
            m_problems.Add({RuleId::OutputWithoutFile, place});
            return;
        }
        const std::string key = m_keys.KeyOf(name);
        if (m_inputs.contains(key))
            m_problems.Add({RuleId::OverwritesInput, place, {name}});
        const auto [first, isNew] = m_written.try_emplace(key, place);
        if (!isNew && first->second.section == place.section)
            m_problems.Add({RuleId::OverwritesOutput, place, {Amount{double(first->second.element + 1)}}});
    }

private:
    FileKeys m_keys;
    std::set<std::string> m_inputs;
    std::map<std::string, ProblemPlace> m_written;
    CProblems& m_problems;
};

} // namespace

void CheckOutputFiles(const HD_Global_Var& global, const std::string& path, CProblems& problems)
{
    Outputs outputs(global, path, problems);
    const auto& maps = global.MapOutput.MapOutputFiles;
    for (std::size_t i = 0; i < maps.size() && global.MapOutput.GenerateOutput; ++i)
        outputs.Check(maps[i].FileName, GlobalPlace(global, &maps, FieldOf(&CMapsOutput::FileName), i));
    const auto& series = global.TextOutput.OutputFiles;
    for (std::size_t i = 0; i < series.size() && global.TextOutput.GenerateOutput; ++i)
        if (!series[i].AutoName)
            outputs.Check(series[i].FileName, GlobalPlace(global, &series, FieldOf(&CTextAutoFile::FileName), i));
}
