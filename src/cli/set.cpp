#include "cli/field_text.h"
#include "cli/keyword.h"
#include "cli/open_file.h"

int Set(const std::string& file, const std::string& keyword, const std::vector<std::string>& values,
        const Output& output)
{
    const Result<NamedValue> value = FindKeyword(keyword);
    if (!value)
        return Complain(value.error().message, Exit::Usage);
    const std::string& target = output.Over(file);
    FileLock lock;
    if (const int failed = LockFile(target, lock))
        return failed;
    HD_Parameters parameters;
    FileVersion version;
    if (const int failed = OpenFile(file, Purpose::Rewrite, parameters, &version))
        return failed;
    if (const Result<void> stored = ParseParams(value.value().fields, values, &parameters.Global); !stored)
        return Complain(value.value().name + ": " + stored.error().message + ".", Exit::Usage);
    return Rewrite(parameters, target, lock, output, output.path.empty() ? version : VersionThere(target));
}
