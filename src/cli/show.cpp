#include "cli/match.h"
#include "cli/open_file.h"
#include "cli/record_table.h"
#include "files/declare_field.h"

#include <iostream>

namespace {

std::string KnownLists()
{
    std::string names;
    for (const ListEntry& entry : HDLists())
        names += std::string(names.empty() ? "" : ", ") + entry.section;
    for (const DeclaredSection& section : HDGlobals().Sections())
        for (const DeclaredSection& items : section.Sections())
            names += ", " + std::string(items.name);
    return names;
}

GroupValue<const void> ItemsOf(const DeclaredSection& items, const HD_Parameters& parameters)
{
    return items.keywords.front().Fields().front().GroupIn(&parameters.Global);
}

/// The records or items of the list; false when there is no such list.
bool MakeTable(const HD_Parameters& parameters, const std::string& name, RecordTable& table)
{
    for (const ListEntry& entry : HDLists()) {
        if (!SameIgnoringCase(entry.section, name))
            continue;
        table.AddSection(entry.constList(parameters));
        return true;
    }
    for (const DeclaredSection& section : HDGlobals().Sections()) {
        for (const DeclaredSection& items : section.Sections()) {
            if (!SameIgnoringCase(items.name, name))
                continue;
            table.AddItems(ItemsOf(items, parameters));
            return true;
        }
    }
    return false;
}

struct OverviewRow
{
    std::string section, contents;
    std::int32_t count = 0;
};
constexpr Field overviewFields[] = {Text<&OverviewRow::section>("section"), Text<&OverviewRow::contents>("contents"),
                                    Integer<&OverviewRow::count>("count")};

std::vector<OverviewRow> Overview(const HD_Parameters& parameters)
{
    std::vector<OverviewRow> rows;
    const auto add = [&rows](std::string_view section, const char* contents, std::size_t count) {
        rows.push_back({std::string(section), contents, std::int32_t(count)});
    };
    for (const DeclaredSection& section : HDGlobals().Sections()) {
        add(section.name, "keywords", section.keywords.size());
        for (const DeclaredSection& items : section.Sections())
            add(items.name, "items", ItemsOf(items, parameters).size());
    }
    for (const ListEntry& entry : HDLists()) {
        const CListSection& section = entry.constList(parameters);
        add(entry.section, section.HasSets() ? "sets" : "records",
            section.HasSets() ? section.ListCount() : section.ListAt(0).GetCount());
    }
    return rows;
}

} // namespace

int Show(const std::string& file, const std::string& list, Format format)
{
    HD_Parameters parameters;
    if (const int failed = OpenFile(file, Purpose::Read, parameters))
        return failed;
    RecordTable table;
    std::vector<OverviewRow> overview;
    if (list.empty()) {
        overview = Overview(parameters);
        table.SetFields({{overviewFields}});
        for (const OverviewRow& row : overview)
            table.AddRow(&row);
    } else if (!MakeTable(parameters, list, table)) {
        return Complain("There is no list \"" + list + "\"; the lists are " + KnownLists() + ".", Exit::Usage);
    }
    table.Print(std::cout, format);
    return Exit::Fine;
}
