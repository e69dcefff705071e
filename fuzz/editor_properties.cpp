// The files of the editors beside the HD parameters, and of the shell.
#include "editors/cross_sections/section_file.h"
#include "editors/network/network_file.h"
#include "file_properties.h"
#include "properties.h"
#include "shell/project_file.h"

std::string CheckNetworkFile(const std::string& text)
{
    return CheckFile(text, [](tqlHandle structure, LoadReport& report) {
        const CNetwork network = LoadNetwork(structure, report);
        return DeclaredText(DeclaredNetworkFile(), &network);
    });
}

std::string CheckSectionFile(const std::string& text)
{
    return CheckFile(text, [](tqlHandle structure, LoadReport& report) {
        const CCrossSections sections = LoadCrossSections(structure, report);
        return DeclaredText(DeclaredSectionFile(), &sections);
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
