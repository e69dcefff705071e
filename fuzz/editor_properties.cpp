// The files of the editors beside the HD parameters, and of the shell.
#include "editors/cross_sections/section_file.h"
#include "editors/network/network_file.h"
#include "file_properties.h"
#include "properties.h"
#include "shell/project_file.h"

std::string CheckNetworkFile(const std::string& text)
{
    return CheckFile(
        text, [](tqlHandle structure, LoadReport& report) { return NetworkText(LoadNetwork(structure, report)); });
}

std::string CheckSectionFile(const std::string& text)
{
    return CheckFile(text, [](tqlHandle structure, LoadReport& report) {
        return CrossSectionsText(LoadCrossSections(structure, report));
    });
}

std::string CheckProjectFile(const std::string& text)
{
    return CheckFile(text, [](tqlHandle structure, LoadReport& report) {
        ProjectFile project;
        ReadDeclaredFile(structure, DeclaredProjectFile(), &project, report);
        return DeclaredText(DeclaredProjectFile(), &project);
    });
}
