#include "cli/field_text.h"
#include "cli/keyword.h"
#include "cli/open_file.h"

#include <iostream>

int Get(const std::string& file, const std::string& keyword)
{
    const Result<NamedValue> value = FindKeyword(keyword);
    if (!value)
        return Complain(value.error().message, Exit::Usage);
    HD_Parameters parameters;
    if (const int failed = OpenFile(file, Purpose::Read, parameters))
        return failed;
    for (const std::string& text : ParamTexts(value.value().fields, &parameters.Global))
        std::cout << text << '\n';
    return Exit::Fine;
}
