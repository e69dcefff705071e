#include "cli/keyword.h"

#include "cli/match.h"

#include <vector>

namespace {

std::vector<NamedValue> AllValues()
{
    std::vector<NamedValue> values;
    for (const DeclaredSection& section : HDGlobals().Sections()) {
        const std::string prefix = std::string(section.name) + '/';
        for (const DeclaredKeyword& row : section.keywords)
            values.push_back({prefix + std::string(row.name), row.Fields()});
        for (const DeclaredSection& items : section.Sections())
            values.push_back({prefix + std::string(items.name), items.keywords.front().Fields()});
    }
    return values;
}

std::string_view Short(const NamedValue& value)
{
    return std::string_view(value.name).substr(value.name.find('/') + 1);
}

std::string Listed(const std::vector<NamedValue>& values)
{
    std::string text;
    for (const NamedValue& value : values)
        text += (text.empty() ? "" : ", ") + value.name;
    return text;
}

} // namespace

Result<NamedValue> FindKeyword(const std::string& name)
{
    std::vector<NamedValue> found, similar;
    for (NamedValue& value : AllValues()) {
        if (value.name == name || Short(value) == name)
            found.push_back(std::move(value));
        else if (SameIgnoringCase(value.name, name) || SameIgnoringCase(Short(value), name))
            similar.push_back(std::move(value));
    }
    if (found.size() == 1)
        return found.front();
    if (!found.empty())
        return Error{"\"" + name + "\" is the name of several keywords; give one of " + Listed(found) + "."};
    std::string message = "There is no keyword \"" + name + "\".";
    if (!similar.empty())
        message += " Did you mean " + Listed(similar) + "?";
    return Error{message};
}
