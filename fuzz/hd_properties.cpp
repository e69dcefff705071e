#include "data/hd_file.h"
#include "file_properties.h"
#include "properties.h"

std::string CheckHDFile(const std::string& text)
{
    return CheckFile(text, [](tqlHandle structure, LoadReport& report) -> Result<std::string> {
        HD_Parameters parameters;
        parameters.Load(structure, &report);
        return HDFileText(parameters, true);
    });
}
