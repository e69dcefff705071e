#include "data/hd_file.h"

Result<HD_Parameters> LoadHDFile(const std::string& path)
{
    const Result<TqlStructure> structure = ParseFile(path);
    if (!structure)
        return structure.error();
    HD_Parameters parameters;
    parameters.Load(structure.value().Get());
    return parameters;
}

namespace {

/// `length`: about how long the text will be.
TqlStructure Build(const HD_Parameters& parameters, bool everySet, std::uint64_t length = 0)
{
    TqlStructure structure(tqlCreate());
    tqlReserve(structure.Get(), std::size_t(length));
    parameters.Save(structure.Get(), everySet);
    return structure;
}

} // namespace

std::string HDFileText(const HD_Parameters& parameters, bool everySet)
{
    return std::string(tqlGetText(Build(parameters, everySet).Get()));
}

Result<WriteReport> SaveHDFile(const HD_Parameters& parameters, const std::string& path, const SaveOptions& options)
{
    const auto& before = options.file.expected; // most changes are small
    const TqlStructure structure = Build(parameters, options.everySet, before ? before->size + before->size / 16 : 0);
    return SaveStructure(structure.Get(), path, options.file);
}
