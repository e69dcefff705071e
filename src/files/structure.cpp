#include "files/structure.h"

namespace {

Result<TqlStructure> Checked(TqlStructure structure, TqlSyntaxError* report)
{
    TqlSyntaxError error;
    if (!tqlGetSyntaxErr(structure.Get(), &error))
        return structure;
    tqlGetErrorGlb(); // taken: the report says it all
    if (report)
        *report = error;
    return Error{.message = error.message, .code = error.reason};
}

} // namespace

Result<TqlStructure> ParseFile(const std::string& path, TqlSyntaxError* report, FileVersion* version)
{
    Result<TqlStructure> structure = Checked(TqlStructure(tqlLoadFile(path)), report);
    if (structure && version)
        *version = VersionOfText(tqlGetSource(structure.value().Get()));
    return structure;
}

Result<TqlStructure> ParseText(std::string text, const std::string& name)
{
    return Checked(TqlStructure(tqlLoadText(std::move(text), name)), nullptr);
}

Error NoText(const std::string& path)
{
    constexpr const char* why = "content cannot be expressed in a parameter file.";
    return {path.empty() ? std::string("The ").append(why)
                         : std::string("Could not write \"").append(path).append("\": the ").append(why)};
}

Result<std::string> TextOf(tqlHandle built)
{
    const std::string_view text = tqlGetText(built);
    return text.empty() ? Result<std::string>(NoText()) : std::string(text);
}

Result<WriteReport> SaveStructure(tqlHandle built, const std::string& path, const SafeFileOptions& options)
{
    const std::string_view text = tqlGetText(built);
    return text.empty() ? NoText(path) : WriteFileSafely(path, text, options);
}
