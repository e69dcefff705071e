#include "data/hd_file.h"

Result<TqlStructure> ParseFile(const std::string& path, TqlSyntaxError* report)
{
    TqlStructure structure(tqlLoadFile(path, 1));
    TqlSyntaxError error;
    if (!tqlGetSyntaxErr(structure.Get(), &error))
        return structure;
    tqlGetErrorGlb(); // taken: the report says it all
    if (report)
        *report = error;
    return Error{error.message};
}

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

TqlStructure Build(const HD_Parameters& parameters, bool everySet)
{
    TqlStructure structure(tqlCreate());
    parameters.Save(structure.Get(), everySet);
    return structure;
}

} // namespace

std::string HDFileText(const HD_Parameters& parameters, bool everySet)
{
    return std::string(tqlGetText(Build(parameters, everySet).Get()));
}

Result<void> SaveHDFile(const HD_Parameters& parameters, const std::string& path, const SaveOptions& options)
{
    const TqlStructure structure = Build(parameters, options.everySet);
    const std::string_view text = tqlGetText(structure.Get());
    if (text.empty()) // the library refuses what no reader could take back
        return Error{"Could not write \"" + path + "\": the content cannot be expressed in a parameter file."};
    return WriteFileSafely(path, text, {.sync = options.sync});
}
